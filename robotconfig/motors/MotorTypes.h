// Layer record (with core/, sensors/, drive_serial_network/): built on host/ alone.
// Motor types: which exist on the current platform, their default flags,
// and the replacement of types a platform lacks.
#pragma once

#include <array>
#include <cstdint>

#include "robotconfig/host/DeviceTypes.h"

/// Characteristics of one motor type on the platforms of its mask.
struct TMotorCharacteristics {
  TMotorTypes nMotorType;
  uint32_t nPlatformMask;
  int32_t nToggle;      ///< 0, or a feature toggle that must be on
  int32_t nHostValue1;
  int32_t nHostValue2;
  int32_t nHostValue3;
  uint8_t nHostByte1;
  uint8_t nHostByte2;
  uint8_t bAlwaysGenerate;
  uint8_t nHostByte4;
  uint8_t bDefaultReversed;
  uint8_t bDefaultEncoder;
  uint8_t bDefaultPIDControl;
  uint8_t nUnused;
};

/// Replacement of a type for each platform group: kind 1, kind 8, kind 2,
/// kind 3, kind 7, kind 9, kinds 4 and 10..14.
struct TMotorTypeConversion {
  TMotorTypes nSourceType;
  std::array<TMotorTypes, 7> nReplacement;
};

constexpr int kNumbOfMotorTypes = 32;

/// Characteristics of a type on the current platform; null when it has none.
const TMotorCharacteristics *getMotorCharacteristics(TMotorTypes nType);
/// The same lookup under its second exported name.
const TMotorCharacteristics *getRawMotorCharacteristics(TMotorTypes nType);
/// Conversion row of a type; null outside 0..31.
const TMotorTypeConversion *getMotorConversion(TMotorTypes nType);
/// A type read from a line, made one the current platform has (0 if none).
TMotorTypes resolveMotorTypeForPlatform(TMotorTypes nType);
