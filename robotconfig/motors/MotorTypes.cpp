#include "robotconfig/motors/MotorTypes.h"

#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

constexpr uint32_t kAllPlatforms = 0xFFFFFFFF;

// Which motor types exist where, with their default flags. Order matters: a
// later row of the same type replaces an earlier one on a platform both match.
//  type, platform mask, toggle, host values 1-3, host bytes 1-2, always generate, host byte 4, reversed, encoder, PID
constexpr TMotorCharacteristics kMotorCharacteristics[] = {
    {0, kAllPlatforms, 0, 2, 1, 0, 0, 0, 0, 1, 0, 0, 0, 0},
    {26, 0x102, 0, 2, 1, 1, 1, 0, 0, 0, 0, 1, 0, 0},
    {17, 0x102, 0, 2, 1, 1, 1, 0, 0, 1, 0, 1, 1, 0},
    {18, 0x100, 0, 2, 1, 1, 1, 0, 0, 1, 0, 1, 1, 0},
    {19, 0x100, 0, 2, 1, 1, 1, 0, 0, 1, 0, 1, 1, 0},
    {20, 0x102, 0, 2, 1, 2, 1, 0, 1, 1, 0, 0, 0, 0},
    {21, 0x102, 0, 2, 1, 2, 1, 0, 1, 1, 0, 0, 0, 0},
    {2, 0x102, 1, 2, 1, 0, 0, 0, 1, 1, 0, 0, 0, 0},
    {3, 0x102, 1, 2, 1, 0, 0, 0, 1, 1, 0, 0, 0, 0},
    {26, 0x28C, 0, 2, 1, 3, 1, 0, 0, 1, 0, 0, 0, 0},
    {1, 0x10, 0, 2, 0, 0, 0, 0, 1, 1, 0, 0, 0, 0},
    {4, 0x28C, 0, 2, 1, 0, 0, 0, 1, 1, 1, 0, 0, 0},
    {10, 0x4, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {11, 0x4, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {12, 0x4, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {13, 0x4, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {6, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {7, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {8, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {9, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {10, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {11, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {12, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {13, 0x8, 0, 6, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {14, 0x80, 0, 2, 1, 1, 1, 0, 1, 1, 0, 1, 1, 0},
    {2, 0x29C, 0, 2, 1, 0, 0, 0, 1, 1, 0, 0, 0, 0},
    {3, 0x29C, 0, 2, 1, 3, 1, 0, 1, 1, 0, 0, 0, 0},
    {5, 0x29C, 0, 2, 1, 0, 0, 0, 1, 1, 1, 0, 0, 0},
    {16, 0x10, 0, 2, 1, 0, 0, 0, 1, 1, 0, 0, 0, 0},
    {22, 0x10, 0, 2, 1, 3, 1, 1, 1, 1, 0, 0, 0, 0},
    {23, 0x10, 0, 2, 1, 3, 1, 1, 1, 1, 0, 0, 0, 0},
    {24, 0x10, 0, 2, 1, 3, 1, 1, 1, 1, 0, 0, 0, 0},
    {25, 0x10, 0, 2, 1, 3, 1, 1, 1, 1, 0, 0, 0, 0},
    {27, 0x102, 0, 2, 1, 3, 0, 0, 1, 1, 0, 1, 0, 0},
    {28, 0x102, 0, 2, 1, 3, 1, 0, 1, 1, 0, 1, 1, 0},
    {29, kAllPlatforms, 0, 2, 1, 0, 0, 0, 1, 1, 1, 0, 0, 0},
    {30, 0x102, 1, 2, 1, 2, 0, 0, 1, 1, 0, 1, 0, 0},
    {31, 0x102, 1, 2, 1, 2, 1, 0, 1, 1, 0, 1, 1, 0},
};

// Replacement of each type per platform group (kind 1, 8, 2, 3, 7, 9, 4 and 10-14).
constexpr TMotorTypeConversion kMotorTypeConversions[kNumbOfMotorTypes] = {
    {0, {0, 0, 0, 0, 0, 0, 0}},       {1, {0, 0, 0, 0, 0, 0, 1}},       {2, {2, 2, 2, 2, 14, 15, 2}},
    {3, {3, 3, 3, 3, 14, 15, 3}},     {4, {0, 0, 4, 4, 14, 15, 5}},     {5, {0, 0, 5, 5, 14, 15, 5}},
    {6, {17, 18, 10, 6, 14, 15, 3}},  {7, {17, 18, 11, 7, 14, 15, 3}},  {8, {17, 18, 12, 8, 14, 15, 3}},
    {9, {17, 18, 13, 9, 14, 15, 3}},  {10, {17, 18, 10, 10, 14, 15, 3}}, {11, {17, 18, 11, 11, 14, 15, 3}},
    {12, {17, 18, 12, 12, 14, 15, 3}}, {13, {17, 18, 13, 13, 14, 15, 3}}, {14, {17, 18, 11, 7, 14, 15, 3}},
    {15, {17, 18, 11, 7, 14, 15, 3}}, {16, {0, 0, 16, 16, 14, 15, 16}}, {17, {17, 17, 3, 3, 14, 15, 3}},
    {18, {17, 18, 3, 3, 14, 15, 3}},  {19, {17, 19, 3, 3, 14, 15, 3}},  {20, {20, 20, 3, 3, 14, 15, 3}},
    {21, {21, 21, 3, 3, 14, 15, 3}},  {22, {17, 18, 3, 3, 14, 15, 22}}, {23, {17, 18, 3, 3, 14, 15, 23}},
    {24, {17, 18, 3, 3, 14, 15, 24}}, {25, {17, 18, 3, 3, 14, 15, 25}}, {26, {0, 0, 0, 0, 0, 0, 0}},
    {27, {0, 0, 0, 0, 0, 0, 0}},      {28, {0, 0, 0, 0, 0, 0, 0}},      {29, {0, 0, 0, 0, 0, 0, 0}},
    {30, {0, 0, 0, 0, 0, 0, 0}},      {31, {0, 0, 0, 0, 0, 0, 0}},
};

// Conversion column of each platform kind 0..14; -1 = no column.
constexpr std::array<int, kNumbOfPlatformKinds> kConversionColumnOfKind = {-1, 0, 2, 3, 6, -1, -1, 4, 1, 5, 6, 6, 6, 6, 6};

// The per-platform lookup, shared by every configuration and rebuilt when
// the platform mask changes (a platform switch in the IDE).
struct TMotorTypeLookup {
  uint32_t nPlatformMask = 0;
  uint32_t nToggleState = 0;
  std::array<const TMotorCharacteristics *, kNumbOfMotorTypes> characteristics{};
  std::array<const TMotorTypeConversion *, kNumbOfMotorTypes> conversions{};
};
TMotorTypeLookup motorTypeLookup;

// The lookup for the current platform, rebuilt when the platform mask or the
// controller toggle has changed since the last build.
const TMotorTypeLookup &currentMotorTypeLookup() {
  const uint32_t nMask = pToggles->getPlatformMask();
  // Rows guarded by a toggle change with it too, so the toggle is part of the key.
  const uint32_t nToggles = pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) ? 1u : 0u;
  TMotorTypeLookup &lookup = motorTypeLookup;
  if (lookup.nPlatformMask == nMask && lookup.nToggleState == nToggles && lookup.conversions[0] != nullptr)
    return lookup;
  lookup.nPlatformMask = nMask;
  lookup.nToggleState = nToggles;
  lookup.characteristics.fill(nullptr);
  lookup.conversions.fill(nullptr);
  for (const TMotorCharacteristics &row : kMotorCharacteristics) {
    if ((row.nPlatformMask & nMask) == 0) continue;
    if (row.nToggle != 0 && !pToggles->bIsToggleEnabled(row.nToggle, kToggleQueryLevel)) continue;
    lookup.characteristics[size_t(row.nMotorType)] = &row;
  }
  for (const TMotorTypeConversion &row : kMotorTypeConversions) lookup.conversions[size_t(row.nSourceType)] = &row;
  return lookup;
}

bool bIsMotorType(TMotorTypes nType) { return nType >= 0 && nType < kNumbOfMotorTypes; }

}  // namespace

const TMotorCharacteristics *getMotorCharacteristics(TMotorTypes nType) {
  if (!bIsMotorType(nType)) return nullptr;
  return currentMotorTypeLookup().characteristics[size_t(nType)];
}

const TMotorCharacteristics *getRawMotorCharacteristics(TMotorTypes nType) { return getMotorCharacteristics(nType); }

const TMotorTypeConversion *getMotorConversion(TMotorTypes nType) {
  if (!bIsMotorType(nType)) return nullptr;
  return currentMotorTypeLookup().conversions[size_t(nType)];
}

TMotorTypes resolveMotorTypeForPlatform(TMotorTypes nType) {
  if (getMotorCharacteristics(nType)) return nType;
  const TMotorTypeConversion *pConversion = getMotorConversion(nType);
  const int nKind = pToggles->getPlatformKind();
  if (!pConversion || nKind < 0 || nKind >= kNumbOfPlatformKinds) return 0;
  const int nColumn = kConversionColumnOfKind[size_t(nKind)];
  if (nColumn < 0) return 0;
  const TMotorTypes nReplacement = pConversion->nReplacement[size_t(nColumn)];
  return getMotorCharacteristics(nReplacement) ? nReplacement : 0;
}

TMotorTypes CRobotConfigurationBasic::getDefaultMotorType(int nMotor) const {
  // Motor type a hub drives its motors with.
  auto hubDefault = [this](int n) -> TMotorTypes {
    switch (getMotorMuxForMotor(n)) {
      case hubHTMotor: return 20;
      case hubMatrxRbtcs: return 21;
      default: return 0;
    }
  };
  switch (pToggles->getPlatformKind()) {
    case platformNxt: return nMotor >= 0 && nMotor <= 2 ? 17 : hubDefault(nMotor);
    case platformBrick4Motor: return nMotor >= 0 && nMotor <= 3 ? 18 : hubDefault(nMotor);
    case platformSharedPorts: return 14;
    case platformKind9: return 15;
    default: return 3;
  }
}

TMotorTypes CRobotConfigurationBasic::getMotorTypeWithOptionalAdjustForMotorTypeNone(int nMotor) const {
  if (!bIsMotorIndex(nMotor)) return 0;
  const TMotorTypes nType = settings.motors[size_t(nMotor)].nMotorType;
  if (nType != 0 && nType != -1) return nType;
  if (!bIsValidMotorPort(nMotor)) return 0;
  const int nKind = pToggles->getPlatformKind();
  return (nKind == platformNxt || nKind == platformBrick4Motor) ? getDefaultMotorType(nMotor) : 0;
}

TMotorTypes CRobotConfigurationBasic::adjustLegacyMotorNormalDeprecated(int nMotor) {
  const TMotorTypes nType = getDefaultMotorType(nMotor);
  setMotorTypeInConfig(nMotor, nType);
  return nType;
}

void CRobotConfigurationBasic::setMotorTypeInConfig(int nMotor, TMotorTypes nType) {
  if (!bIsMotorIndex(nMotor)) return;
  TMotorSlot &motor = settings.motors[size_t(nMotor)];
  if (motor.nMotorType != nType) {
    parseInfo.bMotorListIndexMappingBuilt = false;
    // On shared ports a motor and the sensor port of the same index go together.
    if (bSharedPortsForMotorsAndSensors() && nMotor < kMaxNumbOfSensorPorts) {
      if (nType != 0) setSensorTypeInConfig(nMotor, 91);
      else setSensorTypeInConfig(nMotor, 0);
    }
  }
  motor.nMotorType = nType;
  const TMotorCharacteristics *pRow = getMotorCharacteristics(nType);
  motor.bPIDControlled = pRow && pRow->bDefaultPIDControl;
  motor.bReversed = pRow && pRow->bDefaultReversed;
  TPidSettings defaults;
  pToggles->copyDefaultPidSettings(nType, defaults);
  motor.pidSettings.copyPidSettings(&defaults);
  if (nType == 0)
    for (uint8_t &nDriveMotor : settings.nDriveTrainMotorIndex)
      if (nDriveMotor == nMotor) nDriveMotor = 255;
}

namespace {

/// The type a legacy motor type becomes on this platform: the first of its
/// modern target, the type the conversion column gives for the target, and
/// the legacy type itself that the platform has and the motor's port can
/// drive (so that a line can name it there); failing that, the first the
/// platform has; 0 when it has none of them.
TMotorTypes modernTypeOfLegacy(const CRobotConfigurationBasic &config, int nMotor, TMotorTypes nLegacy,
                               TMotorTypes nTarget) {
  const TSensorHWTypesMask nHardwareMask = config.getAorDMotorTypeMask(nMotor);
  const TMotorTypes candidates[] = {nTarget, resolveMotorTypeForPlatform(nTarget), nLegacy};
  TMotorTypes nFirstOnPlatform = 0;
  for (const TMotorTypes nType : candidates) {
    if (nType == 0 || !getMotorCharacteristics(nType)) continue;
    if (*getMotorTypedefString(nType, nHardwareMask) != L'\0') return nType;
    if (nFirstOnPlatform == 0) nFirstOnPlatform = nType;
  }
  return nFirstOnPlatform;
}

}  // namespace

void CRobotConfigurationBasic::normalizeLegacyMotorConfiguration(int nMotor) {
  if (!bIsMotorIndex(nMotor)) return;
  TMotorSlot &motor = settings.motors[size_t(nMotor)];
  const TMotorTypes nType = motor.nMotorType;
  const TMotorCharacteristics *pRow = getMotorCharacteristics(nType);
  // A legacy type keeps its own reversed and PID defaults while taking the modern type.
  auto takeLegacyFlags = [&motor, pRow]() {
    motor.bReversed = pRow && pRow->bDefaultReversed;
    motor.bPIDControlled = pRow && pRow->bDefaultPIDControl;
  };
  switch (nType) {
    case 0: case 1: case 4: case 5: case 16:
      takeLegacyFlags();
      break;
    case 2: case 3: case 6: case 7: case 8: case 9: case 10: case 11: case 12: case 13: case 14:
    case 17: case 18: case 19: case 20: case 21: case 22: case 23: case 24: case 25:
      break;
    case 26: case 27: case 28: case 29:
      setMotorTypeInConfig(nMotor, modernTypeOfLegacy(*this, nMotor, nType, 17));
      takeLegacyFlags();
      break;
    case 30: case 31:
      setMotorTypeInConfig(nMotor, modernTypeOfLegacy(*this, nMotor, nType, 20));
      takeLegacyFlags();
      break;
    default:
      setMotorTypeInConfig(nMotor, 0);
      motor.bPIDControlled = false;
      motor.bReversed = false;
      break;
  }
}

bool CRobotConfigurationBasic::bGetDefaultEncoderSetting(int nMotor) const {
  const TMotorCharacteristics *pRow = getMotorCharacteristics(getMotorTypeInConfig(nMotor));
  return pRow && pRow->bDefaultEncoder;
}

bool CRobotConfigurationBasic::bGetDefaultPidControlSetting(int nMotor) const {
  const TMotorCharacteristics *pRow = getMotorCharacteristics(getMotorTypeInConfig(nMotor));
  return pRow && pRow->bDefaultPIDControl;
}

bool CRobotConfigurationBasic::bGetDefaultMotorReversedSetting(int nMotor) const {
  const TMotorCharacteristics *pRow = getMotorCharacteristics(getMotorTypeInConfig(nMotor));
  return pRow && pRow->bDefaultReversed;
}
