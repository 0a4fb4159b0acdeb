// The help texts, the manual page and the completion scripts, all written
// from the command and option tables.
#include "cli/Help.h"

#include <cstring>

#include "cli/OptionTable.h"

#ifndef ROBOTCONFIG_VERSION
#define ROBOTCONFIG_VERSION "0.1.0"
#endif

namespace {

constexpr size_t kWidth = 80;
constexpr size_t kLabelWidth = 26;

// `sText` broken at blanks into lines of at most kWidth columns; the first
// starts at column `nFirstColumn`, the others after `sIndent`.
std::string wrapped(const std::string &sText, const std::string &sIndent, size_t nFirstColumn) {
  std::string sOut;
  size_t nColumn = nFirstColumn;
  bool bLineEmpty = true;
  size_t nStart = 0;
  while (nStart < sText.size()) {
    size_t nEnd = sText.find(' ', nStart);
    if (nEnd == std::string::npos) nEnd = sText.size();
    const std::string sWord = sText.substr(nStart, nEnd - nStart);
    if (!bLineEmpty && nColumn + 1 + sWord.size() > kWidth) {
      sOut += "\n" + sIndent;
      nColumn = sIndent.size();
      bLineEmpty = true;
    }
    if (!bLineEmpty) {
      sOut += ' ';
      ++nColumn;
    }
    sOut += sWord;
    nColumn += sWord.size();
    bLineEmpty = false;
    nStart = nEnd + 1;
  }
  return sOut;
}

// One option as the help lists it.
std::string optionLine(const TOptionSpec &option) {
  std::string sLabel = "  " + optionLabel(option);
  if (sLabel.size() + 1 > kLabelWidth) sLabel += "\n" + std::string(kLabelWidth, ' ');
  else sLabel.resize(kLabelWidth, ' ');
  const size_t nColumn = sLabel.size() - (sLabel.rfind('\n') == std::string::npos ? 0 : sLabel.rfind('\n') + 1);
  return sLabel + wrapped(option.pzHelp, std::string(kLabelWidth, ' '), nColumn) + "\n";
}

bool bGlobal(const TOptionSpec &option) { return option.nCommands == kEveryCommand; }

// The options of one command (global ones excluded), or the global ones.
std::string optionLines(unsigned nBit) {
  std::string sOut;
  for (size_t n = 0; n < kNumbOfOptionSpecs; ++n) {
    const TOptionSpec &option = kOptionSpecs[n];
    if (nBit == kEveryCommand ? bGlobal(option) : (!bGlobal(option) && (option.nCommands & nBit)))
      sOut += optionLine(option);
  }
  return sOut;
}

// Indents every line of `sText`.
std::string indented(const std::string &sText, const char *pzIndent) {
  std::string sOut = pzIndent;
  for (size_t n = 0; n < sText.size(); ++n) {
    sOut += sText[n];
    if (sText[n] == '\n' && n + 1 < sText.size()) sOut += pzIndent;
  }
  return sOut;
}

// Roff text: a leading dot or quote and backslashes escaped, dashes as minus signs.
std::string roff(const std::string &sText) {
  std::string sOut;
  bool bLineStart = true;
  for (char c : sText) {
    if (bLineStart && (c == '.' || c == '\'')) sOut += "\\&";
    if (c == '\\') sOut += "\\e";
    else if (c == '-') sOut += "\\-";
    else sOut += c;
    bLineStart = c == '\n';
  }
  return sOut;
}

std::string manOptions(unsigned nBit) {
  std::string sOut;
  for (size_t n = 0; n < kNumbOfOptionSpecs; ++n) {
    const TOptionSpec &option = kOptionSpecs[n];
    if (nBit == kEveryCommand ? bGlobal(option) : (!bGlobal(option) && (option.nCommands & nBit)))
      sOut += ".TP\n.B " + roff(optionLabel(option)) + "\n" + roff(option.pzHelp) + "\n";
  }
  return sOut;
}

// Words to complete for an option's value, as a blank-separated list.
std::string choicesOf(const TOptionSpec &option) {
  if (!option.pzChoices) return "";
  std::vector<std::string> words;
  if (std::strcmp(option.pzChoices, "@platforms") == 0) words = platformNames();
  else if (std::strcmp(option.pzChoices, "@boards") == 0) words = boardKeywords();
  else if (option.pzChoices[0] != '@') return option.pzChoices;
  std::string sOut;
  for (const std::string &sWord : words) sOut += (sOut.empty() ? "" : " ") + sWord;
  return sOut;
}

std::string commandNames() {
  std::string sOut;
  for (size_t n = 0; n < kNumbOfCommandSpecs; ++n) sOut += (n ? " " : "") + std::string(kCommandSpecs[n].pzName);
  return sOut;
}

// Every spelling of the options that apply to a command.
std::string optionWords(TCommand nCommand) {
  std::string sOut;
  for (size_t n = 0; n < kNumbOfOptionSpecs; ++n) {
    const TOptionSpec &option = kOptionSpecs[n];
    if (!(option.nCommands & commandBit(nCommand))) continue;
    if (option.pzShort) sOut += std::string(sOut.empty() ? "" : " ") + option.pzShort;
    sOut += std::string(sOut.empty() ? "" : " ") + option.pzLong;
  }
  return sOut;
}

std::string bashCompletion() {
  std::string sOut =
      "# bash completion for robotcfg\n"
      "_robotcfg() {\n"
      "  local cur=${COMP_WORDS[COMP_CWORD]} prev=${COMP_WORDS[COMP_CWORD-1]} command= word\n"
      "  for word in \"${COMP_WORDS[@]:1:COMP_CWORD-1}\"; do\n"
      "    case \" " + commandNames() + " \" in *\" $word \"*) command=$word; break ;; esac\n"
      "  done\n"
      "  case $prev in\n";
  for (size_t n = 0; n < kNumbOfOptionSpecs; ++n) {
    const TOptionSpec &option = kOptionSpecs[n];
    if (!option.pzValue) continue;
    std::string sPattern = option.pzLong;
    if (option.pzShort) sPattern = std::string(option.pzShort) + "|" + sPattern;
    const std::string sChoices = choicesOf(option);
    sOut += "    " + sPattern + ") " +
            (sChoices.empty() ? std::string("COMPREPLY=($(compgen -f -- \"$cur\"))")
                              : "COMPREPLY=($(compgen -W \"" + sChoices + "\" -- \"$cur\"))") +
            "; return ;;\n";
  }
  sOut += "  esac\n  case $command in\n";
  for (size_t n = 0; n < kNumbOfCommandSpecs; ++n)
    sOut += std::string("    ") + kCommandSpecs[n].pzName + ") words=\"" + optionWords(kCommandSpecs[n].nCommand) +
            (kCommandSpecs[n].nCommand == TCommand::kCompletion ? " bash zsh fish" : "") + "\" ;;\n";
  sOut += "    *) words=\"" + commandNames() + " " + optionWords(TCommand::kNone) + "\" ;;\n"
          "  esac\n"
          "  if [[ $cur == -* || -z $command || $command == completion ]]; then\n"
          "    COMPREPLY=($(compgen -W \"$words\" -- \"$cur\"))\n"
          "  else\n"
          "    COMPREPLY=($(compgen -f -- \"$cur\"))\n"
          "  fi\n"
          "}\n"
          "complete -o filenames -F _robotcfg robotcfg\n";
  return sOut;
}

std::string zshCompletion() {
  // zsh runs the bash function through its bash-completion emulation.
  return "#compdef robotcfg\n"
         "autoload -U +X bashcompinit && bashcompinit\n" +
         bashCompletion();
}

std::string fishCompletion() {
  std::string sOut = "# fish completion for robotcfg\ncomplete -c robotcfg -f\n";
  for (size_t n = 0; n < kNumbOfCommandSpecs; ++n)
    sOut += std::string("complete -c robotcfg -n __fish_use_subcommand -a ") + kCommandSpecs[n].pzName + " -d '" +
            kCommandSpecs[n].pzSummary + "'\n";
  sOut += "complete -c robotcfg -n '__fish_seen_subcommand_from completion' -a 'bash zsh fish'\n";
  for (size_t n = 0; n < kNumbOfOptionSpecs; ++n) {
    const TOptionSpec &option = kOptionSpecs[n];
    sOut += "complete -c robotcfg";
    if (!bGlobal(option)) {
      sOut += " -n '__fish_seen_subcommand_from";
      for (size_t c = 0; c < kNumbOfCommandSpecs; ++c)
        if (option.nCommands & commandBit(kCommandSpecs[c].nCommand)) sOut += std::string(" ") + kCommandSpecs[c].pzName;
      sOut += "'";
    }
    if (option.pzShort) sOut += std::string(" -s ") + (option.pzShort + 1);
    sOut += std::string(" -l ") + (option.pzLong + 2);
    if (option.pzValue) {
      const std::string sChoices = choicesOf(option);
      sOut += sChoices.empty() ? " -r -F" : " -x -a '" + sChoices + "'";
    }
    std::string sHelp = option.pzHelp;
    for (size_t p = sHelp.find('\''); p != std::string::npos; p = sHelp.find('\'', p + 2)) sHelp.replace(p, 1, "\\'");
    sOut += " -d '" + sHelp + "'\n";
  }
  // Commands that take files complete file names.
  sOut += "complete -c robotcfg -n 'not __fish_use_subcommand; and not __fish_seen_subcommand_from models init completion' -F\n";
  return sOut;
}

}  // namespace

std::string usageText(TCommand nCommand) {
  const TCommandSpec *pCommand = commandSpecOf(nCommand);
  if (pCommand) {
    std::string sOut = std::string("usage: robotcfg [options] ") + pCommand->pzName +
                       (*pCommand->pzArguments ? " " : "") + pCommand->pzArguments + "\n\n" +
                       pCommand->pzDescription + "\n";
    const std::string sOptions = optionLines(commandBit(nCommand));
    if (!sOptions.empty()) sOut += "options:\n" + sOptions + "\n";
    sOut += "common options (every command):\n" + optionLines(kEveryCommand) + "\n";
    sOut += "exit status: " + wrapped(pCommand->pzExitStatus, "  ", 13) + "\n\n";
    sOut += "example:\n" + indented(pCommand->pzExample, "  ") + "\n";
    return sOut;
  }
  std::string sOut =
      "usage: robotcfg [options] <command> [FILE...]\n"
      "\n"
      "Reads, checks and rewrites the '#pragma config(...)' block of robot programs.\n"
      "\n"
      "commands:\n";
  for (size_t n = 0; n < kNumbOfCommandSpecs; ++n) {
    const TCommandSpec &command = kCommandSpecs[n];
    std::string sLabel = std::string("  ") + command.pzName + (*command.pzArguments ? " " : "") + command.pzArguments;
    if (sLabel.size() + 1 > kLabelWidth) sLabel += "\n" + std::string(kLabelWidth, ' ');
    else sLabel.resize(kLabelWidth, ' ');
    sOut += sLabel + wrapped(command.pzSummary, std::string(kLabelWidth, ' '), kLabelWidth) + "\n";
  }
  sOut += "\noptions (every command):\n" + optionLines(kEveryCommand) +
          "\n'robotcfg COMMAND --help' describes a command and its options.\n"
          "FILE '-' reads standard input. A project file robotcfg.toml (or .robotcfg.toml) in\n"
          "a program's folder or above it sets the platform, board and files (see 'init').\n"
          "exit status: 0 success, 1 rejected lines (or --check found changes), 2 usage or I/O error.\n";
  return sOut;
}

std::string manPage() {
  std::string sOut = ".TH ROBOTCFG 1 \"\" \"robotcfg " ROBOTCONFIG_VERSION "\" \"User Commands\"\n"
                     ".SH NAME\nrobotcfg \\- read, check and rewrite the configuration block of robot programs\n"
                     ".SH SYNOPSIS\n.B robotcfg\n[\\fIoptions\\fR] \\fIcommand\\fR [\\fIFILE\\fR...]\n"
                     ".SH DESCRIPTION\n" +
                     roff("Reads, checks and rewrites the '#pragma config(...)' block of robot programs. "
                          "FILE '-' reads standard input. A project file robotcfg.toml (or .robotcfg.toml) in "
                          "a program's folder or above it sets the platform, board and files: the keys "
                          "platform, board, external-controllers, extensions (default [\".c\"]) and exclude "
                          "(glob patterns relative to the file's folder). The nearest file wins; options "
                          "on the command line override it.") +
                     "\n.SH COMMANDS\n";
  for (size_t n = 0; n < kNumbOfCommandSpecs; ++n) {
    const TCommandSpec &command = kCommandSpecs[n];
    sOut += ".SS " + roff(std::string(command.pzName) + (*command.pzArguments ? " " : "") + command.pzArguments) +
            "\n" + roff(command.pzDescription) + manOptions(commandBit(command.nCommand)) +
            ".PP\nExit status: " + roff(command.pzExitStatus) + "\n.PP\nExample:\n.nf\n" + roff(command.pzExample) +
            "\n.fi\n";
  }
  sOut += ".SH OPTIONS\n" + manOptions(kEveryCommand) +
          ".SH ENVIRONMENT\n.TP\n.B ROBOTCFG_PLATFORM\n" +
          roff("the platform when neither --platform nor a project file names one") + "\n.SH EXIT STATUS\n" +
          roff("0 success, 1 rejected lines (or a block that would change), 2 usage or I/O error.") + "\n";
  return sOut;
}

std::string completionScript(const std::string &sShell) {
  if (sShell == "bash") return bashCompletion();
  if (sShell == "zsh") return zshCompletion();
  if (sShell == "fish") return fishCompletion();
  return "";
}
