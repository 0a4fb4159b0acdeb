#include <string>

#include "cli/Commands.h"
#include "core/RobotConfiguration.h"

void printBoardDetails(CRobotConfigurationBasic &, std::string &) {}
