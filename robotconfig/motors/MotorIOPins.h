// Motor IO-pin tables of the controller boards and plug-in boards, and the
// hub (motor/servo controller) keywords.
#pragma once

#include <cstdint>

#include "robotconfig/host/DeviceTypes.h"

/// One motor index's pins on a board: row i belongs to motor index i.
struct TMotorIOPinsDefinition {
  TSensorHWTypesMask nHWTypesMask;     ///< motor types the pins can drive
  const wchar_t *pzDefaultMotorName;   ///< default motor name, or null
  const wchar_t *pzPrimaryIOPinName;
  int32_t bPrimaryIOPinFlag;
  const wchar_t *pzSecondaryIOPinName;  ///< null when the motor uses one pin
  int32_t bSecondaryIOPinFlag;
};

/// Hub keywords by hub value 0..7, ended by null.
extern const wchar_t *const pzMuxTypes[9];

/// Keyword of hub values 0..5; "none" for any other value.
const wchar_t *getMuxTypes(int nHubType);

/// A pin table and its row count.
struct TMotorIOPinTableRef {
  const TMotorIOPinsDefinition *pTable;
  int32_t nCount;
};

/// The motor pin table of a controller board; `bChangesTable` is false for
/// boards that keep whatever table is set.
TMotorIOPinTableRef getControllerBoardMotorIOPins(TControllerBoardType nBoard, bool &bChangesTable);
/// The motor pin table of a plug-in board value; count 0 when it sets none.
TMotorIOPinTableRef getPluginBoardMotorIOPins(int nPluginBoard);
