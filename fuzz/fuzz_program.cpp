// Formats arbitrary program text and checks that formatting a formatted
// program changes nothing. What the checker refuses, format refuses too, so
// inputs with a checker error are skipped; every other input must be written.
#include <string_view>

#include "fuzz/FuzzSupport.h"
#include "robotconfig/checker/ProgramChecker.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

namespace {

// The program with its block regenerated; false when the checker finds an error.
bool formatProgram(const std::string &sBytes, std::string &sOut) {
  CHostRobotConfiguration config;
  const CProgramText program(sBytes);
  {
    // The check reads like format: a board line of the program must not stay selected.
    CHostSelectionScope selection;
    if (checkProgram(config, program).nErrors > 0) return false;
  }
  CString sBlock;
  std::vector<TConfigurationDiagnostic> refused;
  fuzzCheck(generateSettledBlock(config, sBlock, &refused), "a program the checker passes is written back");
  sOut = replaceConfigurationBlock(program, sBlock);
  fuzzCheck(programHoldsBlock(program, sBlock) == (sOut == sBytes), "the block check agrees with the replaced text");
  return true;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  CHostSelectionScope scope;
  CCapturingMessageSink messages;
  selectPlatformFromInput(data, size);
  std::string sOnce, sTwice;
  if (!formatProgram(std::string(reinterpret_cast<const char *>(data), size), sOnce)) return 0;
  fuzzCheck(formatProgram(sOnce, sTwice), "formatted program checks clean");
  fuzzCheck(sOnce == sTwice, "formatting is a fixed point");
  return 0;
}
