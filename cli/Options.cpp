#include "cli/Options.h"

#include <cstdlib>
#include <cstring>

#include "cli/OptionTable.h"
#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// A non-negative decimal number, or -1.
int parseNumber(const std::string &sText) {
  if (sText.empty() || sText.size() > 6) return -1;
  for (char c : sText)
    if (c < '0' || c > '9') return -1;
  return std::atoi(sText.c_str());
}

bool bSameWord(const std::string &sText, const wchar_t *pzWord) {
  return pzWord && CString::fromUtf8(sText).CompareNoCase(pzWord) == 0;
}

// The option spelled `sArg` ("-i" or "--in-place"); null when none.
const TOptionSpec *findOptionSpec(const std::string &sArg) {
  for (size_t n = 0; n < kNumbOfOptionSpecs; ++n) {
    const TOptionSpec &option = kOptionSpecs[n];
    if (sArg == option.pzLong || (option.pzShort && sArg == option.pzShort)) return &option;
  }
  return nullptr;
}

// "the format command" or "the check and format commands": where an option applies.
std::string commandsOf(unsigned nCommands) {
  std::vector<std::string> names;
  for (size_t n = 0; n < kNumbOfCommandSpecs; ++n)
    if (nCommands & commandBit(kCommandSpecs[n].nCommand)) names.push_back(kCommandSpecs[n].pzName);
  std::string sText = "the ";
  for (size_t n = 0; n < names.size(); ++n)
    sText += (n == 0 ? "" : n + 1 == names.size() ? " and " : ", ") + names[n];
  return sText + (names.size() == 1 ? " command" : " commands");
}

std::string joined(const std::vector<std::string> &words) {
  std::string sText;
  for (const std::string &sWord : words) sText += (sText.empty() ? "" : ", ") + sWord;
  return sText;
}

}  // namespace

int findPlatformKind(const std::string &sText) {
  const int nNumber = parseNumber(sText);
  if (nNumber >= 0) return nNumber < kNumbOfPlatformKinds ? nNumber : -1;
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    const CPlatformType *pPlatform = getPlatformTypeForKind(nKind);
    if (pPlatform && (bSameWord(sText, pPlatform->pKeyword) || bSameWord(sText, pPlatform->pPlatformParms->pPlatformName)))
      return nKind;
  }
  return -1;
}

TControllerBoardType findBoard(const std::string &sText) {
  const int nNumber = parseNumber(sText);
  if (nNumber >= 0) return getCircuitBoardInfo(nNumber) ? nNumber : -1;
  // Board words are looked up on every platform: the platform may be chosen after the board.
  for (const TDeviceTypeMenuItem *pRow = getArduinoCircuitBoardTypeMenuDefn(); pRow && pRow->nPlatformMask != 0; ++pRow)
    if (bSameWord(sText, pRow->pzKeyword) || bSameWord(sText, pRow->pzLabel)) return pRow->nValue;
  return -1;
}

std::vector<std::string> platformNames() {
  std::vector<std::string> names;
  for (int nKind = 0; nKind < kNumbOfPlatformKinds; ++nKind) {
    const CPlatformType *pPlatform = getPlatformTypeForKind(nKind);
    if (pPlatform && pPlatform->pKeyword && *pPlatform->pKeyword) names.push_back(CString(pPlatform->pKeyword).toUtf8());
  }
  return names;
}

std::vector<std::string> boardKeywords() {
  std::vector<std::string> words;
  for (const TDeviceTypeMenuItem *pRow = getArduinoCircuitBoardTypeMenuDefn(); pRow && pRow->nPlatformMask != 0; ++pRow)
    if (pRow->pzKeyword && *pRow->pzKeyword) words.push_back(CString(pRow->pzKeyword).toUtf8());
  return words;
}

std::string unknownPlatformMessage(const std::string &sText) {
  return "unknown platform '" + sText + "' (a number 0.." + std::to_string(kNumbOfPlatformKinds - 1) +
         " or one of: " + joined(platformNames()) + ")";
}

std::string unknownBoardMessage(const std::string &sText) {
  return "unknown board '" + sText + "' (a board number or one of: " + joined(boardKeywords()) + ")";
}

bool parseOptions(int argc, char **argv, TOptions &options, std::string &sError) {
  bool bOptionsEnded = false;
  unsigned nUsed = 0;        // bits of the options given, by their place in the table
  std::string sFirstUsed[64];  // how each was spelled, for messages
  for (int i = 1; i < argc; ++i) {
    std::string sArg = argv[i];
    if (!bOptionsEnded && sArg == "--") {
      bOptionsEnded = true;
      continue;
    }
    if (!bOptionsEnded && sArg.size() > 1 && sArg[0] == '-') {
      std::string sValue;
      bool bHasValue = false;
      const size_t nEquals = sArg.find('=');
      if (sArg.rfind("--", 0) == 0 && nEquals != std::string::npos) {
        sValue = sArg.substr(nEquals + 1);
        sArg = sArg.substr(0, nEquals);
        bHasValue = true;
      }
      const TOptionSpec *pOption = findOptionSpec(sArg);
      if (!pOption) {
        sError = "unknown option '" + sArg + "'";
        return false;
      }
      if (pOption->pzValue && !bHasValue) {
        if (i + 1 >= argc) {
          sError = "option '" + sArg + "' needs a value";
          return false;
        }
        sValue = argv[++i];
      } else if (!pOption->pzValue && bHasValue) {
        sError = "option '" + sArg + "' takes no value";
        return false;
      }
      if (!pOption->apply(options, sValue, sError)) return false;
      const size_t nIndex = size_t(pOption - kOptionSpecs);
      if (nIndex < 32 && !(nUsed & (1u << nIndex))) {
        nUsed |= 1u << nIndex;
        sFirstUsed[nIndex] = sArg;
      }
      continue;
    }
    if (options.nCommand == TCommand::kNone) {
      const TCommandSpec *pCommand = findCommandSpec(sArg);
      if (!pCommand) {
        sError = "unknown command '" + sArg + "'";
        return false;
      }
      options.nCommand = pCommand->nCommand;
      continue;
    }
    options.files.push_back(sArg);
  }
  if (options.bHelp || options.bVersion || options.bManPage) return true;

  if (!options.bPlatformGiven) {
    const char *pzEnv = std::getenv("ROBOTCFG_PLATFORM");
    if (pzEnv && *pzEnv) {
      options.nPlatformKind = findPlatformKind(pzEnv);
      if (options.nPlatformKind < 0) {
        sError = unknownPlatformMessage(pzEnv) + " in ROBOTCFG_PLATFORM";
        return false;
      }
      options.bPlatformFromEnvironment = true;
    }
  }

  const TCommandSpec *pCommand = commandSpecOf(options.nCommand);
  if (!pCommand) {
    sError = "no command given";
    return false;
  }
  const int nFiles = int(options.files.size());
  if (nFiles < pCommand->nMinFiles || (pCommand->nMaxFiles >= 0 && nFiles > pCommand->nMaxFiles) ||
      (options.nCommand == TCommand::kSaveModel && options.sOutputPath.empty())) {
    sError = pCommand->pzFileError;
    return false;
  }
  for (size_t n = 0; n < kNumbOfOptionSpecs && n < 32; ++n)
    if ((nUsed & (1u << n)) && !(kOptionSpecs[n].nCommands & commandBit(options.nCommand))) {
      sError = sFirstUsed[n] + " applies to " + commandsOf(kOptionSpecs[n].nCommands) + " only";
      return false;
    }
  if (options.nCommand == TCommand::kCompletion && options.files[0] != "bash" && options.files[0] != "zsh" &&
      options.files[0] != "fish") {
    sError = "unknown shell '" + options.files[0] + "' (bash, zsh or fish)";
    return false;
  }
  // What format does with a file: one way only.
  std::vector<std::string> ways;
  if (options.bInPlace) ways.push_back("-i");
  if (options.bCheckOnly) ways.push_back("--check");
  if (options.bDiff) ways.push_back("--diff");
  if (ways.size() > 1) {
    sError = ways[0] + " and " + ways[1] + " cannot be combined";
    return false;
  }
  if (options.bJson && options.bSvg) {
    sError = "--json and --svg cannot be combined";
    return false;
  }
  if (options.bChoices && !options.bJson) {
    sError = "--choices needs --json";
    return false;
  }
  if (options.bNoConfig && !options.sConfigPath.empty()) {
    sError = "--config and --no-config cannot be combined";
    return false;
  }
  // set and apply rewrite their first file only.
  const bool bEdits = options.nCommand == TCommand::kSet || options.nCommand == TCommand::kApply;
  if (options.bInPlace)
    for (const std::string &sFile : bEdits ? std::vector<std::string>{options.files.front()} : options.files)
      if (sFile == "-") {
        sError = "cannot rewrite standard input in place";
        return false;
      }
  return true;
}
