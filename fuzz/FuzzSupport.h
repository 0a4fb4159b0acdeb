// Shared set-up of the fuzz harnesses.
#pragma once

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/ProgramText.h"

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
inline void fuzzCheck(bool bHolds, const char *pzWhat);

/// The settled block of `config`; false for the one case the rules leave
/// unsettled: a drive train or gripper whose line left slots empty writes
/// "None" there, which the readers refuse (all drive-train slots, gripper
/// slots 0 and 2). Any other unsettled block stops the run.
inline bool bSettles(CHostRobotConfiguration &config, CString &sBlock) {
  std::vector<TConfigurationDiagnostic> refused;
  if (generateSettledBlock(config, sBlock, &refused)) return true;
  fuzzCheck(!refused.empty(), "the generated block settles");
  for (const TConfigurationDiagnostic &line : refused)
    fuzzCheck(line.sMessage.Find(L"No motor specified for index") == 0, "the generated block reads back");
  return false;
}

/// Stops the run when an invariant does not hold.
inline void fuzzCheck(bool bHolds, const char *pzWhat) {
  if (!bHolds) {
    std::fprintf(stderr, "invariant broken: %s\n", pzWhat);
    std::abort();
  }
}
