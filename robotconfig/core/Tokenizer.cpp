// Classification of one source line: finds the "#pragma config(...)" lines and
// splits them into keyword and parameters, and recognises the marker comment
// lines that frame the generated configuration block.
//
// Tokens are views into the line; only stored tokens are copied, so a line of
// any length and content costs at most kMaxConfigTokens string copies.
#include <algorithm>
#include <cstddef>
#include <string_view>

#include "robotconfig/core/RobotConfiguration.h"

namespace {

using TLineView = std::wstring_view;

// Where the reader stands in the line; decides what the next token means.
enum class TTokenizerState {
  kFirstToken,        // nothing read yet
  kAfterPragma,       // "#pragma" read, "config" expected
  kAfterConfig,       // "config" read, "(" expected
  kKeyword,           // "(" read, the keyword comes next
  kParameters,        // keyword stored, parameters follow
  kAfterStartMarker,  // the first token was the bare start marker
  kMarkerText,        // reading the text of a marker comment line
};

/// True for the only two characters that separate tokens: space and tab.
inline bool isBlank(wchar_t c) { return c == L' ' || c == L'\t'; }

/// Position of the first non-blank character at or after `pos` (the line's length if none).
size_t skipBlanks(TLineView line, size_t pos) {
  while (pos < line.size() && isBlank(line[pos])) ++pos;
  return pos;
}

/// Reads the token that starts at `pos` (which must be inside the line),
/// moves `pos` past what the token consumed, and returns the token cut to
/// kMaxConfigTokenLength characters; `bCut` tells whether it was longer.
TLineView readToken(TLineView line, size_t &pos, bool &bCut) {
  const size_t nLength = line.size();
  size_t nFirst = pos;
  size_t nEnd = pos;
  const wchar_t c = line[pos];
  if (c == L'"') {
    // Quoted: everything up to the closing quote, which may be missing.
    nFirst = pos + 1;
    const size_t nClose = line.find(L'"', nFirst);
    nEnd = nClose == TLineView::npos ? nLength : nClose;
    pos = nClose == TLineView::npos ? nLength : nClose + 1;
  } else if (c == L'(' || c == L')') {
    nEnd = ++pos;
  } else {
    // The stopping character is left for the caller; a comma here gives an empty token.
    while (pos < nLength) {
      const wchar_t ch = line[pos];
      if (isBlank(ch) || ch == L',' || ch == L'(' || ch == L')') break;
      ++pos;
    }
    nEnd = pos;
  }
  bCut = nEnd - nFirst > static_cast<size_t>(kMaxConfigTokenLength);
  return line.substr(nFirst, std::min(nEnd - nFirst, static_cast<size_t>(kMaxConfigTokenLength)));
}

/// True when `text` begins with `prefix`.
inline bool startsWith(TLineView text, TLineView prefix) { return text.substr(0, prefix.size()) == prefix; }

/// Copies `token` into slot `nIndex` of `parms`.
inline void storeToken(TTokenizedConfigParms &parms, int nIndex, TLineView token) {
  parms.sParms[static_cast<size_t>(nIndex)].SetString(token.data(), static_cast<int>(token.size()));
}

}  // namespace

TTokenizedLineType CRobotConfigurationBasic::nTokenizeLine(const CString &sLine, TTokenizedConfigParms &parms) {
  bool bCut = false;
  return nTokenizeLineReportingCuts(sLine, parms, bCut);
}

TTokenizedLineType CRobotConfigurationBasic::nTokenizeLineReportingCuts(const CString &sLine,
                                                                        TTokenizedConfigParms &parms, bool &bCut) {
  bCut = false;
  const TLineView line(sLine.str());
  const TLineView startMarker(sConfigStartMarker);
  const TLineView endMarker(sConfigEndMarker);

  size_t pos = skipBlanks(line, 0);
  if (pos == line.size()) return lineTypeBlank;

  TTokenizerState state = TTokenizerState::kFirstToken;
  int n = 0;  // tokens stored
  bool bLastTokenIsCloseParen = false;

  // Nothing is returned from inside the loop once a token is stored, so the
  // tokens go straight into `parms` and early results leave it untouched.
  for (;;) {
    pos = skipBlanks(line, pos);
    if (pos == line.size()) break;
    bool bTokenCut = false;
    const TLineView token = readToken(line, pos, bTokenCut);
    bLastTokenIsCloseParen = token == L")";
    if (state == TTokenizerState::kKeyword || state == TTokenizerState::kParameters) bCut = bCut || bTokenCut;

    switch (state) {
      case TTokenizerState::kFirstToken:
        if (startsWith(token, startMarker)) {
          if (token.size() == startMarker.size()) {
            state = TTokenizerState::kAfterStartMarker;
          } else {
            const TLineView rest = token.substr(startMarker.size());
            if (startsWith(rest, endMarker)) return lineTypeNoTokens;
            storeToken(parms, n++, rest);
            state = TTokenizerState::kMarkerText;
          }
        } else if (token == L"#pragma") {
          state = TTokenizerState::kAfterPragma;
        } else {
          // A statement with the empty-block marker behind it on the same line.
          return line.find(TLineView(sConfigEmptyBlockMarker), 1) != TLineView::npos ? lineTypeContainsMarker
                                                                                     : lineTypeOther;
        }
        break;
      case TTokenizerState::kAfterPragma:
        if (token != L"config" && token != L"Config") return lineTypeOther;
        state = TTokenizerState::kAfterConfig;
        break;
      case TTokenizerState::kAfterConfig:
        if (token != L"(") return lineTypeOther;
        state = TTokenizerState::kKeyword;
        break;
      case TTokenizerState::kKeyword:
        storeToken(parms, n++, token);
        state = TTokenizerState::kParameters;
        break;
      case TTokenizerState::kParameters:
        storeToken(parms, n++, token);
        break;
      case TTokenizerState::kAfterStartMarker:
        n = 0;
        state = TTokenizerState::kMarkerText;
        if (startsWith(token, endMarker)) return lineTypeNoTokens;
        storeToken(parms, n++, token);
        break;
      case TTokenizerState::kMarkerText:
        if (!startsWith(token, endMarker)) storeToken(parms, n++, token);
        break;
    }

    // Separator: a comma is consumed, a ')' is read as the next token, and
    // anything else ends the line once something has been stored.
    pos = skipBlanks(line, pos);
    if (pos == line.size()) break;
    const wchar_t next = line[pos];
    if (next == L',')
      ++pos;
    else if (next != L')' && n > 0)
      break;
    if (n >= kMaxConfigTokens) {
      // Words after the last one stored are dropped unless only ")" follows.
      pos = skipBlanks(line, pos);
      if (state == TTokenizerState::kParameters && pos < line.size() && line[pos] != L')') bCut = true;
      break;
    }
  }

  // The closing parenthesis is read as a token but is not a parameter.
  if (bLastTokenIsCloseParen && n > 0) {
    --n;
    parms.sParms[static_cast<size_t>(n)].Empty();
  }
  parms.nNumbOfParms = n;
  if (n == 0) return lineTypeNoTokens;
  for (int i = n; i < kMaxConfigTokens; ++i) parms.sParms[static_cast<size_t>(i)].Empty();
  return state == TTokenizerState::kMarkerText ? lineTypeMarkerComment : lineTypeConfigPragma;
}
