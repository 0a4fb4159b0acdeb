// The checker's cost beside plain reading: the same programs read on the
// road alone, and checked (road, line rules and the regenerated-block net).
#include <benchmark/benchmark.h>

#include <fstream>
#include <iterator>
#include <string>

#include "robotconfig/checker/ProgramChecker.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

namespace {

std::string readBenchFile(const char *pzPath) {
  std::ifstream in(pzPath, std::ios::binary);
  return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

// Programs measured: the brick program (hubs, many motors) and a VEX program with mistakes.
const std::string &benchProgram(int nWhich) {
  static const std::string sBrick = readBenchFile(ROBOTCONFIG_BENCH_DIR "/brick_program.c");
  static const std::string sVex = readBenchFile(ROBOTCONFIG_SOURCE_DIR "/tests/mistakes/vexi2c-sensor-defined-twice.c");
  return nWhich == 0 ? sBrick : sVex;
}

void selectFor(int nWhich) {
  if (nWhich == 0) selectHostPlatform(platformNxt, -1, true);
  else selectHostPlatform(platformVexI2c);
}

void BM_ReadOnly(benchmark::State &state) {
  CHostSelectionScope scope;
  CCapturingMessageSink quiet;
  selectFor(int(state.range(0)));
  const CProgramText program(benchProgram(int(state.range(0))));
  for (auto _ : state) {
    CHostRobotConfiguration config;
    benchmark::DoNotOptimize(readProgramConfiguration(config, program));
  }
  state.SetBytesProcessed(int64_t(state.iterations()) * int64_t(program.bytes().size()));
}
BENCHMARK(BM_ReadOnly)->Arg(0)->Arg(1);

void BM_Check(benchmark::State &state) {
  CHostSelectionScope scope;
  selectFor(int(state.range(0)));
  const CProgramText program(benchProgram(int(state.range(0))));
  for (auto _ : state) {
    CHostRobotConfiguration config;
    benchmark::DoNotOptimize(checkProgram(config, program));
  }
  state.SetBytesProcessed(int64_t(state.iterations()) * int64_t(program.bytes().size()));
}
BENCHMARK(BM_Check)->Arg(0)->Arg(1);

}  // namespace
