#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"
#include "host/DeviceCatalog.h"

bool CRobotConfigurationBasic::bParseConfigDefinitionLineMotor(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineRenameMotor(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineHubs(const TTokenizedConfigParms &parms, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForMotors() { return false; }
bool CRobotConfigurationBasic::buildSourceCodeForMultiplexors() { return false; }

void CRobotConfigurationBasic::buildSourceCodeForRenameMotor(int nMotor) {
  CString sPort;
  getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sPort);
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeRenameMotor), sPort,
               sMotorNames[size_t(nMotor)]);
  addSourceLineToConfiguration(sLine);
}

void CRobotConfigurationBasic::buildSourceCodeForHelperIOPins(CString &sOut, int nPin1, int nPin2) {
  sOut.Format(L", IOPins, %s, %s", ::getSensorPortString(nPin1, settings.nCircuitBoardType),
              ::getSensorPortString(nPin2, settings.nCircuitBoardType));
}
