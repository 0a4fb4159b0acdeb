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

TEST_F(SerialPorts, PinMapsAndClaimedPins) {
  select(platformArduino, kMega);
  EXPECT_TRUE(rec.bCanSystemUartPortBeReconfigured());
  int nFirst = 0, nSecond = 0, nPort = 0;
  EXPECT_EQ(rec.getUARTPortIOPinDefinition(1), &getCircuitBoardInfo(kMega)->pSerialPorts->uartPins[1]);
  EXPECT_TRUE(rec.findUartFromPin(34, nPort, nFirst, nSecond));
  EXPECT_EQ(std::vector<int>({nPort, nFirst, nSecond}), std::vector<int>({1, 35, 34}));
  // A pin of no port: port -1, and the pins those of port 0 (the search ends there).
  EXPECT_FALSE(rec.findUartFromPin(20, nPort, nFirst, nSecond));
  EXPECT_EQ(std::vector<int>({nPort, nFirst, nSecond}), std::vector<int>({-1, 16, 17}));
  for (const int port : {-1, 4, 6}) EXPECT_EQ(rec.getUARTPortIOPinDefinition(port), nullptr) << port;
  EXPECT_EQ(rec.getI2CPortIOPinDefinition(1), nullptr);

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
  // Releasing frees both pins and the port.
  rec.setUARTType(1, 4);
  rec.setUartIOPinsInConfigNone(1);
  EXPECT_EQ(rec.getSensorTypeInConfig(35) + rec.getSensorTypeInConfig(34) + rec.getUARTType(1), 0);
  // Releasing a port whose first pin holds something else leaves everything alone.
  rec.setUartIOPinsInConfig(3);
  rec.setSensorTypeInConfig(31, kTouch);
  rec.setSensorTypeInConfig(30, kUartPin);
  TConfigurationSettings before = rec.getSettings();
  rec.setUartIOPinsInConfigNone(3);
  EXPECT_TRUE(bSettingsUnchanged(before));
  // I2C: both pins are claimed and released, the mode with them.
  rec.settings.nI2CMode[0] = 1;
  rec.setI2CIOPinsInConfig(0);
  EXPECT_EQ(rec.getSensorTypeInConfig(36), kI2CPin);
  EXPECT_EQ(rec.getSensorTypeInConfig(37), kI2CPin);
  rec.setI2CIOPinsInConfigNone(0);
  EXPECT_EQ(rec.getSensorTypeInConfig(36) + rec.getSensorTypeInConfig(37) + rec.getSettings().nI2CMode[0], 0);
  // Ports outside the board change nothing.
  before = rec.getSettings();
  for (const int port : {-1, 4, 6, 1000}) {
    rec.setUartIOPinsInConfig(port);
    rec.setUartIOPinsInConfigNone(port);
    rec.setI2CIOPinsInConfig(port);
    rec.setI2CIOPinsInConfigNone(port);
  }
  EXPECT_TRUE(bSettingsUnchanged(before));

  // A board counting 8 UARTs: six usable, the other two have neither pins nor a record.
  select(platformArduino, kMegaExpansion);
  EXPECT_EQ(rec.getMaxNumbOfUARTPorts(), 6);
  rec.getMapUARTPortToIOPins(7, nFirst, nSecond);
  EXPECT_EQ(nFirst, -1);
  EXPECT_EQ(rec.getUARTPortIOPinDefinition(6), nullptr);
  // Ports wired to no pins claim nothing.
  select(platformVexI2c);
  EXPECT_FALSE(rec.bCanSystemUartPortBeReconfigured());
  before = rec.getSettings();
  rec.setUartIOPinsInConfig(1);
  rec.setI2CIOPinsInConfig(0);
  EXPECT_TRUE(bSettingsUnchanged(before));
  rec.settings.nCircuitBoardType = 99;  // no board of the catalog: no port, no pins
  EXPECT_FALSE(rec.findUartFromPin(3, nPort, nFirst, nSecond));
  EXPECT_EQ(std::vector<int>({nPort, nFirst, nSecond}), std::vector<int>({-1, -1, -1}));
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

  // "uartNotUsed" claims the pins too; older keywords and unknown words are taken as they look up.
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART2, uartNotUsed, baudRate4800)", sError));
  EXPECT_EQ(rec.getSensorTypeInConfig(33), kUartPin);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART3, User_Control, baudRateFast)", sError));
  EXPECT_EQ(rec.getUARTType(3), 2);
  EXPECT_EQ(rec.getBaudRate(3), -1);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART3, uartSomething)", sError));
  EXPECT_EQ(rec.getUARTType(3), -1);

  // A board counting 8 UARTs reads the first six.
  select(platformArduino, kMegaExpansion);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART5, uartCMUCAM, baudRate115200)", sError));
  EXPECT_EQ(rec.getSensorTypeInConfig(51), kUartPin);
  // Port and baud-rate words belong to their platform.
  select(platformVexI2c);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART2, uartUserControl, baudRate1200)", sError));
  EXPECT_EQ(rec.getBaudRate(2), 0);
  select(platformVexPic);
  EXPECT_TRUE(parse(L"#pragma config(UART_Usage, UART1, uartUserControl, baudRate1200)", sError));
  EXPECT_EQ(rec.getBaudRate(1), -1);

  struct TRefused {
    int nKind;
    TControllerBoardType nBoard;
    const wchar_t *pzPort, *pzMessage;
  } kRefused[] = {
      {platformArduino, kMega, L"UART4", L"Bad UART Index 'UART4'"},
      {platformArduino, kMega, L"uart1", L"Bad UART Index 'uart1'"},
      {platformArduino, kMega, L"", L"Bad UART Index ''"},
      {platformVexI2c, -1, L"UART0", L"Bad UART Index 'UART0'"},
      {platformVexPic, -1, L"UART2", L"Bad UART Index 'UART2'"},
      {platformNxt, -1, L"UART1", L"Configurable UART ports are not supported on platform 'NXT'"},
      {platformBoard10, -1, L"UART1", L"Configurable UART ports are not supported on platform 'Maker Board 10'"},
  };
  for (const TRefused &c : kRefused) {
    select(c.nKind, c.nBoard);
    EXPECT_FALSE(parse(std::wstring(L"#pragma config(UART_Usage, ") + c.pzPort + L", uartUserControl, baudRate9600)",
                       sError));
    EXPECT_EQ(sError.str(), c.pzMessage);
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
