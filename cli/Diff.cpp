// robotcfg diff: whether two programs configure the same robot, and with -v
// which devices differ.
#include <array>
#include <cstdio>
#include <string>

#include "cli/Commands.h"
#include "cli/ReadProgram.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// The summary line of each comparison result.
struct TCompareSummary {
  TConfigCompareResults nResult;
  const char *pzText;
};
constexpr std::array<TCompareSummary, 4> kCompareSummaries = {{
    {configCompareSame, "configurations are the same"},
    {configCompareNamesDiffer, "configurations differ only in device names"},
    {configCompareSettingsDiffer, "configurations differ in settings"},
    {configCompareModelNamesDiffer, "configurations differ only in model names"},
}};

const wchar_t *orDash(const wchar_t *pz) { return (pz && *pz) ? pz : L"-"; }
CString orDash(const CString &s) { return s.IsEmpty() ? CString(L"-") : s; }

// Appends `sText` and a line end.
void appendLine(std::string &sOut, const CString &sText) {
  sOut += sText.toUtf8();
  sOut += '\n';
}

// Collects the devices whose descriptions differ between the two programs.
class CDifferenceList {
 public:
  /// Adds the device when the descriptions differ (or `bForce`); true when added.
  bool add(const CString &sDevice, const CString &sA, const CString &sB, bool bForce = false) {
    if (sA == sB && !bForce) return false;
    appendLine(m_sOut, sDevice);
    appendLine(m_sOut, L"  < " + sA);
    appendLine(m_sOut, L"  > " + sB);
    ++m_nCount;
    return true;
  }
  int count() const { return m_nCount; }
  const std::string &text() const { return m_sOut; }

 private:
  std::string m_sOut;
  int m_nCount = 0;
};

// A motor's settings in the terms of a Motor line: type, options, encoder, pins, PID settings.
CString describeMotorSettings(const CRobotConfigurationBasic &config, int nMotor) {
  const TMotorSlot &motor = config.getSettings().motors[size_t(nMotor)];
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  CString sType(getMotorTypedefString(motor.nMotorType, 0));
  if (sType.IsEmpty()) sType.Format(L"type %d", motor.nMotorType);
  CString sText;
  sText.Format(L"%-30s %s", motor.nMotorType == 0 ? CString(L"-") : sType,
               motor.bPIDControlled ? L"PIDControl" : L"openLoop");
  if (motor.bReversed) sText += L" reversed";
  if (motor.nDriveSide == 1) sText += L" driveLeft";
  if (motor.nDriveSide == 2) sText += L" driveRight";
  if (motor.bEncoder) sText += L" encoder";
  if (motor.nEncoderPort >= 0)
    sText.AppendFormat(L" encoderPort %s", orDash(getSensorPortString(motor.nEncoderPort, nBoard)));
  if (motor.nPrimaryIOPin >= 0 || motor.nSecondaryIOPin >= 0)
    sText.AppendFormat(L" pins %s, %s", getSensorPortString(motor.nPrimaryIOPin, nBoard),
                       getSensorPortString(motor.nSecondaryIOPin, nBoard));
  const TPidSettings &pid = motor.pidSettings;
  if (!pid.bIdenticalPidSettings(emptyPidSettings))
    sText.AppendFormat(L" PID %d %d %d %d %d %d %d %d", pid.B1, pid.B2, pid.B3, pid.B4, pid.W1, pid.W2, pid.W3,
                       pid.W4);
  return sText;
}

// Name column followed by the rest of a description.
CString withName(const CString &sName, const CString &sRest) {
  CString sText;
  sText.Format(L"%-14s %s", orDash(sName), sRest);
  return sText;
}

// Whether two motor names count as different, as the configuration comparison counts them.
bool bMotorNamesDiffer(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, int nMotor) {
  const CString &sA = a.sMotorNames[size_t(nMotor)];
  const CString &sB = b.sMotorNames[size_t(nMotor)];
  if (sA == sB) return false;
  if (!sA.IsEmpty()) return true;
  CString sDefaultA, sDefaultB;
  a.getDefaultMotorNameLowLevel(nMotor, sDefaultA, true);
  b.getDefaultMotorNameLowLevel(nMotor, sDefaultB, true);
  return !(sB == sDefaultB && sDefaultA.IsEmpty());
}

void compareMotors(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  CString sPort;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    const CString sA = describeMotorSettings(a, n), sB = describeMotorSettings(b, n);
    if (sA == sB && !bMotorNamesDiffer(a, b, n)) continue;
    a.getDefaultMotorNameForPlatformOrControllerBoard(n, sPort);
    CString sDevice;
    sDevice.Format(L"motor %s (index %d)", orDash(sPort), n);
    list.add(sDevice, withName(a.sMotorNames[size_t(n)], sA), withName(b.sMotorNames[size_t(n)], sB), true);
  }
}

// A sensor port: name, type, mode, second port and I2C address.
CString describeSensor(const CRobotConfigurationBasic &config, int nPort) {
  const TSensorTypes nType = config.getSensorTypeInConfig(nPort);
  const TSensorModes nMode = config.getSensorModeInConfig(nPort);
  CString sType(getSensorTypeString(nType));
  if (sType.IsEmpty()) sType.Format(L"type %d", nType);
  CString sMode(getSensorModeString(nType, nMode));
  if (sMode.IsEmpty()) sMode.Format(L"mode %d", nMode);
  CString sText;
  sText.Format(L"%-14s %-30s %s", orDash(config.sSensorNames[size_t(nPort)]), nType == 0 ? CString(L"-") : sType,
               nMode == 0 ? CString(L"-") : sMode);
  const int nSecondary = config.getSecondaryPort(nPort);
  if (nSecondary >= 0) sText.AppendFormat(L" secondary %s", orDash(getSensorSecondaryPort(nSecondary)));
  if (const int nAddress = config.getI2C_Address(nPort)) sText.AppendFormat(L" address %d", nAddress);
  return sText;
}

void compareSensors(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  for (int port = 0; port < kMaxNumbOfSensorPorts; ++port) {
    CString sPort(getSensorPortString(port, a.getCircuitBoardType()));
    if (sPort.IsEmpty()) sPort = getSensorPortString(port, b.getCircuitBoardType());
    CString sDevice;
    sDevice.Format(L"sensor %s (index %d)", orDash(sPort), port);
    list.add(sDevice, describeSensor(a, port), describeSensor(b, port));
  }
}

// A servo: name, type and its setting word.
CString describeServo(const CRobotConfigurationBasic &config, int nServo) {
  const TServoTypes nType = config.getServoType(nServo);
  CString sType(getServoTypedefString(nType));
  if (sType.IsEmpty()) sType.Format(L"type %d", nType);
  CString sText;
  sText.Format(L"%-14s %-30s setting %d", orDash(config.sServoNames[size_t(nServo)]),
               nType == 0 ? CString(L"-") : sType, config.getSettings().nServoSettings[size_t(nServo)]);
  return sText;
}

// A servo-position set: its name and eight positions.
CString describeServoPositions(const CRobotConfigurationBasic &config, int nSet) {
  const auto &positions = config.getSettings().nServoPositions[size_t(nSet)];
  CString sText;
  sText.Format(L"%-14s", orDash(config.sServoPositionNames[size_t(nSet)]));
  for (const uint8_t nPosition : positions) sText.AppendFormat(L" %d", nPosition);
  return sText;
}

void compareServos(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  CString sPort;
  for (int servo = 0; servo < kMaxNumbOfServos; ++servo) {
    getServoPortString(servo, sPort);
    CString sDevice;
    sDevice.Format(L"servo %s (index %d)", orDash(sPort), servo);
    list.add(sDevice, describeServo(a, servo), describeServo(b, servo));
  }
  for (int nSet = 0; nSet < kMaxNumbOfServoPositionSets; ++nSet) {
    CString sDevice;
    sDevice.Format(L"servo positions %d", nSet);
    list.add(sDevice, describeServoPositions(a, nSet), describeServoPositions(b, nSet));
  }
}

// Port word of a serial port, or KIND + number when the platform has none.
CString serialPortName(const TDeviceTypeMenuItem *pWords, const wchar_t *pzKind, int nPort) {
  CString sName(getTypedefEnumString(pWords, nPort, -1));
  if (sName.IsEmpty()) sName.Format(L"%s%d", pzKind, nPort);
  return sName;
}

void compareSerialPorts(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  auto describeUart = [](const CRobotConfigurationBasic &config, int nPort) {
    CString sText;
    sText.Format(L"%-20s %s", orDash(getTypedefEnumString(nUARTTypes, config.getUARTType(nPort), -1)),
                 orDash(getTypedefEnumString(nUARTBaudRates, config.getBaudRate(nPort), -1)));
    return sText;
  };
  auto describeI2C = [](const CRobotConfigurationBasic &config, int nPort) {
    return CString(orDash(getTypedefEnumString(nI2CTypes, config.getSettings().nI2CMode[size_t(nPort)], -1)));
  };
  for (int port = 0; port < kMaxNumbOfSerialPorts; ++port)
    list.add(L"serial port " + serialPortName(nUartIndex, L"UART", port), describeUart(a, port), describeUart(b, port));
  for (int port = 0; port < kMaxNumbOfSerialPorts; ++port)
    list.add(L"serial port " + serialPortName(nI2CIndex, L"I2C", port), describeI2C(a, port), describeI2C(b, port));
}

void compareHubs(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  static constexpr std::array<const wchar_t *, kNumbOfHubSensorPorts> kSensorPortNames = {L"S1", L"S2", L"S3", L"S4"};
  auto describeChain = [](const CRobotConfigurationBasic &config, int nPort) {
    const auto &chain = config.getSettings().nSensorPortHubs[size_t(nPort)];
    CString sText;
    sText.Format(L"%s, %s, %s, %s", getMuxTypes(chain[0]), getMuxTypes(chain[1]), getMuxTypes(chain[2]),
                 getMuxTypes(chain[3]));
    return sText;
  };
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port)
    list.add(CString(L"controllers on ") + kSensorPortNames[size_t(port)], describeChain(a, port),
             describeChain(b, port));
}

void compareBoards(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  auto describeBoard = [](const CRobotConfigurationBasic &config) {
    const auto &plugins = config.getSettings().nPluginBoardTypes;
    CString sText;
    const TControllerBoardType nBoard = config.getCircuitBoardType();
    sText.Format(L"%s (%d), CPU clock %d, plug-in boards %d, %d, %d", orDash(getCktBoardNameString(nBoard)), nBoard,
                 config.getCpuClockSpeed(), plugins[0], plugins[1], plugins[2]);
    return sText;
  };
  list.add(L"board", describeBoard(a), describeBoard(b));
}

void compareModels(const CRobotConfigurationBasic &a, const CRobotConfigurationBasic &b, CDifferenceList &list) {
  list.add(L"standard model", orDash(a.getStandardModelName()), orDash(b.getStandardModelName()));
  list.add(L"user model file", orDash(a.getModelNameUserFile()), orDash(b.getModelNameUserFile()));
}

}  // namespace

int runDiff(const TOptions &options) {
  if (options.files.size() != 2) return kExitUsage;
  const std::string &sPathA = options.files[0];
  const std::string &sPathB = options.files[1];
  // Each program starts from the selection of the command line, whatever board the other names.
  TReadProgram a, b;
  bool bReadA = false, bReadB = false;
  {
    CHostSelectionScope scope;
    bReadA = readProgram(sPathA, a);
  }
  {
    CHostSelectionScope scope;
    bReadB = readProgram(sPathB, b);
  }
  if (!bReadA || !bReadB) return kExitUsage;
  // A refused line is missing from its configuration, so any comparison would mislead.
  const bool bRejectedA = reportDiagnostics(sPathA, a);
  const bool bRejectedB = reportDiagnostics(sPathB, b);
  if (bRejectedA || bRejectedB) {
    std::fprintf(stderr, "robotcfg: cannot compare configurations with rejected lines\n");
    return kExitUsage;
  }

  const TConfigCompareResults nResult = a.pConfig->compareConfiguration(*b.pConfig);
  std::string sOut;
  for (const TCompareSummary &summary : kCompareSummaries)
    if (summary.nResult == nResult) sOut = std::string(summary.pzText) + "\n";
  if (options.bVerbose && nResult != configCompareSame) {
    CDifferenceList list;
    compareBoards(*a.pConfig, *b.pConfig, list);
    compareHubs(*a.pConfig, *b.pConfig, list);
    compareMotors(*a.pConfig, *b.pConfig, list);
    compareServos(*a.pConfig, *b.pConfig, list);
    compareSensors(*a.pConfig, *b.pConfig, list);
    compareSerialPorts(*a.pConfig, *b.pConfig, list);
    compareModels(*a.pConfig, *b.pConfig, list);
    sOut += list.text();
    // Drive train, program type, memory, firmware, data-log series and network are not devices.
    if (list.count() == 0 && nResult == configCompareSettingsDiffer) sOut += "other settings differ\n";
  }
  std::fwrite(sOut.data(), 1, sOut.size(), stdout);
  return nResult == configCompareSame ? kExitOk : kExitRejected;
}
