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
inline void checkOnlyUnwritableSlotsRefused(const std::vector<TConfigurationDiagnostic> &refused);

/// The settled block of `config`; false for the one case the rules leave
/// unsettled: a drive train or gripper whose line left slots empty writes
/// "None" there, which the readers refuse (all drive-train slots, gripper
/// slots 0 and 2). Any other unsettled block stops the run.
inline bool bSettles(CHostRobotConfiguration &config, CString &sBlock) {
  std::vector<TConfigurationDiagnostic> refused;
  if (generateSettledBlock(config, sBlock, &refused)) return true;
  fuzzCheck(!refused.empty(), "the generated block settles");
  checkOnlyUnwritableSlotsRefused(refused);
  return false;
}

/// Stops the run unless the lines refused in a generated block are the one
/// case the rules leave unwritable: a drive train or gripper whose line left
/// slots empty writes "None" there, which the readers refuse (all drive-train
/// slots, gripper slots 0 and 2).
inline void checkOnlyUnwritableSlotsRefused(const std::vector<TConfigurationDiagnostic> &refused) {
  for (const TConfigurationDiagnostic &line : refused)
    fuzzCheck(line.sMessage.Find(L"No motor specified for index") == 0, "the generated block reads back");
}

/// Checks that the block `config` writes reads back to a record that writes
/// the same block again. Two rules may change it once, and only they: a board
/// word that names no board falls back to the IDE's board, and the I2C use
/// "i2cSensors" follows the sensors. False when the block cannot be read back
/// (the unwritable drive-train and gripper slots).
inline bool bReadsBackToItself(CHostRobotConfiguration &config) {
  CString sBlock;
  config.buildSourceCodeForConfiguration(sBlock, false);
  // Reading again must neither move the IDE's board nor repeat the warnings.
  CHostSelectionScope selection;
  CCapturingMessageSink quiet;
  CHostRobotConfiguration reread;
  const std::vector<TConfigurationDiagnostic> refused = readProgramConfiguration(reread, CProgramText(sBlock.toUtf8()));
  if (!refused.empty()) {
    checkOnlyUnwritableSlotsRefused(refused);
    return false;
  }
  CString sAgain;
  reread.buildSourceCodeForConfiguration(sAgain, false);
  if (sAgain == sBlock) return true;
  const TConfigurationSettings &before = config.getSettings(), &after = reread.getSettings();
  fuzzCheck(before.nCircuitBoardType != after.nCircuitBoardType || before.nI2CMode[0] != after.nI2CMode[0],
            "the generated block reads back to itself");
  return true;
}

/// Stops the run when an invariant does not hold.
inline void fuzzCheck(bool bHolds, const char *pzWhat) {
  if (!bHolds) {
    std::fprintf(stderr, "invariant broken: %s\n", pzWhat);
    std::abort();
  }
}
