#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"
#include "host/Platform.h"

TPidSettings *CRobotConfigurationBasic::getMotorPidSettings(int nMotor) {
  return bIsMotorIndex(nMotor) ? &settings.motors[size_t(nMotor)].pidSettings : nullptr;
}

void CRobotConfigurationBasic::setMotorPidSettings(int nMotor, const TPidSettings &pidSettings) {
  if (bIsMotorIndex(nMotor)) settings.motors[size_t(nMotor)].pidSettings.copyPidSettings(&pidSettings);
}

void CRobotConfigurationBasic::setMotorPidSettingsDefaultInConfig(int nMotor, TMotorTypes nType) {
  if (!bIsMotorIndex(nMotor)) return;
  TPidSettings defaults;
  pToggles->copyDefaultPidSettings(nType, defaults);
  settings.motors[size_t(nMotor)].pidSettings.copyPidSettings(&defaults);
}

bool CRobotConfigurationBasic::bIsMotorUsingDefaultPidSettings(int nMotor) const {
  if (!bIsMotorIndex(nMotor)) return false;
  const TMotorSlot &motor = settings.motors[size_t(nMotor)];
  return motor.pidSettings.bIdenticalPidSettings(*pToggles->getDefaultPidSettings(motor.nMotorType)) ||
         motor.pidSettings.bIdenticalPidSettings(emptyPidSettings);
}

void CRobotConfigurationBasic::validateMapEncoderToMotor(int) {}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineMotorPidSettings(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForMotorPidSettings() { return false; }

bool CRobotConfigurationBasic::buildSourceCodeForMotorPidSettings(int, const CString &) { return false; }
