#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"

void CRobotConfigurationBasic::clearDriveTrain() {}
void CRobotConfigurationBasic::setDriveTrainType(TDriveTrainType) {}
void CRobotConfigurationBasic::setGripperArmType(TGripperArmType) {}
int CRobotConfigurationBasic::getDriveTrainMotorIndex(int) const { return -1; }
void CRobotConfigurationBasic::setDriveTrainMotorIndex(int, int) {}
TMotorTypes CRobotConfigurationBasic::getDriveTrainMotorType(int) const { return 0; }
void CRobotConfigurationBasic::setDriveTrainMotorType(int, TMotorTypes) {}
bool CRobotConfigurationBasic::getDriveTrainMotorReversed(int) const { return false; }
void CRobotConfigurationBasic::setDriveTrainMotorReversed(int, bool) {}
int CRobotConfigurationBasic::getGripperArmMotorIndex(int) const { return -1; }
void CRobotConfigurationBasic::setGripperArmMotorIndex(int, int) {}
TMotorTypes CRobotConfigurationBasic::getGripperArmMotorType(int) const { return 0; }
void CRobotConfigurationBasic::setGripperArmMotorType(int, TMotorTypes) {}
bool CRobotConfigurationBasic::getGripperArmMotorReversed(int) const { return false; }
void CRobotConfigurationBasic::setGripperArmMotorReversed(int, bool) {}
void CRobotConfigurationBasic::initializeEmptyMotor(int) {}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineDriveTrainMotors(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineDriveTrainWheels(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineGripperArm(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineJoystickDrive(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForDriveTrainMotors() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForDriveTrainWheels() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForGripperArm() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForGameController() { return false; }
