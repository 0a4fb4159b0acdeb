#include <string_view>

#include "robotconfig/checker/Render.h"
#include "robotconfig/program/ProgramText.h"

namespace {

std::string location(const std::string &sFile, int nLine, int nColumn) {
  std::string s = sFile;
  if (nLine > 0) s += ":" + std::to_string(nLine);
  if (nLine > 0 && nColumn > 0) s += ":" + std::to_string(nColumn);
  return s;
}

// "'a'", "'a' or 'b'", "'a', 'b' or 'c'".
std::string wordList(const std::vector<std::string> &words) {
  std::string s;
  for (size_t i = 0; i < words.size(); ++i) {
    if (i > 0) s += i + 1 == words.size() ? " or " : ", ";
    s += "'" + words[i] + "'";
  }
  return s;
}

// The source line and a caret under the token at `nColumn`, as gcc shows them.
std::string excerpt(const CProgramText &program, int nLine, int nColumn) {
  if (nLine < 1 || size_t(nLine) > program.lines().size() || nColumn < 1) return "";
  const std::wstring sLine = program.lineString(size_t(nLine - 1)).str();
  const std::string sNumber = std::to_string(nLine);
  std::string sOut = " " + std::string(sNumber.size() < 4 ? 4 - sNumber.size() : 0, ' ') + sNumber + " | " +
                     program.lineString(size_t(nLine - 1)).toUtf8() + "\n";
  std::wstring sMarks;
  const size_t nStart = size_t(nColumn - 1);
  // Blanks before the caret keep the line's tabs so that it stands under the token.
  for (size_t i = 0; i < nStart && i < sLine.size(); ++i) sMarks += sLine[i] == L'\t' ? L'\t' : L' ';
  size_t nEnd = nStart;
  while (nEnd < sLine.size() && sLine[nEnd] != L',' && sLine[nEnd] != L')' && sLine[nEnd] != L' ' && sLine[nEnd] != L'\t')
    ++nEnd;
  sMarks += L'^';
  if (nEnd > nStart + 1) sMarks += std::wstring(nEnd - nStart - 1, L'~');
  sOut += std::string(std::max<size_t>(sNumber.size(), 4) + 1, ' ') + " | " + CString(sMarks).toUtf8() + "\n";
  return sOut;
}

}  // namespace

std::string renderText(const TFileFindings &file, const TTextOptions &options) {
  std::string sOut;
  for (const TFinding &finding : file.findings) {
    if (options.bErrorsOnly && finding.nSeverity != TSeverity::kError) continue;
    if (finding.sCode == "RC001") {
      sOut += location(file.sFile, finding.nLine, 0) + ": error: " + finding.sMessage + "\n";
      if (!finding.suggestions.empty())
        sOut += location(file.sFile, finding.nLine, 0) + ": note: did you mean " + wordList(finding.suggestions) + "?\n";
      continue;
    }
    sOut += location(file.sFile, finding.nLine, finding.nColumn) + ": " + severityWord(finding.nSeverity) + ": " +
            finding.sMessage + " [" + finding.sCode + "]\n";
    if (options.bShowSource && file.pProgram) sOut += excerpt(*file.pProgram, finding.nLine, finding.nColumn);
    if (!finding.suggestions.empty())
      sOut += location(file.sFile, finding.nLine, finding.nColumn) + ": note: did you mean " +
              wordList(finding.suggestions) + "?\n";
    for (const TRelatedLocation &related : finding.related) {
      sOut += location(file.sFile, related.nLine, related.nColumn) + ": note: " + related.sMessage + "\n";
      if (options.bShowSource && file.pProgram && related.nColumn > 0)
        sOut += excerpt(*file.pProgram, related.nLine, related.nColumn);
    }
  }
  return sOut;
}
