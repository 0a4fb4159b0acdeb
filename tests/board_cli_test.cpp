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

TEST(BoardCli, ShowListsCpuFixedPinsAndPluginBoards) {
  TRunResult r = runRobotcfg({"show", "--platform", "arduino", "-"}, kShieldProgram);
  EXPECT_EQ(r.nExit, 0);
  const std::string kBoardPart =
      "Board: Arduino Mega 2560 (13), CPU clock 16000000\n"
      "External Motor/Servo Controllers: off\n"
      "CPU: ATmega2560, default clock 16000000\n"
      "Board keyword: typeCktBoardMega2560\n"
      "Fixed pins:\n"
      "  dgtl0    sensorUartPin\n"
      "  dgtl1    sensorUartPin\n"
      "  dgtl13   sensorBoardFixedPin\n"
      "Plug-in boards:\n"
      "  slot 1  typeShieldSparkfunArdumoto Sparkfun Ardumoto\n"
      "  slot 2  typeShieldDFRobotMotorOld  DFRobot Motor (Old)\n";
  EXPECT_NE(r.sOut.find(kBoardPart), std::string::npos) << r.sOut;

  // A fixed pin that a program gave another use says so.
  r = runRobotcfg({"show", "--platform", "arduino", "--board", "typeCktBoardUno", "-"},
                  "#pragma config(Sensor, dgtl13, led, sensorDigitalOut)\n");
  EXPECT_NE(r.sOut.find("  dgtl13   sensorBoardFixedPin (now sensorDigitalOut)\n"), std::string::npos) << r.sOut;
  EXPECT_NE(r.sOut.find("Plug-in boards: none\n"), std::string::npos) << r.sOut;

  // Platforms without board selection show the CPU only.
  r = runRobotcfg({"show", "--platform", "nxt"});
  EXPECT_NE(r.sOut.find("CPU: AT91SAM7S256, default clock 48000000\n"), std::string::npos) << r.sOut;
  EXPECT_EQ(r.sOut.find("Fixed pins"), std::string::npos);
  EXPECT_EQ(r.sOut.find("Plug-in boards"), std::string::npos);
  EXPECT_EQ(r.sOut.find("Board keyword"), std::string::npos);
}

}  // namespace
