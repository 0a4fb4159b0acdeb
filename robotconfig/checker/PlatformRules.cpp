// When many lines fail, the file is often for another platform: say which
// platforms (and boards) read it without errors.
#include <set>

#include "robotconfig/checker/CheckContext.h"
#include "robotconfig/checker/ProgramChecker.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

namespace {

// Lines with an error before a hint is worth the extra reads.
constexpr int kFailingLinesForHint = 2;
// Configuration lines beyond which the reads on every platform cost too much:
// real blocks hold a few dozen.
constexpr size_t kMaxLinesForHint = 1000;

}  // namespace

void suggestOtherPlatforms(CCheckContext &context, const CProgramText &program) {
  std::set<int> failingLines;
  for (const TFinding &finding : context.findings)
    if (finding.nSeverity == TSeverity::kError && finding.nLine > 0) failingLines.insert(finding.nLine);
  if (int(failingLines.size()) < kFailingLinesForHint || context.lines.size() > kMaxLinesForHint) return;
  const int nCurrent = pToggles->getPlatformKind();
  const bool bToggle = pToggles->bIsToggleEnabled(kToggleExternalControllers, kToggleQueryLevel) != 0;
  std::string sClean;
  for (int nKind = 1; nKind < kNumbOfPlatformKinds; ++nKind) {
    if (nKind == nCurrent) continue;
    const CPlatformType *pPlatform = getPlatformTypeForKind(nKind);
    if (!pPlatform) continue;
    CHostSelectionScope scope;
    selectHostPlatform(nKind, -1, bToggle);
    TCheckOptions options;
    options.bSuggestPlatforms = false;
    const TCheckResult result = checkProgramText(program, options);
    if (result.nErrors > 0) continue;
    if (!sClean.empty()) sClean += ", ";
    sClean += utf8(pPlatform->pPlatformParms->pPlatformName) + " (--platform " + utf8(pPlatform->pKeyword) + ")";
  }
  if (sClean.empty()) return;
  TFinding finding;
  finding.sCode = "RC501";
  finding.nSeverity = TSeverity::kNote;
  finding.sMessage = std::to_string(failingLines.size()) + " lines fail on " +
                     utf8(pPlatformData->pPlatformParms->pPlatformName) + "; the file reads without errors on " +
                     sClean;
  context.findings.push_back(std::move(finding));
}
