#include "robotconfig/model/ConfigurationEdits.h"

#include <algorithm>
#include <array>
#include <cstring>

#include <nlohmann/json.hpp>

#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/model/ConfigurationDocument.h"
#include "robotconfig/model/ModelWords.h"
#include "robotconfig/program/ProgramText.h"
#include "robotconfig/sensors/ControllerBoards.h"
#include "robotconfig/sensors/SensorMenus.h"

namespace robotconfig::model {

namespace {

/// Hardware-type mask the drive-train menus are read with.
constexpr TSensorHWTypesMask kDriveMenuMask = 7;
/// Longest device name a configuration line keeps.
constexpr size_t kMaxNameLength = kMaxConfigTokenLength;

/// Words of C that cannot name a device.
constexpr const char *kReservedWords[] = {
    "auto",     "break",    "case",     "char",   "const",    "continue", "default",  "do",     "double",
    "else",     "enum",     "extern",   "float",  "for",      "goto",     "if",       "inline", "int",
    "long",     "register", "restrict", "return", "short",    "signed",   "sizeof",   "static", "struct",
    "switch",   "typedef",  "union",    "unsigned", "void",   "volatile", "while",    "bool",   "true",
    "false",    "task",     "main",     "string", "word",     "ubyte",    "sbyte"};

/// Firmware-feature words and their settings flags.
struct TFirmwareFeature {
  const char *pzWord;
  int32_t TConfigurationSettings::*pFlag;
};
constexpr std::array<TFirmwareFeature, 2> kFirmwareFeatures = {{
    {"fwTimedServo", &TConfigurationSettings::bFwTimedServo},
    {"fwSounds", &TConfigurationSettings::bFwSounds},
}};

/// True for the values that remove a device or empty a slot.
bool bIsNone(const std::string &sValue) { return sValue.empty() || sValue == "none" || sValue == "None"; }

/// Reads true/false (also on/off, yes/no, 1/0); false when the word is neither.
bool parseBool(const std::string &sValue, bool &bResult) {
  static constexpr std::array<const char *, 4> kTrue = {"true", "on", "yes", "1"};
  static constexpr std::array<const char *, 4> kFalse = {"false", "off", "no", "0"};
  for (const char *pz : kTrue)
    if (sValue == pz) return bResult = true, true;
  for (const char *pz : kFalse)
    if (sValue == pz) return bResult = false, true;
  return false;
}

/// The words joined for a message, "(none)" when there are none.
std::string joinWords(const std::vector<std::string> &words) {
  if (words.empty()) return "(none on this platform)";
  std::string sText;
  for (const std::string &sWord : words) sText += (sText.empty() ? "" : ", ") + sWord;
  return sText;
}

/// "" when the text can name a device in a program; else why not.
std::string nameProblem(const std::string &sName) {
  const auto bStart = [](char c) { return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || c == '_'; };
  const auto bInner = [&](char c) { return bStart(c) || (c >= '0' && c <= '9'); };
  if (sName.size() > kMaxNameLength) return "a name has at most 99 characters";
  if (!bStart(sName[0]) || !std::all_of(sName.begin(), sName.end(), bInner))
    return "a name starts with a letter or '_' and holds only letters, digits and '_'";
  for (const char *pzWord : kReservedWords)
    if (sName == pzWord) return "'" + sName + "' is a word of the language";
  return std::string();
}

/// Edits one configuration; each handler refuses with a message in m_sError.
class CEditor {
 public:
  explicit CEditor(CHostRobotConfiguration &config) : m_config(config) {}

  /// Applies one edit; false with the reason in error() when refused.
  bool apply(const TEdit &edit);
  const std::string &error() const { return m_sError; }

 private:
  bool fail(std::string sMessage) {
    m_sError = std::move(sMessage);
    return false;
  }
  bool editMotor(const std::string &sPort, const std::string &sField, const std::string &sValue);
  bool editSensor(const std::string &sPort, const std::string &sField, const std::string &sValue);
  bool editServo(const std::string &sPort, const std::string &sField, const std::string &sValue);
  bool editBoard(const std::string &sValue);
  bool editPlugins(const std::string &sValue);
  bool editSlots(const std::string &sGroup, const std::string &sField, const std::string &sValue);
  bool editJoystick(const std::string &sField, const std::string &sValue);
  bool editUart(const std::string &sPort, const std::string &sField, const std::string &sValue);
  bool editI2C(const std::string &sPort, const std::string &sField, const std::string &sValue);
  bool editProgramType(const std::string &sValue);
  bool editFirmware(const std::string &sWord, const std::string &sValue);
  /// Refuses a name a program could not use or that another device already has.
  bool checkName(const std::string &sName, const std::string &sOwnPort);
  /// The port word of the device that already uses a name; "" when none.
  std::string deviceNamed(const std::string &sName) const;

  CHostRobotConfiguration &m_config;
  std::string m_sError;
};

std::string CEditor::deviceNamed(const std::string &sName) const {
  const CString sWide = CString::fromUtf8(sName);
  CString sOther;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    m_config.getUserDefinedMotorNameInConfig(n, sOther);
    if (sOther == sWide && m_config.getMotorTypeInConfig(n) != 0) return motorPortWord(m_config, n);
  }
  for (int n = 0; n < sensorPortCount(m_config); ++n) {
    m_config.getUserDefinedSensorNameInConfig(n, sOther);
    if (sOther == sWide && m_config.getSensorTypeInConfig(n) != 0) return sensorPortWord(m_config, n);
  }
  for (int n = 0; n < kMaxNumbOfServos; ++n) {
    m_config.getUserDefinedServoNameInConfig(n, sOther);
    if (sOther == sWide && m_config.bIsValidServoPort(n)) return servoPortWord(n);
  }
  return std::string();
}

bool CEditor::checkName(const std::string &sName, const std::string &sOwnPort) {
  const std::string sProblem = nameProblem(sName);
  if (!sProblem.empty()) return fail("'" + sName + "' cannot name a device: " + sProblem);
  const std::string sOwner = deviceNamed(sName);
  if (!sOwner.empty() && sOwner != sOwnPort) return fail("the name '" + sName + "' is already used by " + sOwner);
  return true;
}

bool CEditor::editMotor(const std::string &sPort, const std::string &sField, const std::string &sValue) {
  const int nMotor = findMotorPort(m_config, sPort);
  if (nMotor < 0) {
    std::vector<std::string> ports;
    for (int n = 0; n < kMaxNumbOfMotors; ++n)
      if (m_config.bIsValidMotorPort(n)) ports.push_back(motorPortWord(m_config, n));
    return fail("no motor port '" + sPort + "' on this platform and board; motor ports: " + joinWords(ports));
  }
  bool bFlag = false;
  if (sField == "type") {
    if (bIsNone(sValue)) {
      m_config.setMotorTypeInConfig(nMotor, 0);
      return true;
    }
    const std::vector<std::string> choices = motorTypeChoices(m_config, nMotor);
    if (std::find(choices.begin(), choices.end(), sValue) == choices.end())
      return fail("'" + sValue + "' is not a motor type port " + sPort + " can take; choose one of: " + joinWords(choices));
    m_config.setMotorTypeInConfig(nMotor, getMotorTypedefNameIndex(CString::fromUtf8(sValue), m_config.getAorDMotorTypeMask(nMotor)));
    m_config.setEmptyMotorNameToDefaultName(nMotor);
    return true;
  }
  if (m_config.getMotorTypeInConfig(nMotor) <= 0) return fail("port " + sPort + " has no motor; set its type first");
  if (sField == "name") {
    if (!sValue.empty() && !checkName(sValue, sPort)) return false;
    m_config.setUserDefinedMotorNameInConfig(nMotor, CString::fromUtf8(sValue), emptyLineNumber);
    // The line reader gives an empty name the default one; so does the edit.
    m_config.setEmptyMotorNameToDefaultName(nMotor);
    return true;
  }
  if (sField == "reversed" || sField == "pidControl" || sField == "encoder") {
    if (!parseBool(sValue, bFlag)) return fail("'" + sValue + "' is not true or false");
    if (sField == "reversed") m_config.setMotorReversedInConfig(nMotor, bFlag);
    else if (sField == "encoder") m_config.setMotorEncoderInConfig(nMotor, bFlag);
    else if (bFlag && !m_config.getMotorEncoderInConfig(nMotor)) return fail("PID control needs the motor's encoder");
    else m_config.setMotorPIDControlledInConfig(nMotor, bFlag);
    return true;
  }
  if (sField == "encoderPort") {
    if (!pPlatformData->bPlatformAssociatesEncoderSensorWithMotor())
      return fail("motors on this platform do not name an encoder port");
    if (bIsNone(sValue)) {
      m_config.setMapEncoderToMotor(nMotor, -1);
      return true;
    }
    const int nEncoderPort = findSensorPort(m_config, sValue);
    if (nEncoderPort < 0) return fail("no sensor port '" + sValue + "' on this board");
    m_config.setMotorEncoderInConfig(nMotor, true);
    m_config.setMapEncoderToMotor(nMotor, nEncoderPort);
    return true;
  }
  if (sField == "driveSide") {
    const int nSide = menuValue(nDriveSideMenu, sValue);
    if (nSide < 0) return fail("'" + sValue + "' is not a drive side; choose one of: " + joinWords(menuWords(nDriveSideMenu)));
    m_config.setMotorDriveSideInConfig(nMotor, nSide);
    return true;
  }
  return fail("a motor has no setting '" + sField + "'; settings: type, name, reversed, pidControl, encoder, encoderPort, driveSide");
}

bool CEditor::editSensor(const std::string &sPort, const std::string &sField, const std::string &sValue) {
  const int nPort = findSensorPort(m_config, sPort);
  if (nPort < 0 || nPort >= sensorPortCount(m_config)) return fail("no sensor port '" + sPort + "' on this board");
  const TSensorTypes nOld = m_config.getSensorTypeInConfig(nPort);
  if (sField == "type") {
    // A pin that a motor, a serial port or the board holds is changed there.
    if (bIsSensorTypeSetElsewhere(nOld))
      return fail("port " + sPort + " holds " + utf8(getSensorTypeString(nOld)) + ", which the device using it sets");
    if (bIsNone(sValue)) {
      m_config.setSensorTypeInConfig(nPort, 0);
      return true;
    }
    const std::vector<std::string> choices = sensorTypeChoices();
    if (std::find(choices.begin(), choices.end(), sValue) == choices.end())
      return fail("'" + sValue + "' is not a sensor type of this platform; choose one of: " + joinWords(choices));
    m_config.setSensorTypeInConfig(nPort, getSensorTypeIndex(CString::fromUtf8(sValue), true));
    return true;
  }
  if (nOld == 0 || bIsSensorTypeSetElsewhere(nOld)) return fail("port " + sPort + " has no sensor; set its type first");
  if (sField == "name") {
    if (!sValue.empty() && !checkName(sValue, sPort)) return false;
    m_config.setUserDefinedSensorNameInConfig(nPort, CString::fromUtf8(sValue), emptyLineNumber);
    return true;
  }
  if (sField == "mode") {
    if (bIsNone(sValue)) {
      m_config.setSensorModeInConfig(nPort, 0);
      return true;
    }
    const std::vector<std::string> choices = sensorModeChoices(nOld);
    if (std::find(choices.begin(), choices.end(), sValue) == choices.end())
      return fail("'" + sValue + "' is not a mode of " + utf8(getSensorTypeString(nOld)) + "; choose one of: " + joinWords(choices));
    m_config.setSensorModeInConfig(nPort, getSensorModeIndex(nOld, CString::fromUtf8(sValue), true));
    return true;
  }
  return fail("a sensor has no setting '" + sField + "'; settings: type, name, mode");
}

bool CEditor::editServo(const std::string &sPort, const std::string &sField, const std::string &sValue) {
  const int nServo = findServoPort(m_config, sPort);
  if (nServo < 0) return fail("no servo port '" + sPort + "' on this platform");
  if (sField == "type") {
    if (bIsNone(sValue)) {
      m_config.setServoType(nServo, 0);
      return true;
    }
    const std::vector<std::string> choices = servoTypeChoices();
    if (std::find(choices.begin(), choices.end(), sValue) == choices.end())
      return fail("'" + sValue + "' is not a servo type; choose one of: " + joinWords(choices));
    m_config.setServoType(nServo, getServoTypedefNameIndex(CString::fromUtf8(sValue)));
    return true;
  }
  if (sField == "name") {
    if (!sValue.empty() && !checkName(sValue, sPort)) return false;
    m_config.setUserDefinedServoNameInConfig(nServo, CString::fromUtf8(sValue), emptyLineNumber);
    if (sValue.empty()) m_config.setEmptyServoNameToDefaultName(nServo);
    return true;
  }
  return fail("a servo has no setting '" + sField + "'; settings: type, name");
}

bool CEditor::editBoard(const std::string &sValue) {
  const std::vector<std::string> choices = boardChoices();
  if (choices.empty()) return fail("this platform has no board selection");
  const int nBoard = menuValue(getArduinoCircuitBoardTypeMenuDefn(), sValue);
  if (nBoard < 0) return fail("'" + sValue + "' is not a board of this platform; choose one of: " + joinWords(choices));
  if (nBoard != m_config.getCircuitBoardType()) {
    m_config.setCircuitBoardType(nBoard);
    m_config.updateCircuitBoardAndPlugInBoardTypes();
  }
  return true;
}

bool CEditor::editPlugins(const std::string &sValue) {
  if (m_config.getSettings().nPlatformKind != platformArduino) return fail("only Arduino boards take plug-in boards");
  std::array<int32_t, kNumbOfPluginSlots> slots{};
  size_t nSlot = 0, nStart = 0;
  while (nStart <= sValue.size() && !bIsNone(sValue)) {
    size_t nEnd = sValue.find(',', nStart);
    if (nEnd == std::string::npos) nEnd = sValue.size();
    const std::string sWord = sValue.substr(nStart, nEnd - nStart);
    const int nPlugin = menuValue(nPluginCircuitBoardTypes, sWord);
    if (nPlugin <= 0)
      return fail("'" + sWord + "' is not a plug-in board; choose from: " + joinWords(menuWords(nPluginCircuitBoardTypes)));
    if (nSlot >= slots.size()) return fail("a board takes at most 3 plug-in boards");
    slots[nSlot++] = nPlugin;
    nStart = nEnd + 1;
  }
  // The record has no setter of its own for the slots: the line reader fills them as here.
  const int32_t nClock = m_config.getCpuClockSpeed();
  m_config.settings.nPluginBoardTypes = slots;
  m_config.updateCircuitBoardAndPlugInBoardTypes();
  m_config.setCpuClockSpeed(static_cast<unsigned>(nClock));
  return true;
}

bool CEditor::editSlots(const std::string &sGroup, const std::string &sField, const std::string &sValue) {
  if (!pPlatformData->pPlatformParms->bSupportsDriveTrainConfig) return fail("this platform has no drive-train settings");
  const bool bDrive = sGroup == "drive";
  const TDeviceTypeMenuItem *pTable = bDrive ? nDriveTrainTypes : nGripperArmTypes;
  if (sField == "type") {
    const int nType = bIsNone(sValue) ? 0 : menuValue(pTable, sValue, kDriveMenuMask);
    if (nType < 0) return fail("'" + sValue + "' is not a type; choose one of: " + joinWords(menuWords(pTable, kDriveMenuMask)));
    if (bDrive) m_config.setDriveTrainType(nType);
    else m_config.setGripperArmType(nType);
    return true;
  }
  const int nCount = bDrive ? m_config.getNumbOfMotorsForDriveTrain() : m_config.getNumbOfMotorsForGripperArm();
  int nSlot = -1;
  if (sField.size() == 6 && sField.compare(0, 5, "motor") == 0) nSlot = sField[5] - '1';
  if (nSlot < 0 || nSlot >= nCount)
    return fail("no slot '" + sField + "'; the type takes motor1 to motor" + std::to_string(nCount));
  int nMotor = -1;
  if (!bIsNone(sValue)) {
    nMotor = findMotorPort(m_config, sValue);
    if (nMotor < 0) return fail("no motor port '" + sValue + "' on this platform and board");
  }
  if (bDrive) m_config.setDriveTrainMotorIndex(nSlot, nMotor);
  else m_config.setGripperArmMotorIndex(nSlot, nMotor);
  return true;
}

bool CEditor::editJoystick(const std::string &sField, const std::string &sValue) {
  if (!pPlatformData->pPlatformParms->bSupportsJoystickDriveConfig) return fail("this platform has no joystick drive");
  const bool bType = sField == "type";
  if (!bType && sField != "scaling") return fail("the joystick drive has no setting '" + sField + "'; settings: type, scaling");
  const TDeviceTypeMenuItem *pTable = bType ? nJoystickDriveTypes : nJoystickAxisScalingTypes;
  const int nValue = bIsNone(sValue) && bType ? 0 : menuValue(pTable, sValue, kDriveMenuMask);
  if (nValue < 0) return fail("'" + sValue + "' is not offered; choose one of: " + joinWords(menuWords(pTable, kDriveMenuMask)));
  if (bType) m_config.setJoystickMotorDriveType(nValue);
  else m_config.setJoystickMotorAxisScaling(nValue);
  return true;
}

bool CEditor::editUart(const std::string &sPort, const std::string &sField, const std::string &sValue) {
  const int nPort = menuValue(nUartIndex, sPort);
  if (nPort < 0 || nPort >= std::min(m_config.getMaxNumbOfUARTPorts(), kMaxNumbOfSerialPorts))
    return fail("no UART '" + sPort + "' on this board");
  if (sField == "use") {
    const int nMode = menuValue(nUARTTypes, sValue);
    if (nMode < 0) return fail("'" + sValue + "' is not a UART use; choose one of: " + joinWords(menuWords(nUARTTypes)));
    m_config.setUARTType(nPort, nMode);
    m_config.setBaudRate(nPort, getDefaultBaudRateForUartMode(nMode));
    // A UART_Usage line claims the port's pins whatever its use.
    m_config.setUartIOPinsInConfig(nPort);
    return true;
  }
  if (sField == "baud") {
    const int nBaud = menuValue(nUARTBaudRates, sValue);
    if (nBaud < 0) return fail("'" + sValue + "' is not a baud rate; choose one of: " + joinWords(menuWords(nUARTBaudRates)));
    m_config.setBaudRate(nPort, nBaud);
    m_config.setUartIOPinsInConfig(nPort);
    return true;
  }
  return fail("a UART has no setting '" + sField + "'; settings: use, baud");
}

bool CEditor::editI2C(const std::string &sPort, const std::string &sField, const std::string &sValue) {
  const int nPort = menuValue(nI2CIndex, sPort);
  if (nPort < 0 || nPort >= std::min(m_config.getMaxNumbOfI2CPorts(), kMaxNumbOfSerialPorts))
    return fail("no I2C port '" + sPort + "' on this board");
  if (sField != "use") return fail("an I2C port has no setting '" + sField + "'; settings: use");
  const int nMode = menuValue(nI2CTypes, sValue);
  if (nMode < 0) return fail("'" + sValue + "' is not an I2C use; choose one of: " + joinWords(menuWords(nI2CTypes)));
  // The record keeps the use without a setter; the I2C_Usage reader stores it so too.
  m_config.settings.nI2CMode[size_t(nPort)] = nMode;
  m_config.setI2CIOPinsInConfig(nPort);
  return true;
}

bool CEditor::editProgramType(const std::string &sValue) {
  const int nType = menuValue(nProgramTypes, sValue);
  if (nType < 0) return fail("'" + sValue + "' is not a program type; choose one of: " + joinWords(menuWords(nProgramTypes)));
  // Only some platforms and values have a ProgramType line; a value no line
  // carries would be lost on writing.
  CHostRobotConfiguration written(m_config);
  written.settings.nProgramType = nType;
  CString sBlock;
  written.buildSourceCodeForConfiguration(sBlock, false);
  if (!findWrittenDevices(written, sBlock).keywords.count(configTypeProgramType))
    return fail("the configuration lines of this platform cannot carry program type '" + sValue + "'");
  m_config.settings.nProgramType = nType;
  return true;
}

bool CEditor::editFirmware(const std::string &sWord, const std::string &sValue) {
  bool bOn = false;
  if (!parseBool(sValue, bOn)) return fail("'" + sValue + "' is not true or false");
  for (const TFirmwareFeature &feature : kFirmwareFeatures)
    if (sWord == feature.pzWord) {
      m_config.settings.*(feature.pFlag) = bOn ? 1 : 0;
      return true;
    }
  return fail("no firmware feature '" + sWord + "'; features: fwTimedServo, fwSounds");
}

bool CEditor::apply(const TEdit &edit) {
  std::vector<std::string> parts;
  size_t nStart = 0;
  for (;;) {
    const size_t nDot = edit.sPath.find('.', nStart);
    parts.push_back(edit.sPath.substr(nStart, nDot == std::string::npos ? std::string::npos : nDot - nStart));
    if (nDot == std::string::npos) break;
    nStart = nDot + 1;
  }
  const std::string &sSection = parts[0];
  const std::string &sValue = edit.sValue;
  const size_t nParts = parts.size();
  // A device path without a setting sets the device's type.
  const std::string sDeviceField = nParts == 3 ? parts[2] : "type";
  if ((sSection == "motor" || sSection == "sensor" || sSection == "servo") && (nParts == 2 || nParts == 3)) {
    if (sSection == "motor") return editMotor(parts[1], sDeviceField, sValue);
    if (sSection == "sensor") return editSensor(parts[1], sDeviceField, sValue);
    return editServo(parts[1], sDeviceField, sValue);
  }
  if (sSection == "uart" && (nParts == 2 || nParts == 3)) return editUart(parts[1], nParts == 3 ? parts[2] : "use", sValue);
  if (sSection == "i2c" && (nParts == 2 || nParts == 3)) return editI2C(parts[1], nParts == 3 ? parts[2] : "use", sValue);
  if ((sSection == "drive" || sSection == "gripper") && nParts == 2) return editSlots(sSection, parts[1], sValue);
  if (sSection == "joystick" && nParts == 2) return editJoystick(parts[1], sValue);
  if (sSection == "board" && nParts == 1) return editBoard(sValue);
  if (sSection == "plugins" && nParts == 1) return editPlugins(sValue);
  if (sSection == "programType" && nParts == 1) return editProgramType(sValue);
  if (sSection == "firmware" && nParts == 2) return editFirmware(parts[1], sValue);
  return fail(std::string("unknown path; paths are:\n") + editPathHelp());
}

/// Slots of the drive train and gripper arm that a line cannot leave empty,
/// as "PATH: reason" messages; checked once all edits are made, since the
/// type comes before its motors.
std::vector<std::string> emptySlotProblems(const CRobotConfigurationBasic &config) {
  static constexpr bool kOptionalGripperSlot[] = {false, true, false, true};
  std::vector<std::string> problems;
  const std::string sDrive = tableWord(nDriveTrainTypes, config.getDriveTrainType());
  for (int nSlot = 0; nSlot < config.getNumbOfMotorsForDriveTrain(); ++nSlot)
    if (!config.bIsValidMotorPort(config.getDriveTrainMotorIndex(nSlot)))
      problems.push_back("drive.motor" + std::to_string(nSlot + 1) + ": the drive train " + sDrive +
                         " needs a motor in this slot");
  const std::string sGripper = tableWord(nGripperArmTypes, config.getGripperArmType());
  for (int nSlot = 0; nSlot < std::min(config.getNumbOfMotorsForGripperArm(), 4); ++nSlot)
    if (!kOptionalGripperSlot[nSlot] && !config.bIsValidMotorPort(config.getGripperArmMotorIndex(nSlot)))
      problems.push_back("gripper.motor" + std::to_string(nSlot + 1) + ": the gripper arm " + sGripper +
                         " needs a motor in this slot");
  return problems;
}

/// Gives motors the names and PID settings the line reader would: a motor
/// written with its default name reads back with that name, an unwritten one
/// with none; a motor without PID settings of its own gets its type's when
/// written, and none (as after clearing) when not.
void settleMotorDefaults(CHostRobotConfiguration &config) {
  CHostRobotConfiguration written(config);
  CString sBlock, sName, sDefault, sHubDefault;
  written.buildSourceCodeForConfiguration(sBlock, false);
  const TWrittenDevices devices = findWrittenDevices(written, sBlock);
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    config.getUserDefinedMotorNameInConfig(n, sName);
    config.getDefaultMotorName(n, sDefault);
    config.getDefaultMotorNameAdjustedForTetrix(n, sHubDefault);
    const bool bWritten = devices.motors.count(n) != 0;
    if (config.bIsMotorUsingDefaultPidSettings(n)) {
      if (bWritten) config.setMotorPidSettingsDefaultInConfig(n, written.getMotorTypeInConfig(n));
      else config.setMotorPidSettings(n, emptyPidSettings);
    }
    if (!sName.IsEmpty() && sName != sDefault && sName != sHubDefault) continue;
    config.setUserDefinedMotorNameInConfig(n, CString(), emptyLineNumber);
    if (bWritten) config.setEmptyMotorNameToDefaultName(n);
  }
}

}  // namespace

const char *editPathHelp() {
  return "  motor.PORT[.type|.name|.reversed|.pidControl|.encoder|.encoderPort|.driveSide]=VALUE\n"
         "  sensor.PORT[.type|.name|.mode]=VALUE\n"
         "  servo.PORT[.type|.name]=VALUE\n"
         "  board=WORD   plugins=WORD[,WORD...]   programType=WORD   firmware.FEATURE=true|false\n"
         "  drive.type=WORD   drive.motorN=PORT   gripper.type=WORD   gripper.motorN=PORT\n"
         "  joystick.type=WORD   joystick.scaling=WORD\n"
         "  uart.PORT[.use|.baud]=WORD   i2c.PORT[.use]=WORD\n";
}

bool parseEditAssignment(const std::string &sText, TEdit &edit, std::string &sError) {
  const size_t nEquals = sText.find('=');
  if (nEquals == std::string::npos || nEquals == 0) {
    sError = "'" + sText + "' is no edit: write PATH=VALUE";
    return false;
  }
  edit.sPath = sText.substr(0, nEquals);
  edit.sValue = sText.substr(nEquals + 1);
  return true;
}

bool parseEditList(const std::string &sJson, std::vector<TEdit> &edits, std::string &sError) {
  edits.clear();
  const nlohmann::json list = nlohmann::json::parse(sJson, nullptr, false);
  if (list.is_discarded()) {
    sError = "the edits are not valid JSON";
    return false;
  }
  if (!list.is_array()) {
    sError = "the edits must be a JSON list of {\"op\": \"set\", \"path\": ..., \"value\": ...}";
    return false;
  }
  std::vector<TEdit> parsed;
  for (size_t n = 0; n < list.size(); ++n) {
    const nlohmann::json &item = list[n];
    const std::string sWhere = "edit " + std::to_string(n + 1) + ": ";
    if (!item.is_object()) {
      sError = sWhere + "an edit is an object";
      return false;
    }
    for (const auto &[sKey, value] : item.items())
      if (sKey != "op" && sKey != "path" && sKey != "value") {
        sError = sWhere + "unknown key '" + sKey + "'";
        return false;
      }
    const auto op = item.find("op");
    if (op != item.end() && (!op->is_string() || op->get<std::string>() != "set")) {
      sError = sWhere + "unknown operation " + op->dump() + "; the operation is \"set\"";
      return false;
    }
    const auto path = item.find("path");
    if (path == item.end() || !path->is_string() || path->get<std::string>().empty()) {
      sError = sWhere + "\"path\" must be a non-empty string";
      return false;
    }
    const auto value = item.find("value");
    TEdit edit{path->get<std::string>(), std::string()};
    if (value == item.end()) {
      sError = sWhere + "\"value\" is missing";
      return false;
    }
    if (value->is_string()) edit.sValue = value->get<std::string>();
    else if (value->is_boolean()) edit.sValue = value->get<bool>() ? "true" : "false";
    else if (value->is_number_integer()) edit.sValue = value->dump();
    else if (!value->is_null()) {
      sError = sWhere + "\"value\" must be a string, true/false, an integer or null";
      return false;
    }
    parsed.push_back(std::move(edit));
  }
  edits = std::move(parsed);
  return true;
}

std::vector<std::string> applyEdits(CHostRobotConfiguration &config, const std::vector<TEdit> &edits) {
  CHostRobotConfiguration edited(config);
  CEditor editor(edited);
  std::vector<std::string> errors;
  for (const TEdit &edit : edits)
    if (!editor.apply(edit)) errors.push_back(edit.sPath + ": " + editor.error());
  if (errors.empty()) errors = emptySlotProblems(edited);
  if (!errors.empty()) return errors;
  settleMotorDefaults(edited);
  // The last word is the block's: what it cannot carry is refused, not lost.
  const std::string sCarried = checkBlockReadsBack(edited);
  if (!sCarried.empty()) {
    std::string sPaths;
    for (const TEdit &edit : edits) sPaths += (sPaths.empty() ? "" : ", ") + edit.sPath;
    return {sPaths + ": " + sCarried};
  }
  config = edited;
  return errors;
}

std::string checkBlockReadsBack(const CHostRobotConfiguration &config) {
  CHostRobotConfiguration written(config);
  CString sBlock;
  written.buildSourceCodeForConfiguration(sBlock, false);
  CHostSelectionScope selection;
  CCapturingMessageSink quiet;
  CHostRobotConfiguration reread;
  const std::vector<TConfigurationDiagnostic> refused = readProgramConfiguration(reread, CProgramText(sBlock.toUtf8()));
  if (!refused.empty()) return "the written block would not read back: " + refused.front().sMessage.toUtf8();
  if (written.compareConfiguration(reread) == configCompareSame) return std::string();
  // Say what would change, as the documents show it.
  nlohmann::json before = nlohmann::json::parse(configurationDocument(written, {true, false}).dump());
  nlohmann::json after = nlohmann::json::parse(configurationDocument(reread, {true, false}).dump());
  before.erase("block");
  after.erase("block");
  std::string sChanges;
  for (const nlohmann::json &change : nlohmann::json::diff(before, after)) {
    if (change.value("op", "") != "replace") continue;
    sChanges += (sChanges.empty() ? "" : ", ") + change["path"].get<std::string>() + " would read back as " + change["value"].dump();
  }
  return "the configuration lines cannot carry this" + (sChanges.empty() ? std::string() : ": " + sChanges);
}

}  // namespace robotconfig::model
