// Reading and writing the "Sensor" and sensor rename lines.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <iterator>
#include <string>
#include <vector>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"
#include "robotconfig/host/StandardModels.h"
#include "tests/config_lines.h"

namespace {
using test_support::COneModelList;

constexpr const wchar_t *kSensorLinePrefix = L"#pragma config(Sensor,";

class SensorLines : public ::testing::Test {
 protected:
  void select(int nKind, TControllerBoardType nBoard = -1) {
    selectHostPlatform(nKind, nBoard);
    rec.clearConfigurationDefinition();
  }

  // Hands one line to the dispatcher; the error text is left in sError.
  bool parse(const std::wstring &sLine, TLineNumber line = TLineNumber(4, 0)) {
    TTokenizedConfigParms parms;
    EXPECT_EQ(CRobotConfigurationBasic::nTokenizeLine(sLine, parms), lineTypeConfigPragma) << sLine;
    sError = L"stale";
    return rec.bParseConfigDefinitionLine(parms, false, line, L"program.c", sError);
  }

  std::wstring name(int nPort) const {
    CString s;
    rec.getUserDefinedSensorNameInConfig(nPort, s);
    return s.str();
  }

  CHostSelectionScope scope;
  CHostRobotConfiguration rec;
  CString sError;
};

// The lines of a generated block that start with `pzPrefix`.
std::vector<std::wstring> linesStartingWith(const CString &sBlock, const wchar_t *pzPrefix) {
  std::vector<std::wstring> lines;
  const std::wstring &s = sBlock.str();
  for (size_t pos = 0; pos < s.size();) {
    size_t end = s.find(L"\r\n", pos);
    if (end == std::wstring::npos) end = s.size();
    const std::wstring sLine = s.substr(pos, end - pos);
    if (sLine.rfind(pzPrefix, 0) == 0) lines.push_back(sLine);
    pos = end + 2;
  }
  return lines;
}

std::vector<std::wstring> sensorLines(CRobotConfigurationBasic &rec) {
  CString sBlock;
  rec.buildSourceCodeForConfiguration(sBlock, true);
  return linesStartingWith(sBlock, kSensorLinePrefix);
}

TEST_F(SensorLines, WrittenColumnsCharacterForCharacter) {
  select(platformVexI2c);
  auto put = [this](int nPort, const wchar_t *pzName, TSensorTypes nType, TSensorModes nMode = 0) {
    rec.setUserDefinedSensorNameInConfig(nPort, pzName, TLineNumber(1, 0));
    rec.setSensorTypeInConfig(nPort, nType);
    rec.setSensorModeInConfig(nPort, nMode);
  };
  put(0, L"gyro", 49, 7);
  put(1, L"spare", 0);
  put(2, L"temp", 69, 5);
  rec.setI2C_Address(2, 72);
  put(3, L"limit", 45, 2);
  rec.setSecondaryPort(3, 1);
  put(4, L"touch", 1, 9);  // a mode of another type is not written
  put(5, L"", 4);
  put(8, L"wheelEncoder", 80);
  put(10, L"sonar", 52);
  rec.setSecondaryPort(10, 2);
  put(13, L"aVeryLongSensorName", 1);
  put(14, L"range", 71);
  rec.setI2C_Address(14, -3);
  rec.setSecondaryPort(14, 15);
  put(20, L"", 67);
  rec.settings.nSensorTypes[21] = -1;  // read as no sensor
  rec.setUserDefinedSensorNameInConfig(21, L"idle", TLineNumber(1, 0));
  for (TSensorTypes nPinType : {57, 58, 59, 60, 61, 62, 64, 65, 66, 91}) {
    rec.settings.nSensorTypes[22] = nPinType;  // claimed pins never get a line of their own
    rec.setUserDefinedSensorNameInConfig(22, L"pin", TLineNumber(1, 0));
    EXPECT_EQ(sensorLines(rec).size(), 12u) << nPinType;
  }
  rec.setSensorTypeInConfig(22, 0);
  rec.setUserDefinedSensorNameInConfig(22, L"", TLineNumber(1, 0));

  const std::vector<std::wstring> expected = {
      L"#pragma config(Sensor, in1,    gyro,           sensorGyro, modeDegrees)",
      L"#pragma config(Sensor, in2,    spare,          sensorNone)",
      L"#pragma config(Sensor, in3,    temp,           sensorI2CTemperature,          , 72 , modeCelsius)",
      L"#pragma config(Sensor, in4,    limit,          sensorLimitSwitch, secondaryPort2, modeEdge)",
      L"#pragma config(Sensor, in5,    touch,          sensorTouch)",
      L"#pragma config(Sensor, in6,    ,               sensorDigitalIn)",
      L"#pragma config(Sensor, dgtl1,  wheelEncoder,   sensorQuadEncoder)",
      L"#pragma config(Sensor, dgtl3,  sonar,          sensorSONAR_cm, secondaryPort3)",
      L"#pragma config(Sensor, dgtl6,  aVeryLongSensorName, sensorTouch)",
      L"#pragma config(Sensor, dgtl7,  range,          sensorI2CRangeFinder,          secondaryPort16, -3 )",
      L"#pragma config(Sensor, I2C_1,  ,               sensorQuadEncoderOnI2CPort,    , AutoAssign )",
      L"#pragma config(Sensor, I2C_2,  idle,           sensorNone)",
  };
  EXPECT_EQ(sensorLines(rec), expected);
}

TEST_F(SensorLines, WriterCoversThePlatformsPortsOnly) {
  select(platformNxt);
  rec.setSensorTypeInConfig(3, 8);
  rec.setSensorTypeInConfig(4, 8);  // the record has the port, the brick does not
  EXPECT_EQ(sensorLines(rec), std::vector<std::wstring>{L"#pragma config(Sensor, S4,     ,               sensorSONAR)"});

  select(platformNone);
  rec.setSensorTypeInConfig(0, 1);
  EXPECT_TRUE(sensorLines(rec).empty());
}

TEST_F(SensorLines, ReadingStoresTypeNameModeAndLines) {
  select(platformVexI2c);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in1,    gyro,           sensorGyro, modeDegrees)", TLineNumber(9, 0)));
  EXPECT_EQ(rec.getSensorTypeInConfig(0), 49);
  EXPECT_EQ(rec.getSensorModeInConfig(0), 7);
  EXPECT_EQ(name(0), L"gyro");
  EXPECT_EQ(rec.sensorNameLines[0], TLineNumber(9, 0));
  EXPECT_EQ(rec.getSensorDefinitionLine(0), TLineNumber(9, 0));
  EXPECT_EQ(rec.getSecondaryPort(0), -1);
  EXPECT_FALSE(rec.getParseInfo().bNonCanonicalPortNames);

  // A word that is no mode of the type is taken as the secondary port.
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in2, sonar, sensorSONAR_cm, secondaryPort4)"));
  EXPECT_EQ(rec.getSensorTypeInConfig(1), 52);
  EXPECT_EQ(rec.getSensorTypeInConfig(2), 56);
  EXPECT_EQ(rec.getSecondaryPort(1), 3);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in2, sonar, sensorSONAR_cm, modeEdge)"));
  EXPECT_EQ(rec.getSensorModeInConfig(1), 0);
  EXPECT_EQ(rec.getSecondaryPort(1), -1);

  // An empty fourth parameter is an empty mode column.
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in4, temp, sensorI2CTemperature, , secondaryPort2, 9)"));
  EXPECT_EQ(rec.getSensorModeInConfig(3), 0);
  EXPECT_EQ(rec.getSecondaryPort(3), 1);
  EXPECT_EQ(rec.getI2C_Address(3), 9);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in4, temp, sensorI2CTemperature, modeFahrenheit, , 11)"));
  EXPECT_EQ(rec.getSensorModeInConfig(3), 6);
  EXPECT_EQ(rec.getSecondaryPort(3), 1);  // an empty secondary column keeps the port
  EXPECT_EQ(rec.getI2C_Address(3), 11);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in4, temp, sensorI2CTemperature, modeFahrenheit, secondaryPort1)"));
  EXPECT_EQ(rec.getI2C_Address(3), 11);  // a missing I2C column keeps the address
  EXPECT_EQ(rec.getSecondaryPort(3), 0);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in4, temp, sensorI2CTemperature, secondaryPort1, AutoAssign)"));
  EXPECT_EQ(rec.getI2C_Address(3), 0);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in4, temp, sensorI2CTemperature, secondaryPort1, 0x10)"));
  EXPECT_EQ(rec.getI2C_Address(3), 0);  // no number reads as 0
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in4, temp, sensorI2CTemperature, secondaryPort1, 12, modeRate)"));
  EXPECT_EQ(rec.getI2C_Address(3), 12);
  EXPECT_EQ(rec.getSensorModeInConfig(3), 0);  // a mode of another type is no mode

  // A closing parenthesis in the mode or secondary place: the I2C column follows it.
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in7, heat, sensorI2CTemperature, ), 44, 0)"));
  EXPECT_EQ(rec.getI2C_Address(6), 44);
  EXPECT_EQ(rec.getSecondaryPort(6), -1);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in7, heat, sensorI2CTemperature, secondaryPort3, ), 5)"));
  EXPECT_EQ(rec.getI2C_Address(6), 0);
  EXPECT_EQ(rec.getSecondaryPort(6), 2);

  // The writer's "AutoAssign" after an empty secondary column resets an address.
  rec.setI2C_Address(20, 9);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, I2C_1,  ,               sensorQuadEncoderOnI2CPort,    , AutoAssign )"));
  EXPECT_EQ(rec.getSensorTypeInConfig(20), 67);
  EXPECT_EQ(rec.getI2C_Address(20), 0);
  EXPECT_EQ(rec.getSecondaryPort(20), -1);

  // A name given to a port whose reader stores nothing else.
  rec.setSensorModeInConfig(5, 2);
  rec.setSecondaryPort(5, 4);
  rec.setSensorTypeInConfig(5, 1);
  rec.setSensorModeInConfig(5, 2);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, in6, renamed, sensorNone, modeEdge)", TLineNumber(12, 0)));
  EXPECT_EQ(rec.getSensorTypeInConfig(5), 1);
  EXPECT_EQ(rec.getSensorModeInConfig(5), 0);
  EXPECT_EQ(name(5), L"renamed");
  EXPECT_EQ(rec.sensorNameLines[5], TLineNumber(12, 0));
  EXPECT_NE(rec.getSensorDefinitionLine(5), TLineNumber(12, 0));
  EXPECT_EQ(rec.getSecondaryPort(5), 4);
}

TEST_F(SensorLines, ClaimedPinsAndUnknownTypes) {
  select(platformVexI2c);
  rec.setSensorTypeInConfig(8, 1);
  rec.setSensorModeInConfig(8, 2);
  for (const wchar_t *pzType : {L"sensorMotorIOPinPrimary", L"sensorUartPin", L"sensorBoardFixedPin",
                                L"sensorMotorOnSharedPort", L"sensorReservedPin"}) {
    EXPECT_TRUE(parse(std::wstring(L"#pragma config(Sensor, dgtl1, pin, ") + pzType + L")")) << pzType;
    EXPECT_EQ(rec.getSensorTypeInConfig(8), 1) << pzType;
    EXPECT_EQ(rec.getSensorModeInConfig(8), 0) << pzType;
    EXPECT_EQ(name(8), L"") << pzType;
  }

  // A type the catalog does not know is stored as it comes and dropped after reading.
  EXPECT_TRUE(parse(L"#pragma config(Sensor, dgtl2, odd, sensorFromTheFuture, modeEdge)"));
  EXPECT_EQ(rec.getSensorTypeInConfig(9), -1);
  EXPECT_EQ(name(9), L"odd");
  const std::vector<std::wstring> expected = {L"#pragma config(Sensor, dgtl1,  ,               sensorTouch)",
                                              L"#pragma config(Sensor, dgtl2,  odd,            sensorNone)"};
  EXPECT_EQ(sensorLines(rec), expected);
  rec.normalizeValuesAfterParsingConfiguration();
  EXPECT_EQ(rec.getSensorTypeInConfig(9), 0);
}

TEST_F(SensorLines, SecondLineForAPortReplacesItsSensor) {
  select(platformArduino, 8);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, dgtl2, sonar, sensorSONAR_inch)"));
  EXPECT_EQ(rec.getSensorTypeInConfig(9), 56);
  EXPECT_TRUE(parse(L"#pragma config(Sensor, dgtl2, button, sensorTouch)"));
  EXPECT_EQ(rec.getSensorTypeInConfig(8), 1);
  EXPECT_EQ(rec.getSensorTypeInConfig(9), 0);
  EXPECT_EQ(name(8), L"button");

  // A second half named on its own line comes back with its partner's line.
  EXPECT_TRUE(parse(L"#pragma config(Sensor, dgtl4, , sensorSONAR_SecondPort)"));
  EXPECT_TRUE(parse(L"#pragma config(Sensor, dgtl3, sonar, sensorSONAR_mm)"));
  EXPECT_EQ(rec.getSensorTypeInConfig(9), 53);
  EXPECT_EQ(rec.getSensorTypeInConfig(10), 56);
}

TEST_F(SensorLines, RejectedLines) {
  select(platformVexI2c);
  const TConfigurationSettings before = rec.getSettings();
  EXPECT_FALSE(parse(L"#pragma config(Sensor, S1, touch, sensorTouch)"));
  EXPECT_EQ(sError, L"Bad sensor device index 'S1'");
  EXPECT_FALSE(parse(L"#pragma config(Sensor, IN1, touch, sensorTouch)"));
  EXPECT_EQ(sError, L"Bad sensor device index 'IN1'");
  EXPECT_FALSE(parse(L"#pragma config(Sensor)"));
  EXPECT_EQ(sError, L"Bad sensor device index ''");
  EXPECT_EQ(std::memcmp(&before, &rec.getSettings(), sizeof before), 0);

  EXPECT_FALSE(parse(L"#pragma config(RenamedStdModelSensor, in9, touch)"));
  EXPECT_EQ(sError, L"Bad sensor device index 'in9'");

  EXPECT_FALSE(parse(L"#pragma config(RenamedStdModelSensor, in1, bumper)", TLineNumber(6, 0)));
  EXPECT_EQ(sError, L"Renaming standard model sensor name for index 'in1' with no sensor defined");
  EXPECT_EQ(name(0), L"bumper");  // the name stays stored
  EXPECT_EQ(rec.sensorNameLines[0], TLineNumber(6, 0));

  rec.setSensorTypeInConfig(2, 52);
  EXPECT_FALSE(parse(L"#pragma config(RenameSensor, in4, echo)"));
  EXPECT_EQ(sError, L"Renaming standard model sensor name for index 'in4' with no sensor defined");
  EXPECT_TRUE(parse(L"#pragma config(RenameSensor, in3, sonar)"));
  EXPECT_EQ(name(2), L"sonar");
  rec.setSensorTypeInConfig(5, 80);
  EXPECT_FALSE(parse(L"#pragma config(RenamedStdModelSensor, in7, half)"));
  EXPECT_TRUE(parse(L"#pragma config(RenamedStdModelSensor, in6, quad)"));
}

TEST_F(SensorLines, ModeAfterSecondaryAndI2CColumnsReadsBack) {
  select(platformVexI2c);
  // Each line is what the writer gives a sensor with a mode and a secondary
  // port or I2C column.
  struct TCase {
    const wchar_t *pzLine;
    int nPort;
    TSensorModes nMode;
    int nSecondary;
    int nAddress;
  };
  const TCase kCases[] = {
      {L"#pragma config(Sensor, in4,    limit,          sensorLimitSwitch, secondaryPort2, modeEdge)", 3, 2, 1, 0},
      {L"#pragma config(Sensor, in3,    temp,           sensorI2CTemperature,          , 72 , modeCelsius)", 2, 5, -1,
       72},
      {L"#pragma config(Sensor, in5,    color,          sensorI2CColor,                secondaryPort9, 8 , modeRGB)", 4,
       10, 8, 8},
      {L"#pragma config(Sensor, in6,    heat,           sensorI2CTemperature,          , 30 )", 5, 0, -1, 30},
  };
  for (const TCase &c : kCases) {
    EXPECT_TRUE(parse(c.pzLine)) << c.pzLine;
    EXPECT_EQ(rec.getSensorModeInConfig(c.nPort), c.nMode) << c.pzLine;
    EXPECT_EQ(rec.getSecondaryPort(c.nPort), c.nSecondary) << c.pzLine;
    EXPECT_EQ(rec.getI2C_Address(c.nPort), c.nAddress) << c.pzLine;
  }
  std::vector<std::wstring> expected;
  for (int nPort : {2, 3, 4, 5})
    for (const TCase &c : kCases)
      if (c.nPort == nPort) expected.push_back(c.pzLine);
  EXPECT_EQ(sensorLines(rec), expected);
}

TEST_F(SensorLines, RenameLinesForNamesThatDifferFromTheModel) {
  select(platformNxt);
  CHostRobotConfiguration model;
  model.setSensorTypeInConfig(0, 1);
  model.setUserDefinedSensorNameInConfig(0, L"touch", TLineNumber(1, 0));
  model.setSensorTypeInConfig(2, 5);
  model.setUserDefinedSensorNameInConfig(2, L"light", TLineNumber(1, 0));
  COneModelList models(model, L"Bot");
  CStandardModelRobotConfigurationList *pPrevious = pStandardRobotModels;
  pStandardRobotModels = &models;

  rec.setSensorTypeInConfig(0, 1);
  rec.setUserDefinedSensorNameInConfig(0, L"touch", TLineNumber(1, 0));
  rec.setSensorTypeInConfig(2, 5);
  EXPECT_TRUE(parse(L"#pragma config(RenamedStdModelSensor, S3, eye)"));
  rec.sStandardModelName = L"Bot";
  CString sBlock;
  rec.buildSourceCodeForConfiguration(sBlock, false);
  pStandardRobotModels = pPrevious;
  EXPECT_EQ(linesStartingWith(sBlock, L"#pragma config(Renamed"),
            std::vector<std::wstring>{L"#pragma config(RenamedStdModelSensor, S3, eye)"});
}

// Every type each platform offers, on every port its board names, written and
// read back, keeps its type, mode and name, and the secondary port and I2C
// address that its line carries. Types the writer never writes are left out,
// and a two-port type needs a free successor on the platform.
TEST_F(SensorLines, EveryTypeOnEveryPortReadsBack) {
  constexpr TSensorTypes kNeverWritten[] = {56, 57, 58, 59, 60, 61, 62, 64, 65, 66, 81, 91};
  constexpr TSensorTypes kTwoPortTypes[] = {52, 53, 54, 55, 80};
  auto bIn = [](const auto &values, TSensorTypes nType) {
    return std::find(std::begin(values), std::end(values), nType) != std::end(values);
  };
  CHostRobotConfiguration readBack;
  size_t nChecked = 0;
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    select(nKind);
    const bool bTwoPortGroup = nKind == 3 || nKind == 4 || nKind >= 10;
    const int nPorts = pPlatformData->pPlatformParms->nNumbOfSensorPorts;
    auto bValidPort = [this, nPorts](int nPort) { return nPort < nPorts && *rec.getSensorPortString(nPort) != 0; };
    for (TSensorTypes nType = 0; nType <= 91; ++nType) {
      // Only the types the platform offers read back.
      if (bIn(kNeverWritten, nType) || getSensorTypeIndex(getSensorTypeString(nType), true) != nType) continue;
      const bool bTwoPorts = bTwoPortGroup && bIn(kTwoPortTypes, nType);
      for (TSensorModes nMode = 0; nMode <= 10; ++nMode) {
        if (*getSensorModeString(nType, nMode) == 0) continue;
        // A two-port type fills every other port, and the ports between in a second pass.
        const int nStride = bTwoPorts ? 2 : 1;
        for (int nFirst = 0; nFirst < nStride; ++nFirst) {
          SCOPED_TRACE(testing::Message() << "kind " << nKind << " type " << nType << " mode " << nMode);
          rec.clearConfigurationDefinition();
          std::vector<int> ports;
          for (int nPort = nFirst; bValidPort(nPort); nPort += nStride) {
            if (bTwoPorts && !bValidPort(nPort + 1)) break;
            ports.push_back(nPort);
            rec.setUserDefinedSensorNameInConfig(nPort, CString(L's') + std::to_wstring(nPort), TLineNumber(1, 0));
            rec.setSensorTypeInConfig(nPort, nType);
            rec.setSensorModeInConfig(nPort, nMode);
            rec.setSecondaryPort(nPort, nPort % 17 - 1);
            rec.setI2C_Address(nPort, nPort * 5 + 1);
          }
          if (ports.empty()) continue;

          readBack.clearConfigurationDefinition();
          const auto clearedTypes = readBack.getSettings().nSensorTypes;
          for (const std::wstring &sLine : sensorLines(rec)) {
            TTokenizedConfigParms parms;
            ASSERT_EQ(CRobotConfigurationBasic::nTokenizeLine(sLine, parms), lineTypeConfigPragma);
            ASSERT_TRUE(readBack.bParseConfigDefinitionLine(parms, false, TLineNumber(2, 0), L"p.c", sError))
                << sLine << ": " << sError.str();
          }
          for (int nPort : ports) {
            CString sWritten, sRead;
            rec.getUserDefinedSensorNameInConfig(nPort, sWritten);
            readBack.getUserDefinedSensorNameInConfig(nPort, sRead);
            EXPECT_EQ(sRead, sWritten) << nPort;
            // A line without a sensor names the port and leaves its type alone.
            const TSensorTypes nExpected = nType == 0 ? clearedTypes[size_t(nPort)] : nType;
            EXPECT_EQ(readBack.getSensorTypeInConfig(nPort), nExpected) << nPort;
            EXPECT_EQ(readBack.getSensorModeInConfig(nPort), nMode) << nPort;
            if (bTwoPorts) {
              EXPECT_EQ(readBack.getSensorTypeInConfig(nPort + 1), nType == 80 ? 81 : 56) << nPort;
            }
            if (nType == 0) continue;
            EXPECT_EQ(readBack.getSecondaryPort(nPort), rec.getSecondaryPort(nPort)) << nPort;
            if (nType >= 67 && nType <= 72) {
              EXPECT_EQ(readBack.getI2C_Address(nPort), nType >= 69 ? rec.getI2C_Address(nPort) : 0) << nPort;
            }
            ++nChecked;
          }
          if (HasFailure()) return;
        }
      }
    }
  }
  EXPECT_GT(nChecked, 14000u);
}

// The whole road through a program: read, generate, put back.
TEST_F(SensorLines, ProgramRoundTrip) {
  select(platformNxt);
  const std::string sProgram =
      "#pragma config(Sensor, S1,     touch,          sensorTouch, modeEdge)\n"
      "#pragma config(Sensor, S3,     sonar,          sensorSONAR)\n"
      "//*!!Code automatically generated by 'TAVREN' configuration wizard               !!*//\n"
      "\n"
      "task main() {}\n";
  const CProgramText program(sProgram);
  EXPECT_TRUE(readProgramConfiguration(rec, program).empty());
  CString sBlock;
  rec.buildSourceCodeForConfiguration(sBlock, false);
  EXPECT_EQ(replaceConfigurationBlock(program, sBlock), sProgram);
}

}  // namespace
