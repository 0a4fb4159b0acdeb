// Motor types per platform, motor ports and hubs, IO pins and default motor names.
#include <gtest/gtest.h>

#include <cstring>
#include <set>
#include <string>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorTypes.h"
#include "tests/config_lines.h"

namespace {

class MotorRules : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

std::set<int> typesWithRows() {
  std::set<int> types;
  for (int nType = 0; nType < kNumbOfMotorTypes; ++nType)
    if (getMotorCharacteristics(nType)) types.insert(nType);
  return types;
}

std::wstring defaultName(const CRobotConfigurationBasic &rec, int nMotor, bool bHubStyle) {
  CString sName(L"stale");
  rec.getDefaultMotorNameLowLevel(nMotor, sName, bHubStyle);
  return sName.str();
}

TEST_F(MotorRules, CharacteristicsDependOnPlatformAndToggle) {
  struct TCase {
    int nKind;
    bool bToggle;
    std::set<int> types;
  } kCases[] = {
      {platformArduino, false, {0, 1, 2, 3, 5, 16, 22, 23, 24, 25, 29}},
      {platformKind9, false, {0, 2, 3, 4, 5, 26, 29}},
      {platformNxt, false, {0, 17, 20, 21, 26, 27, 28, 29}},
      {platformNxt, true, {0, 2, 3, 17, 20, 21, 26, 27, 28, 29, 30, 31}},  // the toggle guards rows
  };
  for (const TCase &c : kCases) {
    selectHostPlatform(c.nKind, -1, c.bToggle);
    EXPECT_EQ(typesWithRows(), c.types) << c.nKind << " " << c.bToggle;
  }
  EXPECT_EQ(getRawMotorCharacteristics(26), getMotorCharacteristics(26));
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    selectHostPlatform(nKind);
    EXPECT_EQ(getMotorCharacteristics(2) != nullptr, ((1u << nKind) & 0x29Cu) != 0) << nKind;
    EXPECT_EQ(getMotorCharacteristics(-1), nullptr);
    EXPECT_EQ(getMotorCharacteristics(32), nullptr);
    for (int nType = 0; nType < kNumbOfMotorTypes; ++nType) EXPECT_EQ(getMotorConversion(nType)->nSourceType, nType);
  }
}

TEST_F(MotorRules, TypesReadFromLinesResolvePerPlatform) {
  struct TCase {
    int nKind;
    TMotorTypes nType, nResolved;
  };
  const TCase kCases[] = {
      {platformNxt, 18, 17},   {platformNxt, 19, 17},       {platformNxt, 4, 0},
      {platformBrick4Motor, 19, 19}, {platformBrick4Motor, 17, 17}, {platformVexPic, 6, 10},
      {platformVexI2c, 17, 3}, {platformSharedPorts, 17, 14}, {platformSharedPorts, 3, 3},
      {platformArduino, 4, 5}, {platformBoard12, 3, 0},      {platformNone, 17, 0},
      {platformKind5, 3, 0},   {platformVexPic, 26, 26},     {platformVexPic, 30, 0},
  };
  for (const TCase &c : kCases) {
    selectHostPlatform(c.nKind);
    EXPECT_EQ(resolveMotorTypeForPlatform(c.nType), c.nResolved) << "kind " << c.nKind << " type " << c.nType;
  }
}

TEST_F(MotorRules, DefaultTypes) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  EXPECT_EQ(rec.getDefaultMotorType(2), 17);
  EXPECT_EQ(rec.getDefaultMotorType(3), 0);
  rec.settings.nSensorPortHubs[0][0] = hubHTMotor;
  EXPECT_EQ(rec.getDefaultMotorType(3), 20);
  rec.settings.nSensorPortHubs[0][0] = hubMatrxRbtcs;
  EXPECT_EQ(rec.getDefaultMotorType(3), 21);

  // A slot of type 0 reports the default type only where the port exists on a brick.
  rec.settings.motors[0].nMotorType = 0;
  EXPECT_EQ(rec.getMotorTypeWithOptionalAdjustForMotorTypeNone(0), 17);
  EXPECT_EQ(rec.getMotorTypeWithOptionalAdjustForMotorTypeNone(20), 0);
  EXPECT_EQ(rec.getMotorTypeInConfig(0), 0);

  const std::pair<int, TMotorTypes> kDefaults[] = {{platformBrick4Motor, 18}, {platformSharedPorts, 14},
                                                   {platformKind9, 15},       {platformVexPic, 3},
                                                   {platformNone, 3},         {platformBoard14, 3}};
  for (const auto &[nKind, nType] : kDefaults) {
    selectHostPlatform(nKind);
    CHostRobotConfiguration other;
    EXPECT_EQ(other.getDefaultMotorType(3), nType) << nKind;
    EXPECT_EQ(other.getMotorTypeWithOptionalAdjustForMotorTypeNone(3), nKind == platformBrick4Motor ? 18 : 0);
  }
}

TEST_F(MotorRules, LegacyTypesAreNormalised) {
  selectHostPlatform(platformNxt, -1, true);
  CHostRobotConfiguration rec;
  struct TCase {
    TMotorTypes nType;
    bool bEncoder;
    TMotorTypes nNewType;
    bool bPID, bReversed, bNewEncoder;
  } kCases[] = {
      {28, false, 17, true, false, false}, {29, true, 17, false, true, true}, {26, true, 17, false, false, true},
      {31, true, 20, true, false, true},    {15, true, 0, false, false, true}, {-1, true, 0, false, false, true},
      {20, false, 20, true, true, false},  // modern types keep their flags
  };
  for (const TCase &c : kCases) {
    TMotorSlot &motor = rec.settings.motors[5];
    motor = TMotorSlot{};
    motor.nMotorType = c.nType;
    motor.bEncoder = c.bEncoder;
    motor.bPIDControlled = true;
    motor.bReversed = true;
    rec.normalizeLegacyMotorConfiguration(5);
    EXPECT_EQ(motor.nMotorType, c.nNewType) << c.nType;
    EXPECT_EQ(motor.bPIDControlled, c.bPID) << c.nType;
    EXPECT_EQ(motor.bReversed, c.bReversed) << c.nType;
    EXPECT_EQ(motor.bEncoder, c.bNewEncoder) << c.nType;
  }
}

TEST_F(MotorRules, SettingATypeResetsFlagsAndFreesDriveTrainSlots) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  rec.settings.nDriveTrainMotorIndex = {1, 2, 1, 255};
  rec.parseInfo.bMotorListIndexMappingBuilt = true;
  TMotorSlot &motor = rec.settings.motors[1];
  motor.bPIDControlled = false;
  motor.bReversed = true;
  motor.pidSettings.clearPidSettings();

  // The same type again: the mapping stays valid, the flags return to the type's defaults.
  rec.setMotorTypeInConfig(1, 17);
  EXPECT_TRUE(rec.getParseInfo().bMotorListIndexMappingBuilt);
  EXPECT_TRUE(motor.bPIDControlled);
  EXPECT_FALSE(motor.bReversed);
  EXPECT_TRUE(motor.pidSettings.bIdenticalPidSettings(*pToggles->getDefaultPidSettings(17)));

  rec.setMotorTypeInConfig(1, 29);
  EXPECT_FALSE(rec.getParseInfo().bMotorListIndexMappingBuilt);
  EXPECT_TRUE(motor.bReversed);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{1, 2, 1, 255}));
  rec.setMotorTypeInConfig(1, 0);
  EXPECT_EQ(rec.getSettings().nDriveTrainMotorIndex, (std::array<uint8_t, 4>{255, 2, 255, 255}));

  rec.setMotorEncoderInConfig(0, false);
  EXPECT_FALSE(rec.getMotorPIDControlledInConfig(0));

  // On shared ports a motor claims the sensor port of its index, once per change of type.
  selectHostPlatform(platformSharedPorts);
  rec.clearConfigurationDefinition();
  rec.setMotorTypeInConfig(2, 14);
  EXPECT_EQ(rec.getSensorTypeInConfig(2), 91);
  rec.settings.nSensorTypes[2] = 5;
  rec.setMotorTypeInConfig(2, 14);
  EXPECT_EQ(rec.getSensorTypeInConfig(2), 5);
  rec.settings.nSensorTypes[2] = 91;
  rec.setMotorTypeInConfig(2, 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(2), 0);
}

TEST_F(MotorRules, HubMotorAndServoNumbering) {
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  rec.settings.nSensorPortHubs[0] = {hubHTMotor, hubHTMotor, hubNone, hubHTMotor};
  for (int n = -1; n <= 9; ++n) EXPECT_EQ(rec.bIsValidMotorPort(n), n >= 0 && n <= 6) << n;  // the chain ends at none
  EXPECT_EQ(rec.getDeviceIndexOnMotorHub(hubHTMotor, 0, 1, 1), 6);
  EXPECT_EQ(rec.getDeviceIndexOnMotorHub(hubHTServo, 0, 1, 1), -1);
  EXPECT_EQ(rec.getMotorMuxForMotor(6), hubHTMotor);
  EXPECT_EQ(rec.getMotorMuxForMotor(7), hubNone);
  EXPECT_EQ(rec.getMotorMuxForMotor(2), hubNone);  // a built-in port
  // A chain that starts empty holds no motors, though the port holds a controller.
  rec.settings.nSensorPortHubs[0] = {hubNone, hubHTMotor, hubNone, hubNone};
  EXPECT_FALSE(rec.bIsValidMotorPort(3));
  EXPECT_TRUE(rec.bSensorPortContainsHiTechnicMux(0));
  EXPECT_FALSE(rec.bSensorPortContainsHiTechnicMux(1));

  selectHostPlatform(platformBrick4Motor);
  rec.clearConfigurationDefinition();
  rec.settings.nSensorPortHubs[1][0] = hubMatrxRbtcs;
  for (int n = 11; n <= 16; ++n) EXPECT_EQ(rec.bIsValidMotorPort(n), n >= 12 && n <= 15) << n;
  EXPECT_EQ(rec.getDefaultMotorType(13), 21);

  selectHostPlatform(platformNxt, -1, true);
  rec.clearConfigurationDefinition();
  rec.settings.nSensorPortHubs[2] = {hubHTServo, hubHTServo, hubNone, hubNone};
  for (int n = 47; n <= 60; ++n) EXPECT_EQ(rec.bIsValidServoPort(n), n >= 48 && n <= 59) << n;
  setHostExternalControllers(false);
  EXPECT_FALSE(rec.bIsValidServoPort(48));
  EXPECT_EQ(std::wstring(getMuxTypes(3)), L"MatrxRbtcs");
}

TEST_F(MotorRules, MotorIOPinsClaimSensorPorts) {
  selectHostPlatform(platformArduino);
  CHostRobotConfiguration rec;
  rec.setMotorIOPinsInConfig(2, 5, 4, false);
  EXPECT_EQ(rec.getSensorTypeInConfig(5), 57);
  EXPECT_EQ(rec.getSensorTypeInConfig(4), 58);
  EXPECT_EQ(rec.getMapMotorToPrimaryIOPin(2), 5);
  EXPECT_EQ(rec.getMapMotorToSecondaryIOPin(2), 4);
  rec.setSensorModeInConfig(5, 1);
  const TConfigurationSettings before = rec.getSettings();
  rec.setMotorIOPinsInConfig(2, 5, 4, false);
  EXPECT_EQ(std::memcmp(&before, &rec.getSettings(), sizeof before), 0);
  // Moving one pin frees only that pin.
  rec.setMotorIOPinsInConfig(2, 8, 4, false);
  EXPECT_EQ(rec.getSensorTypeInConfig(5), 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(8), 57);
  EXPECT_EQ(rec.getSensorTypeInConfig(4), 58);
  rec.setMotorIOPinsInConfigNone(2);
  EXPECT_EQ(rec.getSensorTypeInConfig(8) + rec.getSensorTypeInConfig(4), 0);
  EXPECT_EQ(rec.getMapMotorToPrimaryIOPin(2) + rec.getMapMotorToSecondaryIOPin(2), -2);
}

TEST_F(MotorRules, DefaultMotorNames) {
  struct TCase {
    int nKind, nMotor;
    bool bHubStyle;
    const wchar_t *pzName;
  } kCases[] = {{platformVexPic, 0, false, L"port1"},
                {platformSharedPorts, 9, false, L"motor10"},
                {platformArduino, 0, true, L""},
                {platformBrick4Motor, 3, false, L"motorD"},
                {platformBrick4Motor, 4, true, L""}};
  for (const TCase &c : kCases) {
    selectHostPlatform(c.nKind);
    CHostRobotConfiguration rec;
    EXPECT_EQ(defaultName(rec, c.nMotor, c.bHubStyle), c.pzName) << c.nKind << ":" << c.nMotor;
  }
  // Lettered names run on without gaps over the hub motors that exist.
  selectHostPlatform(platformNxt);
  CHostRobotConfiguration rec;
  rec.settings.nSensorPortHubs[0] = {hubHTMotor, hubHTMotor, hubNone, hubNone};
  rec.settings.nSensorPortHubs[1][0] = hubMatrxRbtcs;
  const std::pair<int, const wchar_t *> kLettered[] = {{3, L"motorD"},  {6, L"motorG"},  {7, L""},
                                                       {11, L"motorH"}, {14, L"motorK"}, {15, L""}};
  for (const auto &[nMotor, pzName] : kLettered) EXPECT_EQ(defaultName(rec, nMotor, false), pzName) << nMotor;
  EXPECT_EQ(defaultName(rec, 5, true), L"mtr_S1_C2_1");
  EXPECT_EQ(defaultName(rec, 13, true), L"mtr_Matrix_S2_3");
  EXPECT_EQ(rec.getIndexForDefaultMotorName(L"motorB"), 1);
  EXPECT_EQ(rec.getIndexForDefaultMotorName(L""), -1);
  rec.setEmptyMotorNameToDefaultName(4);
  EXPECT_EQ(rec.sMotorNames[4], L"motorE");
  EXPECT_EQ(rec.motorNameLines[4], emptyLineNumber);

  // On a board the pin table names the ports; the first of two equal names wins.
  selectHostPlatform(platformArduino, 28);
  rec.clearConfigurationDefinition();
  CString sPort;
  rec.getDefaultMotorNameForPlatformOrControllerBoard(0, sPort);
  EXPECT_EQ(sPort, L"motor_5");
  EXPECT_EQ(rec.getIndexForDefaultMotorName(L"servo_C"), 6);

  // An audio motor never takes a default name.
  selectHostPlatform(platformVexPic);
  rec.clearConfigurationDefinition();
  rec.settings.motors[0].nMotorType = 1;
  rec.settings.motors[1].nMotorType = 3;
  rec.setEmptyMotorNameToDefaultName(0);
  rec.setEmptyMotorNameToDefaultName(1);
  EXPECT_TRUE(rec.sMotorNames[0].IsEmpty());
  EXPECT_EQ(rec.sMotorNames[1], L"port2");
}

}  // namespace

namespace {

// Each motor type of a platform as the record takes it: "type:" then P (PID
// control), R (reversed), W (a Motor line is written for a bare motor).
std::string typeDefaults(int nKind, bool bToggle) {
  selectHostPlatform(nKind, -1, bToggle);
  std::string sOut;
  for (int nType = 1; nType < kNumbOfMotorTypes; ++nType) {
    if (!getMotorCharacteristics(nType)) continue;
    CHostRobotConfiguration rec;
    rec.setMotorTypeInConfig(1, nType);
    const TMotorSlot &motor = rec.getSettings().motors[1];
    sOut += std::to_string(nType) + ":" + (motor.bPIDControlled ? "P" : "") + (motor.bReversed ? "R" : "") +
            (test_support::generatedLines(rec, L"#pragma config(Motor,").empty() ? "" : "W") + " ";
  }
  return sOut;
}

}  // namespace

TEST_F(MotorRules, TypeDefaultsPerPlatform) {
  EXPECT_EQ(typeDefaults(platformVexPic, false), "2:W 3:W 4:RW 5:RW 10:W 11:W 12:W 13:W 26:W 29:RW ");
  EXPECT_EQ(typeDefaults(platformVexI2c, false), "2:W 3:W 4:RW 5:RW 6:W 7:W 8:W 9:W 10:W 11:W 12:W 13:W 26:W 29:RW ");
  EXPECT_EQ(typeDefaults(platformNxt, true), "2:W 3:W 17:P 20:W 21:W 26:W 27:W 28:P 29:RW 30:W 31:PW ");
  EXPECT_EQ(typeDefaults(platformKind9, false), "2:W 3:W 4:RW 5:RW 26: 29:RW ");
  EXPECT_EQ(typeDefaults(platformSharedPorts, false), "2:W 3:W 4:RW 5:RW 14:PW 26:W 29:RW ");
}
