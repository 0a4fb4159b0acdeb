// What the tokenizer forgives in a line: the record reads it, but the text
// says more (or less) than what is read.
#include "robotconfig/checker/CheckContext.h"

namespace {

// Parameters each keyword reads at most (keyword excluded); 0 when any number.
struct TParameterLimit {
  TConfigTypes nType;
  int nMaxParms;
};

constexpr TParameterLimit kParameterLimits[] = {
    {configTypeStandardModel, 1}, {configTypeUserModel, 1},    {configTypeRenameMotor, 2},
    {configTypeRenameSensor, 2},  {configTypeJoystickDrive, 2}, {configTypeHubs, 5},
    {configTypeServo, 3},         {configTypeCpuParameters, 2}, {configTypeProgramType, 1},
    {configTypeCircuitBoardType, 1}, {configTypePluginCircuitBoard, 1}, {configTypeI2CUsage, 5},
    {configTypeMemorySize, 3},    {configTypeAnalog, 1},
};

}  // namespace

void checkLineSyntax(CCheckContext &context, TCheckedLine &line) {
  const TScannedLine &scanned = line.scanned;
  if (scanned.nStrayWordColumn > 0) {
    TFinding &finding = context.report(line, "RC012", scanned.nStrayAfter,
                                       "a comma is missing before '" + utf8(scanned.sStrayWord) +
                                           "': the parameter holds two words, and reading stops at the second");
    finding.nColumn = scanned.nStrayWordColumn;
    return;
  }
  if (scanned.nTrailingColumn > 0) {
    TFinding &finding = context.report(line, "RC011", -1,
                                       "text after ')' is ignored and lost when the block is regenerated");
    finding.nColumn = scanned.nTrailingColumn;
  } else if (!scanned.bClosed) {
    TFinding &finding = context.report(line, "RC010", -1, "the configuration line has no closing ')'");
    finding.nColumn = line.sLineText.GetLength() + 1;
  }
  for (const TParameterLimit &limit : kParameterLimits) {
    if (limit.nType != line.nType || line.parms.nNumbOfParms - 1 <= limit.nMaxParms) continue;
    // Empty parameters at the end are the writer's own padding.
    int nLast = line.parms.nNumbOfParms - 1;
    while (nLast > limit.nMaxParms && line.parms.sParms[size_t(nLast)].IsEmpty()) --nLast;
    if (nLast <= limit.nMaxParms) continue;
    context.report(line, "RC013", limit.nMaxParms + 1,
                   "'" + utf8(line.parms.sParms[0]) + "' reads " + std::to_string(limit.nMaxParms) +
                       (limit.nMaxParms == 1 ? " parameter" : " parameters") + "; " +
                       quoted(line.parms.sParms[size_t(limit.nMaxParms + 1)]) + " and what follows are ignored");
  }
}
