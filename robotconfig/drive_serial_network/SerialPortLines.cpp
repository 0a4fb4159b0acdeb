// UART and I2C ports in the configuration: claiming their pins as sensor
// ports, and the UART_Usage and I2C_Usage lines.
#include <algorithm>
#include <array>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// Sensor types that mark a sensor port as the pin of a serial port.
constexpr TSensorTypes kSensorUartPin = 60;
constexpr TSensorTypes kSensorI2CPin = 61;

// The UART modes that carry an XBee radio.
constexpr std::array<TSerialPortMode, 2> kXBeeUartModes = {4, 5};

constexpr TSerialPortMode kUartNotUsed = 0;

// The word that introduces the pin names of a generated line.
constexpr const wchar_t *kIOPinsWord = L"IOPins";

typedef void (CRobotConfigurationBasic::*TClaimPins)(int nPort);

// What the UART_Usage and I2C_Usage lines have in common, per keyword.
struct TSerialLineKind {
  TConfigTypes nType;
  const wchar_t *pzNotSupported;  ///< %s: the platform's name
  const wchar_t *pzBadIndex;      ///< %s: the port word as written
  const TDeviceTypeMenuItem *pIndexWords;
  const TDeviceTypeMenuItem *pModeWords;
  const TDeviceTypeMenuItem *pBaudWords;  ///< null: the line has no baud rate
  int32_t TSerialPortsInfo::*pPortCount;
  std::array<int32_t, kMaxNumbOfSerialPorts> TConfigurationSettings::*pModes;
  std::array<int32_t, kMaxNumbOfSerialPorts> TConfigurationSettings::*pBaudRates;  ///< null with pBaudWords
  TClaimPins pClaimPins;
};

const std::array<TSerialLineKind, 2> kSerialLineKinds = {{
    {configTypeUartUsage, L"Configurable UART ports are not supported on platform '%s'", L"Bad UART Index '%s'",
     nUartIndex, nUARTTypes, nUARTBaudRates, &TSerialPortsInfo::nNumbOfUARTs, &TConfigurationSettings::nUARTMode,
     &TConfigurationSettings::nUARTBaudRate, &CRobotConfigurationBasic::setUartIOPinsInConfig},
    {configTypeI2CUsage, L"Configurable I2C ports are not supported on platform '%s'", L"Bad I2C Port Index '%s'",
     nI2CIndex, nI2CTypes, nullptr, &TSerialPortsInfo::nNumbOfI2Cs, &TConfigurationSettings::nI2CMode, nullptr,
     &CRobotConfigurationBasic::setI2CIOPinsInConfig},
}};

// Platform kinds on which I2C_Usage lines are written, and whether they name the pins.
struct TI2CLineStyle {
  int nPlatformKind;
  bool bWithPins;
};
constexpr std::array<TI2CLineStyle, 7> kI2CLineStyles = {{
    {platformVexI2c, false},
    {platformArduino, true},
    {platformBoard10, true},
    {platformBoard11, true},
    {platformBoard12, true},
    {platformBoard13, true},
    {platformBoard14, true},
}};

// The line style of the current platform kind; null when it writes no I2C_Usage lines.
const TI2CLineStyle *i2cLineStyleOf(int nPlatformKind) {
  for (const TI2CLineStyle &style : kI2CLineStyles)
    if (style.nPlatformKind == nPlatformKind) return &style;
  return nullptr;
}

// Number of ports of one kind the board has, capped at the record's six; 0 without a board.
int serialPortCount(TControllerBoardType nBoard, int32_t TSerialPortsInfo::*pCount) {
  const TCktBoardInfo *pBoard = getCircuitBoardInfo(nBoard);
  if (!pBoard || !pBoard->pSerialPorts) return 0;
  return std::clamp(pBoard->pSerialPorts->*pCount, 0, kMaxNumbOfSerialPorts);
}

// The ", IOPins, first, second" part of a generated line.
CString pinSuffix(int nFirstPin, int nSecondPin, TControllerBoardType nBoard) {
  CString sSuffix;
  sSuffix.Format(L", %s, %s, %s", kIOPinsWord, getSensorPortString(nFirstPin, nBoard),
                 getSensorPortString(nSecondPin, nBoard));
  return sSuffix;
}

}  // namespace

void CRobotConfigurationBasic::setUartIOPinsInConfig(int nPort) {
  int nFirstPin = -1, nSecondPin = -1;
  getMapUARTPortToIOPins(nPort, nFirstPin, nSecondPin);
  for (const int nPin : {nFirstPin, nSecondPin})
    if (bIsSensorIndex(nPin) && settings.nSensorTypes[size_t(nPin)] != kSensorUartPin)
      setSensorTypeInConfig(nPin, kSensorUartPin);
}

void CRobotConfigurationBasic::setI2CIOPinsInConfig(int nPort) {
  int nFirstPin = -1, nSecondPin = -1;
  getMapI2CPortToIOPins(nPort, nFirstPin, nSecondPin);
  for (const int nPin : {nFirstPin, nSecondPin})
    if (bIsSensorIndex(nPin) && settings.nSensorTypes[size_t(nPin)] != kSensorI2CPin)
      setSensorTypeInConfig(nPin, kSensorI2CPin);
}

void CRobotConfigurationBasic::setUartIOPinsInConfigNone(int nPort) {
  int nFirstPin = -1, nSecondPin = -1;
  getMapUARTPortToIOPins(nPort, nFirstPin, nSecondPin);
  // Releasing the first pin finds the port from it, which frees the second pin and the port's mode.
  if (!bIsSensorIndex(nFirstPin) || settings.nSensorTypes[size_t(nFirstPin)] != kSensorUartPin) return;
  removeMotorEncodersForSensorPort(nFirstPin);
  removeSensorTypeInConfig(nFirstPin);
  clearSensorTypeAndModeInConfig(nFirstPin);
  calculateI2CUsage();
}

void CRobotConfigurationBasic::setI2CIOPinsInConfigNone(int nPort) {
  int nFirstPin = -1, nSecondPin = -1;
  getMapI2CPortToIOPins(nPort, nFirstPin, nSecondPin);
  for (const int nPin : {nFirstPin, nSecondPin}) {
    if (!bIsSensorIndex(nPin) || settings.nSensorTypes[size_t(nPin)] != kSensorI2CPin) continue;
    removeMotorEncodersForSensorPort(nPin);
    removeSensorTypeInConfig(nPin);
    clearSensorTypeAndModeInConfig(nPin);
    calculateI2CUsage();
  }
}

bool CRobotConfigurationBasic::checkUartAssignmentForMultiRobot(TLineNumber) const {
  const int nPorts = getMaxNumbOfUARTPorts();
  for (int port = 0; port < nPorts; ++port) {
    const TSerialPortMode nMode = settings.nUARTMode[size_t(port)];
    if (std::find(kXBeeUartModes.begin(), kXBeeUartModes.end(), nMode) != kXBeeUartModes.end()) return true;
  }
  return false;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineUartOrI2C(TConfigTypes nType,
                                                                  const TTokenizedConfigParms &parms, bool,
                                                                  TLineNumber, CString &sError) {
  const auto pKind = std::find_if(kSerialLineKinds.begin(), kSerialLineKinds.end(),
                                  [nType](const TSerialLineKind &kind) { return kind.nType == nType; });
  if (pKind == kSerialLineKinds.end()) return false;

  const int nPorts = serialPortCount(settings.nCircuitBoardType, pKind->pPortCount);
  if (nPorts < 1) {
    const wchar_t *pzPlatform =
        (pPlatformData && pPlatformData->pPlatformParms) ? pPlatformData->pPlatformParms->pPlatformName : L"";
    sError.Format(pKind->pzNotSupported, pzPlatform);
    return false;
  }
  const int nPort = getTypedefIndex(pKind->pIndexWords, parms.sParms[1], true);
  if (nPort < 0 || nPort >= nPorts) {
    sError.Format(pKind->pzBadIndex, parms.sParms[1]);
    return false;
  }
  // Words missing from the tables are kept as -1 rather than refused.
  (settings.*(pKind->pModes))[size_t(nPort)] = getTypedefIndex(pKind->pModeWords, parms.sParms[2], true);
  if (pKind->pBaudWords && pKind->pBaudRates)
    (settings.*(pKind->pBaudRates))[size_t(nPort)] = getTypedefIndex(pKind->pBaudWords, parms.sParms[3], true);
  (this->*(pKind->pClaimPins))(nPort);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForSerialPorts() {
  const TControllerBoardType nBoard = settings.nCircuitBoardType;
  bool bWritten = false;
  CString sLine;
  int nFirstPin = -1, nSecondPin = -1;

  const int nUarts = serialPortCount(nBoard, &TSerialPortsInfo::nNumbOfUARTs);
  for (int port = 0; port < nUarts; ++port) {
    const TSerialPortMode nDefault = getDefaultUartType(port);
    const TSerialPortMode nMode = settings.nUARTMode[size_t(port)];
    const TBaudRate nBaudRate = settings.nUARTBaudRate[size_t(port)];
    if (nMode == nDefault && (nDefault == kUartNotUsed || nBaudRate == getDefaultBaudRateForUartMode(nDefault)))
      continue;
    // A port without a word of its own here (the VEX system port) is still
    // written, so that a changed baud rate stays visible in the program.
    const wchar_t *pzPort = getTypedefEnumString(nUartIndex, port, -1);
    getMapUARTPortToIOPins(port, nFirstPin, nSecondPin);
    sLine.Format(L"#pragma config(%s, %s, %s, %s%s)", TConfigTypeDefns::getConfigTypeName(configTypeUartUsage),
                 pzPort, getTypedefEnumString(nUARTTypes, nMode, -1),
                 getTypedefEnumString(nUARTBaudRates, nBaudRate, -1), pinSuffix(nFirstPin, nSecondPin, nBoard));
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }

  const TI2CLineStyle *pStyle = i2cLineStyleOf(pToggles->getPlatformKind());
  const int nI2Cs = pStyle ? serialPortCount(nBoard, &TSerialPortsInfo::nNumbOfI2Cs) : 0;
  for (int port = 0; port < nI2Cs; ++port) {
    const int32_t nMode = settings.nI2CMode[size_t(port)];
    if (nMode == 0) continue;
    const wchar_t *pzPort = getTypedefEnumString(nI2CIndex, port, -1);
    CString sSuffix;
    if (pStyle->bWithPins) {
      getMapI2CPortToIOPins(port, nFirstPin, nSecondPin);
      sSuffix = pinSuffix(nFirstPin, nSecondPin, nBoard);
    }
    sLine.Format(L"#pragma config(%s, %s, %s%s)", TConfigTypeDefns::getConfigTypeName(configTypeI2CUsage), pzPort,
                 getTypedefEnumString(nI2CTypes, nMode, -1), sSuffix);
    addSourceLineToConfiguration(sLine);
    bWritten = true;
  }
  return bWritten;
}
