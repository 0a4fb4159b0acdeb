// Controller boards and plug-in boards: the plug-in board words of the
// PluginCircuitBoard line and the pins each controller board reserves.
#pragma once

#include <cstdint>

#include "robotconfig/host/DeviceTypes.h"

struct TDeviceTypeMenuItem;

/// Plug-in boards (motor shields) by value: 0 "typePluginBoardNone",
/// 1 "typeShieldDFRobotMotor", 2 "typeShieldDFRobotMotorOld",
/// 3 "typeShieldSparkfunArdumoto", 4 "typeShieldParallaxBoeBot"; rows exist
/// on the Arduino platform only, and a row with platform mask 0 ends the table.
extern const TDeviceTypeMenuItem nPluginCircuitBoardTypes[];

/// One pin a controller board reserves: the sensor type it puts on a sensor port.
struct TBoardFixedPin {
  TSensorTypes nSensorType;  ///< 60 a system UART pin, 65 a pin fixed by the board
  int32_t nSensorPort;
};

/// The pins of one controller board; `nCount` is 0 for a board that reserves none.
struct TBoardFixedPinList {
  const TBoardFixedPin *pPins;
  int32_t nCount;
};

/// Pins that a controller board reserves on its sensor ports. Boards 8-11,
/// 14-23, 27 and 28 reserve dgtl0 and dgtl1 (UART) and dgtl13; boards 12, 13
/// and 24 the same pins of their larger port layout; other boards none.
TBoardFixedPinList getControllerBoardFixedPins(TControllerBoardType nBoard);
