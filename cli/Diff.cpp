#include <cstdio>

#include "cli/Commands.h"

int runDiff(const TOptions &) {
  std::fprintf(stderr, "robotcfg: diff is not available in this build\n");
  return kExitUsage;
}
