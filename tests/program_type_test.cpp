// Program types by platform, and the ProgramType and FirmwareFeatures lines.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "tests/config_lines.h"

namespace {
using test_support::parseLine;
using test_support::generatedLines;


class ProgramTypeAndFirmware : public ::testing::Test {
 protected:
  CHostSelectionScope scope;
};

TEST_F(ProgramTypeAndFirmware, ProgramTypeWordsDependOnThePlatform) {
  struct TCase {
    int nKind;
    const wchar_t *pzWord;
    int nValue;  // -1: refused on that platform
  } kCases[] = {
      {platformVexPic, L"CompetitionUserControl", 5},  {platformVexI2c, L"CompetitionUserControl", 3},
      {platformArduino, L"CompetitionUserControl", 3}, {platformSharedPorts, L"CompetitionUserControl", -1},
      {platformVexPic, L"StandaloneWithUSBCable", 2},  {platformVexPic, L"StandaloneWiFi", -1},
      {platformVexI2c, L"StandaloneWiFi", 1},          {platformKind9, L"Competition", 3},
      {platformKind9, L"NonCompetition", 1},           {platformNxt, L"Competition", -1},
      {platformVexPic, L"competition", -1},            {platformVexI2c, L"NotYetAssigned", 255},
      {platformVexPic, L"", -1},
  };
  for (const TCase &test : kCases) {
    SCOPED_TRACE(testing::Message() << test.nKind << " " << CString(test.pzWord).toUtf8());
    selectHostPlatform(test.nKind);
    CHostRobotConfiguration rec;
    CString sError;
    const std::wstring sLine = std::wstring(L"#pragma config(ProgramType, ") + test.pzWord + L")";
    EXPECT_EQ(parseLine(rec, sLine, sError), test.nValue >= 0);
    EXPECT_EQ(rec.getSettings().nProgramType, test.nValue);
    if (test.nValue < 0) {
      EXPECT_EQ(sError, std::wstring(L"'") + test.pzWord + L"' is an invalid program type for current platform");
    }
  }

  // Every value the VEX PIC writes has a word that reads back to it.
  selectHostPlatform(platformVexPic);
  for (int nValue : {1, 2, 3, 4}) {
    const std::wstring sWord = getTypedefEnumString(nProgramTypes, nValue, -1);
    EXPECT_EQ(getTypedefIndex(nProgramTypes, sWord, true), nValue) << nValue;
  }
}

TEST_F(ProgramTypeAndFirmware, RefusedProgramTypeIsNeverWritten) {
  selectHostPlatform(platformVexPic);
  CHostRobotConfiguration rec;
  CString sError;
  EXPECT_FALSE(parseLine(rec, L"#pragma config(ProgramType, Scrimmage)", sError));
  EXPECT_TRUE(generatedLines(rec, L"#pragma config(ProgramType").empty());
}

TEST_F(ProgramTypeAndFirmware, FirmwareFeatures) {
  selectHostPlatform(platformVexI2c);
  CHostRobotConfiguration rec;
  EXPECT_TRUE(generatedLines(rec, L"#pragma config(FirmwareFeatures").empty());

  CString sError;
  EXPECT_TRUE(parseLine(rec, L"#pragma config(FirmwareFeatures, fwSounds)", sError));
  EXPECT_FALSE(rec.getSettings().bFwTimedServo);
  EXPECT_TRUE(rec.getSettings().bFwSounds);
  EXPECT_EQ(generatedLines(rec, L"#pragma config(FirmwareFeatures"),
            (std::vector<std::wstring>{L"#pragma config(FirmwareFeatures, fwSounds)"}));

  // A bad word fails the line; the good ones around it are still taken.
  rec.clearConfigurationDefinition();
  EXPECT_FALSE(parseLine(rec, L"#pragma config(FirmwareFeatures, fwsounds, fwTimedServo)", sError));
  EXPECT_EQ(sError, L"Invalid firmware feature 'fwsounds'.");
  EXPECT_TRUE(rec.getSettings().bFwTimedServo);
  EXPECT_FALSE(rec.getSettings().bFwSounds);
  EXPECT_FALSE(parseLine(rec, L"#pragma config(FirmwareFeatures, Sounds, fwSounds, , x)", sError));
  EXPECT_EQ(sError, L"Invalid firmware feature 'x'.");  // the last bad word's message
  EXPECT_EQ(generatedLines(rec, L"#pragma config(FirmwareFeatures"),
            (std::vector<std::wstring>{L"#pragma config(FirmwareFeatures, fwTimedServo, fwSounds)"}));

  // Reading never takes a feature away.
  EXPECT_TRUE(parseLine(rec, L"#pragma config(FirmwareFeatures)", sError));
  EXPECT_TRUE(parseLine(rec, L"#pragma config(FirmwareFeatures, fwSounds)", sError));
  EXPECT_TRUE(rec.getSettings().bFwTimedServo);
  EXPECT_TRUE(rec.getSettings().bFwSounds);
}

}  // namespace
