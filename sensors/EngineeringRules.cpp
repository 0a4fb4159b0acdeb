#include "core/RobotConfiguration.h"

void CRobotConfigurationBasic::checkEngineeringRules(bool) {}

int CRobotConfigurationBasic::nGetNumberOfAnalogVexChannelsAndReportErrors(bool) { return 0; }

void CRobotConfigurationBasic::digitalInPortAssignmentWarningForVexPIC(int, int) {}

void CRobotConfigurationBasic::digitalOutPortAssignmentWarning(int, int) {}

void CRobotConfigurationBasic::errorInvalidQuadSensorPort(int, int) {}
