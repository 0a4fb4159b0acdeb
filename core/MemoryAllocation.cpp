#include "core/PendingKeywords.h"
#include "core/RobotConfiguration.h"

void CRobotConfigurationBasic::updateCompileCodeSizeResults(int nSize1, int nSize2, int nSize3) {
  parseInfo.nCompileCodeSizeResults = {nSize1, nSize2, nSize3};
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineMemoryAllocation(const TTokenizedConfigParms &parms, bool, TLineNumber, CString &sError) {
  return bRejectKeywordNotYetSupported(parms, sError);
}

bool CRobotConfigurationBasic::buildSourceCodeForMemorySizes() { return false; }
