// The checker's promise, as the fuzz harnesses and the property test check
// it: a program the checker passes without an error is written back, the
// written program checks clean and formats to itself, and every device a
// line defined comes back the same.
#pragma once

#include <string>

#include "robotconfig/checker/ProgramChecker.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

namespace checker_property {

/// What one line's device is in a record, as text to compare; "" for lines of other keywords.
inline std::string deviceOfLine(const CRobotConfigurationBasic &config, const TTokenizedConfigParms &parms) {
  const TConfigTypes nType = TConfigTypeDefns::lookupConfigType(parms.sParms[0]);
  CString sName;
  std::string sDevice;
  if (nType == configTypeMotor) {
    const int n = config.getIndexForDefaultMotorName(parms.sParms[1]);
    config.getUserDefinedMotorNameInConfig(n, sName);
    sDevice = "motor " + std::to_string(config.getMotorTypeInConfig(n)) + (config.getMotorReversedInConfig(n) ? " r" : "") +
              (config.getMotorPIDControlledInConfig(n) ? " pid" : "") + " side " +
              std::to_string(config.getMotorDriveSideInConfig(n)) + " pins " +
              std::to_string(config.getMapMotorToPrimaryIOPin(n)) + "/" + std::to_string(config.getMapMotorToSecondaryIOPin(n));
  } else if (nType == configTypeSensor) {
    const int n = config.getIndexForSensorName(parms.sParms[1]);
    config.getUserDefinedSensorNameInConfig(n, sName);
    sDevice = "sensor " + std::to_string(config.getSensorTypeInConfig(n)) + " mode " +
              std::to_string(config.getSensorModeInConfig(n)) + " second " + std::to_string(config.getSecondaryPort(n));
  } else if (nType == configTypeServo) {
    const int n = getServoIndex(parms.sParms[1]);
    config.getUserDefinedServoNameInConfig(n, sName);
    sDevice = "servo " + std::to_string(config.getServoType(n));
  } else {
    return "";
  }
  return sDevice + " '" + sName.toUtf8() + "'";
}

/// "" when the promise holds for `sProgram` under the current host selection;
/// else what broke. Programs with an error are outside the promise.
inline std::string promiseBroken(const std::string &sProgram) {
  CCapturingMessageSink quiet;
  const CProgramText program(sProgram);
  CHostRobotConfiguration config;
  if (checkProgram(config, program).nErrors > 0) return "";
  CHostRobotConfiguration copy(config);
  CString sBlock;
  if (!generateSettledBlock(copy, sBlock)) return "check passes a program whose block is not written";
  const std::string sFormatted = replaceConfigurationBlock(program, sBlock);
  const CProgramText formatted(sFormatted);
  CHostRobotConfiguration reread;
  const TCheckResult again = checkProgram(reread, formatted);
  if (again.nErrors > 0) return "the formatted program does not check clean";
  CString sAgain;
  if (!generateSettledBlock(reread, sAgain) || replaceConfigurationBlock(formatted, sAgain) != sFormatted)
    return "the formatted program does not format to itself";
  // Every device line of the input names the same device after the round trip.
  TTokenizedConfigParms parms;
  for (size_t i = 0; i < program.lines().size(); ++i) {
    if (CRobotConfigurationBasic::nTokenizeLine(program.lineString(i), parms) != lineTypeConfigPragma) continue;
    if (deviceOfLine(config, parms) != deviceOfLine(reread, parms))
      return "line " + std::to_string(i + 1) + " gives another device after the round trip: " +
             deviceOfLine(config, parms) + " became " + deviceOfLine(reread, parms);
  }
  return "";
}

}  // namespace checker_property
