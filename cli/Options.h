// Command line of robotcfg.
#pragma once

#include <string>
#include <vector>

#include "robotconfig/host/DeviceTypes.h"

enum class TCommand { kNone, kCheck, kFormat, kGenerate, kShow, kDiff, kModels, kSaveModel, kInit, kCompletion, kSet, kApply, kServe };

/// When output is coloured.
enum class TColorWhen { kAuto, kAlways, kNever };

struct TOptions {
  TCommand nCommand = TCommand::kNone;
  std::vector<std::string> files;
  int nPlatformKind = platformNxt;
  TControllerBoardType nBoard = -1;  ///< -1: the platform's default board
  bool bExternalControllers = false;
  /// Which of the three above the command line (or ROBOTCFG_PLATFORM) set:
  /// those override a project file.
  bool bPlatformGiven = false;
  bool bPlatformFromEnvironment = false;
  bool bBoardGiven = false;
  bool bExternalGiven = false;
  bool bInPlace = false;    ///< format -i
  bool bCheckOnly = false;  ///< format --check
  bool bDiff = false;       ///< format --diff
  bool bList = false;       ///< format -l
  bool bVerbose = false;    ///< diff -v; format -i -v
  std::string sOutputPath;  ///< save-model -o
  bool bWarningsAreErrors = false;  ///< --Werror
  bool bQuiet = false;              ///< -q: errors only
  std::string sReportFormat = "text";  ///< check --format: text, json or sarif
  bool bShowSource = false;         ///< --show-source: caret excerpts even when not on a terminal
  std::string sStdinFilename;       ///< --stdin-filename: the name of "-" in messages
  std::string sConfigPath;          ///< --config FILE
  bool bNoConfig = false;           ///< --no-config
  TColorWhen nColor = TColorWhen::kAuto;
  bool bJson = false;     ///< show --json
  bool bChoices = false;  ///< show --json --choices
  bool bAll = false;      ///< show --all: every port, not only configured devices
  bool bSvg = false;      ///< show --svg
  int nServePort = 0;        ///< serve --port (0: a free port)
  std::string sServeHost;    ///< serve --host (empty: 127.0.0.1)
  bool bHelp = false;
  bool bVersion = false;
  bool bManPage = false;            ///< --man
};

/// Parses the arguments; false with a message in `sError` on a usage error.
bool parseOptions(int argc, char **argv, TOptions &options, std::string &sError);

/// The help printed by --help: the whole tool's, or a command's.
std::string usageText(TCommand nCommand = TCommand::kNone);

/// Platform kind of a number 0..14 or a platform name; -1 when none.
int findPlatformKind(const std::string &sText);
/// Board number of a number or a board keyword or name; -1 when none.
TControllerBoardType findBoard(const std::string &sText);
/// "unknown platform 'X' (...)" listing the accepted names.
std::string unknownPlatformMessage(const std::string &sText);
/// "unknown board 'X' (...)" listing the accepted keywords.
std::string unknownBoardMessage(const std::string &sText);
/// The platform names and the board keywords, for messages and completion.
std::vector<std::string> platformNames();
std::vector<std::string> boardKeywords();
