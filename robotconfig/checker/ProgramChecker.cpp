#include "robotconfig/checker/ProgramChecker.h"

#include <algorithm>

#include "robotconfig/checker/CheckContext.h"
#include "robotconfig/checker/RuleTable.h"
#include "robotconfig/checker/WordSuggestions.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

std::string utf8(const CString &s) { return s.toUtf8(); }
std::string utf8(const std::wstring &s) { return CString(s).toUtf8(); }
std::string utf8(const wchar_t *pz) { return CString(pz).toUtf8(); }
std::string quoted(const CString &s) { return "'" + s.toUtf8() + "'"; }

int CCheckContext::columnOf(const TCheckedLine &line, int nParm) {
  if (nParm >= 0 && size_t(nParm) < line.scanned.columns.size()) return line.scanned.columns[size_t(nParm)];
  if (nParm < 0) {
    // The line's first non-blank character.
    const std::wstring &s = line.sLineText.str();
    const size_t n = s.find_first_not_of(L" \t");
    return n == std::wstring::npos ? 1 : int(n) + 1;
  }
  return line.scanned.columns.empty() ? 1 : line.scanned.columns.back();
}

TFinding &CCheckContext::report(TCheckedLine &line, const char *pzCode, int nParm, const std::string &sMessage) {
  TFinding finding;
  finding.sCode = pzCode;
  const TCheckRule *pRule = findCheckRule(pzCode);
  finding.nSeverity = pRule ? pRule->nSeverity : TSeverity::kError;
  finding.nLine = line.nLine;
  finding.nColumn = columnOf(line, nParm);
  finding.sMessage = sMessage;
  if (finding.nSeverity != TSeverity::kNote) line.bFlagged = true;
  line.reportedParms.insert(nParm);
  findings.push_back(std::move(finding));
  return findings.back();
}

namespace {

// The configuration keywords closest to a word no keyword matches.
std::vector<std::wstring> closestKeywords(const CString &sWord) {
  std::vector<std::wstring> keywords;
  for (TConfigTypes nType = 0; nType < kNumbOfConfigTypes; ++nType)
    keywords.push_back(TConfigTypeDefns::getConfigTypeName(nType));
  return closestWords(sWord.str(), keywords);
}

// Watches the road: keeps each line with its layout and runs the line rules
// right after the reader, while the record holds what the line left.
class CLineChecker : public CReadingObserver {
 public:
  explicit CLineChecker(CCheckContext &context) : m_context(context) {}

  void beforeLine(int nLine, const TTokenizedConfigParms &parms) override {
    TCheckedLine line;
    line.nLine = nLine;
    line.parms = parms;
    line.sLineText = m_context.program.lineString(size_t(nLine - 1));
    line.scanned = scanConfigLine(line.sLineText);
    line.nType = TConfigTypeDefns::lookupConfigType(parms.sParms[0]);
    m_context.lines.push_back(std::move(line));
    const TConfigurationSettings &settings = m_context.config.getSettings();
    m_context.sensorTypesBefore.assign(settings.nSensorTypes.begin(), settings.nSensorTypes.end());
    m_context.motorPinsBefore.clear();
    for (const TMotorSlot &motor : settings.motors)
      m_context.motorPinsBefore.emplace_back(motor.nPrimaryIOPin, motor.nSecondaryIOPin);
  }

  void afterLine(int, const TTokenizedConfigParms &, bool bAccepted) override {
    TCheckedLine &line = m_context.lines.back();
    line.bAccepted = bAccepted;
    // A refused line has its reader's message; only a misspelt keyword gets a hint.
    if (!bAccepted) {
      if (line.nType == configTypeNotFound) line.keywordSuggestions = closestKeywords(line.parms.sParms[0]);
      return;
    }
    checkLineSyntax(m_context, line);
    // Reading stopped early: what is missing is the missing comma's doing.
    if (line.scanned.nStrayWordColumn > 0) return;
    checkLineWords(m_context, line);
    checkLineDevices(m_context, line);
  }

 private:
  CCheckContext &m_context;
};

// True for the message box that tells of the program's board replacing the IDE's.
bool bIsBoardChangeMessage(const THostMessage &message) {
  return message.sText.Find(L"IDE Circuit Board type is being changed") == 0;
}

}  // namespace

TCheckResult checkProgram(CHostRobotConfiguration &config, const CProgramText &program, const TCheckOptions &options) {
  CCheckContext context(config, program);
  CLineChecker observer(context);
  std::vector<THostMessage> messages;
  TCheckResult result;
  {
    CCapturingMessageSink capture;
    const TControllerBoardType nBoardBefore = pToggles->getIDECircuitBoardType();
    result.refused = readProgramConfiguration(config, program, &observer);
    context.bBoardKept = pToggles->getIDECircuitBoardType() == nBoardBefore;
    messages = std::move(capture.messages);
  }
  for (const TConfigurationDiagnostic &refusal : result.refused) {
    TFinding finding;
    finding.sCode = "RC001";
    finding.nLine = refusal.nLine;
    finding.sMessage = refusal.sMessage.toUtf8();
    for (const TCheckedLine &line : context.lines)
      if (line.nLine == refusal.nLine)
        for (const std::wstring &sWord : line.keywordSuggestions) finding.suggestions.push_back(utf8(sWord));
    context.findings.push_back(std::move(finding));
  }
  // Messages of the reading: the board change and the port-order rules.
  for (const THostMessage &message : messages) {
    CString sText(message.sText);
    sText.Replace(L"\n \n", L" ");
    sText.Replace(L'\n', L' ');
    TFinding finding;
    finding.nSeverity = TSeverity::kWarning;
    finding.sMessage = sText.toUtf8();
    if (bIsBoardChangeMessage(message)) {
      finding.sCode = "RC502";
      finding.nSeverity = options.bBoardChosen ? TSeverity::kWarning : TSeverity::kNote;
      for (const TCheckedLine &line : context.lines)
        if (line.nType == configTypeCircuitBoardType && line.bAccepted) finding.nLine = line.nLine;
      if (finding.nLine > 0) finding.nColumn = 1;
    } else {
      finding.sCode = "RC503";
    }
    context.findings.push_back(std::move(finding));
  }
  checkDevicesOnHubs(context);
  // Only a program the rules above pass is worth regenerating.
  const bool bErrorsSoFar = std::any_of(context.findings.begin(), context.findings.end(),
                                        [](const TFinding &f) { return f.nSeverity == TSeverity::kError; });
  if (!bErrorsSoFar) checkRegeneratedBlock(context);
  if (options.bSuggestPlatforms) suggestOtherPlatforms(context, program);

  std::stable_sort(context.findings.begin(), context.findings.end(), [](const TFinding &a, const TFinding &b) {
    return a.nLine != b.nLine ? a.nLine < b.nLine : a.nColumn < b.nColumn;
  });
  result.findings = std::move(context.findings);
  for (const TFinding &finding : result.findings) {
    if (finding.nSeverity == TSeverity::kError) ++result.nErrors;
    if (finding.nSeverity == TSeverity::kWarning) ++result.nWarnings;
  }
  return result;
}

TCheckResult checkProgramText(const CProgramText &program, const TCheckOptions &options) {
  CHostRobotConfiguration config;
  return checkProgram(config, program, options);
}
