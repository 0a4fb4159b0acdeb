// Layer record (with core/, motors/, drive_serial_network/): built on host/ alone.
// What the setup dialogs' menus need from the sensor side of the library: the
// drive-side menu, the sensor-port menu of the configuration's board and the
// default mode of a sensor type.
#pragma once

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/DeviceTypes.h"

class CRobotConfigurationBasic;
class CDropDownButtonOfDeviceTypeMenuItem;

/// Drive sides of a motor on every platform: 0 "None", 1 "Left", 2 "Right",
/// ended by a row with platform mask 0.
extern const TDeviceTypeMenuItem nDriveSideMenu[];

/// Fills `button` with the sensor ports of `config`'s board that `nHWMask`
/// admits, every third-party mask accepted and nothing shown as chosen. The
/// bool is not used.
void addSensorPortsToMenu(CRobotConfigurationBasic &config, CDropDownButtonOfDeviceTypeMenuItem &button, bool bUnused,
                          TSensorHWTypesMask nHWMask);

/// Mode a sensor of a type starts with: 0 (the default mode) for every type.
TSensorModes getDefaultSensorModeForSensorType(TSensorTypes nType);
