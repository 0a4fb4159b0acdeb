// Reads arbitrary configuration lines on every platform and checks that what
// the record writes back reads again without error and writes the same text.
#include <string_view>

#include "core/RobotConfiguration.h"
#include "fuzz/FuzzSupport.h"
#include "host/HostConfiguration.h"
#include "host/ProgramText.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  CHostSelectionScope scope;
  CCapturingMessageSink messages;
  selectPlatformFromInput(data, size);
  // Each input line is offered as a configuration line, with or without the pragma.
  std::string sProgram;
  const std::string_view input(reinterpret_cast<const char *>(data), size);
  size_t nStart = 0;
  while (nStart <= input.size()) {
    size_t nEnd = input.find('\n', nStart);
    if (nEnd == std::string_view::npos) nEnd = input.size();
    sProgram += "#pragma config(";
    sProgram += input.substr(nStart, nEnd - nStart);
    sProgram += ")\n";
    nStart = nEnd + 1;
  }
  CHostRobotConfiguration config;
  const CProgramText program(sProgram);
  if (!readProgramConfiguration(config, program).empty()) return 0;
  CString sFirst;
  config.buildSourceCodeForConfiguration(sFirst, false);
  CHostRobotConfiguration reread;
  const CProgramText generated(sFirst.toUtf8());
  fuzzCheck(readProgramConfiguration(reread, generated).empty(), "generated lines read back");
  CString sSecond;
  reread.buildSourceCodeForConfiguration(sSecond, false);
  fuzzCheck(sFirst == sSecond, "generation is a fixed point");
  return 0;
}
