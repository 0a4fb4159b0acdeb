#include "robotconfig/core/ParameterText.h"

#include <string>
#include <string_view>

namespace {

/// Characters that end an unquoted parameter when the tokenizer reads it.
constexpr std::wstring_view kParameterBreaks = L" \t,()";

}  // namespace

CString textAsParameter(const CString &sText) {
  const std::wstring &s = sText.str();
  const bool bNeedsQuotes = s.empty() || s.front() == L'"' || s.find_first_of(kParameterBreaks) != std::wstring::npos;
  if (!bNeedsQuotes || s.find(L'"') != std::wstring::npos) return sText;
  return CString(L'"') + sText + L'"';
}

CString nameAsParameter(const CString &sName) { return sName.IsEmpty() ? sName : textAsParameter(sName); }
