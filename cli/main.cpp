// robotcfg: checks, formats and shows the configuration block of robot programs.
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <string>

#include "cli/Commands.h"
#include "cli/Help.h"
#include "cli/InputFiles.h"
#include "cli/ReadProgram.h"
#include "cli/Terminal.h"
#include "cli/Options.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/StandardModelList.h"

#ifndef ROBOTCONFIG_VERSION
#define ROBOTCONFIG_VERSION "0.1.0"
#endif

int main(int argc, char **argv) {
  // A file-size limit must fail the write (and leave the program intact), not kill the tool.
  std::signal(SIGXFSZ, SIG_IGN);
  TOptions options;
  std::string sError;
  if (!parseOptions(argc, argv, options, sError)) {
    std::fprintf(stderr, "robotcfg: %s\nTry 'robotcfg --help' for more information.\n", sError.c_str());
    return kExitUsage;
  }
  if (options.bHelp) {
    std::fputs(usageText(options.nCommand).c_str(), stdout);
    return kExitOk;
  }
  if (options.bManPage) {
    std::fputs(manPage().c_str(), stdout);
    return kExitOk;
  }
  if (options.bVersion) {
    std::printf("robotcfg %s\n", ROBOTCONFIG_VERSION);
    return kExitOk;
  }
  setStdinFilename(options.sStdinFilename);
  setColorWhen(options.nColor);
  if (!expandInputFiles(options, sError)) {
    std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
    return kExitUsage;
  }
  // check and format select again for each program; the others read one.
  selectPlatformForProgram(options.files.empty() ? std::string() : options.files.front(), options);
  installHostStandardModelList();
  int nStatus = kExitUsage;
  switch (options.nCommand) {
    case TCommand::kCheck: nStatus = runCheck(options); break;
    case TCommand::kFormat: nStatus = runFormat(options); break;
    case TCommand::kGenerate: nStatus = runGenerate(options); break;
    case TCommand::kShow: nStatus = runShow(options); break;
    case TCommand::kDiff: nStatus = runDiff(options); break;
    case TCommand::kModels: nStatus = runModels(options); break;
    case TCommand::kSaveModel: nStatus = runSaveModel(options); break;
    case TCommand::kInit: nStatus = runInit(options); break;
    case TCommand::kCompletion: nStatus = runCompletion(options); break;
    case TCommand::kSet: nStatus = runSet(options); break;
    case TCommand::kApply: nStatus = runApply(options); break;
    case TCommand::kServe: nStatus = runServe(options); break;
    case TCommand::kNone: break;
  }
  // Output that could not be written (a full disk, a closed pipe) is an I/O error.
  if (std::fflush(stdout) != 0 || std::ferror(stdout)) {
    std::fprintf(stderr, "robotcfg: cannot write standard output: %s\n", std::strerror(errno));
    return kExitUsage;
  }
  return nStatus;
}
