// Numeric types shared by the configuration record and the host catalogs.
// They are plain 32-bit integers so that values read from program text and
// values from the catalogs mix without casts; the named constants below are
// the values with a fixed role in the configuration rules.
#pragma once

#include <cstdint>

typedef int32_t TControllerBoardType;  ///< controller board number, 0 = none
typedef int32_t TMotorTypes;           ///< motor type 0..31, 0 = no motor
typedef int32_t TSensorTypes;          ///< sensor type 0..91, 0 = no sensor
typedef int32_t TSensorModes;          ///< sensor mode, 0 = default
typedef int32_t TServoTypes;           ///< servo type, 0 = none
typedef int32_t TSensorPortHub;        ///< hub (motor/servo controller) type, 0 = none
typedef int32_t TMotorDriveSide;       ///< 0 none, 1 left, 2 right
typedef int32_t TMotorIndex;           ///< motor index 0..35
typedef int32_t TServoIndex;           ///< servo index 0..127
typedef int32_t tSensors;              ///< sensor port 0..97
typedef int32_t TSensorHWTypesMask;    ///< hardware-type mask that filters type names
typedef int32_t TThirdPartyHWMask;     ///< third-party hardware mask of menu rows
typedef int32_t TSerialPortMode;       ///< UART use
typedef int32_t TBaudRate;             ///< UART baud-rate code
typedef int32_t TDriveTrainType;
typedef int32_t TGripperArmType;
typedef int32_t TJoystickDriveType;
typedef int32_t TJoystickAxisScaling;

/// Platform kinds, as returned by CToggles::getPlatformKind().
enum : int32_t {
  platformNone = 0,
  platformNxt = 1,
  platformVexPic = 2,
  platformVexI2c = 3,
  platformArduino = 4,
  platformKind5 = 5,
  platformKind6 = 6,
  platformSharedPorts = 7,
  platformBrick4Motor = 8,
  platformKind9 = 9,
  platformBoard10 = 10,
  platformBoard11 = 11,
  platformBoard12 = 12,
  platformBoard13 = 13,
  platformBoard14 = 14,
};
constexpr int32_t kNumbOfPlatformKinds = 15;

/// Hub types of the daisy-chain table.
enum : int32_t {
  hubNone = 0,
  hubHTMotor = 1,
  hubHTServo = 2,
  hubMatrxRbtcs = 3,
  hubHTTouch = 4,
  hubMSServo = 5,
  hubMSMotor = 6,
  hubNXTSlave = 7,
};

/// Feature toggle 1: "External Motor/Servo Controllers".
constexpr int kToggleExternalControllers = 1;
/// The level every toggle query passes.
constexpr int kToggleQueryLevel = -10;
