#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"
#include "host/DeviceCatalog.h"
#include "host/Platform.h"

bool CRobotConfigurationBasic::bParseConfigDefinitionLineServo(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineServoPositions(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForServos() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForServoPositions() { return false; }

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
