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
constexpr TSensorTypes kSensorHubController = 26;

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
  if (!bIsSensorPort(nPort)) return;
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
  if (!bIsSensorPort(nPort)) return;
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

void CRobotConfigurationBasic::removeSensorModeInConfig(int nPort) {
  // Clears the port's type (not its mode), as the setup dialogs expect.
  if (bIsSensorPort(nPort)) settings.nSensorTypes[size_t(nPort)] = 0;
}

void CRobotConfigurationBasic::setSecondaryPort(int nPort, int nSecondary) {
  if (bIsSensorPort(nPort)) settings.nSecondaryPorts[size_t(nPort)] = nSecondary;
}

void CRobotConfigurationBasic::getDefaultSensorNameInConfig(int nPort, CString &sName) const {
  sName = getSensorPortString(nPort);
}

const wchar_t *CRobotConfigurationBasic::getSensorPortString(int nPort) const {
  return ::getSensorPortString(nPort, settings.nCircuitBoardType);
}

void CRobotConfigurationBasic::updateDefaultSensorNameForPlatformOrControllerBoard(tSensors nPort, const wchar_t *pzName) {
  if (bIsSensorPort(nPort)) sDefaultSensorNames[size_t(nPort)] = pzName;
}

void CRobotConfigurationBasic::configureNXTSensorPortsForTetrixHubs() {
  if (!pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel)) return;
  constexpr TSensorTypes kSecondHubController = 27;
  const int nKind = pToggles->getPlatformKind();
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port) {
    bool bHasController = false;
    for (TSensorPortHub nHub : settings.nSensorPortHubs[size_t(port)])
      if (nHub == hubHTMotor || nHub == hubHTServo || nHub == hubMatrxRbtcs) bHasController = true;
    const TSensorTypes nOldType = settings.nSensorTypes[size_t(port)];
    TSensorTypes nNewType = nOldType;
    if (bHasController) nNewType = kSensorHubController;
    else if (nOldType == kSensorHubController || nOldType == kSecondHubController) nNewType = 0;
    if (nNewType == nOldType) continue;
    removeMotorEncodersForSensorPort(port);
    removeSensorTypeInConfig(port);
    settings.nSensorTypes[size_t(port)] = nNewType;
    settings.nSensorModes[size_t(port)] = 0;
    if (nOldType == kSensorSharedMotorPort && nKind == platformSharedPorts) setMotorTypeInConfig(port, 0);
    calculateI2CUsage();
  }
}

void CRobotConfigurationBasic::configureDefaultMotorAndServoNamesForEquippedHubs(bool bForce) {
  if (bHubDefaultNamesConfigured && !bForce) return;
  const int nKind = pToggles->getPlatformKind();
  if (nKind != platformNxt && nKind != platformBrick4Motor) return;
  CString sName;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port)
    for (int pos = 0; pos < kNumbOfHubChainPositions; ++pos) {
      const TSensorPortHub nHub = settings.nSensorPortHubs[size_t(port)][size_t(pos)];
      if (nHub == 0 || nHub == -1) break;
      for (int m = 0; m < getMotorMuxNumbOfMotors(nHub); ++m) {
        const int nMotor = getDeviceIndexOnMotorHub(nHub, port, pos, m);
        if (nMotor >= 0 && nMotor < kMaxNumbOfMotors) setEmptyMotorNameToDefaultName(nMotor);
      }
      for (int s = 0; s < getServoMuxNumbOfServos(nHub); ++s) {
        const int nServo = getDeviceIndexOnServoHub(nHub, port, pos, s);
        if (nServo < 0 || nServo >= kMaxNumbOfServos) continue;
        const TServoTypes nType = settings.nServoTypes[size_t(nServo)];
        if (nType < 0 || nType > 2 || !sServoNames[size_t(nServo)].IsEmpty()) continue;
        getDefaultServoNameLowLevel(nServo, sName, false);
        sServoNames[size_t(nServo)] = sName;
        servoNameLines[size_t(nServo)] = emptyLineNumber;
      }
    }
  bHubDefaultNamesConfigured = true;
}
