// Command line of robotcfg.
#pragma once

#include <string>
#include <vector>

#include "robotconfig/host/DeviceTypes.h"

enum class TCommand { kNone, kCheck, kFormat, kGenerate, kShow, kDiff, kModels, kSaveModel };

struct TOptions {
  TCommand nCommand = TCommand::kNone;
  std::vector<std::string> files;
  int nPlatformKind = platformNxt;
  TControllerBoardType nBoard = -1;  ///< -1: the platform's default board
  bool bExternalControllers = false;
  bool bInPlace = false;    ///< format -i
  bool bCheckOnly = false;  ///< format --check
  bool bVerbose = false;    ///< diff -v
  std::string sOutputPath;  ///< save-model -o
  bool bWarningsAreErrors = false;  ///< --Werror
  bool bQuiet = false;              ///< -q: errors only
  std::string sReportFormat = "text";  ///< check --format: text, json or sarif
  bool bShowSource = false;         ///< --show-source: caret excerpts even when not on a terminal
  bool bHelp = false;
  bool bVersion = false;
};

/// Parses the arguments; false with a message in `sError` on a usage error.
bool parseOptions(int argc, char **argv, TOptions &options, std::string &sError);

/// The usage text printed by --help.
const char *usageText();

/// Platform kind of a number 0..14 or a platform name; -1 when none.
int findPlatformKind(const std::string &sText);
/// Board number of a number or a board keyword or name; -1 when none.
TControllerBoardType findBoard(const std::string &sText);
