#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

void CRobotConfigurationBasic::getDefaultMotorNameLowLevel(int nMotor, CString &sName, bool bHubStyle) const {
  sName.Empty();
  const int nKind = pToggles->getPlatformKind();
  switch (nKind) {
    case platformVexPic:
    case platformVexI2c:
      sName.Format(L"port%d", nMotor + 1);
      return;
    case platformSharedPorts:
    case platformKind9:
      sName.Format(L"motor%d", nMotor + 1);
      return;
    case platformNxt:
    case platformBrick4Motor:
      break;
    default:
      return;
  }
  const int nBase = nKind == platformNxt ? 3 : 4;
  if (nMotor < nBase) {
    sName.Format(L"motor%1c", static_cast<wchar_t>(L'A' + nMotor));
    return;
  }
  // Lettered names run on without gaps over the hub motors that exist.
  int nLetter = nBase;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port)
    for (int pos = 0; pos < kNumbOfHubChainPositions; ++pos) {
      const TSensorPortHub nHub = settings.nSensorPortHubs[size_t(port)][size_t(pos)];
      if (nHub <= 0) break;
      const int nMotorsOnHub = getMotorMuxNumbOfMotors(nHub);
      if (nMotorsOnHub < 0) continue;
      for (int m = 0; m < nMotorsOnHub; ++m) {
        if (getDeviceIndexOnMotorHub(nHub, port, pos, m) != nMotor) continue;
        if (!bHubStyle) sName.Format(L"motor%1c", static_cast<wchar_t>(L'A' + nLetter + m));
        else if (nHub == hubHTMotor) sName.Format(L"mtr_S%d_C%d_%d", port + 1, pos + 1, m + 1);
        else sName.Format(L"mtr_Matrix_S%d_%d", port + 1, m + 1);
        return;
      }
      nLetter += nMotorsOnHub;
    }
}

void CRobotConfigurationBasic::getDefaultMotorNameForPlatformOrControllerBoard(int nMotor, CString &sName) const {
  switch (settings.nPlatformKind) {
    case platformNxt:
    case platformBrick4Motor:
      getDefaultMotorNameLowLevel(nMotor, sName, true);
      break;
    case platformArduino:
      sName = (nMotor >= 0 && nMotor < kMaxNumbOfMotors) ? sBoardDefaultMotorNames[size_t(nMotor)] : CString();
      break;
    default:
      sName.Empty();
      break;
  }
  if (sName.IsEmpty()) getMotorPortStringForNonArduinoPlatforms(nMotor, sName);
}

void CRobotConfigurationBasic::updateDefaultMotorNameForPlatformOrControllerBoard(TMotorIndex nMotor,
                                                                                  const wchar_t *pzName) {
  if (bIsMotorIndex(nMotor) && sBoardDefaultMotorNames[size_t(nMotor)] != pzName)
    sBoardDefaultMotorNames[size_t(nMotor)] = pzName;
}

int CRobotConfigurationBasic::getIndexForDefaultMotorName(const CString &sName) const {
  if (sName.IsEmpty()) return -1;
  CString sPortName;
  const int nMotors = getMaxNumbOfMotorPorts();
  for (int n = 0; n < nMotors && n < kMaxNumbOfMotors; ++n) {
    getDefaultMotorNameForPlatformOrControllerBoard(n, sPortName);
    if (!sPortName.IsEmpty() && sPortName == sName) return n;
  }
  return getMotorIndexForNonArduinoPlatforms(sName);
}

void CRobotConfigurationBasic::setUserDefinedMotorNameInConfig(int nMotor, const CString &sName,
                                                              const TLineNumber &line) {
  if (!bIsMotorIndex(nMotor)) return;
  sMotorNames[size_t(nMotor)] = sName;
  motorNameLines[size_t(nMotor)] = line;
}

void CRobotConfigurationBasic::setEmptyMotorNameToDefaultName(int nMotor) {
  if (!bIsMotorIndex(nMotor)) return;
  TMotorSlot &motor = settings.motors[size_t(nMotor)];
  // Audio (1) and the unrowed legacy type (15) never take a default name.
  if (motor.nMotorType == 1 || motor.nMotorType == 15 || motor.nMotorType < 0 || motor.nMotorType > 31) return;
  if (!sMotorNames[size_t(nMotor)].IsEmpty()) return;
  CString sDefault;
  getDefaultMotorNameLowLevel(nMotor, sDefault, false);
  if (sDefault.IsEmpty()) return;
  sMotorNames[size_t(nMotor)] = sDefault;
  motorNameLines[size_t(nMotor)] = emptyLineNumber;
  if (motor.nMotorType == 0) {
    motor.bEncoder = bGetDefaultEncoderSetting(nMotor);
    if (!motor.bEncoder) motor.bPIDControlled = false;
    motor.bPIDControlled = bGetDefaultPidControlSetting(nMotor);
    motor.bReversed = bGetDefaultMotorReversedSetting(nMotor);
  }
}
