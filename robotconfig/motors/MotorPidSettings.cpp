#include <array>
#include <cstdint>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorLines.h"

namespace {

// One value of a MotorPidSetting line: an 8-bit or a 16-bit field of the record.
struct TPidColumn {
  uint8_t TPidSettings::*pByte;
  uint16_t TPidSettings::*pWord;
};

// The values of a MotorPidSetting line, in the order the line gives them.
constexpr std::array<TPidColumn, 8> kPidColumns = {{
    {&TPidSettings::B1, nullptr},
    {&TPidSettings::B2, nullptr},
    {nullptr, &TPidSettings::W1},
    {&TPidSettings::B3, nullptr},
    {&TPidSettings::B4, nullptr},
    {nullptr, &TPidSettings::W2},
    {nullptr, &TPidSettings::W3},
    {nullptr, &TPidSettings::W4},
}};

// The value an empty parameter of a MotorPidSetting line stands for.
constexpr unsigned kEmptyPidValue = 65535;

// Value of one column of a record.
unsigned pidColumnValue(const TPidSettings &pid, const TPidColumn &column) {
  return column.pByte ? unsigned(pid.*column.pByte) : unsigned(pid.*column.pWord);
}

// Stores a value into one column, keeping the low bits the field holds.
void setPidColumnValue(TPidSettings &pid, const TPidColumn &column, unsigned nValue) {
  if (column.pByte) pid.*column.pByte = static_cast<uint8_t>(nValue & 0xFFu);
  else pid.*column.pWord = static_cast<uint16_t>(nValue & 0xFFFFu);
}

}  // namespace

TPidSettings *CRobotConfigurationBasic::getMotorPidSettings(int nMotor) {
  return bIsMotorIndex(nMotor) ? &settings.motors[size_t(nMotor)].pidSettings : nullptr;
}

void CRobotConfigurationBasic::setMotorPidSettings(int nMotor, const TPidSettings &pidSettings) {
  if (bIsMotorIndex(nMotor)) settings.motors[size_t(nMotor)].pidSettings.copyPidSettings(&pidSettings);
}

void CRobotConfigurationBasic::setMotorPidSettingsDefaultInConfig(int nMotor, TMotorTypes nType) {
  if (!bIsMotorIndex(nMotor)) return;
  TPidSettings defaults;
  pToggles->copyDefaultPidSettings(nType, defaults);
  settings.motors[size_t(nMotor)].pidSettings.copyPidSettings(&defaults);
}

bool CRobotConfigurationBasic::bIsMotorUsingDefaultPidSettings(int nMotor) const {
  if (!bIsMotorIndex(nMotor)) return false;
  const TMotorSlot &motor = settings.motors[size_t(nMotor)];
  return motor.pidSettings.bIdenticalPidSettings(*pToggles->getDefaultPidSettings(motor.nMotorType)) ||
         motor.pidSettings.bIdenticalPidSettings(emptyPidSettings);
}

void CRobotConfigurationBasic::validateMapEncoderToMotor(int) {}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineMotorPidSettings(const TTokenizedConfigParms &parms, bool,
                                                                          TLineNumber, CString &sError) {
  const CString &sPort = parms.sParms[1];
  const int nMotor = getIndexForDefaultMotorName(sPort);
  if (!bIsMotorIndex(nMotor)) {
    sError.Format(kBadMotorDeviceIndexMessage, sPort);
    return false;
  }
  TPidSettings &slotSettings = settings.motors[size_t(nMotor)].pidSettings;
  TPidSettings pid;
  pid.copyPidSettings(&slotSettings);
  for (size_t i = 0; i < kPidColumns.size(); ++i) {
    const CString &sValue = parms.sParms[2 + i];
    bool bOk = false;
    const unsigned nValue = sValue.IsEmpty() ? kEmptyPidValue : static_cast<unsigned>(getInteger(sValue, bOk));
    setPidColumnValue(pid, kPidColumns[i], nValue);
  }
  slotSettings.copyPidSettings(&pid);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForMotorPidSettings() {
  const int nCount = getNumbOfMotorIndexesToWrite();
  if (nCount < 1) return false;
  const int nKind = pToggles->getPlatformKind();
  const bool bBrick = nKind == platformNxt || nKind == platformBrick4Motor;
  bool bWritten = false;
  for (int nMotor = 0; nMotor < nCount; ++nMotor) {
    if (!bIsValidMotorPort(nMotor)) continue;
    TMotorSlot &motor = settings.motors[size_t(nMotor)];
    if (motor.nMotorType == 0 || motor.nMotorType == -1) motor.nMotorType = bBrick ? getDefaultMotorType(nMotor) : 0;
    if (motor.nMotorType == 0) continue;
    CString sPortColumn;
    getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sPortColumn);
    sPortColumn += L",";
    if (motor.bPIDControlled && buildSourceCodeForMotorPidSettings(nMotor, sPortColumn)) bWritten = true;
  }
  return bWritten;
}

bool CRobotConfigurationBasic::buildSourceCodeForMotorPidSettings(int nMotor, const CString &sPortColumn) {
  if (!bIsMotorIndex(nMotor)) return false;
  const TMotorSlot &motor = settings.motors[size_t(nMotor)];
  const TPidSettings &pid = motor.pidSettings;
  if (pid.bIdenticalPidSettings(*pToggles->getDefaultPidSettings(motor.nMotorType)) ||
      pid.bIdenticalPidSettings(emptyPidSettings))
    return false;
  std::array<unsigned, kPidColumns.size()> values{};
  for (size_t i = 0; i < kPidColumns.size(); ++i) values[i] = pidColumnValue(pid, kPidColumns[i]);
  CString sLine;
  sLine.Format(L"#pragma config(%s,  %s  %d, %d, %d, %d, %d,   %d, %d, %d)",
               TConfigTypeDefns::getConfigTypeName(configTypeMotorPidSetting), sPortColumn, values[0], values[1],
               values[2], values[3], values[4], values[5], values[6], values[7]);
  addSourceLineToConfiguration(sLine);
  return true;
}
