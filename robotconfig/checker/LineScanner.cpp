#include "robotconfig/checker/LineScanner.h"

#include <string_view>

namespace {

bool bIsBlank(wchar_t c) { return c == L' ' || c == L'\t'; }

// Position of the first non-blank character at or after `pos`.
size_t skipBlanks(std::wstring_view line, size_t pos) {
  while (pos < line.size() && bIsBlank(line[pos])) ++pos;
  return pos;
}

// Moves `pos` past the token that starts there, the way the tokenizer reads it.
void skipToken(std::wstring_view line, size_t &pos) {
  const wchar_t c = line[pos];
  if (c == L'"') {
    const size_t nClose = line.find(L'"', pos + 1);
    pos = nClose == std::wstring_view::npos ? line.size() : nClose + 1;
  } else if (c == L'(' || c == L')') {
    ++pos;
  } else {
    while (pos < line.size() && !bIsBlank(line[pos]) && line[pos] != L',' && line[pos] != L'(' && line[pos] != L')')
      ++pos;
  }
}

// True when the rest of a line is empty or a comment.
bool bIsCommentOrEmpty(std::wstring_view rest) { return rest.empty() || rest.substr(0, 2) == L"//" || rest.substr(0, 2) == L"/*"; }

}  // namespace

TScannedLine scanConfigLine(const CString &sLine) {
  TScannedLine scanned;
  const std::wstring_view line(sLine.str());
  // "#pragma", "config" and "(" come first; the tokenizer has checked them.
  size_t pos = line.find(L'(');
  if (pos == std::wstring_view::npos) return scanned;
  ++pos;
  for (;;) {
    pos = skipBlanks(line, pos);
    if (pos >= line.size()) return scanned;
    const size_t nStart = pos;
    skipToken(line, pos);
    if (line.substr(nStart, pos - nStart) == L")") {
      scanned.bClosed = true;
      const size_t nRest = skipBlanks(line, pos);
      if (!bIsCommentOrEmpty(line.substr(nRest))) scanned.nTrailingColumn = int(nRest) + 1;
      return scanned;
    }
    scanned.columns.push_back(int(nStart) + 1);
    pos = skipBlanks(line, pos);
    if (pos >= line.size()) return scanned;
    if (line[pos] == L',') {
      ++pos;
    } else if (line[pos] != L')') {
      // The tokenizer stops here: a second word without a comma before it.
      const size_t nWordStart = pos;
      skipToken(line, pos);
      if (pos == nWordStart) ++pos;
      scanned.nStrayWordColumn = int(nWordStart) + 1;
      scanned.sStrayWord = std::wstring(line.substr(nWordStart, pos - nWordStart));
      scanned.nStrayAfter = int(scanned.columns.size()) - 1;
      return scanned;
    }
  }
}
