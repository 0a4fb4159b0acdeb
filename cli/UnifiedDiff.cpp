#include "cli/UnifiedDiff.h"

#include <algorithm>
#include <string_view>
#include <vector>

namespace {

constexpr size_t kContext = 3;
// Beyond this many cells the changed middle is shown as removed, then added:
// still a correct diff, without quadratic time on a huge change.
constexpr size_t kMaxTableCells = size_t(1) << 24;

struct TOperation {
  char cKind;   ///< ' ', '-' or '+'
  size_t nOld;  ///< line in the old text (for ' ' and '-')
  size_t nNew;  ///< line in the new text (for ' ' and '+')
};

// The lines of a text, each with its line end.
std::vector<std::string_view> splitLines(const std::string &sText) {
  std::vector<std::string_view> lines;
  size_t nStart = 0;
  while (nStart < sText.size()) {
    size_t nEnd = sText.find('\n', nStart);
    nEnd = nEnd == std::string::npos ? sText.size() : nEnd + 1;
    lines.emplace_back(sText.data() + nStart, nEnd - nStart);
    nStart = nEnd;
  }
  return lines;
}

// The edit script of a[nA0, nA1) against b[nB0, nB1) by longest common subsequence.
void diffMiddle(const std::vector<std::string_view> &a, const std::vector<std::string_view> &b, size_t nA0, size_t nA1,
                size_t nB0, size_t nB1, std::vector<TOperation> &ops) {
  const size_t n = nA1 - nA0, m = nB1 - nB0;
  if (n == 0 || m == 0 || (n + 1) * (m + 1) > kMaxTableCells) {
    for (size_t i = nA0; i < nA1; ++i) ops.push_back({'-', i, 0});
    for (size_t j = nB0; j < nB1; ++j) ops.push_back({'+', 0, j});
    return;
  }
  // lcs[i][j]: longest common run of a[i..] and b[j..].
  std::vector<uint32_t> lcs((n + 1) * (m + 1), 0);
  auto at = [&](size_t i, size_t j) -> uint32_t & { return lcs[i * (m + 1) + j]; };
  for (size_t i = n; i-- > 0;)
    for (size_t j = m; j-- > 0;)
      at(i, j) = a[nA0 + i] == b[nB0 + j] ? at(i + 1, j + 1) + 1 : std::max(at(i + 1, j), at(i, j + 1));
  size_t i = 0, j = 0;
  while (i < n || j < m) {
    if (i < n && j < m && a[nA0 + i] == b[nB0 + j]) {
      ops.push_back({' ', nA0 + i++, nB0 + j++});
    } else if (i < n && (j == m || at(i + 1, j) >= at(i, j + 1))) {
      ops.push_back({'-', nA0 + i++, 0});  // removals before additions, as diff -u shows them
    } else {
      ops.push_back({'+', 0, nB0 + j++});
    }
  }
}

// One line of the diff: its mark, its text, and a note when it has no line end.
void appendLine(std::string &sOut, char cKind, std::string_view sLine) {
  sOut += cKind;
  if (!sLine.empty() && sLine.back() == '\n') {
    sOut += sLine;
  } else {
    sOut += sLine;
    sOut += "\n\\ No newline at end of file\n";
  }
}

// "start,count" of a hunk side, as diff -u writes it.
std::string range(size_t nFirst, size_t nCount) {
  return std::to_string(nCount == 0 ? nFirst : nFirst + 1) + (nCount == 1 ? "" : "," + std::to_string(nCount));
}

}  // namespace

std::string unifiedDiff(const std::string &sOld, const std::string &sNew, const std::string &sName) {
  if (sOld == sNew) return "";
  const std::vector<std::string_view> a = splitLines(sOld), b = splitLines(sNew);
  size_t nPrefix = 0;
  while (nPrefix < a.size() && nPrefix < b.size() && a[nPrefix] == b[nPrefix]) ++nPrefix;
  size_t nSuffix = 0;
  while (nSuffix < a.size() - nPrefix && nSuffix < b.size() - nPrefix &&
         a[a.size() - 1 - nSuffix] == b[b.size() - 1 - nSuffix])
    ++nSuffix;
  std::vector<TOperation> ops;
  for (size_t i = 0; i < nPrefix; ++i) ops.push_back({' ', i, i});
  diffMiddle(a, b, nPrefix, a.size() - nSuffix, nPrefix, b.size() - nSuffix, ops);
  for (size_t k = nSuffix; k-- > 0;) ops.push_back({' ', a.size() - 1 - k, b.size() - 1 - k});

  std::string sOut = "--- a/" + sName + "\n+++ b/" + sName + "\n";
  size_t nOp = 0;
  while (nOp < ops.size()) {
    while (nOp < ops.size() && ops[nOp].cKind == ' ') ++nOp;
    if (nOp == ops.size()) break;
    // A hunk: from kContext lines before this change to kContext lines after
    // the last change that lies within 2 * kContext equal lines of the one before.
    const size_t nBegin = nOp >= kContext ? nOp - kContext : 0;
    size_t nEnd = nOp;
    size_t nEqualRun = 0;
    for (size_t k = nOp; k < ops.size(); ++k) {
      if (ops[k].cKind != ' ') {
        nEnd = k + 1;
        nEqualRun = 0;
      } else if (++nEqualRun > 2 * kContext) {
        break;
      }
    }
    const size_t nStop = std::min(ops.size(), nEnd + kContext);
    size_t nOldFirst = 0, nNewFirst = 0, nOldCount = 0, nNewCount = 0;
    bool bOldSeen = false, bNewSeen = false;
    for (size_t k = nBegin; k < nStop; ++k) {
      if (ops[k].cKind != '+') {
        if (!bOldSeen) nOldFirst = ops[k].nOld, bOldSeen = true;
        ++nOldCount;
      }
      if (ops[k].cKind != '-') {
        if (!bNewSeen) nNewFirst = ops[k].nNew, bNewSeen = true;
        ++nNewCount;
      }
    }
    // A side without lines in the hunk is an empty text (a hunk has context
    // otherwise), which diff -u numbers 0,0.
    sOut += "@@ -" + range(nOldFirst, nOldCount) + " +" + range(nNewFirst, nNewCount) + " @@\n";
    for (size_t k = nBegin; k < nStop; ++k)
      appendLine(sOut, ops[k].cKind, ops[k].cKind == '+' ? b[ops[k].nNew] : a[ops[k].nOld]);
    nOp = nStop;
  }
  return sOut;
}
