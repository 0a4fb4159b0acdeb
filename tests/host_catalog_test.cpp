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

std::wstring str(const wchar_t *pz) { return pz ? std::wstring(pz) : std::wstring(L"<null>"); }

std::wstring motorPort(int nMotor) {
  CString s(L"stale");
  getMotorPortStringForNonArduinoPlatforms(nMotor, s);
  return s.str();
}

std::wstring servoPort(int nServo) {
  CString s(L"stale");
  getServoPortString(nServo, s);
  return s.str();
}

class HostCatalog : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

TEST_F(HostCatalog, PlatformRecordsPerKind) {
  struct TExpected {
    const wchar_t *pzKeyword;
    int nMotors, nSensors, nServos;
    TControllerBoardType nBoard;
    bool bEncoder;
  };
  const TExpected kExpected[kNumbOfPlatformKinds] = {
      {L"none", 0, 0, 0, 0, false},       {L"nxt", 35, 4, 96, 1, false},      {L"vexpic", 8, 16, 0, 2, false},
      {L"vexi2c", 10, 28, 0, 5, true},    {L"arduino", 12, 70, 0, 8, false},  {L"sensorlab", 0, 8, 0, 7, false},
      {L"datalogger", 0, 4, 0, 7, false}, {L"sharedports", 12, 12, 0, 6, false}, {L"brick4", 36, 4, 96, 1, false},
      {L"classroom", 8, 16, 0, 7, false}, {L"maker10", 0, 24, 0, 3, false},   {L"maker11", 0, 24, 0, 4, false},
      {L"maker12", 0, 24, 0, 25, false},  {L"maker13", 0, 24, 0, 26, false},  {L"maker14", 0, 24, 0, 29, false},
  };
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    SCOPED_TRACE(nKind);
    const TExpected &e = kExpected[nKind];
    selectHostPlatform(nKind);
    EXPECT_EQ(pToggles->getPlatformMask(), 1u << nKind);
    EXPECT_EQ(pToggles->getIDECircuitBoardType(), e.nBoard);
    const CPlatformType &p = *pPlatformData;
    EXPECT_EQ(p.nPlatformKind, nKind);
    EXPECT_EQ(str(p.pKeyword), e.pzKeyword);
    EXPECT_EQ(p.pMotorParms->nNumbOfMotorPorts, e.nMotors);
    EXPECT_EQ(p.pPlatformParms->nNumbOfSensorPorts, e.nSensors);
    EXPECT_EQ(p.pPlatformParms->nNumbOfServoPorts, e.nServos);
    EXPECT_EQ(p.bPlatformAssociatesEncoderSensorWithMotor(), e.bEncoder);
    EXPECT_EQ(getPlatformTypeForKind(nKind)->pPlatformParms, p.pPlatformParms);
  }
  EXPECT_EQ(getPlatformTypeForKind(-1), nullptr);
  EXPECT_EQ(getPlatformTypeForKind(kNumbOfPlatformKinds), nullptr);
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

TEST(HostSelection, TogglesAndTheScopeThatRestoresThem) {
  selectHostPlatform(platformVexPic, -1, true);
  setHostToggle(3, true);
  setHostToggle(40, true);  // no such toggle: ignored
  EXPECT_EQ(pToggles->bIsToggleEnabled(40, kToggleQueryLevel), 0);
  EXPECT_EQ(pToggles->bIsToggleEnabled(-1, kToggleQueryLevel), 0);
  CToggles *const pReference = pToggles;
  CPlatformType *const pSelected = pPlatformData;
  CFakeToggles fake;
  {
    CHostSelectionScope outer;
    selectHostPlatform(99);  // out of range: no platform
    EXPECT_EQ(pToggles->getPlatformKind(), platformNone);
    pToggles->setIDEPlatformAndCircuitBoardType(platformArduino, 13, 0x1234567890ull);
    EXPECT_EQ(pToggles->getIDECircuitBoardType(), 13);
    EXPECT_EQ(pPlatformData->nPlatformKind, platformArduino);
    pToggles->bNeverShowVexPortWarnings = true;
    selectHostPlatform(platformBoard12, 30, false);  // keeps the options and the warning switch
    EXPECT_EQ(pToggles->getPlatformSelectionOptions(), 0x1234567890ull);
    EXPECT_TRUE(pToggles->bNeverShowVexPortWarnings);
    EXPECT_NE(pToggles->bIsToggleEnabled(3, kToggleQueryLevel), 0);
    setHostToggle(3, false);
    {
      CHostSelectionScope inner;
      pToggles = &fake;
      CPlatformType other = *getPlatformTypeForKind(platformKind5);
      pPlatformData = &other;
    }
    EXPECT_EQ(pToggles, pReference);
    EXPECT_EQ(pToggles->getIDECircuitBoardType(), 30);
    EXPECT_EQ(pPlatformData->nPlatformKind, platformBoard12);
  }
  EXPECT_EQ(pToggles, pReference);
  EXPECT_EQ(pPlatformData, pSelected);
  EXPECT_EQ(pToggles->getPlatformKind(), platformVexPic);
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 2);
  EXPECT_NE(pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel), 0);
  EXPECT_NE(pToggles->bIsToggleEnabled(3, kToggleQueryLevel), 0);
  EXPECT_FALSE(pToggles->bNeverShowVexPortWarnings);

  CString sPath;
  EXPECT_EQ(pToggles->bGetFileNameFromUser(fileTypeRobotModel, sPath, 0xF001, 0x00800804, 0), 0);
  sPath = L"robot.model";
  EXPECT_EQ(pToggles->bGetFileNameFromUser(fileTypeRobotModel, sPath, 0xF001, 0x00800804, 0), 1);
  setHostToggle(3, false);
  selectHostPlatform(platformNone);
}

TEST_F(HostCatalog, DefaultPidSettings) {
  const std::set<TMotorTypes> pidTypes = {14, 17, 18, 19, 28, 31};
  for (TMotorTypes nType = -5; nType < 40; ++nType) {
    const TPidSettings *pDefault = pToggles->getDefaultPidSettings(nType);
    EXPECT_EQ(pDefault->bIdenticalPidSettings(emptyPidSettings), pidTypes.count(nType) == 0) << nType;
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
      kEndOfTable,
      menuRow(kNxtOnly, 7, L"pastTheEnd"),
  };
  selectHostPlatform(platformNxt);
  struct TLookup {
    const wchar_t *pzWord;
    int nIndex;
  };
  for (const TLookup &c : {TLookup{L"alpha", 2}, {L"oldDelta", 4}, {L"delta", 4}, {L"Delta", -1}, {L"delta ", -1},
                           {L"pastTheEnd", -1}, {L"", -1}})
    EXPECT_EQ(getTypedefIndex(table, c.pzWord, true), c.nIndex) << c.pzWord;
  EXPECT_EQ(getTypedefIndex(nullptr, L"alpha", true), -1);
  EXPECT_EQ(str(getTypedefEnumString(table, 4, -1)), L"delta");
  EXPECT_EQ(str(getTypedefEnumString(table, 5, -1)), L"onlyAlias");
  EXPECT_EQ(str(getTypedefEnumString(table, 1, -1)), L"");
  EXPECT_EQ(str(getTypedefEnumString(table, 7, -1)), L"");
  EXPECT_EQ(str(getTypedefEnumString(nullptr, 0, -1)), L"");
  selectHostPlatform(platformVexPic);
  EXPECT_EQ(getTypedefIndex(table, L"alpha", true), 1);
  EXPECT_EQ(getTypedefIndex(table, L"delta", true), -1);
}

TEST(HostCatalogInteger, AcceptsOnlyWholeDecimalNumbers) {
  struct TCase {
    const wchar_t *pzText;
    bool bOk;
    int nValue;
  };
  const TCase cases[] = {{L"42", true, 42},          {L"  -17\t", true, -17},  {L"+8", true, 8},
                         {L"2147483647", true, INT32_MAX}, {L"-2147483648", true, INT32_MIN},
                         {L"2147483648", false, 0},  {L"-2147483649", false, 0}, {L"", false, 0},
                         {L"-", false, 0},           {L"12x", false, 0},       {L"0x10", false, 0},
                         {L"1 2", false, 0},         {L"--1", false, 0}};
  for (const TCase &c : cases) {
    bool bOk = !c.bOk;
    EXPECT_EQ(getInteger(c.pzText, bOk), c.nValue) << CString(c.pzText).toUtf8();
    EXPECT_EQ(bOk, c.bOk) << CString(c.pzText).toUtf8();
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
      // A type of other platforms keeps its word but is not read on this one.
      bool bOffered = false;
      for (const TDeviceTypeMenuItem *pRow = getSensorTypeNameTable(); pRow->nPlatformMask != 0; ++pRow)
        bOffered = bOffered || (pRow->nValue == nType && (pRow->nPlatformMask & (1u << nKind)) != 0);
      EXPECT_EQ(getSensorTypeIndex(sType, true), bOffered ? nType : -1);
      for (TSensorModes nMode = 0; nMode < 16; ++nMode) {
        const CString sMode = getSensorModeString(nType, nMode);
        if (!sMode.IsEmpty()) { EXPECT_EQ(getSensorModeIndex(nType, sMode, true), nMode); }
      }
    }
    for (TMotorTypes nType = 0; nType <= 31; ++nType) {
      for (TSensorHWTypesMask nMask : {0, -1, 0x18, 0x20, 0x40, 0x10198, 0x8008, 0x13980, 0x4000}) {
        const CString sType = getMotorTypedefString(nType, nMask);
        if (nMask == 0 || nMask == -1) { ASSERT_FALSE(sType.IsEmpty()) << nType; }
        if (!sType.IsEmpty()) { EXPECT_EQ(getMotorTypedefNameIndex(sType, nMask), nType); }
      }
    }
    for (TServoTypes nType = 0; nType <= 3; ++nType)
      EXPECT_EQ(getServoTypedefNameIndex(getServoTypedefString(nType)), nType);
    for (int nServo = 0; nServo < 96; ++nServo) EXPECT_EQ(getServoIndex(servoPort(nServo)), nServo);
    for (int nMotor = 0; nMotor < 36; ++nMotor) {
      const CString sPort = motorPort(nMotor);
      if (!sPort.IsEmpty()) { EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(sPort), nMotor); }
    }
    for (int nSecondary = 0; nSecondary < 16; ++nSecondary)
      EXPECT_EQ(getSecondaryPortIndex(getSensorSecondaryPort(nSecondary)), nSecondary);
    for (TControllerBoardType nBoard = 0; nBoard <= 36; ++nBoard) {
      const TCktBoardInfo *pInfo = getCircuitBoardInfo(nBoard);
      for (int nPort = pInfo->nFirstSensorPort; nPort <= pInfo->nLastSensorPort; ++nPort) {
        const CString sPort = getSensorPortString(nPort, nBoard);
        ASSERT_FALSE(sPort.IsEmpty()) << nBoard << ':' << nPort;
        EXPECT_EQ(getTypedefIndex(getSensorNameDefinitions(nBoard), sPort, true), nPort);
        EXPECT_EQ(getTypedefIndex(getSensorNameDefinitionsForCktBoards(nBoard), sPort, true), nPort);
      }
      EXPECT_EQ(getSensorPortString(pInfo->nLastSensorPort + 1, nBoard), CString());
      const CString sBoard = getTypedefEnumString(getArduinoCircuitBoardTypeMenuDefn(), nBoard, -1);
      if (!sBoard.IsEmpty()) { EXPECT_EQ(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), sBoard, true), nBoard); }
    }
    for (const TDeviceTypeMenuItem *pTable : driveTables)
      for (const TDeviceTypeMenuItem *pRow = pTable; pRow->nPlatformMask != 0; ++pRow)
        EXPECT_EQ(getTypedefIndex(pTable, getTypedefEnumString(pTable, pRow->nValue, 7), true), pRow->nValue);
  }
}

TEST_F(HostCatalog, PortNamesFollowThePlatform) {
  struct TCase {
    int nKind, nMotor;
    const wchar_t *pzPort;
  };
  const TCase kPorts[] = {{platformNxt, 2, L"motorC"},          {platformNxt, 3, L"mtr_S1_C1_1"},
                          {platformNxt, 34, L"mtr_S4_C4_2"},    {platformNxt, 35, L""},
                          {platformBrick4Motor, 3, L"motorD"},  {platformBrick4Motor, 4, L"mtr_S1_C1_1"},
                          {platformVexPic, 9, L"port10"},       {platformVexPic, 10, L""},
                          {platformArduino, 11, L"motor12"},    {platformBoard14, 0, L""},
                          {platformKind6, 0, L""},              {platformNxt, -1, L""}};
  for (const TCase &c : kPorts) {
    selectHostPlatform(c.nKind);
    EXPECT_EQ(motorPort(c.nMotor), c.pzPort) << c.nKind << ":" << c.nMotor;
  }
  selectHostPlatform(platformNxt);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"mtr_Matrix_S2_3"), 13);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"motorD"), -1);
  selectHostPlatform(platformBrick4Motor);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"mtr_Matrix_S4_4"), 4 + 24 + 3);
  selectHostPlatform(platformKind5);
  EXPECT_EQ(getMotorIndexForNonArduinoPlatforms(L"motor1"), -1);

  EXPECT_EQ(servoPort(7), L"srvo_S1_C2_2");
  EXPECT_EQ(servoPort(96), L"");
  EXPECT_EQ(servoPort(-1), L"");
  EXPECT_EQ(getServoIndex(L"srvo_Matrix_S4_4"), 75);
  EXPECT_EQ(getServoIndex(L"srvo_S5_C1_1"), -1);
  EXPECT_EQ(str(getSensorSecondaryPort(-1)) + str(getSensorSecondaryPort(16)), L"");
}

TEST_F(HostCatalog, TypeAndModeWords) {
  selectHostPlatform(platformVexI2c);
  EXPECT_EQ(str(getSensorTypeString(92)) + str(getSensorTypeString(-1)), L"");
  EXPECT_EQ(getSensorTypeIndex(L"sensornone", true), -1);
  EXPECT_EQ(str(getSensorModeString(8, 4)), L"");
  EXPECT_EQ(getSensorModeIndex(3, L"modeEdge", true), -1);  // a mode of another type
  EXPECT_EQ(getSensorModeIndex(1, L"secondaryPort1", true), -1);
  EXPECT_EQ(getServoTypedefNameIndex(L"tServoNothing"), -1);

  // The hardware mask limits the motor types offered for a port.
  auto offered = [](TSensorHWTypesMask nMask) {
    std::set<TMotorTypes> types;
    for (TMotorTypes nType = 0; nType <= 31; ++nType)
      if (*getMotorTypedefString(nType, nMask) != L'\0') types.insert(nType);
    return types;
  };
  EXPECT_EQ(offered(0x18), (std::set<TMotorTypes>{0, 2, 3, 4, 5, 17, 18, 19, 26, 27, 28, 29}));
  EXPECT_EQ(offered(0x20), (std::set<TMotorTypes>{0, 20, 30, 31}));
  EXPECT_EQ(offered(0x10180), (std::set<TMotorTypes>{0, 4, 5, 10, 11, 12, 13, 14, 15}));
  EXPECT_EQ(str(getMotorTypedefString(32, -1)), L"");
  EXPECT_EQ(getMotorTypedefNameIndex(L"tmotorTetrix", 0x18), -1);
  EXPECT_EQ(getMotorTypedefNameIndex(L"tmotorTetrix", 0x20), 20);
}

TEST_F(HostCatalog, BoardFacts) {
  for (TControllerBoardType nBoard = 0; nBoard <= 36; ++nBoard) {
    const TCktBoardInfo *pInfo = getCircuitBoardInfo(nBoard);
    ASSERT_NE(pInfo, nullptr);
    EXPECT_EQ(pInfo->nBoardType, nBoard);
    EXPECT_FALSE(CString(getCktBoardNameString(nBoard)).IsEmpty());
    if (nBoard != 0) { EXPECT_GE(pInfo->nDefaultCpuClockSpeed, 1000000) << nBoard; }
  }
  EXPECT_EQ(getCircuitBoardInfo(37), nullptr);
  EXPECT_EQ(getCircuitBoardInfo(-1), nullptr);
  EXPECT_EQ(str(getCktBoardNameString(37)), L"");
  EXPECT_EQ(getSensorNameDefinitions(99)->nPlatformMask, 0u);
  EXPECT_EQ(str(getSensorPortString(-1, 10)), L"None");

  // The board menu lists each selectable board once, under its platform's mask.
  const std::set<TControllerBoardType> arduinoBoards = {8,  9,  10, 11, 12, 13, 14, 15, 16, 17,
                                                        18, 19, 20, 21, 22, 23, 24, 27, 28, 36};
  std::set<TControllerBoardType> listed;
  for (const TDeviceTypeMenuItem *pRow = getArduinoCircuitBoardTypeMenuDefn(); pRow->nPlatformMask != 0; ++pRow) {
    EXPECT_TRUE(listed.insert(pRow->nValue).second);
    EXPECT_EQ(pRow->nPlatformMask, arduinoBoards.count(pRow->nValue) ? 0x10u : 0x7C00u);
  }
  EXPECT_EQ(listed.size(), arduinoBoards.size() + 11);
  selectHostPlatform(platformArduino);
  EXPECT_EQ(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), L"typeCktBoardMakerClassic", true), -1);
  selectHostPlatform(platformBoard13);
  EXPECT_EQ(getTypedefIndex(getArduinoCircuitBoardTypeMenuDefn(), L"typeCktBoardMakerClassic", true), 3);
}

}  // namespace
