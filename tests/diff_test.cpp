// robotcfg diff as a user runs it, and the engineering-rule warnings that the
// reading commands print.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "tests/subprocess.h"

namespace {

using testing_support::CTempDir;
using testing_support::runRobotcfg;
using testing_support::TRunResult;

const std::vector<std::string> kMega = {"--platform", "arduino", "--board", "typeCktBoardMega"};

void writeFile(const std::string &sPath, const std::string &sBytes) {
  std::ofstream out(sPath, std::ios::binary | std::ios::trunc);
  out << sBytes;
}

// Runs robotcfg with the platform options, then the command and its arguments.
TRunResult run(const std::vector<std::string> &platform, std::vector<std::string> args) {
  args.insert(args.begin(), platform.begin(), platform.end());
  return runRobotcfg(args);
}

class Diff : public ::testing::Test {
 protected:
  // Writes a program holding `sConfig` and returns its path.
  std::string program(const std::string &sName, const std::string &sConfig) {
    const std::string sPath = dir.file(sName);
    writeFile(sPath, sConfig + "task main() {}\n");
    return sPath;
  }

  CTempDir dir;
};

TEST_F(Diff, ResultsAndExitStatuses) {
  const std::string sXBee = program("xbee.c", "#pragma config(UART_Usage, UART1, uartXBeeWiFi, baudRate115200)\n");
  const std::string sSame =
      program("same.c", "// the same configuration, written differently\n"
                        "#pragma config(uart_usage, UART1, uartXBeeWiFi, baudRate115200, IOPins, x, y)\n");
  const std::string sUser = program("user.c", "#pragma config(UART_Usage, UART1, uartUserControl, baudRate9600)\n");

  TRunResult r = run(kMega, {"diff", sXBee, sSame});
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sOut, "configurations are the same\n");
  EXPECT_EQ(r.sErr, "");

  r = run(kMega, {"diff", "--verbose", sUser, sXBee});
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sOut,
            "configurations differ in settings\n"
            "serial port UART1\n"
            "  < uartUserControl      baudRate9600\n"
            "  > uartXBeeWiFi         baudRate115200\n");

  // A port configured in one program only: its pins are sensor ports of the other.
  const std::string sNone = program("none.c", "");
  r = run(kMega, {"diff", "-v", sNone, sXBee});
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sOut,
            "configurations differ in settings\n"
            "sensor dgtl18 (index 34)\n"
            "  < -              -                              -\n"
            "  > -              sensorUartPin                  -\n"
            "sensor dgtl19 (index 35)\n"
            "  < -              -                              -\n"
            "  > -              sensorUartPin                  -\n"
            "serial port UART1\n"
            "  < uartNotUsed          baudRate4800\n"
            "  > uartXBeeWiFi         baudRate115200\n");

  // Model names only: two user-model files that configure the same (nothing).
  std::filesystem::create_directory(dir.file("robots"));
  writeFile(dir.file("robots/a.txt"), "");
  writeFile(dir.file("robots/b.txt"), "");
  const std::string sModelA = program("model-a.c", "#pragma config(UserModel, \"robots/a.txt\")\n");
  const std::string sModelB = program("model-b.c", "#pragma config(UserModel, \"robots/b.txt\")\n");
  r = run(kMega, {"diff", "-v", sModelA, sModelB});
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sOut,
            "configurations differ only in model names\n"
            "user model file\n"
            "  < robots/a.txt\n"
            "  > robots/b.txt\n");

  // Settings that belong to no device.
  const std::string sSeriesA = program("series-a.c", "#pragma config(DatalogSeries, 0, speed)\n");
  const std::string sSeriesB = program("series-b.c", "#pragma config(DatalogSeries, 0, battery)\n");
  r = run(kMega, {"diff", "-v", sSeriesA, sSeriesB});
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sOut, "configurations differ in settings\nother settings differ\n");
}

TEST_F(Diff, DeviceNamesAndPortOrderWarnings) {
  const std::vector<std::string> kVexPic = {"--platform", "vexpic"};
  const std::string sA = program("a.c", "#pragma config(Sensor, in6, armAngle, sensorPotentiometer)\n"
                                        "#pragma config(Sensor, in3, bumper, sensorTouch)\n"
                                        "#pragma config(Motor, port2, left, tmotorStandard, openLoop)\n");
  const std::string sB = program("b.c", "#pragma config(Motor, port2, right, tmotorStandard, openLoop)\n"
                                        "#pragma config(Sensor, in3, bumper, sensorTouch)\n"
                                        "#pragma config(Sensor, in6, arm, sensorPotentiometer)\n");
  // Each program's reading warns about the digital input below the analog sensor; warnings never silence later ones.
  const std::string sWarning =
      ": warning: VEX CPU is more efficient if digital input sensors are given higher port numbers than all analog "
      "sensors. Firmware will still operate if this is not the case but in a less efficient fashion. Analog port at "
      "'in6' is higher 'number' than digital port at 'in3'. Use \"Motor and Sensors Setup\" command (on the "
      "\"Robot\" menu) to modify configuration.\n";
  TRunResult r = run(kVexPic, {"diff", "-v", sA, sB});
  EXPECT_EQ(r.nExit, 1);
  EXPECT_EQ(r.sOut,
            "configurations differ only in device names\n"
            "motor port2 (index 1)\n"
            "  < left           tmotorStandard                 openLoop\n"
            "  > right          tmotorStandard                 openLoop\n"
            "sensor in6 (index 5)\n"
            "  < armAngle       sensorPotentiometer            -\n"
            "  > arm            sensorPotentiometer            -\n");
  EXPECT_EQ(r.sErr, sA + sWarning + sB + sWarning);

  r = run(kVexPic, {"check", sA, sB, sA});
  EXPECT_EQ(r.nExit, 0);
  const std::string sFinding = sWarning.substr(0, sWarning.size() - 1) + " [RC503]\n";
  EXPECT_EQ(r.sErr, sA + sFinding + sB + sFinding + sA + sFinding);
  // Elsewhere the same ports draw no warning.
  r = run({"--platform", "vexi2c"}, {"check", sA});
  EXPECT_EQ(r.sErr, "");
}

TEST_F(Diff, EachProgramIsReadForTheBoardOfTheCommandLine) {
  // The first program switches to its own board; the second still starts from the IDE's.
  const std::string sMega = program("mega.c", "#pragma config(CircuitBoardType, typeCktBoardMega)\n");
  const std::string sPlain = program("plain.c", "");
  for (const auto &args : {std::vector<std::string>{"diff", "-v", sMega, sPlain},
                           std::vector<std::string>{"diff", "-v", sPlain, sMega}}) {
    const TRunResult r = run({"--platform", "arduino"}, args);
    EXPECT_EQ(r.nExit, 1);
    EXPECT_EQ(r.sOut.rfind("configurations differ in settings\nboard\n", 0), 0u) << r.sOut;
    EXPECT_NE(r.sOut.find("Arduino Mega (12)"), std::string::npos);
    EXPECT_NE(r.sOut.find("Arduino Duemilanove (8)"), std::string::npos);
  }
  const TRunResult r = run({"--platform", "arduino", "--board", "typeCktBoardMega"}, {"diff", sMega, sPlain});
  EXPECT_EQ(r.nExit, 0);
  EXPECT_EQ(r.sOut, "configurations are the same\n");
}

TEST_F(Diff, RejectedLinesAndUnreadableFilesAreErrors) {
  const std::string sGood = program("good.c", "#pragma config(UART_Usage, UART1, uartUserControl, baudRate9600)\n");
  const std::string sBad =
      program("bad.c", "int x;\n#pragma config(UART_Usage, UART7, uartUserControl, baudRate9600)\n");
  TRunResult r = run(kMega, {"diff", sGood, sBad});
  EXPECT_EQ(r.nExit, 2);
  EXPECT_EQ(r.sOut, "");
  EXPECT_EQ(r.sErr, sBad + ":2: error: Bad UART Index 'UART7'\n"
                           "robotcfg: cannot compare configurations with rejected lines\n");

  const std::string sMissing = dir.file("missing.c");
  r = run(kMega, {"diff", sGood, sMissing});
  EXPECT_EQ(r.nExit, 2);
  EXPECT_EQ(r.sOut, "");
  EXPECT_EQ(r.sErr, "robotcfg: cannot open '" + sMissing + "': No such file or directory\n");

  r = runRobotcfg({"diff", sGood});
  EXPECT_EQ(r.nExit, 2);
  EXPECT_EQ(r.sErr, "robotcfg: diff takes exactly two files\nTry 'robotcfg --help' for more information.\n");
}

}  // namespace
