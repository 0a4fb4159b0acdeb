// Words of the configuration language for the model: device ports, type
// words and menus, turned between the record's numbers and the words a
// program's configuration lines use.
#pragma once

#include <string>
#include <vector>

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"

namespace robotconfig::model {

/// UTF-8 of a wide text; "" for null.
std::string utf8(const wchar_t *pzText);
std::string utf8(const CString &sText);

/// Port word of a motor index as its Motor line names it.
std::string motorPortWord(const CRobotConfigurationBasic &config, int nMotor);
/// Motor index of a port word the platform has; -1 when none.
int findMotorPort(const CRobotConfigurationBasic &config, const std::string &sWord);

/// Port word of a sensor port on the configuration's board; "" when the board lacks it.
std::string sensorPortWord(const CRobotConfigurationBasic &config, int nPort);
/// Sensor port of a port word of the configuration's board; -1 when none.
int findSensorPort(const CRobotConfigurationBasic &config, const std::string &sWord);
/// Number of sensor ports the record may use on this platform.
int sensorPortCount(const CRobotConfigurationBasic &config);

/// Port word of a servo index; "" when none.
std::string servoPortWord(int nServo);
/// Servo index of a port word valid on this platform; -1 when none.
int findServoPort(const CRobotConfigurationBasic &config, const std::string &sWord);

/// Word of a value in a name table of the current platform; "" when none.
std::string tableWord(const TDeviceTypeMenuItem *pTable, int nValue);
/// Keywords a drop-down menu of the setup dialogs offers from a table.
std::vector<std::string> menuWords(const TDeviceTypeMenuItem *pTable, TSensorHWTypesMask nHWMask = -1,
                                   TThirdPartyHWMask nThirdPartyMask = -1);
/// Value of a word in a menu that the same masks build; -1 when the menu lacks it.
int menuValue(const TDeviceTypeMenuItem *pTable, const std::string &sWord, TSensorHWTypesMask nHWMask = -1,
              TThirdPartyHWMask nThirdPartyMask = -1);

/// Motor-type words a motor port may take on this platform and board.
std::vector<std::string> motorTypeChoices(const CRobotConfigurationBasic &config, int nMotor);
/// Sensor-type words a sensor port may take (claimed pins and second halves left out).
std::vector<std::string> sensorTypeChoices();
/// Mode words of a sensor type; empty when the type has none.
std::vector<std::string> sensorModeChoices(TSensorTypes nType);
/// Servo-type words of this platform.
std::vector<std::string> servoTypeChoices();
/// Board words of this platform; empty when it has no board selection.
std::vector<std::string> boardChoices();

/// Sensor types the Sensor line cannot set: pins that motors, serial ports and
/// boards claim, and the second halves of two-port sensors.
bool bIsSensorTypeSetElsewhere(TSensorTypes nType);

}  // namespace robotconfig::model
