// The drive-train, firmware, program-type and memory part of `show`.
#include <array>
#include <string>

#include "cli/Commands.h"
#include "robotconfig/core/MemoryAllocation.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/host/DeviceCatalog.h"

namespace {

/// Hardware-type mask the drive-train menus are read with.
constexpr TSensorHWTypesMask kDriveMenuMask = 7;

/// The firmware features and the settings flag of each, in the order a FirmwareFeatures line names them.
struct TFirmwareFeatureFlag {
  const wchar_t *pzKeyword;
  int32_t TConfigurationSettings::*pFlag;
};
constexpr std::array<TFirmwareFeatureFlag, 2> kFirmwareFeatureFlags = {{
    {L"fwTimedServo", &TConfigurationSettings::bFwTimedServo},
    {L"fwSounds", &TConfigurationSettings::bFwSounds},
}};

/// Appends one formatted line.
template <class... Args>
void appendLine(std::string &sOut, const wchar_t *pzFormat, const Args &...args) {
  CString sLine;
  sLine.Format(pzFormat, args...);
  sOut += sLine.toUtf8();
  sOut += '\n';
}

/// A menu value as its word, or its number when the catalog has no word for it.
CString menuWord(const TDeviceTypeMenuItem *pTable, int nValue, TSensorHWTypesMask nMask) {
  CString sWord(getTypedefEnumString(pTable, nValue, nMask));
  if (sWord.IsEmpty()) sWord.Format(L"%d", nValue);
  return sWord;
}

/// A slot's motor as "port (index)", or "none".
CString slotMotor(const CRobotConfigurationBasic &config, int nMotor) {
  if (!CRobotConfigurationBasic::bIsMotorIndex(nMotor)) return CString(L"none");
  CString sPort, sText;
  config.getDefaultMotorNameForPlatformOrControllerBoard(nMotor, sPort);
  sText.Format(L"%s (%d)", sPort.IsEmpty() ? CString(L"?") : sPort, nMotor);
  return sText;
}

/// A memory size as written in a MemorySize line.
CString memorySize(int nSize) {
  CString sSize(L"auto");
  if (nSize >= 0) sSize.Format(L"%d", nSize);
  return sSize;
}

void printDriveTrain(const CRobotConfigurationBasic &config, std::string &sOut) {
  if (config.getDriveTrainType() == 0) {
    sOut += "Drive train: none\n";
    return;
  }
  appendLine(sOut, L"Drive train: %s", menuWord(nDriveTrainTypes, config.getDriveTrainType(), kDriveMenuMask));
  for (int nSlot = 0; nSlot < config.getNumbOfMotorsForDriveTrain(); ++nSlot)
    appendLine(sOut, L"  motor %d  %s", nSlot, slotMotor(config, config.getDriveTrainMotorIndex(nSlot)));
  const auto &wheels = config.getSettings().nDriveTrainWheels;
  appendLine(sOut, L"  wheels   %d, %d, %d, %d, %d", wheels[0], wheels[1], wheels[2], wheels[3], wheels[4]);
}

void printGripperArm(const CRobotConfigurationBasic &config, std::string &sOut) {
  if (config.getGripperArmType() == 0) return;
  appendLine(sOut, L"Gripper arm: %s", menuWord(nGripperArmTypes, config.getGripperArmType(), kDriveMenuMask));
  for (int nSlot = 0; nSlot < config.getNumbOfMotorsForGripperArm(); ++nSlot)
    appendLine(sOut, L"  motor %d  %s", nSlot, slotMotor(config, config.getGripperArmMotorIndex(nSlot)));
}

void printJoystickDrive(const CRobotConfigurationBasic &config, std::string &sOut) {
  if (config.getJoystickMotorDriveType() == 0) {
    sOut += "Joystick drive: none\n";
    return;
  }
  appendLine(sOut, L"Joystick drive: %s, %s",
             menuWord(nJoystickDriveTypes, config.getJoystickMotorDriveType(), kDriveMenuMask),
             menuWord(nJoystickAxisScalingTypes, config.getJoystickMotorAxisScaling(), kDriveMenuMask));
}

void printProgramAndFirmware(const CRobotConfigurationBasic &config, std::string &sOut) {
  const TConfigurationSettings &settings = config.getSettings();
  CString sFeatures;
  for (const TFirmwareFeatureFlag &feature : kFirmwareFeatureFlags) {
    if (!(settings.*(feature.pFlag))) continue;
    sFeatures += L" ";
    sFeatures += feature.pzKeyword;
  }
  appendLine(sOut, L"Firmware features:%s", sFeatures.IsEmpty() ? CString(L" none") : sFeatures);
  const wchar_t *pzProgramType = getTypedefEnumString(nProgramTypes, settings.nProgramType, -1);
  appendLine(sOut, L"Program type: %s (%d)", *pzProgramType ? pzProgramType : L"-", settings.nProgramType);
}

// The sizes of the MemorySize line, and the RAM map the platform's defaults
// give for them: the pair sizes the datalog and debug streams, the third is
// the requested task stack, and the program is taken to use every task.
void printMemory(const CRobotConfigurationBasic &config, std::string &sOut) {
  const auto &sizes = config.getSettings().nMemorySizes;
  appendLine(sOut, L"Memory sizes: %s, %s, %s", memorySize(sizes[0]), memorySize(sizes[1]), memorySize(sizes[2]));
  TRamMemoryLimits limits;
  limits.loadDefaultMemorySettings();
  TMemoryAllocation allocation;
  allocation.nDatalogStreamSize = sizes[0] < 0 || sizes[1] < 0 ? -1 : sizes[0];
  allocation.nDebugStreamSize = sizes[0] < 0 || sizes[1] < 0 ? -1 : sizes[1];
  allocation.nDefaultTaskStackSize = limits.nDefaultTaskStackSize;
  allocation.nRequestedTaskStackSize = sizes[2];
  allocation.nNumbOfTasks = limits.nNumbOfTasks;
  allocation.calculateDerivedValues(limits);
  appendLine(sOut, L"RAM map: total %d, task stacks %d (%d tasks), datalog stream %d, debug stream %d, used %d",
             allocation.nTotalRam, allocation.nTotalTaskStack, allocation.nNumbOfTasks, allocation.nDatalogStreamSize,
             allocation.nDebugStreamSize, allocation.nTotalUsed);
}

}  // namespace

void printDriveAndProgramDetails(CRobotConfigurationBasic &config, std::string &sOut) {
  printDriveTrain(config, sOut);
  printGripperArm(config, sOut);
  printJoystickDrive(config, sOut);
  printProgramAndFirmware(config, sOut);
  printMemory(config, sOut);
}
