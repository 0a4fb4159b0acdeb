#include "cli/Terminal.h"

#include <unistd.h>

#include <cstdlib>

namespace {

bool g_bColorStdout = false;
bool g_bColorStderr = false;

constexpr const char *kReset = "\033[0m";

// The colour of each severity word, as compilers show them.
struct TSeverityColour {
  const char *pzWord;
  const char *pzColour;
};
constexpr TSeverityColour kSeverityColours[] = {
    {": error: ", "\033[1;31m"},
    {": warning: ", "\033[1;35m"},
    {": note: ", "\033[1;36m"},
};

}  // namespace

void setColorWhen(TColorWhen nWhen) {
  const char *pzNoColor = std::getenv("NO_COLOR");
  const bool bAllowed = !(pzNoColor && *pzNoColor);
  g_bColorStdout = nWhen == TColorWhen::kAlways || (nWhen == TColorWhen::kAuto && bAllowed && isatty(STDOUT_FILENO));
  g_bColorStderr = nWhen == TColorWhen::kAlways || (nWhen == TColorWhen::kAuto && bAllowed && isatty(STDERR_FILENO));
}

std::string colouredDiagnostics(const std::string &sText) {
  if (!g_bColorStderr) return sText;
  std::string sOut;
  size_t nStart = 0;
  while (nStart < sText.size()) {
    size_t nEnd = sText.find('\n', nStart);
    nEnd = nEnd == std::string::npos ? sText.size() : nEnd + 1;
    std::string sLine = sText.substr(nStart, nEnd - nStart);
    for (const TSeverityColour &severity : kSeverityColours) {
      const size_t nAt = sLine.find(severity.pzWord);
      if (nAt == std::string::npos) continue;
      sLine.insert(nAt + std::char_traits<char>::length(severity.pzWord) - 1, kReset);
      sLine.insert(nAt + 2, severity.pzColour);
      break;
    }
    sOut += sLine;
    nStart = nEnd;
  }
  return sOut;
}

std::string colouredDiff(const std::string &sDiff) {
  if (!g_bColorStdout) return sDiff;
  std::string sOut;
  size_t nStart = 0;
  while (nStart < sDiff.size()) {
    size_t nEnd = sDiff.find('\n', nStart);
    nEnd = nEnd == std::string::npos ? sDiff.size() : nEnd;
    const std::string sLine = sDiff.substr(nStart, nEnd - nStart);
    const char *pzColour = nullptr;
    if (sLine.rfind("---", 0) == 0 || sLine.rfind("+++", 0) == 0) pzColour = "\033[1m";
    else if (sLine.rfind("@@", 0) == 0) pzColour = "\033[36m";
    else if (!sLine.empty() && sLine[0] == '-') pzColour = "\033[31m";
    else if (!sLine.empty() && sLine[0] == '+') pzColour = "\033[32m";
    sOut += pzColour ? pzColour + sLine + kReset : sLine;
    if (nEnd < sDiff.size()) sOut += '\n';
    nStart = nEnd + 1;
  }
  return sOut;
}
