#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"

bool CRobotConfigurationBasic::bCanSystemUartPortBeReconfigured() const { return false; }

const TSerialPortIOPinsDefn *CRobotConfigurationBasic::getUARTPortIOPinDefinition(int) const { return nullptr; }

const TSerialPortIOPinsDefn *CRobotConfigurationBasic::getI2CPortIOPinDefinition(int) const { return nullptr; }

void CRobotConfigurationBasic::setUartIOPinsInConfig(int) {}

void CRobotConfigurationBasic::setUartIOPinsInConfigNone(int) {}

void CRobotConfigurationBasic::setI2CIOPinsInConfig(int) {}

void CRobotConfigurationBasic::setI2CIOPinsInConfigNone(int) {}

bool CRobotConfigurationBasic::checkUartAssignmentForMultiRobot(TLineNumber) const { return false; }

bool CRobotConfigurationBasic::bParseConfigDefinitionLineUartOrI2C(TConfigTypes, const TTokenizedConfigParms &parms, bool,
                                                                  TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForSerialPorts() { return false; }
