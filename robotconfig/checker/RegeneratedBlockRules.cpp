// The safety net: after the rules above, the block is regenerated (settled)
// and every accepted line must find what it says in it. A rule that the
// checker lacks then shows up as a lost definition instead of silent loss.
#include <algorithm>
#include <set>

#include "robotconfig/checker/CheckContext.h"
#include "robotconfig/host/DeviceCatalog.h"
#include "robotconfig/host/HostMessages.h"

namespace {

// Keywords whose lines the net compares. Network, series and servo-position
// lines keep their own texts and are compared by the record's comparison.
constexpr TConfigTypes kComparedTypes[] = {
    configTypeMotor,       configTypeSensor,     configTypeServo,          configTypeHubs,
    configTypeMotorPidSetting, configTypeUartUsage, configTypeI2CUsage,    configTypePluginCircuitBoard,
    configTypeProgramType, configTypeFirmwareFeatures, configTypeDriveTrainMotors, configTypeDriveTrainWheels,
    configTypeGripperArm,  configTypeJoystickDrive, configTypeMemorySize,  configTypeStandardModel,
    configTypeRenameMotor, configTypeRenameSensor,
};

// Which device of its keyword a line is about: the index of its port for
// device lines, the first parameter for other keyed lines, "" for singletons.
std::wstring lineKey(const CRobotConfigurationBasic &config, TConfigTypes nType, const TTokenizedConfigParms &parms) {
  const CString &sFirst = parms.sParms[1];
  switch (nType) {
    case configTypeMotor:
    case configTypeMotorPidSetting:
    case configTypeRenameMotor: return std::to_wstring(config.getIndexForDefaultMotorName(sFirst));
    case configTypeSensor:
    case configTypeRenameSensor: return std::to_wstring(config.getIndexForSensorName(sFirst));
    case configTypeServo: return std::to_wstring(getServoIndex(sFirst));
    case configTypeHubs:
    case configTypeUartUsage:
    case configTypeI2CUsage:
    case configTypePluginCircuitBoard: return sFirst.str();
    default: return L"";
  }
}

// Words of a line that need not come back as written: numbers (written in
// their own form), the I2C column's words, and the closing parenthesis.
bool bIsFreeWord(const CString &sWord) {
  bool bNumber = false;
  getInteger(sWord, bNumber);
  return sWord.IsEmpty() || bNumber || sWord == L")" || sWord == L"AutoAssign";
}

// A generated line as the net looks it up.
struct TGeneratedLine {
  TTokenizedConfigParms parms;
  CString sText;
};

std::string userWorded(const CString &sBlockLine, const CString &sMessage) {
  CString sLine(sBlockLine);
  sLine.Trim();
  return "the configuration cannot be written back: the regenerated line '" + utf8(sLine) +
         "' would be refused (" + utf8(sMessage) + ")";
}

}  // namespace

void checkRegeneratedBlock(CCheckContext &context) {
  CHostRobotConfiguration copy(context.config);
  CString sBlock;
  std::vector<TConfigurationDiagnostic> refused;
  // A program that holds the block its record generates reads back into that
  // very record (the rules above only look at it): no reading again is needed.
  bool bHeld = false;
  if (!generateSettledBlock(copy, sBlock, &refused, context.bBoardKept ? &context.program : nullptr, &bHeld)) {
    // Say which line of the program the unwritable device comes from.
    const CProgramText block(sBlock.toUtf8());
    TTokenizedConfigParms parms;
    for (const TConfigurationDiagnostic &refusal : refused) {
      TFinding finding;
      finding.sCode = "RC902";
      const CString sBlockLine = refusal.nLine >= 1 && size_t(refusal.nLine) <= block.lines().size()
                                     ? block.lineString(size_t(refusal.nLine - 1))
                                     : CString();
      finding.sMessage = userWorded(sBlockLine, refusal.sMessage);
      if (CRobotConfigurationBasic::nTokenizeLine(sBlockLine, parms) == lineTypeConfigPragma) {
        const TConfigTypes nType = TConfigTypeDefns::lookupConfigType(parms.sParms[0]);
        for (TCheckedLine &line : context.lines)
          if (line.bAccepted && line.nType == nType) {
            finding.nLine = line.nLine;
            finding.nColumn = 1;
          }
        if (finding.nLine > 0) finding.sMessage += "; change this line or the lines it depends on (board, controllers)";
      }
      context.findings.push_back(std::move(finding));
    }
    if (refused.empty()) {
      TFinding finding;
      finding.sCode = "RC902";
      finding.sMessage = "the configuration cannot be written: the block changes each time it is regenerated; check the "
                         "board, controller and I2C lines, which the other lines depend on";
      context.findings.push_back(std::move(finding));
    }
    return;
  }

  // The settled block, read back, indexes its lines by keyword and device.
  CHostRobotConfiguration reread;
  if (!bHeld) {
    CCapturingMessageSink quiet;
    readProgramConfiguration(reread, CProgramText(sBlock.toUtf8()));
  }
  const CRobotConfigurationBasic &readBack = bHeld ? static_cast<const CRobotConfigurationBasic &>(context.config) : reread;
  std::multimap<std::pair<TConfigTypes, std::wstring>, TGeneratedLine> generated;
  const CProgramText block(sBlock.toUtf8());
  for (size_t i = 0; i < block.lines().size(); ++i) {
    TGeneratedLine line;
    line.sText = block.lineString(i);
    if (CRobotConfigurationBasic::nTokenizeLine(line.sText, line.parms) != lineTypeConfigPragma) continue;
    const TConfigTypes nType = TConfigTypeDefns::lookupConfigType(line.parms.sParms[0]);
    generated.emplace(std::make_pair(nType, lineKey(readBack, nType, line.parms)), line);
  }

  for (TCheckedLine &line : context.lines) {
    if (!line.bAccepted || line.bFlagged) continue;
    if (std::find(std::begin(kComparedTypes), std::end(kComparedTypes), line.nType) == std::end(kComparedTypes))
      continue;
    const auto range = generated.equal_range(std::make_pair(line.nType, lineKey(context.config, line.nType, line.parms)));
    const int nFirstWord = line.nType == configTypeFirmwareFeatures || line.nType == configTypeStandardModel ? 1 : 2;
    // The words the line says, each of which some generated line of its device must carry.
    std::set<std::wstring> carried;
    for (auto it = range.first; it != range.second; ++it)
      for (int n = 1; n < it->second.parms.nNumbOfParms && n < kMaxConfigTokens; ++n)
        carried.insert(it->second.parms.sParms[size_t(n)].str());
    if (range.first == range.second) {
      // A Sensor line that names no sensor, and a line of the legacy second
      // keyword, may come back as nothing: nothing is lost.
      if (line.nType == configTypeSensor && getSensorTypeIndex(line.parms.sParms[3], true) <= 0 &&
          line.parms.sParms[2].IsEmpty())
        continue;
      context.report(line, "RC901", 0, "this definition is lost when the block is regenerated");
      continue;
    }
    for (int n = nFirstWord; n < line.parms.nNumbOfParms && n < kMaxConfigTokens; ++n) {
      const CString &sWord = line.parms.sParms[size_t(n)];
      if (bIsFreeWord(sWord) || carried.count(sWord.str()) || line.reportedParms.count(n)) continue;
      context.report(line, "RC901", n,
                     quoted(sWord) + " is lost when the block is regenerated; the line becomes '" +
                         utf8(range.first->second.sText) + "'");
      break;
    }
  }
}
