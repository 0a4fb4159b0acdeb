// robotcfg with board programs: the IDE's board following the program, and
// the board part of `show`.
#include <gtest/gtest.h>

#include <string>

#include "tests/subprocess.h"

namespace {

using testing_support::runRobotcfg;
using testing_support::TRunResult;

const std::string kShieldProgram =
    "#pragma config(CircuitBoardType, typeCktBoardMega2560)\n"
    "#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)\n"
    "#pragma config(PluginCircuitBoard, typeShieldDFRobotMotorOld)\n"
    "task main() {}\n";

TEST(BoardCli, CheckAndFormatNoteTheBoardTheIdeNowAssumes) {
  // Unless the command line named a board, the change is a note.
  const std::string kExpectedErr =
      "<stdin>:1:1: note: IDE Circuit Board type is being changed from 'Arduino Duemilanove' to 'Arduino Mega 2560' "
      "to match '#pragma config...' definition in user application program. [RC502]\n";
  TRunResult r = runRobotcfg({"check", "--platform", "arduino", "-"}, kShieldProgram);
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sErr, kExpectedErr);
  EXPECT_EQ(r.sOut, "");

  r = runRobotcfg({"format", "--platform", "arduino", "-"}, kShieldProgram);
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sErr, kExpectedErr);
  EXPECT_EQ(r.sOut.substr(0, r.sOut.find("//*!!")),
            "#pragma config(CircuitBoardType, typeCktBoardMega2560)\n"
            "#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)\n"
            "#pragma config(PluginCircuitBoard, typeShieldDFRobotMotorOld)\n");

  // A board the IDE already holds, or one compatible with it, changes nothing and notes nothing.
  r = runRobotcfg({"check", "--platform", "arduino", "--board", "typeCktBoardMega2560", "-"}, kShieldProgram);
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sErr, "");
  r = runRobotcfg({"check", "--platform", "arduino", "--board", "typeCktBoardUnoRobotKit", "-"},
                  "#pragma config(CircuitBoardType, typeCktBoardUnoSMD)\n");
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sErr, "");
}

TEST(BoardCli, ShowNamesTheBoardAndItsPluginBoards) {
  TRunResult r = runRobotcfg({"show", "--platform", "arduino", "-"}, kShieldProgram);
  EXPECT_EQ(r.nExit, 0);
  EXPECT_NE(r.sOut.find("Board: Arduino Mega 2560 (typeCktBoardMega2560), CPU ATmega2560 at 16000000 Hz\n"
                        "External Motor/Servo Controllers: off\n"
                        "Plug-in boards: typeShieldSparkfunArdumoto, typeShieldDFRobotMotorOld\n"),
            std::string::npos)
      << r.sOut;
  // Platforms without board selection have no board word.
  r = runRobotcfg({"show", "--platform", "nxt"});
  EXPECT_NE(r.sOut.find("Board: NXT Brick, CPU AT91SAM7S256 at 48000000 Hz\n"), std::string::npos) << r.sOut;
}

}  // namespace
