#include "robotconfig/program/ProgramText.h"

#include <algorithm>

#include "robotconfig/program/HostConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Platform.h"

CProgramText::CProgramText(std::string sBytes) : m_sBytes(std::move(sBytes)) {
  // An editor's UTF-8 byte-order mark would otherwise hide a configuration line 1.
  if (m_sBytes.compare(0, 3, "\xEF\xBB\xBF") == 0) m_nBomLength = 3;
  size_t nStart = m_nBomLength;
  bool bFirstEnd = true;
  while (nStart < m_sBytes.size()) {
    const size_t nNewline = m_sBytes.find('\n', nStart);
    if (nNewline == std::string::npos) {
      m_lines.push_back({nStart, m_sBytes.size() - nStart, 0});
      break;
    }
    const bool bCr = nNewline > nStart && m_sBytes[nNewline - 1] == '\r';
    if (bFirstEnd) {
      m_bCrLf = bCr;
      bFirstEnd = false;
    }
    const size_t nLength = nNewline - nStart - (bCr ? 1 : 0);
    m_lines.push_back({nStart, nLength, bCr ? size_t(2) : size_t(1)});
    nStart = nNewline + 1;
  }
}

std::string_view CProgramText::lineText(size_t nIndex) const {
  const TLine &line = m_lines.at(nIndex);
  return std::string_view(m_sBytes).substr(line.nOffset, line.nLength);
}

namespace {

// What a line is to the block finder.
enum class TLineRole { kOther, kBlank, kConfig, kMarker };

// True when a line's bytes may hold a configuration line: only one whose
// first token is "#pragma" (quoted or not) can, so most lines are passed
// over without being decoded.
bool mayBeConfigLine(std::string_view line) {
  size_t pos = 0;
  while (pos < line.size() && (line[pos] == ' ' || line[pos] == '\t')) ++pos;
  if (pos < line.size() && line[pos] == '"') ++pos;
  return line.compare(pos, 7, "#pragma") == 0;
}

// The role of one line: configuration lines and the marker lines that close a
// block are part of it; so are blank lines inside it.
TLineRole lineRole(const CString &sLine, TTokenizedConfigParms &parms) {
  switch (CRobotConfigurationBasic::nTokenizeLine(sLine, parms)) {
    case lineTypeBlank:
      return TLineRole::kBlank;
    case lineTypeConfigPragma:
      return TLineRole::kConfig;
    case lineTypeMarkerComment:
      return TLineRole::kMarker;
    case lineTypeNoTokens: {
      // Only the marker forms close a block; "#pragma config()" and the like do not.
      CString sTrimmed(sLine);
      sTrimmed.TrimLeft();
      return sTrimmed.Find(sConfigStartMarker) == 0 ? TLineRole::kMarker : TLineRole::kOther;
    }
    default:
      return TLineRole::kOther;
  }
}

// The role of line `nIndex`, decoding it only when its bytes could make it
// more than an ordinary line: blank lines hold only blanks, and every other
// role needs "#pragma" first or the marker somewhere.
TLineRole lineRole(const CProgramText &program, size_t nIndex, CString &sLine, TTokenizedConfigParms &parms) {
  const std::string_view line = program.lineText(nIndex);
  if (line.find_first_not_of(" \t") == std::string_view::npos) return TLineRole::kBlank;
  if (!mayBeConfigLine(line) && line.find("//*!!") == std::string_view::npos) return TLineRole::kOther;
  program.decodeLine(nIndex, sLine);
  return lineRole(sLine, parms);
}

// Which lines the block takes and where it starts.
struct TBlockPlan {
  std::vector<bool> bRemove;
  size_t nBlockStart;  ///< the line the block is written at; the line count when there is no block
};

// The block of `program`: every configuration line, and the first marker line
// after the block's start together with one blank line after it.
TBlockPlan planBlock(const CProgramText &program) {
  const size_t nLines = program.lines().size();
  std::vector<TLineRole> roles(nLines);
  CString sLine;
  TTokenizedConfigParms parms;
  for (size_t i = 0; i < nLines; ++i) roles[i] = lineRole(program, i, sLine, parms);

  std::vector<bool> bRemove(nLines, false);
  size_t nBlockStart = nLines;
  bool bMarkerTaken = false;
  for (size_t i = 0; i < nLines; ++i) {
    if (roles[i] == TLineRole::kConfig) {
      bRemove[i] = true;
      nBlockStart = std::min(nBlockStart, i);
    } else if (roles[i] == TLineRole::kMarker && !bMarkerTaken) {
      bMarkerTaken = true;
      bRemove[i] = true;
      nBlockStart = std::min(nBlockStart, i);
      if (i + 1 < nLines && roles[i + 1] == TLineRole::kBlank) bRemove[i + 1] = true;
    }
  }
  // Blank lines between configuration lines and their marker go with the block.
  for (size_t i = nBlockStart; i < nLines; ++i) {
    if (roles[i] != TLineRole::kBlank || bRemove[i]) continue;
    size_t j = i;
    while (j < nLines && roles[j] == TLineRole::kBlank && !bRemove[j]) ++j;
    if (j < nLines && bRemove[j] && j > i && (roles[j] == TLineRole::kConfig || roles[j] == TLineRole::kMarker) &&
        bRemove[i - 1])
      std::fill(bRemove.begin() + long(i), bRemove.begin() + long(j), true);
    i = j;
  }
  return {std::move(bRemove), nBlockStart};
}

// The bytes written in the block's place; empty when the program stays as it is
// (an empty text for a program without a block).
std::string blockBytes(const CProgramText &program, const CString &sGenerated, bool bHadBlock) {
  std::string sBlock = encodeGeneratedBlock(sGenerated, program.lineEnding());
  if (sBlock.empty() && bHadBlock)  // an emptied block keeps its place with the empty-block marker
    sBlock = CString(sConfigEmptyBlockMarker).toUtf8() + program.lineEnding() + program.lineEnding();
  return sBlock;
}

}  // namespace

std::vector<TConfigurationDiagnostic> readProgramConfiguration(CRobotConfigurationBasic &config,
                                                               const CProgramText &program,
                                                               CReadingObserver *pObserver) {
  std::vector<TConfigurationDiagnostic> diagnostics;
  config.clearConfigurationDefinition();
  config.initializeMultiRobotNetworkDefinitionBeforeParsingConfiguration();
  CString sPath;
  config.getPathName(sPath);
  TTokenizedConfigParms parms;
  CString sError, sLine;
  for (size_t i = 0; i < program.lines().size(); ++i) {
    if (!mayBeConfigLine(program.lineText(i))) continue;
    bool bCut = false;
    program.decodeLine(i, sLine);
    if (CRobotConfigurationBasic::nTokenizeLineReportingCuts(sLine, parms, bCut) != lineTypeConfigPragma) continue;
    const int nLine = static_cast<int>(i) + 1;
    sError.Empty();
    // The record keeps only what the tokens hold; a rewritten block would drop the rest.
    const bool bLineTooLong = program.lineText(i).size() > CProgramText::kMaxDecodedLineBytes;
    if (bCut || bLineTooLong) {
      CString sMessage;
      sMessage.Format(L"'%s' configuration line holds more than is kept (at most 12 parameters of 99 characters)",
                      parms.sParms[0]);
      diagnostics.push_back({nLine, sMessage});
    }
    if (pObserver) pObserver->beforeLine(nLine, parms);
    const bool bAccepted = config.bParseConfigDefinitionLine(parms, true, TLineNumber(nLine, 0), sPath, sError);
    if (pObserver) pObserver->afterLine(nLine, parms, bAccepted);
    if (bAccepted) continue;
    if (sError.IsEmpty()) sError.Format(L"'%s' configuration line rejected", parms.sParms[0]);
    diagnostics.push_back({nLine, sError});
  }
  if (pObserver) pObserver->beforeAfterReadingSteps();
  config.normalizeValuesAfterParsingConfiguration();
  config.validateMultiRobotNetworkDefinitionAfterParsingConfiguration();
  // The IDE follows the board the program names, then checks the port rules.
  config.modifyBoardTypeIfDifferentFromIDESetting();
  config.checkEngineeringRules(true);
  return diagnostics;
}

bool generateSettledBlock(CHostRobotConfiguration &config, CString &sBlock,
                          std::vector<TConfigurationDiagnostic> *pRefused, const CProgramText *pProgram,
                          bool *pHeld) {
  if (pHeld) *pHeld = false;
  config.buildSourceCodeForConfiguration(sBlock, false);
  // The program's own lines read back into this very record, so its block is settled.
  if (pProgram && programHoldsBlock(*pProgram, sBlock)) {
    if (pHeld) *pHeld = true;
    return true;
  }
  CString sPath;
  config.getPathName(sPath);
  // Two rounds settle every case the rules allow; more would mean a fault.
  constexpr int kMaxRounds = 4;
  for (int nRound = 0; nRound < kMaxRounds; ++nRound) {
    // Reading again must neither move the IDE's board nor repeat the warnings.
    CHostSelectionScope selection;
    CCapturingMessageSink quiet;
    CHostRobotConfiguration reread;
    reread.setPathName(sPath);
    std::vector<TConfigurationDiagnostic> refused = readProgramConfiguration(reread, CProgramText(sBlock.toUtf8()));
    if (!refused.empty()) {
      if (pRefused) *pRefused = std::move(refused);
      return false;
    }
    CString sAgain;
    reread.buildSourceCodeForConfiguration(sAgain, false);
    if (sAgain == sBlock) {
      if (pHeld && pProgram) *pHeld = programHoldsBlock(*pProgram, sBlock);
      return true;
    }
    sBlock = sAgain;
  }
  return false;
}

std::string encodeGeneratedBlock(const CString &sGenerated, const char *pzLineEnding) {
  const std::wstring &sText = sGenerated.str();
  const std::string_view ending(pzLineEnding);
  const size_t n = sText.size();
  std::string sOut;
  sOut.reserve(n + n / 32);
  // "\r\n" and a lone "\n" both end a line; pairs do not overlap, so "\r\r\n" keeps its first "\r".
  for (size_t i = 0; i < n;) {
    const wchar_t c = sText[i];
    if (c == L'\r' && i + 1 < n && sText[i + 1] == L'\n') {
      sOut += ending;
      i += 2;
    } else if (c == L'\n') {
      sOut += ending;
      ++i;
    } else if (static_cast<uint32_t>(c) < 0x80) {  // an ASCII run up to the next line end, a byte per character
      size_t j = i + 1;
      while (j < n && static_cast<uint32_t>(sText[j]) < 0x80 && sText[j] != L'\r' && sText[j] != L'\n') ++j;
      const size_t nAt = sOut.size();
      sOut.resize(nAt + (j - i));
      char *pOut = &sOut[nAt];
      for (; i < j; ++i) *pOut++ = static_cast<char>(sText[i]);
    } else {
      CString::appendUtf8(sOut, c);
      ++i;
    }
  }
  return sOut;
}

std::string replaceConfigurationBlock(const CProgramText &program, const CString &sGenerated) {
  const TBlockPlan plan = planBlock(program);
  const size_t nLines = program.lines().size();
  const bool bHadBlock = plan.nBlockStart < nLines;
  const std::string sBlock = blockBytes(program, sGenerated, bHadBlock);
  if (sBlock.empty() && !bHadBlock) return program.bytes();

  std::string sOut(program.byteOrderMark());
  sOut.reserve(program.bytes().size() + sBlock.size());
  if (!bHadBlock) sOut += sBlock;
  for (size_t i = 0; i < nLines; ++i) {
    if (i == plan.nBlockStart) sOut += sBlock;
    if (plan.bRemove[i]) continue;
    const CProgramText::TLine &line = program.lines()[i];
    sOut.append(program.bytes(), line.nOffset, line.nLength + line.nEolLength);
  }
  return sOut;
}

bool programHoldsBlock(const CProgramText &program, const CString &sGenerated) {
  const TBlockPlan plan = planBlock(program);
  const size_t nLines = program.lines().size();
  const bool bHadBlock = plan.nBlockStart < nLines;
  const std::string sBlock = blockBytes(program, sGenerated, bHadBlock);
  if (sBlock.empty() && !bHadBlock) return true;
  if (!bHadBlock) return false;
  // The replaced text keeps every line before the block, so it equals the
  // program exactly when the block's bytes stand where the block starts and
  // every line from there on is either kept or part of those bytes.
  const std::string &sBytes = program.bytes();
  size_t nAt = program.lines()[plan.nBlockStart].nOffset;
  if (sBytes.compare(nAt, sBlock.size(), sBlock) != 0) return false;
  nAt += sBlock.size();
  for (size_t i = plan.nBlockStart; i < nLines; ++i) {
    if (plan.bRemove[i]) continue;
    const CProgramText::TLine &line = program.lines()[i];
    const size_t nSize = line.nLength + line.nEolLength;
    if (sBytes.compare(nAt, nSize, sBytes, line.nOffset, nSize) != 0) return false;
    nAt += nSize;
  }
  return nAt == sBytes.size();
}
