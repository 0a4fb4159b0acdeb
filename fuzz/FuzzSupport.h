// Shared set-up of the fuzz harnesses.
#pragma once

#include <cstdint>
#include <cstdlib>
#include <string>

#include "host/HostMessages.h"
#include "host/Platform.h"

/// Selects a platform kind, toggle and board from the input's first byte and
/// removes that byte; message boxes are captured, never printed.
inline void selectPlatformFromInput(const uint8_t *&data, size_t &size) {
  int nKind = platformNxt;
  bool bExternal = false;
  if (size > 0) {
    nKind = data[0] % kNumbOfPlatformKinds;
    bExternal = (data[0] & 0x80) != 0;
    ++data;
    --size;
  }
  selectHostPlatform(nKind, -1, bExternal);
}

/// Stops the run when an invariant does not hold.
inline void fuzzCheck(bool bHolds, const char *pzWhat) {
  if (!bHolds) {
    std::fprintf(stderr, "invariant broken: %s\n", pzWhat);
    std::abort();
  }
}
