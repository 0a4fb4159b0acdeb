#include <algorithm>

#include "robotconfig/core/ParameterText.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// Position of a SrvoPosition line that leaves a position empty.
constexpr uint8_t kEmptyServoPosition = 128;
// Parameter of a SrvoPosition line that holds the first position (the name is parameter 1).
constexpr int kFirstServoPositionParm = 2;

// One servo position as a line gives it: 128 when left empty, else the number's low 8 bits.
uint8_t servoPositionOf(const CString &sText) {
  if (sText.IsEmpty()) return kEmptyServoPosition;
  bool bOk = false;
  return static_cast<uint8_t>(getInteger(sText, bOk));
}

}  // namespace

bool CRobotConfigurationBasic::bParseConfigDefinitionLineServo(const TTokenizedConfigParms &parms, bool,
                                                               TLineNumber line, CString &sError) {
  const TServoTypes nType = getServoTypedefNameIndex(parms.sParms[3]);
  const int nServo = getServoIndex(parms.sParms[1]);
  if (!bIsServoIndex(nServo)) {
    sError.Format(L"Bad servo device index '%s'", parms.sParms[1]);
    return false;
  }
  configureDefaultMotorAndServoNamesForEquippedHubs(false);
  setUserDefinedServoNameInConfig(nServo, parms.sParms[2], line);
  // Runs before the new type is stored, so the default name follows the servo's previous type.
  if (parms.sParms[2].IsEmpty()) setEmptyServoNameToDefaultName(nServo);
  setServoType(nServo, nType);
  setServoDefinitionLine(nServo, line);
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineServoPositions(const TTokenizedConfigParms &parms, bool,
                                                                        TLineNumber, CString &sError) {
  const int nSet = settings.nNumbOfServoPositions;
  if (nSet < 0 || nSet >= kMaxNumbOfServoPositionSets) {
    sError = L"Maximum limit of servo position settinge exceeded";
    return false;
  }
  std::array<uint8_t, kNumbOfServoPositionsPerSet> positions{};
  for (int j = 0; j < kNumbOfServoPositionsPerSet; ++j)
    positions[size_t(j)] = servoPositionOf(parms.sParms[size_t(kFirstServoPositionParm + j)]);
  sServoPositionNames[size_t(nSet)] = parms.sParms[1];
  settings.nServoPositions[size_t(nSet)] = positions;
  settings.nNumbOfServoPositions = nSet + 1;
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForServos() {
  const int nServos = std::min<int>(pPlatformData->pPlatformParms->nNumbOfServoPorts, kMaxNumbOfServos);
  bool bWritten = false;
  CString sPort, sLine;
  for (int i = 0; i < nServos; ++i) {
    const TServoTypes nType = settings.nServoTypes[size_t(i)];
    const CString &sName = sServoNames[size_t(i)];
    if (sName.IsEmpty() && nType == 0) continue;
    if (!bIsValidServoPort(i)) continue;
    getDefaultServoNameLowLevel(i, sPort, true);
    sLine.Format(L"#pragma config(%s,  %-16s %-21s %s)", TConfigTypeDefns::getConfigTypeName(configTypeServo),
                 sPort + L",", nameAsParameter(sName) + L",", getServoTypedefString(nType));
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}

bool CRobotConfigurationBasic::buildSourceCodeForServoPositions() {
  const int nSets = std::clamp<int>(settings.nNumbOfServoPositions, 0, kMaxNumbOfServoPositionSets);
  bool bWritten = false;
  CString sValues, sLine;
  for (int nSet = 0; nSet < nSets; ++nSet) {
    const CString &sName = sServoPositionNames[size_t(nSet)];
    if (sName.IsEmpty()) continue;
    const auto &positions = settings.nServoPositions[size_t(nSet)];
    sValues.Format(L"%3d", positions[0]);
    for (int j = 1; j < kNumbOfServoPositionsPerSet; ++j) {
      const CString sSoFar(sValues);
      sValues.Format(L"%s, %3d", sSoFar, positions[size_t(j)]);
    }
    sLine.Format(L"#pragma config(%s,  %-22s %s)", TConfigTypeDefns::getConfigTypeName(configTypeServoPosition),
                 nameAsParameter(sName) + L",", sValues);
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}

int CRobotConfigurationBasic::getMaxNumbOfServoPorts() const {
  // Servos exist only on the controllers that the toggle makes available.
  return pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) ? 96 : 0;
}

void CRobotConfigurationBasic::setUserDefinedServoNameInConfig(int nServo, const CString &sName,
                                                              const TLineNumber &line) {
  if (nServo < 0 || nServo >= kMaxNumbOfServos) return;
  sServoNames[size_t(nServo)] = sName;
  servoNameLines[size_t(nServo)] = line;
}

void CRobotConfigurationBasic::getDefaultServoNameLowLevel(int nServo, CString &sName, bool bHubNames) const {
  sName.Empty();
  const int nKind = pToggles->getPlatformKind();
  if (nKind != platformNxt && nKind != platformBrick4Motor) return;
  // Servos are numbered without gaps over the servo controllers that exist.
  int nCount = 0;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port)
    for (int pos = 0; pos < kNumbOfHubChainPositions; ++pos) {
      const TSensorPortHub nHub = settings.nSensorPortHubs[size_t(port)][size_t(pos)];
      if (nHub == 0 || nHub == -1) break;
      const int nServos = getServoMuxNumbOfServos(nHub);
      if (nServos < 0) continue;
      for (int s = 0; s < nServos; ++s) {
        if (getDeviceIndexOnServoHub(nHub, port, pos, s) != nServo) continue;
        if (!bHubNames) sName.Format(L"servo%d", nCount + s + 1);
        else if (nHub == hubHTServo) sName.Format(L"srvo_S%d_C%d_%d", port + 1, pos + 1, s + 1);
        else sName.Format(L"srvo_Matrix_S%d_%d", port + 1, s + 1);
        return;
      }
      nCount += nServos;
    }
}

void CRobotConfigurationBasic::getDefaultServoNameForPlatformOrControllerBoard(int nServo, CString &sName) const {
  switch (settings.nPlatformKind) {
    case platformNxt:
    case platformBrick4Motor:
      getDefaultServoNameLowLevel(nServo, sName, true);
      if (sName.IsEmpty()) getServoPortString(nServo, sName);
      break;
    case platformArduino:
      sName = (nServo >= 0 && nServo < kMaxNumbOfMotors) ? sBoardDefaultMotorNames[size_t(nServo)] : CString();
      if (sName.IsEmpty()) getMotorPortStringForNonArduinoPlatforms(nServo, sName);
      break;
    default:
      getServoPortString(nServo, sName);
      break;
  }
}

void CRobotConfigurationBasic::setDefaultServoNameToEmpty(int nServo) {
  if (nServo < 0 || nServo >= kMaxNumbOfServos) return;
  CString sDefault;
  getDefaultServoNameLowLevel(nServo, sDefault, false);
  if (sServoNames[size_t(nServo)] != sDefault) return;
  sServoNames[size_t(nServo)].Empty();
  servoNameLines[size_t(nServo)] = emptyLineNumber;
}

void CRobotConfigurationBasic::setEmptyServoNameToDefaultName(int nServo) {
  if (nServo < 0 || nServo >= kMaxNumbOfServos) return;
  const TServoTypes nType = settings.nServoTypes[size_t(nServo)];
  if (nType < 0 || nType > 2 || !sServoNames[size_t(nServo)].IsEmpty()) return;
  getDefaultServoNameLowLevel(nServo, sServoNames[size_t(nServo)], false);
  servoNameLines[size_t(nServo)] = emptyLineNumber;
}
