// Lists the motors and sensors a program's configuration block sets up, then
// prints the settled block `robotcfg format` would write.
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <sstream>

#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/program/ProgramText.h"

int main(int argc, char **argv) {
  if (argc < 2) return std::cerr << "usage: list_devices PROGRAM [PLATFORM-KIND]\n", 2;
  std::ifstream file(argv[1], std::ios::binary);
  std::ostringstream bytes;
  bytes << file.rdbuf();
  selectHostPlatform(argc > 2 ? std::atoi(argv[2]) : 1);  // 1: NXT
  CHostRobotConfiguration config;
  for (const TConfigurationDiagnostic &d : readProgramConfiguration(config, CProgramText(bytes.str())))
    std::cerr << argv[1] << ':' << d.nLine << ": error: " << d.sMessage.toUtf8() << '\n';
  CString name, port;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    if (config.getMotorTypeInConfig(n) == 0) continue;
    config.getUserDefinedMotorNameInConfig(n, name);
    config.getDefaultMotorNameForPlatformOrControllerBoard(n, port);
    std::cout << "motor  " << port.toUtf8() << ' ' << name.toUtf8() << ' '
              << CString(getMotorTypedefString(config.getMotorTypeInConfig(n), 0)).toUtf8() << '\n';
  }
  for (int n = 0; n < config.getMaxNumbOfSensorPorts() && n < kMaxNumbOfSensorPorts; ++n) {
    if (config.getSensorTypeInConfig(n) == 0) continue;
    config.getUserDefinedSensorNameInConfig(n, name);
    std::cout << "sensor " << CString(getSensorPortString(n, config.getCircuitBoardType())).toUtf8() << ' '
              << name.toUtf8() << ' ' << CString(getSensorTypeString(config.getSensorTypeInConfig(n))).toUtf8() << '\n';
  }
  CString block;
  if (!generateSettledBlock(config, block)) return std::cerr << "the block does not settle\n", 1;
  std::cout << encodeGeneratedBlock(block, "\n");
}
