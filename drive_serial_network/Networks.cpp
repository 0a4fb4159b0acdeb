#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"

bool CRobotConfigurationBasic::bParseConfigDefinitionLineNetworkDefinition(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineNetworkNode(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForMultiNetworks() { return false; }
