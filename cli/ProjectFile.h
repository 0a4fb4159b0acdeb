// The project file robotcfg.toml: found like .clang-format (the nearest one in
// a program's folder or above it), it sets the platform, board and toggle of
// the programs below it and which files a folder holds.
#pragma once

#include <string>
#include <vector>

#include "cli/Options.h"

/// What a project file says; a key it leaves out keeps its default.
struct TProjectSettings {
  std::string sPath;    ///< the file; "" when there is none
  std::string sFolder;  ///< its folder, which exclude patterns are relative to
  bool bHasPlatform = false;
  int nPlatformKind = -1;
  bool bHasBoard = false;
  TControllerBoardType nBoard = -1;
  bool bHasExternal = false;
  bool bExternalControllers = false;
  std::vector<std::string> extensions{".c"};
  std::vector<std::string> exclude;
};

/// The names looked for in each folder, in order.
extern const char *const kProjectFileNames[2];

/// Reads a project file; false with "FILE:LINE:COL: MESSAGE" in `sError` when
/// it cannot be read, is no TOML, or holds an unknown key or a bad value.
bool loadProjectFile(const std::string &sPath, TProjectSettings &settings, std::string &sError);

/// Reads the text of a project file named `sPath` into `settings` (whose
/// path and folder the caller sets); false with the message as above.
bool parseProjectText(const std::string &sText, const std::string &sPath, TProjectSettings &settings,
                      std::string &sError);

/// The project file of a program or folder (`sPath`; "" stands for the
/// current folder): --config's, none with --no-config, or the nearest one
/// found upwards. False (with the message) when that file is bad.
bool projectSettingsFor(const std::string &sPath, bool bIsFolder, const TOptions &options,
                        TProjectSettings &settings, std::string &sError);

/// Selects the host platform, board and toggle for a program: the command
/// line's where it gave them, else the project file's, else the defaults.
void selectPlatformFor(const TProjectSettings &settings, const TOptions &options);

/// True when `sPath` (below the project file's folder) matches an exclude pattern.
bool bExcluded(const TProjectSettings &settings, const std::string &sPath);
