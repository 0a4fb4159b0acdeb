// Device-name catalog: the words of the configuration language (type, mode
// and port keywords) and the drive-train menu tables. Lookups see only the
// rows whose platform mask includes the current platform.
#pragma once

#include <cstdint>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceTypes.h"

/// One row of every name table. A row with platform mask 0 ends a table.
struct TDeviceTypeMenuItem {
  uint32_t nPlatformMask;      ///< bit 1 << k for platform kind k; 0xFFFFFFFF = all
  int32_t nAttribute;          ///< row attribute; the hardware-type bits of motor-type rows
  int32_t nSpare1;
  int32_t nSpare2;
  int32_t nSpare3;
  int32_t nThirdPartyMask;     ///< 0xFE in the library's tables
  int32_t nRowAttribute;       ///< 5 = a second keyword for a value already listed
  int32_t nValue;
  const wchar_t *pzKeyword;    ///< word as written in configuration lines
  const wchar_t *pzLabel;      ///< display label or null
  int32_t nSpare4;
};

/// Row attribute of a second keyword for an already listed value.
constexpr int32_t kRowAttributeAlias = 5;

/// Value of the first row (of the current platform) whose keyword is `sText`
/// exactly; -1 when none. The bool is always true.
int getTypedefIndex(const TDeviceTypeMenuItem *pTable, const CString &sText, bool bExact);
/// Keyword of a value: the first row of the current platform that is not an
/// alias, else the first alias; "" when no row has the value.
const wchar_t *getTypedefEnumString(const TDeviceTypeMenuItem *pTable, int nValue, TSensorHWTypesMask nMask);

/// Sensor-port name table of a board (value = sensor-port index).
const TDeviceTypeMenuItem *getSensorNameDefinitions(TControllerBoardType nBoard);
/// The same table as offered to the board menus of the setup dialogs.
const TDeviceTypeMenuItem *getSensorNameDefinitionsForCktBoards(TControllerBoardType nBoard);
/// Name of a sensor port on a board: "None" for -1, "" for a port the board lacks.
const wchar_t *getSensorPortString(int nPort, TControllerBoardType nBoard);

/// Motor-type keyword of a type whose hardware bits meet `nMask` (mask 0 or -1:
/// any type); "" when none.
const wchar_t *getMotorTypedefString(TMotorTypes nType, TSensorHWTypesMask nMask);
/// Motor type of a keyword whose hardware bits meet `nMask`; -1 when none.
TMotorTypes getMotorTypedefNameIndex(const CString &sText, TSensorHWTypesMask nMask);

const wchar_t *getServoTypedefString(TServoTypes nType);
TServoTypes getServoTypedefNameIndex(const CString &sText);

const wchar_t *getSensorTypeString(TSensorTypes nType);
TSensorTypes getSensorTypeIndex(const CString &sText, bool bExact);

/// Keyword of a sensor mode; "" when the type has no such mode.
const wchar_t *getSensorModeString(TSensorTypes nType, TSensorModes nMode);
/// Mode of a keyword for a sensor type; -1 when none.
TSensorModes getSensorModeIndex(TSensorTypes nType, const CString &sText, bool bExact);

/// Servo index of a servo port name, -1 when none.
int getServoIndex(const CString &sText);
/// Port name of a servo index (empty when none).
void getServoPortString(int nServo, CString &sName);

/// Motor index of a motor port name on the current platform, -1 when none.
int getMotorIndexForNonArduinoPlatforms(const CString &sText);
/// Port name of a motor index on the current platform (empty when none).
void getMotorPortStringForNonArduinoPlatforms(int nMotor, CString &sName);

/// Secondary-port value of a keyword, -1 when none.
int getSecondaryPortIndex(const CString &sText);
/// Keyword of a secondary-port value; "" for -1 and unknown values.
const wchar_t *getSensorSecondaryPort(int nSecondary);

/// The name tables behind the lookups above, rows of every platform (a row's
/// mask tells where it applies), for menus and checkers that list the words.
const TDeviceTypeMenuItem *getMotorTypeNameTable();
const TDeviceTypeMenuItem *getSensorTypeNameTable();
/// Sensor modes of every type; getSensorModeIndex tells which belong to a type.
const TDeviceTypeMenuItem *getSensorModeNameTable();
const TDeviceTypeMenuItem *getServoTypeNameTable();

/// Decimal value of the text (optional sign, blanks around allowed);
/// `bOk` is false, and the result 0, when the text is no number or overflows.
int getInteger(const CString &sText, bool &bOk);

extern const TDeviceTypeMenuItem nDriveTrainTypes[];
extern const TDeviceTypeMenuItem nGripperArmTypes[];
extern const TDeviceTypeMenuItem nJoystickDriveTypes[];
extern const TDeviceTypeMenuItem nJoystickAxisScalingTypes[];
