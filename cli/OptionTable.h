// The commands and options of robotcfg as data: one table drives the parser,
// the help of each command, the manual page and the completion scripts, so
// that they cannot disagree.
#pragma once

#include <string>

#include "cli/Options.h"

/// One command.
struct TCommandSpec {
  TCommand nCommand;
  const char *pzName;
  const char *pzArguments;  ///< as the usage line shows them, "" when none
  int nMinFiles;
  int nMaxFiles;             ///< -1: any number
  const char *pzFileError;   ///< usage error when the file count is wrong
  const char *pzSummary;     ///< one line for the command list
  const char *pzDescription; ///< paragraphs for COMMAND --help, lines ending in "\n"
  const char *pzExitStatus;  ///< what 0, 1 and 2 mean for it
  const char *pzExample;     ///< one command line, or lines
};

/// Bit of a command in an option's command set.
constexpr unsigned commandBit(TCommand nCommand) { return 1u << unsigned(nCommand); }
/// Every command.
constexpr unsigned kEveryCommand = ~0u;

/// One option. An option with a value name takes a value, as "--name VALUE"
/// or "--name=VALUE"; any other takes none.
struct TOptionSpec {
  const char *pzShort;   ///< "-i", or null
  const char *pzLong;    ///< "--in-place"
  const char *pzValue;   ///< value name ("OUT"), or null for a switch
  unsigned nCommands;    ///< commands it applies to
  const char *pzHelp;    ///< one sentence
  const char *pzChoices; ///< blank-separated values to complete; "@platforms", "@boards", "@files", or null
  /// Stores the option; false with a message in `sError` for a bad value.
  bool (*apply)(TOptions &options, const std::string &sValue, std::string &sError);
};

/// The commands, in the order the help lists them.
extern const TCommandSpec kCommandSpecs[];
extern const size_t kNumbOfCommandSpecs;
/// The options, in the order the help lists them.
extern const TOptionSpec kOptionSpecs[];
extern const size_t kNumbOfOptionSpecs;

/// The command of a name; null when none.
const TCommandSpec *findCommandSpec(const std::string &sName);
/// The table row of a command; null for kNone.
const TCommandSpec *commandSpecOf(TCommand nCommand);
/// "--long" or "-s, --long" as the help shows an option, with its value name.
std::string optionLabel(const TOptionSpec &option);
