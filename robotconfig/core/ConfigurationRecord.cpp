#include <algorithm>
#include <cstring>
#include <type_traits>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/Networking.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorTypes.h"

const wchar_t *const sConfigStartMarker = L"//*!!";
const wchar_t *const sConfigEndMarker = L"!!*//";
const wchar_t *const sConfigEmptyBlockMarker = L"//*!!!!*//";

// The settings block is cleared, copied and compared as raw memory.
static_assert(std::is_trivially_copyable_v<TConfigurationSettings>, "settings block must be plain data");
static_assert(std::is_trivially_copyable_v<TConfigurationParseInfo>, "parse-info block must be plain data");
static_assert(sizeof(TConfigurationSettings) % 4 == 0, "settings block is compared in 32-bit words");

CRobotConfigurationBasic::CRobotConfigurationBasic()
    : nHostData(0),
      pNtwkInfo(new Networking::CNtwkInfoFromPragmas),
      bHubDefaultNamesConfigured(false),
      bDigitalPortWarningShown(false),
      bQuadPortErrorShown(false) {
  // The derived part does not exist yet, so the record's own clear runs.
  clearConfigurationDefinitionLowLevel();
}

CRobotConfigurationBasic::~CRobotConfigurationBasic() {
  delete pNtwkInfo;
  pNtwkInfo = nullptr;
}

void CRobotConfigurationBasic::getPathName(CString &sPath) { sPath.Empty(); }

bool CRobotConfigurationBasic::bParseConfigDefinitionLineFileNameForUserModel(const TTokenizedConfigParms &, bool,
                                                                              TLineNumber, const CString &,
                                                                              CString &) {
  return false;
}

void CRobotConfigurationBasic::clearConfigurationDefinition() { clearConfigurationDefinitionLowLevel(); }

void CRobotConfigurationBasic::clearConfigurationDefinitionLowLevel() {
  // 1-2: both plain blocks start from zero so that untouched bytes compare equal.
  std::memset(static_cast<void *>(&settings), 0, sizeof settings);
  settings.nMemorySizes.fill(-1);
  std::memset(static_cast<void *>(&parseInfo), 0, sizeof parseInfo);
  parseInfo.nCompileCodeSizeResults.fill(-1);
  parseInfo.firstConfigLine = firstLineNumber;
  parseInfo.bFirstConfigLineSeen = false;

  // 3-5
  pNtwkInfo->initializeEmpty();
  for (TMotorSlot &motor : settings.motors) {
    std::memset(static_cast<void *>(&motor), 0, sizeof motor);
    motor.nPrimaryIOPin = -1;
    motor.nSecondaryIOPin = -1;
    motor.pidSettings.clearPidSettings();
  }
  for (CString &s : sBoardDefaultMotorNames) s.Empty();
  for (CString &s : sDefaultSensorNames) s.Empty();

  // 6-7
  settings.nCircuitBoardType = pToggles->getIDECircuitBoardType();
  const TCktBoardInfo *pBoard = getCircuitBoardInfo(settings.nCircuitBoardType);
  settings.nCpuClockSpeed = pBoard ? pBoard->nDefaultCpuClockSpeed : 0;
  setDefaultFixedIOPinsForControllerBoard();
  setDefaultMotorIOPinsForControllerBoard();
  copyBoardDefaultMotorNamesFromPinTable();

  // 8-9
  settings.nProgramType = 255;
  settings.nUnnamedAfterI2CMode = 1;
  settings.nNumbOfServoPositions = 0;
  parseInfo.bNonCanonicalPortNames = false;
  for (CString &s : sServoPositionNames) s.Empty();

  // 10: on the brick platforms every built-in port starts with its default motor.
  const int nKind = pToggles->getPlatformKind();
  const bool bBrick = nKind == platformNxt || nKind == platformBrick4Motor;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    TMotorSlot &motor = settings.motors[size_t(n)];
    sMotorNames[size_t(n)].Empty();
    motorNameLines[size_t(n)] = emptyLineNumber;
    motor.nMotorType = (bBrick && bIsValidMotorPort(n)) ? getDefaultMotorType(n) : 0;
    motor.bReversed = false;
    const TMotorCharacteristics *pRow = getMotorCharacteristics(motor.nMotorType);
    motor.bEncoder = pRow && pRow->bDefaultEncoder;
    motor.bPIDControlled = pRow && pRow->bDefaultPIDControl;
    setMotorIOPinsInConfig(n, -1, -1, false);
    motor.nEncoderPort = -1;
  }

  // 11-12
  bHubDefaultNamesConfigured = false;
  for (int port = 0; port < kMaxNumbOfSensorPorts; ++port) {
    sSensorNames[size_t(port)].Empty();
    sensorNameLines[size_t(port)] = emptyLineNumber;
    settings.nSensorTypes[size_t(port)] = 0;
    settings.nSensorModes[size_t(port)] = 0;
    settings.nSecondaryPorts[size_t(port)] = -1;
  }

  // 13: drive train and controls.
  settings.nDriveTrainType = 0;
  settings.nDriveTrainMotorIndex.fill(255);
  settings.nDriveTrainWheels = {0, 1, 1, 0, 0};
  settings.nGripperArmType = 0;
  settings.nGripperArmMotorIndex.fill(-1);
  settings.nJoystickMotorDriveType = 0;
  settings.nJoystickMotorAxisScaling = 0;

  // 14: servos. Their name lines are reset too, so that a cleared record
  // carries no line of an earlier program.
  for (int servo = 0; servo < kMaxNumbOfServos; ++servo) {
    sServoNames[size_t(servo)].Empty();
    servoNameLines[size_t(servo)] = emptyLineNumber;
    settings.nServoTypes[size_t(servo)] = 0;
    settings.nServoSettings[size_t(servo)] = 0x00FF0000;
  }

  // 15: the sensor clearing above removed the board's fixed pins; apply them again.
  pBoard = getCircuitBoardInfo(settings.nCircuitBoardType);
  settings.nCpuClockSpeed = pBoard ? pBoard->nDefaultCpuClockSpeed : 0;
  setDefaultFixedIOPinsForControllerBoard();
  setDefaultMotorIOPinsForControllerBoard();
  copyBoardDefaultMotorNamesFromPinTable();

  // 16-19
  clearUartAndI2CDefinition();
  pNtwkInfo->initializeEmpty();
  sStandardModelName.Empty();
  sModelNameUserFile.Empty();
  settings.nPlatformKind = pToggles->getPlatformKind();
}

void CRobotConfigurationBasic::copyBoardDefaultMotorNamesFromPinTable() {
  if (!settings.pMotorIOPinTable) return;
  const int nRows = std::min(settings.nNumbOfEntriesInMotorIOPinTable, kMaxNumbOfMotors);
  for (int i = 0; i < nRows; ++i) {
    const wchar_t *pzName = settings.pMotorIOPinTable[i].pzDefaultMotorName;
    if (pzName && sBoardDefaultMotorNames[size_t(i)] != pzName) sBoardDefaultMotorNames[size_t(i)] = pzName;
  }
}

void CRobotConfigurationBasic::setMotorEncoderInConfig(int nMotor, bool bEncoder) {
  if (!bIsMotorIndex(nMotor)) return;
  TMotorSlot &motor = settings.motors[size_t(nMotor)];
  motor.bEncoder = bEncoder;
  if (!bEncoder) motor.bPIDControlled = false;
}

int CRobotConfigurationBasic::getNumbOfMotorsForDriveTrain(TDriveTrainType nType) {
  // Motors per drive-train type 0..7.
  static constexpr std::array<int, 8> kMotors = {0, 2, 2, 4, 4, 4, 3, 4};
  return (nType >= 0 && nType < static_cast<int>(kMotors.size())) ? kMotors[size_t(nType)] : 0;
}

int CRobotConfigurationBasic::getNumbOfMotorsForGripperArm(TGripperArmType nType) {
  return (nType == 1 || nType == 2) ? 4 : 0;
}
