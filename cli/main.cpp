// robotcfg: checks, formats and shows the configuration block of robot programs.
#include <cstdio>
#include <string>

#include "cli/Commands.h"
#include "cli/Options.h"
#include "host/Platform.h"

#ifndef ROBOTCONFIG_VERSION
#define ROBOTCONFIG_VERSION "0.1.0"
#endif

int main(int argc, char **argv) {
  TOptions options;
  std::string sError;
  if (!parseOptions(argc, argv, options, sError)) {
    std::fprintf(stderr, "robotcfg: %s\nTry 'robotcfg --help' for more information.\n", sError.c_str());
    return kExitUsage;
  }
  if (options.bHelp) {
    std::fputs(usageText(), stdout);
    return kExitOk;
  }
  if (options.bVersion) {
    std::printf("robotcfg %s\n", ROBOTCONFIG_VERSION);
    return kExitOk;
  }
  selectHostPlatform(options.nPlatformKind, options.nBoard, options.bExternalControllers);
  switch (options.nCommand) {
    case TCommand::kCheck: return runCheck(options);
    case TCommand::kFormat: return runFormat(options);
    case TCommand::kGenerate: return runGenerate(options);
    case TCommand::kShow: return runShow(options);
    case TCommand::kNone: break;
  }
  return kExitUsage;
}
