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

class CRobotConfigurationBasic;
/// Prints the configuration as port tables.
void printConfiguration(CRobotConfigurationBasic &config, std::string &sOut);
