#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"

bool CRobotConfigurationBasic::bParseConfigDefinitionLineProgramType(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineFirmwareFeatures(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForFirmwareFeatures() { return false; }
