// The programs a command line names: files as given, folders walked, each
// with the project file that applies to it.
#pragma once

#include <string>

#include "cli/Options.h"

/// Replaces each folder in `options.files` (check and format) by the programs
/// in it: walked in sorted order, taking the files with a listed extension,
/// skipping hidden folders and excluded paths. A file named explicitly is
/// always taken. Also reads the project file of every program; false with a
/// message when a folder cannot be read or a project file is bad.
bool expandInputFiles(TOptions &options, std::string &sError);

/// Selects the platform, board and toggle for one program (a path, "-", or
/// "" for none): the command line's, else its project file's, else the defaults.
void selectPlatformForProgram(const std::string &sPath, const TOptions &options);

/// True when neither the command line, ROBOTCFG_PLATFORM nor a project file
/// chose the platform of a program.
bool bPlatformUnchosen(const std::string &sPath, const TOptions &options);
