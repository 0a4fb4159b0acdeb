// Layer record (core/, motors/, sensors/, drive_serial_network/): built on host/ alone.
// The robot configuration of one user program: every motor, sensor, servo,
// hub, serial port, board, drive-train, memory and network setting that the
// program's "#pragma config(...)" block describes, how that block is read
// line by line, and how it is written back.
//
// The class is abstract: a host derives its own configuration class from it
// and supplies the pure virtual operations (see host/HostConfiguration.h for
// the reference host class).
#pragma once

#include <array>
#include <cstdint>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceTypes.h"
#include "robotconfig/host/LineNumber.h"
#include "robotconfig/host/PidSettings.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorIOPins.h"

namespace Networking {
class CNtwkInfoFromPragmas;
}
struct TDeviceTypeMenuItem;

/// Fixed capacities of the record.
constexpr int kMaxNumbOfMotors = 36;
constexpr int kMaxNumbOfSensorPorts = 98;
constexpr int kMaxNumbOfServos = 128;
constexpr int kMaxNumbOfServoPositionSets = 40;
constexpr int kNumbOfServoPositionsPerSet = 8;
constexpr int kMaxNumbOfSerialPorts = 6;
constexpr int kNumbOfPluginSlots = 3;
constexpr int kNumbOfHubSensorPorts = 4;
constexpr int kNumbOfHubChainPositions = 4;
constexpr int kNumbOfMemorySizes = 3;

/// The start and end markers that frame the generated-code comment line, and
/// the marker of an empty configuration block.
extern const wchar_t *const sConfigStartMarker;     // "//*!!"
extern const wchar_t *const sConfigEndMarker;       // "!!*//"
extern const wchar_t *const sConfigEmptyBlockMarker;  // "//*!!!!*//"

/// One motor index of the settings block.
struct TMotorSlot {
  TMotorTypes nMotorType;
  bool bEncoder;
  bool bPIDControlled;
  bool bReversed;
  uint8_t nSpareByte = 0;  ///< named so that the slot has no padding
  TMotorDriveSide nDriveSide;  ///< 0 none, 1 left, 2 right
  int32_t nEncoderPort;        ///< sensor port of the encoder, -1 none
  int32_t nPrimaryIOPin;       ///< sensor port of the first IO pin, -1 none
  int32_t nSecondaryIOPin;     ///< sensor port of the second IO pin, -1 none
  TPidSettings pidSettings;
};

/// Every scalar setting of a configuration, cleared, copied and compared as
/// one block of plain data.
struct TConfigurationSettings {
  int32_t nPlatformKind;  ///< platform kind when the record was last cleared
  TControllerBoardType nCircuitBoardType;
  std::array<int32_t, 3> nSpareWords;
  int32_t bFwTimedServo;
  int32_t bFwSounds;
  TJoystickDriveType nJoystickMotorDriveType;
  TJoystickAxisScaling nJoystickMotorAxisScaling;
  TGripperArmType nGripperArmType;
  std::array<int32_t, 4> nGripperArmMotorIndex;   ///< -1 none
  std::array<uint16_t, 5> nDriveTrainWheels;
  std::array<uint8_t, 4> nDriveTrainMotorIndex;   ///< 255 none
  uint8_t nDriveTrainType;
  uint8_t nSpareByte = 0;  ///< named so that the block has no padding
  std::array<TMotorSlot, kMaxNumbOfMotors> motors;
  const TMotorIOPinsDefinition *pMotorIOPinTable;  ///< board's pin table, not owned
  int32_t nNumbOfEntriesInMotorIOPinTable;
  std::array<TSensorTypes, kMaxNumbOfSensorPorts> nSensorTypes;
  std::array<TSensorModes, kMaxNumbOfSensorPorts> nSensorModes;
  std::array<TServoTypes, kMaxNumbOfServos> nServoTypes;
  std::array<int32_t, kMaxNumbOfServos> nServoSettings;
  std::array<int32_t, kMaxNumbOfSensorPorts> nI2CAddresses;
  std::array<std::array<uint8_t, kNumbOfServoPositionsPerSet>, kMaxNumbOfServoPositionSets> nServoPositions;
  int32_t nNumbOfServoPositions;
  std::array<TSerialPortMode, kMaxNumbOfSerialPorts> nUARTMode;
  std::array<TBaudRate, kMaxNumbOfSerialPorts> nUARTBaudRate;
  std::array<int32_t, kMaxNumbOfSerialPorts> nI2CMode;
  int32_t nUnnamedAfterI2CMode;  ///< 1 after a clear; kept, never interpreted
  int32_t nProgramType;
  std::array<int32_t, kNumbOfMemorySizes> nMemorySizes;  ///< -1 = auto
  std::array<int32_t, kNumbOfPluginSlots> nPluginBoardTypes;
  int32_t nCpuClockSpeed;
  std::array<std::array<TSensorPortHub, kNumbOfHubChainPositions>, kNumbOfHubSensorPorts> nSensorPortHubs;
  std::array<int32_t, kMaxNumbOfSensorPorts> nSecondaryPorts;  ///< -1 none
  int32_t nSpareTailWord = 0;  ///< named so that the block has no padding
};

/// Definition lines and values derived while reading.
struct TConfigurationParseInfo {
  TLineNumber firstConfigLine;
  bool bFirstConfigLineSeen;
  bool bNonCanonicalPortNames;
  std::array<TLineNumber, kMaxNumbOfServos> servoDefinitionLines;
  std::array<TLineNumber, kMaxNumbOfSensorPorts> sensorDefinitionLines;
  std::array<TLineNumber, kMaxNumbOfMotors> motorDefinitionLines;
  bool bMotorListIndexMappingBuilt;
  std::array<int32_t, kMaxNumbOfMotors> nMotorListIndexMapping;
  std::array<int32_t, 3> nCompileCodeSizeResults;

  /// Default-constructs the line numbers and leaves the other members unset.
  TConfigurationParseInfo() {}  // NOLINT: members are set by the record's clear
};

/// Class of a tokenized source line.
enum TTokenizedLineType : int32_t {
  lineTypeBlank = 0,
  lineTypeOther = 1,
  lineTypeMarkerComment = 2,
  lineTypeConfigPragma = 3,
  lineTypeContainsMarker = 4,
  lineTypeNoTokens = 5,
};

constexpr int kMaxConfigTokens = 13;
constexpr int kMaxConfigTokenLength = 99;

/// A configuration line split into its keyword (element 0) and parameters.
struct TTokenizedConfigParms {
  int32_t nNumbOfParms = 0;  ///< tokens stored, the keyword included
  std::array<CString, kMaxConfigTokens> sParms;
};

/// Configuration keywords by value; the keyword table spells them.
typedef int32_t TConfigTypes;
enum : int32_t {
  configTypeStandardModel = 0,
  configTypeUserModel = 1,
  configTypeRenameMotor = 2,
  configTypeRenameSensor = 3,
  configTypeDriveTrainMotors = 4,
  configTypeDriveTrainWheels = 5,
  configTypeGripperArm = 6,
  configTypeJoystickDrive = 7,
  configTypeFirmwareFeatures = 8,
  configTypeHubs = 9,
  configTypeMotor = 10,
  configTypeMotorPidSetting = 11,
  configTypeSensor = 12,
  configTypeServo = 13,
  configTypeServoPosition = 14,
  configTypeCpuParameters = 15,
  configTypeProgramType = 16,
  configTypeCircuitBoardType = 17,
  configTypePluginCircuitBoard = 18,
  configTypeUartUsage = 19,
  configTypeI2CUsage = 20,
  configTypeMemorySize = 21,
  configTypeDatalogSeries = 22,
  configTypeNetworkDefinition = 23,
  configTypeNetworkNode = 24,
  configTypeAnalog = 25,
  configTypeNotFound = -1,
};
constexpr int kNumbOfConfigTypes = 26;

/// The keyword table, reached through the exported `nConfigTypeNames`.
class TConfigTypeDefns {
 public:
  /// Keyword of a value 0..25 (the canonical spelling); "" outside that range.
  static const wchar_t *getConfigTypeName(TConfigTypes nType);
  /// Value of a keyword compared without regard to case; -1 when none.
  static TConfigTypes lookupConfigType(const CString &sKeyword);
};
extern const TConfigTypeDefns nConfigTypeNames;

/// Result of comparing two configurations.
typedef int32_t TConfigCompareResults;
enum : int32_t {
  configCompareSame = 0,
  configCompareNamesDiffer = 1,
  configCompareSettingsDiffer = 2,
  configCompareModelNamesDiffer = 4,
};

class CRobotConfigurationBasic {
 public:
  CRobotConfigurationBasic();
  CRobotConfigurationBasic(const CRobotConfigurationBasic &source);
  virtual ~CRobotConfigurationBasic();

  // ---- Virtual operations, in slot order -------------------------------
  /// Path of the program file the configuration belongs to.
  virtual void getPathName(CString &sPath);
  /// Host: records the program file's path (never called by the library).
  virtual void setPathName(const CString &sPath) = 0;
  /// Host: whether its own data equals that of another configuration.
  virtual bool bIsHostDataEqual(int nOtherHostData) const = 0;
  /// Host: takes over another configuration's host data.
  virtual void copyHostData(int nSourceHostData) = 0;
  /// Host: marks the configuration as changed (never called by the library).
  virtual void setModified(bool bModified) = 0;
  virtual TConfigCompareResults compareConfiguration(const CRobotConfigurationBasic &other) const;
  virtual void copyFrom(const CRobotConfigurationBasic &source);
  /// Resets every UART to the platform default and every I2C port to unused.
  virtual void clearUartAndI2CDefinition();
  /// Removes VEX I2C encoder sensors that no motor uses.
  virtual void clearUnusedVexI2CEncoders();
  /// Brings the record to the state of a program without configuration lines
  /// for the current platform and the board chosen in the IDE.
  virtual void clearConfigurationDefinition();
  /// Host: whether the configuration has changed (never called by the library).
  virtual bool bIsModified() const = 0;

 private:
  /// Reader of "UserModel" lines; this version accepts nothing.
  virtual bool bParseConfigDefinitionLineFileNameForUserModel(const TTokenizedConfigParms &parms, bool bFlag,
                                                              TLineNumber line, const CString &sSourceFile,
                                                              CString &sError);

 protected:
  /// Host: reads a "DatalogSeries" line (false + message = rejected).
  virtual bool bParseConfigDefinitionLineDatalogSeries(const TTokenizedConfigParms &parms, bool bFlag,
                                                       TLineNumber line, CString &sError) = 0;
  /// Host: appends its "DatalogSeries" lines; true when it appended any.
  virtual bool buildSourceCodeForDatalogSeries() = 0;

 public:
  const CRobotConfigurationBasic &operator=(const CRobotConfigurationBasic &source);
  int operator==(const CRobotConfigurationBasic &other) const;
  int operator!=(const CRobotConfigurationBasic &other) const;

  // ---- Reading a program ------------------------------------------------
  /// Classifies one source line and splits a configuration line into tokens.
  static TTokenizedLineType nTokenizeLine(const CString &sLine, TTokenizedConfigParms &parms);
  /// The same, and `bCut` tells whether a configuration line held more than
  /// the tokens kept: a word longer than 99 characters, or words after the 13th.
  static TTokenizedLineType nTokenizeLineReportingCuts(const CString &sLine, TTokenizedConfigParms &parms,
                                                       bool &bCut);
  /// Reads one tokenized configuration line; false = rejected, message in sError.
  bool bParseConfigDefinitionLine(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                  const CString &sSourceFile, CString &sError);
  void initializeMultiRobotNetworkDefinitionBeforeParsingConfiguration();
  void normalizeValuesAfterParsingConfiguration();
  void validateMultiRobotNetworkDefinitionAfterParsingConfiguration();

  // ---- Writing a program -------------------------------------------------
  /// Builds the configuration block; true when any writer wrote something.
  bool buildSourceCodeForConfiguration(CString &sOutput, bool bSkipStandardModel);

  // ---- Accessors -----------------------------------------------------------
  // Indexes are checked: out of range, a read gives the "none" answer and a
  // write changes nothing.
  static bool bIsMotorIndex(int n) { return n >= 0 && n < kMaxNumbOfMotors; }
  static bool bIsSensorIndex(int n) { return n >= 0 && n < kMaxNumbOfSensorPorts; }
  static bool bIsServoIndex(int n) { return n >= 0 && n < kMaxNumbOfServos; }
  static bool bIsSerialPortIndex(int n) { return n >= 0 && n < kMaxNumbOfSerialPorts; }

  int getSecondaryPort(int nPort) const { return bIsSensorIndex(nPort) ? settings.nSecondaryPorts[size_t(nPort)] : -1; }
  void getUserDefinedMotorNameInConfig(int nMotor, CString &sName) const {
    sName = bIsMotorIndex(nMotor) ? sMotorNames[size_t(nMotor)] : CString();
  }
  void getUserDefinedServoNameInConfig(int nServo, CString &sName) const {
    sName = bIsServoIndex(nServo) ? sServoNames[size_t(nServo)] : CString();
  }
  void getUserDefinedSensorNameInConfig(int nPort, CString &sName) const {
    sName = bIsSensorIndex(nPort) ? sSensorNames[size_t(nPort)] : CString();
  }
  TMotorTypes getMotorTypeInConfig(int nMotor) const {
    return bIsMotorIndex(nMotor) ? settings.motors[size_t(nMotor)].nMotorType : 0;
  }
  bool getMotorReversedInConfig(int nMotor) const {
    return bIsMotorIndex(nMotor) && settings.motors[size_t(nMotor)].bReversed;
  }
  void setMotorReversedInConfig(int nMotor, bool bReversed) {
    if (bIsMotorIndex(nMotor)) settings.motors[size_t(nMotor)].bReversed = bReversed;
  }
  TMotorDriveSide getMotorDriveSideInConfig(int nMotor) const {
    return bIsMotorIndex(nMotor) ? settings.motors[size_t(nMotor)].nDriveSide : 0;
  }
  void setMotorDriveSideInConfig(int nMotor, TMotorDriveSide nSide) {
    if (bIsMotorIndex(nMotor)) settings.motors[size_t(nMotor)].nDriveSide = nSide;
  }
  bool getMotorPIDControlledInConfig(int nMotor) const {
    return bIsMotorIndex(nMotor) && settings.motors[size_t(nMotor)].bPIDControlled;
  }
  void setMotorPIDControlledInConfig(int nMotor, bool bPID) {
    if (bIsMotorIndex(nMotor)) settings.motors[size_t(nMotor)].bPIDControlled = bPID;
  }
  bool getMotorEncoderInConfig(int nMotor) const { return bIsMotorIndex(nMotor) && settings.motors[size_t(nMotor)].bEncoder; }
  /// Turning the encoder off also turns PID control off.
  void setMotorEncoderInConfig(int nMotor, bool bEncoder);
  const TLineNumber &getMotorDefinitionLine(int nMotor) const {
    return bIsMotorIndex(nMotor) ? parseInfo.motorDefinitionLines[size_t(nMotor)] : emptyLineNumber;
  }
  void setMotorDefinitionLine(int nMotor, const TLineNumber &line) {
    if (bIsMotorIndex(nMotor)) parseInfo.motorDefinitionLines[size_t(nMotor)] = line;
  }
  TSensorTypes getSensorTypeInConfig(int nPort) const {
    return bIsSensorIndex(nPort) ? settings.nSensorTypes[size_t(nPort)] : 0;
  }
  TSensorModes getSensorModeInConfig(int nPort) const {
    return bIsSensorIndex(nPort) ? settings.nSensorModes[size_t(nPort)] : 0;
  }
  const TLineNumber &getSensorDefinitionLine(int nPort) const {
    return bIsSensorIndex(nPort) ? parseInfo.sensorDefinitionLines[size_t(nPort)] : emptyLineNumber;
  }
  void setSensorDefinitionLine(int nPort, const TLineNumber &line) {
    if (bIsSensorIndex(nPort)) parseInfo.sensorDefinitionLines[size_t(nPort)] = line;
  }
  TServoTypes getServoType(int nServo) const { return bIsServoIndex(nServo) ? settings.nServoTypes[size_t(nServo)] : 0; }
  void setServoType(int nServo, TServoTypes nType) {
    if (bIsServoIndex(nServo)) settings.nServoTypes[size_t(nServo)] = nType;
  }
  int getI2C_Address(int nPort) const { return bIsSensorIndex(nPort) ? settings.nI2CAddresses[size_t(nPort)] : 0; }
  void setI2C_Address(int nPort, int nAddress) {
    if (bIsSensorIndex(nPort)) settings.nI2CAddresses[size_t(nPort)] = nAddress;
  }
  const TLineNumber &getServoDefinitionLine(int nServo) const {
    return bIsServoIndex(nServo) ? parseInfo.servoDefinitionLines[size_t(nServo)] : emptyLineNumber;
  }
  void setServoDefinitionLine(int nServo, const TLineNumber &line) {
    if (bIsServoIndex(nServo)) parseInfo.servoDefinitionLines[size_t(nServo)] = line;
  }
  TSerialPortMode getUARTType(int nUart) const { return bIsSerialPortIndex(nUart) ? settings.nUARTMode[size_t(nUart)] : 0; }
  TBaudRate getBaudRate(int nUart) const { return bIsSerialPortIndex(nUart) ? settings.nUARTBaudRate[size_t(nUart)] : 0; }
  const TMotorIOPinsDefinition *getMotorIOPins() const { return settings.pMotorIOPinTable; }
  /// Row `nRow` of the pin table; null outside the table.
  const TMotorIOPinsDefinition *getMotorIOPin(int nRow) const {
    return (settings.pMotorIOPinTable && nRow >= 0 && nRow < settings.nNumbOfEntriesInMotorIOPinTable)
               ? settings.pMotorIOPinTable + nRow
               : nullptr;
  }
  int getNumbOfEntriesInMotorIOPinTable() const { return settings.nNumbOfEntriesInMotorIOPinTable; }
  int getCpuClockSpeed() const { return settings.nCpuClockSpeed; }
  void setCpuClockSpeed(unsigned nSpeed) { settings.nCpuClockSpeed = static_cast<int32_t>(nSpeed); }
  TControllerBoardType getCircuitBoardType() const { return settings.nCircuitBoardType; }
  const CString &getStandardModelName() const { return sStandardModelName; }
  const CString &getModelNameUserFile() const { return sModelNameUserFile; }
  TDriveTrainType getDriveTrainType() const { return settings.nDriveTrainType; }
  TGripperArmType getGripperArmType() const { return settings.nGripperArmType; }
  TJoystickDriveType getJoystickMotorDriveType() const { return settings.nJoystickMotorDriveType; }
  TJoystickAxisScaling getJoystickMotorAxisScaling() const { return settings.nJoystickMotorAxisScaling; }

  /// Motors of a drive-train type: 2 for types 1 and 2, 4 for 3, 4, 5 and 7,
  /// 3 for 6, else 0.
  static int getNumbOfMotorsForDriveTrain(TDriveTrainType nType);
  /// Motors of a gripper-arm type: 4 for types 1 and 2, else 0.
  static int getNumbOfMotorsForGripperArm(TGripperArmType nType);
  int getNumbOfMotorsForDriveTrain() const { return getNumbOfMotorsForDriveTrain(settings.nDriveTrainType); }
  int getNumbOfMotorsForGripperArm() const { return getNumbOfMotorsForGripperArm(settings.nGripperArmType); }

  /// Read-only view of the plain-data blocks.
  const TConfigurationSettings &getSettings() const { return settings; }
  const TConfigurationParseInfo &getParseInfo() const { return parseInfo; }

  // ---- Motor types ---------------------------------------------------------
  TMotorTypes getDefaultMotorType(int nMotor) const;
  TMotorTypes getMotorTypeWithOptionalAdjustForMotorTypeNone(int nMotor) const;
  TMotorTypes adjustLegacyMotorNormalDeprecated(int nMotor);
  void setMotorTypeInConfig(int nMotor, TMotorTypes nType);
  void normalizeLegacyMotorConfiguration(int nMotor);
  bool bGetDefaultEncoderSetting(int nMotor) const;
  bool bGetDefaultPidControlSetting(int nMotor) const;
  bool bGetDefaultMotorReversedSetting(int nMotor) const;

  // ---- Default motor names ------------------------------------------------------
  void getDefaultMotorNameLowLevel(int nMotor, CString &sName, bool bHubStyle) const;
  void getDefaultMotorName(int nMotor, CString &sName) const { getDefaultMotorNameLowLevel(nMotor, sName, false); }
  void getDefaultMotorNameAdjustedForTetrix(int nMotor, CString &sName) const {
    getDefaultMotorNameLowLevel(nMotor, sName, true);
  }
  void getDefaultMotorNameForPlatformOrControllerBoard(int nMotor, CString &sName) const;
  void updateDefaultMotorNameForPlatformOrControllerBoard(TMotorIndex nMotor, const wchar_t *pzName);
  int getIndexForDefaultMotorName(const CString &sName) const;
  void setUserDefinedMotorNameInConfig(int nMotor, const CString &sName, const TLineNumber &line);
  void setEmptyMotorNameToDefaultName(int nMotor);

  // ---- Motor ports, IO pins and hubs ---------------------------------------
  bool bSharedPortsForMotorsAndSensors() const;
  int getMaxNumbOfMotorPorts() const;
  bool bIsValidMotorPort(int nMotor) const;
  bool bIsValidServoPort(int nServo) const;
  int getMotorMuxNumbOfMotors(TSensorPortHub nHub) const;
  int getServoMuxNumbOfServos(TSensorPortHub nHub) const;
  TSensorPortHub getMotorMuxForMotor(int nMotor) const;
  TMotorIndex getDeviceIndexOnMotorHub(TSensorPortHub nHub, int nSensorPort, int nChainPosition, int nMotorOnHub) const;
  TServoIndex getDeviceIndexOnServoHub(TSensorPortHub nHub, int nSensorPort, int nChainPosition, int nServoOnHub) const;
  bool bSensorPortContainsHiTechnicMux(int nSensorPort) const;
  const TMotorIOPinsDefinition *getMotorIOPinDefinition(int nMotor) const;
  int getMapMotorToPrimaryIOPin(int nMotor) const {
    return bIsMotorIndex(nMotor) ? settings.motors[size_t(nMotor)].nPrimaryIOPin : -1;
  }
  int getMapMotorToSecondaryIOPin(int nMotor) const {
    return bIsMotorIndex(nMotor) ? settings.motors[size_t(nMotor)].nSecondaryIOPin : -1;
  }
  void setMotorIOPinsInConfig(int nMotor, int nPrimary, int nSecondary, bool bTwoPinType);
  void setMotorIOPinsInConfigNone(int nMotor) { setMotorIOPinsInConfig(nMotor, -1, -1, false); }
  void setMotorIOPins(const TMotorIOPinsDefinition *pTable, int nCount);
  void setDefaultMotorIOPinsForControllerBoard();
  void setDefaultMotorIOPinsForPlugInBoard(int nSlot);
  void updateDefaultMotorNamesForIOPins();

  TSensorHWTypesMask getAorDMotorTypeMask(int nMotor) const;
  TThirdPartyHWMask getThirdPartyMotorTypeMask(int nMotor) const;
  void buildListIndexMappingForMotors();
  int getMotorlistIndexMapping(int nIndex);

  // ---- PID settings and encoders ------------------------------------------------
  TPidSettings *getMotorPidSettings(int nMotor);
  void setMotorPidSettings(int nMotor, const TPidSettings &pidSettings);
  void setMotorPidSettingsDefaultInConfig(int nMotor, TMotorTypes nType);
  bool bIsMotorUsingDefaultPidSettings(int nMotor) const;
  int getMapEncoderToMotor(int nMotor) const {
    return bIsMotorIndex(nMotor) ? settings.motors[size_t(nMotor)].nEncoderPort : -1;
  }
  void setMapEncoderToMotor(int nMotor, int nSensorPort);
  void validateMapEncoderToMotor(int nMotor);
  void removeMotorEncodersForSensorPort(int nSensorPort);

  // ---- Sensors -----------------------------------------------------------------
  void setSensorTypeInConfig(int nPort, TSensorTypes nType);
  void removeSensorTypeInConfig(int nPort);
  void setSensorModeInConfig(int nPort, TSensorModes nMode) {
    if (bIsSensorIndex(nPort)) settings.nSensorModes[size_t(nPort)] = nMode;
  }
  void clearSensorTypeAndModeInConfig(int nPort);
  void calculateI2CUsage();
  void setUserDefinedSensorNameInConfig(int nPort, const CString &sName, const TLineNumber &line);
  int getMaxNumbOfSensorPorts() const;
  void removeSensorModeInConfig(int nPort);
  void setSecondaryPort(int nPort, int nSecondary);
  void getDefaultSensorNameInConfig(int nPort, CString &sName) const;
  const wchar_t *getSensorPortString(int nPort) const;
  void updateDefaultSensorNameForPlatformOrControllerBoard(tSensors nPort, const wchar_t *pzName);
  void configureNXTSensorPortsForTetrixHubs();
  void configureDefaultMotorAndServoNamesForEquippedHubs(bool bForce);

  // ---- Device menus ----------------------------------------------------------------
  /// Sensor port of a port name of the configuration's board; negative when none.
  int getIndexForSensorName(const CString &sName) const;
  TDriveTrainType getIndexForDriveTrainType(const CString &sWord) const;
  TJoystickDriveType getIndexForJoystickDriveType(const CString &sWord) const;
  TJoystickAxisScaling getIndexForJoystickScalingType(const CString &sWord) const;
  TGripperArmType getIndexForGripperArmType(const CString &sWord) const;

  // ---- Engineering rules -------------------------------------------------------------
  void checkEngineeringRules(bool bResetWarnings);
  int nGetNumberOfAnalogVexChannelsAndReportErrors(bool bReportErrors);

  // ---- Servos ------------------------------------------------------------------------
  int getMaxNumbOfServoPorts() const;
  void setUserDefinedServoNameInConfig(int nServo, const CString &sName, const TLineNumber &line);
  void getDefaultServoNameLowLevel(int nServo, CString &sName, bool bHubNames) const;
  void getDefaultServoName(int nServo, CString &sName) const { getDefaultServoNameLowLevel(nServo, sName, false); }
  void getDefaultServoNameAdjustedForTetrix(int nServo, CString &sName) const {
    getDefaultServoNameLowLevel(nServo, sName, true);
  }
  void getDefaultServoNameForPlatformOrControllerBoard(int nServo, CString &sName) const;
  void setDefaultServoNameToEmpty(int nServo);
  void setEmptyServoNameToDefaultName(int nServo);

  // ---- Boards ----------------------------------------------------------------------
  void setCircuitBoardType(TControllerBoardType nBoard);
  void updateCircuitBoardAndPlugInBoardTypes();
  void setDefaultFixedIOPinsForControllerBoard();
  static bool bAreCktBoardTypesFullyCompatible(TControllerBoardType nBoardA, TControllerBoardType nBoardB);
  void modifyBoardTypeIfDifferentFromIDESetting();

  // ---- Drive train, gripper arm and joystick drive ---------------------------------
  void clearDriveTrain();
  void setDriveTrainType(TDriveTrainType nType);
  void setGripperArmType(TGripperArmType nType);
  int getDriveTrainMotorIndex(int nSlot) const;
  void setDriveTrainMotorIndex(int nSlot, int nMotor);
  TMotorTypes getDriveTrainMotorType(int nSlot) const;
  void setDriveTrainMotorType(int nSlot, TMotorTypes nType);
  bool getDriveTrainMotorReversed(int nSlot) const;
  void setDriveTrainMotorReversed(int nSlot, bool bReversed);
  int getGripperArmMotorIndex(int nSlot) const;
  void setGripperArmMotorIndex(int nSlot, int nMotor);
  TMotorTypes getGripperArmMotorType(int nSlot) const;
  void setGripperArmMotorType(int nSlot, TMotorTypes nType);
  bool getGripperArmMotorReversed(int nSlot) const;
  void setGripperArmMotorReversed(int nSlot, bool bReversed);
  void setJoystickMotorDriveType(TJoystickDriveType nType) { settings.nJoystickMotorDriveType = nType; }
  void setJoystickMotorAxisScaling(TJoystickAxisScaling nScaling) { settings.nJoystickMotorAxisScaling = nScaling; }
  void initializeEmptyMotor(int nMotor);

  // ---- Memory ----------------------------------------------------------------------
  void updateCompileCodeSizeResults(int nSize1, int nSize2, int nSize3);

  // ---- Standard models and model files ----------------------------------------------
  bool updateStandardModelName(const CString &sName);
  void clearStandardModelName();
  bool updateModelNameUserFile(const CString &sName);
  void clearUserFileModelName();
  bool SaveConfigurationAsModelFile(TTavrenFileTypes nFileType, const CString &sProposedPath);

  // ---- UART and I2C ports --------------------------------------------------------
  TSerialPortMode getDefaultUartType(int nPort);
  int getMaxNumbOfUARTPorts() const;
  int getMaxNumbOfI2CPorts() const;
  void getMapUARTPortToIOPins(int nPort, int &nFirstPin, int &nSecondPin) const;
  void getMapI2CPortToIOPins(int nPort, int &nFirstPin, int &nSecondPin) const;
  bool findUartFromPin(int nPin, int &nPort, int &nFirstPin, int &nSecondPin) const;
  bool findI2CFromPin(int nPin, int &nPort, int &nFirstPin, int &nSecondPin) const;
  void setUARTType(int nUart, TSerialPortMode nMode) {
    if (bIsSerialPortIndex(nUart)) settings.nUARTMode[size_t(nUart)] = nMode;
  }
  void clearUARTType(int nUart) { setUARTType(nUart, 0); }
  void setBaudRate(int nUart, TBaudRate nBaudRate) {
    if (bIsSerialPortIndex(nUart)) settings.nUARTBaudRate[size_t(nUart)] = nBaudRate;
  }
  bool bCanSystemUartPortBeReconfigured() const;
  const TSerialPortIOPinsDefn *getUARTPortIOPinDefinition(int nPort) const;
  const TSerialPortIOPinsDefn *getI2CPortIOPinDefinition(int nPort) const;
  void setUartIOPinsInConfig(int nPort);
  void setUartIOPinsInConfigNone(int nPort);
  void setI2CIOPinsInConfig(int nPort);
  void setI2CIOPinsInConfigNone(int nPort);
  bool checkUartAssignmentForMultiRobot(TLineNumber line) const;

 protected:
  /// Appends one line and "\r\n" to the generated text.
  void addSourceLineToConfiguration(const CString &sLine);
  /// Appends the generated-code comment line that closes the block.
  void addCommentLineForCodeAutomaticallyGeneratedByConfigurationWizard();
  /// Appends an empty line.
  void addBlankLineToConfiguration();

 private:
  /// Dispatches a line of a known keyword to its reader.
  bool bParseConfigLineOfType(TConfigTypes nType, const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                              const CString &sSourceFile, CString &sError);
  /// Reader of the "CPU_Parameters" line.
  bool bParseConfigDefinitionLineCpuParameters(const TTokenizedConfigParms &parms, CString &sError);
  /// Reader of the "Analog" line.
  bool bParseConfigDefinitionLineAnalog(const TTokenizedConfigParms &parms, CString &sError);

  // Readers of the configuration keywords.
  bool bParseConfigDefinitionLineStandardModel(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                               CString &sError);
  bool bParseConfigDefinitionLineRenameMotor(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                             CString &sError);
  bool bParseConfigDefinitionLineRenameSensor(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                              CString &sError);
  bool bParseConfigDefinitionLineDriveTrainMotors(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                  CString &sError);
  bool bParseConfigDefinitionLineDriveTrainWheels(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                  CString &sError);
  bool bParseConfigDefinitionLineGripperArm(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                            CString &sError);
  bool bParseConfigDefinitionLineJoystickDrive(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                               CString &sError);
  bool bParseConfigDefinitionLineFirmwareFeatures(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                  CString &sError);
  bool bParseConfigDefinitionLineHubs(const TTokenizedConfigParms &parms, CString &sError);
  bool bParseConfigDefinitionLineMotor(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                       CString &sError);
  bool bParseConfigDefinitionLineMotorPidSettings(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                  CString &sError);
  bool bParseConfigDefinitionLineSensor(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                        CString &sError);
  bool bParseConfigDefinitionLineServo(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                       CString &sError);
  bool bParseConfigDefinitionLineServoPositions(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                CString &sError);
  bool bParseConfigDefinitionLineProgramType(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                             CString &sError);
  bool bParseConfigDefinitionLineCPUType(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                         CString &sError);
  bool bParseConfigDefinitionLinePluginBoardType(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                 CString &sError);
  bool bParseConfigDefinitionLineUartOrI2C(TConfigTypes nType, const TTokenizedConfigParms &parms, bool bFlag,
                                           TLineNumber line, CString &sError);
  bool bParseConfigDefinitionLineMemoryAllocation(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                  CString &sError);
  bool bParseConfigDefinitionLineNetworkDefinition(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                                   CString &sError);
  bool bParseConfigDefinitionLineNetworkNode(const TTokenizedConfigParms &parms, bool bFlag, TLineNumber line,
                                             CString &sError);

  // Writers of the configuration lines.
  bool buildSourceCodeForOptions();
  bool buildSourceCodeForStandardModel();
  void buildSourceCodeStandardModelLowLevel();
  bool buildSourceCodeForFileNameForUserModel();
  void buildSourceCodeForFileNameForUserModelLowLevel();
  bool buildSourceCodeForCircuitBoardType();
  bool buildSourceCodeForCpuTypeAndClockSpeed();
  bool buildSourceCodeForFirmwareFeatures();
  bool buildSourceCodeForMultiNetworks();
  bool buildSourceCodeForPluginBoards();
  bool buildSourceCodeForMemorySizes();
  bool buildSourceCodeForIFIParms();
  bool buildSourceCodeForSerialPorts();
  bool buildSourceCodeForMultiplexors();
  bool buildSourceCodeForSensors();
  bool buildSourceCodeForMotors();
  bool buildSourceCodeForMotorPidSettings();
  bool buildSourceCodeForMotorPidSettings(int nMotor, const CString &sPortColumn);
  bool buildSourceCodeForDriveTrainMotors();
  bool buildSourceCodeForDriveTrainWheels();
  bool buildSourceCodeForGripperArm();
  bool buildSourceCodeForGameController();
  bool buildSourceCodeForServos();
  bool buildSourceCodeForServoPositions();
  void buildSourceCodeForRenameMotor(int nMotor);
  void buildSourceCodeForRenameSensor(int nPort);
  void buildSourceCodeForHelperIOPins(CString &sOut, int nPin1, int nPin2);

  // Board helpers.
  void updateCircuitBoardType();
  void setDefaultCircuitBoardCpuTypeAndClockSpeed();
  /// Sensor-port name table of the configuration's board.
  const TDeviceTypeMenuItem *getSensorNameDefinitionsForCktBoards() const;

  // Engineering-rule warnings.
  void digitalInPortAssignmentWarningForVexPIC(int nAnalogPort, int nDigitalPort);
  void digitalOutPortAssignmentWarning(int nAnalogPort, int nDigitalPort);
  void errorInvalidQuadSensorPort(int nAnalogPort, int nQuadPort);

  /// The writers run for the individual lines, in this order; see SourceGeneration.cpp.
  typedef bool (CRobotConfigurationBasic::*TSourceWriter)();

  /// Calls the record's own clear (not through the virtual table).
  void clearConfigurationDefinitionLowLevel();
  /// Copies the board's default motor names from its pin table.
  void copyBoardDefaultMotorNamesFromPinTable();
  /// Default UART modes and I2C usage (the record's own version).
  void clearUartAndI2CDefinitionLowLevel();

 public:
  // ---- Members, in declaration order ----------------------------------------------
  int32_t nHostData;
  std::array<CString, kMaxNumbOfMotors> sBoardDefaultMotorNames;
  std::array<CString, kMaxNumbOfSensorPorts> sDefaultSensorNames;
  std::array<CString, kMaxNumbOfMotors> sMotorNames;
  std::array<CString, kMaxNumbOfSensorPorts> sSensorNames;
  std::array<CString, kMaxNumbOfServos> sServoNames;
  CString sStandardModelName;
  CString sModelNameUserFile;
  std::array<CString, kMaxNumbOfServoPositionSets> sServoPositionNames;
  std::array<TLineNumber, kMaxNumbOfMotors> motorNameLines;
  std::array<TLineNumber, kMaxNumbOfSensorPorts> sensorNameLines;
  std::array<TLineNumber, kMaxNumbOfServos> servoNameLines;
  Networking::CNtwkInfoFromPragmas *pNtwkInfo;
  TConfigurationSettings settings;
  TConfigurationParseInfo parseInfo;
  bool bHubDefaultNamesConfigured;
  CString sSourceCode;
  bool bDigitalPortWarningShown;
  bool bQuadPortErrorShown;
};
