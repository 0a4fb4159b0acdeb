#include "cli/Options.h"

#include <cstdlib>
#include <cstring>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

struct TCommandName {
  const char *pzName;
  TCommand nCommand;
};

constexpr TCommandName kCommands[] = {
    {"check", TCommand::kCheck},
    {"format", TCommand::kFormat},
    {"generate", TCommand::kGenerate},
    {"show", TCommand::kShow},
    {"diff", TCommand::kDiff},
    {"models", TCommand::kModels},
    {"save-model", TCommand::kSaveModel},
};

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

}  // namespace

const char *usageText() {
  return "usage: robotcfg [options] <command> [FILE...]\n"
         "\n"
         "Reads, checks and rewrites the '#pragma config(...)' block of robot programs.\n"
         "\n"
         "commands:\n"
         "  check FILE...      report mistakes as FILE:LINE:COL: error: MESSAGE [CODE] (see docs/DIAGNOSTICS.md)\n"
         "  format FILE...     print each program with its configuration block regenerated\n"
         "  generate FILE      print only the regenerated configuration block\n"
         "  show [FILE]        print the configuration (of FILE, or the empty one) as port tables\n"
         "  diff A B           compare the configurations of two programs (-v: which devices differ)\n"
         "  models             list the standard robot models of the platform\n"
         "  save-model FILE -o OUT\n"
         "                     save the configuration of FILE as a model file\n"
         "\n"
         "options:\n"
         "  --platform KIND          platform kind: a number 0..14 or a name such as nxt, vexpic,\n"
         "                           vexi2c, arduino (default: nxt)\n"
         "  --board BOARD            controller board chosen in the IDE: a number or a board keyword\n"
         "                           (default: the platform's own board)\n"
         "  --external-controllers   enable \"External Motor/Servo Controllers\"\n"
         "  -i, --in-place           format: rewrite the files instead of printing them\n"
         "  --check                  format: change nothing; exit 1 when a block is not in generated form\n"
         "  -v, --verbose            diff: list the devices that differ\n"
         "  --format text|json|sarif check: how findings are reported (json and sarif on stdout)\n"
         "  --Werror                 check, format: treat warnings as errors\n"
         "  -q, --quiet              check, format: report errors only\n"
         "  --show-source            show the offending line under each finding (default on a terminal)\n"
         "  -o, --output OUT         save-model: the model file to write\n"
         "  -h, --help               show this help\n"
         "  --version                show the version\n"
         "\n"
         "FILE '-' reads standard input.\n"
         "exit status: 0 success, 1 rejected lines (or --check found changes), 2 usage or I/O error.\n";
}

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

bool parseOptions(int argc, char **argv, TOptions &options, std::string &sError) {
  bool bOptionsEnded = false;
  std::string sPlatform, sBoard;
  bool bPlatformGiven = false, bBoardGiven = false;
  for (int i = 1; i < argc; ++i) {
    std::string sArg = argv[i];
    if (!bOptionsEnded && sArg.size() > 1 && sArg[0] == '-') {
      std::string sValue;
      bool bHasValue = false;
      const size_t nEquals = sArg.find('=');
      if (sArg.rfind("--", 0) == 0 && nEquals != std::string::npos) {
        sValue = sArg.substr(nEquals + 1);
        sArg = sArg.substr(0, nEquals);
        bHasValue = true;
      }
      auto takeValue = [&](std::string &sOut) {
        if (bHasValue) {
          sOut = sValue;
          return true;
        }
        if (i + 1 >= argc) {
          sError = "option '" + sArg + "' needs a value";
          return false;
        }
        sOut = argv[++i];
        return true;
      };
      if (sArg == "--") bOptionsEnded = true;
      else if (sArg == "-h" || sArg == "--help") options.bHelp = true;
      else if (sArg == "--version") options.bVersion = true;
      else if (sArg == "-i" || sArg == "--in-place") options.bInPlace = true;
      else if (sArg == "--check") options.bCheckOnly = true;
      else if (sArg == "-v" || sArg == "--verbose") options.bVerbose = true;
      else if (sArg == "-o" || sArg == "--output") {
        if (!takeValue(options.sOutputPath)) return false;
      }
      else if (sArg == "--Werror") options.bWarningsAreErrors = true;
      else if (sArg == "-q" || sArg == "--quiet") options.bQuiet = true;
      else if (sArg == "--show-source") options.bShowSource = true;
      else if (sArg == "--format") {
        if (!takeValue(options.sReportFormat)) return false;
        if (options.sReportFormat != "text" && options.sReportFormat != "json" && options.sReportFormat != "sarif") {
          sError = "unknown report format '" + options.sReportFormat + "' (text, json or sarif)";
          return false;
        }
      }
      else if (sArg == "--external-controllers") options.bExternalControllers = true;
      else if (sArg == "--platform") {
        if (!takeValue(sPlatform)) return false;
        bPlatformGiven = true;
      } else if (sArg == "--board") {
        if (!takeValue(sBoard)) return false;
        bBoardGiven = true;
      } else {
        sError = "unknown option '" + sArg + "'";
        return false;
      }
      if (bHasValue && sArg != "--platform" && sArg != "--board" && sArg != "--output" &&
          sArg != "--format") {
        sError = "option '" + sArg + "' takes no value";
        return false;
      }
      continue;
    }
    if (options.nCommand == TCommand::kNone) {
      for (const TCommandName &command : kCommands)
        if (sArg == command.pzName) options.nCommand = command.nCommand;
      if (options.nCommand == TCommand::kNone) {
        sError = "unknown command '" + sArg + "'";
        return false;
      }
      continue;
    }
    options.files.push_back(sArg);
  }
  if (options.bHelp || options.bVersion) return true;

  if (!bPlatformGiven) {
    const char *pzEnv = std::getenv("ROBOTCFG_PLATFORM");
    if (pzEnv && *pzEnv) sPlatform = pzEnv;
  }
  if (bPlatformGiven || !sPlatform.empty()) {
    options.nPlatformKind = findPlatformKind(sPlatform);
    if (options.nPlatformKind < 0) {
      sError = "unknown platform '" + sPlatform + "'";
      return false;
    }
  }
  if (bBoardGiven) {
    options.nBoard = findBoard(sBoard);
    if (options.nBoard < 0) {
      sError = "unknown board '" + sBoard + "'";
      return false;
    }
  }

  switch (options.nCommand) {
    case TCommand::kNone:
      sError = "no command given";
      return false;
    case TCommand::kCheck:
    case TCommand::kFormat:
      if (options.files.empty()) {
        sError = "no input files";
        return false;
      }
      break;
    case TCommand::kGenerate:
      if (options.files.size() != 1) {
        sError = "generate takes exactly one file";
        return false;
      }
      break;
    case TCommand::kShow:
      if (options.files.size() > 1) {
        sError = "show takes at most one file";
        return false;
      }
      break;
    case TCommand::kDiff:
      if (options.files.size() != 2) {
        sError = "diff takes exactly two files";
        return false;
      }
      break;
    case TCommand::kModels:
      if (!options.files.empty()) {
        sError = "models takes no file";
        return false;
      }
      break;
    case TCommand::kSaveModel:
      if (options.files.size() != 1 || options.sOutputPath.empty()) {
        sError = "save-model takes one file and -o OUT";
        return false;
      }
      break;
  }
  if (options.bVerbose && options.nCommand != TCommand::kDiff) {
    sError = "-v applies to the diff command only";
    return false;
  }
  if ((options.bInPlace || options.bCheckOnly) && options.nCommand != TCommand::kFormat) {
    sError = "-i and --check apply to the format command only";
    return false;
  }
  if (options.sReportFormat != "text" && options.nCommand != TCommand::kCheck) {
    sError = "--format applies to the check command only";
    return false;
  }
  if (options.bInPlace && options.bCheckOnly) {
    sError = "-i and --check cannot be combined";
    return false;
  }
  if (options.bInPlace)
    for (const std::string &sFile : options.files)
      if (sFile == "-") {
        sError = "cannot rewrite standard input in place";
        return false;
      }
  return true;
}
