// The manual page and the shell completion scripts (the help texts are in
// Options.h: usageText).
#pragma once

#include <string>

/// The manual page robotcfg.1, in roff.
std::string manPage();
/// The completion script of a shell ("bash", "zsh" or "fish"); "" for another.
std::string completionScript(const std::string &sShell);
