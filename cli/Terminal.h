// Colour on a terminal: --color=auto|always|never, and NO_COLOR.
#pragma once

#include <string>

#include "cli/Options.h"

/// Decides whether standard output and standard error are coloured: always,
/// never, or (auto) when the stream is a terminal and NO_COLOR is unset or empty.
void setColorWhen(TColorWhen nWhen);

/// `sText` ("FILE:LINE:COL: error: ..." lines) with the severity words coloured
/// when standard error is coloured.
std::string colouredDiagnostics(const std::string &sText);

/// A unified diff with removed lines red, added ones green and hunk headers
/// cyan when standard output is coloured.
std::string colouredDiff(const std::string &sDiff);
