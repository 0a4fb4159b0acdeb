#include <algorithm>
#include <string>

#include "cli/Commands.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"

namespace {

// Appends one formatted line.
template <class... Args>
void appendLine(std::string &sOut, const wchar_t *pzFormat, const Args &...args) {
  CString sLine;
  sLine.Format(pzFormat, args...);
  sOut += sLine.toUtf8();
  sOut += '\n';
}

const wchar_t *orDash(const wchar_t *pz) { return (pz && *pz) ? pz : L"-"; }
CString orDash(const CString &s) { return s.IsEmpty() ? CString(L"-") : s; }

// The motor's options as they read in a Motor line.
CString motorFlags(const CRobotConfigurationBasic &config, int nMotor) {
  const TMotorSlot &motor = config.getSettings().motors[size_t(nMotor)];
  CString sFlags(motor.bPIDControlled ? L"PIDControl" : L"openLoop");
  if (motor.bReversed) sFlags += L" reversed";
  if (motor.nDriveSide == 1) sFlags += L" driveLeft";
  if (motor.nDriveSide == 2) sFlags += L" driveRight";
  if (motor.bEncoder) sFlags += L" encoder";
  return sFlags;
}

void printMotors(CRobotConfigurationBasic &config, std::string &sOut) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  std::string sRows;
  CString sPort, sName;
  for (int n = 0; n < kMaxNumbOfMotors; ++n) {
    if (!config.bIsValidMotorPort(n)) continue;
    config.getDefaultMotorNameForPlatformOrControllerBoard(n, sPort);
    config.getUserDefinedMotorNameInConfig(n, sName);
    if (sName.IsEmpty()) config.getDefaultMotorName(n, sName);  // what the program may call it
    const TMotorSlot &motor = config.getSettings().motors[size_t(n)];
    CString sPins;
    if (motor.nPrimaryIOPin >= 0 || motor.nSecondaryIOPin >= 0)
      sPins.Format(L"%s, %s", getSensorPortString(motor.nPrimaryIOPin, nBoard),
                   getSensorPortString(motor.nSecondaryIOPin, nBoard));
    const bool bNoMotor = motor.nMotorType == 0;
    appendLine(sRows, L"  %3d  %-14s %-14s %-30s %s%s%s", n, sPort, orDash(sName),
               bNoMotor ? L"-" : orDash(getMotorTypedefString(motor.nMotorType, 0)),
               bNoMotor ? CString() : motorFlags(config, n),
               sPins.IsEmpty() ? L"" : L"  pins ", sPins);
  }
  if (sRows.empty()) {
    sOut += "Motors: none\n";
    return;
  }
  sOut += "Motors:\n";
  appendLine(sOut, L"  %3s  %-14s %-14s %-30s %s", L"#", L"port", L"name", L"type", L"options");
  sOut += sRows;
}

void printSensors(CRobotConfigurationBasic &config, std::string &sOut) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  const int nPorts = std::min(config.getMaxNumbOfSensorPorts(), kMaxNumbOfSensorPorts);
  if (nPorts <= 0) {
    sOut += "Sensors: none\n";
    return;
  }
  sOut += "Sensors:\n";
  appendLine(sOut, L"  %3s  %-14s %-14s %-30s %s", L"#", L"port", L"name", L"type", L"mode");
  CString sName;
  for (int port = 0; port < nPorts; ++port) {
    config.getUserDefinedSensorNameInConfig(port, sName);
    const TSensorTypes nType = config.getSensorTypeInConfig(port);
    const TSensorModes nMode = config.getSensorModeInConfig(port);
    appendLine(sOut, L"  %3d  %-14s %-14s %-30s %s", port, orDash(getSensorPortString(port, nBoard)), orDash(sName),
               nType == 0 ? L"-" : orDash(getSensorTypeString(nType)),
               nMode == 0 ? L"-" : orDash(getSensorModeString(nType, nMode)));
  }
}

void printServos(CRobotConfigurationBasic &config, std::string &sOut) {
  std::string sRows;
  CString sPort, sName;
  for (int servo = 0; servo < kMaxNumbOfServos; ++servo) {
    if (!config.bIsValidServoPort(servo)) continue;
    getServoPortString(servo, sPort);
    config.getUserDefinedServoNameInConfig(servo, sName);
    appendLine(sRows, L"  %3d  %-14s %-14s %s", servo, sPort, orDash(sName),
               orDash(getServoTypedefString(config.getServoType(servo))));
  }
  if (sRows.empty()) return;
  sOut += "Servos:\n";
  appendLine(sOut, L"  %3s  %-14s %-14s %s", L"#", L"port", L"name", L"type");
  sOut += sRows;
}

void printHubs(const CRobotConfigurationBasic &config, std::string &sOut) {
  static constexpr const wchar_t *kSensorPortNames[] = {L"S1", L"S2", L"S3", L"S4"};
  std::string sRows;
  for (int port = 0; port < kNumbOfHubSensorPorts; ++port) {
    const auto &chain = config.getSettings().nSensorPortHubs[size_t(port)];
    if (chain[0] <= 0 && chain[1] <= 0 && chain[2] <= 0 && chain[3] <= 0) continue;
    appendLine(sRows, L"  %s  %s, %s, %s, %s", kSensorPortNames[port], getMuxTypes(chain[0]), getMuxTypes(chain[1]),
               getMuxTypes(chain[2]), getMuxTypes(chain[3]));
  }
  if (sRows.empty()) return;
  sOut += "Motor/servo controllers:\n";
  sOut += sRows;
}

void printSerialPorts(CRobotConfigurationBasic &config, std::string &sOut) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  std::string sRows;
  int nFirst = -1, nSecond = -1;
  for (int port = 0; port < config.getMaxNumbOfUARTPorts(); ++port) {
    config.getMapUARTPortToIOPins(port, nFirst, nSecond);
    CString sWord(getTypedefEnumString(nUartIndex, port, -1));
    if (sWord.IsEmpty()) sWord.Format(L"UART%d", port);
    appendLine(sRows, L"  %-6s %-20s %-16s pins %s, %s", sWord,
               orDash(getTypedefEnumString(nUARTTypes, config.getUARTType(port), -1)),
               orDash(getTypedefEnumString(nUARTBaudRates, config.getBaudRate(port), -1)),
               getSensorPortString(nFirst, nBoard), getSensorPortString(nSecond, nBoard));
  }
  for (int port = 0; port < config.getMaxNumbOfI2CPorts(); ++port) {
    config.getMapI2CPortToIOPins(port, nFirst, nSecond);
    CString sWord(getTypedefEnumString(nI2CIndex, port, -1));
    if (sWord.IsEmpty()) sWord.Format(L"I2C%d", port);
    appendLine(sRows, L"  %-6s %-37s pins %s, %s", sWord,
               orDash(getTypedefEnumString(nI2CTypes, config.getSettings().nI2CMode[size_t(port)], -1)),
               getSensorPortString(nFirst, nBoard), getSensorPortString(nSecond, nBoard));
  }
  if (sRows.empty()) return;
  sOut += "Serial ports:\n";
  sOut += sRows;
}

}  // namespace

void printConfiguration(CRobotConfigurationBasic &config, std::string &sOut) {
  const TControllerBoardType nBoard = config.getCircuitBoardType();
  const CPlatformType *pPlatform = getPlatformTypeForKind(config.getSettings().nPlatformKind);
  appendLine(sOut, L"Platform: %s (kind %d)", pPlatform ? pPlatform->pPlatformParms->pPlatformName : L"?",
             config.getSettings().nPlatformKind);
  appendLine(sOut, L"Board: %s (%d), CPU clock %d", orDash(getCktBoardNameString(nBoard)), nBoard,
             config.getCpuClockSpeed());
  appendLine(sOut, L"External Motor/Servo Controllers: %s",
             pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) ? L"on" : L"off");
  printBoardDetails(config, sOut);
  printHubs(config, sOut);
  printMotors(config, sOut);
  printServos(config, sOut);
  printSensors(config, sOut);
  printSerialPorts(config, sOut);
  printDriveAndProgramDetails(config, sOut);
}
