// Controller and plug-in boards: applying a board, the CircuitBoardType,
// PluginCircuitBoard, CPU_Parameters and VEX PIC ProgramType lines, and the
// IDE following the program's board.
#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <utility>
#include <vector>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"
#include "robotconfig/sensors/ControllerBoards.h"
#include "tests/config_lines.h"

namespace {
using test_support::parseLine;
using test_support::bSameSettings;


class Boards : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

void parseOk(CRobotConfigurationBasic &rec, const std::wstring &sLine) {
  CString sError;
  EXPECT_TRUE(parseLine(rec, sLine, sError)) << sLine << ": " << sError.str();
}

// The generated lines of the board keywords (and ProgramType), in the order written.
std::vector<std::wstring> boardLines(CRobotConfigurationBasic &rec) {
  static const std::wstring kPrefixes[] = {L"#pragma config(CircuitBoardType,", L"#pragma config(CPU_Parameters,",
                                           L"#pragma config(PluginCircuitBoard,", L"#pragma config(ProgramType,"};
  CString sText;
  rec.buildSourceCodeForConfiguration(sText, false);
  std::vector<std::wstring> lines;
  const std::wstring s = sText.str();
  for (size_t pos = 0; pos < s.size();) {
    size_t end = s.find(L"\r\n", pos);
    if (end == std::wstring::npos) end = s.size();
    for (const std::wstring &sPrefix : kPrefixes)
      if (s.compare(pos, sPrefix.size(), sPrefix) == 0) lines.push_back(s.substr(pos, end - pos));
    pos = end + 2;
  }
  return lines;
}

TEST_F(Boards, CompatibleBoards) {
  for (TControllerBoardType a : {10, 11, 27})
    for (TControllerBoardType b : {10, 11, 27}) EXPECT_TRUE(CRobotConfigurationBasic::bAreCktBoardTypesFullyCompatible(a, b));
  EXPECT_TRUE(CRobotConfigurationBasic::bAreCktBoardTypesFullyCompatible(8, 8));
  for (const auto &[a, b] : {std::pair<int, int>{10, 8}, {27, 28}, {12, 13}, {0, 10}})
    EXPECT_FALSE(CRobotConfigurationBasic::bAreCktBoardTypesFullyCompatible(a, b));
}

TEST_F(Boards, ApplyingABoard) {
  selectHostPlatform(platformArduino, 8);
  CHostRobotConfiguration rec;
  rec.setCpuClockSpeed(1);
  rec.setCircuitBoardType(13);
  EXPECT_EQ(rec.getCircuitBoardType(), 13);
  EXPECT_EQ(rec.getCpuClockSpeed(), 16000000);
  for (int nPort : {16, 17}) EXPECT_EQ(rec.getSensorTypeInConfig(nPort), 60);
  EXPECT_EQ(rec.getSensorTypeInConfig(29), 65);
  EXPECT_EQ(rec.getNumbOfEntriesInMotorIOPinTable(), 12);
  EXPECT_EQ(rec.sBoardDefaultMotorNames[0], L"servo_2");
  EXPECT_EQ(rec.sBoardDefaultMotorNames[11], L"motor_10");

  // Boards that keep their platform's pins leave the table and the pins alone.
  const TMotorIOPinsDefinition *pTable = rec.getMotorIOPins();
  rec.setCircuitBoardType(36);
  EXPECT_EQ(rec.getMotorIOPins(), pTable);
  EXPECT_EQ(rec.getCpuClockSpeed(), 16000000);
  EXPECT_EQ(rec.getSensorTypeInConfig(29), 65);

  rec.setCpuClockSpeed(5);
  rec.setDefaultFixedIOPinsForControllerBoard();
  EXPECT_EQ(rec.getCpuClockSpeed(), 5);
  // A number that is no board of the catalog has no clock.
  rec.setCircuitBoardType(99);
  EXPECT_EQ(rec.getCpuClockSpeed(), 0);
}

TEST_F(Boards, FixedPinsOfAnEarlierBoardStay) {
  selectHostPlatform(platformArduino, 12);
  CHostRobotConfiguration rec;
  ASSERT_EQ(rec.getSensorTypeInConfig(29), 65);
  parseOk(rec, L"#pragma config(CircuitBoardType, typeCktBoardDuemilanove)");
  EXPECT_EQ(rec.getCircuitBoardType(), 8);
  for (int nPort : {6, 7, 16, 17}) EXPECT_EQ(rec.getSensorTypeInConfig(nPort), 60) << nPort;
  for (int nPort : {19, 29}) EXPECT_EQ(rec.getSensorTypeInConfig(nPort), 65) << nPort;
  EXPECT_EQ(rec.getNumbOfEntriesInMotorIOPinTable(), 8);
  EXPECT_EQ(rec.sBoardDefaultMotorNames[0], L"servo_9");

  EXPECT_EQ(getControllerBoardFixedPins(2).nCount, 0);
  EXPECT_EQ(getControllerBoardFixedPins(36).nCount, 0);
  const TBoardFixedPinList pins = getControllerBoardFixedPins(24);
  ASSERT_EQ(pins.nCount, 3);
  EXPECT_EQ(pins.pPins[2].nSensorType, 65);
  EXPECT_EQ(pins.pPins[2].nSensorPort, 29);
}

TEST_F(Boards, CircuitBoardTypeLine) {
  selectHostPlatform(platformArduino, 8);
  CHostRobotConfiguration rec;
  parseOk(rec, L"#pragma config(CircuitBoardType, typeCktBoardFio)");
  EXPECT_EQ(rec.getCircuitBoardType(), 22);
  EXPECT_EQ(rec.getCpuClockSpeed(), 8000000);

  // The board already held changes nothing, not even the clock.
  rec.setCpuClockSpeed(1);
  const TConfigurationSettings before = rec.getSettings();
  parseOk(rec, L"#pragma config(CircuitBoardType, typeCktBoardFio)");
  EXPECT_TRUE(bSameSettings(rec, before));

  // An unknown word, or a board of another platform, counts as no board.
  CString sError;
  for (const wchar_t *pzOther : {L"typeCktBoardFIO", L"typeCktBoardMakerClassic", L""}) {
    CHostRobotConfiguration other;
    EXPECT_TRUE(parseLine(other, std::wstring(L"#pragma config(CircuitBoardType, ") + pzOther + L")", sError));
    EXPECT_EQ(other.getCircuitBoardType(), 0);
  }

  const struct {
    int nKind;
    const wchar_t *pzMessage;
  } kNoSelection[] = {
      {platformNxt, L"Selected platform 'NXT' does not support programmable 'Board Type' selection"},
      {platformVexPic, L"Selected platform 'VEX PIC' does not support programmable 'Board Type' selection"},
  };
  for (const auto &test : kNoSelection) {
    selectHostPlatform(test.nKind);
    CHostRobotConfiguration other;
    const TConfigurationSettings cleared = other.getSettings();
    EXPECT_FALSE(parseLine(other, L"#pragma config(CircuitBoardType, typeCktBoardUno)", sError));
    EXPECT_EQ(sError, test.pzMessage);
    EXPECT_TRUE(bSameSettings(other, cleared));
  }
  // The board platforms select their own boards.
  selectHostPlatform(platformBoard10);
  CHostRobotConfiguration maker;
  parseOk(maker, L"#pragma config(CircuitBoardType, typeCktBoardMakerMega)");
  EXPECT_EQ(maker.getCircuitBoardType(), 4);
}

TEST_F(Boards, PluginCircuitBoardLine) {
  selectHostPlatform(platformArduino, 10);
  CHostRobotConfiguration rec;
  parseOk(rec, L"#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)");
  EXPECT_EQ(rec.getSettings().nPluginBoardTypes[0], 3);
  bool bChangesTable = false;
  const TMotorIOPinTableRef board = getControllerBoardMotorIOPins(10, bChangesTable);
  EXPECT_EQ(rec.getMotorIOPins(), board.pTable);  // this shield brings no motor pins

  parseOk(rec, L"#pragma config(PluginCircuitBoard, typePluginBoardNone)");
  EXPECT_EQ(rec.getSettings().nPluginBoardTypes[1], 0);

  parseOk(rec, L"#pragma config(PluginCircuitBoard, typeShieldDFRobotMotor)");
  EXPECT_EQ(rec.getSettings().nPluginBoardTypes[1], 1);
  EXPECT_EQ(rec.getMotorIOPins(), getPluginBoardMotorIOPins(1).pTable);
  EXPECT_EQ(rec.getNumbOfEntriesInMotorIOPinTable(), 8);
  EXPECT_EQ(rec.getMotorIOPin(0)->nHWTypesMask, 0x200);
  EXPECT_EQ(rec.sBoardDefaultMotorNames[0], L"motor_5");

  parseOk(rec, L"#pragma config(PluginCircuitBoard, typeShieldParallaxBoeBot)");
  EXPECT_EQ(rec.getSettings().nPluginBoardTypes, (std::array<int32_t, 3>{3, 1, 4}));
  EXPECT_EQ(rec.getMotorIOPins(), getPluginBoardMotorIOPins(4).pTable);
  EXPECT_EQ(rec.sBoardDefaultMotorNames[7], L"sound");

  // A fourth board has no slot and an unknown word no meaning: both are accepted and ignored.
  const TConfigurationSettings before = rec.getSettings();
  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(PluginCircuitBoard, typeShieldDFRobotMotorOld)", sError));
  EXPECT_TRUE(parseLine(rec, L"#pragma config(PluginCircuitBoard, typeShieldUnknown)", sError));
  EXPECT_TRUE(bSameSettings(rec, before));

  // A board line after the shields keeps the shields' pins.
  parseOk(rec, L"#pragma config(CircuitBoardType, typeCktBoardNano)");
  EXPECT_EQ(rec.getCircuitBoardType(), 14);
  EXPECT_EQ(rec.getMotorIOPins(), getPluginBoardMotorIOPins(4).pTable);

  selectHostPlatform(platformNxt);
  CHostRobotConfiguration nxt;
  EXPECT_TRUE(parseLine(nxt, L"#pragma config(PluginCircuitBoard, typeShieldDFRobotMotor)", sError));
  EXPECT_EQ(nxt.getSettings().nPluginBoardTypes, (std::array<int32_t, 3>{0, 0, 0}));  // no shields off Arduino
}

TEST_F(Boards, BoardLinesWritten) {
  selectHostPlatform(platformArduino, 8);
  CHostRobotConfiguration rec;
  EXPECT_EQ(boardLines(rec), (std::vector<std::wstring>{L"#pragma config(CircuitBoardType, typeCktBoardDuemilanove)"}));

  parseOk(rec, L"#pragma config(CPU_Parameters, ATmega328P, 8000000)");
  parseOk(rec, L"#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)");
  parseOk(rec, L"#pragma config(PluginCircuitBoard, typeShieldDFRobotMotorOld)");
  parseOk(rec, L"#pragma config(CircuitBoardType, typeCktBoardUnoSMD)");
  // The board line resets the clock: a CPU line before it is lost.
  EXPECT_EQ(rec.getCpuClockSpeed(), 16000000);
  parseOk(rec, L"#pragma config(CPU_Parameters, ATmega328P, 12000000)");
  const std::vector<std::wstring> expected = {
      L"#pragma config(CircuitBoardType, typeCktBoardUnoSMD)",
      L"#pragma config(CPU_Parameters, ATmega328P, 12000000)",
      L"#pragma config(PluginCircuitBoard, typeShieldSparkfunArdumoto)",
      L"#pragma config(PluginCircuitBoard, typeShieldDFRobotMotorOld)",
  };
  EXPECT_EQ(boardLines(rec), expected);

  // The written lines read back to the same configuration: the shields after the CPU line keep its clock.
  CHostRobotConfiguration copy;
  for (const std::wstring &sLine : expected) parseOk(copy, sLine);
  EXPECT_TRUE(bSameSettings(copy, rec.getSettings()));

  // The board's own clock is not written.
  parseOk(copy, L"#pragma config(CPU_Parameters, ATmega328P, 16000000)");
  EXPECT_EQ(boardLines(copy).size(), 3u);

  // A board without a word on the platform is not named at all.
  selectHostPlatform(platformNxt, 10);
  CHostRobotConfiguration nxt;
  EXPECT_TRUE(boardLines(nxt).empty());
  for (TControllerBoardType nBoard : {0, 1, 2, 5, 6, 7}) {
    selectHostPlatform(platformArduino, nBoard);
    CHostRobotConfiguration own;
    EXPECT_TRUE(boardLines(own).empty()) << nBoard;
  }
  selectHostPlatform(platformBoard12);
  CHostRobotConfiguration maker;
  EXPECT_EQ(boardLines(maker), (std::vector<std::wstring>{L"#pragma config(CircuitBoardType, typeCktBoardMakerMini)"}));
}

TEST_F(Boards, ProgramTypeWrittenOnTheVexPic) {
  selectHostPlatform(platformVexPic);
  CHostRobotConfiguration rec;
  EXPECT_TRUE(boardLines(rec).empty());  // 255: not yet assigned
  const wchar_t *const kWords[] = {L"NonCompetition", L"StandaloneWithUSBCable", L"Competition", L"CompetitionAutonomous"};
  for (int nType = 1; nType <= 4; ++nType) {
    rec.settings.nProgramType = nType;
    EXPECT_EQ(boardLines(rec), (std::vector<std::wstring>{std::wstring(L"#pragma config(ProgramType, ") + kWords[nType - 1] + L")"}));
  }
  for (int nType : {0, 5, -1}) {
    rec.settings.nProgramType = nType;
    EXPECT_TRUE(boardLines(rec).empty()) << nType;
  }
  selectHostPlatform(platformVexI2c);
  CHostRobotConfiguration i2c;
  i2c.settings.nProgramType = 3;
  EXPECT_TRUE(boardLines(i2c).empty());
}

TEST_F(Boards, IdeFollowsTheProgramsBoard) {
  CCapturingMessageSink sink;
  selectHostPlatform(platformArduino, 10);
  CHostRobotConfiguration rec;
  parseOk(rec, L"#pragma config(CircuitBoardType, typeCktBoardUnoRobotKit)");  // compatible with the Uno
  rec.modifyBoardTypeIfDifferentFromIDESetting();
  EXPECT_TRUE(sink.messages.empty());
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 10);

  selectHostPlatform(platformBoard10, 3);
  CHostRobotConfiguration maker;
  parseOk(maker, L"#pragma config(CircuitBoardType, typeCktBoardMakerMega)");
  maker.modifyBoardTypeIfDifferentFromIDESetting();
  ASSERT_EQ(sink.messages.size(), 1u);
  EXPECT_EQ(sink.messages[0].sText,
            L"IDE Circuit Board type is being changed from 'Maker Board Classic' to 'Maker Board Mega' to match "
            L"'#pragma config...' definition in user application program.");
  EXPECT_EQ(sink.messages[0].nStyle, 0x10u);
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 4);
  EXPECT_EQ(pToggles->getPlatformKind(), platformBoard10);

  // A configuration without a board leaves the IDE alone.
  maker.settings.nCircuitBoardType = 0;
  maker.modifyBoardTypeIfDifferentFromIDESetting();
  EXPECT_EQ(sink.messages.size(), 1u);

  // Reading a whole program switches the IDE too.
  selectHostPlatform(platformArduino, 8);
  CHostRobotConfiguration read;
  EXPECT_TRUE(readProgramConfiguration(read, CProgramText("#pragma config(CircuitBoardType, typeCktBoardMega2560)\n")).empty());
  EXPECT_EQ(pToggles->getIDECircuitBoardType(), 13);
}

}  // namespace
