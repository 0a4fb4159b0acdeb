#include <string>

#include "cli/Commands.h"
#include "core/RobotConfiguration.h"

void printDriveAndProgramDetails(CRobotConfigurationBasic &, std::string &) {}
