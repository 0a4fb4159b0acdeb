// PID-settings service: the per-motor PID record and its operations.
#pragma once

#include <cstdint>

/// PID settings of one motor: four 8-bit values, then four 16-bit values.
/// All zero means "no settings" (the empty record).
struct TPidSettings {
  uint8_t B1, B2, B3, B4;
  uint16_t W1, W2, W3, W4;

  /// Copies `pSource` into this record (a null source empties it).
  void copyPidSettings(const TPidSettings *pSource);
  /// True when both records hold the same eight values.
  bool bIdenticalPidSettings(const TPidSettings &other) const;
  /// Empties the record.
  void clearPidSettings();
};

/// A record with no settings.
extern const TPidSettings emptyPidSettings;
