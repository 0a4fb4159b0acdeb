// A unified diff of two texts, as `diff -u` prints it, for format --diff.
#pragma once

#include <string>

/// The unified diff (3 lines of context) turning `sOld` into `sNew`, under the
/// headers "--- a/NAME" and "+++ b/NAME"; "" when the texts are equal.
std::string unifiedDiff(const std::string &sOld, const std::string &sNew, const std::string &sName);
