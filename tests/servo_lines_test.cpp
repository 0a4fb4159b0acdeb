// Servos: default names over the servo controllers, the Servo and SrvoPosition
// lines read and written.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "tests/config_lines.h"

namespace {
using test_support::parseLine;
using test_support::generatedLines;


class Servos : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

std::wstring lowLevelName(const CRobotConfigurationBasic &rec, int nServo, bool bHubNames) {
  CString sName(L"stale");
  rec.getDefaultServoNameLowLevel(nServo, sName, bHubNames);
  return sName.str();
}

std::wstring platformName(const CRobotConfigurationBasic &rec, int nServo) {
  CString sName;
  rec.getDefaultServoNameForPlatformOrControllerBoard(nServo, sName);
  return sName.str();
}

TEST_F(Servos, ServoPortCountFollowsTheToggle) {
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    selectHostPlatform(nKind, -1, false);
    CHostRobotConfiguration rec;
    EXPECT_EQ(rec.getMaxNumbOfServoPorts(), 0) << "kind " << nKind;
    setHostExternalControllers(true);
    EXPECT_EQ(rec.getMaxNumbOfServoPorts(), 96) << "kind " << nKind;
  }
}

TEST_F(Servos, DefaultNamesCountServosOverTheControllers) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  rec.settings.nSensorPortHubs[0][0] = hubHTServo;
  rec.settings.nSensorPortHubs[1][0] = hubMatrxRbtcs;
  EXPECT_EQ(lowLevelName(rec, 1, true), L"srvo_S1_C1_2");
  EXPECT_EQ(lowLevelName(rec, 1, false), L"servo2");
  EXPECT_EQ(lowLevelName(rec, 24, true), L"srvo_Matrix_S2_1");
  EXPECT_EQ(lowLevelName(rec, 24, false), L"servo7");
  EXPECT_EQ(lowLevelName(rec, 27, false), L"servo10");
  EXPECT_EQ(lowLevelName(rec, 6, true), L"");
  EXPECT_EQ(lowLevelName(rec, 28, true), L"");
  CString sName;
  rec.getDefaultServoNameAdjustedForTetrix(5, sName);
  EXPECT_EQ(sName, L"srvo_S1_C1_6");
  rec.getDefaultServoName(5, sName);
  EXPECT_EQ(sName, L"servo6");

  // Motor controllers carry no servos; the count goes on over the chain.
  rec.settings.nSensorPortHubs[0] = {hubHTMotor, hubHTServo, hubHTServo, hubNone};
  EXPECT_EQ(lowLevelName(rec, 6, true), L"srvo_S1_C2_1");
  EXPECT_EQ(lowLevelName(rec, 6, false), L"servo1");
  EXPECT_EQ(lowLevelName(rec, 17, false), L"servo12");
  EXPECT_EQ(lowLevelName(rec, 24, false), L"servo13");
  EXPECT_EQ(lowLevelName(rec, 0, false), L"");
  // A chain ends at its first empty position.
  rec.settings.nSensorPortHubs[0] = {hubNone, hubHTServo, hubNone, hubNone};
  EXPECT_EQ(lowLevelName(rec, 6, true), L"");
  EXPECT_EQ(lowLevelName(rec, 24, false), L"servo1");

  // For the platform: the hub name, else the catalog's port name.
  EXPECT_EQ(platformName(rec, 24), L"srvo_Matrix_S2_1");
  EXPECT_EQ(platformName(rec, 6), L"srvo_S1_C2_1");

  // Only the brick platforms name servos after their controllers.
  selectHostPlatform(platformArduino, 10, true);
  CHostRobotConfiguration arduino;
  arduino.settings.nSensorPortHubs[0][0] = hubHTServo;
  EXPECT_EQ(lowLevelName(arduino, 0, true), L"");
  // On the Arduino a servo is named after the board's motor pins.
  EXPECT_EQ(platformName(arduino, 0), L"servo_9");
  EXPECT_EQ(platformName(arduino, 4), L"motor_3");
  selectHostPlatform(platformVexPic);
  CHostRobotConfiguration vex;
  CString sPort;
  getServoPortString(3, sPort);
  EXPECT_EQ(platformName(vex, 3), sPort.str());
}

TEST_F(Servos, ServoLineReadAndWritten) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  rec.settings.nSensorPortHubs[0] = {hubHTMotor, hubHTServo, hubNone, hubNone};
  rec.settings.nSensorPortHubs[1][0] = hubMatrxRbtcs;
  CString sError;
  ASSERT_TRUE(parseLine(rec, L"#pragma config(Servo,  srvo_S1_C2_1,    clawServo,            tServoStandard)",
                        sError, TLineNumber(9, 0)))
      << sError.str();
  CString sName;
  rec.getUserDefinedServoNameInConfig(6, sName);
  EXPECT_EQ(sName, L"clawServo");
  EXPECT_EQ(rec.getServoType(6), 1);
  EXPECT_EQ(rec.getServoDefinitionLine(6), TLineNumber(9, 0));
  EXPECT_EQ(rec.servoNameLines[6], TLineNumber(9, 0));
  ASSERT_TRUE(parseLine(rec, L"#pragma config(Servo, srvo_Matrix_S2_2, wrist, tServoWinch)", sError)) << sError.str();
  EXPECT_EQ(rec.getServoType(25), 3);

  // The first Servo line gives every untyped servo of the controllers its default name, so they are written too.
  EXPECT_EQ(generatedLines(rec, L"#pragma config(Servo,"),
            (std::vector<std::wstring>{
                L"#pragma config(Servo,  srvo_S1_C2_1,    clawServo,            tServoStandard)",
                L"#pragma config(Servo,  srvo_S1_C2_2,    servo2,               tServoNone)",
                L"#pragma config(Servo,  srvo_S1_C2_3,    servo3,               tServoNone)",
                L"#pragma config(Servo,  srvo_S1_C2_4,    servo4,               tServoNone)",
                L"#pragma config(Servo,  srvo_S1_C2_5,    servo5,               tServoNone)",
                L"#pragma config(Servo,  srvo_S1_C2_6,    servo6,               tServoNone)",
                L"#pragma config(Servo,  srvo_Matrix_S2_1, servo7,               tServoNone)",
                L"#pragma config(Servo,  srvo_Matrix_S2_2, wrist,                tServoWinch)",
                L"#pragma config(Servo,  srvo_Matrix_S2_3, servo9,               tServoNone)",
                L"#pragma config(Servo,  srvo_Matrix_S2_4, servo10,              tServoNone)",
            }));

  // A servo whose controller is gone is not written.
  rec.settings.nSensorPortHubs[1][0] = hubNone;
  EXPECT_EQ(generatedLines(rec, L"#pragma config(Servo,").size(), 6u);
  // Nor is a servo without name and type.
  for (CString &sServoName : rec.sServoNames) sServoName.Empty();
  rec.setServoType(6, 0);
  EXPECT_TRUE(generatedLines(rec, L"#pragma config(Servo,").empty());
  // A typed servo without a name keeps an empty name column.
  rec.setServoType(7, 2);
  EXPECT_EQ(generatedLines(rec, L"#pragma config(Servo,"),
            (std::vector<std::wstring>{
                L"#pragma config(Servo,  srvo_S1_C2_2,    ,                     tServoContinuousRotation)"}));
}

TEST_F(Servos, ServoLineRefusals) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  rec.settings.nSensorPortHubs[0][0] = hubHTServo;
  const TLineNumber clearedLine = rec.getServoDefinitionLine(0);
  CString sError;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Servo, srvo_S5_C1_1, claw, tServoStandard)", sError));
  EXPECT_EQ(sError, L"Bad servo device index 'srvo_S5_C1_1'");
  EXPECT_FALSE(parseLine(rec, L"#pragma config(Servo, , claw, tServoStandard)", sError));
  EXPECT_EQ(sError, L"Bad servo device index ''");
  EXPECT_TRUE(rec.sServoNames[0].IsEmpty());
  EXPECT_EQ(rec.getServoDefinitionLine(0), clearedLine);
  // Only a bad index is refused: a servo of no configured controller and a
  // type word the catalog does not know are stored as they come.
  EXPECT_TRUE(parseLine(rec, L"#pragma config(Servo, srvo_S2_C1_1, lift, tServoStandard)", sError));
  EXPECT_EQ(rec.sServoNames[24], L"lift");
  EXPECT_TRUE(parseLine(rec, L"#pragma config(Servo, srvo_S1_C1_1, claw, tServoBig)", sError));
  EXPECT_EQ(rec.sServoNames[0], L"claw");
  EXPECT_EQ(rec.getServoType(0), -1);
}

TEST_F(Servos, EmptyServoNameTakesTheDefaultOfThePreviousType) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  rec.settings.nSensorPortHubs[0][0] = hubHTServo;
  CString sError, sName;
  ASSERT_TRUE(parseLine(rec, L"#pragma config(Servo, srvo_S1_C1_3, , tServoWinch)", sError, TLineNumber(4, 0)));
  rec.getUserDefinedServoNameInConfig(2, sName);
  EXPECT_EQ(sName, L"servo3");
  EXPECT_EQ(rec.servoNameLines[2], emptyLineNumber);
  EXPECT_EQ(rec.getServoDefinitionLine(2), TLineNumber(4, 0));

  // The old type is a winch: no default name, even though the new type is none.
  rec.sServoNames[2].Empty();
  ASSERT_TRUE(parseLine(rec, L"#pragma config(Servo, srvo_S1_C1_3, , tServoNone)", sError));
  rec.getUserDefinedServoNameInConfig(2, sName);
  EXPECT_EQ(sName, L"");
  EXPECT_EQ(rec.getServoType(2), 0);

  // A default name is recognised and emptied again; a user's name is kept.
  rec.sServoNames[4] = L"servo5";
  rec.setDefaultServoNameToEmpty(4);
  EXPECT_TRUE(rec.sServoNames[4].IsEmpty());
  rec.sServoNames[4] = L"Servo5";
  rec.setDefaultServoNameToEmpty(4);
  EXPECT_EQ(rec.sServoNames[4], L"Servo5");
  rec.setDefaultServoNameToEmpty(-1);
  rec.setEmptyServoNameToDefaultName(kMaxNumbOfServos);
}

TEST_F(Servos, ServoPositionsReadAndWritten) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  CString sError;
  ASSERT_TRUE(parseLine(rec, L"#pragma config(SrvoPosition, home)", sError)) << sError.str();
  ASSERT_TRUE(parseLine(rec, L"#pragma config(SrvoPosition, grab, 0, 10, , 255, 7, 100, 128, 3)", sError))
      << sError.str();
  ASSERT_EQ(rec.getSettings().nNumbOfServoPositions, 2);
  EXPECT_EQ(rec.sServoPositionNames[0], L"home");
  EXPECT_EQ(rec.getSettings().nServoPositions[0],
            (std::array<uint8_t, 8>{128, 128, 128, 128, 128, 128, 128, 128}));
  EXPECT_EQ(rec.getSettings().nServoPositions[1], (std::array<uint8_t, 8>{0, 10, 128, 255, 7, 100, 128, 3}));

  EXPECT_EQ(generatedLines(rec, L"#pragma config(SrvoPosition,"),
            (std::vector<std::wstring>{
                L"#pragma config(SrvoPosition,  home,                  128, 128, 128, 128, 128, 128, 128, 128)",
                L"#pragma config(SrvoPosition,  grab,                    0,  10, 128, 255,   7, 100, 128,   3)",
            }));
  // A set that lost its name is not written.
  rec.sServoPositionNames[0].Empty();
  EXPECT_EQ(generatedLines(rec, L"#pragma config(SrvoPosition,").size(), 1u);
}

TEST_F(Servos, ServoPositionRefusals) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  CString sError;
  // A position keeps the low 8 bits of its number; a word reads as getInteger gives it.
  ASSERT_TRUE(parseLine(rec, L"#pragma config(SrvoPosition, grab, 300, -1, open, , 9, 8, 7, 6, 5)", sError));
  EXPECT_EQ(rec.getSettings().nServoPositions[0],
            (std::array<uint8_t, kNumbOfServoPositionsPerSet>{44, 255, 0, 128, 9, 8, 7, 6}));
  rec.clearConfigurationDefinition();

  for (int n = 0; n < kMaxNumbOfServoPositionSets; ++n)
    ASSERT_TRUE(parseLine(rec, L"#pragma config(SrvoPosition, set" + std::to_wstring(n) + L", 1)", sError))
        << sError.str();
  EXPECT_FALSE(parseLine(rec, L"#pragma config(SrvoPosition, oneTooMany, 2)", sError));
  EXPECT_EQ(sError, L"Maximum limit of servo position settinge exceeded");
  EXPECT_EQ(rec.getSettings().nNumbOfServoPositions, 40);
  EXPECT_EQ(rec.sServoPositionNames[39], L"set39");
  const std::vector<std::wstring> lines = generatedLines(rec, L"#pragma config(SrvoPosition,");
  ASSERT_EQ(lines.size(), 40u);
  EXPECT_EQ(lines[39], L"#pragma config(SrvoPosition,  set39,                   1, 128, 128, 128, 128, 128, 128, 128)");
}

}  // namespace
