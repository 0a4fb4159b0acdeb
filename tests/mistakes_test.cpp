// The mistakes corpus: each program under tests/mistakes/ holds a mistake a
// user makes, its first line the options to check it with, and NAME.expected
// what check reports. Also the rule that check's verdict and format agree.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include <unistd.h>

#include "robotconfig/checker/RuleTable.h"
#include "tests/subprocess.h"

namespace {

using testing_support::readFile;

namespace fs = std::filesystem;
using testing_support::lineDiff;
using testing_support::runRobotcfg;
using testing_support::TRunResult;

// A program to check, with the options it is checked with.
struct TCase {
  std::string sFile;  ///< relative to the project root
  std::vector<std::string> options;
};

std::vector<TCase> corpus() {
  std::vector<TCase> cases;
  for (const fs::directory_entry &entry : fs::directory_iterator(fs::path(ROBOTCONFIG_SOURCE_DIR) / "tests/mistakes")) {
    if (entry.path().extension() != ".c") continue;
    std::string sFirst = readFile(entry.path());
    sFirst = sFirst.substr(0, sFirst.find('\n'));
    const std::string kPrefix = "// options:";
    cases.push_back({"tests/mistakes/" + entry.path().filename().string(),
                     sFirst.rfind(kPrefix, 0) == 0 ? testing_support::splitWords(sFirst.substr(kPrefix.size())) : std::vector<std::string>{}});
  }
  std::sort(cases.begin(), cases.end(), [](const TCase &a, const TCase &b) { return a.sFile < b.sFile; });
  return cases;
}

std::vector<TCase> examples() {
  std::vector<TCase> cases;
  for (const fs::directory_entry &entry : fs::directory_iterator(fs::path(ROBOTCONFIG_SOURCE_DIR) / "examples"))
    if (entry.is_directory())
      cases.push_back({"examples/" + entry.path().filename().string() + "/program.c",
                       testing_support::splitWords(readFile(entry.path() / "options"))});
  return cases;
}

TRunResult run(const std::string &sCommand, const TCase &c, const std::vector<std::string> &extra = {}) {
  std::vector<std::string> args{sCommand};
  args.insert(args.end(), c.options.begin(), c.options.end());
  args.insert(args.end(), extra.begin(), extra.end());
  args.push_back(c.sFile);
  return runRobotcfg(args, {}, ROBOTCONFIG_SOURCE_DIR);
}

TEST(Mistakes, CheckReportsWhatIsRecorded) {
  const std::vector<TCase> cases = corpus();
  ASSERT_GE(cases.size(), 60u);
  std::set<std::string> codesSeen;
  for (const TCase &c : cases) {
    SCOPED_TRACE(c.sFile);
    const std::string sExpected = readFile(fs::path(ROBOTCONFIG_SOURCE_DIR) / (c.sFile.substr(0, c.sFile.size() - 2) + ".expected"));
    const TRunResult check = run("check", c);
    EXPECT_TRUE(check.sErr == sExpected) << lineDiff(sExpected, check.sErr);
    EXPECT_EQ(check.nExit, sExpected.find(": error: ") != std::string::npos ? 1 : 0);
    for (size_t at = sExpected.find("[RC"); at != std::string::npos; at = sExpected.find("[RC", at + 1))
      codesSeen.insert(sExpected.substr(at + 1, 5));
    if (sExpected.find(": error: ") != std::string::npos) codesSeen.insert("RC001");
  }
  // Every rule is shown by some mistake; RC902 needs a block the record
  // cannot write, which the rules before it leave no program to produce.
  size_t nRules = 0;
  const TCheckRule *pRules = checkRules(nRules);
  const std::string sDocs = readFile(fs::path(ROBOTCONFIG_SOURCE_DIR) / "docs/DIAGNOSTICS.md");
  for (size_t i = 0; i < nRules; ++i)
    EXPECT_NE(sDocs.find(std::string("\n## ") + pRules[i].pzCode + "\n"), std::string::npos)
        << pRules[i].pzCode << " has no section in docs/DIAGNOSTICS.md";
  for (size_t i = 0; i < nRules; ++i)
    EXPECT_TRUE(codesSeen.count(pRules[i].pzCode) || std::string(pRules[i].pzCode) == "RC902")
        << "no mistake shows " << pRules[i].pzCode;
}

// What check passes, format writes; what format writes checks clean and formats to itself.
TEST(Mistakes, CheckCleanMeansFormatSettles) {
  std::vector<TCase> cases = corpus();
  const std::vector<TCase> more = examples();
  cases.insert(cases.end(), more.begin(), more.end());
  for (const TCase &c : cases) {
    SCOPED_TRACE(c.sFile);
    if (run("check", c).nExit != 0) continue;
    const TRunResult format = run("format", c);
    ASSERT_EQ(format.nExit, 0) << format.sErr;
    // Named after the case and the process: examples share a file name, and test runs may overlap.
    std::string sName = c.sFile;
    std::replace(sName.begin(), sName.end(), '/', '-');
    const fs::path formatted = fs::temp_directory_path() / ("robotcfg-" + std::to_string(getpid()) + "-" + sName);
    std::ofstream(formatted, std::ios::binary) << format.sOut;
    const TCase again{formatted.string(), c.options};
    const TRunResult check = run("check", again);
    EXPECT_EQ(check.nExit, 0) << check.sErr;
    // Port-order advice and a board the command line contradicts stay; anything else would be gone.
    std::istringstream lines(check.sErr);
    for (std::string sLine; std::getline(lines, sLine);)
      EXPECT_TRUE(sLine.find(": warning: ") == std::string::npos || sLine.find("[RC503]") != std::string::npos ||
                  sLine.find("[RC502]") != std::string::npos)
          << sLine;
    EXPECT_TRUE(run("format", again, {"--check"}).nExit == 0) << "formatting the formatted program changes it";
    fs::remove(formatted);
  }
}

}  // namespace
