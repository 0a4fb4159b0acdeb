// The reading road followed by generation: arbitrary configuration lines on
// any platform, board and toggle; what the record writes back must read again
// without error, write the same text, and give an equal record.
#include <string_view>

#include "robotconfig/core/RobotConfiguration.h"
#include "fuzz/FuzzSupport.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

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
  const std::vector<TConfigurationDiagnostic> diagnostics = readProgramConfiguration(config, program);
  for (const TConfigurationDiagnostic &diagnostic : diagnostics)
    fuzzCheck(!diagnostic.sMessage.IsEmpty(), "a rejected line comes with a message");
  if (!diagnostics.empty()) return 0;
  // What the record writes reads back to itself, except where a rule moves a
  // setting on reading (see the README).
  if (!bReadsBackToItself(config)) return 0;
  // The settled block is the one a program gets, and from there nothing changes.
  CString sFirst;
  if (!bSettles(config, sFirst)) return 0;
  CHostRobotConfiguration reread;
  fuzzCheck(readProgramConfiguration(reread, CProgramText(sFirst.toUtf8())).empty(), "generated lines read back");
  CString sSecond;
  reread.buildSourceCodeForConfiguration(sSecond, false);
  fuzzCheck(sFirst == sSecond, "generation is a fixed point");
  CHostRobotConfiguration third;
  fuzzCheck(readProgramConfiguration(third, CProgramText(sSecond.toUtf8())).empty(), "regenerated lines read back");
  CString sThird;
  third.buildSourceCodeForConfiguration(sThird, false);
  fuzzCheck(reread.compareConfiguration(third) == configCompareSame, "read-back record compares equal");
  return 0;
}
