#include <algorithm>
#include <array>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/sensors/SensorMenus.h"

namespace {

// Sensor types with a role in the port rules.
constexpr TSensorTypes kSensorHubController = 26;
constexpr TSensorTypes kSensorSecondHubController = 27;
constexpr TSensorTypes kSensorUartPin = 60;
constexpr TSensorTypes kSensorI2CPin = 61;
constexpr TSensorTypes kSensorI2CEncoder = 67;
constexpr TSensorTypes kSensorI2CBus = 68;
constexpr TSensorTypes kSensorSharedMotorPort = 91;
// A motor's primary, secondary and two-pin IO pins.
constexpr std::array<TSensorTypes, 3> kMotorIOPinTypes = {57, 58, 59};

// I2C usage "i2cSensors" of the I2C port vocabulary.
constexpr int32_t kI2CUsageSensors = 2;

// Platform kinds whose two-port sensors take a port and its successor.
constexpr std::array<int, 7> kI2CGroupPlatforms = {platformVexI2c, platformArduino, platformBoard10, platformBoard11,
                                                   platformBoard12, platformBoard13, platformBoard14};

// A two-port sensor type and the type its second port takes.
struct TTwoPortSensor {
  TSensorTypes nType;
  TSensorTypes nSecondHalf;
};
constexpr std::array<TTwoPortSensor, 5> kTwoPortSensors = {{{52, 56}, {53, 56}, {54, 56}, {55, 56}, {80, 81}}};

// The sensors that live on the I2C bus.
constexpr std::array<TSensorTypes, 2> kI2CBusSensors = {kSensorI2CEncoder, kSensorI2CBus};

// Hub types that carry motors or servos, and so make their sensor port a hub port.
constexpr std::array<TSensorPortHub, 3> kControllerHubs = {hubHTMotor, hubHTServo, hubMatrxRbtcs};

// True when `value` is one of `values`.
template <class T, size_t N>
bool bIsOneOf(const std::array<T, N> &values, T value) {
  return std::find(values.begin(), values.end(), value) != values.end();
}

// True when the current platform kind belongs to the I2C group.
bool bIsI2CGroupPlatform() { return bIsOneOf(kI2CGroupPlatforms, pToggles->getPlatformKind()); }

// The type a two-port sensor puts on its second port; 0 for one-port types.
TSensorTypes secondHalfOfTwoPortType(TSensorTypes nType) {
  for (const TTwoPortSensor &sensor : kTwoPortSensors)
    if (sensor.nType == nType) return sensor.nSecondHalf;
  return 0;
}

// True for the second half of a two-port sensor.
bool bIsSecondHalfType(TSensorTypes nType) {
  for (const TTwoPortSensor &sensor : kTwoPortSensors)
    if (sensor.nSecondHalf == nType) return true;
  return false;
}

// True when the port's old type marks a motor of the shared-port platform.
bool bIsSharedPortMotor(TSensorTypes nOldType) {
  return nOldType == kSensorSharedMotorPort && pToggles->getPlatformKind() == platformSharedPorts;
}

// Removes the motor that holds a shared port. The port is emptied first: the
// motor's removal clears its port again, and must find it empty rather than
// come back here or wipe the sensor that is about to take the port.
void releaseSharedPortMotor(CRobotConfigurationBasic &config, int nPort) {
  config.removeSensorTypeInConfig(nPort);
  config.setMotorTypeInConfig(nPort, 0);
}

// Puts a type with the default mode on a port (an index already checked).
void storeSensorType(CRobotConfigurationBasic &config, int nPort, TSensorTypes nType) {
  config.settings.nSensorTypes[size_t(nPort)] = nType;
  config.settings.nSensorModes[size_t(nPort)] = 0;
}

}  // namespace

TSensorModes getDefaultSensorModeForSensorType(TSensorTypes) { return 0; }

void CRobotConfigurationBasic::setSensorTypeInConfig(int nPort, TSensorTypes nType) {
  if (!bIsSensorIndex(nPort) || settings.nSensorTypes[size_t(nPort)] == nType) return;
  const TSensorTypes nOldType = settings.nSensorTypes[size_t(nPort)];
  removeMotorEncodersForSensorPort(nPort);

  const TSensorTypes nSecondHalf = secondHalfOfTwoPortType(nType);
  if (nSecondHalf != 0 && bIsI2CGroupPlatform()) {
    // Both ports are emptied before either is typed: emptying the successor
    // may release a stale second half whose partner is this port.
    const bool bHasSuccessor = bIsSensorIndex(nPort + 1);  // the last port has none: one port only
    removeSensorTypeInConfig(nPort);
    if (bHasSuccessor) removeSensorTypeInConfig(nPort + 1);
    storeSensorType(*this, nPort, nType);
    if (bHasSuccessor) storeSensorType(*this, nPort + 1, nSecondHalf);
    calculateI2CUsage();
    return;
  }
  if (bIsOneOf(kI2CBusSensors, nType)) {
    removeSensorTypeInConfig(nPort);
    storeSensorType(*this, nPort, nType);
    calculateI2CUsage();
    return;
  }
  // The motor goes before the sensor is stored, so that the new sensor survives.
  if (bIsSharedPortMotor(nOldType)) releaseSharedPortMotor(*this, nPort);
  removeSensorTypeInConfig(nPort);
  storeSensorType(*this, nPort, nType);
  calculateI2CUsage();
}

void CRobotConfigurationBasic::removeSensorTypeInConfig(int nPort) {
  if (!bIsSensorIndex(nPort)) return;
  const TSensorTypes nType = settings.nSensorTypes[size_t(nPort)];
  if (secondHalfOfTwoPortType(nType) != 0 && bIsI2CGroupPlatform()) {
    clearSensorTypeAndModeInConfig(nPort + 1);
  } else if (bIsSecondHalfType(nType)) {
    clearSensorTypeAndModeInConfig(nPort - 1);
  } else if (bIsOneOf(kMotorIOPinTypes, nType)) {
    // The motor lets the pin go, so that no two devices claim one port.
    for (TMotorSlot &motor : settings.motors) {
      if (motor.nPrimaryIOPin == nPort) motor.nPrimaryIOPin = -1;
      if (motor.nSecondaryIOPin == nPort) motor.nSecondaryIOPin = -1;
    }
  } else if (nType == kSensorUartPin || nType == kSensorI2CPin) {
    int nSerialPort = -1, nFirstPin = -1, nSecondPin = -1;
    const bool bUart = nType == kSensorUartPin;
    const bool bFound = bUart ? findUartFromPin(nPort, nSerialPort, nFirstPin, nSecondPin)
                              : findI2CFromPin(nPort, nSerialPort, nFirstPin, nSecondPin);
    if (bFound && bIsSerialPortIndex(nSerialPort)) {
      (bUart ? settings.nUARTMode : settings.nI2CMode)[size_t(nSerialPort)] = 0;
      clearSensorTypeAndModeInConfig(nFirstPin);
      clearSensorTypeAndModeInConfig(nSecondPin);
    }
  }
  clearSensorTypeAndModeInConfig(nPort);
}

void CRobotConfigurationBasic::clearSensorTypeAndModeInConfig(int nPort) {
  if (!bIsSensorIndex(nPort)) return;
  settings.nSensorTypes[size_t(nPort)] = 0;
  settings.nSensorModes[size_t(nPort)] = 0;
}

void CRobotConfigurationBasic::calculateI2CUsage() {
  if (!bIsI2CGroupPlatform()) return;
  const bool bAnyI2CSensor = std::any_of(settings.nSensorTypes.begin(), settings.nSensorTypes.end(),
                                         [](TSensorTypes nType) { return bIsOneOf(kI2CBusSensors, nType); });
  if (bAnyI2CSensor) settings.nI2CMode[0] = kI2CUsageSensors;
  else if (settings.nI2CMode[0] == kI2CUsageSensors) settings.nI2CMode[0] = 0;
}

void CRobotConfigurationBasic::setUserDefinedSensorNameInConfig(int nPort, const CString &sName,
                                                               const TLineNumber &line) {
  if (!bIsSensorIndex(nPort)) return;
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
    const bool bUsed = std::any_of(settings.motors.begin(), settings.motors.end(), [port](const TMotorSlot &motor) {
      return motor.nMotorType != 0 && motor.nEncoderPort == port;
    });
    if (bUsed) continue;
    removeMotorEncodersForSensorPort(port);
    removeSensorTypeInConfig(port);
    clearSensorTypeAndModeInConfig(port);
    calculateI2CUsage();
  }
}

void CRobotConfigurationBasic::removeSensorModeInConfig(int nPort) {
  // Clears the port's type (not its mode), as the setup dialogs expect.
  if (bIsSensorIndex(nPort)) settings.nSensorTypes[size_t(nPort)] = 0;
}

void CRobotConfigurationBasic::setSecondaryPort(int nPort, int nSecondary) {
  if (bIsSensorIndex(nPort)) settings.nSecondaryPorts[size_t(nPort)] = nSecondary;
}

void CRobotConfigurationBasic::getDefaultSensorNameInConfig(int nPort, CString &sName) const {
  sName = getSensorPortString(nPort);
}

const wchar_t *CRobotConfigurationBasic::getSensorPortString(int nPort) const {
  return ::getSensorPortString(nPort, settings.nCircuitBoardType);
}

void CRobotConfigurationBasic::updateDefaultSensorNameForPlatformOrControllerBoard(tSensors nPort, const wchar_t *pzName) {
  if (bIsSensorIndex(nPort)) sDefaultSensorNames[size_t(nPort)] = pzName;
}

void CRobotConfigurationBasic::configureNXTSensorPortsForTetrixHubs() {
  if (!pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel)) return;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port) {
    const auto &chain = settings.nSensorPortHubs[size_t(port)];
    const bool bHasController = std::any_of(chain.begin(), chain.end(),
                                            [](TSensorPortHub nHub) { return bIsOneOf(kControllerHubs, nHub); });
    const TSensorTypes nOldType = settings.nSensorTypes[size_t(port)];
    TSensorTypes nNewType = nOldType;
    if (bHasController) nNewType = kSensorHubController;
    else if (nOldType == kSensorHubController || nOldType == kSensorSecondHubController) nNewType = 0;
    if (nNewType == nOldType) continue;
    removeMotorEncodersForSensorPort(port);
    if (bIsSharedPortMotor(nOldType)) releaseSharedPortMotor(*this, port);
    removeSensorTypeInConfig(port);
    storeSensorType(*this, port, nNewType);
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
      if (nHub == hubNone || nHub == -1) break;
      for (int m = 0; m < getMotorMuxNumbOfMotors(nHub); ++m) {
        const int nMotor = getDeviceIndexOnMotorHub(nHub, port, pos, m);
        if (bIsMotorIndex(nMotor)) setEmptyMotorNameToDefaultName(nMotor);
      }
      for (int s = 0; s < getServoMuxNumbOfServos(nHub); ++s) {
        const int nServo = getDeviceIndexOnServoHub(nHub, port, pos, s);
        if (!bIsServoIndex(nServo)) continue;
        const TServoTypes nType = settings.nServoTypes[size_t(nServo)];
        if (nType < 0 || nType > 2 || !sServoNames[size_t(nServo)].IsEmpty()) continue;
        getDefaultServoNameLowLevel(nServo, sName, false);
        sServoNames[size_t(nServo)] = sName;
        servoNameLines[size_t(nServo)] = emptyLineNumber;
      }
    }
  bHubDefaultNamesConfigured = true;
}
