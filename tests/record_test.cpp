// The configuration record: reset values, board defaults, comparison and copying.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"
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

TEST_F(ConfigurationRecord, ResetValuesOnEveryPlatformKind) {
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    SCOPED_TRACE(nKind);
    selectHostPlatform(nKind);
    CHostRobotConfiguration rec;
    const TConfigurationSettings &s = rec.getSettings();
    const TControllerBoardType nBoard = pToggles->getIDECircuitBoardType();
    EXPECT_EQ(s.nCircuitBoardType, nBoard);
    EXPECT_EQ(s.nCpuClockSpeed, getCircuitBoardInfo(nBoard)->nDefaultCpuClockSpeed);
    EXPECT_EQ(s.nProgramType, 255);
    EXPECT_EQ(s.nUnnamedAfterI2CMode, 1);
    EXPECT_EQ(s.nMemorySizes, (std::array<int32_t, 3>{-1, -1, -1}));
    EXPECT_EQ(rec.getParseInfo().nCompileCodeSizeResults, (std::array<int32_t, 3>{-1, -1, -1}));
    EXPECT_EQ(s.nSecondaryPorts[size_t(kMaxNumbOfSensorPorts - 1)], -1);
    EXPECT_EQ(s.nDriveTrainMotorIndex, (std::array<uint8_t, 4>{255, 255, 255, 255}));
    EXPECT_EQ(s.nDriveTrainWheels, (std::array<uint16_t, 5>{0, 1, 1, 0, 0}));
    EXPECT_EQ(s.nGripperArmMotorIndex, (std::array<int32_t, 4>{-1, -1, -1, -1}));
    EXPECT_EQ(s.nServoSettings[size_t(kMaxNumbOfServos - 1)], 0x00FF0000);
    // Only the brick platforms start with motors on their built-in ports.
    const int nBuiltIn = nKind == platformNxt ? 3 : nKind == platformBrick4Motor ? 4 : 0;
    for (int n = 0; n < kMaxNumbOfMotors; ++n) {
      const TMotorSlot &motor = s.motors[size_t(n)];
      EXPECT_EQ(motor.nMotorType, n < nBuiltIn ? (nKind == platformNxt ? 17 : 18) : 0) << n;
      EXPECT_EQ(motor.bEncoder && motor.bPIDControlled, n < nBuiltIn) << n;
      EXPECT_EQ(motor.nEncoderPort + motor.nPrimaryIOPin + motor.nSecondaryIOPin, -3) << n;
      // Default names are exactly those of the board's pin-table rows.
      const bool bRow = s.pMotorIOPinTable && n < s.nNumbOfEntriesInMotorIOPinTable &&
                        s.pMotorIOPinTable[n].pzDefaultMotorName;
      EXPECT_EQ(rec.sBoardDefaultMotorNames[size_t(n)].str(),
                bRow ? std::wstring(s.pMotorIOPinTable[n].pzDefaultMotorName) : std::wstring());
    }
  }
}

TEST_F(ConfigurationRecord, ClearTakesBackEverything) {
  for (const int nKind : {1, 3, 4, 8}) {
    SCOPED_TRACE(nKind);
    selectHostPlatform(nKind, nKind == 4 ? 12 : -1, nKind != 3);
    CHostRobotConfiguration fresh;
    CHostRobotConfiguration rec;
    rec.settings.nSensorPortHubs[0][0] = hubHTMotor;
    rec.settings.nDriveTrainType = 3;
    rec.settings.nGripperArmMotorIndex = {4, 5, 6, 7};
    rec.settings.nMemorySizes = {100, 200, 300};
    rec.settings.nUARTMode[1] = 4;
    rec.setMotorTypeInConfig(2, 29);
    rec.setMotorIOPinsInConfig(4, 9, 10, true);
    rec.setSensorTypeInConfig(11, 5);
    rec.sServoPositionNames[0] = L"open";
    rec.sModelNameUserFile = L"model.txt";
    rec.parseInfo.bFirstConfigLineSeen = true;
    rec.parseInfo.firstConfigLine = TLineNumber(12, 0);
    rec.clearConfigurationDefinition();
    EXPECT_TRUE(bSameSettings(rec, fresh));
    EXPECT_EQ(rec.compareConfiguration(fresh), configCompareSame);
    EXPECT_FALSE(rec.getParseInfo().bFirstConfigLineSeen);
    EXPECT_EQ(rec.getParseInfo().firstConfigLine, firstLineNumber);
  }
  // A record cleared under another board is the fresh record of the new one.
  selectHostPlatform(4, 12);
  CHostRobotConfiguration rec;
  EXPECT_EQ(rec.sBoardDefaultMotorNames[11], L"motor_10");
  selectHostPlatform(4, 28);
  rec.clearConfigurationDefinition();
  CHostRobotConfiguration fresh;
  EXPECT_TRUE(bSameSettings(rec, fresh));
  std::vector<std::wstring> expected = {L"motor_5",  L"motor_3", L"servo_9", L"servo_10",
                                        L"servo_A", L"servo_B", L"servo_C", L"servo_C"};
  expected.resize(kMaxNumbOfMotors);
  EXPECT_EQ(boardDefaultMotorNames(rec), expected);
}

TEST_F(ConfigurationRecord, FixedPinsAndUartDefaultsAfterClear) {
  for (const auto &[nBoard, nUart1, nUart2, nFixed] : {std::array<int, 4>{12, 16, 17, 29}, {8, 6, 7, 19}}) {
    selectHostPlatform(4, nBoard);
    CHostRobotConfiguration rec;
    for (int port = 0; port < kMaxNumbOfSensorPorts; ++port)
      EXPECT_EQ(rec.getSensorTypeInConfig(port), (port == nUart1 || port == nUart2) ? 60 : port == nFixed ? 65 : 0)
          << nBoard << ":" << port;
  }
  struct TUartDefaults {
    int nKind;
    std::array<TSerialPortMode, 6> nModes;
    std::array<TBaudRate, 6> nBaudRates;
  };
  const TUartDefaults kExpected[] = {
      {platformVexI2c, {1, 0, 3, 0, 0, 0}, {12, 2, 5, 2, 2, 2}},
      {platformVexPic, {1, 3, 0, 0, 0, 0}, {12, 5, 2, 2, 2, 2}},
      {platformKind9, {1, 0, 0, 0, 0, 0}, {12, 2, 2, 2, 2, 2}},
      {platformNxt, {0, 0, 0, 0, 0, 0}, {2, 2, 2, 2, 2, 2}},
  };
  for (const TUartDefaults &e : kExpected) {
    selectHostPlatform(e.nKind);
    CHostRobotConfiguration rec;
    rec.settings.nUARTMode = {4, 4, 4, 4, 4, 4};
    rec.settings.nI2CMode[0] = 2;
    rec.clearConfigurationDefinition();
    for (int port = 0; port < kMaxNumbOfSerialPorts; ++port) {
      EXPECT_EQ(rec.getUARTType(port), e.nModes[size_t(port)]) << e.nKind << " UART " << port;
      EXPECT_EQ(rec.getBaudRate(port), e.nBaudRates[size_t(port)]) << e.nKind << " UART " << port;
    }
    EXPECT_EQ(rec.getSettings().nI2CMode[0], 0);
  }
}

TEST_F(ConfigurationRecord, DriveTrainAndGripperMotorCounts) {
  const int kDriveTrainMotors[] = {0, 0, 2, 2, 4, 4, 4, 3, 4, 0, 0};  // from type -1
  for (int nType = -1; nType < 10; ++nType)
    EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForDriveTrain(nType), kDriveTrainMotors[nType + 1]) << nType;
  const int kGripperMotors[] = {0, 0, 4, 4, 0, 0};
  for (int nType = -1; nType < 5; ++nType)
    EXPECT_EQ(CRobotConfigurationBasic::getNumbOfMotorsForGripperArm(nType), kGripperMotors[nType + 1]) << nType;
  CHostRobotConfiguration rec;
  rec.settings.nDriveTrainType = 6;
  rec.settings.nGripperArmType = 2;
  EXPECT_EQ(rec.getNumbOfMotorsForDriveTrain(), 3);
  EXPECT_EQ(rec.getNumbOfMotorsForGripperArm(), 4);
}

}  // namespace
