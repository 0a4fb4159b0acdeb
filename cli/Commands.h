// The commands of robotcfg.
#pragma once

#include "cli/Options.h"

/// Exit statuses.
constexpr int kExitOk = 0;
constexpr int kExitRejected = 1;
constexpr int kExitUsage = 2;

int runCheck(const TOptions &options);
int runFormat(const TOptions &options);
int runGenerate(const TOptions &options);
int runShow(const TOptions &options);
int runDiff(const TOptions &options);
int runModels(const TOptions &options);
int runSaveModel(const TOptions &options);
int runInit(const TOptions &options);
int runCompletion(const TOptions &options);

int runSet(const TOptions &options);
int runApply(const TOptions &options);
int runServe(const TOptions &options);
