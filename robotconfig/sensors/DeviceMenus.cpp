#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/MenuButton.h"
#include "robotconfig/sensors/SensorMenus.h"

namespace {

constexpr uint32_t kAllPlatforms = 0xFFFFFFFFu;
constexpr int32_t kAnyThirdPartyHardware = 0xFE;

// A row of a library table: on every platform, without a label.
constexpr TDeviceTypeMenuItem unlabelledRow(int32_t nValue, const wchar_t *pzKeyword) {
  return {kAllPlatforms, 0, 0, 0, 0, kAnyThirdPartyHardware, 0, nValue, pzKeyword, nullptr, 0};
}
constexpr TDeviceTypeMenuItem kEndRow = {0, 0, 0, 0, 0, 0, 0, 0, nullptr, nullptr, 0};

// Third-party mask that admits every row.
constexpr TThirdPartyHWMask kEveryThirdPartyHardware = -1;

}  // namespace

const TDeviceTypeMenuItem nDriveSideMenu[] = {
    unlabelledRow(0, L"None"),
    unlabelledRow(1, L"Left"),
    unlabelledRow(2, L"Right"),
    kEndRow,
};

void addSensorPortsToMenu(CRobotConfigurationBasic &config, CDropDownButtonOfDeviceTypeMenuItem &button, bool,
                          TSensorHWTypesMask nHWMask) {
  button.initializeAndBuildDropDownMenu(getSensorNameDefinitions(config.getCircuitBoardType()), nHWMask, nullptr,
                                        kEveryThirdPartyHardware);
}

int CRobotConfigurationBasic::getIndexForSensorName(const CString &sName) const {
  return getTypedefIndex(getSensorNameDefinitions(settings.nCircuitBoardType), sName, true);
}

TDriveTrainType CRobotConfigurationBasic::getIndexForDriveTrainType(const CString &sWord) const {
  return getTypedefIndex(nDriveTrainTypes, sWord, true);
}

TJoystickDriveType CRobotConfigurationBasic::getIndexForJoystickDriveType(const CString &sWord) const {
  return getTypedefIndex(nJoystickDriveTypes, sWord, true);
}

TJoystickAxisScaling CRobotConfigurationBasic::getIndexForJoystickScalingType(const CString &sWord) const {
  return getTypedefIndex(nJoystickAxisScalingTypes, sWord, true);
}

TGripperArmType CRobotConfigurationBasic::getIndexForGripperArmType(const CString &sWord) const {
  return getTypedefIndex(nGripperArmTypes, sWord, true);
}

const TDeviceTypeMenuItem *CRobotConfigurationBasic::getSensorNameDefinitionsForCktBoards() const {
  return ::getSensorNameDefinitionsForCktBoards(settings.nCircuitBoardType);
}
