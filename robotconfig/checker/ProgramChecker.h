// The checker: reads a program on the reading road and reports every line
// whose meaning the record would drop or change, beside the readers' own
// refusals (which it never repeats).
#pragma once

#include <vector>

#include "robotconfig/checker/Finding.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

/// What the caller knows about how the program is read.
struct TCheckOptions {
  /// The board was named on purpose (a command-line option): a program that
  /// changes it deserves a warning rather than a note.
  bool bBoardChosen = false;
  /// Try the other platforms when many lines fail (costs a read per platform).
  bool bSuggestPlatforms = true;
};

/// Everything a check found.
struct TCheckResult {
  /// The readers' refusals (code RC001), then the checker's findings, in line order.
  std::vector<TFinding> findings;
  /// The refusals as the road returned them.
  std::vector<TConfigurationDiagnostic> refused;
  /// Counts by severity.
  int nErrors = 0;
  int nWarnings = 0;
};

/// Reads `program` into `config` (whose path is set) and checks it. Messages
/// the reading shows (board change, port-order rules) become findings; the
/// host selection (platform, board) is what the caller selected, and the
/// program's own board line may change it, as on the reading road.
TCheckResult checkProgram(CHostRobotConfiguration &config, const CProgramText &program,
                          const TCheckOptions &options = TCheckOptions());

/// The same for program text alone, read into a configuration of its own.
TCheckResult checkProgramText(const CProgramText &program, const TCheckOptions &options = TCheckOptions());
