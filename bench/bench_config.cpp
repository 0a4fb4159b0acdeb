// Throughput of the reading and writing roads: tokenizing one line, reading a
// program's configuration, regenerating its block, and the record's own
// construct, clear, copy and compare. The BM_Brick* benchmarks are the rows of
// docs/PERFORMANCE.md: a 31-line brick block (hubs, sensors, motors, PID
// settings, servos, servo positions) in a short program.
#include <benchmark/benchmark.h>

#include <dirent.h>

#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size);

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

// The brick program of the table, read from bench/brick_program.c.
const std::string &brickProgram() {
  static const std::string sProgram = [] {
    std::ifstream in(ROBOTCONFIG_BENCH_DIR "/brick_program.c", std::ios::binary);
    return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
  }();
  return sProgram;
}

// Selects the brick platform the table is measured on, while it lives.
struct TBrickPlatform {
  CHostSelectionScope scope;
  CCapturingMessageSink quiet;
  TBrickPlatform() { selectHostPlatform(platformNxt, -1, true); }
};

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

void BM_BrickRead(benchmark::State &state) {
  TBrickPlatform platform;
  const CProgramText program(brickProgram());
  CHostRobotConfiguration config;
  for (auto _ : state) {
    CHostSelectionScope board;  // the tool starts every file from the command line's board
    benchmark::DoNotOptimize(readProgramConfiguration(config, program));
  }
}
BENCHMARK(BM_BrickRead);

void BM_BrickGenerate(benchmark::State &state) {
  TBrickPlatform platform;
  const CProgramText program(brickProgram());
  CHostRobotConfiguration config;
  readProgramConfiguration(config, program);
  for (auto _ : state) {
    CString sBlock;
    config.buildSourceCodeForConfiguration(sBlock, false);
    benchmark::DoNotOptimize(sBlock);
  }
}
BENCHMARK(BM_BrickGenerate);

void BM_BrickReadGenerateReplace(benchmark::State &state) {
  TBrickPlatform platform;
  const CProgramText program(brickProgram());
  for (auto _ : state) {
    CHostSelectionScope board;
    CHostRobotConfiguration config;
    readProgramConfiguration(config, program);
    CString sBlock;
    config.buildSourceCodeForConfiguration(sBlock, false);
    benchmark::DoNotOptimize(replaceConfigurationBlock(program, sBlock));
  }
}
BENCHMARK(BM_BrickReadGenerateReplace);

// What `format` does per file: read, settle the block, replace it.
void BM_BrickFormatSettled(benchmark::State &state) {
  TBrickPlatform platform;
  const CProgramText program(brickProgram());
  for (auto _ : state) {
    CHostSelectionScope board;
    CHostRobotConfiguration config;
    readProgramConfiguration(config, program);
    CString sBlock;
    generateSettledBlock(config, sBlock);
    benchmark::DoNotOptimize(replaceConfigurationBlock(program, sBlock));
  }
}
BENCHMARK(BM_BrickFormatSettled);

void BM_RecordConstructClear(benchmark::State &state) {
  TBrickPlatform platform;
  for (auto _ : state) {
    CHostRobotConfiguration config;
    config.clearConfigurationDefinition();
    benchmark::DoNotOptimize(config);
  }
}
BENCHMARK(BM_RecordConstructClear);

void BM_ClearConfiguration(benchmark::State &state) {
  TBrickPlatform platform;
  CHostRobotConfiguration config;
  for (auto _ : state) config.clearConfigurationDefinition();
}
BENCHMARK(BM_ClearConfiguration);

void BM_RecordCopy(benchmark::State &state) {
  TBrickPlatform platform;
  CHostRobotConfiguration source, target;
  readProgramConfiguration(source, CProgramText(brickProgram()));
  for (auto _ : state) {
    target = source;
    benchmark::DoNotOptimize(target);
  }
}
BENCHMARK(BM_RecordCopy);

void BM_RecordCompare(benchmark::State &state) {
  TBrickPlatform platform;
  CHostRobotConfiguration first, second;
  readProgramConfiguration(first, CProgramText(brickProgram()));
  second = first;
  for (auto _ : state) benchmark::DoNotOptimize(first == second);
}
BENCHMARK(BM_RecordCompare);

// The round-trip fuzz harness run over its stored corpus, without the
// fuzzer's instrumentation: items per second are executions per second.
void BM_FuzzRoundTrip(benchmark::State &state) {
  std::vector<std::string> inputs;
  const std::string sDir = ROBOTCONFIG_SOURCE_DIR "/fuzz/corpus/fuzz_program";
  if (DIR *pDir = ::opendir(sDir.c_str())) {
    while (const dirent *pEntry = ::readdir(pDir)) {
      if (pEntry->d_name[0] == '.') continue;
      std::ifstream in(sDir + "/" + pEntry->d_name, std::ios::binary);
      inputs.emplace_back((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
    }
    ::closedir(pDir);
  }
  if (inputs.empty()) {
    state.SkipWithError("no corpus");
    return;
  }
  size_t i = 0;
  for (auto _ : state) {
    const std::string &sInput = inputs[i++ % inputs.size()];
    LLVMFuzzerTestOneInput(reinterpret_cast<const uint8_t *>(sInput.data()), sInput.size());
  }
  state.SetItemsProcessed(state.iterations());
}
BENCHMARK(BM_FuzzRoundTrip);

}  // namespace
