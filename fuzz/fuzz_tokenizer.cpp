// Tokenizes arbitrary bytes as one source line and checks the token limits.
#include <string_view>

#include "robotconfig/core/RobotConfiguration.h"
#include "fuzz/FuzzSupport.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  const CString sLine = CString::fromUtf8(std::string_view(reinterpret_cast<const char *>(data), size));
  TTokenizedConfigParms parms;
  const TTokenizedLineType nType = CRobotConfigurationBasic::nTokenizeLine(sLine, parms);
  fuzzCheck(nType >= lineTypeBlank && nType <= lineTypeNoTokens, "line type in range");
  if (nType == lineTypeConfigPragma || nType == lineTypeMarkerComment) {
    fuzzCheck(parms.nNumbOfParms >= 1 && parms.nNumbOfParms <= kMaxConfigTokens, "token count in range");
    for (const CString &sToken : parms.sParms) fuzzCheck(sToken.GetLength() <= kMaxConfigTokenLength, "token length");
  }
  return 0;
}
