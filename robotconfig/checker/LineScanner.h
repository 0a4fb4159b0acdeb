// Where the tokens of a configuration line stand, and what the tokenizer
// forgives in it: a missing ')', text after ')', two words in one parameter.
#pragma once

#include <string>
#include <vector>

#include "robotconfig/host/CString.h"

/// The layout of one "#pragma config(...)" line.
struct TScannedLine {
  /// 1-based column of each token the tokenizer stores: 0 is the keyword,
  /// n is parameter n (an empty parameter stands at its comma).
  std::vector<int> columns;
  bool bClosed = false;      ///< a ')' ends the parameters
  int nTrailingColumn = 0;   ///< column of text after ')' (comments aside); 0 when none
  int nStrayWordColumn = 0;  ///< column of a word that follows another without a comma; 0 when none
  std::wstring sStrayWord;   ///< that word
  int nStrayAfter = 0;       ///< index of the parameter the stray word follows
};

/// Scans a line that the tokenizer classified as a configuration line.
TScannedLine scanConfigLine(const CString &sLine);
