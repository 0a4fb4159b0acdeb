// Drive train, gripper arm and joystick drive: the motor slots that form
// them, the operations of the setup dialogs, and their four configuration
// lines in both directions. Drive-train and gripper slots hold motor
// indexes; a slot's type and direction are those of the motor it names.
#include <algorithm>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

/// Hardware-type mask the drive-train menus are read with.
constexpr TSensorHWTypesMask kDriveMenuMask = 7;

/// Empty drive-train slot (the slots are bytes).
constexpr uint8_t kNoDriveTrainMotor = 255;
/// Empty gripper slot.
constexpr int32_t kNoGripperMotor = -1;

/// Wheel numbers of a record without a drive train.
constexpr std::array<uint16_t, 5> kDefaultDriveTrainWheels = {0, 1, 1, 0, 0};

/// Gripper slots that may stay empty without failing a GripperArm line.
constexpr std::array<bool, 4> kOptionalGripperSlot = {false, true, false, true};

/// Parameter word the readers take for "no motor in this slot".
constexpr const wchar_t *kNoMotorWord = L"None";

/// Tokens a line really holds (keyword included), never more than the token array.
int numbOfTokens(const TTokenizedConfigParms &parms) { return std::clamp(parms.nNumbOfParms, 0, kMaxConfigTokens); }

/// True when `nMotor` is a motor index of the current platform.
bool bIsValidMotorIndex(const CRobotConfigurationBasic &rec, int nMotor) {
  return CRobotConfigurationBasic::bIsMotorIndex(nMotor) && nMotor < rec.getMaxNumbOfMotorPorts();
}

/// The catalog's word for a menu value; the value in decimal when the catalog
/// has no row for it, so that the written line is never missing its word.
CString menuWordOrNumber(const TDeviceTypeMenuItem *pTable, int nValue) {
  CString sWord(getTypedefEnumString(pTable, nValue, kDriveMenuMask));
  if (sWord.IsEmpty()) sWord.Format(L"%d", nValue);
  return sWord;
}

/// The value a drive-train, gripper or joystick word stands for: the catalog's
/// row, else the number that menuWordOrNumber writes for a value without a
/// word; -1 when it is neither.
int menuValueOfWord(const TDeviceTypeMenuItem *pTable, const CString &sWord) {
  const int nValue = getTypedefIndex(pTable, sWord, true);
  if (nValue >= 0) return nValue;
  bool bNumber = false;
  const int nNumber = getInteger(sWord, bNumber);
  CString sCanonical;
  sCanonical.Format(L"%d", nNumber);
  return bNumber && sCanonical == sWord ? nNumber : -1;
}

/// The word a written drive-train or gripper line uses for a slot's motor:
/// its port name, or "None" for an empty slot or a motor without a name.
CString slotMotorWord(const CRobotConfigurationBasic &rec, int nMotor, bool bEmpty) {
  CString sName;
  if (!bEmpty) rec.getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sName);
  return sName.IsEmpty() ? CString(kNoMotorWord) : sName;
}

/// Stores `value` in slot `nSlot` when the slot exists; anything else is ignored.
template <class T, size_t N>
void storeInSlot(std::array<T, N> &slots, int nSlot, T value) {
  if (nSlot >= 0 && size_t(nSlot) < N) slots[size_t(nSlot)] = value;
}

/// Puts `nMotor` into slot `nSlot` of `slots`, of which `nCount` are in use. A
/// slot beyond the count or a motor the platform lacks leaves the slot empty;
/// a motor without a type gets the platform's default, since a drive motor needs one.
template <class T, size_t N>
void assignSlotMotor(CRobotConfigurationBasic &rec, std::array<T, N> &slots, int nCount, int nSlot, int nMotor,
                     T empty) {
  if (nSlot < 0 || nSlot >= nCount || !bIsValidMotorIndex(rec, nMotor)) {
    storeInSlot(slots, nSlot, empty);
    return;
  }
  slots[size_t(nSlot)] = static_cast<T>(nMotor);
  if (rec.getMotorTypeInConfig(nMotor) <= 0) rec.setMotorTypeInConfig(nMotor, rec.getDefaultMotorType(nMotor));
}

/// Type of the motor a slot names; 0 for no motor of the platform.
TMotorTypes motorTypeOf(const CRobotConfigurationBasic &rec, int nMotor) {
  return bIsValidMotorIndex(rec, nMotor) ? rec.getMotorTypeInConfig(nMotor) : 0;
}

/// Sets the type of the motor a slot names, if it names one.
void setMotorTypeOf(CRobotConfigurationBasic &rec, int nMotor, TMotorTypes nType) {
  if (bIsValidMotorIndex(rec, nMotor)) rec.setMotorTypeInConfig(nMotor, nType);
}

/// Direction of the motor a slot names; false for no motor of the platform.
bool motorReversedOf(const CRobotConfigurationBasic &rec, int nMotor) {
  return bIsValidMotorIndex(rec, nMotor) && rec.getMotorReversedInConfig(nMotor);
}

/// Sets the direction of the motor a slot names, if it names one.
void setMotorReversedOf(CRobotConfigurationBasic &rec, int nMotor, bool bReversed) {
  if (bIsValidMotorIndex(rec, nMotor)) rec.setMotorReversedInConfig(nMotor, bReversed);
}

}  // namespace

// ---- Operations ---------------------------------------------------------------

void CRobotConfigurationBasic::clearDriveTrain() {
  settings.nDriveTrainType = 0;
  settings.nDriveTrainMotorIndex.fill(kNoDriveTrainMotor);
  settings.nDriveTrainWheels = kDefaultDriveTrainWheels;
}

void CRobotConfigurationBasic::setDriveTrainType(TDriveTrainType nType) {
  settings.nDriveTrainType = static_cast<uint8_t>(nType);
  const int nCount = getNumbOfMotorsForDriveTrain();
  for (int nSlot = nCount; nSlot < static_cast<int>(settings.nDriveTrainMotorIndex.size()); ++nSlot)
    settings.nDriveTrainMotorIndex[size_t(nSlot)] = kNoDriveTrainMotor;
  if (settings.nDriveTrainType == 0) settings.nDriveTrainWheels = kDefaultDriveTrainWheels;
}

void CRobotConfigurationBasic::setGripperArmType(TGripperArmType nType) {
  settings.nGripperArmType = nType;
  if (getNumbOfMotorsForGripperArm() == 0) settings.nGripperArmMotorIndex.fill(kNoGripperMotor);
}

int CRobotConfigurationBasic::getDriveTrainMotorIndex(int nSlot) const {
  if (nSlot < 0 || nSlot >= getNumbOfMotorsForDriveTrain()) return -1;
  return settings.nDriveTrainMotorIndex[size_t(nSlot)];
}

void CRobotConfigurationBasic::setDriveTrainMotorIndex(int nSlot, int nMotor) {
  assignSlotMotor(*this, settings.nDriveTrainMotorIndex, getNumbOfMotorsForDriveTrain(), nSlot, nMotor,
                  kNoDriveTrainMotor);
}

TMotorTypes CRobotConfigurationBasic::getDriveTrainMotorType(int nSlot) const {
  return motorTypeOf(*this, getDriveTrainMotorIndex(nSlot));
}

void CRobotConfigurationBasic::setDriveTrainMotorType(int nSlot, TMotorTypes nType) {
  setMotorTypeOf(*this, getDriveTrainMotorIndex(nSlot), nType);
}

bool CRobotConfigurationBasic::getDriveTrainMotorReversed(int nSlot) const {
  return motorReversedOf(*this, getDriveTrainMotorIndex(nSlot));
}

void CRobotConfigurationBasic::setDriveTrainMotorReversed(int nSlot, bool bReversed) {
  setMotorReversedOf(*this, getDriveTrainMotorIndex(nSlot), bReversed);
}

int CRobotConfigurationBasic::getGripperArmMotorIndex(int nSlot) const {
  if (nSlot < 0 || nSlot >= getNumbOfMotorsForGripperArm()) return -1;
  return settings.nGripperArmMotorIndex[size_t(nSlot)];
}

void CRobotConfigurationBasic::setGripperArmMotorIndex(int nSlot, int nMotor) {
  assignSlotMotor(*this, settings.nGripperArmMotorIndex, getNumbOfMotorsForGripperArm(), nSlot, nMotor,
                  kNoGripperMotor);
}

TMotorTypes CRobotConfigurationBasic::getGripperArmMotorType(int nSlot) const {
  return motorTypeOf(*this, getGripperArmMotorIndex(nSlot));
}

void CRobotConfigurationBasic::setGripperArmMotorType(int nSlot, TMotorTypes nType) {
  setMotorTypeOf(*this, getGripperArmMotorIndex(nSlot), nType);
}

bool CRobotConfigurationBasic::getGripperArmMotorReversed(int nSlot) const {
  return motorReversedOf(*this, getGripperArmMotorIndex(nSlot));
}

void CRobotConfigurationBasic::setGripperArmMotorReversed(int nSlot, bool bReversed) {
  setMotorReversedOf(*this, getGripperArmMotorIndex(nSlot), bReversed);
}

void CRobotConfigurationBasic::initializeEmptyMotor(int nMotor) {
  if (!bIsMotorIndex(nMotor)) return;
  TMotorSlot &motor = settings.motors[size_t(nMotor)];
  motor.nMotorType = 0;
  motor.bEncoder = false;
  motor.bPIDControlled = false;
  motor.bReversed = false;
  motor.nDriveSide = 0;
  motor.nEncoderPort = 0;
  motor.nPrimaryIOPin = -1;
  motor.nSecondaryIOPin = -1;
  motor.pidSettings.clearPidSettings();
}

// ---- Readers --------------------------------------------------------------------

bool CRobotConfigurationBasic::bParseConfigDefinitionLineDriveTrainMotors(const TTokenizedConfigParms &parms, bool,
                                                                          TLineNumber, CString &sError) {
  if (!pPlatformData->pPlatformParms->bSupportsDriveTrainConfig) {
    sError = L"Drive Train configuration not supported by platform";
    return false;
  }
  // A word the menu lacks is kept as a type with no motors (255).
  settings.nDriveTrainType = static_cast<uint8_t>(menuValueOfWord(nDriveTrainTypes, parms.sParms[1]));
  bool bAccepted = true;
  const int nTokens = numbOfTokens(parms);
  for (int nToken = 2; nToken < nTokens; ++nToken) {
    const int nSlot = nToken - 2;
    const CString &sWord = parms.sParms[size_t(nToken)];
    if (sWord.IsEmpty()) {
      sError = L"Not enough motors specified";
      settings.nDriveTrainType = 0;
      return false;
    }
    const bool bNoMotor = sWord == kNoMotorWord;
    const int nMotor = bNoMotor ? -1 : getIndexForDefaultMotorName(sWord);
    setDriveTrainMotorIndex(nSlot, nMotor);
    // A name of a motor the platform does not have is as invalid as an unknown one.
    if (bIsValidMotorIndex(*this, nMotor)) continue;
    if (bAccepted) {
      if (bNoMotor) sError.Format(L"No motor specified for index %d.", nSlot);
      else sError.Format(L"Invalid motor '%s' for index %d.", sWord, nSlot);
    }
    bAccepted = false;
  }
  return bAccepted;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineDriveTrainWheels(const TTokenizedConfigParms &parms, bool,
                                                                          TLineNumber, CString &sError) {
  if (!pPlatformData->pPlatformParms->bSupportsDriveTrainConfig) {
    sError = L"Drive Train configuration not supported by platform";
    return false;
  }
  bool bAccepted = true;
  const int nTokens = numbOfTokens(parms);
  for (int nToken = 1; nToken < nTokens; ++nToken) {
    const CString &sWord = parms.sParms[size_t(nToken)];
    if (sWord.IsEmpty()) {
      sError.Empty();
      return false;
    }
    bool bNumber = false;
    const int nValue = sWord == kNoMotorWord ? 0 : getInteger(sWord, bNumber);
    const int nWheel = nToken - 1;
    if (size_t(nWheel) < settings.nDriveTrainWheels.size()) {
      settings.nDriveTrainWheels[size_t(nWheel)] = static_cast<uint16_t>(nValue);
    } else {
      sError.Empty();
      bAccepted = false;
    }
  }
  return bAccepted;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineGripperArm(const TTokenizedConfigParms &parms, bool,
                                                                    TLineNumber, CString &sError) {
  if (!pPlatformData->pPlatformParms->bSupportsDriveTrainConfig) {
    sError = L"Gripper Arm configuration not supported by platform";
    return false;
  }
  settings.nGripperArmType = menuValueOfWord(nGripperArmTypes, parms.sParms[1]);
  bool bAccepted = true;
  const int nTokens = numbOfTokens(parms);
  for (int nToken = 2; nToken < nTokens; ++nToken) {
    const int nSlot = nToken - 2;
    const CString &sWord = parms.sParms[size_t(nToken)];
    if (sWord.IsEmpty()) {
      sError = L"Not enough motors specified";
      settings.nGripperArmType = 0;
      return false;
    }
    const bool bNoMotor = sWord == kNoMotorWord;
    const int nMotor = bNoMotor ? -1 : getIndexForDefaultMotorName(sWord);
    setGripperArmMotorIndex(nSlot, nMotor);
    if (bIsValidMotorIndex(*this, nMotor)) continue;
    if (size_t(nSlot) < kOptionalGripperSlot.size() && kOptionalGripperSlot[size_t(nSlot)]) continue;
    if (bAccepted) {
      if (bNoMotor) sError.Format(L"No motor specified for index %d.", nSlot);
      else sError.Format(L"Invalid motor '%s' for index %d.", sWord, nSlot);
    }
    bAccepted = false;
  }
  return bAccepted;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineJoystickDrive(const TTokenizedConfigParms &parms, bool,
                                                                       TLineNumber, CString &sError) {
  if (!pPlatformData->pPlatformParms->bSupportsJoystickDriveConfig) {
    sError = L"Joystick control configuration not supported by platform";
    return false;
  }
  // Unknown words are reported but do not reject the line.
  settings.nJoystickMotorDriveType = menuValueOfWord(nJoystickDriveTypes, parms.sParms[1]);
  if (settings.nJoystickMotorDriveType < 0) {
    sError.Format(L"Invalid motor drive type '%s'", parms.sParms[1]);
    settings.nJoystickMotorDriveType = 0;
  }
  settings.nJoystickMotorAxisScaling = menuValueOfWord(nJoystickAxisScalingTypes, parms.sParms[2]);
  if (settings.nJoystickMotorAxisScaling < 0) {
    sError.Format(L"Invalid joystick axis type '%s'", parms.sParms[2]);
    settings.nJoystickMotorAxisScaling = 0;
  }
  return true;
}

// ---- Writers --------------------------------------------------------------------

bool CRobotConfigurationBasic::buildSourceCodeForDriveTrainMotors() {
  if (settings.nDriveTrainType == 0) return false;
  CString sParameters = menuWordOrNumber(nDriveTrainTypes, settings.nDriveTrainType);
  const int nCount = getNumbOfMotorsForDriveTrain();
  for (int nSlot = 0; nSlot < nCount; ++nSlot) {
    const int nMotor = settings.nDriveTrainMotorIndex[size_t(nSlot)];
    sParameters += L", ";
    sParameters += slotMotorWord(*this, nMotor, nMotor == kNoDriveTrainMotor);
  }
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeDriveTrainMotors),
               sParameters);
  addSourceLineToConfiguration(sLine);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForDriveTrainWheels() {
  if (settings.nDriveTrainType == 0) return false;
  const std::array<uint16_t, 5> &wheels = settings.nDriveTrainWheels;
  CString sWheels;
  sWheels.Format(L"%d, %d, %d, %d, %d", wheels[0], wheels[1], wheels[2], wheels[3], wheels[4]);
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeDriveTrainWheels), sWheels);
  addSourceLineToConfiguration(sLine);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForGripperArm() {
  if (settings.nGripperArmType == 0) return false;
  CString sParameters = menuWordOrNumber(nGripperArmTypes, settings.nGripperArmType);
  if (getNumbOfMotorsForGripperArm() > 0) {
    for (const int32_t nMotor : settings.nGripperArmMotorIndex) {
      sParameters += L", ";
      sParameters += slotMotorWord(*this, nMotor, nMotor == kNoGripperMotor);
    }
  }
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeGripperArm), sParameters);
  addSourceLineToConfiguration(sLine);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForGameController() {
  if (settings.nJoystickMotorDriveType == 0) return false;
  CString sLine;
  sLine.Format(L"#pragma config(%s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeJoystickDrive),
               menuWordOrNumber(nJoystickDriveTypes, settings.nJoystickMotorDriveType),
               menuWordOrNumber(nJoystickAxisScalingTypes, settings.nJoystickMotorAxisScaling));
  addSourceLineToConfiguration(sLine);
  return true;
}
