// What the library accepts comes back whole: a program is read, its block
// written, the block read again; the two records compare the same and the
// second writing gives the same text.
#include <gtest/gtest.h>

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "robotconfig/host/HostMessages.h"

#include "robotconfig/host/Platform.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"
#include "robotconfig/program/StandardModelList.h"

namespace {

std::string messagesOf(const std::vector<TConfigurationDiagnostic> &diagnostics) {
  std::string s;
  for (const TConfigurationDiagnostic &d : diagnostics) s += std::to_string(d.nLine) + ": " + d.sMessage.toUtf8() + "\n";
  return s;
}

/// The block `rec` writes, as UTF-8 with "\n" line ends.
std::string blockOf(CRobotConfigurationBasic &rec) {
  CString sText;
  rec.buildSourceCodeForConfiguration(sText, false);
  return encodeGeneratedBlock(sText, "\n");
}

/// Reads `sProgram` into `first`, writes it, reads the block into `second`
/// and checks that both records and both writings agree; returns the block.
std::string roundTrip(const std::string &sProgram, CHostRobotConfiguration &first, CHostRobotConfiguration &second) {
  const std::vector<TConfigurationDiagnostic> refused = readProgramConfiguration(first, CProgramText(sProgram));
  EXPECT_TRUE(refused.empty()) << messagesOf(refused);
  const std::string sBlock = blockOf(first);
  const std::vector<TConfigurationDiagnostic> again = readProgramConfiguration(second, CProgramText(sBlock));
  EXPECT_TRUE(again.empty()) << messagesOf(again) << sBlock;
  EXPECT_EQ(first.compareConfiguration(second), configCompareSame) << sBlock;
  EXPECT_EQ(blockOf(second), sBlock);
  return sBlock;
}

class LosslessRoundTrip : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
  CHostStandardModelScope models;
};

struct TLosslessCase {
  const char *pzWhat;
  int nPlatformKind;
  bool bExternalControllers;
  const char *pzProgram;
  std::vector<const char *> expectedLines;  ///< lines the block must hold, as written
};

// Configurations that used to come back different: each must be written so
// that it reads back to itself.
const TLosslessCase kCases[] = {
    {"names that need quotes", platformNxt, true,
     "#pragma config(Hubs, S1, HTServo, none, none, none)\n"
     "#pragma config(Sensor, S2, \"my sensor\", sensorTouch)\n"
     "#pragma config(Servo, srvo_S1_C1_1, \"arm (left)\", tServoStandard)\n"
     "#pragma config(SrvoPosition, \"open, wide\", 10, 20)\n"
     "#pragma config(DatalogSeries, \"a b\", x\"y, \"\")\n",
     {"#pragma config(Sensor, S2,     \"my sensor\",    sensorTouch)",
      "#pragma config(Servo,  srvo_S1_C1_1,    \"arm (left)\",         tServoStandard)",
      "#pragma config(SrvoPosition,  \"open, wide\",           10,  20, 128, 128, 128, 128, 128, 128)",
      "#pragma config(DatalogSeries, \"a b\", x\"y, \"\")"}},
    {"renamed standard-model sensor", platformNxt, false,
     "#pragma config(StandardModel, \"NXT Rover\")\n"
     "#pragma config(RenamedStdModelSensor, S1, \"front bumper\")\n",
     {"#pragma config(RenamedStdModelSensor, S1, \"front bumper\")"}},
    {"a sensor takes a motor's IO pin", platformArduino, false,
     "#pragma config(Motor, motor_5, m, tmotorDCMotorPWM, openLoop, IOPins, dgtl5, dgtl4)\n"
     "#pragma config(Sensor, dgtl5, bump, sensorTouch)\n",
     {"#pragma config(Sensor, dgtl5,  bump,           sensorTouch)",
      "#pragma config(Motor,  motor_5,         m,             tmotorDCMotorPWM, openLoop, IOPins, None, dgtl4)"}},
    {"a legacy type where its target has no row", platformVexI2c, false,
     "#pragma config(Motor, port2, m, tmotorReversed, openLoop)\n",
     {"#pragma config(Motor,  port2,           m,             tmotorStandard, openLoop, reversed)"}},
    {"drive-train, gripper and joystick values without a word", platformVexPic, false,
     "#pragma config(DriveTrainMotors, 8)\n"
     "#pragma config(GripperArm, 3)\n"
     "#pragma config(JoystickDrive, 9, 7)\n",
     {"#pragma config(DriveTrainMotors, 8)", "#pragma config(GripperArm, 3)", "#pragma config(JoystickDrive, 9, 7)"}},
};

TEST_F(LosslessRoundTrip, EveryCaseReadsBackToItself) {
  for (const TLosslessCase &c : kCases) {
    SCOPED_TRACE(c.pzWhat);
    selectHostPlatform(c.nPlatformKind, -1, c.bExternalControllers);
    CHostRobotConfiguration first, second;
    const std::string sBlock = roundTrip(c.pzProgram, first, second);
    for (const char *pzLine : c.expectedLines) EXPECT_NE(sBlock.find(std::string(pzLine) + "\n"), std::string::npos) << pzLine << "\n" << sBlock;
  }
}

TEST_F(LosslessRoundTrip, WordsWithANulInsideAreNotTheWord) {
  selectHostPlatform(platformArduino);
  static const char kProgram[] =
      "#pragma config(MemorySize\0zz, 100, 100, 100)\n"
      "#pragma config(Sensor, dgtl2, bump, sensorTouch\0zz)\n";
  CHostRobotConfiguration rec;
  const std::vector<TConfigurationDiagnostic> refused =
      readProgramConfiguration(rec, CProgramText(std::string(kProgram, sizeof kProgram - 1)));
  ASSERT_EQ(refused.size(), 1u) << messagesOf(refused);
  EXPECT_EQ(refused[0].sMessage.str(), std::wstring(L"Bad parameter type: 'MemorySize\0zz'", 35));
  EXPECT_EQ(blockOf(rec).find("sensorTouch"), std::string::npos);
}

TEST_F(LosslessRoundTrip, DatalogSeriesCompareByTheirText) {
  // Two series whose fingerprints collide still differ.
  CHostRobotConfiguration a, b;
  roundTrip("#pragma config(DatalogSeries, 1i1apxk)\n", a, b);
  CHostRobotConfiguration c, d;
  roundTrip("#pragma config(DatalogSeries, cgnqhrb)\n", c, d);
  EXPECT_EQ(a.compareConfiguration(c), configCompareSettingsDiffer);
  EXPECT_EQ(c.compareConfiguration(a), configCompareSettingsDiffer);
}

TEST_F(LosslessRoundTrip, BoardKindsRefuseMotorLines) {
  // The board kinds have no motor type, so a Motor line is refused rather than dropped.
  selectHostPlatform(platformBoard12);
  CHostRobotConfiguration rec;
  const std::vector<TConfigurationDiagnostic> refused =
      readProgramConfiguration(rec, CProgramText("#pragma config(Motor, motor1, x, tmotorStandard, openLoop)\n"));
  ASSERT_EQ(refused.size(), 1u);
  EXPECT_EQ(refused[0].sMessage, L"Bad motor device index 'motor1'");
}

TEST_F(LosslessRoundTrip, ModelFileWithoutRoomForATemporaryFileIsWrittenInPlace) {
  selectHostPlatform(platformNxt);
  namespace fs = std::filesystem;
  const fs::path folder = fs::temp_directory_path() / ("lossless-" + std::to_string(::getpid()));
  fs::create_directories(folder);
  // A name of the longest length leaves no room for a temporary name beside it.
  const fs::path target = folder / std::string(255, 'm');
  std::ofstream(target) << "old model\n";
  CCapturingMessageSink messages;
  CHostRobotConfiguration first;
  ASSERT_TRUE(readProgramConfiguration(first, CProgramText("#pragma config(Sensor, S1, \"my bump\", sensorTouch)\n")).empty());
  EXPECT_TRUE(first.SaveConfigurationAsModelFile(fileTypeRobotModel, CString::fromUtf8(target.string())));
  EXPECT_TRUE(messages.messages.empty());
  std::ostringstream saved;
  saved << std::ifstream(target, std::ios::binary).rdbuf();
  CHostRobotConfiguration second;
  EXPECT_TRUE(readProgramConfiguration(second, CProgramText(saved.str())).empty());
  EXPECT_EQ(first.compareConfiguration(second), configCompareSame);
  EXPECT_EQ(encodeGeneratedBlock(CString::fromUtf8(saved.str()), "\n").rfind(blockOf(second), 0), 0u) << saved.str();
  fs::remove_all(folder);
}

}  // namespace
