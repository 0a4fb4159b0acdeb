// The bundled example programs against their recorded outputs: what `check`
// reports and what `format` prints, byte for byte.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "tests/subprocess.h"

namespace {

using testing_support::readFile;

namespace fs = std::filesystem;
using testing_support::lineDiff;
using testing_support::runRobotcfg;
using testing_support::TRunResult;

std::vector<std::string> exampleNames() {
  std::vector<std::string> names;
  for (const fs::directory_entry &entry : fs::directory_iterator(fs::path(ROBOTCONFIG_SOURCE_DIR) / "examples"))
    if (entry.is_directory()) names.push_back(entry.path().filename().string());
  std::sort(names.begin(), names.end());
  return names;
}

// Runs robotcfg in the project root, as the recorded outputs were made.
TRunResult run(const std::string &sCommand, const std::vector<std::string> &options, const std::string &sFile) {
  std::vector<std::string> args{sCommand};
  args.insert(args.end(), options.begin(), options.end());
  args.push_back(sFile);
  return runRobotcfg(args, {}, ROBOTCONFIG_SOURCE_DIR);
}

TEST(Examples, OutputsMatchTheRecordedOnes) {
  const std::vector<std::string> names = exampleNames();
  ASSERT_FALSE(names.empty()) << "no example directories under examples/";
  for (const std::string &sName : names) {
    SCOPED_TRACE("examples/" + sName);
    const fs::path dir = fs::path(ROBOTCONFIG_SOURCE_DIR) / "examples" / sName;
    const std::vector<std::string> options = testing_support::splitWords(readFile(dir / "options"));
    const std::string sExpectedCheck = readFile(dir / "expected-check.txt");
    const std::string sExpectedFormat = readFile(dir / "expected-format.c");
    const bool bRejected = sExpectedCheck.find(": error: ") != std::string::npos;
    const std::string sProgram = "examples/" + sName + "/program.c";

    const TRunResult check = run("check", options, sProgram);
    EXPECT_TRUE(check.sErr == sExpectedCheck) << "check: standard error\n" << lineDiff(sExpectedCheck, check.sErr);
    EXPECT_EQ(check.sOut, "");
    EXPECT_EQ(check.nExit, bRejected ? 1 : 0);

    const TRunResult format = run("format", options, sProgram);
    EXPECT_TRUE(format.sOut == sExpectedFormat) << "format: standard output\n"
                                                << lineDiff(sExpectedFormat, format.sOut);
    // format reports what check reports, and prints nothing when it refuses.
    EXPECT_TRUE(format.sErr == sExpectedCheck) << "format: standard error\n" << lineDiff(sExpectedCheck, format.sErr);
    EXPECT_EQ(format.nExit, bRejected ? 1 : 0);
    EXPECT_EQ(bRejected, sExpectedFormat.empty());

    if (sExpectedFormat.empty()) continue;
    const std::string sFormatted = "examples/" + sName + "/expected-format.c";
    const TRunResult again = run("format", options, sFormatted);
    EXPECT_TRUE(again.sOut == sExpectedFormat) << "formatting expected-format.c changes it\n"
                                                << lineDiff(sExpectedFormat, again.sOut);
    EXPECT_EQ(again.nExit, 0);
    std::vector<std::string> checkOptions{"--check"};
    checkOptions.insert(checkOptions.end(), options.begin(), options.end());
    const TRunResult unchanged = run("format", checkOptions, sFormatted);
    EXPECT_EQ(unchanged.nExit, 0) << unchanged.sErr;
    EXPECT_EQ(unchanged.sOut, "");
    // Warnings may still be printed (a board change, say); the block itself needs nothing.
    EXPECT_EQ(unchanged.sErr.find("not in generated form"), std::string::npos) << unchanged.sErr;
  }
}

}  // namespace
