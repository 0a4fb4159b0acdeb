// Comparing and copying configurations: equal settings compare equal however
// they were reached, the order in which differences are reported, and what
// each way of copying carries over.
#include <gtest/gtest.h>

#include <cstring>
#include <new>
#include <string>
#include <vector>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Networking.h"
#include "robotconfig/host/Platform.h"

namespace {

class ConfigurationCompare : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

// A motor slot assembled field by field in storage that held other bytes.
TMotorSlot *rebuildSlotInDirtyStorage(unsigned char *pStorage, const TMotorSlot &model) {
  std::memset(pStorage, 0xA5, sizeof(TMotorSlot));
  TMotorSlot *pSlot = new (pStorage) TMotorSlot;
  pSlot->nMotorType = model.nMotorType;
  pSlot->bEncoder = model.bEncoder;
  pSlot->bPIDControlled = model.bPIDControlled;
  pSlot->bReversed = model.bReversed;
  pSlot->nDriveSide = model.nDriveSide;
  pSlot->nEncoderPort = model.nEncoderPort;
  pSlot->nPrimaryIOPin = model.nPrimaryIOPin;
  pSlot->nSecondaryIOPin = model.nSecondaryIOPin;
  pSlot->pidSettings.copyPidSettings(&model.pidSettings);
  return pSlot;
}

TEST_F(ConfigurationCompare, EqualSettingsCompareEqualWhateverThePath) {
  selectHostPlatform(platformArduino, 12);
  CHostRobotConfiguration fresh;
  std::vector<CHostRobotConfiguration> records(5);

  // Changes undone, in one order...
  CHostRobotConfiguration &a = records[0];
  a.setMotorReversedInConfig(2, true);
  a.setSensorTypeInConfig(40, 1);
  a.setUARTType(1, 4);
  a.setUartIOPinsInConfig(1);
  a.sSensorNames[40] = L"bumper";
  a.setUartIOPinsInConfigNone(1);
  a.clearUartAndI2CDefinition();
  a.removeSensorTypeInConfig(40);
  a.setMotorReversedInConfig(2, false);
  a.sSensorNames[40].Empty();

  // ...and in another.
  CHostRobotConfiguration &b = records[1];
  b.sSensorNames[40] = L"other";
  b.setUARTType(1, 5);
  b.setUartIOPinsInConfig(1);
  b.setMotorReversedInConfig(2, true);
  b.setSensorTypeInConfig(40, 4);
  b.setMotorReversedInConfig(2, false);
  b.setSensorTypeInConfig(41, 1);
  b.removeSensorTypeInConfig(41);
  b.removeSensorTypeInConfig(40);
  b.setSensorTypeInConfig(35, 0);  // releases UART 1 through its pin
  b.clearUartAndI2CDefinition();
  b.sSensorNames[40].Empty();

  // A motor slot rebuilt in storage full of other bytes and copied in.
  CHostRobotConfiguration &c = records[2];
  alignas(TMotorSlot) unsigned char storage[sizeof(TMotorSlot)];
  c.settings.motors[3] = *rebuildSlotInDirtyStorage(storage, fresh.settings.motors[3]);

  // Cleared after other changes, assigned, and copy-constructed.
  CHostRobotConfiguration &d = records[3];
  d.settings.nDriveTrainType = 4;
  d.setMotorTypeInConfig(0, 3);
  d.sMotorNames[0] = L"left";
  d.clearConfigurationDefinition();
  CHostRobotConfiguration &e = records[4];
  e.setMotorTypeInConfig(5, 3);
  e = b;
  const CHostRobotConfiguration copy(a);

  for (size_t i = 0; i < records.size(); ++i) {
    SCOPED_TRACE(i);
    EXPECT_EQ(records[i].compareConfiguration(fresh), configCompareSame);
    EXPECT_EQ(fresh.compareConfiguration(records[i]), configCompareSame);
    EXPECT_EQ(records[i].compareConfiguration(copy), configCompareSame);
    EXPECT_EQ(records[i] == records[(i + 1) % records.size()], 1);
  }
}

TEST_F(ConfigurationCompare, FirstDifferenceInOrderDecides) {
  selectHostPlatform(platformVexPic);
  CHostRobotConfiguration a;
  CHostRobotConfiguration b;

  // Settings come before the host's data, the network and every name.
  b.settings.nServoPositions[3][1] = 9;
  b.nHostData = 7;
  b.sServoPositionNames[3] = L"up";
  EXPECT_EQ(a.compareConfiguration(b), configCompareSettingsDiffer);
  b.settings.nServoPositions[3][1] = 0;
  EXPECT_EQ(a.compareConfiguration(b), configCompareSettingsDiffer);
  b.nHostData = 0;
  b.pNtwkInfo->setNetworkName(L"team");
  EXPECT_EQ(a.compareConfiguration(b), configCompareSettingsDiffer);
  b.pNtwkInfo->initializeEmpty();

  // Names come before model names; servo-position names are names too.
  b.sStandardModelName = L"Squarebot";
  EXPECT_EQ(a.compareConfiguration(b), configCompareNamesDiffer);
  b.sServoPositionNames[3].Empty();
  EXPECT_EQ(a.compareConfiguration(b), configCompareModelNamesDiffer);
  b.sStandardModelName.Empty();

  // A VEX motor's default name is "portN", so an empty name never stands for it.
  b.sMotorNames[1] = L"port2";
  EXPECT_EQ(a.compareConfiguration(b), configCompareNamesDiffer);
  EXPECT_EQ(b.compareConfiguration(a), configCompareNamesDiffer);
  b.sMotorNames[1].Empty();

  // Default names, name lines, read-time information, the generated text and the warning flags do not count.
  b.sBoardDefaultMotorNames[0] = L"drive";
  b.sDefaultSensorNames[0] = L"in";
  b.sensorNameLines[0] = TLineNumber(9, 0);
  b.motorNameLines[0] = TLineNumber(9, 0);
  b.servoNameLines[0] = TLineNumber(9, 0);
  b.parseInfo.bFirstConfigLineSeen = true;
  b.parseInfo.nCompileCodeSizeResults = {1, 2, 3};
  b.sSourceCode = L"#pragma config(Motor, port1)";
  b.bDigitalPortWarningShown = true;
  b.bQuadPortErrorShown = true;
  b.bHubDefaultNamesConfigured = true;
  EXPECT_EQ(a.compareConfiguration(b), configCompareSame);
  EXPECT_EQ(a != b, 0);
}

// A host class whose comparison always finds model names to differ.
class CModelNamesAlwaysDiffer : public CHostRobotConfiguration {
 public:
  TConfigCompareResults compareConfiguration(const CRobotConfigurationBasic &) const override {
    return configCompareModelNamesDiffer;
  }
};

TEST_F(ConfigurationCompare, OperatorsGoThroughTheVirtualTable) {
  selectHostPlatform(platformNxt);
  const CModelNamesAlwaysDiffer odd;
  const CHostRobotConfiguration plain;
  const CRobotConfigurationBasic &base = odd;
  EXPECT_EQ(base == plain, 0);
  EXPECT_EQ(base != plain, 1);

  // Assignment through the base class runs the host's copy, which carries its data-log series.
  CHostRobotConfiguration source;
  CString sError;
  TTokenizedConfigParms parms;
  ASSERT_EQ(CRobotConfigurationBasic::nTokenizeLine(L"#pragma config(DatalogSeries, 0, speed)", parms),
            lineTypeConfigPragma);
  ASSERT_TRUE(source.bParseConfigDefinitionLine(parms, false, TLineNumber(1, 0), L"p.c", sError));
  CHostRobotConfiguration target;
  CRobotConfigurationBasic &targetBase = target;
  const CRobotConfigurationBasic &result = (targetBase = source);
  EXPECT_EQ(&result, &targetBase);
  EXPECT_EQ(target.getDatalogSeries(), source.getDatalogSeries());
  EXPECT_EQ(target == source, 1);
}

TEST_F(ConfigurationCompare, WhatCopyingCarriesOver) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration source;
  source.sServoNames[7] = L"gate";
  source.servoNameLines[7] = TLineNumber(5, 0);
  source.sensorNameLines[2] = TLineNumber(6, 0);
  source.sServoPositionNames[0] = L"open";
  source.sStandardModelName = L"Tribot";
  source.parseInfo.bFirstConfigLineSeen = true;
  source.parseInfo.firstConfigLine = TLineNumber(3, 0);
  source.parseInfo.nCompileCodeSizeResults = {10, 20, 30};
  source.bDigitalPortWarningShown = true;
  source.bQuadPortErrorShown = true;
  source.bHubDefaultNamesConfigured = true;
  source.sDefaultSensorNames[1] = L"light";
  source.pNtwkInfo->setNetworkName(L"net");

  // copyFrom: settings, read-time information, user names with their lines, model names.
  CHostRobotConfiguration target;
  target.copyFrom(source);
  EXPECT_EQ(target.compareConfiguration(source), configCompareSame);
  EXPECT_EQ(target.sServoNames[7], L"gate");
  EXPECT_EQ(target.servoNameLines[7], TLineNumber(5, 0));
  EXPECT_EQ(target.sensorNameLines[2], TLineNumber(6, 0));
  EXPECT_EQ(target.getParseInfo().firstConfigLine, TLineNumber(3, 0));
  EXPECT_EQ(target.getParseInfo().nCompileCodeSizeResults, (std::array<int32_t, 3>{10, 20, 30}));
  EXPECT_EQ(target.getStandardModelName(), L"Tribot");
  // ...but not the default names, the generated text or the flags.
  EXPECT_TRUE(target.sDefaultSensorNames[1].IsEmpty());
  EXPECT_FALSE(target.bDigitalPortWarningShown);
  EXPECT_FALSE(target.bQuadPortErrorShown);
  EXPECT_FALSE(target.bHubDefaultNamesConfigured);

  // Copying a record onto itself keeps it as it was.
  target.copyFrom(target);
  const CHostRobotConfiguration &sameRecord = target;
  target = sameRecord;
  EXPECT_EQ(target.compareConfiguration(source), configCompareSame);
  EXPECT_EQ(target.sServoNames[7], L"gate");

  // The copy constructor takes every member, flags and default names included.
  const CHostRobotConfiguration copy(source);
  EXPECT_TRUE(copy.bDigitalPortWarningShown);
  EXPECT_TRUE(copy.bQuadPortErrorShown);
  EXPECT_TRUE(copy.bHubDefaultNamesConfigured);
  EXPECT_EQ(copy.sDefaultSensorNames[1], L"light");
  EXPECT_EQ(copy.getParseInfo().firstConfigLine, TLineNumber(3, 0));
  EXPECT_EQ(std::memcmp(&copy.getSettings(), &source.getSettings(), sizeof(TConfigurationSettings)), 0);
  EXPECT_NE(copy.pNtwkInfo, source.pNtwkInfo);  // each record owns its network
  EXPECT_NE(target.pNtwkInfo, source.pNtwkInfo);
  EXPECT_EQ(target.pNtwkInfo->sNetworkName, L"net");
}

}  // namespace
