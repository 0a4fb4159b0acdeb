#include <algorithm>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/Platform.h"

namespace {

// UART modes and baud-rate codes with a role in the defaults.
constexpr TSerialPortMode kUartNotUsed = 0;
constexpr TSerialPortMode kUartSystemCommPort = 1;
constexpr TSerialPortMode kUartVEXLCD = 3;
constexpr TBaudRate kBaudRate200000 = 12;

struct TUartDefaults {
  int nPlatformKind;
  std::array<TSerialPortMode, kMaxNumbOfSerialPorts> nModes;
};

// Default use of each UART by platform kind; kinds not listed use none.
constexpr TUartDefaults kUartDefaults[] = {
    {platformVexPic, {kUartSystemCommPort, kUartVEXLCD, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed}},
    {platformVexI2c, {kUartSystemCommPort, kUartNotUsed, kUartVEXLCD, kUartNotUsed, kUartNotUsed, kUartNotUsed}},
    {platformArduino, {kUartSystemCommPort, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed}},
    {platformSharedPorts, {kUartSystemCommPort, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed}},
    {platformKind9, {kUartSystemCommPort, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed, kUartNotUsed}},
};

struct TModeBaudRate {
  TSerialPortMode nMode;
  TBaudRate nBaudRate;
};

// Default baud rate of each UART mode; every other mode runs at 4800 baud.
constexpr TModeBaudRate kDefaultBaudRates[] = {{1, 12}, {4, 12}, {5, 12}, {3, 5}, {6, 11}};
constexpr TBaudRate kBaudRate4800 = 2;

// Serial-port description of a board, or null.
const TSerialPortsInfo *serialPortsOf(TControllerBoardType nBoard) {
  const TCktBoardInfo *pBoard = getCircuitBoardInfo(nBoard);
  return pBoard ? pBoard->pSerialPorts : nullptr;
}

// The board's record of port `nPort` out of `nCount` ports; null when there is no such port.
const TSerialPortIOPinsDefn *portRecord(const std::array<TSerialPortIOPinsDefn, 6> &pins, int nCount, int nPort) {
  // A board may count more ports than it describes; only described ones have a record.
  if (nPort < 0 || nPort >= nCount || nPort >= static_cast<int>(pins.size())) return nullptr;
  return &pins[size_t(nPort)];
}

// Pins of port `nPort` out of `nCount` ports; both -1 when there is no such port.
void pinsOfPort(const std::array<TSerialPortIOPinsDefn, 6> &pins, int nCount, int nPort, int &nFirstPin,
                int &nSecondPin) {
  const TSerialPortIOPinsDefn *pRecord = portRecord(pins, nCount, nPort);
  nFirstPin = pRecord ? pRecord->nFirstPin : -1;
  nSecondPin = pRecord ? pRecord->nSecondPin : -1;
}

// The port (searched from the highest) that uses `nPin`.
bool findPortFromPin(const std::array<TSerialPortIOPinsDefn, 6> &pins, int nCount, int nPin, int &nPort,
                     int &nFirstPin, int &nSecondPin) {
  for (nPort = std::min(nCount, kMaxNumbOfSerialPorts) - 1; nPort >= 0; --nPort) {
    pinsOfPort(pins, nCount, nPort, nFirstPin, nSecondPin);
    if (nPin == nSecondPin || nPin == nFirstPin) return true;
  }
  return false;
}

}  // namespace

TBaudRate getDefaultBaudRateForUartMode(TSerialPortMode nMode) {
  for (const TModeBaudRate &row : kDefaultBaudRates)
    if (row.nMode == nMode) return row.nBaudRate;
  return kBaudRate4800;
}

TSerialPortMode CRobotConfigurationBasic::getDefaultUartType(int nPort) {
  const int nKind = pToggles->getPlatformKind();
  // The system port of these boards always returns to its fixed use.
  if (nKind == platformArduino) {
    settings.nUARTMode[0] = kUartSystemCommPort;
    settings.nUARTBaudRate[0] = kBaudRate200000;
  }
  if (nPort < 0 || nPort >= kMaxNumbOfSerialPorts) return kUartNotUsed;
  for (const TUartDefaults &row : kUartDefaults)
    if (row.nPlatformKind == nKind) return row.nModes[size_t(nPort)];
  return kUartNotUsed;
}

void CRobotConfigurationBasic::clearUartAndI2CDefinition() { clearUartAndI2CDefinitionLowLevel(); }

void CRobotConfigurationBasic::clearUartAndI2CDefinitionLowLevel() {
  for (int port = 0; port < kMaxNumbOfSerialPorts; ++port) {
    const TSerialPortMode nMode = getDefaultUartType(port);
    settings.nUARTMode[size_t(port)] = nMode;
    settings.nUARTBaudRate[size_t(port)] = getDefaultBaudRateForUartMode(nMode);
  }
  settings.nI2CMode.fill(0);
}

int CRobotConfigurationBasic::getMaxNumbOfUARTPorts() const {
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts ? std::clamp(pPorts->nNumbOfUARTs, 0, kMaxNumbOfSerialPorts) : 0;
}

int CRobotConfigurationBasic::getMaxNumbOfI2CPorts() const {
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts ? std::clamp(pPorts->nNumbOfI2Cs, 0, kMaxNumbOfSerialPorts) : 0;
}

void CRobotConfigurationBasic::getMapUARTPortToIOPins(int nPort, int &nFirstPin, int &nSecondPin) const {
  nFirstPin = nSecondPin = -1;
  if (const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType))
    pinsOfPort(pPorts->uartPins, pPorts->nNumbOfUARTs, nPort, nFirstPin, nSecondPin);
}

void CRobotConfigurationBasic::getMapI2CPortToIOPins(int nPort, int &nFirstPin, int &nSecondPin) const {
  nFirstPin = nSecondPin = -1;
  if (const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType))
    pinsOfPort(pPorts->i2cPins, pPorts->nNumbOfI2Cs, nPort, nFirstPin, nSecondPin);
}

bool CRobotConfigurationBasic::findUartFromPin(int nPin, int &nPort, int &nFirstPin, int &nSecondPin) const {
  nPort = nFirstPin = nSecondPin = -1;
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts && findPortFromPin(pPorts->uartPins, pPorts->nNumbOfUARTs, nPin, nPort, nFirstPin, nSecondPin);
}

bool CRobotConfigurationBasic::findI2CFromPin(int nPin, int &nPort, int &nFirstPin, int &nSecondPin) const {
  nPort = nFirstPin = nSecondPin = -1;
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts && findPortFromPin(pPorts->i2cPins, pPorts->nNumbOfI2Cs, nPin, nPort, nFirstPin, nSecondPin);
}

bool CRobotConfigurationBasic::bCanSystemUartPortBeReconfigured() const {
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts && pPorts->bCanSystemUartBeReconfigured;
}

const TSerialPortIOPinsDefn *CRobotConfigurationBasic::getUARTPortIOPinDefinition(int nPort) const {
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts ? portRecord(pPorts->uartPins, pPorts->nNumbOfUARTs, nPort) : nullptr;
}

const TSerialPortIOPinsDefn *CRobotConfigurationBasic::getI2CPortIOPinDefinition(int nPort) const {
  const TSerialPortsInfo *pPorts = serialPortsOf(settings.nCircuitBoardType);
  return pPorts ? portRecord(pPorts->i2cPins, pPorts->nNumbOfI2Cs, nPort) : nullptr;
}
