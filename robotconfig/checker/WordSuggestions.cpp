#include "robotconfig/checker/WordSuggestions.h"

#include <algorithm>
#include <cwctype>
#include <tuple>

namespace {

std::wstring lowerCase(const std::wstring &s) {
  std::wstring sLower(s);
  for (wchar_t &c : sLower) c = wchar_t(std::towlower(wint_t(c)));
  return sLower;
}

size_t commonPrefix(const std::wstring &a, const std::wstring &b) {
  size_t n = 0;
  while (n < a.size() && n < b.size() && a[n] == b[n]) ++n;
  return n;
}

}  // namespace

size_t editDistance(const std::wstring &a, const std::wstring &b) {
  const size_t n = a.size(), m = b.size();
  std::vector<std::vector<size_t>> d(n + 1, std::vector<size_t>(m + 1, 0));
  for (size_t i = 0; i <= n; ++i) d[i][0] = i;
  for (size_t j = 0; j <= m; ++j) d[0][j] = j;
  for (size_t i = 1; i <= n; ++i)
    for (size_t j = 1; j <= m; ++j) {
      const size_t nCost = a[i - 1] == b[j - 1] ? 0 : 1;
      d[i][j] = std::min({d[i - 1][j] + 1, d[i][j - 1] + 1, d[i - 1][j - 1] + nCost});
      if (i > 1 && j > 1 && a[i - 1] == b[j - 2] && a[i - 2] == b[j - 1]) d[i][j] = std::min(d[i][j], d[i - 2][j - 2] + 1);
    }
  return d[n][m];
}

std::vector<std::wstring> closestWords(const std::wstring &sWord, const std::vector<std::wstring> &candidates,
                                       size_t nMax) {
  // Words longer than any keyword are no typing slips; comparing them costs for nothing.
  if (sWord.empty() || sWord.size() > 64) return {};
  const std::wstring sLower = lowerCase(sWord);
  for (const std::wstring &sCandidate : candidates)
    if (lowerCase(sCandidate) == sLower) return {sCandidate};
  const size_t nLimit = std::max<size_t>(2, sWord.size() / 4);
  const size_t nPrefixNeeded = std::max<size_t>(6, sWord.size() >= 2 ? sWord.size() - 2 : 0);
  std::vector<std::tuple<size_t, size_t, std::wstring>> ranked;  // distance, -prefix, word
  for (const std::wstring &sCandidate : candidates) {
    const std::wstring sOther = lowerCase(sCandidate);
    const size_t nDistance = editDistance(sLower, sOther);
    const size_t nPrefix = commonPrefix(sLower, sOther);
    if (nDistance <= nLimit || nPrefix >= nPrefixNeeded)
      ranked.emplace_back(nDistance, sOther.size() - std::min(nPrefix, sOther.size()), sCandidate);
  }
  std::sort(ranked.begin(), ranked.end());
  std::vector<std::wstring> best;
  for (const auto &entry : ranked) {
    if (best.size() >= nMax) break;
    if (std::find(best.begin(), best.end(), std::get<2>(entry)) == best.end()) best.push_back(std::get<2>(entry));
  }
  return best;
}
