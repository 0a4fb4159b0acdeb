#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"
#include "host/DeviceCatalog.h"

bool CRobotConfigurationBasic::bParseConfigDefinitionLineSensor(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineRenameSensor(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForSensors() { return false; }

void CRobotConfigurationBasic::buildSourceCodeForRenameSensor(int nPort) {
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeRenameSensor),
               ::getSensorPortString(nPort, settings.nCircuitBoardType), sSensorNames[size_t(nPort)]);
  addSourceLineToConfiguration(sLine);
}
