// Checks arbitrary program text (the example programs, mutated): the checker
// never fails, its findings point into the program, and a program it passes
// keeps every device through format.
#include "fuzz/CheckerProperty.h"
#include "fuzz/FuzzSupport.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  CHostSelectionScope scope;
  CCapturingMessageSink messages;
  selectPlatformFromInput(data, size);
  const std::string sBytes(reinterpret_cast<const char *>(data), size);
  {
    CHostSelectionScope inner;
    const CProgramText program(sBytes);
    const TCheckResult result = checkProgramText(program);
    for (const TFinding &finding : result.findings) {
      fuzzCheck(finding.nLine >= 0 && size_t(finding.nLine) <= program.lines().size(), "findings point into the program");
      fuzzCheck(finding.nColumn >= 0 && !finding.sCode.empty() && !finding.sMessage.empty(), "findings are complete");
    }
  }
  const std::string sBroken = checker_property::promiseBroken(sBytes);
  if (!sBroken.empty()) std::fprintf(stderr, "%s\n", sBroken.c_str());
  fuzzCheck(sBroken.empty(), "a program the checker passes keeps its devices through format");
  return 0;
}
