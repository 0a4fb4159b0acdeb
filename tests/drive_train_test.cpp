// Drive train, gripper arm and joystick drive: the slot operations, the four
// configuration lines in both directions, and their part of `show`.
#include <gtest/gtest.h>

#include <climits>
#include <cstring>
#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "tests/subprocess.h"
#include "tests/config_lines.h"

namespace {
using test_support::parseLine;
using test_support::generatedLines;
using test_support::bSameSettings;


class DriveTrain : public ::testing::Test {
 protected:
  void SetUp() override { selectHostPlatform(platformVexPic); }
  CHostSelectionScope scope;
};

std::vector<std::wstring> driveLines(CRobotConfigurationBasic &rec) {
  std::vector<std::wstring> lines;
  for (const wchar_t *pzKeyword : {L"DriveTrainMotors", L"DriveTrainWheels", L"GripperArm", L"JoystickDrive"})
    for (const std::wstring &sLine : generatedLines(rec, std::wstring(L"#pragma config(") + pzKeyword + L","))
      lines.push_back(sLine);
  return lines;
}

// Reads the written drive lines into a fresh record and expects the same settings.
void expectLinesReadBack(CHostRobotConfiguration &rec) {
  CHostRobotConfiguration copy;
  copy = rec;
  copy.settings.nDriveTrainType = 0;
  copy.settings.nDriveTrainMotorIndex.fill(255);
  copy.settings.nDriveTrainWheels = {0, 1, 1, 0, 0};
  copy.settings.nGripperArmType = 0;
  copy.settings.nGripperArmMotorIndex.fill(-1);
  copy.settings.nJoystickMotorDriveType = 0;
  copy.settings.nJoystickMotorAxisScaling = 0;
  for (const std::wstring &sLine : driveLines(rec)) {
    CString sError;
    EXPECT_TRUE(parseLine(copy, sLine, sError)) << sLine << ": " << sError.str();
  }
  EXPECT_TRUE(bSameSettings(rec, copy));
  EXPECT_EQ(driveLines(copy), driveLines(rec));
}

TEST_F(DriveTrain, ClearedRecordWritesNoDriveLines) {
  CHostRobotConfiguration rec;
  rec.settings.nDriveTrainWheels = {7, 7, 7, 7, 7};
  rec.settings.nDriveTrainMotorIndex = {0, 1, 2, 3};
  rec.settings.nGripperArmMotorIndex = {4, 5, 6, 7};
  rec.settings.nJoystickMotorAxisScaling = 2;
  EXPECT_TRUE(driveLines(rec).empty());
}

TEST_F(DriveTrain, DriveTrainTypeKeepsSlotsBelowItsCount) {
  CHostRobotConfiguration rec;
  rec.setDriveTrainType(3);  // four motors
  for (int nSlot = 0; nSlot < 4; ++nSlot) rec.setDriveTrainMotorIndex(nSlot, nSlot + 2);
  rec.settings.nDriveTrainWheels = {4, 2, 2, 9, 9};
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{2, 3, 4, 5}));

  rec.setDriveTrainType(1);  // two motors
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{2, 3, 255, 255}));
  EXPECT_EQ(rec.getDriveTrainMotorIndex(1), 3);
  EXPECT_EQ(rec.getDriveTrainMotorIndex(2), -1);  // at or beyond the count
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels, (std::array<uint16_t, 5>{4, 2, 2, 9, 9}));

  // A type without a motor list of its own: the slots empty, the wheels stay.
  rec.setDriveTrainType(8);
  EXPECT_EQ(rec.getDriveTrainType(), 8);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{255, 255, 255, 255}));
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels, (std::array<uint16_t, 5>{4, 2, 2, 9, 9}));
  rec.setDriveTrainType(256 + 2);  // kept in 8 bits
  EXPECT_EQ(rec.getDriveTrainType(), 2);
  EXPECT_EQ(rec.getNumbOfMotorsForDriveTrain(), 2);

  rec.setDriveTrainMotorIndex(0, 1);
  rec.setDriveTrainType(0);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{255, 255, 255, 255}));
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels, (std::array<uint16_t, 5>{0, 1, 1, 0, 0}));

  rec.setGripperArmType(2);
  for (int nSlot = 0; nSlot < 4; ++nSlot) rec.setGripperArmMotorIndex(nSlot, nSlot);
  rec.setGripperArmType(1);
  EXPECT_EQ(rec.getSettings().nGripperArmMotorIndex, (std::array<int32_t, 4>{0, 1, 2, 3}));
  rec.setGripperArmType(3);
  EXPECT_EQ(rec.getSettings().nGripperArmMotorIndex, (std::array<int32_t, 4>{-1, -1, -1, -1}));
}

TEST_F(DriveTrain, SlotOperationsStayWithinTheFourSlots) {
  CHostRobotConfiguration rec;
  rec.setDriveTrainType(1);
  rec.setGripperArmType(1);
  rec.setDriveTrainMotorIndex(0, 0);
  rec.setGripperArmMotorIndex(0, 1);
  CHostRobotConfiguration before;
  before = rec;
  for (int nSlot : {-1, 4, 5, 100, INT_MIN, INT_MAX}) {
    SCOPED_TRACE(nSlot);
    rec.setDriveTrainMotorIndex(nSlot, 2);
    rec.setDriveTrainMotorType(nSlot, 3);
    rec.setDriveTrainMotorReversed(nSlot, true);
    rec.setGripperArmMotorIndex(nSlot, 2);
    rec.setGripperArmMotorType(nSlot, 3);
    rec.setGripperArmMotorReversed(nSlot, true);
    EXPECT_EQ(rec.getDriveTrainMotorIndex(nSlot), -1);
    EXPECT_EQ(rec.getDriveTrainMotorType(nSlot), 0);
    EXPECT_FALSE(rec.getDriveTrainMotorReversed(nSlot));
    EXPECT_EQ(rec.getGripperArmMotorIndex(nSlot), -1);
    EXPECT_EQ(rec.getGripperArmMotorType(nSlot), 0);
    EXPECT_FALSE(rec.getGripperArmMotorReversed(nSlot));
    EXPECT_TRUE(bSameSettings(rec, before));
  }
  for (int nMotor : {-1, kMaxNumbOfMotors, INT_MIN}) {
    rec.initializeEmptyMotor(nMotor);
    EXPECT_TRUE(bSameSettings(rec, before)) << nMotor;
  }

  // A slot past the drive train's count but inside the four is emptied, not filled.
  rec.settings.nDriveTrainMotorIndex[3] = 6;
  rec.setDriveTrainMotorIndex(3, 2);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex[3], 255);
  // A motor index the platform lacks empties a valid slot (VEX PIC has motors 0..7).
  for (int nMotor : {8, 35, 36, -1, 255, INT_MAX}) {
    rec.setDriveTrainMotorIndex(0, 0);
    rec.setDriveTrainMotorIndex(0, nMotor);
    EXPECT_EQ(rec.getDriveTrainMotorIndex(0), 255) << nMotor;
    rec.setGripperArmMotorIndex(2, 0);
    rec.setGripperArmMotorIndex(2, nMotor);
    EXPECT_EQ(rec.getGripperArmMotorIndex(2), -1) << nMotor;
  }
  // An empty slot below the count reads as 255; its motor as nothing.
  EXPECT_EQ(rec.getDriveTrainMotorIndex(1), 255);
  EXPECT_EQ(rec.getDriveTrainMotorType(1), 0);
  rec.setDriveTrainMotorReversed(1, true);
  for (const TMotorSlot &motor : rec.getSettings().motors) EXPECT_FALSE(motor.bReversed);
  EXPECT_EQ(rec.getGripperArmMotorIndex(1), -1);
}

TEST_F(DriveTrain, SlotsReachTheMotorsTheyName) {
  CHostRobotConfiguration rec;
  rec.setDriveTrainType(2);
  rec.setGripperArmType(2);
  ASSERT_EQ(rec.getMotorTypeInConfig(3), 0);
  rec.setDriveTrainMotorIndex(1, 3);  // a motor without a type gets the platform's default
  EXPECT_EQ(rec.getMotorTypeInConfig(3), rec.getDefaultMotorType(3));
  EXPECT_NE(rec.getMotorTypeInConfig(3), 0);
  EXPECT_EQ(rec.getDriveTrainMotorType(1), rec.getDefaultMotorType(3));

  rec.setMotorTypeInConfig(4, 2);
  rec.setGripperArmMotorIndex(3, 4);  // a motor with a type keeps it
  EXPECT_EQ(rec.getGripperArmMotorType(3), 2);

  rec.setDriveTrainMotorReversed(1, true);
  EXPECT_TRUE(rec.getMotorReversedInConfig(3));
  EXPECT_TRUE(rec.getDriveTrainMotorReversed(1));
  rec.setGripperArmMotorType(3, 3);
  EXPECT_EQ(rec.getMotorTypeInConfig(4), 3);
  rec.setDriveTrainMotorType(1, 2);
  EXPECT_EQ(rec.getMotorTypeInConfig(3), 2);
  // Taking the motor's type away takes it out of the drive train.
  rec.setDriveTrainMotorType(1, 0);
  EXPECT_EQ(rec.getDriveTrainMotorIndex(1), 255);
}

TEST_F(DriveTrain, InitializeEmptyMotor) {
  CHostRobotConfiguration rec;
  TMotorSlot &motor = rec.settings.motors[5];
  motor.nMotorType = 3;
  motor.bEncoder = motor.bPIDControlled = motor.bReversed = true;
  motor.nDriveSide = 2;
  motor.nEncoderPort = 9;
  motor.nPrimaryIOPin = 1;
  motor.nSecondaryIOPin = 2;
  motor.pidSettings.B1 = 7;
  motor.pidSettings.W4 = 700;
  rec.initializeEmptyMotor(5);
  EXPECT_EQ(motor.nMotorType, 0);
  EXPECT_FALSE(motor.bEncoder || motor.bPIDControlled || motor.bReversed);
  EXPECT_EQ(motor.nDriveSide, 0);
  EXPECT_EQ(motor.nEncoderPort, 0);
  EXPECT_EQ(motor.nPrimaryIOPin, -1);
  EXPECT_EQ(motor.nSecondaryIOPin, -1);
  EXPECT_TRUE(motor.pidSettings.bIdenticalPidSettings(emptyPidSettings));
}

TEST_F(DriveTrain, ReadingDriveTrainMotors) {
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainMotors, fourWheelDrive, port1, port2, port3, port8)", sError));
  EXPECT_EQ(rec.getDriveTrainType(), 3);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{0, 1, 2, 7}));
  EXPECT_EQ(rec.getMotorTypeInConfig(7), rec.getDefaultMotorType(7));

  rec.clearConfigurationDefinition();
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, twoWheelDrive, None, port2)", sError));
  EXPECT_EQ(sError, L"No motor specified for index 0.");
  EXPECT_EQ(rec.getDriveTrainType(), 1);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{255, 1, 255, 255}));

  // The first failure's message stays; later slots are still read.
  rec.clearConfigurationDefinition();
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, mecanumDrive, port1, wheel, None, port4)", sError));
  EXPECT_EQ(sError, L"Invalid motor 'wheel' for index 1.");
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{0, 255, 255, 3}));
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, mecanumDrive, port1, Port2, port3, port4)", sError));
  EXPECT_EQ(sError, L"Invalid motor 'Port2' for index 1.");

  // A motor word past the type's count is checked but not stored.
  rec.clearConfigurationDefinition();
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, twoWheelDrive, port1, port2, port9)", sError));
  EXPECT_EQ(sError, L"Invalid motor 'port9' for index 2.");
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{0, 1, 255, 255}));
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainMotors, twoWheelDrive, port1, port2, port6)", sError));
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{0, 1, 255, 255}));

  // An empty word stops the line and takes the drive train away.
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, fourWheelDrive, port3, , port5, port6)", sError));
  EXPECT_EQ(sError, L"Not enough motors specified");
  EXPECT_EQ(rec.getDriveTrainType(), 0);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{2, 1, 255, 255}));

  // No motor words at all is accepted, and slots set earlier stay.
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainMotors, threeWheelOmni)", sError));
  EXPECT_EQ(rec.getDriveTrainType(), 6);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{2, 1, 255, 255}));
}

TEST_F(DriveTrain, HubMotorNamesNeedTheControllersToggle) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  CString sError;
  // The port name exists, but without external controllers the NXT has only motorA..motorC.
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, twoWheelDrive, motorB, mtr_S1_C1_1)", sError));
  EXPECT_EQ(sError, L"Invalid motor 'mtr_S1_C1_1' for index 1.");
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{1, 255, 255, 255}));

  selectHostPlatform(platformNxt, -1, true);
  rec.clearConfigurationDefinition();
  rec.settings.nSensorPortHubs[0][0] = hubHTMotor;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainMotors, twoWheelDrive, motorB, mtr_S1_C1_1)", sError))
      << sError.str();
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{1, 3, 255, 255}));
}

TEST_F(DriveTrain, ReadingGripperArm) {
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(GripperArm, gripperClawLift, port5, None, port6, bogus)", sError));
  EXPECT_EQ(rec.getGripperArmType(), 2);
  EXPECT_EQ(rec.getSettings().nGripperArmMotorIndex, (std::array<int32_t, 4>{4, -1, 5, -1}));

  EXPECT_FALSE(parseLine(rec, L"#pragma config(GripperArm, gripperArmWithWrist, None, port2, bogus, port4)", sError));
  EXPECT_EQ(sError, L"No motor specified for index 0.");
  EXPECT_EQ(rec.getSettings().nGripperArmMotorIndex, (std::array<int32_t, 4>{-1, 1, -1, 3}));
  EXPECT_FALSE(parseLine(rec, L"#pragma config(GripperArm, gripperArmWithWrist, port1, port2, bogus, port4)", sError));
  EXPECT_EQ(sError, L"Invalid motor 'bogus' for index 2.");

  EXPECT_FALSE(parseLine(rec, L"#pragma config(GripperArm, gripperArmWithWrist, port1, , port3, port4)", sError));
  EXPECT_EQ(sError, L"Not enough motors specified");
  EXPECT_EQ(rec.getGripperArmType(), 0);

  // A word the menu lacks is kept as -1, a type without motors.
  EXPECT_TRUE(parseLine(rec, L"#pragma config(GripperArm, gripperBig)", sError));
  EXPECT_EQ(rec.getGripperArmType(), -1);
  EXPECT_EQ(rec.getGripperArmMotorIndex(0), -1);
}

TEST_F(DriveTrain, ReadingDriveTrainWheels) {
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainWheels, 4, -1, None, 70000, x)", sError));
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels, (std::array<uint16_t, 5>{4, 65535, 0, 70000 - 65536, 0}));
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainWheels, 9)", sError));
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels[0], 9);
  EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainWheels)", sError));

  // A sixth number and an empty word fail without a message of their own.
  sError = L"stale";
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainWheels, 1, 2, 3, 4, 5, 6)", sError));
  EXPECT_EQ(sError, L"");
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels, (std::array<uint16_t, 5>{1, 2, 3, 4, 5}));
  sError = L"stale";
  EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainWheels, 8, , 8)", sError));
  EXPECT_EQ(sError, L"");
  EXPECT_EQ(rec.getSettings().nDriveTrainWheels, (std::array<uint16_t, 5>{8, 2, 3, 4, 5}));
}

TEST_F(DriveTrain, ReadingJoystickDrive) {
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(JoystickDrive, splitArcadeDrive, axisScalingCubed)", sError));
  EXPECT_EQ(rec.getJoystickMotorDriveType(), 4);
  EXPECT_EQ(rec.getJoystickMotorAxisScaling(), 2);

  EXPECT_TRUE(parseLine(rec, L"#pragma config(JoystickDrive, tankDrive, axisScalingCube)", sError));
  EXPECT_EQ(sError, L"Invalid joystick axis type 'axisScalingCube'");
  EXPECT_EQ(rec.getJoystickMotorDriveType(), 1);
  EXPECT_EQ(rec.getJoystickMotorAxisScaling(), 0);

  sError.Empty();
  EXPECT_TRUE(parseLine(rec, L"#pragma config(JoystickDrive, TankDrive, axisScalingSquared)", sError));
  EXPECT_EQ(sError, L"Invalid motor drive type 'TankDrive'");
  EXPECT_EQ(rec.getJoystickMotorDriveType(), 0);
  EXPECT_EQ(rec.getJoystickMotorAxisScaling(), 1);

  EXPECT_TRUE(parseLine(rec, L"#pragma config(JoystickDrive, tank, squared)", sError));
  EXPECT_EQ(sError, L"Invalid joystick axis type 'squared'");  // the second message replaces the first
}

TEST_F(DriveTrain, PlatformsWithoutDriveConfiguration) {
  for (int nKind : {platformNone, platformKind5, platformKind6}) {
    SCOPED_TRACE(nKind);
    selectHostPlatform(nKind);
    CHostRobotConfiguration rec;
    CHostRobotConfiguration before;
    CString sError;
    EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainMotors, twoWheelDrive)", sError));
    EXPECT_EQ(sError, L"Drive Train configuration not supported by platform");
    EXPECT_FALSE(parseLine(rec, L"#pragma config(DriveTrainWheels, 1, 2)", sError));
    EXPECT_EQ(sError, L"Drive Train configuration not supported by platform");
    EXPECT_FALSE(parseLine(rec, L"#pragma config(GripperArm, gripperClawLift)", sError));
    EXPECT_EQ(sError, L"Gripper Arm configuration not supported by platform");
    EXPECT_FALSE(parseLine(rec, L"#pragma config(JoystickDrive, tankDrive, axisScalingLinear)", sError));
    EXPECT_EQ(sError, L"Joystick control configuration not supported by platform");
    EXPECT_TRUE(bSameSettings(rec, before));
  }
  // Every platform with motor ports of its own takes all four lines.
  for (int nKind : {platformNxt, platformVexPic, platformVexI2c, platformArduino, platformSharedPorts,
                    platformBrick4Motor, platformKind9, platformBoard10, platformBoard11, platformBoard12,
                    platformBoard13, platformBoard14}) {
    SCOPED_TRACE(nKind);
    selectHostPlatform(nKind);
    CHostRobotConfiguration rec;
    CString sError;
    EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainMotors, driveTrainNone)", sError)) << sError.str();
    EXPECT_TRUE(parseLine(rec, L"#pragma config(DriveTrainWheels, 1, 2)", sError)) << sError.str();
    EXPECT_TRUE(parseLine(rec, L"#pragma config(GripperArm, gripperNone)", sError)) << sError.str();
    EXPECT_TRUE(parseLine(rec, L"#pragma config(JoystickDrive, tankDrive, axisScalingLinear)", sError))
        << sError.str();
  }
}

TEST_F(DriveTrain, WrittenLines) {
  CHostRobotConfiguration rec;
  CString sError;
  for (const wchar_t *pzLine : {L"#pragma config(DriveTrainMotors, fourWheelDrive, port1, port2, port3, port4)",
                                L"#pragma config(DriveTrainWheels, 4, -1, 1, 10, 0)",
                                L"#pragma config(GripperArm, gripperClawLift, port5, None, port6, bogus)",
                                L"#pragma config(JoystickDrive, arcadeDriveRightStick, axisScalingSquared)"})
    ASSERT_TRUE(parseLine(rec, pzLine, sError)) << sError.str();
  EXPECT_EQ(driveLines(rec), (std::vector<std::wstring>{
                                 L"#pragma config(DriveTrainMotors, fourWheelDrive, port1, port2, port3, port4)",
                                 L"#pragma config(DriveTrainWheels, 4, 65535, 1, 10, 0)",
                                 L"#pragma config(GripperArm, gripperClawLift, port5, None, port6, None)",
                                 L"#pragma config(JoystickDrive, arcadeDriveRightStick, axisScalingSquared)",
                             }));
  expectLinesReadBack(rec);

  // An emptied drive-train slot is written as None, which the drive-train reader refuses.
  rec.setDriveTrainMotorIndex(2, -1);
  const std::vector<std::wstring> lines = generatedLines(rec, L"#pragma config(DriveTrainMotors,");
  ASSERT_EQ(lines.size(), 1u);
  EXPECT_EQ(lines[0], L"#pragma config(DriveTrainMotors, fourWheelDrive, port1, port2, None, port4)");
  CHostRobotConfiguration copy;
  EXPECT_FALSE(parseLine(copy, lines[0], sError));
  EXPECT_EQ(sError, L"No motor specified for index 2.");

  // Hub-style port names on the NXT.
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration nxt;
  nxt.settings.nSensorPortHubs[0][0] = hubHTMotor;
  nxt.setDriveTrainType(1);
  nxt.setDriveTrainMotorIndex(0, 0);
  nxt.setDriveTrainMotorIndex(1, 4);
  EXPECT_EQ(generatedLines(nxt, L"#pragma config(DriveTrainMotors,"),
            (std::vector<std::wstring>{L"#pragma config(DriveTrainMotors, twoWheelDrive, motorA, mtr_S1_C1_2)"}));
}

TEST_F(DriveTrain, TypesWithoutAWordStillReadBack) {
  CHostRobotConfiguration rec;
  CString sError;
  // A word the menu lacks keeps the drive train as type 255, a type without
  // motors; it is written as that number, which reads back as 255 again.
  ASSERT_TRUE(parseLine(rec, L"#pragma config(DriveTrainMotors, hoverDrive, port1)", sError));
  ASSERT_TRUE(parseLine(rec, L"#pragma config(DriveTrainWheels, 2, 3, 4, 5, 6)", sError));
  ASSERT_TRUE(parseLine(rec, L"#pragma config(GripperArm, gripperBig)", sError));
  EXPECT_EQ(rec.getDriveTrainType(), 255);
  EXPECT_EQ(rec.getGripperArmType(), -1);
  EXPECT_EQ(driveLines(rec), (std::vector<std::wstring>{L"#pragma config(DriveTrainMotors, 255)",
                                                        L"#pragma config(DriveTrainWheels, 2, 3, 4, 5, 6)",
                                                        L"#pragma config(GripperArm, -1)"}));
  expectLinesReadBack(rec);

  // The same for joystick values set through the dialogs' setters.
  rec.setJoystickMotorDriveType(9);
  rec.setJoystickMotorAxisScaling(1);
  EXPECT_EQ(generatedLines(rec, L"#pragma config(JoystickDrive,"),
            (std::vector<std::wstring>{L"#pragma config(JoystickDrive, 9, axisScalingSquared)"}));
}

TEST_F(DriveTrain, ShowListsDriveAndControls) {
  const std::string sProgram =
      "#pragma config(DriveTrainMotors, twoWheelSkidSteer, port1, port2)\n"
      "#pragma config(DriveTrainWheels, 2, 1, 1, 0, 0)\n"
      "#pragma config(GripperArm, gripperArmWithWrist, port3, None, port4, None)\n"
      "#pragma config(JoystickDrive, tankDrive, axisScalingCubed)\n";
  const testing_support::TRunResult r = testing_support::runRobotcfg({"show", "--platform", "vexpic", "-"}, sProgram);
  EXPECT_EQ(r.nExit, 0) << r.sErr;
  EXPECT_NE(r.sOut.find("Drive train: twoWheelSkidSteer, motors port1, port2; wheels 2, 1, 1, 0, 0\n"
                        "Gripper arm: gripperArmWithWrist, motors port3, none, port4, none\n"
                        "Joystick drive: tankDrive, axisScalingCubed\n"),
            std::string::npos)
      << r.sOut;
}

}  // namespace
