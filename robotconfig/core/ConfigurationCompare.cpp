#include <cstring>
#include <type_traits>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/Networking.h"

// The settings block is compared as raw memory, so it must hold no padding:
// bytes no member owns would make equal settings compare different.
static_assert(std::has_unique_object_representations_v<TConfigurationSettings>,
              "settings block must have no padding bytes");

CRobotConfigurationBasic::CRobotConfigurationBasic(const CRobotConfigurationBasic &source)
    : nHostData(source.nHostData),
      sBoardDefaultMotorNames(source.sBoardDefaultMotorNames),
      sDefaultSensorNames(source.sDefaultSensorNames),
      sMotorNames(source.sMotorNames),
      sSensorNames(source.sSensorNames),
      sServoNames(source.sServoNames),
      sStandardModelName(source.sStandardModelName),
      sModelNameUserFile(source.sModelNameUserFile),
      sServoPositionNames(source.sServoPositionNames),
      motorNameLines(source.motorNameLines),
      sensorNameLines(source.sensorNameLines),
      servoNameLines(source.servoNameLines),
      pNtwkInfo(new Networking::CNtwkInfoFromPragmas(*source.pNtwkInfo)),
      settings(source.settings),
      parseInfo(source.parseInfo),
      bHubDefaultNamesConfigured(source.bHubDefaultNamesConfigured),
      sSourceCode(source.sSourceCode),
      bDigitalPortWarningShown(source.bDigitalPortWarningShown),
      bQuadPortErrorShown(source.bQuadPortErrorShown) {}

TConfigCompareResults CRobotConfigurationBasic::compareConfiguration(const CRobotConfigurationBasic &other) const {
  // Every setting counts, padding included: a clear keeps the block zero-filled.
  if (std::memcmp(&settings, &other.settings, sizeof settings) != 0) return configCompareSettingsDiffer;
  if (!bIsHostDataEqual(other.nHostData)) return configCompareSettingsDiffer;
  if (*pNtwkInfo != *other.pNtwkInfo) return configCompareSettingsDiffer;
  if (sServoPositionNames != other.sServoPositionNames) return configCompareNamesDiffer;
  if (sServoNames != other.sServoNames) return configCompareNamesDiffer;
  CString sThisDefault, sOtherDefault;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    const CString &sThis = sMotorNames[size_t(n)];
    const CString &sOther = other.sMotorNames[size_t(n)];
    if (sThis == sOther) continue;
    // An empty name stands for the default name when this record has none of its own.
    if (sThis.IsEmpty()) {
      other.getDefaultMotorNameLowLevel(n, sOtherDefault, true);
      getDefaultMotorNameLowLevel(n, sThisDefault, true);
      if (sOther == sOtherDefault && sThisDefault.IsEmpty()) continue;
    }
    return configCompareNamesDiffer;
  }
  if (sSensorNames != other.sSensorNames) return configCompareNamesDiffer;
  if (sStandardModelName != other.sStandardModelName || sModelNameUserFile != other.sModelNameUserFile)
    return configCompareModelNamesDiffer;
  return configCompareSame;
}

void CRobotConfigurationBasic::copyFrom(const CRobotConfigurationBasic &source) {
  if (&source == this) return;
  std::memcpy(static_cast<void *>(&settings), &source.settings, sizeof settings);
  std::memcpy(static_cast<void *>(&parseInfo), &source.parseInfo, sizeof parseInfo);
  sSensorNames = source.sSensorNames;
  sensorNameLines = source.sensorNameLines;
  sMotorNames = source.sMotorNames;
  motorNameLines = source.motorNameLines;
  sServoNames = source.sServoNames;
  servoNameLines = source.servoNameLines;
  sServoPositionNames = source.sServoPositionNames;
  sStandardModelName = source.sStandardModelName;
  sModelNameUserFile = source.sModelNameUserFile;
  copyHostData(source.nHostData);
  *pNtwkInfo = *source.pNtwkInfo;
}

const CRobotConfigurationBasic &CRobotConfigurationBasic::operator=(const CRobotConfigurationBasic &source) {
  copyFrom(source);
  return *this;
}

int CRobotConfigurationBasic::operator==(const CRobotConfigurationBasic &other) const {
  return compareConfiguration(other) == configCompareSame ? 1 : 0;
}

int CRobotConfigurationBasic::operator!=(const CRobotConfigurationBasic &other) const {
  return compareConfiguration(other) == configCompareSame ? 0 : 1;
}
