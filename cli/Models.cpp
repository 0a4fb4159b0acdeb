#include <cstdio>

#include "cli/Commands.h"

int runModels(const TOptions &) {
  std::fprintf(stderr, "robotcfg: models is not available in this build\n");
  return kExitUsage;
}

int runSaveModel(const TOptions &) {
  std::fprintf(stderr, "robotcfg: save-model is not available in this build\n");
  return kExitUsage;
}
