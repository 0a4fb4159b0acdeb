#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/Platform.h"

namespace {

// Built-in motor ports of a hub platform; 0 on the others.
int builtInMotorPorts(int nKind) {
  return nKind == platformNxt ? 3 : nKind == platformBrick4Motor ? 4 : 0;
}

bool bIsHubPlatform(int nKind) { return nKind == platformNxt || nKind == platformBrick4Motor; }

bool bToggleExternalControllers() {
  return pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) != 0;
}

}  // namespace

bool CRobotConfigurationBasic::bSharedPortsForMotorsAndSensors() const {
  return pToggles->getPlatformKind() == platformSharedPorts;
}

int CRobotConfigurationBasic::getMaxNumbOfMotorPorts() const {
  const int nKind = pToggles->getPlatformKind();
  const int nPlatformPorts = pPlatformData->pMotorParms->nNumbOfMotorPorts;
  switch (nKind) {
    case platformNxt:
    case platformBrick4Motor:
      return bToggleExternalControllers() ? nPlatformPorts : builtInMotorPorts(nKind);
    case platformVexPic:
    case platformVexI2c:
    case platformSharedPorts:
    case platformKind9:
      return nPlatformPorts;
    case platformArduino:
    case platformBoard10:
    case platformBoard11:
    case platformBoard12:
    case platformBoard13:
    case platformBoard14:
      if (settings.nCircuitBoardType != 0 && settings.pMotorIOPinTable && settings.nNumbOfEntriesInMotorIOPinTable != 0)
        return settings.nNumbOfEntriesInMotorIOPinTable;
      return nPlatformPorts;
    default:
      return 0;
  }
}

bool CRobotConfigurationBasic::bIsValidMotorPort(int nMotor) const {
  const int nKind = pToggles->getPlatformKind();
  if (!bIsHubPlatform(nKind)) return nMotor >= 0 && nMotor < getMaxNumbOfMotorPorts();
  if (nMotor >= 0 && nMotor < builtInMotorPorts(nKind)) return true;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port)
    for (int pos = 0; pos < kNumbOfHubChainPositions; ++pos) {
      const TSensorPortHub nHub = settings.nSensorPortHubs[size_t(port)][size_t(pos)];
      if (nHub <= 0) break;  // a chain ends at its first empty position
      for (int m = 0; m < getMotorMuxNumbOfMotors(nHub); ++m)
        if (getDeviceIndexOnMotorHub(nHub, port, pos, m) == nMotor) return true;
    }
  return false;
}

bool CRobotConfigurationBasic::bIsValidServoPort(int nServo) const {
  if (!bToggleExternalControllers()) return false;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port)
    for (int pos = 0; pos < kNumbOfHubChainPositions; ++pos) {
      const TSensorPortHub nHub = settings.nSensorPortHubs[size_t(port)][size_t(pos)];
      if (nHub <= 0) break;
      for (int s = 0; s < getServoMuxNumbOfServos(nHub); ++s)
        if (getDeviceIndexOnServoHub(nHub, port, pos, s) == nServo) return true;
    }
  return false;
}

int CRobotConfigurationBasic::getMotorMuxNumbOfMotors(TSensorPortHub nHub) const {
  return nHub == hubHTMotor ? 2 : nHub == hubMatrxRbtcs ? 4 : -1;
}

int CRobotConfigurationBasic::getServoMuxNumbOfServos(TSensorPortHub nHub) const {
  return nHub == hubHTServo ? 6 : nHub == hubMatrxRbtcs ? 4 : -1;
}

TMotorIndex CRobotConfigurationBasic::getDeviceIndexOnMotorHub(TSensorPortHub nHub, int nSensorPort, int nChainPosition,
                                                               int nMotorOnHub) const {
  const int nBase = builtInMotorPorts(pToggles->getPlatformKind());
  if (nBase == 0) return -1;
  if (nHub == hubHTMotor) return nBase + 8 * nSensorPort + 2 * nChainPosition + nMotorOnHub;
  if (nHub == hubMatrxRbtcs) return nBase + 8 * nSensorPort + nMotorOnHub;
  return -1;
}

TServoIndex CRobotConfigurationBasic::getDeviceIndexOnServoHub(TSensorPortHub nHub, int nSensorPort, int nChainPosition,
                                                               int nServoOnHub) const {
  if (nHub == hubHTServo) return 24 * nSensorPort + 6 * nChainPosition + nServoOnHub;
  if (nHub == hubMatrxRbtcs) return 24 * nSensorPort + nServoOnHub;
  return -1;
}

TSensorPortHub CRobotConfigurationBasic::getMotorMuxForMotor(int nMotor) const {
  const int nBase = builtInMotorPorts(pToggles->getPlatformKind());
  if (nBase == 0 || nMotor < nBase) return hubNone;
  const int r = nMotor - nBase;
  const int port = r / 8;
  if (port >= kNumbOfHubSensorPorts) return hubNone;
  const auto &chain = settings.nSensorPortHubs[size_t(port)];
  const TSensorPortHub nFirst = chain[0];
  if (nFirst == hubMatrxRbtcs) return hubMatrxRbtcs;
  if (nFirst == hubHTMotor || nFirst == hubHTServo)
    return chain[size_t((r % 8) / 2)] == hubHTMotor ? hubHTMotor : hubNone;
  return hubNone;
}

bool CRobotConfigurationBasic::bSensorPortContainsHiTechnicMux(int nSensorPort) const {
  if (!bIsHubPlatform(pToggles->getPlatformKind())) return false;
  if (nSensorPort < 0 || nSensorPort >= kNumbOfHubSensorPorts) return false;
  for (TSensorPortHub nHub : settings.nSensorPortHubs[size_t(nSensorPort)])
    if (nHub >= 1 && nHub <= 5) return true;
  return false;
}

const TMotorIOPinsDefinition *CRobotConfigurationBasic::getMotorIOPinDefinition(int nMotor) const {
  if (settings.nNumbOfEntriesInMotorIOPinTable < 1 || !settings.pMotorIOPinTable) return nullptr;
  if (nMotor < 0 || nMotor >= settings.nNumbOfEntriesInMotorIOPinTable) return nullptr;
  return settings.pMotorIOPinTable + nMotor;
}

void CRobotConfigurationBasic::setMotorIOPinsInConfig(int nMotor, int nPrimary, int nSecondary, bool bTwoPinType) {
  if (!bIsMotorIndex(nMotor)) return;
  TMotorSlot &motor = settings.motors[size_t(nMotor)];
  struct TPinUpdate {
    int32_t *pPin;
    int nNewPin;
    TSensorTypes nPinSensorType;
  };
  const TPinUpdate updates[] = {{&motor.nPrimaryIOPin, nPrimary, bTwoPinType ? 59 : 57},
                                {&motor.nSecondaryIOPin, nSecondary, bTwoPinType ? 59 : 58}};
  for (const TPinUpdate &update : updates) {
    const int nOldPin = *update.pPin;
    if (nOldPin == update.nNewPin) continue;
    if (nOldPin >= 0 && nOldPin < kMaxNumbOfSensorPorts && settings.nSensorTypes[size_t(nOldPin)] != 0) {
      const TSensorTypes nRemovedType = settings.nSensorTypes[size_t(nOldPin)];
      removeMotorEncodersForSensorPort(nOldPin);
      removeSensorTypeInConfig(nOldPin);
      settings.nSensorTypes[size_t(nOldPin)] = 0;
      settings.nSensorModes[size_t(nOldPin)] = 0;
      if (nRemovedType == 91 && pToggles->getPlatformKind() == platformSharedPorts && nOldPin < kMaxNumbOfMotors)
        setMotorTypeInConfig(nOldPin, 0);
      calculateI2CUsage();
    }
    // A pin index from a line is never trusted to lie inside the sensor ports.
    const bool bSensorPort = update.nNewPin >= 0 && update.nNewPin < kMaxNumbOfSensorPorts;
    // A pin another motor holds is taken from it: that motor lets it go.
    if (bSensorPort) {
      const TSensorTypes nHeld = settings.nSensorTypes[size_t(update.nNewPin)];
      if (nHeld >= 57 && nHeld <= 59) removeSensorTypeInConfig(update.nNewPin);
    }
    *update.pPin = update.nNewPin;
    if (bSensorPort) setSensorTypeInConfig(update.nNewPin, update.nPinSensorType);
  }
}

void CRobotConfigurationBasic::setMotorIOPins(const TMotorIOPinsDefinition *pTable, int nCount) {
  settings.pMotorIOPinTable = pTable;
  settings.nNumbOfEntriesInMotorIOPinTable = nCount;
  copyBoardDefaultMotorNamesFromPinTable();
}

void CRobotConfigurationBasic::updateDefaultMotorNamesForIOPins() {
  if (!settings.pMotorIOPinTable || settings.nNumbOfEntriesInMotorIOPinTable < 1) return;
  copyBoardDefaultMotorNamesFromPinTable();
}

void CRobotConfigurationBasic::setDefaultMotorIOPinsForControllerBoard() {
  bool bChangesTable = true;
  const TMotorIOPinTableRef table = getControllerBoardMotorIOPins(settings.nCircuitBoardType, bChangesTable);
  if (!bChangesTable) return;
  settings.pMotorIOPinTable = table.pTable;
  settings.nNumbOfEntriesInMotorIOPinTable = table.nCount;
}

void CRobotConfigurationBasic::setDefaultMotorIOPinsForPlugInBoard(int nSlot) {
  if (nSlot < 0 || nSlot >= kNumbOfPluginSlots) return;
  const TMotorIOPinTableRef table = getPluginBoardMotorIOPins(settings.nPluginBoardTypes[size_t(nSlot)]);
  if (table.pTable) setMotorIOPins(table.pTable, table.nCount);
}

TSensorHWTypesMask CRobotConfigurationBasic::getAorDMotorTypeMask(int nMotor) const {
  switch (pToggles->getPlatformKind()) {
    case platformVexPic:
      return 0x10198;
    case platformVexI2c:
      // Ports 1 and 10 drive two-wire motors directly; the others through controllers.
      return (nMotor == 0 || nMotor == 9) ? 0x8008 : 0x10188;
    case platformSharedPorts:
    case platformKind9:
      return 0x10188;
    case platformArduino:
    case platformBoard10:
    case platformBoard11:
    case platformBoard12:
    case platformBoard13:
    case platformBoard14: {
      const TMotorIOPinsDefinition *pRow = getMotorIOPinDefinition(nMotor);
      return pRow ? pRow->nHWTypesMask : 0;
    }
    case platformNxt:
    case platformBrick4Motor:
      // Built-in ports only: with external controllers on, the platform's
      // motor count takes in the hub motors too.
      if (nMotor < builtInMotorPorts(pToggles->getPlatformKind())) return 0x18;
      switch (getMotorMuxForMotor(nMotor)) {
        case hubHTMotor: return 0x20;
        case hubMatrxRbtcs: return 0x40;
        default: return 0x18;
      }
    default:
      return 0x18;
  }
}

TThirdPartyHWMask CRobotConfigurationBasic::getThirdPartyMotorTypeMask(int nMotor) const {
  const int nKind = pToggles->getPlatformKind();
  if (!bIsHubPlatform(nKind) || nMotor < builtInMotorPorts(nKind)) return 0xFE;
  switch (getMotorMuxForMotor(nMotor)) {
    case hubHTMotor: return 4;
    case hubMatrxRbtcs: return 0x40;
    default: return 0xFE;
  }
}

void CRobotConfigurationBasic::buildListIndexMappingForMotors() {
  const int nKind = pToggles->getPlatformKind();
  // Kinds 5 and 6 keep whatever mapping they have.
  const bool bIdentity = (nKind >= 0 && nKind <= 4) || (nKind >= 7 && nKind <= 14);
  if (bIdentity)
    for (int i = 0; i < kMaxNumbOfMotors; ++i) parseInfo.nMotorListIndexMapping[size_t(i)] = i;
  parseInfo.bMotorListIndexMappingBuilt = true;
}

int CRobotConfigurationBasic::getMotorlistIndexMapping(int nIndex) {
  if (!parseInfo.bMotorListIndexMappingBuilt) buildListIndexMappingForMotors();
  return (nIndex >= 0 && nIndex < kMaxNumbOfMotors) ? parseInfo.nMotorListIndexMapping[size_t(nIndex)] : -1;
}
