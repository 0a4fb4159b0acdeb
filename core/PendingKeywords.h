// Refusal of configuration keywords whose readers are not part of this build.
#pragma once

#include "core/RobotConfiguration.h"

/// Sets "Configuration keyword '%s' is not supported yet" for the line's keyword; false.
bool bRejectKeywordNotYetSupported(const TTokenizedConfigParms &parms, CString &sError);
