// Devices against each other: a device defined twice, two devices on one pin,
// one motor in two drive slots, names the robot program cannot compile.
#include <algorithm>
#include <cwctype>
#include <set>

#include "robotconfig/checker/CheckContext.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// Sensor-port types that mean "claimed by another device", not a sensor.
constexpr TSensorTypes kClaimTypes[] = {56, 57, 58, 59, 60, 61, 62, 64, 65, 66, 81, 91};

bool bIsClaimType(TSensorTypes nType) {
  return std::find(std::begin(kClaimTypes), std::end(kClaimTypes), nType) != std::end(kClaimTypes);
}

// Keywords of the robot language (C with a few words of its own): names that
// would not compile as variables.
constexpr const wchar_t *kReservedWords[] = {
    L"auto",   L"bool",   L"break",  L"byte",     L"case",     L"char",    L"const",  L"continue", L"default",
    L"do",     L"double", L"else",   L"enum",     L"extern",   L"false",   L"float",  L"for",      L"goto",
    L"if",     L"inline", L"int",    L"long",     L"register", L"return",  L"short",  L"signed",   L"sizeof",
    L"static", L"string", L"struct", L"switch",   L"task",     L"true",    L"typedef", L"ubyte",   L"union",
    L"unsigned", L"void", L"volatile", L"while",  L"word",     L"sbyte",   L"main",
};

// The key that makes two lines define the same device or setting; "" when a
// line may repeat (firmware features add up, plug-in boards fill slots).
std::string deviceKey(const CCheckContext &context, const TCheckedLine &line) {
  const CString &sFirst = line.parms.sParms[1];
  const std::string sKeyword = utf8(TConfigTypeDefns::getConfigTypeName(line.nType));
  switch (line.nType) {
    case configTypeMotor:
    case configTypeMotorPidSetting:
      return sKeyword + "#" + std::to_string(context.config.getIndexForDefaultMotorName(sFirst));
    case configTypeSensor: return sKeyword + "#" + std::to_string(context.config.getIndexForSensorName(sFirst));
    case configTypeServo: return sKeyword + "#" + std::to_string(getServoIndex(sFirst));
    case configTypeHubs:
    case configTypeUartUsage:
    case configTypeI2CUsage:
    case configTypeDatalogSeries: return sKeyword + "#" + utf8(sFirst);
    case configTypeStandardModel:
    case configTypeUserModel:
    case configTypeDriveTrainMotors:
    case configTypeDriveTrainWheels:
    case configTypeGripperArm:
    case configTypeJoystickDrive:
    case configTypeProgramType:
    case configTypeCircuitBoardType:
    case configTypeMemorySize:
    case configTypeCpuParameters:
    case configTypeNetworkDefinition: return sKeyword;
    default: return "";
  }
}

// "a sensor 'bumper' on S1 (line 3)" style description of a line's device.
std::string describeDevice(const TCheckedLine &line) {
  const std::string sName = line.parms.sParms[2].IsEmpty() ? "" : " " + quoted(line.parms.sParms[2]);
  switch (line.nType) {
    case configTypeMotor: return "motor" + sName + " on " + quoted(line.parms.sParms[1]);
    case configTypeSensor: return "sensor" + sName + " on " + quoted(line.parms.sParms[1]);
    case configTypeServo: return "servo" + sName + " on " + quoted(line.parms.sParms[1]);
    case configTypeUartUsage: return "UART " + quoted(line.parms.sParms[1]);
    case configTypeI2CUsage: return "I2C port " + quoted(line.parms.sParms[1]);
    default: return "'" + utf8(line.parms.sParms[0]) + "' line";
  }
}

void checkDefinedTwice(CCheckContext &context, TCheckedLine &line) {
  const std::string sKey = deviceKey(context, line);
  if (sKey.empty()) return;
  const size_t nIndex = context.lines.size() - 1;
  auto it = context.definitions.find(sKey);
  if (it == context.definitions.end()) {
    context.definitions[sKey] = nIndex;
    return;
  }
  const TCheckedLine &earlier = context.lines[it->second];
  TFinding &finding = context.report(line, "RC201", 1,
                                     describeDevice(line) + " is defined again; the definition on line " +
                                         std::to_string(earlier.nLine) + " is lost");
  finding.related.push_back({earlier.nLine, CCheckContext::columnOf(earlier, 1), "first defined here"});
  it->second = nIndex;
}

// Ports whose sensor type this line changed, and what now holds them.
void checkPortClaims(CCheckContext &context, TCheckedLine &line) {
  const TConfigurationSettings &settings = context.config.getSettings();
  const int nOwnPort = line.nType == configTypeSensor ? context.config.getIndexForSensorName(line.parms.sParms[1]) : -1;
  for (int port = 0; port < kMaxNumbOfSensorPorts && size_t(port) < context.sensorTypesBefore.size(); ++port) {
    const TSensorTypes nBefore = context.sensorTypesBefore[size_t(port)];
    const TSensorTypes nAfter = settings.nSensorTypes[size_t(port)];
    if (port == nOwnPort) {
      // A sensor on a port another device holds.
      auto claim = context.claims.find(port);
      if (claim != context.claims.end() && bIsClaimType(nBefore) && !bIsClaimType(nAfter)) {
        TFinding &finding = context.report(line, "RC301", 1,
                                           quoted(line.parms.sParms[1]) + " is held by the " + claim->second.sOwner +
                                               "; the two cannot share it");
        finding.related.push_back({claim->second.nLine, 0, "the " + claim->second.sOwner + " is defined here"});
      }
      if (!bIsClaimType(nAfter) && nAfter != 0) {
        context.sensorLines[port] = context.lines.size() - 1;
        context.claims.erase(port);
      }
      continue;
    }
    if (nBefore == nAfter || !bIsClaimType(nAfter)) continue;
    // This line claimed a port: a sensor defined there before is lost.
    auto sensor = context.sensorLines.find(port);
    if (sensor != context.sensorLines.end() && !bIsClaimType(nBefore) && nBefore != 0) {
      const TCheckedLine &earlier = context.lines[sensor->second];
      TFinding &finding = context.report(line, "RC301", 1,
                                         "the " + describeDevice(line) + " claims " +
                                             quoted(CString(getSensorPortString(port, settings.nCircuitBoardType))) +
                                             ", where the " + describeDevice(earlier) + " stands; the sensor is lost");
      finding.related.push_back({earlier.nLine, CCheckContext::columnOf(earlier, 1), "the sensor is defined here"});
      context.sensorLines.erase(sensor);
    }
    context.claims[port] = {line.nLine, describeDevice(line)};
  }
}

// Two motors on one IO pin.
void checkMotorPins(CCheckContext &context, TCheckedLine &line) {
  CHostRobotConfiguration &config = context.config;
  const int nMotor = config.getIndexForDefaultMotorName(line.parms.sParms[1]);
  if (!CRobotConfigurationBasic::bIsMotorIndex(nMotor) || config.getMotorTypeInConfig(nMotor) == 0) return;
  const int pins[2] = {config.getMapMotorToPrimaryIOPin(nMotor), config.getMapMotorToSecondaryIOPin(nMotor)};
  for (int m = 0; m < kMaxNumbOfMotors && size_t(m) < context.motorPinsBefore.size(); ++m) {
    if (m == nMotor || config.getMotorTypeInConfig(m) == 0) continue;
    // The pins the other motor held before this line: it lets go of one this line takes.
    const std::pair<int, int> &held = context.motorPinsBefore[size_t(m)];
    for (int nPin : pins) {
      if (nPin < 0 || (nPin != held.first && nPin != held.second)) continue;
      const TLineNumber &other = config.getMotorDefinitionLine(m);
      CString sName;
      config.getUserDefinedMotorNameInConfig(m, sName);
      TFinding &finding = context.report(line, "RC301", 1, "");
      finding.sMessage = "IO pin " + quoted(CString(getSensorPortString(nPin, config.getCircuitBoardType()))) +
                         " is already used by motor " + quoted(sName) + "; two motors cannot share a pin";
      if (other.nLine > 0) finding.related.push_back({other.nLine, 0, "motor " + quoted(sName) + " is defined here"});
      return;
    }
  }
}

// Gripper slots that may stay empty (the second motor of each joint).
constexpr bool kOptionalGripperSlot[] = {false, true, false, true};

// A drive train or gripper arm with a slot left without a motor.
void checkSlotCount(CCheckContext &context, TCheckedLine &line) {
  const CHostRobotConfiguration &config = context.config;
  const bool bDrive = line.nType == configTypeDriveTrainMotors;
  const int nNeeded = bDrive ? config.getNumbOfMotorsForDriveTrain() : config.getNumbOfMotorsForGripperArm();
  const int nNamed = std::max(0, line.parms.nNumbOfParms - 2);
  for (int nSlot = nNamed; nSlot < nNeeded && nSlot < 4; ++nSlot) {
    if (!bDrive && kOptionalGripperSlot[nSlot]) continue;
    context.report(line, "RC014", line.parms.nNumbOfParms - 1,
                   quoted(line.parms.sParms[1]) + " drives " + std::to_string(nNeeded) + " motors, but the line names " +
                       std::to_string(nNamed) + "; slot " + std::to_string(nSlot) + " needs a motor");
    return;
  }
}

// A motor named in two slots of a drive train or gripper arm.
void checkSlots(CCheckContext &context, TCheckedLine &line) {
  checkSlotCount(context, line);
  std::map<std::wstring, int> seen;
  for (int n = 2; n < line.parms.nNumbOfParms && n < kMaxConfigTokens; ++n) {
    const CString &sWord = line.parms.sParms[size_t(n)];
    if (sWord.IsEmpty() || sWord == L"None") continue;
    auto it = seen.find(sWord.str());
    if (it == seen.end()) {
      seen[sWord.str()] = n;
      continue;
    }
    TFinding &finding = context.report(line, "RC302", n,
                                       "motor " + quoted(sWord) + " already fills slot " + std::to_string(it->second - 2) +
                                           " of the '" + utf8(line.parms.sParms[0]) + "' line");
    finding.related.push_back({line.nLine, CCheckContext::columnOf(line, it->second), "first used here"});
  }
}

bool bIsIdentifier(const std::wstring &s) {
  if (s.empty() || !(std::iswalpha(wint_t(s[0])) || s[0] == L'_') || s[0] > 0x7F) return false;
  return std::all_of(s.begin(), s.end(), [](wchar_t c) { return c < 0x80 && (std::iswalnum(wint_t(c)) || c == L'_'); });
}

void checkName(CCheckContext &context, TCheckedLine &line) {
  const CString &sName = line.parms.sParms[2];
  if (sName.IsEmpty()) return;
  if (!bIsIdentifier(sName.str())) {
    context.report(line, "RC402", 2,
                   quoted(sName) + " is not a valid name: use letters, digits and '_', not starting with a digit");
    return;
  }
  for (const wchar_t *pzReserved : kReservedWords)
    if (sName == pzReserved) {
      context.report(line, "RC403", 2, quoted(sName) + " is a keyword of the robot language and cannot name a device");
      return;
    }
  const std::string sDevice = deviceKey(context, line);
  auto it = context.names.find(sName.str());
  if (it == context.names.end()) {
    context.names[sName.str()] = {line.nLine, CCheckContext::columnOf(line, 2), sDevice};
    return;
  }
  // The same device renamed (a rename line) is no clash.
  if (it->second.sDevice == sDevice && !sDevice.empty()) return;
  TFinding &finding = context.report(line, "RC401", 2,
                                     "the name " + quoted(sName) + " is already given to another device on line " +
                                         std::to_string(it->second.nLine));
  finding.related.push_back({it->second.nLine, it->second.nColumn, "first given here"});
}

}  // namespace

void checkLineDevices(CCheckContext &context, TCheckedLine &line) {
  checkDefinedTwice(context, line);
  checkPortClaims(context, line);
  switch (line.nType) {
    case configTypeMotor:
      checkMotorPins(context, line);
      checkName(context, line);
      break;
    case configTypeSensor:
    case configTypeServo: checkName(context, line); break;
    case configTypeRenameMotor:
    case configTypeRenameSensor: checkName(context, line); break;
    case configTypeDriveTrainMotors:
    case configTypeGripperArm: checkSlots(context, line); break;
    default: break;
  }
}

void checkDevicesOnHubs(CCheckContext &context) {
  CHostRobotConfiguration &config = context.config;
  for (TCheckedLine &line : context.lines) {
    if (!line.bAccepted || line.bFlagged) continue;
    const CString &sPort = line.parms.sParms[1];
    if (line.nType == configTypeMotor) {
      const int nMotor = config.getIndexForDefaultMotorName(sPort);
      if (nMotor < 0 || config.bIsValidMotorPort(nMotor) || config.getMotorTypeInConfig(nMotor) == 0) continue;
      context.report(line, "RC303", 1,
                     "motor port " + quoted(sPort) +
                         " is on a controller the configuration does not declare; add a 'Hubs' line for it");
    } else if (line.nType == configTypeServo) {
      const int nServo = getServoIndex(sPort);
      if (nServo < 0 || config.bIsValidServoPort(nServo)) continue;
      const bool bToggle = pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) != 0;
      context.report(line, "RC303", 1,
                     "servo port " + quoted(sPort) +
                         (bToggle ? " is on a controller the configuration does not declare; add a 'Hubs' line for it"
                                  : " needs external motor/servo controllers (--external-controllers)"));
    }
  }
}
