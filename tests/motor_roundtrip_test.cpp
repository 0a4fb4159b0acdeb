// Motor configurations survive being written and read again: the record read
// back from the generated block equals the record that wrote it, and writing
// it again gives the same text.
#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"

namespace {

// What a configuration holds, as compared here: the settings block and every name.
struct TRecordImage {
  TConfigurationSettings settings;
  std::array<CString, kMaxNumbOfMotors> sMotorNames;
  std::array<CString, kMaxNumbOfSensorPorts> sSensorNames;
  std::array<CString, kMaxNumbOfServos> sServoNames;
  std::array<CString, kMaxNumbOfServoPositionSets> sServoPositionNames;
  CString sStandardModelName;
  CString sModelNameUserFile;
};

TRecordImage imageOf(const CRobotConfigurationBasic &rec) {
  return {rec.getSettings(),      rec.sMotorNames,        rec.sSensorNames,      rec.sServoNames,
          rec.sServoPositionNames, rec.sStandardModelName, rec.sModelNameUserFile};
}

void expectSameRecord(const TRecordImage &a, const TRecordImage &b) {
  EXPECT_EQ(std::memcmp(&a.settings, &b.settings, sizeof a.settings), 0);
  for (size_t n = 0; n < a.settings.motors.size(); ++n)
    EXPECT_EQ(std::memcmp(&a.settings.motors[n], &b.settings.motors[n], sizeof a.settings.motors[n]), 0) << "motor " << n;
  EXPECT_EQ(a.sMotorNames, b.sMotorNames);
  EXPECT_EQ(a.sSensorNames, b.sSensorNames);
  EXPECT_EQ(a.sServoNames, b.sServoNames);
  EXPECT_EQ(a.sServoPositionNames, b.sServoPositionNames);
  EXPECT_EQ(a.sStandardModelName, b.sStandardModelName);
  EXPECT_EQ(a.sModelNameUserFile, b.sModelNameUserFile);
}

std::string messagesOf(const std::vector<TConfigurationDiagnostic> &diagnostics) {
  std::string s;
  for (const TConfigurationDiagnostic &d : diagnostics)
    s += std::to_string(d.nLine) + ": " + d.sMessage.toUtf8() + "\n";
  return s;
}

CString generate(CRobotConfigurationBasic &rec) {
  CString sText;
  rec.buildSourceCodeForConfiguration(sText, false);
  return sText;
}

// Reads `sProgram`, writes it, reads the text written and writes again.
void checkRoundTrip(const std::string &sProgram) {
  CHostRobotConfiguration first;
  const std::vector<TConfigurationDiagnostic> diagnostics = readProgramConfiguration(first, CProgramText(sProgram));
  ASSERT_TRUE(diagnostics.empty()) << messagesOf(diagnostics);
  const CString sWritten = generate(first);
  ASSERT_FALSE(sWritten.IsEmpty());
  // Writing stores default types into empty slots and normalises legacy
  // types; the record compared is the one after that.
  const TRecordImage written = imageOf(first);

  CHostRobotConfiguration second;
  const std::vector<TConfigurationDiagnostic> again =
      readProgramConfiguration(second, CProgramText(encodeGeneratedBlock(sWritten, "\n")));
  ASSERT_TRUE(again.empty()) << messagesOf(again) << sWritten.toUtf8();
  expectSameRecord(written, imageOf(second));
  EXPECT_EQ(generate(second).str(), sWritten.str());
}

struct TExample {
  const char *pzFolder;
  int nPlatformKind;
  TControllerBoardType nBoard;
  bool bExternalControllers;
};

// The example programs of the motor lines, with the selection their options name.
const TExample kExamples[] = {
    {"nxt-motors-pid", platformNxt, -1, true},
    {"brick4-motors", platformBrick4Motor, -1, true},
    {"arduino-motor-pins", platformArduino, 10, false},
    {"vexi2c-drive-encoders", platformVexI2c, -1, false},
};

class MotorRoundTrip : public ::testing::TestWithParam<TExample> {
 protected:
  CHostSelectionScope scope;
};

TEST_P(MotorRoundTrip, ExampleProgram) {
  const TExample &example = GetParam();
  selectHostPlatform(example.nPlatformKind, example.nBoard, example.bExternalControllers);
  std::ifstream in(std::string(ROBOTCONFIG_SOURCE_DIR) + "/examples/" + example.pzFolder + "/program.c",
                   std::ios::binary);
  ASSERT_TRUE(in) << example.pzFolder;
  std::ostringstream bytes;
  bytes << in.rdbuf();
  checkRoundTrip(bytes.str());
}

INSTANTIATE_TEST_SUITE_P(Examples, MotorRoundTrip, ::testing::ValuesIn(kExamples),
                         [](const ::testing::TestParamInfo<TExample> &param) {
                           std::string sName = param.param.pzFolder;
                           for (char &c : sName)
                             if (c == '-') c = '_';
                           return sName;
                         });

class MotorRoundTripPrograms : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

TEST_F(MotorRoundTripPrograms, BrickProgramsWithHubChains) {
  selectHostPlatform(platformNxt, -1, true);
  checkRoundTrip(
      "#pragma config(Hubs, S1, HTMotor, HTMotor, HTServo, none)\n"
      "#pragma config(Hubs, S3, MatrxRbtcs, none, none, none)\n"
      "#pragma config(Hubs, S4, none, HTMotor, none, none)\n"
      "#pragma config(Motor, motorA, left, tmotorNxt, PIDControl, driveLeft, encoder)\n"
      "#pragma config(Motor, motorB, right, tmotorNxt, openLoop, reversed, driveRight)\n"
      "#pragma config(Motor, motorC, , tmotorNxtEncoderClosedLoop)\n"
      "#pragma config(Motor, mtr_S1_C1_1, lift, tmotorTetrixEncoderPID, reversed, encoder)\n"
      "#pragma config(Motor, mtr_S1_C2_2, , tmotorTetrix, openLoop)\n"
      "#pragma config(Motor, mtr_Matrix_S3_4, spinner, tmotorMatrix, PIDControl, encoder)\n"
      "#pragma config(MotorPidSetting, motorA, 9, 8, 700, 7, 6, 50, 40, 30)\n"
      "#pragma config(MotorPidSetting, mtr_Matrix_S3_4, 1, , 2, 3, 4, 5, 6, )\n");

  selectHostPlatform(platformBrick4Motor, -1, true);
  checkRoundTrip(
      "#pragma config(Hubs, S2, HTMotor, none, none, none)\n"
      "#pragma config(Motor, motorA, , tmotorBrickMedium, openLoop)\n"
      "#pragma config(Motor, motorD, big, tmotorBrickLarge, PIDControl, reversed, encoder)\n"
      "#pragma config(Motor, mtr_S2_C1_2, arm, tmotorTetrix, PIDControl, encoder)\n"
      "#pragma config(MotorPidSetting, motorD, 1, 2, 3, 4, 5, 6, 7, 8)\n"
      "#pragma config(MotorPidSetting, mtr_S2_C1_2, 255, 255, 65535, 255, 255, 65535, 65535, 65535)\n");
}

TEST_F(MotorRoundTripPrograms, ControllerAndBoardPrograms) {
  selectHostPlatform(platformVexPic);
  checkRoundTrip(
      "#pragma config(Motor, port1, left, tmotorNormal, openLoop)\n"
      "#pragma config(Motor, port2, right, tmotorVex393_MC29, openLoop, reversed, driveRight)\n"
      "#pragma config(Motor, port8, arm, tmotorServoContinuousRotation, openLoop)\n");

  selectHostPlatform(platformVexI2c);
  checkRoundTrip(
      "#pragma config(Motor, port2, left, tmotorVex393_MC29, PIDControl, driveLeft, encoderPort, dgtl1)\n"
      "#pragma config(Motor, port3, right, tmotorVex393_MC29, openLoop, encoderPort, None)\n"
      "#pragma config(Motor, port4, arm, tmotorVex393_MC29, openLoop, dgtl3)\n");

  selectHostPlatform(platformArduino, 12);
  checkRoundTrip(
      "#pragma config(Motor, motor_4, drive, tmotorDCMotorPWM, PIDControl, reversed, encoder, IOPins, dgtl4, dgtl7)\n"
      "#pragma config(Motor, motor_9, pump, tmotorTwoPin, openLoop, IOPins, dgtl9, dgtl2)\n"
      "#pragma config(Motor, servo_3, tilt, tmotorServoStandard, openLoop, reversed, IOPins, dgtl3, None)\n");

  selectHostPlatform(platformSharedPorts);
  checkRoundTrip(
      "#pragma config(Motor, motor1, left, tmotorSharedPort, PIDControl, encoder, driveLeft)\n"
      "#pragma config(Motor, motor2, right, tmotorSharedPort, openLoop, reversed, driveRight)\n"
      "#pragma config(MotorPidSetting, motor1, 3, 1, 500, 12, 0, 25, 55, 900)\n");
}

}  // namespace
