// Reference host catalog: platforms, boards, toggles and the device-name tables.
#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

#include "robotconfig/host/CatalogRows.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

using robotconfig_catalog::aliasRow;
using robotconfig_catalog::kEndOfTable;
using robotconfig_catalog::menuRow;
using robotconfig_catalog::platformBit;

namespace {

/// A catalog string as a comparable value; null shows as "<null>".
std::wstring str(const wchar_t *pz) { return pz ? std::wstring(pz) : std::wstring(L"<null>"); }

/// The motor port name of an index on the current platform.
std::wstring motorPort(int nMotor) {
  CString s(L"stale");
  getMotorPortStringForNonArduinoPlatforms(nMotor, s);
  return s.str();
}

/// The servo port name of an index.
std::wstring servoPort(int nServo) {
  CString s(L"stale");
  getServoPortString(nServo, s);
  return s.str();
}

class HostCatalog : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

struct TExpectedPlatform {
  int nKind;
  const wchar_t *pzName;
  const wchar_t *pzKeyword;
  int nMotors, nSensors, nServos;
  bool bBoardSel, bAudio, bDrive, bJoystick, bIOPins, bEncoder;
  TControllerBoardType nBoard;
};

constexpr TExpectedPlatform kExpectedPlatforms[] = {
    {0, L"None", L"none", 0, 0, 0, false, false, false, false, false, false, 0},
    {1, L"NXT", L"nxt", 35, 4, 96, false, false, true, true, false, false, 1},
    {2, L"VEX PIC", L"vexpic", 8, 16, 0, false, false, true, true, false, false, 2},
    {3, L"VEX I2C", L"vexi2c", 10, 28, 0, false, false, true, true, false, true, 5},
    {4, L"Arduino", L"arduino", 12, 70, 0, true, true, true, true, true, false, 8},
    {5, L"Sensor Lab", L"sensorlab", 0, 8, 0, false, false, false, false, false, false, 7},
    {6, L"Data Logger", L"datalogger", 0, 4, 0, false, false, false, false, false, false, 7},
    {7, L"Shared Ports", L"sharedports", 12, 12, 0, false, false, true, true, false, false, 6},
    {8, L"Brick 4 Motor", L"brick4", 36, 4, 96, false, false, true, true, false, false, 1},
    {9, L"Classroom Controller", L"classroom", 8, 16, 0, false, false, true, true, false, false, 7},
    {10, L"Maker Board 10", L"maker10", 8, 24, 0, true, false, true, true, true, false, 3},
    {11, L"Maker Board 11", L"maker11", 8, 24, 0, true, false, true, true, true, false, 4},
    {12, L"Maker Board 12", L"maker12", 8, 24, 0, true, false, true, true, true, false, 25},
    {13, L"Maker Board 13", L"maker13", 8, 24, 0, true, false, true, true, true, false, 26},
    {14, L"Maker Board 14", L"maker14", 8, 24, 0, true, false, true, true, true, false, 29},
};

TEST_F(HostCatalog, PlatformRecordsPerKind) {
  for (const TExpectedPlatform &e : kExpectedPlatforms) {
    SCOPED_TRACE(e.nKind);
    selectHostPlatform(e.nKind);
    ASSERT_EQ(pToggles->getPlatformKind(), e.nKind);
    EXPECT_EQ(pToggles->getPlatformMask(), 1u << e.nKind);
    EXPECT_EQ(pToggles->getIDECircuitBoardType(), e.nBoard);
    ASSERT_NE(getCircuitBoardInfo(e.nBoard), nullptr);
    const CPlatformType &p = *pPlatformData;
    EXPECT_EQ(p.nPlatformKind, e.nKind);
    EXPECT_EQ(str(p.pKeyword), e.pzKeyword);
    EXPECT_EQ(str(p.pPlatformParms->pPlatformName), e.pzName);
    EXPECT_EQ(p.pMotorParms->nNumbOfMotorPorts, e.nMotors);
    EXPECT_EQ(p.pPlatformParms->nNumbOfSensorPorts, e.nSensors);
    EXPECT_EQ(p.pPlatformParms->nNumbOfServoPorts, e.nServos);
    EXPECT_EQ(p.pPlatformParms->bSupportsBoardTypeSelection, e.bBoardSel);
    EXPECT_EQ(p.pPlatformParms->bFirstMotorCanBeAudio, e.bAudio);
    EXPECT_EQ(p.pPlatformParms->bSupportsDriveTrainConfig, e.bDrive);
    EXPECT_EQ(p.pPlatformParms->bSupportsJoystickDriveConfig, e.bJoystick);
    EXPECT_EQ(p.pPlatformParms->bMotorsHaveIOPins, e.bIOPins);
    EXPECT_EQ(p.bPlatformAssociatesEncoderSensorWithMotor(), e.bEncoder);
    EXPECT_EQ(p.nDefaultBoard, e.nBoard);
    if (e.nKind != platformNone) {
      EXPECT_GE(p.getNumbOfTasksPerProgramOnBrick(), 1);
      EXPECT_GT(p.getDefaultSingleTaskStackSize(), 0);
      EXPECT_GT(p.getMaxSingleFunctionStackMemoryInBytes(), 0);
    }
    ASSERT_NE(getPlatformTypeForKind(e.nKind), nullptr);
    EXPECT_EQ(getPlatformTypeForKind(e.nKind)->pPlatformParms, p.pPlatformParms);
  }
  EXPECT_EQ(getPlatformTypeForKind(-1), nullptr);
  EXPECT_EQ(getPlatformTypeForKind(kNumbOfPlatformKinds), nullptr);
}

TEST_F(HostCatalog, SelectionAndToggles) {
  selectHostPlatform(platformVexI2c, 12, true);
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 12);
  EXPECT_NE(pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel), 0);
  EXPECT_EQ(pToggles->bIsToggleEnabled(2, kToggleQueryLevel), 0);

  setHostToggle(7, true);
  setHostExternalControllers(false);
  EXPECT_EQ(pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel), 0);
  EXPECT_NE(pToggles->bIsToggleEnabled(7, kToggleQueryLevel), 0);
  setHostToggle(40, true);  // no such toggle: ignored
  EXPECT_EQ(pToggles->bIsToggleEnabled(40, kToggleQueryLevel), 0);
  EXPECT_EQ(pToggles->bIsToggleEnabled(-1, kToggleQueryLevel), 0);

  // Out-of-range kinds fall back to no platform.
  selectHostPlatform(99);
  EXPECT_EQ(pToggles->getPlatformKind(), platformNone);
  EXPECT_EQ(pPlatformData->nPlatformKind, platformNone);
  selectHostPlatform(-3);
  EXPECT_EQ(pToggles->getPlatformMask(), 1u);

  // The IDE adopts kind, board and options; pPlatformData follows.
  pToggles->bNeverShowVexPortWarnings = true;
  pToggles->setIDEPlatformAndCircuitBoardType(platformArduino, 13, 0x1234567890ull);
  EXPECT_EQ(pToggles->getPlatformKind(), platformArduino);
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 13);
  EXPECT_EQ(pToggles->getPlatformSelectionOptions(), 0x1234567890ull);
  EXPECT_EQ(str(pPlatformData->pPlatformParms->pPlatformName), L"Arduino");

  // Selecting again keeps other toggles, options and the warning switch.
  selectHostPlatform(platformNxt);
  EXPECT_NE(pToggles->bIsToggleEnabled(7, kToggleQueryLevel), 0);
  EXPECT_EQ(pToggles->getPlatformSelectionOptions(), 0x1234567890ull);
  EXPECT_TRUE(pToggles->bNeverShowVexPortWarnings);

  CString sPath;
  EXPECT_EQ(pToggles->bGetFileNameFromUser(fileTypeRobotModel, sPath, 0xF001, 0x00800804, 0), 0);
  sPath = L"robot.model";
  EXPECT_EQ(pToggles->bGetFileNameFromUser(fileTypeRobotModel, sPath, 0xF001, 0x00800804, 0), 1);
  EXPECT_EQ(sPath, L"robot.model");
}

class CFakeToggles : public CToggles {
 public:
  uint64_t getPlatformSelectionOptions() const override { return 0; }
  int bIsToggleEnabled(int, int) const override { return 1; }
  const TPidSettings *getDefaultPidSettings(TMotorTypes) const override { return &emptyPidSettings; }
  void copyDefaultPidSettings(TMotorTypes, TPidSettings &settings) const override { settings.clearPidSettings(); }
  TControllerBoardType getIDECircuitBoardType() const override { return 0; }
  int getPlatformKind() const override { return platformKind6; }
  unsigned getPlatformMask() const override { return 1u << platformKind6; }
  void setIDEPlatformAndCircuitBoardType(int, TControllerBoardType, uint64_t) override {}
  int bGetFileNameFromUser(TTavrenFileTypes, CString &, unsigned, unsigned, int) override { return 0; }
};

TEST(HostSelectionScope, RestoresEverythingItChanged) {
  selectHostPlatform(platformVexPic, -1, true);
  setHostToggle(3, true);
  pToggles->bNeverShowVexPortWarnings = false;
  CToggles *const pReference = pToggles;
  CPlatformType *const pSelected = pPlatformData;
  CFakeToggles fake;
  {
    CHostSelectionScope outer;
    selectHostPlatform(platformBoard12, 30, false);
    setHostToggle(3, false);
    pToggles->bNeverShowVexPortWarnings = true;
    {
      CHostSelectionScope inner;
      selectHostPlatform(platformNxt);
      pToggles = &fake;
      CPlatformType other = *getPlatformTypeForKind(platformKind5);
      pPlatformData = &other;
    }
    EXPECT_EQ(pToggles, pReference);
    EXPECT_EQ(pToggles->getPlatformKind(), platformBoard12);
    EXPECT_EQ(pToggles->getIDECircuitBoardType(), 30);
    EXPECT_EQ(pPlatformData->nPlatformKind, platformBoard12);
  }
  EXPECT_EQ(pToggles, pReference);
  EXPECT_EQ(pPlatformData, pSelected);
  EXPECT_EQ(pToggles->getPlatformKind(), platformVexPic);
  EXPECT_EQ(pPlatformData->nPlatformKind, platformVexPic);
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 2);
  EXPECT_NE(pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel), 0);
  EXPECT_NE(pToggles->bIsToggleEnabled(3, kToggleQueryLevel), 0);
  EXPECT_FALSE(pToggles->bNeverShowVexPortWarnings);
  setHostToggle(3, false);
  selectHostPlatform(platformNone);
}

TEST_F(HostCatalog, DefaultPidSettings) {
  const std::set<TMotorTypes> pidTypes = {14, 17, 18, 19, 28, 31};
  for (TMotorTypes nType = -5; nType < 40; ++nType) {
    SCOPED_TRACE(nType);
    const TPidSettings *pDefault = pToggles->getDefaultPidSettings(nType);
    ASSERT_NE(pDefault, nullptr);
    EXPECT_EQ(pDefault->bIdenticalPidSettings(emptyPidSettings), pidTypes.count(nType) == 0);
    TPidSettings copy = {9, 9, 9, 9, 9, 9, 9, 9};
    pToggles->copyDefaultPidSettings(nType, copy);
    EXPECT_TRUE(copy.bIdenticalPidSettings(*pDefault));
  }
}

TEST_F(HostCatalog, TypedefLookupRules) {
  constexpr uint32_t kNxtOnly = platformBit(platformNxt);
  constexpr uint32_t kVexPicOnly = platformBit(platformVexPic);
  const TDeviceTypeMenuItem table[] = {
      menuRow(kVexPicOnly, 1, L"alpha"),   // another platform's row comes first
      menuRow(kNxtOnly, 2, L"alpha"),
      menuRow(kNxtOnly, 3, L"alpha"),      // a later duplicate never wins
      aliasRow(kNxtOnly, 4, L"oldDelta"),  // alias listed before the canonical row
      menuRow(kNxtOnly, 4, L"delta"),
      aliasRow(kNxtOnly, 5, L"onlyAlias"),
      aliasRow(kNxtOnly, 5, L"secondAlias"),
      menuRow(kVexPicOnly, 6, L"vexOnly"),
      kEndOfTable,
      menuRow(kNxtOnly, 7, L"pastTheEnd"),
  };
  selectHostPlatform(platformNxt);
  EXPECT_EQ(getTypedefIndex(table, L"alpha", true), 2);
  EXPECT_EQ(getTypedefIndex(table, L"oldDelta", true), 4);
  EXPECT_EQ(getTypedefIndex(table, L"delta", true), 4);
  EXPECT_EQ(getTypedefIndex(table, L"Delta", true), -1);
  EXPECT_EQ(getTypedefIndex(table, L"delta ", true), -1);
  EXPECT_EQ(getTypedefIndex(table, L"vexOnly", true), -1);
  EXPECT_EQ(getTypedefIndex(table, L"pastTheEnd", true), -1);
  EXPECT_EQ(getTypedefIndex(table, L"", true), -1);
  EXPECT_EQ(getTypedefIndex(nullptr, L"alpha", true), -1);

  EXPECT_EQ(str(getTypedefEnumString(table, 2, -1)), L"alpha");
  EXPECT_EQ(str(getTypedefEnumString(table, 4, -1)), L"delta");
  EXPECT_EQ(str(getTypedefEnumString(table, 5, -1)), L"onlyAlias");
  EXPECT_EQ(str(getTypedefEnumString(table, 1, -1)), L"");
  EXPECT_EQ(str(getTypedefEnumString(table, 7, -1)), L"");
  EXPECT_EQ(str(getTypedefEnumString(table, 4, 7)), L"delta");
  EXPECT_EQ(str(getTypedefEnumString(nullptr, 0, -1)), L"");

  selectHostPlatform(platformVexPic);
  EXPECT_EQ(getTypedefIndex(table, L"alpha", true), 1);
  EXPECT_EQ(getTypedefIndex(table, L"delta", true), -1);
  EXPECT_EQ(str(getTypedefEnumString(table, 6, -1)), L"vexOnly");
}

TEST(HostCatalogInteger, AcceptsOnlyWholeDecimalNumbers) {
  struct TCase {
    const wchar_t *pzText;
    bool bOk;
    int nValue;
  };
  const TCase cases[] = {
      {L"0", true, 0},
      {L"42", true, 42},
      {L"  -17\t", true, -17},
      {L"+8", true, 8},
      {L"007", true, 7},
      {L"2147483647", true, 2147483647},
      {L"-2147483648", true, -2147483647 - 1},
      {L"2147483648", false, 0},
      {L"-2147483649", false, 0},
      {L"99999999999999999999", false, 0},
      {L"", false, 0},
      {L"   ", false, 0},
      {L"-", false, 0},
      {L"x12", false, 0},
      {L"12x", false, 0},
      {L"0x10", false, 0},
      {L"1 2", false, 0},
      {L"--1", false, 0},
      {L"3.5", false, 0},
  };
  for (const TCase &c : cases) {
    SCOPED_TRACE(testing::Message() << '"' << CString(c.pzText).toUtf8() << '"');
    bool bOk = !c.bOk;
    EXPECT_EQ(getInteger(c.pzText, bOk), c.nValue);
    EXPECT_EQ(bOk, c.bOk);
  }
}

// Every word a string function gives must lead back to its value.
TEST_F(HostCatalog, EveryKeywordRoundTripsOnEveryPlatform) {
  const TDeviceTypeMenuItem *const driveTables[] = {nDriveTrainTypes, nGripperArmTypes, nJoystickDriveTypes,
                                                    nJoystickAxisScalingTypes};
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    SCOPED_TRACE(nKind);
    selectHostPlatform(nKind);
    for (TSensorTypes nType = 0; nType <= 91; ++nType) {
      const CString sType = getSensorTypeString(nType);
      ASSERT_FALSE(sType.IsEmpty()) << nType;
      EXPECT_EQ(getSensorTypeIndex(sType, true), nType);
      for (TSensorModes nMode = 0; nMode < 16; ++nMode) {
        const CString sMode = getSensorModeString(nType, nMode);
        if (!sMode.IsEmpty()) {
          EXPECT_EQ(getSensorModeIndex(nType, sMode, true), nMode);
        }
      }
    }
    for (TMotorTypes nType = 0; nType <= 31; ++nType) {
      for (TSensorHWTypesMask nMask : {0, -1, 0x18, 0x20, 0x40, 0x10198, 0x8008, 0x13980, 0x4000}) {
        const CString sType = getMotorTypedefString(nType, nMask);
        if (nMask == 0 || nMask == -1) {
          ASSERT_FALSE(sType.IsEmpty()) << nType;
        }
        if (!sType.IsEmpty()) {
          EXPECT_EQ(getMotorTypedefNameIndex(sType, nMask), nType);
        }
      }
    }
    for (TServoTypes nType = 0; nType <= 3; ++nType) {
      EXPECT_EQ(getServoTypedefNameIndex(getServoTypedefString(nType)), nType);
    }
    for (int nServo = 0; nServo < 96; ++nServo) EXPECT_EQ(getServoIndex(servoPort(nServo)), nServo);
    for (int nMotor = 0; nMotor < 36; ++nMotor) {
      const CString sPort = motorPort(nMotor);
      if (!sPort.IsEmpty()) {
        EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(sPort), nMotor);
      }
    }
    for (int nSecondary = 0; nSecondary < 16; ++nSecondary) {
      EXPECT_EQ(getSecondaryPortIndex(getSensorSecondaryPort(nSecondary)), nSecondary);
    }
    for (TControllerBoardType nBoard = 0; nBoard <= 36; ++nBoard) {
      const TCktBoardInfo *pInfo = getCircuitBoardInfo(nBoard);
      for (int nPort = pInfo->nFirstSensorPort; nPort <= pInfo->nLastSensorPort; ++nPort) {
        const CString sPort = getSensorPortString(nPort, nBoard);
        ASSERT_FALSE(sPort.IsEmpty()) << nBoard << ':' << nPort;
        EXPECT_EQ(getTypedefIndex(getSensorNameDefinitions(nBoard), sPort, true), nPort);
        EXPECT_EQ(getTypedefIndex(getSensorNameDefinitionsForCktBoards(nBoard), sPort, true), nPort);
      }
      const CString sBoard = getTypedefEnumString(getArduinoCircuitBoardTypeMenuDefn(), nBoard, -1);
      if (!sBoard.IsEmpty()) {
        EXPECT_EQ(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), sBoard, true), nBoard);
      }
    }
    for (const TDeviceTypeMenuItem *pTable : driveTables) {
      for (const TDeviceTypeMenuItem *pRow = pTable; pRow->nPlatformMask != 0; ++pRow) {
        EXPECT_EQ(getTypedefIndex(pTable, getTypedefEnumString(pTable, pRow->nValue, 7), true), pRow->nValue);
      }
    }
  }
}

TEST_F(HostCatalog, PortNamesFollowThePlatform) {
  selectHostPlatform(platformNxt);
  EXPECT_EQ(motorPort(0), L"motorA");
  EXPECT_EQ(motorPort(2), L"motorC");
  EXPECT_EQ(motorPort(3), L"mtr_S1_C1_1");
  EXPECT_EQ(motorPort(12), L"mtr_S2_C1_2");
  EXPECT_EQ(motorPort(34), L"mtr_S4_C4_2");
  EXPECT_EQ(motorPort(35), L"");
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"mtr_Matrix_S2_3"), 13);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"motorD"), -1);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"port1"), -1);

  selectHostPlatform(platformBrick4Motor);
  EXPECT_EQ(motorPort(3), L"motorD");
  EXPECT_EQ(motorPort(4), L"mtr_S1_C1_1");
  EXPECT_EQ(motorPort(35), L"mtr_S4_C4_2");
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"mtr_Matrix_S1_1"), 4);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"mtr_Matrix_S4_4"), 4 + 24 + 3);

  selectHostPlatform(platformVexPic);
  EXPECT_EQ(motorPort(0), L"port1");
  EXPECT_EQ(motorPort(9), L"port10");
  EXPECT_EQ(motorPort(10), L"");
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"motorA"), -1);

  for (int nKind : {platformArduino, platformSharedPorts, platformKind9, platformBoard10, platformBoard14}) {
    selectHostPlatform(nKind);
    EXPECT_EQ(motorPort(0), L"motor1");
    EXPECT_EQ(motorPort(11), L"motor12");
    EXPECT_EQ(motorPort(12), L"");
  }
  for (int nKind : {platformNone, platformKind5, platformKind6}) {
    selectHostPlatform(nKind);
    EXPECT_EQ(motorPort(0), L"");
    EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"motor1"), -1);
  }
  EXPECT_EQ(motorPort(-1), L"");

  EXPECT_EQ(servoPort(0), L"srvo_S1_C1_1");
  EXPECT_EQ(servoPort(7), L"srvo_S1_C2_2");
  EXPECT_EQ(servoPort(95), L"srvo_S4_C4_6");
  EXPECT_EQ(servoPort(96), L"");
  EXPECT_EQ(servoPort(-1), L"");
  EXPECT_EQ(getServoIndex(L"srvo_Matrix_S2_1"), 24);
  EXPECT_EQ(getServoIndex(L"srvo_Matrix_S4_4"), 75);
  EXPECT_EQ(getServoIndex(L"srvo_S5_C1_1"), -1);

  EXPECT_EQ(str(getSensorSecondaryPort(0)), L"secondaryPort1");
  EXPECT_EQ(str(getSensorSecondaryPort(-1)), L"");
  EXPECT_EQ(str(getSensorSecondaryPort(16)), L"");
  EXPECT_EQ(getSecondaryPortIndex(L"secondaryPort16"), 15);
}

TEST_F(HostCatalog, TypeAndModeWords) {
  selectHostPlatform(platformVexI2c);
  EXPECT_EQ(str(getSensorTypeString(0)), L"sensorNone");
  EXPECT_EQ(str(getSensorTypeString(26)), L"sensorI2CMuxController");
  EXPECT_EQ(str(getSensorTypeString(67)), L"sensorQuadEncoderOnI2CPort");
  EXPECT_EQ(str(getSensorTypeString(92)), L"");
  EXPECT_EQ(str(getSensorTypeString(-1)), L"");
  EXPECT_EQ(getSensorTypeIndex(L"sensornone", true), -1);

  EXPECT_EQ(str(getSensorModeString(1, 0)), L"modeRaw");
  EXPECT_EQ(str(getSensorModeString(80, 0)), L"modeRaw");
  EXPECT_EQ(str(getSensorModeString(1, 2)), L"modeEdge");
  EXPECT_EQ(str(getSensorModeString(46, 4)), L"modePercentage");
  EXPECT_EQ(str(getSensorModeString(8, 4)), L"");
  EXPECT_EQ(getSensorModeIndex(1, L"modeEdge", true), 2);
  EXPECT_EQ(getSensorModeIndex(3, L"modeEdge", true), -1);  // a mode of another type
  EXPECT_EQ(getSensorModeIndex(87, L"modeCelsius", true), 5);
  EXPECT_EQ(getSensorModeIndex(1, L"secondaryPort1", true), -1);

  EXPECT_EQ(str(getServoTypedefString(3)), L"tServoWinch");
  EXPECT_EQ(getServoTypedefNameIndex(L"tServoStandard"), 1);
  EXPECT_EQ(getServoTypedefNameIndex(L"tServoNothing"), -1);

  // The hardware mask limits the motor types offered for a port.
  auto offered = [](TSensorHWTypesMask nMask) {
    std::set<TMotorTypes> types;
    for (TMotorTypes nType = 0; nType <= 31; ++nType) {
      if (*getMotorTypedefString(nType, nMask) != L'\0') types.insert(nType);
    }
    return types;
  };
  EXPECT_EQ(offered(0x18), (std::set<TMotorTypes>{0, 2, 3, 4, 5, 17, 18, 19, 26, 27, 28, 29}));
  EXPECT_EQ(offered(0x20), (std::set<TMotorTypes>{0, 20, 30, 31}));
  EXPECT_EQ(offered(0x8008), (std::set<TMotorTypes>{0, 2, 3, 4, 5, 6, 7, 8, 9, 26, 29}));
  EXPECT_EQ(offered(0x10180), (std::set<TMotorTypes>{0, 4, 5, 10, 11, 12, 13, 14, 15}));
  EXPECT_EQ(offered(0x4000), (std::set<TMotorTypes>{0, 1}));
  EXPECT_EQ(str(getMotorTypedefString(17, 0)), L"tmotorNxt");
  EXPECT_EQ(str(getMotorTypedefString(32, -1)), L"");
  EXPECT_EQ(getMotorTypedefNameIndex(L"tmotorTetrix", 0x18), -1);
  EXPECT_EQ(getMotorTypedefNameIndex(L"tmotorTetrix", 0x20), 20);
  EXPECT_EQ(getMotorTypedefNameIndex(L"tmotorVex393_MC29", -1), 11);
}

TEST_F(HostCatalog, DriveTrainTables) {
  struct TExpected {
    const TDeviceTypeMenuItem *pTable;
    std::vector<const wchar_t *> keywords;
  };
  const TExpected expected[] = {
      {nDriveTrainTypes,
       {L"driveTrainNone", L"twoWheelDrive", L"twoWheelSkidSteer", L"fourWheelDrive", L"mecanumDrive", L"xDriveOmni",
        L"threeWheelOmni", L"fourWheelOmni"}},
      {nGripperArmTypes, {L"gripperNone", L"gripperArmWithWrist", L"gripperClawLift"}},
      {nJoystickDriveTypes,
       {L"joystickDriveNone", L"tankDrive", L"arcadeDriveLeftStick", L"arcadeDriveRightStick", L"splitArcadeDrive"}},
      {nJoystickAxisScalingTypes, {L"axisScalingLinear", L"axisScalingSquared", L"axisScalingCubed"}},
  };
  for (const TExpected &e : expected) {
    size_t nRows = 0;
    for (const TDeviceTypeMenuItem *pRow = e.pTable; pRow->nPlatformMask != 0; ++pRow, ++nRows) {
      ASSERT_LT(nRows, e.keywords.size());
      EXPECT_EQ(pRow->nValue, static_cast<int>(nRows));
      EXPECT_EQ(str(pRow->pzKeyword), e.keywords[nRows]);
      EXPECT_EQ(pRow->nPlatformMask, 0xFFFFFFFFu);
      EXPECT_EQ(pRow->nThirdPartyMask, 0xFE);
      EXPECT_NE(pRow->pzLabel, nullptr);
    }
    EXPECT_EQ(nRows, e.keywords.size());
  }
  selectHostPlatform(platformVexPic);
  EXPECT_EQ(str(getTypedefEnumString(nDriveTrainTypes, 255, 7)), L"");
  EXPECT_EQ(getTypedefIndex(nDriveTrainTypes, L"mecanumDrive", true), 4);
}

TEST_F(HostCatalog, BoardFacts) {
  for (TControllerBoardType nBoard = 0; nBoard <= 36; ++nBoard) {
    SCOPED_TRACE(nBoard);
    const TCktBoardInfo *pInfo = getCircuitBoardInfo(nBoard);
    ASSERT_NE(pInfo, nullptr);
    EXPECT_EQ(pInfo->nBoardType, nBoard);
    ASSERT_NE(pInfo->pSerialPorts, nullptr);
    EXPECT_FALSE(CString(getCktBoardNameString(nBoard)).IsEmpty());
    const CString sCpu = pInfo->pCpuTypeName;
    EXPECT_FALSE(sCpu.IsEmpty());
    EXPECT_EQ(sCpu.Find(L' '), -1);
    EXPECT_EQ(sCpu.Find(L','), -1);
    if (nBoard != 0) {
      EXPECT_GE(pInfo->nDefaultCpuClockSpeed, 1000000);
    }
    EXPECT_EQ(getSensorPortString(pInfo->nLastSensorPort + 1, nBoard), CString());
  }
  EXPECT_EQ(getCircuitBoardInfo(37), nullptr);
  EXPECT_EQ(getCircuitBoardInfo(-1), nullptr);
  EXPECT_EQ(str(getCktBoardNameString(37)), L"");
  EXPECT_EQ(str(getCktBoardNameString(0)), L"No Board");
  EXPECT_EQ(str(getCktBoardNameString(36)), L"Generic board (user pins)");
  EXPECT_EQ(getSensorNameDefinitions(99)->nPlatformMask, 0u);
  EXPECT_EQ(getSensorNameDefinitions(0)->nPlatformMask, 0u);
  EXPECT_EQ(getCircuitBoardInfo(0)->nLastSensorPort, -1);

  EXPECT_EQ(str(getSensorPortString(-1, 10)), L"None");
  EXPECT_EQ(str(getSensorPortString(0, 1)), L"S1");
  EXPECT_EQ(str(getSensorPortString(15, 2)), L"in16");
  EXPECT_EQ(str(getSensorPortString(27, 5)), L"I2C_8");
  EXPECT_EQ(str(getSensorPortString(11, 6)), L"port12");
  EXPECT_EQ(str(getSensorPortString(15, 7)), L"dgtl8");
  EXPECT_EQ(str(getSensorPortString(19, 10)), L"dgtl13");
  EXPECT_EQ(str(getSensorPortString(29, 13)), L"dgtl13");
  EXPECT_EQ(str(getSensorPortString(23, 3)), L"dgtl15");

  auto pins = [](const TSerialPortIOPinsDefn &d) { return std::make_pair(d.nFirstPin, d.nSecondPin); };
  using P = std::pair<int32_t, int32_t>;
  for (TControllerBoardType nUno : {8, 9, 10, 11, 14, 15, 16, 17, 18, 19, 20, 21, 22, 23, 27, 28, 36}) {
    SCOPED_TRACE(nUno);
    const TCktBoardInfo &info = *getCircuitBoardInfo(nUno);
    EXPECT_EQ(info.nFirstSensorPort, 0);
    EXPECT_EQ(info.nLastSensorPort, 19);
    EXPECT_EQ(info.pSerialPorts->nNumbOfUARTs, 1);
    EXPECT_EQ(pins(info.pSerialPorts->uartPins[0]), P(6, 7));
    EXPECT_EQ(info.pSerialPorts->nNumbOfI2Cs, 1);
    EXPECT_EQ(pins(info.pSerialPorts->i2cPins[0]), P(4, 5));
  }
  for (TControllerBoardType nMega : {12, 13, 24}) {
    SCOPED_TRACE(nMega);
    const TSerialPortsInfo &serial = *getCircuitBoardInfo(nMega)->pSerialPorts;
    EXPECT_EQ(getCircuitBoardInfo(nMega)->nLastSensorPort, 69);
    EXPECT_EQ(pins(serial.uartPins[0]), P(16, 17));
    EXPECT_EQ(pins(serial.uartPins[1]), P(35, 34));
    EXPECT_EQ(pins(serial.uartPins[2]), P(33, 32));
    EXPECT_EQ(pins(serial.uartPins[3]), P(31, 30));
    EXPECT_EQ(pins(serial.i2cPins[0]), P(36, 37));
    EXPECT_EQ(serial.nNumbOfUARTs, nMega == 24 ? 8 : 4);
    EXPECT_EQ(serial.nNumbOfI2Cs, nMega == 24 ? 6 : 1);
  }
  const TSerialPortsInfo &expansion = *getCircuitBoardInfo(24)->pSerialPorts;
  EXPECT_EQ(pins(expansion.uartPins[4]), P(49, 48));
  EXPECT_EQ(pins(expansion.uartPins[5]), P(51, 50));
  EXPECT_EQ(pins(expansion.i2cPins[5]), P(46, 47));

  struct TSerialCounts {
    TControllerBoardType nBoard;
    int nUarts, nI2cs;
  };
  for (const TSerialCounts &c : {TSerialCounts{0, 0, 0}, TSerialCounts{1, 0, 0}, TSerialCounts{2, 2, 0},
                                 TSerialCounts{5, 3, 1}, TSerialCounts{6, 1, 0}, TSerialCounts{7, 1, 0},
                                 TSerialCounts{3, 0, 0}, TSerialCounts{29, 0, 0}}) {
    SCOPED_TRACE(c.nBoard);
    const TSerialPortsInfo &serial = *getCircuitBoardInfo(c.nBoard)->pSerialPorts;
    EXPECT_EQ(serial.nNumbOfUARTs, c.nUarts);
    EXPECT_EQ(serial.nNumbOfI2Cs, c.nI2cs);
    for (int i = 0; i < c.nUarts; ++i) EXPECT_EQ(pins(serial.uartPins[size_t(i)]), P(-1, -1));
  }
}

TEST_F(HostCatalog, BoardMenuOffersTheSelectableBoards) {
  const std::set<TControllerBoardType> arduinoBoards = {8,  9,  10, 11, 12, 13, 14, 15, 16, 17,
                                                        18, 19, 20, 21, 22, 23, 24, 27, 28, 36};
  const std::set<TControllerBoardType> makerBoards = {3, 4, 25, 26, 29, 30, 31, 32, 33, 34, 35};
  std::set<TControllerBoardType> listed;
  std::set<std::wstring> keywords;
  for (const TDeviceTypeMenuItem *pRow = getArduinoCircuitBoardTypeMenuDefn(); pRow->nPlatformMask != 0; ++pRow) {
    SCOPED_TRACE(pRow->nValue);
    EXPECT_TRUE(listed.insert(pRow->nValue).second);
    EXPECT_TRUE(keywords.insert(pRow->pzKeyword).second);
    EXPECT_EQ(str(pRow->pzLabel), str(getCktBoardNameString(pRow->nValue)));
    EXPECT_EQ(pRow->nPlatformMask, arduinoBoards.count(pRow->nValue) ? 0x10u : 0x7C00u);
  }
  std::set<TControllerBoardType> selectable = arduinoBoards;
  selectable.insert(makerBoards.begin(), makerBoards.end());
  EXPECT_EQ(listed, selectable);

  selectHostPlatform(platformArduino);
  EXPECT_EQ(str(getTypedefEnumString(getArduinoCircuitBoardTypeMenuDefn(), 10, -1)), L"typeCktBoardUno");
  EXPECT_EQ(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), L"typeCktBoardMakerClassic", true), -1);
  selectHostPlatform(platformBoard13);
  EXPECT_EQ(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), L"typeCktBoardMakerClassic", true), 3);
  EXPECT_EQ(str(getTypedefEnumString(getArduinoCircuitBoardTypeMenuDefn(), 10, -1)), L"");
}

}  // namespace
