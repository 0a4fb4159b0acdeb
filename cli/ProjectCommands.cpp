// The commands that set a project up: init and completion.
#include <cstdio>
#include <fstream>
#include <sys/stat.h>

#include "cli/Commands.h"
#include "cli/Help.h"
#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

int runCompletion(const TOptions &options) {
  std::fputs(completionScript(options.files.front()).c_str(), stdout);
  return kExitOk;
}

int runInit(const TOptions &options) {
  const char *pzPath = "robotcfg.toml";
  struct stat info;
  if (::lstat(pzPath, &info) == 0) {
    std::fprintf(stderr, "robotcfg: %s exists; it is kept\n", pzPath);
    return kExitUsage;
  }
  const CPlatformType *pPlatform = getPlatformTypeForKind(options.nPlatformKind);
  std::string sBoard;
  if (options.bBoardGiven)
    for (const TDeviceTypeMenuItem *pRow = getArduinoCircuitBoardTypeMenuDefn(); pRow && pRow->nPlatformMask != 0; ++pRow)
      if (pRow->nValue == options.nBoard && pRow->pzKeyword && *pRow->pzKeyword) sBoard = CString(pRow->pzKeyword).toUtf8();
  std::string sText =
      "# robotcfg project file: it applies to the programs in this folder and the\n"
      "# folders below it, unless one of them has a robotcfg.toml of its own.\n"
      "# Options on the command line override it.\n"
      "\n"
      "# The platform: a name (nxt, vexpic, vexi2c, arduino, ...) or a number 0..14.\n"
      "platform = \"" + (pPlatform && pPlatform->pKeyword ? CString(pPlatform->pKeyword).toUtf8() : std::string("nxt")) +
      "\"\n"
      "\n"
      "# The controller board chosen in the IDE (default: the platform's own board).\n" +
      (sBoard.empty() ? std::string("# board = \"typeCktBoardUno\"\n") : "board = \"" + sBoard + "\"\n") +
      "\n"
      "# \"External Motor/Servo Controllers\".\n"
      "external-controllers = " + (options.bExternalControllers ? "true" : "false") + "\n"
      "\n"
      "# File extensions taken from folders.\n"
      "# extensions = [\".c\"]\n"
      "\n"
      "# Glob patterns of paths (relative to this file's folder) that are skipped.\n"
      "# exclude = [\"build/**\", \"vendor/**\"]\n";
  std::ofstream out(pzPath, std::ios::binary);
  out << sText;
  out.close();
  if (!out) {
    std::fprintf(stderr, "robotcfg: cannot write %s\n", pzPath);
    return kExitUsage;
  }
  if (!options.bQuiet) std::printf("wrote %s\n", pzPath);
  return kExitOk;
}
