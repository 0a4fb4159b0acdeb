// Throughput of the reading and writing roads: tokenizing one line, reading a
// whole program's configuration, and regenerating its block.
#include <benchmark/benchmark.h>

#include <string>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"

namespace {

const CString kMotorLine(L"   #pragma config(Motor,  port1,           leftMotor,     tmotorNormal, openLoop)  // drive");

// A program of `nLines` lines, a tenth of them configuration lines.
std::string makeProgram(int nLines) {
  std::string sProgram;
  for (int i = 0; i < nLines; ++i) {
    if (i % 10 == 0) sProgram += "#pragma config(DatalogSeries, " + std::to_string(i) + ", \"series name\", value, 50)\n";
    else sProgram += "  motor[leftMotor] = SensorValue[lineLeft] > 500 ? 40 : 70;  // steer\n";
  }
  return sProgram;
}

void BM_TokenizeLine(benchmark::State &state) {
  TTokenizedConfigParms parms;
  for (auto _ : state) benchmark::DoNotOptimize(CRobotConfigurationBasic::nTokenizeLine(kMotorLine, parms));
  state.SetItemsProcessed(state.iterations());
}
BENCHMARK(BM_TokenizeLine);

void BM_ReadProgram(benchmark::State &state) {
  CHostSelectionScope scope;
  selectHostPlatform(platformArduino);
  const CProgramText program(makeProgram(static_cast<int>(state.range(0))));
  CHostRobotConfiguration config;
  for (auto _ : state) benchmark::DoNotOptimize(readProgramConfiguration(config, program));
  state.SetBytesProcessed(int64_t(state.iterations()) * int64_t(program.bytes().size()));
}
BENCHMARK(BM_ReadProgram)->Arg(100)->Arg(10000);

void BM_FormatProgram(benchmark::State &state) {
  CHostSelectionScope scope;
  selectHostPlatform(platformArduino);
  const CProgramText program(makeProgram(static_cast<int>(state.range(0))));
  CHostRobotConfiguration config;
  readProgramConfiguration(config, program);
  for (auto _ : state) {
    CString sBlock;
    config.buildSourceCodeForConfiguration(sBlock, false);
    benchmark::DoNotOptimize(replaceConfigurationBlock(program, sBlock));
  }
  state.SetBytesProcessed(int64_t(state.iterations()) * int64_t(program.bytes().size()));
}
BENCHMARK(BM_FormatProgram)->Arg(100)->Arg(10000);

void BM_ClearConfiguration(benchmark::State &state) {
  CHostSelectionScope scope;
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration config;
  for (auto _ : state) config.clearConfigurationDefinition();
}
BENCHMARK(BM_ClearConfiguration);

}  // namespace
