#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Networking.h"

const TConfigTypeDefns nConfigTypeNames;

namespace {

struct TConfigKeyword {
  const wchar_t *pzKeyword;
  TConfigTypes nType;
};

// Rows 0..25 hold value = row, so a value's row spells its canonical keyword;
// the last two rows are older keywords that are read but never written.
constexpr TConfigKeyword kConfigKeywords[] = {
    {L"StandardModel", 0},      {L"UserModel", 1},          {L"RenamedStdModelMotor", 2},
    {L"RenamedStdModelSensor", 3}, {L"DriveTrainMotors", 4}, {L"DriveTrainWheels", 5},
    {L"GripperArm", 6},         {L"JoystickDrive", 7},      {L"FirmwareFeatures", 8},
    {L"Hubs", 9},               {L"Motor", 10},             {L"MotorPidSetting", 11},
    {L"Sensor", 12},            {L"Servo", 13},             {L"SrvoPosition", 14},
    {L"CPU_Parameters", 15},    {L"ProgramType", 16},       {L"CircuitBoardType", 17},
    {L"PluginCircuitBoard", 18}, {L"UART_Usage", 19},       {L"I2C_Usage", 20},
    {L"MemorySize", 21},        {L"DatalogSeries", 22},     {L"NetworkDefinition", 23},
    {L"NetworkNode", 24},       {L"Analog", 25},            {L"RenameMotor", 2},
    {L"RenameSensor", 3},
};
static_assert(sizeof(kConfigKeywords) / sizeof(kConfigKeywords[0]) == 28, "28 keyword rows");

// Keywords accepted and ignored: lines that other tools leave in a block.
constexpr const wchar_t *kIgnoredKeywords[] = {L"CLICK", L"Start"};

}  // namespace

const wchar_t *TConfigTypeDefns::getConfigTypeName(TConfigTypes nType) {
  return (nType >= 0 && nType < kNumbOfConfigTypes) ? kConfigKeywords[nType].pzKeyword : L"";
}

TConfigTypes TConfigTypeDefns::lookupConfigType(const CString &sKeyword) {
  for (const TConfigKeyword &row : kConfigKeywords)
    if (sKeyword.CompareNoCase(row.pzKeyword) == 0) return row.nType;
  return configTypeNotFound;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLine(const TTokenizedConfigParms &parms, bool bFlag,
                                                          TLineNumber line, const CString &sSourceFile,
                                                          CString &sError) {
  if (!parseInfo.bFirstConfigLineSeen) {
    parseInfo.firstConfigLine = line;
    parseInfo.bFirstConfigLineSeen = true;
  }
  const CString &sKeyword = parms.sParms[0];
  const TConfigTypes nType = TConfigTypeDefns::lookupConfigType(sKeyword);
  if (nType != configTypeNotFound) return bParseConfigLineOfType(nType, parms, bFlag, line, sSourceFile, sError);
  for (const wchar_t *pzIgnored : kIgnoredKeywords)
    if (sKeyword == pzIgnored) return true;
  sError.Format(L"Bad parameter type: '%s'", sKeyword);
  return false;
}

bool CRobotConfigurationBasic::bParseConfigLineOfType(TConfigTypes nType, const TTokenizedConfigParms &parms,
                                                      bool bFlag, TLineNumber line, const CString &sSourceFile,
                                                      CString &sError) {
  switch (nType) {
    case configTypeStandardModel: return bParseConfigDefinitionLineStandardModel(parms, bFlag, line, sError);
    case configTypeUserModel:
      return bParseConfigDefinitionLineFileNameForUserModel(parms, bFlag, line, sSourceFile, sError);
    case configTypeRenameMotor: return bParseConfigDefinitionLineRenameMotor(parms, bFlag, line, sError);
    case configTypeRenameSensor: return bParseConfigDefinitionLineRenameSensor(parms, bFlag, line, sError);
    case configTypeDriveTrainMotors: return bParseConfigDefinitionLineDriveTrainMotors(parms, bFlag, line, sError);
    case configTypeDriveTrainWheels: return bParseConfigDefinitionLineDriveTrainWheels(parms, bFlag, line, sError);
    case configTypeGripperArm: return bParseConfigDefinitionLineGripperArm(parms, bFlag, line, sError);
    case configTypeJoystickDrive: return bParseConfigDefinitionLineJoystickDrive(parms, bFlag, line, sError);
    case configTypeFirmwareFeatures: return bParseConfigDefinitionLineFirmwareFeatures(parms, bFlag, line, sError);
    case configTypeHubs: return bParseConfigDefinitionLineHubs(parms, sError);
    case configTypeMotor: return bParseConfigDefinitionLineMotor(parms, bFlag, line, sError);
    case configTypeMotorPidSetting: return bParseConfigDefinitionLineMotorPidSettings(parms, bFlag, line, sError);
    case configTypeSensor: return bParseConfigDefinitionLineSensor(parms, bFlag, line, sError);
    case configTypeServo: return bParseConfigDefinitionLineServo(parms, bFlag, line, sError);
    case configTypeServoPosition: return bParseConfigDefinitionLineServoPositions(parms, bFlag, line, sError);
    case configTypeCpuParameters: return bParseConfigDefinitionLineCpuParameters(parms, sError);
    case configTypeProgramType: return bParseConfigDefinitionLineProgramType(parms, bFlag, line, sError);
    case configTypeCircuitBoardType: return bParseConfigDefinitionLineCPUType(parms, bFlag, line, sError);
    case configTypePluginCircuitBoard: return bParseConfigDefinitionLinePluginBoardType(parms, bFlag, line, sError);
    case configTypeUartUsage:
    case configTypeI2CUsage: return bParseConfigDefinitionLineUartOrI2C(nType, parms, bFlag, line, sError);
    case configTypeMemorySize: return bParseConfigDefinitionLineMemoryAllocation(parms, bFlag, line, sError);
    case configTypeDatalogSeries: return bParseConfigDefinitionLineDatalogSeries(parms, bFlag, line, sError);
    case configTypeNetworkDefinition:
      return bParseConfigDefinitionLineNetworkDefinition(parms, bFlag, line, sError);
    case configTypeNetworkNode: return bParseConfigDefinitionLineNetworkNode(parms, bFlag, line, sError);
    case configTypeAnalog: return bParseConfigDefinitionLineAnalog(parms, sError);
    default: return false;
  }
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineCpuParameters(const TTokenizedConfigParms &parms,
                                                                       CString &) {
  bool bOk = false;
  settings.nCpuClockSpeed = getInteger(parms.sParms[2], bOk);
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineAnalog(const TTokenizedConfigParms &parms, CString &sError) {
  const int nIndex = getIndexForSensorName(parms.sParms[1]);
  if (static_cast<unsigned>(nIndex) < 16u) return true;
  sError.Format(L"Bad device index '%s'", parms.sParms[1]);
  return false;
}

void CRobotConfigurationBasic::initializeMultiRobotNetworkDefinitionBeforeParsingConfiguration() {
  pNtwkInfo->initializeEmpty();
}

void CRobotConfigurationBasic::normalizeValuesAfterParsingConfiguration() {
  for (int port = 0; port < kMaxNumbOfSensorPorts; ++port)
    if (settings.nSensorTypes[size_t(port)] == -1) clearSensorTypeAndModeInConfig(port);
  clearUnusedVexI2CEncoders();
}

void CRobotConfigurationBasic::validateMultiRobotNetworkDefinitionAfterParsingConfiguration() {}
