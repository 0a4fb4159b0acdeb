// check and format through the checker: reading a program with its findings,
// and printing them as text, JSON or SARIF.
#pragma once

#include <string>

#include "cli/Options.h"
#include "cli/ReadProgram.h"
#include "robotconfig/checker/Render.h"

/// Reads a program and checks it; false (after printing why) when the file
/// cannot be read. `findings` gets its findings, with --Werror applied.
bool readAndCheckProgram(const std::string &sPath, const TOptions &options, TReadProgram &program,
                         TFileFindings &findings);

/// True when the findings hold an error.
bool bHasErrors(const TFileFindings &findings);

/// Prints the findings of one file as text on standard error (-q and --show-source applied).
void printFindingsText(const TFileFindings &findings, const TOptions &options);

/// The check command: every file, one report in the chosen format.
int runCheckCommand(const TOptions &options);
