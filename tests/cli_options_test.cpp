// robotcfg's options: the help of each command, the manual page, the completion scripts, the name of standard input.
#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>

#include "tests/subprocess.h"

namespace {

using testing_support::runRobotcfg;
using testing_support::TRunResult;

TEST(CliOptions, EachCommandDescribesItsOwnOptionsExitStatusAndExample) {
  const struct {
    const char *pzCommand;
    const char *pzOwnOption;
    const char *pzForeignOption;
  } kCases[] = {
      {"check", "--format text|json|sarif", "--in-place"},
      {"format", "-i, --in-place", "--format text|json|sarif"},
      {"diff", "-v, --verbose", "--diff"},
      {"save-model", "-o, --output OUT", "--check"},
      {"completion", "--platform KIND", "--stdin-filename"},
  };
  for (const auto &test : kCases) {
    SCOPED_TRACE(test.pzCommand);
    const TRunResult r = runRobotcfg({test.pzCommand, "--help"});
    EXPECT_EQ(r.nExit, 0);
    EXPECT_EQ(r.sOut.rfind(std::string("usage: robotcfg [options] ") + test.pzCommand, 0), 0u) << r.sOut;
    EXPECT_NE(r.sOut.find(std::string("\n  ") + test.pzOwnOption), std::string::npos) << r.sOut;
    EXPECT_EQ(r.sOut.find(test.pzForeignOption), std::string::npos) << r.sOut;
    EXPECT_NE(r.sOut.find("\nexit status: 0 "), std::string::npos) << r.sOut;
    EXPECT_NE(r.sOut.find(std::string("\nexample:\n  robotcfg ") + test.pzCommand), std::string::npos) << r.sOut;
  }
}

TEST(CliOptions, ManualPageIsTheOneTheHelpTextsWrite) {
  // docs/robotcfg.1 is written by `make man`; it must not drift from the tool.
  std::ifstream in(std::string(ROBOTCONFIG_SOURCE_DIR) + "/docs/robotcfg.1", std::ios::binary);
  std::ostringstream page;
  page << in.rdbuf();
  const TRunResult r = runRobotcfg({"--man"});
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(page.str(), r.sOut) << "run 'make man' and commit docs/robotcfg.1";
  EXPECT_NE(r.sOut.find(".SS save\\-model FILE \\-o OUT\n"), std::string::npos);
  EXPECT_NE(r.sOut.find(".B \\-i, \\-\\-in\\-place\n"), std::string::npos);
}

TEST(CliOptions, CompletionScriptsNameCommandsOptionsPlatformsAndBoards) {
  for (const char *pzShell : {"bash", "zsh", "fish"}) {
    SCOPED_TRACE(pzShell);
    const TRunResult r = runRobotcfg({"completion", pzShell});
    EXPECT_EQ(r.nExit, 0);
    for (const char *pzWord : {"save-model", "in-place", "stdin-filename", "vexi2c", "typeCktBoardUno", "sarif"})
      EXPECT_NE(r.sOut.find(pzWord), std::string::npos) << pzWord;
  }
  // The bash script is valid bash.
  const TRunResult script = runRobotcfg({"completion", "bash"});
  const TRunResult syntax = testing_support::runProcess({"/bin/bash", "-n"}, script.sOut);
  EXPECT_EQ(syntax.nExit, 0) << syntax.sErr;
}

}  // namespace

namespace {

TEST(CliOptions, StdinFilenameNamesTheProgramReadFromStandardInput) {
  const std::string sProgram = "#pragma config(Motor, port1, m, tmotorBogus)\n";
  const TRunResult r = runRobotcfg({"check", "--platform", "vexpic", "--stdin-filename", "src/robot.c", "-"}, sProgram);
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sErr.rfind("src/robot.c:1:", 0), 0u) << r.sErr;
}

}  // namespace
