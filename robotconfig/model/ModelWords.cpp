#include "robotconfig/model/ModelWords.h"

#include <algorithm>
#include <array>

#include "robotconfig/host/CatalogRows.h"
#include "robotconfig/host/MenuButton.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorTypes.h"

namespace robotconfig::model {

namespace {

/// Sensor types that other devices put on a port, and second halves of two-port sensors.
constexpr std::array<TSensorTypes, 12> kTypesSetElsewhere = {56, 57, 58, 59, 60, 61, 62, 64, 65, 66, 81, 91};

/// True when the row belongs to the current platform.
bool bRowOnPlatform(const TDeviceTypeMenuItem &row) { return (row.nPlatformMask & pToggles->getPlatformMask()) != 0; }

/// True for a type this platform has and that writing keeps: legacy types
/// (15 and 26..31) are converted when the block is written.
bool bIsCurrentMotorType(TMotorTypes nType) {
  return nType > 0 && nType != 15 && nType < 26 && getMotorCharacteristics(nType) != nullptr;
}

}  // namespace

std::string utf8(const wchar_t *pzText) { return pzText ? CString(pzText).toUtf8() : std::string(); }
std::string utf8(const CString &sText) { return sText.toUtf8(); }

std::string motorPortWord(const CRobotConfigurationBasic &config, int nMotor) {
  CString sWord;
  config.getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sWord);
  return sWord.toUtf8();
}

int findMotorPort(const CRobotConfigurationBasic &config, const std::string &sWord) {
  const int nMotor = config.getIndexForDefaultMotorName(CString::fromUtf8(sWord));
  return config.bIsValidMotorPort(nMotor) ? nMotor : -1;
}

int sensorPortCount(const CRobotConfigurationBasic &config) {
  return std::clamp(config.getMaxNumbOfSensorPorts(), 0, kMaxNumbOfSensorPorts);
}

std::string sensorPortWord(const CRobotConfigurationBasic &config, int nPort) {
  if (!CRobotConfigurationBasic::bIsSensorIndex(nPort)) return std::string();
  return utf8(getSensorPortString(nPort, config.getCircuitBoardType()));
}

int findSensorPort(const CRobotConfigurationBasic &config, const std::string &sWord) {
  const int nPort = config.getIndexForSensorName(CString::fromUtf8(sWord));
  if (!CRobotConfigurationBasic::bIsSensorIndex(nPort) || nPort >= kMaxNumbOfSensorPorts) return -1;
  return sensorPortWord(config, nPort).empty() ? -1 : nPort;
}

std::string servoPortWord(int nServo) {
  CString sWord;
  getServoPortString(nServo, sWord);
  return sWord.toUtf8();
}

int findServoPort(const CRobotConfigurationBasic &config, const std::string &sWord) {
  const int nServo = getServoIndex(CString::fromUtf8(sWord));
  return config.bIsValidServoPort(nServo) ? nServo : -1;
}

std::string tableWord(const TDeviceTypeMenuItem *pTable, int nValue) {
  return utf8(getTypedefEnumString(pTable, nValue, -1));
}

std::vector<std::string> menuWords(const TDeviceTypeMenuItem *pTable, TSensorHWTypesMask nHWMask,
                                   TThirdPartyHWMask nThirdPartyMask) {
  CDropDownButtonOfDeviceTypeMenuItem button;
  button.initializeAndBuildDropDownMenu(pTable, nHWMask, nullptr, nThirdPartyMask);
  std::vector<std::string> words;
  for (const auto &item : button.items()) {
    std::string sWord = item.sKeyword.toUtf8();
    if (!sWord.empty() && std::find(words.begin(), words.end(), sWord) == words.end()) words.push_back(sWord);
  }
  return words;
}

int menuValue(const TDeviceTypeMenuItem *pTable, const std::string &sWord, TSensorHWTypesMask nHWMask,
              TThirdPartyHWMask nThirdPartyMask) {
  CDropDownButtonOfDeviceTypeMenuItem button;
  button.initializeAndBuildDropDownMenu(pTable, nHWMask, nullptr, nThirdPartyMask);
  for (const auto &item : button.items())
    if (!sWord.empty() && item.sKeyword.toUtf8() == sWord) return item.nValue;
  return -1;
}

std::vector<std::string> motorTypeChoices(const CRobotConfigurationBasic &config, int nMotor) {
  if (!config.bIsValidMotorPort(nMotor)) return {};
  const TSensorHWTypesMask nMask = config.getAorDMotorTypeMask(nMotor);
  std::vector<std::string> words;
  // Only the types the port can carry in a line: a word the writer would
  // not give back for this port is no choice.
  for (const std::string &sWord : menuWords(robotconfig_catalog::kMotorTypeNames, nMask,
                                            config.getThirdPartyMotorTypeMask(nMotor))) {
    const TMotorTypes nType = getMotorTypedefNameIndex(CString::fromUtf8(sWord), nMask);
    if (nType > 0 && bIsCurrentMotorType(nType) && utf8(getMotorTypedefString(nType, nMask)) == sWord)
      words.push_back(sWord);
  }
  return words;
}

std::vector<std::string> sensorTypeChoices() {
  std::vector<std::string> words;
  for (const std::string &sWord : menuWords(robotconfig_catalog::kSensorTypeNames)) {
    const TSensorTypes nType = getSensorTypeIndex(CString::fromUtf8(sWord), true);
    if (nType > 0 && !bIsSensorTypeSetElsewhere(nType)) words.push_back(sWord);
  }
  return words;
}

std::vector<std::string> sensorModeChoices(TSensorTypes nType) {
  const uint32_t nGroups = robotconfig_catalog::getSensorModeGroups(nType);
  std::vector<std::string> words;
  for (const TDeviceTypeMenuItem *pRow = robotconfig_catalog::kSensorModeNames; pRow->nPlatformMask != 0; ++pRow) {
    if (!bRowOnPlatform(*pRow) || (static_cast<uint32_t>(pRow->nAttribute) & nGroups) == 0 || !pRow->pzKeyword) continue;
    std::string sWord = utf8(pRow->pzKeyword);
    if (std::find(words.begin(), words.end(), sWord) == words.end()) words.push_back(sWord);
  }
  return words;
}

std::vector<std::string> servoTypeChoices() { return menuWords(robotconfig_catalog::kServoTypeNames); }

std::vector<std::string> boardChoices() {
  if (!pPlatformData->pPlatformParms->bSupportsBoardTypeSelection) return {};
  return menuWords(getArduinoCircuitBoardTypeMenuDefn());
}

bool bIsSensorTypeSetElsewhere(TSensorTypes nType) {
  return std::find(kTypesSetElsewhere.begin(), kTypesSetElsewhere.end(), nType) != kTypesSetElsewhere.end();
}

}  // namespace robotconfig::model
