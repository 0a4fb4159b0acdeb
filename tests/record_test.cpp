// The configuration record: reset values, board defaults, comparison and copying.
#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Networking.h"
#include "robotconfig/host/Platform.h"
#include "tests/config_lines.h"

namespace {
using test_support::bSameSettings;


class ConfigurationRecord : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

std::vector<std::wstring> boardDefaultMotorNames(const CRobotConfigurationBasic &rec) {
  std::vector<std::wstring> names;
  for (const CString &s : rec.sBoardDefaultMotorNames) names.push_back(s.str());
  return names;
}

// Fills a record with settings and names that a clear must take back.
void makeDirty(CHostRobotConfiguration &rec) {
  rec.settings.nSensorPortHubs[0][0] = hubHTMotor;
  rec.settings.nDriveTrainType = 3;
  rec.settings.nDriveTrainMotorIndex = {0, 1, 2, 3};
  rec.settings.nGripperArmMotorIndex = {4, 5, 6, 7};
  rec.settings.nMemorySizes = {100, 200, 300};
  rec.settings.nUARTMode[1] = 4;
  rec.settings.nServoSettings[5] = 7;
  rec.settings.nCpuClockSpeed = 1234;
  rec.setMotorTypeInConfig(2, 29);
  rec.settings.motors[3].nEncoderPort = 2;
  rec.setMotorIOPinsInConfig(4, 9, 10, true);
  rec.setSensorTypeInConfig(11, 5);
  rec.settings.nSecondaryPorts[1] = 3;
  rec.sMotorNames[0] = L"left";
  rec.sSensorNames[1] = L"sonar";
  rec.sServoNames[2] = L"claw";
  rec.sServoPositionNames[0] = L"open";
  rec.sStandardModelName = L"model";
  rec.sModelNameUserFile = L"model.txt";
  rec.parseInfo.bFirstConfigLineSeen = true;
  rec.parseInfo.firstConfigLine = TLineNumber(12, 0);
  rec.parseInfo.nCompileCodeSizeResults = {1, 2, 3};
}

TEST_F(ConfigurationRecord, ResetValuesOnEveryPlatformKind) {
  for (const bool bToggle : {false, true}) {
    for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
      SCOPED_TRACE(testing::Message() << "kind " << nKind << " toggle " << bToggle);
      selectHostPlatform(nKind, -1, bToggle);
      CHostRobotConfiguration rec;
      const TConfigurationSettings &s = rec.getSettings();
      const TControllerBoardType nBoard = pToggles->getIDECircuitBoardType();
      EXPECT_EQ(s.nPlatformKind, nKind);
      EXPECT_EQ(s.nCircuitBoardType, nBoard);
      EXPECT_EQ(s.nCpuClockSpeed, getCircuitBoardInfo(nBoard)->nDefaultCpuClockSpeed);
      EXPECT_EQ(s.nProgramType, 255);
      EXPECT_EQ(s.nUnnamedAfterI2CMode, 1);
      EXPECT_EQ(s.nMemorySizes, (std::array<int32_t, 3>{-1, -1, -1}));
      EXPECT_EQ(rec.getParseInfo().nCompileCodeSizeResults, (std::array<int32_t, 3>{-1, -1, -1}));
      EXPECT_EQ(rec.getParseInfo().firstConfigLine, firstLineNumber);
      EXPECT_FALSE(rec.getParseInfo().bFirstConfigLineSeen);
      for (int port = 0; port < kMaxNumbOfSensorPorts; ++port) EXPECT_EQ(s.nSecondaryPorts[size_t(port)], -1);
      EXPECT_EQ(s.nDriveTrainType, 0);
      EXPECT_EQ(s.nDriveTrainMotorIndex, (std::array<uint8_t, 4>{255, 255, 255, 255}));
      EXPECT_EQ(s.nDriveTrainWheels, (std::array<uint16_t, 5>{0, 1, 1, 0, 0}));
      EXPECT_EQ(s.nGripperArmType, 0);
      EXPECT_EQ(s.nGripperArmMotorIndex, (std::array<int32_t, 4>{-1, -1, -1, -1}));
      for (int servo = 0; servo < kMaxNumbOfServos; ++servo) {
        EXPECT_EQ(s.nServoSettings[size_t(servo)], 0x00FF0000);
        EXPECT_EQ(s.nServoTypes[size_t(servo)], 0);
      }
      // Only the brick platforms start with motors on their built-in ports.
      const int nBuiltIn = nKind == platformNxt ? 3 : nKind == platformBrick4Motor ? 4 : 0;
      const TMotorTypes nBuiltInType = nKind == platformNxt ? 17 : 18;
      for (int n = 0; n < kMaxNumbOfMotors; ++n) {
        SCOPED_TRACE(n);
        const TMotorSlot &motor = s.motors[size_t(n)];
        const bool bBuiltIn = n < nBuiltIn;
        EXPECT_EQ(motor.nMotorType, bBuiltIn ? nBuiltInType : 0);
        EXPECT_EQ(motor.bEncoder, bBuiltIn);
        EXPECT_EQ(motor.bPIDControlled, bBuiltIn);
        EXPECT_FALSE(motor.bReversed);
        EXPECT_EQ(motor.nEncoderPort, -1);
        EXPECT_EQ(motor.nPrimaryIOPin, -1);
        EXPECT_EQ(motor.nSecondaryIOPin, -1);
        EXPECT_TRUE(rec.sMotorNames[size_t(n)].IsEmpty());
        EXPECT_EQ(rec.motorNameLines[size_t(n)], emptyLineNumber);
        // Default names are exactly those of the board's pin-table rows.
        const bool bRow = s.pMotorIOPinTable && n < s.nNumbOfEntriesInMotorIOPinTable &&
                          s.pMotorIOPinTable[n].pzDefaultMotorName;
        EXPECT_EQ(rec.sBoardDefaultMotorNames[size_t(n)].str(),
                  bRow ? std::wstring(s.pMotorIOPinTable[n].pzDefaultMotorName) : std::wstring());
      }
      EXPECT_TRUE(rec.getStandardModelName().IsEmpty());
      EXPECT_TRUE(rec.getModelNameUserFile().IsEmpty());
    }
  }
}

TEST_F(ConfigurationRecord, ClearTakesBackEverythingAndIsRepeatable) {
  struct TSelection {
    int nKind;
    TControllerBoardType nBoard;
    bool bToggle;
  };
  for (const TSelection &sel : {TSelection{1, -1, true}, TSelection{2, -1, false}, TSelection{3, -1, false},
                                TSelection{4, 12, false}, TSelection{7, -1, false}, TSelection{8, -1, true}}) {
    SCOPED_TRACE(sel.nKind);
    selectHostPlatform(sel.nKind, sel.nBoard, sel.bToggle);
    CHostRobotConfiguration fresh;
    CHostRobotConfiguration rec;
    makeDirty(rec);
    rec.clearConfigurationDefinition();
    EXPECT_TRUE(bSameSettings(rec, fresh));
    EXPECT_EQ(rec.compareConfiguration(fresh), configCompareSame);
    EXPECT_FALSE(rec.getParseInfo().bFirstConfigLineSeen);
    EXPECT_EQ(rec.getParseInfo().firstConfigLine, firstLineNumber);

    const TConfigurationSettings once = rec.getSettings();
    rec.clearConfigurationDefinition();
    EXPECT_EQ(std::memcmp(&once, &rec.getSettings(), sizeof once), 0);
    EXPECT_EQ(rec.compareConfiguration(fresh), configCompareSame);
  }

  // A record cleared under another platform and board is the fresh record of the new one.
  selectHostPlatform(4, 12);
  CHostRobotConfiguration rec;
  EXPECT_EQ(rec.sBoardDefaultMotorNames[11], L"motor_10");
  selectHostPlatform(4, 28);
  rec.clearConfigurationDefinition();
  CHostRobotConfiguration fresh;
  EXPECT_TRUE(bSameSettings(rec, fresh));
  EXPECT_EQ(boardDefaultMotorNames(rec), boardDefaultMotorNames(fresh));
}

TEST_F(ConfigurationRecord, BoardDefaultMotorNamesAndFixedPins) {
  selectHostPlatform(4, 28);
  CHostRobotConfiguration rec;
  std::vector<std::wstring> expected = {L"motor_5",  L"motor_3", L"servo_9", L"servo_10",
                                        L"servo_A", L"servo_B", L"servo_C", L"servo_C"};
  expected.resize(kMaxNumbOfMotors);
  EXPECT_EQ(boardDefaultMotorNames(rec), expected);

  struct TFixedPins {
    TControllerBoardType nBoard;
    int nUartPin1, nUartPin2, nFixedPin;
  };
  for (const TFixedPins &e : {TFixedPins{12, 16, 17, 29}, TFixedPins{8, 6, 7, 19}}) {
    SCOPED_TRACE(e.nBoard);
    selectHostPlatform(4, e.nBoard);
    rec.clearConfigurationDefinition();
    for (int port = 0; port < kMaxNumbOfSensorPorts; ++port) {
      SCOPED_TRACE(port);
      const TSensorTypes nExpected =
          (port == e.nUartPin1 || port == e.nUartPin2) ? 60 : port == e.nFixedPin ? 65 : 0;
      EXPECT_EQ(rec.getSensorTypeInConfig(port), nExpected);
      EXPECT_EQ(rec.getSensorModeInConfig(port), 0);
    }
  }
}

TEST_F(ConfigurationRecord, UartDefaultsAfterClear) {
  struct TUartDefaults {
    int nKind;
    std::array<TSerialPortMode, 6> nModes;
    std::array<TBaudRate, 6> nBaudRates;
  };
  const TUartDefaults kExpected[] = {
      {platformVexI2c, {1, 0, 3, 0, 0, 0}, {12, 2, 5, 2, 2, 2}},
      {platformVexPic, {1, 3, 0, 0, 0, 0}, {12, 5, 2, 2, 2, 2}},
      {platformArduino, {1, 0, 0, 0, 0, 0}, {12, 2, 2, 2, 2, 2}},
      {platformKind9, {1, 0, 0, 0, 0, 0}, {12, 2, 2, 2, 2, 2}},
      {platformNxt, {0, 0, 0, 0, 0, 0}, {2, 2, 2, 2, 2, 2}},
  };
  for (const TUartDefaults &e : kExpected) {
    SCOPED_TRACE(e.nKind);
    selectHostPlatform(e.nKind);
    CHostRobotConfiguration rec;
    rec.settings.nUARTMode = {4, 4, 4, 4, 4, 4};
    rec.settings.nI2CMode[0] = 2;
    rec.clearConfigurationDefinition();
    for (int port = 0; port < kMaxNumbOfSerialPorts; ++port) {
      EXPECT_EQ(rec.getUARTType(port), e.nModes[size_t(port)]) << "UART " << port;
      EXPECT_EQ(rec.getBaudRate(port), e.nBaudRates[size_t(port)]) << "UART " << port;
      EXPECT_EQ(rec.getSettings().nI2CMode[size_t(port)], 0);
    }
  }
}

TEST_F(ConfigurationRecord, DriveTrainAndGripperMotorCounts) {
  const int kDriveTrainMotors[] = {0, 2, 2, 4, 4, 4, 3, 4, 0, 0};
  for (int nType = 0; nType < 10; ++nType)
    EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForDriveTrain(nType), kDriveTrainMotors[nType]) << nType;
  EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForDriveTrain(-1), 0);
  EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForDriveTrain(255), 0);
  const int kGripperMotors[] = {0, 4, 4, 0, 0};
  for (int nType = 0; nType < 5; ++nType)
    EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForGripperArm(nType), kGripperMotors[nType]) << nType;
  EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForGripperArm(-1), 0);

  CHostRobotConfiguration rec;
  rec.settings.nDriveTrainType = 6;
  rec.settings.nGripperArmType = 2;
  EXPECT_EQ(rec.getNumbOfMotorsForDriveTrain(), 3);
  EXPECT_EQ(rec.getNumbOfMotorsForGripperArm(), 4);
  rec.settings.nDriveTrainType = 200;
  EXPECT_EQ(rec.getNumbOfMotorsForDriveTrain(), 0);
}

TEST_F(ConfigurationRecord, CompareReportsTheFirstKindOfDifference) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration a;
  CHostRobotConfiguration b;
  EXPECT_EQ(a.compareConfiguration(b), configCompareSame);
  EXPECT_EQ(a == b, 1);
  EXPECT_EQ(a != b, 0);

  b.sSensorNames[1] = L"sonar";
  EXPECT_EQ(a.compareConfiguration(b), configCompareNamesDiffer);
  EXPECT_EQ(a != b, 1);
  b.sSensorNames[1].Empty();

  // Names are compared with case.
  a.sServoNames[4] = L"Claw";
  b.sServoNames[4] = L"claw";
  EXPECT_EQ(a.compareConfiguration(b), configCompareNamesDiffer);
  b.sServoNames[4] = L"Claw";

  // An empty name does not stand for the default when this record has a default of its own.
  b.sMotorNames[0] = L"motorA";
  EXPECT_EQ(a.compareConfiguration(b), configCompareNamesDiffer);
  EXPECT_EQ(b.compareConfiguration(a), configCompareNamesDiffer);
  b.sMotorNames[0].Empty();

  b.sStandardModelName = L"Tribot";
  EXPECT_EQ(a.compareConfiguration(b), configCompareModelNamesDiffer);
  b.sStandardModelName.Empty();
  b.sModelNameUserFile = L"robot.txt";
  EXPECT_EQ(a.compareConfiguration(b), configCompareModelNamesDiffer);

  // A setting outranks differing names and model names.
  b.sMotorNames[1] = L"right";
  b.setMotorReversedInConfig(1, true);
  EXPECT_EQ(a.compareConfiguration(b), configCompareSettingsDiffer);
  b.setMotorReversedInConfig(1, false);
  EXPECT_EQ(a.compareConfiguration(b), configCompareNamesDiffer);

  CHostRobotConfiguration c;
  c.pNtwkInfo->setNetworkName(L"net");
  EXPECT_EQ(a.compareConfiguration(c), configCompareSettingsDiffer);
  c.nHostData = 5;
  c.pNtwkInfo->initializeEmpty();
  EXPECT_EQ(a.compareConfiguration(c), configCompareSettingsDiffer);
}

TEST_F(ConfigurationRecord, AssignmentAndCopyConstruction) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration source;
  source.settings.nSensorPortHubs[0][0] = hubHTMotor;
  source.setMotorTypeInConfig(3, 20);
  source.sMotorNames[3] = L"arm";
  source.motorNameLines[3] = TLineNumber(4, 0);
  source.sSensorNames[0] = L"touch";
  source.sServoPositionNames[1] = L"closed";
  source.sModelNameUserFile = L"robot.txt";
  source.sBoardDefaultMotorNames[0] = L"sourceDefault";
  source.sSourceCode = L"source text";
  source.pNtwkInfo->setNetworkName(L"net");

  CHostRobotConfiguration target;
  target.sSourceCode = L"target text";
  target.sBoardDefaultMotorNames[0] = L"targetDefault";
  static_cast<CRobotConfigurationBasic &>(target) = source;
  EXPECT_EQ(target == source, 1);
  EXPECT_EQ(target.compareConfiguration(source), configCompareSame);
  EXPECT_EQ(target.sMotorNames[3], L"arm");
  EXPECT_EQ(target.motorNameLines[3], TLineNumber(4, 0));
  EXPECT_EQ(target.pNtwkInfo->sNetworkName, L"net");
  EXPECT_NE(target.pNtwkInfo, source.pNtwkInfo);
  EXPECT_EQ(target.sSourceCode, L"target text");
  EXPECT_EQ(target.sBoardDefaultMotorNames[0], L"targetDefault");

  {
    const CHostRobotConfiguration copy(source);
    EXPECT_EQ(copy.compareConfiguration(source), configCompareSame);
    EXPECT_NE(copy.pNtwkInfo, source.pNtwkInfo);
    // Copy construction takes every member, the generated text and default names included.
    EXPECT_EQ(copy.sSourceCode, L"source text");
    EXPECT_EQ(copy.sBoardDefaultMotorNames[0], L"sourceDefault");
  }
  EXPECT_EQ(source.pNtwkInfo->sNetworkName, L"net");
  EXPECT_EQ(target.compareConfiguration(source), configCompareSame);
}

}  // namespace
