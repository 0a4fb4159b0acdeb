// UART and I2C ports: their words, default uses, pin maps, claimed pins, and
// the UART_Usage and I2C_Usage lines.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"

namespace {

constexpr TSensorTypes kUartPin = 60;
constexpr TSensorTypes kI2CPin = 61;
constexpr TSensorTypes kTouch = 1;

// Boards of the catalog with a given serial wiring.
constexpr TControllerBoardType kUno = 10;
constexpr TControllerBoardType kMega = 12;
constexpr TControllerBoardType kMegaExpansion = 24;  // reports 8 UARTs

class SerialPorts : public ::testing::Test {
 protected:
  void select(int nKind, TControllerBoardType nBoard = -1) {
    selectHostPlatform(nKind, nBoard);
    rec.clearConfigurationDefinition();
  }
  bool parse(const std::wstring &sLine, CString &sError) {
    TTokenizedConfigParms parms;
    EXPECT_EQ(CRobotConfigurationBasic::nTokenizeLine(sLine, parms), lineTypeConfigPragma) << sLine;
    return rec.bParseConfigDefinitionLine(parms, false, TLineNumber(4, 0), L"program.c", sError);
  }
  // The UART_Usage and I2C_Usage lines of the generated block, each with its line end.
  std::wstring generate() {
    CString sText;
    rec.buildSourceCodeForConfiguration(sText, false);
    std::wstring sLines;
    const std::wstring &s = sText.str();
    for (size_t pos = 0; pos < s.size();) {
      const size_t end = std::min(s.find(L"\r\n", pos), s.size());
      const std::wstring sLine = s.substr(pos, end - pos);
      if (sLine.find(L"_Usage") != std::wstring::npos) sLines += sLine + L"\r\n";
      pos = end + 2;
    }
    return sLines;
  }
  // Reads a whole program the way the host does; returns the messages of the refused lines.
  static std::vector<std::wstring> read(CRobotConfigurationBasic &config, const std::string &sProgram) {
    std::vector<std::wstring> messages;
    for (const TConfigurationDiagnostic &d : readProgramConfiguration(config, CProgramText(sProgram)))
      messages.push_back(d.sMessage.str());
    return messages;
  }
  bool bSettingsUnchanged(const TConfigurationSettings &before) const {
    return std::memcmp(&before, &rec.getSettings(), sizeof before) == 0;
  }

  CHostSelectionScope scope;
  CHostRobotConfiguration rec;
};

struct TExpectedRow {
  uint32_t nMask;
  int32_t nSecondField;
  int32_t nValue;
  const wchar_t *pzKeyword;
  const wchar_t *pzLabel;
  int32_t nRowAttribute;
};

void expectTable(const TDeviceTypeMenuItem *pTable, const std::vector<TExpectedRow> &expected) {
  size_t n = 0;
  for (; pTable[n].nPlatformMask != 0; ++n) {
    SCOPED_TRACE(testing::Message() << "row " << n);
    ASSERT_LT(n, expected.size());
    const TDeviceTypeMenuItem &row = pTable[n];
    const TExpectedRow &e = expected[n];
    EXPECT_EQ(row.nPlatformMask, e.nMask);
    EXPECT_EQ(row.nAttribute, e.nSecondField);
    EXPECT_EQ(row.nSpare1 | row.nSpare2 | row.nSpare3 | row.nSpare4, 0);
    EXPECT_EQ(row.nThirdPartyMask, 0xFE);
    EXPECT_EQ(row.nRowAttribute, e.nRowAttribute);
    EXPECT_EQ(row.nValue, e.nValue);
    EXPECT_EQ(std::wstring(row.pzKeyword), e.pzKeyword);
    if (e.pzLabel) {
      ASSERT_NE(row.pzLabel, nullptr);
      EXPECT_EQ(std::wstring(row.pzLabel), e.pzLabel);
    } else {
      EXPECT_EQ(row.pzLabel, nullptr);
    }
  }
  EXPECT_EQ(n, expected.size());
  EXPECT_EQ(pTable[n].pzKeyword, nullptr);
}

TEST(SerialPortWords, TablesRowByRow) {
  constexpr uint32_t kBoards = 0x29C, kK2 = 0x4, kK3 = 0x8, kK4 = 0x10, kK34 = 0x18;
  expectTable(nUARTTypes, {{kBoards, 0, 0, L"uartNotUsed", L"UART Not Used", 0},
                           {kBoards, 96, 1, L"uartSystemCommPort", L"System Comm Port", 0},
                           {kBoards, 0, 2, L"uartUserControl", L"User Program", 0},
                           {kBoards, 0, 3, L"uartVEXLCD", L"VEX 2x16 LCD", 0},
                           {kBoards, 0, 6, L"uartCMUCAM", L"CMU Camera", 0},
                           {kBoards, 0, 7, L"uartSerialGPS", L"Serial GPS", 0},
                           {kBoards, 0, 4, L"uartXBeeZigBee", L"XBee ZigBee", 0},
                           {kBoards, 0, 5, L"uartXBeeWiFi", L"XBee WiFi", 0},
                           {kBoards, 0, 0, L"NotAssigned", L"UART Not Used", 5},
                           {kBoards, 0, 2, L"User_Control", L"User Program", 5},
                           {kBoards, 0, 3, L"VEX_2x16_LCD", L"VEX 2x16 LCD", 5}});
  expectTable(nUARTBaudRates, {{kK34, 0, 0, L"baudRate1200", L"1.2K bps", 0},
                               {kK34, 0, 1, L"baudRate2400", L"2.4K bps", 0},
                               {kBoards, 0, 2, L"baudRate4800", L"4.8K bps", 0},
                               {kBoards, 0, 3, L"baudRate9600", L"9.6K bps", 0},
                               {kBoards, 0, 5, L"baudRate19200", L"19.2K bps", 0},
                               {kBoards, 0, 7, L"baudRate38400", L"38.4K bps", 0},
                               {kBoards, 0, 8, L"baudRate57600", L"57.6K bps", 0},
                               {kK34, 0, 10, L"baudRate100000", L"100K bps", 0},
                               {kBoards, 0, 11, L"baudRate115200", L"115.2K bps", 0},
                               {kK34, 0, 12, L"baudRate200000", L"200K bps", 0},
                               {kK34, 0, 13, L"baudRate230400", L"230.4K bps", 0},
                               {kK34, 0, 14, L"baudRate250000", L"250K bps", 0}});
  expectTable(nUartIndex, {{kK2, 0, 1, L"UART1", nullptr, 0},
                           {kK3, 0, 1, L"UART1", nullptr, 0},
                           {kK3, 0, 2, L"UART2", nullptr, 0},
                           {kK4, 0, 0, L"UART0", nullptr, 0},
                           {kK4, 0, 1, L"UART1", nullptr, 0},
                           {kK4, 0, 2, L"UART2", nullptr, 0},
                           {kK4, 0, 3, L"UART3", nullptr, 0},
                           {kK4, 0, 4, L"UART4", nullptr, 0},
                           {kK4, 0, 5, L"UART5", nullptr, 0}});
  expectTable(nI2CIndex, {{kK3, 0, 0, L"I2C1", nullptr, 0},
                          {kK4, 0, 0, L"I2C0", nullptr, 0},
                          {kK4, 0, 1, L"I2C1", nullptr, 0},
                          {kK4, 0, 2, L"I2C2", nullptr, 0},
                          {kK4, 0, 3, L"I2C3", nullptr, 0},
                          {kK4, 0, 4, L"I2C4", nullptr, 0},
                          {kBoards, 0, 5, L"I2C5", nullptr, 0}});
  expectTable(nI2CTypes, {{kBoards, 0, 0, L"NotAssigned", nullptr, 0},
                          {kBoards, 0, 1, L"i2cUser", L"User Control", 4},
                          {kBoards, 0, 2, L"i2cSensors", L"Standard Sensors", 0}});
}

TEST_F(SerialPorts, DefaultUsesAndBaudRates) {
  // Mode -> default baud rate; unknown modes run at 4800.
  const std::vector<std::pair<TSerialPortMode, TBaudRate>> kBaud = {
      {0, 2}, {1, 12}, {2, 2}, {3, 5}, {4, 12}, {5, 12}, {6, 11}, {7, 2}, {-1, 2}, {99, 2}};
  for (const auto &[nMode, nBaud] : kBaud) EXPECT_EQ(getDefaultBaudRateForUartMode(nMode), nBaud) << nMode;

  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    SCOPED_TRACE(nKind);
    select(nKind);
    std::array<TSerialPortMode, 6> expected = {0, 0, 0, 0, 0, 0};
    if (nKind == platformVexPic) expected = {1, 3, 0, 0, 0, 0};
    if (nKind == platformVexI2c) expected = {1, 0, 3, 0, 0, 0};
    if (nKind == platformArduino || nKind == platformSharedPorts || nKind == platformKind9) expected[0] = 1;
    for (int port = 0; port < 6; ++port) EXPECT_EQ(rec.getDefaultUartType(port), expected[size_t(port)]) << port;
    EXPECT_EQ(rec.getDefaultUartType(-1), 0);
    EXPECT_EQ(rec.getDefaultUartType(6), 0);
  }

  // On the Arduino platform UART 0 always returns to the system port, whatever port is asked about.
  select(platformArduino, kMega);
  rec.setUARTType(0, 2);
  rec.setBaudRate(0, 3);
  rec.getDefaultUartType(3);
  EXPECT_EQ(rec.getUARTType(0), 1);
  EXPECT_EQ(rec.getBaudRate(0), 12);
  rec.setUARTType(0, 2);
  EXPECT_EQ(generate(), L"");
  EXPECT_EQ(rec.getUARTType(0), 1);

  // Elsewhere asking changes nothing.
  select(platformVexI2c);
  rec.setUARTType(0, 2);
  rec.getDefaultUartType(0);
  EXPECT_EQ(rec.getUARTType(0), 2);
}

TEST_F(SerialPorts, PinMapsBothWays) {
  select(platformArduino, kMega);
  EXPECT_TRUE(rec.bCanSystemUartPortBeReconfigured());
  int nFirst = 0, nSecond = 0, nPort = 0;
  EXPECT_EQ(rec.getUARTPortIOPinDefinition(1), &getCircuitBoardInfo(kMega)->pSerialPorts->uartPins[1]);
  EXPECT_EQ(rec.getI2CPortIOPinDefinition(0), &getCircuitBoardInfo(kMega)->pSerialPorts->i2cPins[0]);
  EXPECT_TRUE(rec.findUartFromPin(34, nPort, nFirst, nSecond));
  EXPECT_EQ(nPort, 1);
  EXPECT_EQ(nFirst, 35);
  EXPECT_EQ(nSecond, 34);
  // A pin of no port: port -1, and the pins those of port 0 (the search ends there).
  EXPECT_FALSE(rec.findUartFromPin(20, nPort, nFirst, nSecond));
  EXPECT_EQ(nPort, -1);
  EXPECT_EQ(nFirst, 16);
  EXPECT_EQ(nSecond, 17);
  for (const int port : {-1, 4, 6}) EXPECT_EQ(rec.getUARTPortIOPinDefinition(port), nullptr) << port;
  EXPECT_EQ(rec.getI2CPortIOPinDefinition(1), nullptr);

  // A board counting 8 UARTs: six usable, the other two have neither pins nor a record.
  select(platformArduino, kMegaExpansion);
  EXPECT_EQ(rec.getMaxNumbOfUARTPorts(), 6);
  for (const int port : {6, 7}) {
    rec.getMapUARTPortToIOPins(port, nFirst, nSecond);
    EXPECT_EQ(nFirst, -1);
    EXPECT_EQ(rec.getUARTPortIOPinDefinition(port), nullptr);
  }

  select(platformNxt);
  EXPECT_EQ(rec.getUARTPortIOPinDefinition(0), nullptr);
  EXPECT_FALSE(rec.bCanSystemUartPortBeReconfigured());
  select(platformVexI2c);
  EXPECT_FALSE(rec.bCanSystemUartPortBeReconfigured());
  EXPECT_NE(rec.getUARTPortIOPinDefinition(2), nullptr);
}

TEST_F(SerialPorts, ClaimingAndReleasingPins) {
  select(platformArduino, kMega);
  // Pin 35 carries a touch sensor and serves as motor 0's encoder.
  rec.setSensorTypeInConfig(35, kTouch);
  rec.setSensorModeInConfig(35, 1);
  rec.settings.motors[0].nEncoderPort = 35;
  rec.settings.motors[0].bEncoder = true;
  rec.setUartIOPinsInConfig(1);
  EXPECT_EQ(rec.getSensorTypeInConfig(35), kUartPin);
  EXPECT_EQ(rec.getSensorModeInConfig(35), 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(34), kUartPin);
  EXPECT_EQ(rec.getMapEncoderToMotor(0), -1);
  EXPECT_FALSE(rec.getMotorEncoderInConfig(0));

  // Claiming again changes nothing.
  TConfigurationSettings before = rec.getSettings();
  rec.setUartIOPinsInConfig(1);
  EXPECT_TRUE(bSettingsUnchanged(before));

  // Releasing frees both pins and the port.
  rec.setUARTType(1, 4);
  rec.setUartIOPinsInConfigNone(1);
  EXPECT_EQ(rec.getSensorTypeInConfig(35), 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(34), 0);
  EXPECT_EQ(rec.getUARTType(1), 0);

  // Releasing a port whose first pin holds something else leaves everything alone.
  rec.setUartIOPinsInConfig(2);
  rec.setUARTType(2, 2);
  rec.setSensorTypeInConfig(33, kTouch);  // takes the port's first pin, which releases the port
  EXPECT_EQ(rec.getUARTType(2), 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(32), 0);
  rec.setUartIOPinsInConfig(3);
  rec.setSensorTypeInConfig(31, kTouch);
  rec.setSensorTypeInConfig(30, kUartPin);
  before = rec.getSettings();
  rec.setUartIOPinsInConfigNone(3);
  EXPECT_TRUE(bSettingsUnchanged(before));

  // I2C: both pins are claimed and released, the mode with them.
  rec.settings.nI2CMode[0] = 1;
  rec.setI2CIOPinsInConfig(0);
  EXPECT_EQ(rec.getSensorTypeInConfig(36), kI2CPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(37), kI2CPin);
  rec.setI2CIOPinsInConfigNone(0);
  EXPECT_EQ(rec.getSensorTypeInConfig(36), 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(37), 0);
  EXPECT_EQ(rec.getSettings().nI2CMode[0], 0);

  // Ports outside the board change nothing.
  before = rec.getSettings();
  for (const int port : {-1, 4, 6, 1000}) {
    rec.setUartIOPinsInConfig(port);
    rec.setUartIOPinsInConfigNone(port);
    rec.setI2CIOPinsInConfig(port);
    rec.setI2CIOPinsInConfigNone(port);
  }
  EXPECT_TRUE(bSettingsUnchanged(before));

  // Ports wired to no pins claim nothing.
  select(platformVexI2c);
  before = rec.getSettings();
  rec.setUartIOPinsInConfig(1);
  rec.setI2CIOPinsInConfig(0);
  EXPECT_TRUE(bSettingsUnchanged(before));
}

TEST_F(SerialPorts, ReadingUartLines) {
  select(platformArduino, kMega);
  rec.setSensorTypeInConfig(34, kTouch);
  CString sError(L"earlier");
  // The pins always come from the board; the IOPins words of the line are ignored.
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART1, uartXBeeZigBee, baudRate57600, IOPins, anlg0, anlg1)", sError));
  EXPECT_EQ(sError, L"earlier");
  EXPECT_EQ(rec.getUARTType(1), 4);
  EXPECT_EQ(rec.getBaudRate(1), 8);
  EXPECT_EQ(rec.getSensorTypeInConfig(35), kUartPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(34), kUartPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(0), 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(1), 0);

  // "uartNotUsed" claims the pins too; older keywords and unknown words are taken as they look up.
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART2, uartNotUsed, baudRate4800)", sError));
  EXPECT_EQ(rec.getSensorTypeInConfig(33), kUartPin);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART3, User_Control, baudRateFast)", sError));
  EXPECT_EQ(rec.getUARTType(3), 2);
  EXPECT_EQ(rec.getBaudRate(3), -1);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART3, uartSomething)", sError));
  EXPECT_EQ(rec.getUARTType(3), -1);
  EXPECT_EQ(rec.getBaudRate(3), -1);

  // Ports the board lacks, and words of no port.
  for (const wchar_t *pzPort : {L"UART4", L"UART5", L"uart1", L"UART6", L"Uart0", L"x"}) {
    EXPECT_FALSE(parse(std::wstring(L"#pragma config(UART_Usage, ") + pzPort + L", uartUserControl, baudRate9600)",
                       sError));
    EXPECT_EQ(sError.str(), std::wstring(L"Bad UART Index '") + pzPort + L"'");
  }
  EXPECT_FALSE(parse(L"#pragma config(UART_Usage)", sError));
  EXPECT_EQ(sError, L"Bad UART Index ''");

  // A board counting 8 UARTs reads the first six.
  select(platformArduino, kMegaExpansion);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART5, uartCMUCAM, baudRate115200)", sError));
  EXPECT_EQ(rec.getSensorTypeInConfig(51), kUartPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(50), kUartPin);

  // Port words belong to their platform: VEX I2C names UART1 and UART2 only.
  select(platformVexI2c);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART2, uartUserControl, baudRate1200)", sError));
  EXPECT_EQ(rec.getUARTType(2), 2);
  EXPECT_EQ(rec.getBaudRate(2), 0);
  EXPECT_FALSE(parse(L"#pragma config(UART_Usage, UART0, uartUserControl, baudRate9600)", sError));
  EXPECT_EQ(sError, L"Bad UART Index 'UART0'");
  // Baud-rate words of other platforms are unknown here.
  select(platformVexPic);
  EXPECT_FALSE(parse(L"#pragma config(UART_Usage, UART2, uartUserControl, baudRate9600)", sError));
  EXPECT_EQ(sError, L"Bad UART Index 'UART2'");
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART1, uartUserControl, baudRate1200)", sError));
  EXPECT_EQ(rec.getBaudRate(1), -1);

  // Platforms whose board has no UART.
  for (const auto &[nKind, pzName] : {std::pair<int, const wchar_t *>{platformNxt, L"NXT"},
                                      {platformBoard10, L"Maker Board 10"},
                                      {platformNone, L"None"}}) {
    select(nKind);
    EXPECT_FALSE(parse(L"#pragma config(UART_Usage, UART1, uartUserControl, baudRate9600)", sError));
    EXPECT_EQ(sError.str(), std::wstring(L"Configurable UART ports are not supported on platform '") + pzName + L"'");
  }
}

TEST_F(SerialPorts, ReadingI2CLines) {
  select(platformArduino, kUno);
  CString sError;
  rec.setSensorTypeInConfig(4, kTouch);
  EXPECT_TRUE(parse(L"#pragma config(I2C_Usage, I2C0, i2cUser, IOPins, dgtl2, dgtl3, more)", sError));
  EXPECT_EQ(rec.getSettings().nI2CMode[0], 1);
  EXPECT_EQ(rec.getSensorTypeInConfig(4), kI2CPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(5), kI2CPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(8), 0);
  EXPECT_TRUE(parse(L"#pragma config(I2C_Usage, I2C0, i2cBogus)", sError));
  EXPECT_EQ(rec.getSettings().nI2CMode[0], -1);
  EXPECT_FALSE(parse(L"#pragma config(I2C_Usage, I2C1, i2cUser)", sError));
  EXPECT_EQ(sError, L"Bad I2C Port Index 'I2C1'");

  // A sensor taking an I2C pin releases the port and its other pin.
  EXPECT_TRUE(parse(L"#pragma config(I2C_Usage, I2C0, i2cUser)", sError));
  rec.setSensorTypeInConfig(5, kTouch);
  EXPECT_EQ(rec.getSettings().nI2CMode[0], 0);
  EXPECT_EQ(rec.getSensorTypeInConfig(4), 0);

  select(platformVexI2c);
  EXPECT_TRUE(parse(L"#pragma config(I2C_Usage, I2C1, i2cSensors)", sError));
  EXPECT_EQ(rec.getSettings().nI2CMode[0], 2);
  EXPECT_FALSE(parse(L"#pragma config(I2C_Usage, I2C0, i2cSensors)", sError));
  EXPECT_EQ(sError, L"Bad I2C Port Index 'I2C0'");
  EXPECT_FALSE(parse(L"#pragma config(I2C_Usage, I2C5, i2cSensors)", sError));
  EXPECT_EQ(sError, L"Bad I2C Port Index 'I2C5'");

  select(platformVexPic);
  EXPECT_FALSE(parse(L"#pragma config(I2C_Usage, I2C5, i2cUser)", sError));
  EXPECT_EQ(sError, L"Configurable I2C ports are not supported on platform 'VEX PIC'");
}

TEST_F(SerialPorts, WritingLines) {
  select(platformArduino, kMega);
  rec.setUARTType(1, 5);
  rec.setBaudRate(1, 11);
  rec.setUartIOPinsInConfig(1);
  rec.setUARTType(3, 6);
  rec.setBaudRate(3, 11);  // the default rate of the mode, still not the default use
  rec.setBaudRate(2, 13);  // a rate alone on an unused port is not written
  rec.settings.nI2CMode[0] = 1;
  const std::wstring sText = generate();
  EXPECT_EQ(sText, L"#pragma config(UART_Usage, UART1, uartXBeeWiFi, baudRate115200, IOPins, dgtl19, dgtl18)\r\n"
                   L"#pragma config(UART_Usage, UART3, uartCMUCAM, baudRate115200, IOPins, dgtl15, dgtl14)\r\n"
                   L"#pragma config(I2C_Usage, I2C0, i2cUser, IOPins, dgtl20, dgtl21)\r\n");

  // What was written reads back to the same configuration, apart from the rate of the unused port.
  rec.setBaudRate(2, 2);
  rec.setI2CIOPinsInConfig(0);
  rec.setUartIOPinsInConfig(3);
  CHostRobotConfiguration copy;
  EXPECT_EQ(read(copy, CString(sText).toUtf8()), std::vector<std::wstring>{});
  EXPECT_EQ(copy.compareConfiguration(rec), configCompareSame);

  // VEX I2C: pins without names, and the I2C port without pins.
  select(platformVexI2c);
  rec.setUARTType(1, 3);
  rec.setBaudRate(1, 5);
  rec.setUARTType(2, 0);
  rec.setBaudRate(2, 2);
  rec.settings.nI2CMode[0] = 2;
  EXPECT_EQ(generate(), L"#pragma config(UART_Usage, UART1, uartVEXLCD, baudRate19200, IOPins, None, None)\r\n"
                        L"#pragma config(UART_Usage, UART2, uartNotUsed, baudRate4800, IOPins, None, None)\r\n"
                        L"#pragma config(I2C_Usage, I2C1, i2cSensors)\r\n");

  // A changed rate is written for a port whose default use is not "not used",
  // also for the system port, which has no word of its own on this platform.
  select(platformVexPic);
  rec.setBaudRate(1, 3);
  rec.setBaudRate(0, 3);
  rec.setUARTType(0, 2);
  EXPECT_EQ(generate(), L"#pragma config(UART_Usage, , uartUserControl, baudRate9600, IOPins, None, None)\r\n"
                        L"#pragma config(UART_Usage, UART1, uartVEXLCD, baudRate9600, IOPins, None, None)\r\n");

  // The I2C line exists on the VEX I2C, Arduino and maker platforms only.
  selectHostPlatform(platformSharedPorts, kUno);
  rec.clearConfigurationDefinition();
  rec.settings.nI2CMode[0] = 1;
  EXPECT_EQ(generate(), L"");
}

TEST_F(SerialPorts, MultiRobotNeedsAnXBeeOnAnExistingUart) {
  select(platformVexPic);  // two UARTs
  EXPECT_FALSE(rec.checkUartAssignmentForMultiRobot(TLineNumber(1, 0)));
  rec.setUARTType(1, 5);
  EXPECT_TRUE(rec.checkUartAssignmentForMultiRobot(TLineNumber(1, 0)));
  rec.setUARTType(1, 4);
  EXPECT_TRUE(rec.checkUartAssignmentForMultiRobot(emptyLineNumber));
  rec.setUARTType(1, 2);
  for (int port = 2; port < 6; ++port) rec.setUARTType(port, 4);
  EXPECT_FALSE(rec.checkUartAssignmentForMultiRobot(emptyLineNumber));

  select(platformNxt);
  rec.setUARTType(0, 5);
  EXPECT_FALSE(rec.checkUartAssignmentForMultiRobot(emptyLineNumber));
}

}  // namespace
