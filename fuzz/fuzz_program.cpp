// Formats arbitrary program text and checks that formatting a formatted
// program changes nothing.
#include <string_view>

#include "fuzz/FuzzSupport.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

namespace {

// The program with its block regenerated; false when a line was refused.
bool formatProgram(const std::string &sBytes, std::string &sOut) {
  CHostRobotConfiguration config;
  const CProgramText program(sBytes);
  if (!readProgramConfiguration(config, program).empty()) return false;
  CString sBlock;
  if (!bSettles(config, sBlock)) return false;
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
  fuzzCheck(formatProgram(sOnce, sTwice), "formatted program reads back");
  fuzzCheck(sOnce == sTwice, "formatting is a fixed point");
  return 0;
}
