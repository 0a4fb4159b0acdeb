#include "core/RobotConfiguration.h"
#include "host/DeviceCatalog.h"
#include "host/Platform.h"

namespace {

// Sensor types with a role in the port rules.
constexpr TSensorTypes kSensorUartPin = 60;
constexpr TSensorTypes kSensorI2CPin = 61;
constexpr TSensorTypes kSensorI2CEncoder = 67;
constexpr TSensorTypes kSensorI2CBus = 68;
constexpr TSensorTypes kSensorSharedMotorPort = 91;

// Platforms whose two-port sensors take a port and its successor.
bool bIsI2CGroupPlatform(int nKind) {
  return nKind == platformVexI2c || nKind == platformArduino || (nKind >= platformBoard10 && nKind <= platformBoard14);
}

// The type a two-port sensor puts on its second port; 0 for one-port types.
TSensorTypes secondHalfOfTwoPortType(TSensorTypes nType) {
  if (nType >= 52 && nType <= 55) return 56;
  if (nType == 80) return 81;
  return 0;
}

bool bIsSensorPort(int nPort) { return nPort >= 0 && nPort < kMaxNumbOfSensorPorts; }

}  // namespace

void CRobotConfigurationBasic::setSensorTypeInConfig(int nPort, TSensorTypes nType) {
  if (!bIsSensorPort(nPort) || settings.nSensorTypes[size_t(nPort)] == nType) return;
  const TSensorTypes nOldType = settings.nSensorTypes[size_t(nPort)];
  removeMotorEncodersForSensorPort(nPort);
  const int nKind = pToggles->getPlatformKind();
  const TSensorTypes nSecondHalf = secondHalfOfTwoPortType(nType);
  if (nSecondHalf != 0 && bIsI2CGroupPlatform(nKind)) {
    // A two-port sensor on the last port has no partner port: it takes the one port.
    removeSensorTypeInConfig(nPort);
    settings.nSensorTypes[size_t(nPort)] = nType;
    settings.nSensorModes[size_t(nPort)] = 0;
    if (bIsSensorPort(nPort + 1)) {
      removeSensorTypeInConfig(nPort + 1);
      settings.nSensorTypes[size_t(nPort + 1)] = nSecondHalf;
      settings.nSensorModes[size_t(nPort + 1)] = 0;
    }
    calculateI2CUsage();
    return;
  }
  removeSensorTypeInConfig(nPort);
  settings.nSensorTypes[size_t(nPort)] = nType;
  settings.nSensorModes[size_t(nPort)] = 0;
  if (nType != kSensorI2CEncoder && nType != kSensorI2CBus && nOldType == kSensorSharedMotorPort &&
      nKind == platformSharedPorts && nPort < kMaxNumbOfMotors)
    setMotorTypeInConfig(nPort, 0);
  calculateI2CUsage();
}

void CRobotConfigurationBasic::removeSensorTypeInConfig(int nPort) {
  if (!bIsSensorPort(nPort)) return;
  const TSensorTypes nType = settings.nSensorTypes[size_t(nPort)];
  if (secondHalfOfTwoPortType(nType) != 0 && bIsI2CGroupPlatform(pToggles->getPlatformKind()) &&
      bIsSensorPort(nPort + 1)) {
    clearSensorTypeAndModeInConfig(nPort + 1);
  } else if ((nType == 56 || nType == 81) && nPort > 0) {
    clearSensorTypeAndModeInConfig(nPort - 1);
  } else if (nType == kSensorUartPin || nType == kSensorI2CPin) {
    int nSerialPort = -1, nFirstPin = -1, nSecondPin = -1;
    const bool bUart = nType == kSensorUartPin;
    if (bUart ? findUartFromPin(nPort, nSerialPort, nFirstPin, nSecondPin)
              : findI2CFromPin(nPort, nSerialPort, nFirstPin, nSecondPin)) {
      (bUart ? settings.nUARTMode : settings.nI2CMode)[size_t(nSerialPort)] = 0;
      if (bIsSensorPort(nFirstPin)) clearSensorTypeAndModeInConfig(nFirstPin);
      if (bIsSensorPort(nSecondPin)) clearSensorTypeAndModeInConfig(nSecondPin);
    }
  }
  clearSensorTypeAndModeInConfig(nPort);
}

void CRobotConfigurationBasic::clearSensorTypeAndModeInConfig(int nPort) {
  settings.nSensorTypes[size_t(nPort)] = 0;
  settings.nSensorModes[size_t(nPort)] = 0;
}

void CRobotConfigurationBasic::calculateI2CUsage() {
  if (!bIsI2CGroupPlatform(pToggles->getPlatformKind())) return;
  bool bAnyI2CSensor = false;
  for (TSensorTypes nType : settings.nSensorTypes)
    if (nType == kSensorI2CEncoder || nType == kSensorI2CBus) bAnyI2CSensor = true;
  constexpr int32_t kI2CSensors = 2;
  if (bAnyI2CSensor) settings.nI2CMode[0] = kI2CSensors;
  else if (settings.nI2CMode[0] == kI2CSensors) settings.nI2CMode[0] = 0;
}

void CRobotConfigurationBasic::setUserDefinedSensorNameInConfig(int nPort, const CString &sName,
                                                               const TLineNumber &line) {
  sSensorNames[size_t(nPort)] = sName;
  sensorNameLines[size_t(nPort)] = line;
}

int CRobotConfigurationBasic::getMaxNumbOfSensorPorts() const {
  if (pToggles->getPlatformKind() == platformArduino && settings.nCircuitBoardType != 0) {
    if (const TCktBoardInfo *pBoard = getCircuitBoardInfo(settings.nCircuitBoardType))
      return pBoard->nLastSensorPort - pBoard->nFirstSensorPort + 1;
  }
  return pPlatformData->pPlatformParms->nNumbOfSensorPorts;
}

int CRobotConfigurationBasic::getIndexForSensorName(const CString &sName) const {
  return getTypedefIndex(getSensorNameDefinitions(settings.nCircuitBoardType), sName, true);
}

void CRobotConfigurationBasic::clearUnusedVexI2CEncoders() {
  const int nKind = pToggles->getPlatformKind();
  if (nKind != platformVexPic && nKind != platformVexI2c) return;
  for (int port = 0; port < kMaxNumbOfSensorPorts; ++port) {
    if (settings.nSensorTypes[size_t(port)] != kSensorI2CEncoder) continue;
    bool bUsed = false;
    for (const TMotorSlot &motor : settings.motors)
      if (motor.nMotorType != 0 && motor.nEncoderPort == port) bUsed = true;
    if (bUsed) continue;
    removeMotorEncodersForSensorPort(port);
    removeSensorTypeInConfig(port);
    clearSensorTypeAndModeInConfig(port);
    calculateI2CUsage();
  }
}
