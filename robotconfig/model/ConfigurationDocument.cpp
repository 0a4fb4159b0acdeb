#include "robotconfig/model/ConfigurationDocument.h"

#include <array>

#include "robotconfig/core/MemoryAllocation.h"
#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/MenuButton.h"
#include "robotconfig/host/Networking.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/model/ModelWords.h"
#include "robotconfig/motors/MotorIOPins.h"
#include "robotconfig/sensors/ControllerBoards.h"
#include "robotconfig/sensors/SensorMenus.h"

namespace robotconfig::model {

using json = nlohmann::ordered_json;

namespace {

/// Hardware-type mask the drive-train menus are read with.
constexpr TSensorHWTypesMask kDriveMenuMask = 7;

/// The firmware features and the settings flag of each.
struct TFirmwareFeature {
  const char *pzWord;
  int32_t TConfigurationSettings::*pFlag;
};
constexpr std::array<TFirmwareFeature, 2> kFirmwareFeatures = {{
    {"fwTimedServo", &TConfigurationSettings::bFwTimedServo},
    {"fwSounds", &TConfigurationSettings::bFwSounds},
}};

/// A word, or null when there is none.
json wordOrNull(const std::string &sWord) { return sWord.empty() ? json(nullptr) : json(sWord); }

/// A memory size as a MemorySize line writes it: bytes, or "auto".
json memorySize(int nSize) { return nSize < 0 ? json("auto") : json(nSize); }

/// The sensor-port words a motor's encoder or pins may name on this board.
std::vector<std::string> sensorPortChoices(CRobotConfigurationBasic &config) {
  CDropDownButtonOfDeviceTypeMenuItem button;
  addSensorPortsToMenu(config, button, false, -1);
  std::vector<std::string> words;
  for (const auto &item : button.items())
    if (config.bIsSensorIndex(item.nValue) && item.nValue < sensorPortCount(config)) words.push_back(item.sKeyword.toUtf8());
  return words;
}

json motorEntry(CRobotConfigurationBasic &config, int nMotor, bool bChoices) {
  const TMotorSlot &motor = config.getSettings().motors[size_t(nMotor)];
  const TMotorIOPinsDefinition *pPins = config.getMotorIOPin(nMotor);
  CString sName, sDefault;
  config.getUserDefinedMotorNameInConfig(nMotor, sName);
  config.getDefaultMotorNameLowLevel(nMotor, sDefault, true);
  json entry;
  entry["port"] = motorPortWord(config, nMotor);
  entry["name"] = utf8(sName.IsEmpty() ? sDefault : sName);
  entry["type"] = motor.nMotorType <= 0 ? json(nullptr)
                                        : wordOrNull(utf8(getMotorTypedefString(motor.nMotorType, pPins ? pPins->nHWTypesMask : 0)));
  entry["pidControl"] = motor.bPIDControlled;
  entry["reversed"] = motor.bReversed;
  entry["encoder"] = motor.bEncoder;
  entry["encoderPort"] = motor.nEncoderPort >= 0 ? wordOrNull(sensorPortWord(config, motor.nEncoderPort)) : json(nullptr);
  entry["driveSide"] = tableWord(nDriveSideMenu, motor.nDriveSide);
  if (pPlatformData->pPlatformParms->bMotorsHaveIOPins)
    entry["ioPins"] = json::array({wordOrNull(sensorPortWord(config, motor.nPrimaryIOPin)),
                                   wordOrNull(sensorPortWord(config, motor.nSecondaryIOPin))});
  if (!config.bIsMotorUsingDefaultPidSettings(nMotor)) {
    const TPidSettings &pid = motor.pidSettings;
    entry["pidSettings"] = json::array({pid.B1, pid.B2, pid.B3, pid.B4, pid.W1, pid.W2, pid.W3, pid.W4});
  }
  if (bChoices) {
    json choices;
    choices["type"] = motorTypeChoices(config, nMotor);
    choices["driveSide"] = menuWords(nDriveSideMenu);
    choices["encoderPort"] = sensorPortChoices(config);
    entry["choices"] = choices;
  }
  return entry;
}

json sensorEntry(const CRobotConfigurationBasic &config, int nPort, bool bChoices) {
  const TSensorTypes nType = config.getSensorTypeInConfig(nPort);
  CString sName;
  config.getUserDefinedSensorNameInConfig(nPort, sName);
  json entry;
  entry["port"] = sensorPortWord(config, nPort);
  entry["name"] = utf8(sName);
  entry["type"] = nType == 0 ? json(nullptr) : wordOrNull(utf8(getSensorTypeString(nType)));
  const TSensorModes nMode = config.getSensorModeInConfig(nPort);
  entry["mode"] = nMode == 0 ? json(nullptr) : wordOrNull(utf8(getSensorModeString(nType, nMode)));
  entry["secondPort"] = wordOrNull(utf8(getSensorSecondaryPort(config.getSecondaryPort(nPort))));
  if (nType != 0 && config.getI2C_Address(nPort) != 0) entry["i2cAddress"] = config.getI2C_Address(nPort);
  if (bChoices) {
    json choices;
    choices["type"] = sensorTypeChoices();
    choices["mode"] = sensorModeChoices(nType);
    entry["choices"] = choices;
  }
  return entry;
}

json servoEntry(const CRobotConfigurationBasic &config, int nServo, bool bChoices) {
  CString sName;
  config.getUserDefinedServoNameInConfig(nServo, sName);
  json entry;
  entry["port"] = servoPortWord(nServo);
  entry["name"] = utf8(sName);
  const TServoTypes nType = config.getServoType(nServo);
  entry["type"] = nType == 0 ? json(nullptr) : wordOrNull(utf8(getServoTypedefString(nType)));
  if (bChoices) entry["choices"] = json{{"type", servoTypeChoices()}};
  return entry;
}

json hubsSection(const CRobotConfigurationBasic &config) {
  static constexpr const char *kHubPorts[] = {"S1", "S2", "S3", "S4"};
  json hubs = json::array();
  for (int nPort = 0; nPort < kNumbOfHubSensorPorts; ++nPort) {
    const auto &chain = config.getSettings().nSensorPortHubs[size_t(nPort)];
    bool bAny = false;
    json words = json::array();
    for (TSensorPortHub nHub : chain) {
      bAny = bAny || nHub > 0;
      words.push_back(utf8(getMuxTypes(nHub)));
    }
    if (bAny) hubs.push_back(json{{"port", kHubPorts[nPort]}, {"chain", words}});
  }
  return hubs;
}

json boardSection(const CRobotConfigurationBasic &config) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  json board;
  board["word"] = wordOrNull(tableWord(getArduinoCircuitBoardTypeMenuDefn(), nBoard));
  board["name"] = utf8(getCktBoardNameString(nBoard));
  const TCktBoardInfo *pInfo = getCircuitBoardInfo(nBoard);
  board["cpu"] = pInfo ? wordOrNull(utf8(pInfo->pCpuTypeName)) : json(nullptr);
  board["clockSpeed"] = config.getCpuClockSpeed();
  json plugins = json::array();
  for (int32_t nPlugin : config.getSettings().nPluginBoardTypes)
    plugins.push_back(nPlugin == 0 ? json(nullptr) : wordOrNull(tableWord(nPluginCircuitBoardTypes, nPlugin)));
  board["plugins"] = plugins;
  return board;
}

json slotMotors(const CRobotConfigurationBasic &config, int nCount, int (CRobotConfigurationBasic::*getIndex)(int) const) {
  json motors = json::array();
  for (int nSlot = 0; nSlot < nCount; ++nSlot) {
    const int nMotor = (config.*getIndex)(nSlot);
    motors.push_back(CRobotConfigurationBasic::bIsMotorIndex(nMotor) ? wordOrNull(motorPortWord(config, nMotor))
                                                                      : json(nullptr));
  }
  return motors;
}

json driveSection(const CRobotConfigurationBasic &config, bool bAll) {
  json drive;
  if (config.getDriveTrainType() != 0 || bAll) {
    json train;
    train["type"] = wordOrNull(utf8(getTypedefEnumString(nDriveTrainTypes, config.getDriveTrainType(), kDriveMenuMask)));
    train["motors"] = slotMotors(config, config.getNumbOfMotorsForDriveTrain(), &CRobotConfigurationBasic::getDriveTrainMotorIndex);
    json wheels = json::array();
    for (uint16_t nWheel : config.getSettings().nDriveTrainWheels) wheels.push_back(nWheel);
    train["wheels"] = wheels;
    drive["driveTrain"] = train;
  }
  if (config.getGripperArmType() != 0 || bAll) {
    json gripper;
    gripper["type"] = wordOrNull(utf8(getTypedefEnumString(nGripperArmTypes, config.getGripperArmType(), kDriveMenuMask)));
    gripper["motors"] =
        slotMotors(config, config.getNumbOfMotorsForGripperArm(), &CRobotConfigurationBasic::getGripperArmMotorIndex);
    drive["gripperArm"] = gripper;
  }
  if (config.getJoystickMotorDriveType() != 0 || bAll) {
    json joystick;
    joystick["type"] =
        wordOrNull(utf8(getTypedefEnumString(nJoystickDriveTypes, config.getJoystickMotorDriveType(), kDriveMenuMask)));
    joystick["scaling"] = wordOrNull(
        utf8(getTypedefEnumString(nJoystickAxisScalingTypes, config.getJoystickMotorAxisScaling(), kDriveMenuMask)));
    drive["joystickDrive"] = joystick;
  }
  return drive;
}

/// The word of a serial port; "" when its table has none.
std::string serialPortWord(const TDeviceTypeMenuItem *pTable, int nPort) { return tableWord(pTable, nPort); }

json serialSection(CRobotConfigurationBasic &config, const TWrittenDevices &written, bool bAll) {
  json serial;
  json uarts = json::array();
  int nFirst = -1, nSecond = -1;
  for (int nPort = 0; nPort < std::min(config.getMaxNumbOfUARTPorts(), kMaxNumbOfSerialPorts); ++nPort) {
    if (!bAll && !written.uarts.count(nPort)) continue;
    config.getMapUARTPortToIOPins(nPort, nFirst, nSecond);
    json uart;
    uart["port"] = serialPortWord(nUartIndex, nPort);
    uart["use"] = wordOrNull(tableWord(nUARTTypes, config.getUARTType(nPort)));
    uart["baud"] = wordOrNull(tableWord(nUARTBaudRates, config.getBaudRate(nPort)));
    uart["pins"] = json::array({wordOrNull(sensorPortWord(config, nFirst)), wordOrNull(sensorPortWord(config, nSecond))});
    uarts.push_back(uart);
  }
  json i2cs = json::array();
  for (int nPort = 0; nPort < std::min(config.getMaxNumbOfI2CPorts(), kMaxNumbOfSerialPorts); ++nPort) {
    if (!bAll && !written.i2cPorts.count(nPort)) continue;
    config.getMapI2CPortToIOPins(nPort, nFirst, nSecond);
    json i2c;
    i2c["port"] = serialPortWord(nI2CIndex, nPort);
    i2c["use"] = wordOrNull(tableWord(nI2CTypes, config.getSettings().nI2CMode[size_t(nPort)]));
    i2c["pins"] = json::array({wordOrNull(sensorPortWord(config, nFirst)), wordOrNull(sensorPortWord(config, nSecond))});
    i2cs.push_back(i2c);
  }
  serial["uarts"] = uarts;
  serial["i2c"] = i2cs;
  return serial;
}

// The sizes of the MemorySize line and the RAM map the platform's defaults
// give for them: the pair sizes the datalog and debug streams, the third is
// the requested task stack, and the program is taken to use every task.
json memorySection(const CRobotConfigurationBasic &config) {
  const auto &sizes = config.getSettings().nMemorySizes;
  TRamMemoryLimits limits;
  limits.loadDefaultMemorySettings();
  TMemoryAllocation allocation;
  allocation.nDatalogStreamSize = sizes[0] < 0 || sizes[1] < 0 ? -1 : sizes[0];
  allocation.nDebugStreamSize = sizes[0] < 0 || sizes[1] < 0 ? -1 : sizes[1];
  allocation.nDefaultTaskStackSize = limits.nDefaultTaskStackSize;
  allocation.nRequestedTaskStackSize = sizes[2];
  allocation.nNumbOfTasks = limits.nNumbOfTasks;
  allocation.calculateDerivedValues(limits);
  json memory;
  memory["sizes"] = json::array({memorySize(sizes[0]), memorySize(sizes[1]), memorySize(sizes[2])});
  memory["map"] = json{{"totalRam", allocation.nTotalRam},
                       {"taskStacks", allocation.nTotalTaskStack},
                       {"tasks", allocation.nNumbOfTasks},
                       {"datalogStream", allocation.nDatalogStreamSize},
                       {"debugStream", allocation.nDebugStreamSize},
                       {"used", allocation.nTotalUsed}};
  return memory;
}

/// An 8-byte radio address as 16 hex digits.
std::string hexAddress(const Networking::TNodeSerialNumber &address) {
  static constexpr char kDigits[] = "0123456789ABCDEF";
  std::string sHex;
  for (unsigned char c : address) {
    sHex += kDigits[c >> 4];
    sHex += kDigits[c & 15];
  }
  return sHex;
}

json networkSection(const CRobotConfigurationBasic &config) {
  const Networking::CNtwkInfoFromPragmas *pInfo = config.pNtwkInfo;
  if (!pInfo || !pInfo->bDefined) return json(nullptr);
  json network;
  network["name"] = utf8(pInfo->sNetworkName);
  network["type"] = wordOrNull(utf8(Networking::getNetworkTypeString(pInfo->nNetworkType)));
  network["number"] = pInfo->nNetworkNumber;
  network["channel"] = pInfo->nChannel;
  json nodes = json::array();
  for (int n = 0; n < std::min<int>(pInfo->nNumbOfNodes, Networking::kMaxNodesInNetwork); ++n) {
    const Networking::TNtwkNodeInfo &node = pInfo->nodes[size_t(n)];
    nodes.push_back(json{{"name", utf8(node.sNodeName)}, {"address", hexAddress(node.nSerialNumber)}});
  }
  network["nodes"] = nodes;
  return network;
}

json choicesSection(CRobotConfigurationBasic &config) {
  json choices;
  choices["board"] = boardChoices();
  choices["plugins"] =
      config.getSettings().nPlatformKind == platformArduino ? menuWords(nPluginCircuitBoardTypes) : std::vector<std::string>();
  choices["uartUse"] = menuWords(nUARTTypes);
  choices["baudRate"] = menuWords(nUARTBaudRates);
  choices["i2cUse"] = menuWords(nI2CTypes);
  const bool bDrive = pPlatformData->pPlatformParms->bSupportsDriveTrainConfig;
  choices["driveTrain"] = bDrive ? menuWords(nDriveTrainTypes, kDriveMenuMask) : std::vector<std::string>();
  choices["gripperArm"] = bDrive ? menuWords(nGripperArmTypes, kDriveMenuMask) : std::vector<std::string>();
  const bool bJoystick = pPlatformData->pPlatformParms->bSupportsJoystickDriveConfig;
  choices["joystickDrive"] = bJoystick ? menuWords(nJoystickDriveTypes, kDriveMenuMask) : std::vector<std::string>();
  choices["joystickScaling"] = bJoystick ? menuWords(nJoystickAxisScalingTypes, kDriveMenuMask) : std::vector<std::string>();
  choices["programType"] = menuWords(nProgramTypes);
  std::vector<std::string> motorPorts;
  for (int n = 0; n < kMaxNumbOfMotors; ++n)
    if (config.bIsValidMotorPort(n)) motorPorts.push_back(motorPortWord(config, n));
  choices["motorPorts"] = motorPorts;
  choices["sensorPorts"] = sensorPortChoices(config);
  json firmware = json::array();
  for (const TFirmwareFeature &feature : kFirmwareFeatures) firmware.push_back(feature.pzWord);
  choices["firmware"] = firmware;
  return choices;
}

}  // namespace

TWrittenDevices findWrittenDevices(const CRobotConfigurationBasic &config, const CString &sBlock) {
  TWrittenDevices devices;
  int nStart = 0;
  while (nStart < sBlock.GetLength()) {
    int nEnd = sBlock.Find(L'\n', nStart);
    if (nEnd < 0) nEnd = sBlock.GetLength();
    TTokenizedConfigParms parms;
    if (CRobotConfigurationBasic::nTokenizeLine(sBlock.Mid(nStart, nEnd - nStart), parms) == lineTypeConfigPragma &&
        parms.nNumbOfParms > 1) {
      const CString &sPort = parms.sParms[1];
      const TConfigTypes nKeyword = TConfigTypeDefns::lookupConfigType(parms.sParms[0]);
      devices.keywords.insert(nKeyword);
      switch (nKeyword) {
        case configTypeMotor: devices.motors.insert(config.getIndexForDefaultMotorName(sPort)); break;
        case configTypeSensor: devices.sensors.insert(config.getIndexForSensorName(sPort)); break;
        case configTypeServo: devices.servos.insert(getServoIndex(sPort)); break;
        case configTypeUartUsage: devices.uarts.insert(getTypedefIndex(nUartIndex, sPort, true)); break;
        case configTypeI2CUsage: devices.i2cPorts.insert(getTypedefIndex(nI2CIndex, sPort, true)); break;
        default: break;
      }
    }
    nStart = nEnd + 1;
  }
  return devices;
}

json configurationDocument(const CHostRobotConfiguration &source, const TDocumentOptions &options) {
  // Writing normalises the record (legacy types, brick defaults); the
  // document shows what the block will carry.
  CHostRobotConfiguration config(source);
  CString sBlock;
  config.buildSourceCodeForConfiguration(sBlock, false);
  // A program that names a model writes the model's name, not its devices;
  // the devices the model brings are configured all the same.
  CHostRobotConfiguration devicesOnly(config);
  devicesOnly.clearStandardModelName();
  devicesOnly.clearUserFileModelName();
  CString sDevicesBlock;
  devicesOnly.buildSourceCodeForConfiguration(sDevicesBlock, true);
  const TWrittenDevices written = findWrittenDevices(devicesOnly, sDevicesBlock);
  const TConfigurationSettings &settings = config.getSettings();

  json doc;
  doc["version"] = kDocumentVersion;
  const CPlatformType *pPlatform = getPlatformTypeForKind(settings.nPlatformKind);
  doc["platform"] = json{{"word", pPlatform ? utf8(pPlatform->pKeyword) : std::string()},
                         {"name", pPlatform ? utf8(pPlatform->pPlatformParms->pPlatformName) : std::string()}};
  doc["board"] = boardSection(config);
  doc["externalControllers"] = pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) != 0;
  doc["standardModel"] = wordOrNull(utf8(config.getStandardModelName()));
  doc["userModel"] = wordOrNull(utf8(config.getModelNameUserFile()));
  doc["hubs"] = hubsSection(config);

  json motors = json::array();
  for (int n = 0; n < kMaxNumbOfMotors; ++n)
    if (config.bIsValidMotorPort(n) && (options.bAll || written.motors.count(n)))
      motors.push_back(motorEntry(config, n, options.bChoices));
  doc["motors"] = motors;

  json sensors = json::array();
  for (int n = 0; n < sensorPortCount(config); ++n)
    if (!sensorPortWord(config, n).empty() && (options.bAll || written.sensors.count(n)))
      sensors.push_back(sensorEntry(config, n, options.bChoices));
  doc["sensors"] = sensors;

  json servos = json::array();
  for (int n = 0; n < kMaxNumbOfServos; ++n)
    if (config.bIsValidServoPort(n) && (options.bAll || written.servos.count(n)))
      servos.push_back(servoEntry(config, n, options.bChoices));
  doc["servos"] = servos;

  json positions = json::array();
  for (int n = 0; n < std::min(settings.nNumbOfServoPositions, kMaxNumbOfServoPositionSets); ++n) {
    json values = json::array();
    for (uint8_t nValue : settings.nServoPositions[size_t(n)]) values.push_back(nValue);
    positions.push_back(json{{"name", utf8(config.sServoPositionNames[size_t(n)])}, {"values", values}});
  }
  doc["servoPositions"] = positions;

  const json drive = driveSection(config, options.bAll);
  for (const auto &item : drive.items()) doc[item.key()] = item.value();
  const json serial = serialSection(config, written, options.bAll);
  doc["uarts"] = serial["uarts"];
  doc["i2c"] = serial["i2c"];
  const bool bProgramType = options.bAll || written.keywords.count(configTypeProgramType);
  doc["programType"] = bProgramType ? wordOrNull(tableWord(nProgramTypes, settings.nProgramType)) : json(nullptr);
  json firmware = json::array();
  for (const TFirmwareFeature &feature : kFirmwareFeatures)
    if (settings.*(feature.pFlag)) firmware.push_back(feature.pzWord);
  doc["firmware"] = firmware;
  doc["memory"] = memorySection(config);
  doc["network"] = networkSection(config);
  json datalog = json::array();
  for (const std::vector<CString> &series : config.getDatalogSeries()) {
    json words = json::array();
    for (const CString &sWord : series) words.push_back(utf8(sWord));
    datalog.push_back(words);
  }
  doc["datalogSeries"] = datalog;
  if (options.bChoices) doc["choices"] = choicesSection(config);
  doc["block"] = utf8(sBlock);
  return doc;
}

}  // namespace robotconfig::model
