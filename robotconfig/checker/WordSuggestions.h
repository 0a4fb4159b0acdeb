// Closest words: what a checker offers for a word it does not know.
#pragma once

#include <string>
#include <vector>

/// The candidates closest to `sWord`, best first, at most `nMax`: a word equal
/// but for case wins alone; else those within a small edit distance (a swap of
/// two neighbours counts one), or sharing all but the last two characters of
/// the word as a prefix.
std::vector<std::wstring> closestWords(const std::wstring &sWord, const std::vector<std::wstring> &candidates,
                                       size_t nMax = 3);

/// Edit distance of two words with neighbour swaps (optimal string alignment).
size_t editDistance(const std::wstring &a, const std::wstring &b);
