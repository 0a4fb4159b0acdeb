// Wide-character string of every library interface: a small value type over
// std::wstring with the operations the configuration code needs, printf-style
// formatting with wide arguments, and lossless UTF-8 conversion for file and
// console I/O.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <type_traits>

class CString;

namespace robotconfig_detail {

// One argument of CString::Format, captured by value so that formatting never
// reads through a mismatched vararg.
struct TFormatArg {
  enum class Kind { kSigned, kUnsigned, kChar, kString, kDouble } nKind = Kind::kSigned;
  long long nSigned = 0;
  unsigned long long nUnsigned = 0;
  wchar_t cChar = 0;
  const wchar_t *pzString = nullptr;
  size_t nStringLength = 0;  ///< characters of pzString; strings may hold NULs
  double fDouble = 0.0;
};

TFormatArg makeFormatArg(const CString &s);
TFormatArg makeFormatArg(const std::wstring &s);
TFormatArg makeFormatArg(const wchar_t *pz);
TFormatArg makeFormatArg(wchar_t c);
TFormatArg makeFormatArg(double f);

template <class T>
TFormatArg makeFormatArg(T value) {
  static_assert(std::is_integral_v<T> || std::is_enum_v<T>, "unsupported Format argument type");
  TFormatArg arg;
  if constexpr (std::is_enum_v<T>) {
    arg.nKind = TFormatArg::Kind::kSigned;
    arg.nSigned = static_cast<long long>(value);
  } else if constexpr (std::is_same_v<T, bool>) {
    arg.nKind = TFormatArg::Kind::kSigned;
    arg.nSigned = value ? 1 : 0;
  } else if constexpr (std::is_signed_v<T>) {
    arg.nKind = TFormatArg::Kind::kSigned;
    arg.nSigned = value;
  } else {
    arg.nKind = TFormatArg::Kind::kUnsigned;
    arg.nUnsigned = value;
  }
  arg.nUnsigned = static_cast<unsigned long long>(arg.nKind == TFormatArg::Kind::kSigned ? arg.nSigned : arg.nUnsigned);
  return arg;
}

// Formats `pzFormat` with the captured arguments; a conversion without an
// argument produces nothing.
std::wstring formatWide(const wchar_t *pzFormat, const TFormatArg *pArgs, size_t nArgs);
// formatWide into `out`, replacing its text or appending to it; the format and
// the arguments may point into `out`.
void formatInto(std::wstring &out, bool bAppend, const wchar_t *pzFormat, const TFormatArg *pArgs, size_t nArgs);

}  // namespace robotconfig_detail

class CString {
 public:
  CString() = default;
  CString(const wchar_t *pz) : m_s(pz ? pz : L"") {}
  CString(const wchar_t *pz, int nLength) : m_s(pz ? std::wstring(pz, nLength < 0 ? 0 : size_t(nLength)) : std::wstring()) {}
  CString(const std::wstring &s) : m_s(s) {}
  CString(std::wstring &&s) : m_s(std::move(s)) {}
  CString(wchar_t ch, int nRepeat = 1) : m_s(nRepeat < 0 ? 0 : size_t(nRepeat), ch) {}

  /// Number of characters.
  int GetLength() const { return static_cast<int>(m_s.size()); }
  bool IsEmpty() const { return m_s.empty(); }
  void Empty() { m_s.clear(); }

  /// Character at `nIndex`; 0 when out of range.
  wchar_t GetAt(int nIndex) const { return (nIndex >= 0 && size_t(nIndex) < m_s.size()) ? m_s[size_t(nIndex)] : L'\0'; }
  wchar_t operator[](int nIndex) const { return GetAt(nIndex); }
  /// Replaces the character at `nIndex`; ignored when out of range.
  void SetAt(int nIndex, wchar_t ch) {
    if (nIndex >= 0 && size_t(nIndex) < m_s.size()) m_s[size_t(nIndex)] = ch;
  }

  const wchar_t *GetString() const { return m_s.c_str(); }
  /// Replaces the text with `nLength` characters at `pz`, reusing the storage.
  void SetString(const wchar_t *pz, int nLength) { m_s.assign(pz, nLength < 0 ? 0 : size_t(nLength)); }
  const std::wstring &str() const { return m_s; }

  /// Case-sensitive three-way comparison (<0, 0, >0).
  int Compare(const wchar_t *pz) const;
  /// Three-way comparison ignoring case.
  int CompareNoCase(const wchar_t *pz) const;

  /// Index of the first occurrence at or after `nStart`, -1 when absent.
  int Find(const wchar_t *pzSub, int nStart = 0) const;
  int Find(wchar_t ch, int nStart = 0) const;
  /// Replaces every occurrence; returns the number replaced.
  int Replace(const wchar_t *pzOld, const wchar_t *pzNew);
  int Replace(wchar_t chOld, wchar_t chNew);

  /// Removes leading and trailing white space.
  CString &Trim();
  CString &TrimLeft();
  CString &TrimRight();

  CString Left(int nCount) const;
  CString Right(int nCount) const;
  CString Mid(int nFirst) const;
  CString Mid(int nFirst, int nCount) const;

  CString &operator+=(const CString &s) { m_s += s.m_s; return *this; }
  CString &operator+=(const wchar_t *pz) { if (pz) m_s += pz; return *this; }
  CString &operator+=(wchar_t ch) { m_s += ch; return *this; }

  /// printf-style formatting with wide arguments: %s takes a wide string
  /// (CString or const wchar_t*), %c a wide character, %d/%i/%u/%x integers;
  /// flags '-' and '0', width and precision are honoured.
  template <class... Args>
  void Format(const wchar_t *pzFormat, const Args &...args) {
    robotconfig_detail::TFormatArg list[sizeof...(Args) + 1] = {robotconfig_detail::makeFormatArg(args)...};
    robotconfig_detail::formatInto(m_s, false, pzFormat, list, sizeof...(Args));
  }
  template <class... Args>
  void AppendFormat(const wchar_t *pzFormat, const Args &...args) {
    robotconfig_detail::TFormatArg list[sizeof...(Args) + 1] = {robotconfig_detail::makeFormatArg(args)...};
    robotconfig_detail::formatInto(m_s, true, pzFormat, list, sizeof...(Args));
  }

  /// UTF-8 encoding; characters that stood for undecodable bytes turn back
  /// into those bytes.
  std::string toUtf8() const;
  /// Decodes UTF-8; each byte that is not valid UTF-8 is kept as a stand-in
  /// character (U+DC80..U+DCFF) so that toUtf8() restores it exactly.
  static CString fromUtf8(std::string_view bytes);
  /// fromUtf8 into `sOut`, reusing its storage.
  static void decodeUtf8(std::string_view bytes, CString &sOut);
  /// Appends the UTF-8 encoding of one character as toUtf8() writes it.
  static void appendUtf8(std::string &out, wchar_t wc);

 private:
  std::wstring m_s;
};

inline bool operator==(const CString &a, const CString &b) { return a.str() == b.str(); }
inline bool operator==(const CString &a, const wchar_t *b) { return a.Compare(b) == 0; }
inline bool operator==(const wchar_t *a, const CString &b) { return b.Compare(a) == 0; }
inline bool operator!=(const CString &a, const CString &b) { return !(a == b); }
inline bool operator!=(const CString &a, const wchar_t *b) { return !(a == b); }
inline bool operator!=(const wchar_t *a, const CString &b) { return !(a == b); }
inline bool operator<(const CString &a, const CString &b) { return a.str() < b.str(); }
inline CString operator+(const CString &a, const CString &b) { CString r(a); r += b; return r; }
inline CString operator+(const CString &a, const wchar_t *b) { CString r(a); r += b; return r; }
inline CString operator+(const wchar_t *a, const CString &b) { CString r(a); r += b; return r; }
inline CString operator+(const CString &a, wchar_t b) { CString r(a); r += b; return r; }
inline CString operator+(wchar_t a, const CString &b) { CString r(a); r += b; return r; }
