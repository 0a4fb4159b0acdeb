// Shared set-up of the fuzz harnesses.
#pragma once

#include <cstdint>
#include <cstdlib>
#include <string>

#include "host/HostMessages.h"
#include "host/Platform.h"

/// Selects the platform kind and toggle 1 from the input's first byte and
/// the IDE board from the second (the platform's own board for values past
/// the catalog's boards), and removes those bytes.
inline void selectPlatformFromInput(const uint8_t *&data, size_t &size) {
  int nKind = platformNxt;
  bool bExternal = false;
  TControllerBoardType nBoard = -1;
  if (size > 0) {
    nKind = data[0] % kNumbOfPlatformKinds;
    bExternal = (data[0] & 0x80) != 0;
    ++data;
    --size;
  }
  if (size > 0) {
    // Most inputs keep the platform's own board; some try any board of the catalog.
    if (data[0] < 74) nBoard = data[0] % 37;
    ++data;
    --size;
  }
  selectHostPlatform(nKind, nBoard, bExternal);
}

/// Stops the run when an invariant does not hold.
inline void fuzzCheck(bool bHolds, const char *pzWhat) {
  if (!bHolds) {
    std::fprintf(stderr, "invariant broken: %s\n", pzWhat);
    std::abort();
  }
}
