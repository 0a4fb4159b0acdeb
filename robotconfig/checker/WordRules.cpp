// Words in catalog positions: every word a keyword expects from a table must
// be one of the table's words on this platform, or the record silently keeps
// its "none" value in its place.
#include <algorithm>

#include "robotconfig/checker/CheckContext.h"
#include "robotconfig/checker/WordSuggestions.h"
#include "robotconfig/drive_serial_network/ProgramTypes.h"
#include "robotconfig/drive_serial_network/SerialPorts.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/Platform.h"
#include "robotconfig/motors/MotorTypes.h"
#include "robotconfig/sensors/ControllerBoards.h"

namespace {

// Motor types that older programs name and the record turns into current ones.
constexpr TMotorTypes kFirstLegacyMotorType = 26;
constexpr TMotorTypes kLastLegacyMotorType = 31;

// Sensor types that stand for pins other devices claim; the record ignores them
// on Sensor lines, and users never need to write them.
constexpr TSensorTypes kClaimedTypes[] = {56, 57, 58, 59, 60, 61, 62, 64, 65, 66, 81, 91};

bool bIsClaimedType(TSensorTypes nType) {
  return std::find(std::begin(kClaimedTypes), std::end(kClaimedTypes), nType) != std::end(kClaimedTypes);
}

bool bRowOnPlatform(const TDeviceTypeMenuItem &row) { return (row.nPlatformMask & pToggles->getPlatformMask()) != 0; }

// "'sensorTuch' is not a sensor type" plus suggestions and other platforms.
void reportUnknownWord(CCheckContext &context, TCheckedLine &line, int nParm, const char *pzKind,
                       const std::vector<std::wstring> &candidates, const TDeviceTypeMenuItem *pTable) {
  const CString &sWord = line.parms.sParms[size_t(nParm)];
  const std::string sPlatform = utf8(pPlatformData->pPlatformParms->pPlatformName);
  if (sWord.IsEmpty()) {
    context.report(line, "RC101", nParm, std::string("expected ") + pzKind + ", found nothing");
    return;
  }
  const std::string sOthers = pTable ? otherPlatformsOfWord(pTable, sWord) : std::string();
  if (!sOthers.empty()) {
    context.report(line, "RC102", nParm,
                   quoted(sWord) + " is not available on " + sPlatform + "; it exists on " + sOthers);
    return;
  }
  TFinding &finding =
      context.report(line, "RC101", nParm, quoted(sWord) + " is not " + pzKind + " on " + sPlatform);
  for (const std::wstring &sSuggestion : closestWords(sWord.str(), candidates)) finding.suggestions.push_back(utf8(sSuggestion));
}

// Checks parameter `nParm` against a table of the current platform.
void checkTableWord(CCheckContext &context, TCheckedLine &line, int nParm, const TDeviceTypeMenuItem *pTable,
                    const char *pzKind) {
  const CString &sWord = line.parms.sParms[size_t(nParm)];
  if (getTypedefIndex(pTable, sWord, true) >= 0) return;
  reportUnknownWord(context, line, nParm, pzKind, tableWords(pTable), pTable);
}

void checkSensorLine(CCheckContext &context, TCheckedLine &line) {
  const TTokenizedConfigParms &parms = line.parms;
  const CString &sType = parms.sParms[3];
  const TSensorTypes nType = getSensorTypeIndex(sType, true);
  if (nType < 0) {
    std::vector<std::wstring> candidates;
    for (const TDeviceTypeMenuItem *pRow = getSensorTypeNameTable(); pRow->nPlatformMask != 0; ++pRow)
      if (bRowOnPlatform(*pRow) && !bIsClaimedType(pRow->nValue)) candidates.push_back(pRow->pzKeyword);
    reportUnknownWord(context, line, 3, "a sensor type", candidates, getSensorTypeNameTable());
    return;
  }
  if (nType == 0 || bIsClaimedType(nType)) return;
  // After the type: the mode, a secondary port, the I2C column, in the writer's or the user's order.
  std::vector<std::wstring> modes;
  for (const TDeviceTypeMenuItem *pRow = getSensorModeNameTable(); pRow->nPlatformMask != 0; ++pRow)
    if (getSensorModeIndex(nType, pRow->pzKeyword, true) == pRow->nValue) modes.push_back(pRow->pzKeyword);
  for (int n = 4; n < parms.nNumbOfParms && n < kMaxConfigTokens; ++n) {
    const CString &sWord = parms.sParms[size_t(n)];
    bool bNumber = false;
    getInteger(sWord, bNumber);
    if (sWord.IsEmpty() || sWord == L")" || sWord == L"AutoAssign" || bNumber) continue;
    if (getSecondaryPortIndex(sWord) >= 0 || getSensorModeIndex(nType, sWord, true) >= 0) continue;
    bool bModeOfOtherType = false;
    for (const TDeviceTypeMenuItem *pRow = getSensorModeNameTable(); pRow->nPlatformMask != 0; ++pRow)
      bModeOfOtherType = bModeOfOtherType || sWord == pRow->pzKeyword;
    TFinding *pFinding;
    if (bModeOfOtherType) {
      pFinding = &context.report(line, "RC105", n,
                                 "mode " + quoted(sWord) + " does not belong to " + quoted(sType) + " and is dropped" +
                                     (modes.size() > 1 ? "" : "; the type has no modes to choose"));
      for (size_t i = 0; i < modes.size() && i < 6; ++i)
        if (modes[i] != L"modeRaw") pFinding->suggestions.push_back(utf8(modes[i]));
    } else {
      pFinding = &context.report(line, "RC101", n,
                                 quoted(sWord) + " is not a mode of " + quoted(sType) +
                                     ", a secondary port or an I2C address");
      for (const std::wstring &s : closestWords(sWord.str(), modes)) pFinding->suggestions.push_back(utf8(s));
    }
  }
}

void checkMotorLine(CCheckContext &context, TCheckedLine &line) {
  const CString &sPort = line.parms.sParms[1];
  const CString &sType = line.parms.sParms[3];
  CHostRobotConfiguration &config = context.config;
  const int nMotor = config.getIndexForDefaultMotorName(sPort);
  if (!CRobotConfigurationBasic::bIsMotorIndex(nMotor)) return;
  const TSensorHWTypesMask nMask = config.getAorDMotorTypeMask(nMotor);
  const TMotorTypes nNamed = getMotorTypedefNameIndex(sType, -1);
  const std::string sPlatform = utf8(pPlatformData->pPlatformParms->pPlatformName);
  if (nNamed < 0) {
    std::vector<std::wstring> candidates;
    for (const TDeviceTypeMenuItem *pRow = getMotorTypeNameTable(); pRow->nPlatformMask != 0; ++pRow) {
      const bool bFits = nMask == 0 || nMask == -1 || (pRow->nAttribute & nMask) != 0;
      if (bFits && getMotorCharacteristics(pRow->nValue)) candidates.push_back(pRow->pzKeyword);
    }
    reportUnknownWord(context, line, 3, "a motor type", candidates, nullptr);
    return;
  }
  if (!config.bIsValidMotorPort(nMotor)) {
    context.report(line, "RC303", 1,
                   "motor port " + quoted(sPort) +
                       " is on a controller that no earlier 'Hubs' line declares, so the motor is lost");
    return;
  }
  const TMotorTypes nStored = config.getMotorTypeInConfig(nMotor);
  const CString sWritten = getMotorTypedefString(nStored, nMask);
  if (nStored == 0 && nNamed != 0) {
    TFinding &finding = context.report(line, "RC104", 3,
                                       quoted(sType) + " gives no motor on " + quoted(sPort) + " of " + sPlatform +
                                           ": the port's hardware cannot drive it, so the motor is lost");
    for (const TDeviceTypeMenuItem *pRow = getMotorTypeNameTable(); pRow->nPlatformMask != 0; ++pRow) {
      if (finding.suggestions.size() >= 3) break;
      if (pRow->nValue != 0 && (pRow->nAttribute & nMask) != 0 && getMotorCharacteristics(pRow->nValue) &&
          pRow->nValue < kFirstLegacyMotorType)
        finding.suggestions.push_back(utf8(pRow->pzKeyword));
    }
    return;
  }
  if (sWritten == sType || nStored == 0) return;
  if (nNamed >= kFirstLegacyMotorType && nNamed <= kLastLegacyMotorType) {
    context.report(line, "RC106", 3, quoted(sType) + " is an older word; the block is written with " +
                                         quoted(sWritten));
    return;
  }
  context.report(line, "RC103", 3,
                 quoted(sType) + " does not exist on " + sPlatform + " and becomes " + quoted(sWritten));
}

void checkServoLine(CCheckContext &context, TCheckedLine &line) {
  const CString &sType = line.parms.sParms[3];
  if (getServoTypedefNameIndex(sType) >= 0) return;
  std::vector<std::wstring> candidates;
  for (const TDeviceTypeMenuItem *pRow = getServoTypeNameTable(); pRow->nPlatformMask != 0; ++pRow)
    if (bRowOnPlatform(*pRow)) candidates.push_back(pRow->pzKeyword);
  reportUnknownWord(context, line, 3, "a servo type", candidates, getServoTypeNameTable());
}

}  // namespace

std::vector<std::wstring> tableWords(const TDeviceTypeMenuItem *pTable) {
  std::vector<std::wstring> words;
  for (const TDeviceTypeMenuItem *pRow = pTable; pRow && pRow->nPlatformMask != 0; ++pRow)
    if (pRow->pzKeyword && bRowOnPlatform(*pRow)) words.push_back(pRow->pzKeyword);
  return words;
}

std::string otherPlatformsOfWord(const TDeviceTypeMenuItem *pTable, const CString &sWord) {
  uint32_t nMask = 0;
  for (const TDeviceTypeMenuItem *pRow = pTable; pRow && pRow->nPlatformMask != 0; ++pRow)
    if (pRow->pzKeyword && sWord == pRow->pzKeyword) nMask |= pRow->nPlatformMask;
  nMask &= ~pToggles->getPlatformMask();
  std::string sList;
  for (int nKind = 1; nKind < kNumbOfPlatformKinds; ++nKind) {
    if (!(nMask & (1u << nKind))) continue;
    const CPlatformType *pPlatform = getPlatformTypeForKind(nKind);
    if (!pPlatform) continue;
    if (!sList.empty()) sList += ", ";
    sList += utf8(pPlatform->pPlatformParms->pPlatformName);
  }
  return sList;
}

void checkLineWords(CCheckContext &context, TCheckedLine &line) {
  switch (line.nType) {
    case configTypeSensor: checkSensorLine(context, line); break;
    case configTypeMotor: checkMotorLine(context, line); break;
    case configTypeServo: checkServoLine(context, line); break;
    case configTypeDriveTrainMotors: checkTableWord(context, line, 1, nDriveTrainTypes, "a drive-train type"); break;
    case configTypeGripperArm: checkTableWord(context, line, 1, nGripperArmTypes, "a gripper-arm type"); break;
    case configTypeJoystickDrive:
      checkTableWord(context, line, 1, nJoystickDriveTypes, "a joystick drive type");
      checkTableWord(context, line, 2, nJoystickAxisScalingTypes, "a joystick axis scaling");
      break;
    case configTypeUartUsage:
      checkTableWord(context, line, 2, nUARTTypes, "a UART use");
      checkTableWord(context, line, 3, nUARTBaudRates, "a baud rate");
      break;
    case configTypeI2CUsage: checkTableWord(context, line, 2, nI2CTypes, "an I2C use"); break;
    case configTypeCircuitBoardType: {
      const TDeviceTypeMenuItem *pBoards = getArduinoCircuitBoardTypeMenuDefn();
      if (getTypedefIndex(pBoards, line.parms.sParms[1], true) >= 0) break;
      std::vector<std::wstring> boards = tableWords(pBoards);
      reportUnknownWord(context, line, 1, "a board", boards, pBoards);
      // Which boards exist, when there are few enough to list.
      TFinding &finding = context.findings.back();
      if (finding.sCode == "RC101" && !boards.empty()) {
        finding.sMessage += "; the boards are";
        for (size_t i = 0; i < boards.size(); ++i) finding.sMessage += (i ? ", " : " ") + utf8(boards[i]);
      }
      break;
    }
    case configTypePluginCircuitBoard:
      checkTableWord(context, line, 1, nPluginCircuitBoardTypes, "a plug-in board");
      break;
    default: break;
  }
}
