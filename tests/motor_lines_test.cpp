// The Motor, Hubs, RenamedStdModelMotor and MotorPidSetting lines: reading,
// writing, and the motor encoder clean-up.
#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <string>
#include <vector>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/host/StandardModels.h"
#include "tests/config_lines.h"

namespace {
using test_support::parseLine;
using test_support::accept;
using test_support::COneModelList;
using test_support::generatedLines;


class MotorLines : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

std::vector<std::wstring> motorLines(CRobotConfigurationBasic &rec) {
  return generatedLines(rec, L"#pragma config(Motor,");
}

std::wstring motorName(const CRobotConfigurationBasic &rec, int nMotor) {
  CString sName;
  rec.getUserDefinedMotorNameInConfig(nMotor, sName);
  return sName.str();
}

TEST_F(MotorLines, MotorLineColumns) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  accept(rec, L"#pragma config(Motor, motorA, leftMotor, tmotorNxt, PIDControl, reversed, driveLeft, encoder)");
  accept(rec, L"#pragma config(Motor, motorB, , tmotorNxt, openLoop, driveRight)");
  accept(rec, L"#pragma config(Motor, motorC, aVeryLongMotorName, tmotorNxt, PIDControl, encoder)");
  EXPECT_EQ(motorLines(rec),
            (std::vector<std::wstring>{
                L"#pragma config(Motor,  motorA,          leftMotor,     tmotorNxt, PIDControl, reversed, driveLeft, encoder)",
                L"#pragma config(Motor,  motorB,           ,             tmotorNxt, openLoop, driveRight)",
                L"#pragma config(Motor,  motorC,          aVeryLongMotorName, tmotorNxt, PIDControl, encoder)",
            }));

  // The first motor of a board platform can drive the speaker; every motor there has IO pins.
  selectHostPlatform(platformArduino, 0);
  CHostRobotConfiguration arduino;
  arduino.settings.motors[0].nMotorType = 1;
  EXPECT_EQ(motorLines(arduino),
            std::vector<std::wstring>{
                L"#pragma config(Motor,  motor1,          Audio,         tmotorSpeaker, openLoop, IOPins, None, None)"});
}

TEST_F(MotorLines, MotorWrittenOnlyWhenItDiffersFromItsDefaults) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  // A cleared brick has its built-in motors at their defaults: nothing to write.
  EXPECT_TRUE(motorLines(rec).empty());
  // The drive side plays no part in the test.
  rec.setMotorDriveSideInConfig(1, 1);
  EXPECT_TRUE(motorLines(rec).empty());
  // A name or a flag of its own makes the line.
  rec.setUserDefinedMotorNameInConfig(2, L"grabber", TLineNumber(3, 0));
  EXPECT_EQ(motorLines(rec), std::vector<std::wstring>{
                                 L"#pragma config(Motor,  motorC,          grabber,       tmotorNxt, PIDControl, encoder)"});
  rec.setUserDefinedMotorNameInConfig(2, L"", TLineNumber(3, 0));
  rec.setMotorEncoderInConfig(0, false);  // also ends PID control
  EXPECT_EQ(motorLines(rec), std::vector<std::wstring>{
                                 L"#pragma config(Motor,  motorA,           ,             tmotorNxt, openLoop)"});
  rec.setMotorEncoderInConfig(0, true);
  rec.setMotorPIDControlledInConfig(0, true);
  // A motor of a hub is always written; its hub-style default name is written as " ,".
  rec.settings.nSensorPortHubs[0][0] = hubHTMotor;
  EXPECT_EQ(rec.getMotorTypeInConfig(3), 0);
  EXPECT_EQ(motorLines(rec),
            (std::vector<std::wstring>{
                L"#pragma config(Motor,  mtr_S1_C1_1,      ,             tmotorTetrix, openLoop)",
                L"#pragma config(Motor,  mtr_S1_C1_2,      ,             tmotorTetrix, openLoop)",
            }));
  // Writing stored the hub's default type into the empty slots.
  EXPECT_EQ(rec.getMotorTypeInConfig(3), 20);
}

TEST_F(MotorLines, WritingNormalisesLegacyTypesButKeepsTheFlagsOfTheLine) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  // A legacy type set by the host becomes the modern one with the legacy defaults.
  rec.settings.motors[0].nMotorType = 29;
  rec.settings.motors[0].bEncoder = false;
  EXPECT_EQ(motorLines(rec), std::vector<std::wstring>{
                                 L"#pragma config(Motor,  motorA,           ,             tmotorNxt, openLoop, reversed)"});
  EXPECT_EQ(rec.getMotorTypeInConfig(0), 17);

  // A type normalising keeps must keep the direction and control its line gave.
  selectHostPlatform(platformArduino, 10);
  CHostRobotConfiguration arduino;
  accept(arduino,
         L"#pragma config(Motor, motor_6, rightWheel, tmotorDCMotorPWM, PIDControl, reversed, IOPins, dgtl6, dgtl7)");
  const std::wstring sLine =
      L"#pragma config(Motor,  motor_6,         rightWheel,    tmotorDCMotorPWM, PIDControl, reversed, IOPins, dgtl6, "
      L"dgtl7)";
  EXPECT_EQ(motorLines(arduino), std::vector<std::wstring>{sLine});
  EXPECT_EQ(motorLines(arduino), std::vector<std::wstring>{sLine});
}

TEST_F(MotorLines, EncoderColumnOnPlatformsThatMapEncodersToMotors) {
  selectHostPlatform(platformVexI2c);
  CHostRobotConfiguration rec;
  accept(rec, L"#pragma config(Motor, port2, left, tmotorVex393_MC29, openLoop, encoderPort, I2C_1)");
  accept(rec, L"#pragma config(Motor, port3, right, tmotorVex393_MC29, openLoop, encoderPort, nowhere)");
  // A bare port word maps the encoder without the encoder flag.
  accept(rec, L"#pragma config(Motor, port4, arm, tmotorVex393_MC29, openLoop, I2C_2)");
  EXPECT_EQ(rec.getMapEncoderToMotor(2), -1);
  EXPECT_TRUE(rec.getMotorEncoderInConfig(2));
  EXPECT_EQ(rec.getMapEncoderToMotor(3), 21);
  EXPECT_FALSE(rec.getMotorEncoderInConfig(3));
  const std::vector<std::wstring> expected = {
      L"#pragma config(Motor,  port2,           left,          tmotorVex393_MC29, openLoop, encoderPort, I2C_1)",
      L"#pragma config(Motor,  port3,           right,         tmotorVex393_MC29, openLoop, encoderPort, None)",
      L"#pragma config(Motor,  port4,           arm,           tmotorVex393_MC29, openLoop, I2C_2)",
  };
  EXPECT_EQ(motorLines(rec), expected);
}

TEST_F(MotorLines, MotorLineRefusals) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  const TConfigurationSettings before = rec.getSettings();
  CString sError;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Motor, port1, left, tmotorNxt)", sError));
  EXPECT_EQ(sError, L"Bad motor device index 'port1'");
  EXPECT_EQ(std::memcmp(&before, &rec.getSettings(), sizeof before), 0);

  // A word that is no option stops the line; what came before it stays.
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Motor, motorB, right, tmotorNxt, reversed, bogus, driveLeft)", sError));
  EXPECT_EQ(sError, L"Bad motor config parm 'bogus'");
  EXPECT_TRUE(rec.getMotorReversedInConfig(1));
  EXPECT_EQ(rec.getMotorDriveSideInConfig(1), 0);
  EXPECT_EQ(motorName(rec, 1), L"right");

  // Numbers of ASCII digits are skipped; digits of other scripts are no number.
  accept(rec, L"#pragma config(Motor, motorC, c, tmotorNxt, 42, openLoop, 007)");
  EXPECT_FALSE(rec.getMotorPIDControlledInConfig(2));
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Motor, motorC, c, tmotorNxt, \xFF14\xFF12)", sError));
  EXPECT_EQ(sError, L"Bad motor config parm '\xFF14\xFF12'");
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Motor, motorC, c, tmotorNxt, -4)", sError));
  EXPECT_EQ(sError, L"Bad motor config parm '-4'");
}

TEST_F(MotorLines, MotorLineOptions) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  accept(rec, L"#pragma config(Motor, motorA, a, tmotorNxt, PIDControl, openLoop, driveRight, driveNone, reversed)");
  EXPECT_FALSE(rec.getMotorPIDControlledInConfig(0));
  EXPECT_EQ(rec.getMotorDriveSideInConfig(0), 0);
  EXPECT_TRUE(rec.getMotorReversedInConfig(0));
  // A new line for the motor starts from cleared flags, except the drive side.
  accept(rec, L"#pragma config(Motor, motorA, a, tmotorNxt, driveLeft)");
  accept(rec, L"#pragma config(Motor, motorA, a, tmotorNxt)");
  EXPECT_FALSE(rec.getMotorReversedInConfig(0));
  EXPECT_FALSE(rec.getMotorEncoderInConfig(0));
  EXPECT_EQ(rec.getMotorDriveSideInConfig(0), 1);
  EXPECT_EQ(rec.getMotorDefinitionLine(0), TLineNumber(7, 0));
  EXPECT_EQ(rec.motorNameLines[0], TLineNumber(7, 0));

  // "encoderPort" as the last parameter a line can carry has no port to read.
  accept(rec, L"#pragma config(Motor, motorB, b, tmotorNxt, 1, 2, 3, 4, 5, 6, 7, 8, encoderPort, S2)");
  EXPECT_TRUE(rec.getMotorEncoderInConfig(1));
  EXPECT_EQ(rec.getMapEncoderToMotor(1), -1);
  // Parameters beyond the twelfth are not read.
  accept(rec, L"#pragma config(Motor, motorC, c, tmotorNxt, 1, 2, 3, 4, 5, 6, 7, 8, 9, reversed)");
  EXPECT_FALSE(rec.getMotorReversedInConfig(2));

  // An empty name takes the default; a port spelled another way is noted.
  accept(rec, L"#pragma config(Motor, motorC, , tmotorNxt, S3)");
  EXPECT_EQ(motorName(rec, 2), L"motorC");
  EXPECT_EQ(rec.getMapEncoderToMotor(2), 2);
  EXPECT_FALSE(rec.getMotorEncoderInConfig(2));
  accept(rec, L"#pragma config(Motor, motorC, c, tmotorNxt, None)");
  EXPECT_EQ(rec.getMapEncoderToMotor(2), -1);
  EXPECT_FALSE(rec.getParseInfo().bNonCanonicalPortNames);
  setHostExternalControllers(true);
  rec.settings.nSensorPortHubs[0][0] = hubHTMotor;
  accept(rec, L"#pragma config(Motor, mtr_Matrix_S1_1, lift, tmotorTetrix, openLoop)");
  EXPECT_TRUE(rec.getParseInfo().bNonCanonicalPortNames);
  EXPECT_EQ(motorName(rec, 3), L"lift");
}

TEST_F(MotorLines, MotorTypeOfTheLine) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  // Legacy types: the replacement type with the legacy type's flags and PID settings.
  accept(rec, L"#pragma config(Motor, motorA, a, tmotorNormal, encoder)");
  EXPECT_EQ(rec.getMotorTypeInConfig(0), 17);
  accept(rec, L"#pragma config(Motor, motorB, b, tmotorNxtEncoderClosedLoop, encoder)");
  EXPECT_EQ(rec.getMotorTypeInConfig(1), 17);
  EXPECT_TRUE(rec.getMotorPIDControlledInConfig(1));
  EXPECT_TRUE(rec.getMotorPidSettings(1)->bIdenticalPidSettings(*pToggles->getDefaultPidSettings(28)));
  // A hub motor takes the types of its controller, also with the toggle on.
  rec.settings.nSensorPortHubs[0] = {hubHTMotor, hubMatrxRbtcs, hubNone, hubNone};
  rec.settings.nSensorPortHubs[1][0] = hubMatrxRbtcs;
  accept(rec, L"#pragma config(Motor, mtr_S1_C1_1, lift, tmotorTetrixEncoderPID, encoder)");
  EXPECT_EQ(rec.getMotorTypeInConfig(3), 20);
  EXPECT_TRUE(rec.getMotorPIDControlledInConfig(3));
  EXPECT_TRUE(rec.getMotorPidSettings(3)->bIdenticalPidSettings(*pToggles->getDefaultPidSettings(31)));
  accept(rec, L"#pragma config(Motor, mtr_Matrix_S2_2, spin, tmotorMatrix, openLoop)");
  EXPECT_EQ(rec.getMotorTypeInConfig(12), 21);
  // The hardware masks of hub motors do not depend on the controllers toggle.
  selectHostPlatform(platformBrick4Motor, -1, false);
  CHostRobotConfiguration brick;
  brick.settings.nSensorPortHubs[1][0] = hubMatrxRbtcs;
  EXPECT_EQ(brick.getAorDMotorTypeMask(13), 0x40);
  setHostExternalControllers(true);
  EXPECT_EQ(brick.getAorDMotorTypeMask(13), 0x40);
  EXPECT_EQ(brick.getThirdPartyMotorTypeMask(13), 0x40);
  EXPECT_EQ(brick.getAorDMotorTypeMask(3), 0x18);
  selectHostPlatform(platformNxt, -1, true);
  // A brick motor type does not fit a hub's motor.
  accept(rec, L"#pragma config(Motor, mtr_S1_C1_2, other, tmotorNxt, openLoop)");
  EXPECT_EQ(rec.getMotorTypeInConfig(4), 0);

  // A type the platform lacks takes its replacement.
  selectHostPlatform(platformArduino, 0);
  CHostRobotConfiguration arduino;
  accept(arduino, L"#pragma config(Motor, motor2, b, tmotorNxt, openLoop)");
  EXPECT_EQ(arduino.getMotorTypeInConfig(1), 3);
  accept(arduino, L"#pragma config(Motor, motor3, c, tmotorNoSuchType, openLoop)");
  EXPECT_EQ(arduino.getMotorTypeInConfig(2), 0);

  // A replacement the port's pins cannot drive leaves the port without a motor.
  selectHostPlatform(platformArduino, 10);
  CHostRobotConfiguration uno;
  accept(uno, L"#pragma config(Motor, motor_5, m, tmotorSharedPort, openLoop)");
  EXPECT_EQ(uno.getMotorTypeInConfig(2), 3);
  accept(uno, L"#pragma config(Motor, servo_9, s, tmotorSharedPort, openLoop)");
  EXPECT_EQ(uno.getMotorTypeInConfig(0), 0);
}

TEST_F(MotorLines, NamesThatNeedQuotes) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  accept(rec, L"#pragma config(Motor, motorA, \"left (main), drive\", tmotorNxt, openLoop)");
  EXPECT_EQ(motorName(rec, 0), L"left (main), drive");
  const std::vector<std::wstring> lines = motorLines(rec);
  EXPECT_EQ(lines, std::vector<std::wstring>{
                       L"#pragma config(Motor,  motorA,          \"left (main), drive\", tmotorNxt, openLoop)"});
  CHostRobotConfiguration again;
  accept(again, lines.at(0));
  EXPECT_EQ(motorName(again, 0), L"left (main), drive");
  // A quote inside a name is an ordinary character of the parameter.
  accept(rec, L"#pragma config(Motor, motorB, say\"hi, tmotorNxt, openLoop)");
  EXPECT_EQ(motorLines(rec).at(1), L"#pragma config(Motor,  motorB,          say\"hi,        tmotorNxt, openLoop)");
}

TEST_F(MotorLines, MotorIOPinsAndSharedPorts) {
  selectHostPlatform(platformArduino, 10);
  CHostRobotConfiguration rec;
  accept(rec, L"#pragma config(Motor, motor_5, a, tmotorDCMotorPWM, openLoop, IOPins, dgtl5, dgtl4)");
  EXPECT_EQ(rec.getMapMotorToPrimaryIOPin(2), 11);
  EXPECT_EQ(rec.getMapMotorToSecondaryIOPin(2), 10);
  EXPECT_EQ(rec.getSensorTypeInConfig(11), 57);
  EXPECT_EQ(rec.getSensorTypeInConfig(10), 58);
  accept(rec, L"#pragma config(Motor, motor_3, b, tmotorTwoPin, openLoop, IOPins, dgtl3, dgtl2)");
  EXPECT_EQ(rec.getSensorTypeInConfig(9), 59);
  EXPECT_EQ(rec.getSensorTypeInConfig(8), 59);
  // A new line for the motor releases the pins it had.
  accept(rec, L"#pragma config(Motor, motor_5, a, tmotorDCMotorPWM, openLoop, IOPins, dgtl5, nowhere)");
  EXPECT_EQ(rec.getSensorTypeInConfig(10), 0);
  EXPECT_EQ(rec.getMapMotorToSecondaryIOPin(2), -1);

  // On the shared-port platform a motor takes the sensor port of its index, and
  // the encoders of other motors on that port go.
  selectHostPlatform(platformSharedPorts);
  CHostRobotConfiguration shared;
  accept(shared, L"#pragma config(Motor, motor1, a, tmotorSharedPort, openLoop, port3)");
  EXPECT_EQ(shared.getSensorTypeInConfig(0), 91);
  EXPECT_EQ(shared.getMapEncoderToMotor(0), 2);
  shared.setMotorEncoderInConfig(0, true);
  accept(shared, L"#pragma config(Motor, motor3, c, tmotorSharedPort, openLoop)");
  EXPECT_EQ(shared.getSensorTypeInConfig(2), 91);
  EXPECT_EQ(shared.getMapEncoderToMotor(0), -1);
  EXPECT_FALSE(shared.getMotorEncoderInConfig(0));
}

TEST_F(MotorLines, HubsLines) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  accept(rec, L"#pragma config(Hubs, S1, HTMotor, HTServo, none, none)");
  accept(rec, L"#pragma config(Hubs, S3, MatrxRbtcs, none, none, none)");
  accept(rec, L"#pragma config(Hubs, S4, MSMotor, NXTSlave, HTTouch, MSServo)");
  EXPECT_EQ(rec.getSettings().nSensorPortHubs[0], (std::array<TSensorPortHub, 4>{1, 2, 0, 0}));
  EXPECT_EQ(rec.getSettings().nSensorPortHubs[3], (std::array<TSensorPortHub, 4>{6, 7, 4, 5}));
  const std::vector<std::wstring> expected = {
      L"#pragma config(Hubs,  S1, HTMotor,  HTServo,  none,     none)",
      L"#pragma config(Hubs,  S3, MatrxRbtcs, none,     none,     none)",
      // Only the controllers that carry motors or servos are spelled; the others read "none".
      L"#pragma config(Hubs,  S4, none,     none,     HTTouch,  MSServo)",
  };
  EXPECT_EQ(generatedLines(rec, L"#pragma config(Hubs,"), expected);
  CHostRobotConfiguration again;
  for (const std::wstring &sLine : expected) accept(again, sLine);
  EXPECT_EQ(again.getSettings().nSensorPortHubs[0], rec.getSettings().nSensorPortHubs[0]);
  EXPECT_EQ(again.getSettings().nSensorPortHubs[2], rec.getSettings().nSensorPortHubs[2]);

  // An end-of-chain mark before the first controller is written, and kept, as none;
  // a value no hub has is written as none.
  rec.settings.nSensorPortHubs[1] = {-1, -1, hubHTMotor, 9};
  rec.settings.nSensorPortHubs[2] = {-1, 0, -1, -1};
  EXPECT_EQ(generatedLines(rec, L"#pragma config(Hubs,  S2"),
            std::vector<std::wstring>{L"#pragma config(Hubs,  S2, none,     none,     HTMotor,  none)"});
  EXPECT_EQ(rec.getSettings().nSensorPortHubs[1], (std::array<TSensorPortHub, 4>{0, 0, 1, 9}));
  EXPECT_EQ(rec.getSettings().nSensorPortHubs[2], (std::array<TSensorPortHub, 4>{0, 0, 0, 0}));
  EXPECT_TRUE(generatedLines(rec, L"#pragma config(Hubs,  S3").empty());

  // Platforms without hubs write none.
  selectHostPlatform(platformVexI2c, -1, true);
  CHostRobotConfiguration vex;
  vex.settings.nSensorPortHubs[0][0] = hubHTMotor;
  EXPECT_TRUE(generatedLines(vex, L"#pragma config(Hubs,").empty());
}

TEST_F(MotorLines, HubsLineRefusals) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Hubs, S5, HTMotor, none, none, none)", sError));
  EXPECT_EQ(sError, L"Invalid #pragma 'Sensor Port' parm 'S5'");
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Hubs, s1, HTMotor, none, none, none)", sError));
  EXPECT_EQ(sError, L"Invalid #pragma 'Sensor Port' parm 's1'");
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Hubs, S2, HTMotor, HTservo, none, none)", sError));
  EXPECT_EQ(sError, L"Invalid #pragma 'Hub Type' parm 'HTservo'");
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Hubs, S2, HTMotor, none, none)", sError));
  EXPECT_EQ(sError, L"Invalid #pragma 'Hub Type' parm ''");
  EXPECT_EQ(rec.getSettings().nSensorPortHubs[1], (std::array<TSensorPortHub, 4>{0, 0, 0, 0}));

  // Without the controllers feature the line is refused, but the hubs are kept.
  setHostExternalControllers(false);
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Hubs, S2, HTMotor, none, none, none)", sError));
  EXPECT_EQ(sError,
            L"\"#pragma config(Hubs, ...)\" requires IDE feature \"External Motor/Servo Controllers\" enabled");
  EXPECT_EQ(rec.getSettings().nSensorPortHubs[1][0], hubHTMotor);
}

TEST_F(MotorLines, RenamedStandardModelMotors) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(RenamedStdModelMotor, motorZ, grabber)", sError));
  EXPECT_EQ(sError, L"Bad motor device index 'motorZ'");
  accept(rec, L"#pragma config(RenamedStdModelMotor, motorB, grabber)");
  EXPECT_EQ(motorName(rec, 1), L"grabber");
  EXPECT_EQ(rec.motorNameLines[1], TLineNumber(7, 0));
  // The older spelling of the keyword reads the same.
  accept(rec, L"#pragma config(RenameMotor, motorC, lifter)");
  EXPECT_EQ(motorName(rec, 2), L"lifter");
  // A slot without a motor is refused, but keeps the name.
  rec.settings.motors[0].nMotorType = 0;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(RenamedStdModelMotor, motorA, ghost)", sError));
  EXPECT_EQ(sError, L"Renaming standard model motor name for index  'motorA' with no motor defined");
  EXPECT_EQ(motorName(rec, 0), L"ghost");

  // The model's names are left out; the names that differ are written.
  CHostRobotConfiguration model;
  COneModelList models(model, L"Tribot");
  CStandardModelRobotConfigurationList *pPrevious = pStandardRobotModels;
  pStandardRobotModels = &models;
  rec.sMotorNames[0].Empty();
  rec.sMotorNames[2].Empty();
  rec.sStandardModelName = L"Tribot";
  const std::vector<std::wstring> lines = generatedLines(rec, L"#pragma config(Renamed");
  pStandardRobotModels = pPrevious;
  EXPECT_EQ(lines, std::vector<std::wstring>{L"#pragma config(RenamedStdModelMotor, motorB, grabber)"});
}

TEST_F(MotorLines, PidSettingLines) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  // Defaults of a PID-controlled motor and an empty record write nothing.
  accept(rec, L"#pragma config(Motor, motorA, a, tmotorNxt, PIDControl, encoder)");
  EXPECT_TRUE(rec.bIsMotorUsingDefaultPidSettings(0));
  EXPECT_TRUE(generatedLines(rec, L"#pragma config(MotorPidSetting").empty());

  accept(rec, L"#pragma config(MotorPidSetting, motorA, 5, 2, 800, 20, 0, 30, 60, 1000)");
  const TPidSettings &pid = *rec.getMotorPidSettings(0);
  EXPECT_EQ((std::vector<unsigned>{pid.B1, pid.B2, pid.B3, pid.B4, pid.W1, pid.W2, pid.W3, pid.W4}),
            (std::vector<unsigned>{5, 2, 20, 0, 800, 30, 60, 1000}));
  EXPECT_FALSE(rec.bIsMotorUsingDefaultPidSettings(0));
  EXPECT_EQ(generatedLines(rec, L"#pragma config(MotorPidSetting"),
            std::vector<std::wstring>{L"#pragma config(MotorPidSetting,  motorA,  5, 2, 800, 20, 0,   30, 60, 1000)"});
  // Not PID-controlled: no line, whatever the settings.
  rec.setMotorPIDControlledInConfig(0, false);
  EXPECT_TRUE(generatedLines(rec, L"#pragma config(MotorPidSetting").empty());
  // The line itself does not change the control mode.
  accept(rec, L"#pragma config(MotorPidSetting, motorA, 5, 2, 800, 20, 0, 30, 60, 1000)");
  EXPECT_FALSE(rec.getMotorPIDControlledInConfig(0));

  // Empty values stand for 65535; each field keeps the low bits it holds.
  accept(rec, L"#pragma config(MotorPidSetting, motorB, 300, , , -1, x, 70000, 65536, -2)");
  const TPidSettings &odd = *rec.getMotorPidSettings(1);
  EXPECT_EQ((std::vector<unsigned>{odd.B1, odd.B2, odd.B3, odd.B4, odd.W1, odd.W2, odd.W3, odd.W4}),
            (std::vector<unsigned>{44, 255, 255, 0, 65535, 4464, 0, 65534}));
  // A short line: the missing values are empty ones.
  accept(rec, L"#pragma config(MotorPidSetting, motorC, 1, 2)");
  EXPECT_EQ(rec.getMotorPidSettings(2)->W4, 65535);

  // A hub motor whose settings the host set, on the hub's port name.
  rec.settings.nSensorPortHubs[1][0] = hubHTMotor;
  TPidSettings custom = emptyPidSettings;
  custom.B1 = 9;
  custom.W4 = 1234;
  rec.setMotorPidSettings(11, custom);
  rec.setMotorPIDControlledInConfig(11, true);
  EXPECT_EQ(generatedLines(rec, L"#pragma config(MotorPidSetting,  mtr"),
            std::vector<std::wstring>{L"#pragma config(MotorPidSetting,  mtr_S2_C1_1,  9, 0, 0, 0, 0,   0, 0, 1234)"});
  rec.setMotorPidSettingsDefaultInConfig(11, 31);
  EXPECT_TRUE(rec.getMotorPidSettings(11)->bIdenticalPidSettings(*pToggles->getDefaultPidSettings(31)));

  const TConfigurationSettings before = rec.getSettings();
  CString sError;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(MotorPidSetting, motorQ, 1, 2, 3, 4, 5, 6, 7, 8)", sError));
  EXPECT_EQ(sError, L"Bad motor device index 'motorQ'");
  EXPECT_EQ(std::memcmp(&before, &rec.getSettings(), sizeof before), 0);
}

TEST_F(MotorLines, EncoderMapping) {
  selectHostPlatform(platformVexI2c);
  CHostRobotConfiguration rec;
  rec.setMapEncoderToMotor(0, -5);
  EXPECT_EQ(rec.getMapEncoderToMotor(0), -1);
  for (int n : {1, 4}) {
    rec.setMapEncoderToMotor(n, 2);
    rec.setMotorEncoderInConfig(n, true);
    rec.setMotorPIDControlledInConfig(n, true);
  }
  rec.setMapEncoderToMotor(5, 3);
  rec.setMotorEncoderInConfig(5, true);
  rec.setMotorPIDControlledInConfig(5, true);
  // A motor without an encoder port is no motor "on port -1".
  rec.setMotorEncoderInConfig(6, true);
  rec.setMotorPIDControlledInConfig(6, true);
  rec.removeMotorEncodersForSensorPort(-1);
  EXPECT_TRUE(rec.getMotorEncoderInConfig(6));
  EXPECT_TRUE(rec.getMotorPIDControlledInConfig(6));

  // A new sensor on port 2 drops the encoders there and nowhere else.
  rec.setSensorTypeInConfig(2, 4);
  for (int n : {1, 4}) {
    EXPECT_EQ(rec.getMapEncoderToMotor(n), -1) << n;
    EXPECT_FALSE(rec.getMotorEncoderInConfig(n)) << n;
    EXPECT_FALSE(rec.getMotorPIDControlledInConfig(n)) << n;
  }
  EXPECT_EQ(rec.getMapEncoderToMotor(5), 3);
  EXPECT_TRUE(rec.getMotorEncoderInConfig(5));
  EXPECT_TRUE(rec.getMotorPIDControlledInConfig(5));
  rec.validateMapEncoderToMotor(5);
  EXPECT_EQ(rec.getMapEncoderToMotor(5), 3);
}

TEST_F(MotorLines, PlatformWithMoreMotorsThanTheRecordHolds) {
  selectHostPlatform(platformVexPic);
  // A catalog whose platform reports more motor ports than a record has slots.
  CPlatformType *pOriginal = pPlatformData;
  CPlatformType wide = *pPlatformData;
  const TPlatformMotorParms manyMotors = {50};
  wide.pMotorParms = &manyMotors;
  pPlatformData = &wide;
  CHostRobotConfiguration rec;
  TPidSettings custom = emptyPidSettings;
  custom.B1 = 1;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    rec.settings.motors[size_t(n)].nMotorType = 3;
    rec.settings.motors[size_t(n)].bPIDControlled = true;
    rec.setMotorPidSettings(n, custom);
  }
  EXPECT_EQ(motorLines(rec).size(), size_t(kMaxNumbOfMotors));
  EXPECT_EQ(generatedLines(rec, L"#pragma config(MotorPidSetting").size(), size_t(kMaxNumbOfMotors));
  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(Motor, port10, last, tmotorServoStandard)", sError)) << sError.str();
  pPlatformData = pOriginal;
}

}  // namespace
