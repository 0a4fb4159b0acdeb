#include "core/RobotConfiguration.h"
#include "host/DeviceCatalog.h"

int CRobotConfigurationBasic::getIndexForSensorName(const CString &sName) const {
  return getTypedefIndex(getSensorNameDefinitions(settings.nCircuitBoardType), sName, true);
}

TDriveTrainType CRobotConfigurationBasic::getIndexForDriveTrainType(const CString &sWord) const {
  return getTypedefIndex(nDriveTrainTypes, sWord, true);
}

TJoystickDriveType CRobotConfigurationBasic::getIndexForJoystickDriveType(const CString &sWord) const {
  return getTypedefIndex(nJoystickDriveTypes, sWord, true);
}

TJoystickAxisScaling CRobotConfigurationBasic::getIndexForJoystickScalingType(const CString &sWord) const {
  return getTypedefIndex(nJoystickAxisScalingTypes, sWord, true);
}

TGripperArmType CRobotConfigurationBasic::getIndexForGripperArmType(const CString &sWord) const {
  return getTypedefIndex(nGripperArmTypes, sWord, true);
}

const TDeviceTypeMenuItem *CRobotConfigurationBasic::getSensorNameDefinitionsForCktBoards() const {
  return ::getSensorNameDefinitionsForCktBoards(settings.nCircuitBoardType);
}
