// Building blocks of the catalog's name tables: platform masks, the row
// constructors every table is written with, and the tables that the lookup
// functions of DeviceCatalog.cpp and BoardCatalog.cpp share. Internal to host/.
#pragma once

#include <cstdint>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/DeviceTypes.h"

namespace robotconfig_catalog {

/// Platform-mask bit of one platform kind.
constexpr uint32_t platformBit(int nPlatformKind) { return 1u << nPlatformKind; }

constexpr uint32_t kAllPlatforms = 0xFFFFFFFFu;
constexpr uint32_t kVexPlatforms = platformBit(platformVexPic) | platformBit(platformVexI2c);
constexpr uint32_t kBoardPlatforms = platformBit(platformBoard10) | platformBit(platformBoard11) |
                                     platformBit(platformBoard12) | platformBit(platformBoard13) |
                                     platformBit(platformBoard14);
/// Platforms whose motors are called "motor1", "motor2", ... (the board kinds have no motor port).
constexpr uint32_t kNumberedMotorPlatforms = platformBit(platformArduino) | platformBit(platformSharedPorts) |
                                             platformBit(platformKind9);

/// Third-party mask of every catalog row: all hardware vendors but bit 0.
constexpr int32_t kAnyThirdPartyHardware = 0xFE;

/// A row of a name table. `nAttribute` carries a table-specific attribute
/// (hardware bits of motor types, sensor-type groups of sensor modes).
constexpr TDeviceTypeMenuItem menuRow(uint32_t nPlatformMask, int32_t nValue, const wchar_t *pzKeyword,
                                      const wchar_t *pzLabel = nullptr, uint32_t nAttribute = 0) {
  return {nPlatformMask, static_cast<int32_t>(nAttribute), 0, 0, 0, kAnyThirdPartyHardware, 0,
          nValue,        pzKeyword,                        pzLabel, 0};
}

/// A row giving a second keyword for a value already listed; lookups by value
/// prefer the canonical row.
constexpr TDeviceTypeMenuItem aliasRow(uint32_t nPlatformMask, int32_t nValue, const wchar_t *pzKeyword,
                                       const wchar_t *pzLabel = nullptr, uint32_t nAttribute = 0) {
  TDeviceTypeMenuItem row = menuRow(nPlatformMask, nValue, pzKeyword, pzLabel, nAttribute);
  row.nRowAttribute = kRowAttributeAlias;
  return row;
}

/// A sensor-port row: on every platform, keyword only.
constexpr TDeviceTypeMenuItem portRow(int32_t nPort, const wchar_t *pzKeyword) {
  return menuRow(kAllPlatforms, nPort, pzKeyword);
}

/// The row that ends every table.
constexpr TDeviceTypeMenuItem kEndOfTable = {0, 0, 0, 0, 0, 0, 0, 0, nullptr, nullptr, 0};

// Tables of DeviceNames.cpp that DeviceCatalog.cpp looks words up in.
extern const TDeviceTypeMenuItem kMotorTypeNames[];
extern const TDeviceTypeMenuItem kSensorTypeNames[];
extern const TDeviceTypeMenuItem kSensorModeNames[];
extern const TDeviceTypeMenuItem kServoTypeNames[];
extern const TDeviceTypeMenuItem kServoPortNames[];
extern const TDeviceTypeMenuItem kMotorPortNames[];
extern const TDeviceTypeMenuItem kSecondaryPortNames[];

/// Sensor-type groups whose modes a sensor type offers (bits of the
/// `nAttribute` of kSensorModeNames rows).
uint32_t getSensorModeGroups(TSensorTypes nType);

}  // namespace robotconfig_catalog
