#include <algorithm>
#include <array>
#include <string_view>

#include "robotconfig/core/ParameterText.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorLines.h"
#include "robotconfig/motors/MotorTypes.h"

namespace {

// What an option word of a Motor line does to the motor's slot.
enum class TMotorOptionEffect {
  kEncoder,        ///< the motor has an encoder
  kEncoderPort,    ///< encoder on the sensor port named by the next parameter
  kIOPins,         ///< the next two parameters name the motor's IO pins
  kPIDControl,     ///< PID speed control on
  kOpenLoop,       ///< PID speed control off
  kReversed,       ///< direction reversed
  kDriveSide,      ///< drive side `nDriveSide`
  kNoEncoderPort,  ///< no encoder port
};

// One option word of a Motor line and what it does.
struct TMotorOptionKeyword {
  const wchar_t *pzKeyword;
  TMotorOptionEffect nEffect;
  TMotorDriveSide nDriveSide;  ///< the side of a kDriveSide row, else 0
};

// The option words of a Motor line, read from parameter 4 on in any order.
constexpr std::array<TMotorOptionKeyword, 10> kMotorOptionKeywords = {{
    {L"encoder", TMotorOptionEffect::kEncoder, 0},
    {L"encoderPort", TMotorOptionEffect::kEncoderPort, 0},
    {L"IOPins", TMotorOptionEffect::kIOPins, 0},
    {L"PIDControl", TMotorOptionEffect::kPIDControl, 0},
    {L"openLoop", TMotorOptionEffect::kOpenLoop, 0},
    {L"reversed", TMotorOptionEffect::kReversed, 0},
    {L"driveNone", TMotorOptionEffect::kDriveSide, 0},
    {L"driveLeft", TMotorOptionEffect::kDriveSide, 1},
    {L"driveRight", TMotorOptionEffect::kDriveSide, 2},
    {L"None", TMotorOptionEffect::kNoEncoderPort, 0},
}};

// Sensor ports that can carry a hub chain, by port index; ended by null.
constexpr std::array<const wchar_t *, kNumbOfHubSensorPorts + 1> kHubSensorPortNames = {L"S1", L"S2", L"S3", L"S4",
                                                                                           nullptr};

// The name column of a motor of the first slot that drives the speaker.
constexpr const wchar_t *kAudioNameColumn = L"Audio,";
// The name column of a motor that carries its default name.
constexpr const wchar_t *kDefaultNameColumn = L" ,";
// The word of "no encoder port" as a bare option.
constexpr const wchar_t *kNoPortWord = L"None";

constexpr const wchar_t *kBadMotorParmMessage = L"Bad motor config parm '%s'";
constexpr const wchar_t *kInvalidPragmaParmMessage = L"Invalid #pragma '%s' parm '%s'";
constexpr const wchar_t *kSensorPortSubject = L"Sensor Port";
constexpr const wchar_t *kHubTypeSubject = L"Hub Type";
constexpr const wchar_t *kHubsNeedToggleMessage =
    L"\"#pragma config(Hubs, ...)\" requires IDE feature \"External Motor/Servo Controllers\" enabled";
constexpr const wchar_t *kRenameWithoutMotorMessage =
    L"Renaming standard model motor name for index  '%s' with no motor defined";

constexpr TMotorTypes kMotorTypeSpeaker = 1;
constexpr TMotorTypes kMotorTypeLegacyNormal = 26;
constexpr TSensorTypes kSensorMotorOnSharedPort = 91;

// The option row of a word; null when the word is no option keyword.
const TMotorOptionKeyword *findMotorOption(const CString &sWord) {
  for (const TMotorOptionKeyword &row : kMotorOptionKeywords)
    if (sWord == row.pzKeyword) return &row;
  return nullptr;
}

// The word of an option effect (and drive side), as the Motor writer spells it.
const wchar_t *motorOptionWord(TMotorOptionEffect nEffect, TMotorDriveSide nSide = 0) {
  for (const TMotorOptionKeyword &row : kMotorOptionKeywords)
    if (row.nEffect == nEffect && row.nDriveSide == nSide) return row.pzKeyword;
  return L"";
}

// Parameter `n` of a line; empty beyond the last slot a line can carry.
CString lineParameter(const TTokenizedConfigParms &parms, int n) {
  return (n >= 0 && n < kMaxConfigTokens) ? parms.sParms[size_t(n)] : CString();
}

// True when the word is one or more of the digits 0-9 and nothing else.
bool bIsDecimalNumberWord(const CString &sWord) {
  if (sWord.IsEmpty()) return false;
  const std::wstring &s = sWord.str();
  return std::all_of(s.begin(), s.end(), [](wchar_t c) { return c >= L'0' && c <= L'9'; });
}

// Hub value of a hub keyword; -1 when the word is none of them.
int hubTypeOfWord(const CString &sWord) {
  if (sWord.IsEmpty()) return -1;
  for (int nHub = 0; pzMuxTypes[nHub] != nullptr; ++nHub)
    if (sWord == pzMuxTypes[nHub]) return nHub;
  return -1;
}


}  // namespace

int getNumbOfMotorIndexesToWrite() {
  const int nKind = pToggles->getPlatformKind();
  const bool bAllSlots = nKind == platformArduino || (nKind >= platformBoard10 && nKind <= platformBoard14);
  const int nCount = bAllSlots ? kMaxNumbOfMotors : pPlatformData->pMotorParms->nNumbOfMotorPorts;
  // A platform may report more motors than the record has slots.
  return std::clamp(nCount, 0, kMaxNumbOfMotors);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineMotor(const TTokenizedConfigParms &parms, bool,
                                                               TLineNumber line, CString &sError) {
  const CString &sPort = parms.sParms[1];
  const int nMotor = getIndexForDefaultMotorName(sPort);
  // The platform's count is trusted only as far as the record's slots reach.
  const int nLimit = std::min(pPlatformData->pMotorParms->nNumbOfMotorPorts, kMaxNumbOfMotors);
  if (nMotor < 0 || nMotor >= nLimit) {
    sError.Format(kBadMotorDeviceIndexMessage, sPort);
    return false;
  }
  const size_t n = size_t(nMotor);
  CString sCanonical;
  getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sCanonical);
  if (sPort != sCanonical) parseInfo.bNonCanonicalPortNames = true;

  configureDefaultMotorAndServoNamesForEquippedHubs(false);
  sMotorNames[n] = parms.sParms[2];
  motorNameLines[n] = line;
  setEmptyMotorNameToDefaultName(nMotor);
  parseInfo.motorDefinitionLines[n] = line;

  TMotorSlot &motor = settings.motors[n];
  motor.bEncoder = false;
  motor.bPIDControlled = false;
  motor.bReversed = false;
  setMotorIOPinsInConfig(nMotor, -1, -1, false);

  const TSensorHWTypesMask nHardwareMask = getAorDMotorTypeMask(nMotor);
  TMotorTypes nType = getMotorTypedefNameIndex(parms.sParms[3], nHardwareMask);
  if (nType == kMotorTypeLegacyNormal) nType = getDefaultMotorType(nMotor);
  nType = resolveMotorTypeForPlatform(nType);
  // A replacement type the port's hardware cannot drive has no name on this
  // port, so no line could carry it: the port has no motor.
  if (nType != 0 && CString(getMotorTypedefString(nType, nHardwareMask)).IsEmpty()) nType = 0;
  motor.nMotorType = nType;

  if (pToggles->getPlatformKind() == platformSharedPorts && nType != 0 &&
      settings.nSensorTypes[n] != kSensorMotorOnSharedPort) {
    // The motor takes the sensor port of the same index.
    removeMotorEncodersForSensorPort(nMotor);
    removeSensorTypeInConfig(nMotor);
    settings.nSensorTypes[n] = kSensorMotorOnSharedPort;
    settings.nSensorModes[n] = 0;
    calculateI2CUsage();
  }

  motor.nEncoderPort = -1;
  normalizeLegacyMotorConfiguration(nMotor);
  pToggles->copyDefaultPidSettings(nType, motor.pidSettings);

  // A sensor-port word of the board, as a sensor-port index; -1 when none.
  const TDeviceTypeMenuItem *pPortNames = getSensorNameDefinitions(settings.nCircuitBoardType);
  auto sensorPortOfWord = [pPortNames](const CString &sWord) {
    const int nPort = getTypedefIndex(pPortNames, sWord, true);
    return bIsSensorIndex(nPort) ? nPort : -1;
  };

  for (int i = 4; i < kMaxConfigTokens; ++i) {
    const CString &sOption = parms.sParms[size_t(i)];
    if (const TMotorOptionKeyword *pRow = findMotorOption(sOption)) {
      switch (pRow->nEffect) {
        case TMotorOptionEffect::kEncoder: motor.bEncoder = true; break;
        case TMotorOptionEffect::kEncoderPort:
          motor.bEncoder = true;
          motor.nEncoderPort = sensorPortOfWord(lineParameter(parms, ++i));
          break;
        case TMotorOptionEffect::kIOPins: {
          const int nFirst = sensorPortOfWord(lineParameter(parms, ++i));
          const int nSecond = sensorPortOfWord(lineParameter(parms, ++i));
          const bool bTwoPinType = motor.nMotorType == 2 || motor.nMotorType == 3;
          setMotorIOPinsInConfig(nMotor, nFirst, nSecond, bTwoPinType);
          break;
        }
        case TMotorOptionEffect::kPIDControl: motor.bPIDControlled = true; break;
        case TMotorOptionEffect::kOpenLoop: motor.bPIDControlled = false; break;
        case TMotorOptionEffect::kReversed: motor.bReversed = true; break;
        case TMotorOptionEffect::kDriveSide: motor.nDriveSide = pRow->nDriveSide; break;
        case TMotorOptionEffect::kNoEncoderPort: motor.nEncoderPort = -1; break;
      }
      continue;
    }
    if (sOption.IsEmpty() || bIsDecimalNumberWord(sOption)) continue;
    const int nPort = getIndexForSensorName(sOption);
    if (nPort >= 0) {
      setMapEncoderToMotor(nMotor, bIsSensorIndex(nPort) ? nPort : -1);
    } else if (sOption == kNoPortWord) {
      motor.nEncoderPort = -1;
    } else {
      sError.Format(kBadMotorParmMessage, sOption);
      return false;
    }
  }
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineRenameMotor(const TTokenizedConfigParms &parms, bool,
                                                                     TLineNumber line, CString &sError) {
  const CString &sPort = parms.sParms[1];
  const int nMotor = getIndexForDefaultMotorName(sPort);
  if (!bIsMotorIndex(nMotor)) {
    sError.Format(kBadMotorDeviceIndexMessage, sPort);
    return false;
  }
  sMotorNames[size_t(nMotor)] = parms.sParms[2];
  motorNameLines[size_t(nMotor)] = line;
  const TMotorTypes nType = settings.motors[size_t(nMotor)].nMotorType;
  if (nType == 0 || nType == kMotorTypeSpeaker) {
    sError.Format(kRenameWithoutMotorMessage, sPort);
    return false;
  }
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineHubs(const TTokenizedConfigParms &parms, CString &sError) {
  const CString &sPort = parms.sParms[1];
  int nPort = -1;
  for (int p = 0; kHubSensorPortNames[size_t(p)] != nullptr; ++p)
    if (sPort == kHubSensorPortNames[size_t(p)]) nPort = p;
  if (nPort < 0) {
    sError.Format(kInvalidPragmaParmMessage, kSensorPortSubject, sPort);
    return false;
  }
  std::array<TSensorPortHub, kNumbOfHubChainPositions> chain{};
  for (int pos = 0; pos < kNumbOfHubChainPositions; ++pos) {
    const CString &sHub = parms.sParms[size_t(2 + pos)];
    const int nHub = hubTypeOfWord(sHub);
    if (nHub < 0) {
      sError.Format(kInvalidPragmaParmMessage, kHubTypeSubject, sHub);
      return false;
    }
    chain[size_t(pos)] = nHub;
  }
  settings.nSensorPortHubs[size_t(nPort)] = chain;
  if (pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel)) return true;
  sError = kHubsNeedToggleMessage;
  return false;
}

bool CRobotConfigurationBasic::buildSourceCodeForMotors() {
  const int nKind = pToggles->getPlatformKind();
  const bool bBrick = nKind == platformNxt || nKind == platformBrick4Motor;
  const bool bExternalControllers = pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) != 0;
  const TPlatformParms &platform = *pPlatformData->pPlatformParms;
  const bool bAssociatesEncoder = pPlatformData->bPlatformAssociatesEncoderSensorWithMotor();
  bool bWritten = false;
  const int nCount = getNumbOfMotorIndexesToWrite();
  for (int nMotor = 0; nMotor < nCount; ++nMotor) {
    if (!bIsValidMotorPort(nMotor)) continue;
    TMotorSlot &motor = settings.motors[size_t(nMotor)];
    CString sDefaultName;
    getDefaultMotorNameLowLevel(nMotor, sDefaultName, true);
    if (motor.nMotorType == 0 || motor.nMotorType == -1) motor.nMotorType = bBrick ? getDefaultMotorType(nMotor) : 0;
    if (motor.nMotorType == 0 && sDefaultName.IsEmpty()) continue;
    // Normalising converts legacy types; a type it keeps keeps the flags its
    // line set, which the reset to the type's defaults would otherwise lose.
    const TMotorSlot before = motor;
    normalizeLegacyMotorConfiguration(nMotor);
    if (motor.nMotorType == before.nMotorType) {
      motor.bReversed = before.bReversed;
      motor.bPIDControlled = before.bPIDControlled;
    }
    const TMotorTypes nType = motor.nMotorType;
    const CString &sUserName = sMotorNames[size_t(nMotor)];
    const CString &sName = sUserName.IsEmpty() ? sDefaultName : sUserName;

    const bool bHubMotor =
        bExternalControllers && ((nKind == platformNxt && nMotor > 2) || (nKind == platformBrick4Motor && nMotor >= 4));
    if (!bHubMotor) {
      const TMotorCharacteristics *pRow = getMotorCharacteristics(nType);
      const bool bDefaultPID = pRow && pRow->bDefaultPIDControl;
      const bool bDefaultEncoder = pRow && pRow->bDefaultEncoder;
      const bool bDefaultReversed = pRow && pRow->bDefaultReversed;
      const bool bWrite = sName != sDefaultName || (platform.bMotorsHaveIOPins && nType != 0) ||
                          motor.bPIDControlled != bDefaultPID || motor.bEncoder != bDefaultEncoder ||
                          motor.bReversed != bDefaultReversed || (bAssociatesEncoder && motor.nEncoderPort >= 0) ||
                          (pRow && pRow->bAlwaysGenerate);
      if (!bWrite) continue;
    }

    CString sPortColumn;
    getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sPortColumn);
    sPortColumn += L",";
    CString sNameColumn = sName == sDefaultName ? CString(kDefaultNameColumn) : nameAsParameter(sName) + L",";
    if (platform.bFirstMotorCanBeAudio && nMotor == 0 && nType == kMotorTypeSpeaker) sNameColumn = kAudioNameColumn;
    const TMotorIOPinsDefinition *pPins = getMotorIOPin(nMotor);
    const CString sType = getMotorTypedefString(nType, pPins ? pPins->nHWTypesMask : 0);

    CString sControl;
    sControl.Format(L", %s",
                    motorOptionWord(motor.bPIDControlled ? TMotorOptionEffect::kPIDControl : TMotorOptionEffect::kOpenLoop));
    CString sDirection;
    if (motor.bReversed) sDirection.AppendFormat(L", %s", motorOptionWord(TMotorOptionEffect::kReversed));
    if (motor.nDriveSide == 1 || motor.nDriveSide == 2)
      sDirection.AppendFormat(L", %s", motorOptionWord(TMotorOptionEffect::kDriveSide, motor.nDriveSide));
    CString sEncoder;
    const wchar_t *pzEncoderPort = ::getSensorPortString(motor.nEncoderPort, settings.nCircuitBoardType);
    if (motor.bEncoder && bAssociatesEncoder)
      sEncoder.Format(L", %s, %s", motorOptionWord(TMotorOptionEffect::kEncoderPort), pzEncoderPort);
    else if (motor.bEncoder)
      sEncoder.Format(L", %s", motorOptionWord(TMotorOptionEffect::kEncoder));
    else if (bAssociatesEncoder && motor.nEncoderPort >= 0)
      // An encoder port without the encoder flag is written in the form that reads back as just that.
      sEncoder.Format(L", %s", pzEncoderPort);
    CString sIOPins;
    if (platform.bMotorsHaveIOPins) buildSourceCodeForHelperIOPins(sIOPins, motor.nPrimaryIOPin, motor.nSecondaryIOPin);

    CString sLine;
    sLine.Format(L"#pragma config(%s,  %-16s %-14s %s%s%s%s%s)", TConfigTypeDefns::getConfigTypeName(configTypeMotor),
                 sPortColumn, sNameColumn, sType, sControl, sDirection, sEncoder, sIOPins);
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}

bool CRobotConfigurationBasic::buildSourceCodeForMultiplexors() {
  const int nKind = pToggles->getPlatformKind();
  if (nKind != platformNxt && nKind != platformBrick4Motor) return false;
  bool bWritten = false;
  for (int nPort = 0; nPort < kNumbOfHubSensorPorts; ++nPort) {
    auto &chain = settings.nSensorPortHubs[size_t(nPort)];
    bool bAnyHub = false;
    for (TSensorPortHub &nHub : chain) {
      if (nHub < 0) nHub = 0;
      if (nHub != 0) {
        bAnyHub = true;
        break;
      }
    }
    if (!bAnyHub) continue;
    std::array<CString, kNumbOfHubChainPositions - 1> sLeading;
    for (size_t pos = 0; pos < sLeading.size(); ++pos) sLeading[pos] = CString(getMuxTypes(chain[pos])) + L",";
    CString sLine;
    sLine.Format(L"#pragma config(%s,  %s, %-9s %-9s %-9s %s)", TConfigTypeDefns::getConfigTypeName(configTypeHubs),
                 kHubSensorPortNames[size_t(nPort)], sLeading[0], sLeading[1], sLeading[2],
                 getMuxTypes(chain[kNumbOfHubChainPositions - 1]));
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}

void CRobotConfigurationBasic::buildSourceCodeForRenameMotor(int nMotor) {
  if (!bIsMotorIndex(nMotor)) return;
  CString sPort;
  getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sPort);
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeRenameMotor), sPort,
               nameAsParameter(sMotorNames[size_t(nMotor)]));
  addSourceLineToConfiguration(sLine);
}

void CRobotConfigurationBasic::buildSourceCodeForHelperIOPins(CString &sOut, int nPin1, int nPin2) {
  sOut.Format(L", %s, %s, %s", motorOptionWord(TMotorOptionEffect::kIOPins),
              ::getSensorPortString(nPin1, settings.nCircuitBoardType),
              ::getSensorPortString(nPin2, settings.nCircuitBoardType));
}
