#include "robotconfig/host/CString.h"

#include <algorithm>
#include <cwchar>
#include <cwctype>
#include <functional>

namespace robotconfig_detail {

TFormatArg makeFormatArg(const CString &s) { return makeFormatArg(s.str()); }

TFormatArg makeFormatArg(const std::wstring &s) {
  TFormatArg arg;
  arg.nKind = TFormatArg::Kind::kString;
  arg.pzString = s.c_str();
  arg.nStringLength = s.size();
  return arg;
}

TFormatArg makeFormatArg(const wchar_t *pz) {
  TFormatArg arg;
  arg.nKind = TFormatArg::Kind::kString;
  arg.pzString = pz;
  arg.nStringLength = pz ? std::wcslen(pz) : 0;
  return arg;
}

TFormatArg makeFormatArg(wchar_t c) {
  TFormatArg arg;
  arg.nKind = TFormatArg::Kind::kChar;
  arg.cChar = c;
  arg.nSigned = static_cast<long long>(c);
  arg.nUnsigned = static_cast<unsigned long long>(c);
  return arg;
}

TFormatArg makeFormatArg(double f) {
  TFormatArg arg;
  arg.nKind = TFormatArg::Kind::kDouble;
  arg.fDouble = f;
  arg.nSigned = static_cast<long long>(f);
  arg.nUnsigned = static_cast<unsigned long long>(arg.nSigned);
  return arg;
}

namespace {

struct TConversionLayout {
  bool bLeft = false;
  bool bZero = false;
  bool bPlus = false;
  int nWidth = -1;
  int nPrecision = -1;
};

// Appends `body` padded to the layout's width; zero padding goes after a sign.
void appendPadded(std::wstring &out, std::wstring_view body, const TConversionLayout &layout, bool bNumeric) {
  const int nPad = layout.nWidth > static_cast<int>(body.size()) ? layout.nWidth - static_cast<int>(body.size()) : 0;
  if (layout.bLeft) {
    out += body;
    out.append(size_t(nPad), L' ');
  } else if (layout.bZero && bNumeric && layout.nPrecision < 0) {
    size_t nSign = (!body.empty() && (body[0] == L'-' || body[0] == L'+')) ? 1 : 0;
    out += body.substr(0, nSign);
    out.append(size_t(nPad), L'0');
    out += body.substr(nSign);
  } else {
    out.append(size_t(nPad), L' ');
    out += body;
  }
}

// Sets `s` to `sign` (when not 0) and the digits of `value` in `base`, at least `nMinDigits` of them.
void setDigits(std::wstring &s, wchar_t sign, unsigned long long value, unsigned base, bool bUpper, int nMinDigits) {
  const wchar_t *pzDigits = bUpper ? L"0123456789ABCDEF" : L"0123456789abcdef";
  wchar_t buffer[64];
  wchar_t *pEnd = buffer + 64;
  wchar_t *p = pEnd;
  while (value != 0) {
    *--p = pzDigits[value % base];
    value /= base;
  }
  const size_t nDigits = size_t(pEnd - p);
  const size_t nMin = nMinDigits < 0 ? 1 : size_t(nMinDigits);
  s.clear();
  if (sign) s += sign;
  if (nDigits < nMin) s.append(nMin - nDigits, L'0');
  s.append(p, nDigits);
}

std::wstring stringOf(const TFormatArg &arg) {
  switch (arg.nKind) {
    case TFormatArg::Kind::kString:
      return arg.pzString ? std::wstring(arg.pzString, arg.nStringLength) : std::wstring(L"(null)");
    case TFormatArg::Kind::kChar:
      return std::wstring(1, arg.cChar);
    case TFormatArg::Kind::kSigned:
      return std::to_wstring(arg.nSigned);
    case TFormatArg::Kind::kUnsigned:
      return std::to_wstring(arg.nUnsigned);
    case TFormatArg::Kind::kDouble:
      return std::to_wstring(arg.fDouble);
  }
  return std::wstring();
}

// The text of a string argument, without copying it.
std::wstring_view stringViewOf(const TFormatArg &arg) {
  return arg.pzString ? std::wstring_view(arg.pzString, arg.nStringLength) : std::wstring_view(L"(null)");
}

// Appends `pzFormat` formatted with the arguments, none of which points into `out`.
void appendConversions(std::wstring &out, const wchar_t *pzFormat, const TFormatArg *pArgs, size_t nArgs) {
  if (!pzFormat) return;
  std::wstring body;  // a number's text, reused by every conversion
  size_t nNext = 0;
  const wchar_t *p = pzFormat;
  while (*p) {
    if (*p != L'%') {
      const wchar_t *pText = p;
      while (*p && *p != L'%') ++p;
      out.append(pText, size_t(p - pText));
      continue;
    }
    const wchar_t *pStart = p++;
    if (*p == L'%') {
      out += L'%';
      ++p;
      continue;
    }
    TConversionLayout layout;
    for (;; ++p) {
      if (*p == L'-') layout.bLeft = true;
      else if (*p == L'0') layout.bZero = true;
      else if (*p == L'+') layout.bPlus = true;
      else if (*p == L' ' || *p == L'#') continue;
      else break;
    }
    while (*p >= L'0' && *p <= L'9') layout.nWidth = (layout.nWidth < 0 ? 0 : layout.nWidth * 10) + (*p++ - L'0');
    if (*p == L'.') {
      ++p;
      layout.nPrecision = 0;
      while (*p >= L'0' && *p <= L'9') layout.nPrecision = layout.nPrecision * 10 + (*p++ - L'0');
    }
    while (*p == L'l' || *p == L'h' || *p == L'L' || *p == L'z' || *p == L'j' || *p == L't') ++p;
    const wchar_t conv = *p;
    if (conv == L'\0') {
      out.append(pStart);  // an unfinished conversion is copied as text
      break;
    }
    ++p;
    const bool bKnown = conv == L's' || conv == L'S' || conv == L'c' || conv == L'C' || conv == L'd' ||
                        conv == L'i' || conv == L'u' || conv == L'x' || conv == L'X' || conv == L'f';
    if (!bKnown) {
      out.append(pStart, p);
      continue;
    }
    if (nNext >= nArgs) continue;  // missing argument: nothing is printed
    const TFormatArg &arg = pArgs[nNext++];
    switch (conv) {
      case L's':
      case L'S': {
        if (arg.nKind != TFormatArg::Kind::kString) {
          body = stringOf(arg);
          if (layout.nPrecision >= 0 && static_cast<int>(body.size()) > layout.nPrecision) body.resize(size_t(layout.nPrecision));
          appendPadded(out, body, layout, false);
          break;
        }
        std::wstring_view text = stringViewOf(arg);
        if (layout.nPrecision >= 0 && static_cast<int>(text.size()) > layout.nPrecision) text = text.substr(0, size_t(layout.nPrecision));
        appendPadded(out, text, layout, false);
        break;
      }
      case L'c':
      case L'C': {
        wchar_t c = arg.nKind == TFormatArg::Kind::kChar       ? arg.cChar
                    : arg.nKind == TFormatArg::Kind::kUnsigned ? static_cast<wchar_t>(arg.nUnsigned)
                                                               : static_cast<wchar_t>(arg.nSigned);
        if (arg.nKind == TFormatArg::Kind::kString) c = (arg.pzString && *arg.pzString) ? *arg.pzString : L'\0';
        appendPadded(out, std::wstring_view(&c, 1), layout, false);
        break;
      }
      case L'd':
      case L'i': {
        if (arg.nKind == TFormatArg::Kind::kString) {
          appendPadded(out, stringViewOf(arg), layout, false);
          break;
        }
        const long long v = arg.nKind == TFormatArg::Kind::kUnsigned ? static_cast<long long>(arg.nUnsigned) : arg.nSigned;
        const unsigned long long mag = v < 0 ? 0ULL - static_cast<unsigned long long>(v) : static_cast<unsigned long long>(v);
        setDigits(body, v < 0 ? L'-' : layout.bPlus ? L'+' : L'\0', mag, 10, false, layout.nPrecision);
        appendPadded(out, body, layout, true);
        break;
      }
      case L'u':
      case L'x':
      case L'X': {
        if (arg.nKind == TFormatArg::Kind::kString) {
          appendPadded(out, stringViewOf(arg), layout, false);
          break;
        }
        // Like C, a negative int printed unsigned shows its 32-bit pattern.
        unsigned long long v = arg.nUnsigned;
        if (arg.nKind != TFormatArg::Kind::kUnsigned && arg.nSigned < 0 && arg.nSigned >= INT32_MIN)
          v = static_cast<uint32_t>(static_cast<int32_t>(arg.nSigned));
        setDigits(body, L'\0', v, conv == L'u' ? 10 : 16, conv == L'X', layout.nPrecision);
        appendPadded(out, body, layout, true);
        break;
      }
      default:
        appendPadded(out, stringOf(arg), layout, true);
        break;
    }
  }
}

}  // namespace

std::wstring formatWide(const wchar_t *pzFormat, const TFormatArg *pArgs, size_t nArgs) {
  std::wstring out;
  appendConversions(out, pzFormat, pArgs, nArgs);
  return out;
}

void formatInto(std::wstring &out, bool bAppend, const wchar_t *pzFormat, const TFormatArg *pArgs, size_t nArgs) {
  // An argument may be `out` itself (or the format may be), which must not change while it is read.
  const wchar_t *pFirst = out.data();
  const wchar_t *pLast = pFirst + out.capacity();
  auto inside = [pFirst, pLast](const wchar_t *p) {
    return p && !std::less<const wchar_t *>()(p, pFirst) && !std::less<const wchar_t *>()(pLast, p);
  };
  bool bAliased = inside(pzFormat);
  for (size_t i = 0; i < nArgs; ++i)
    if (pArgs[i].nKind == TFormatArg::Kind::kString && inside(pArgs[i].pzString)) bAliased = true;
  if (bAliased) {
    std::wstring sText = formatWide(pzFormat, pArgs, nArgs);
    if (bAppend) out += sText;
    else out = std::move(sText);
    return;
  }
  if (!bAppend) out.clear();
  appendConversions(out, pzFormat, pArgs, nArgs);
}

}  // namespace robotconfig_detail

int CString::Compare(const wchar_t *pz) const { return m_s.compare(pz ? pz : L""); }

int CString::CompareNoCase(const wchar_t *pz) const {
  // The whole string counts: a NUL inside it must not end the comparison early.
  const wchar_t *b = pz ? pz : L"";
  for (size_t i = 0;; ++i, ++b) {
    if (i == m_s.size()) return *b == 0 ? 0 : -1;
    if (*b == 0) return 1;
    const wint_t ca = std::towlower(static_cast<wint_t>(m_s[i]));
    const wint_t cb = std::towlower(static_cast<wint_t>(*b));
    if (ca != cb) return ca < cb ? -1 : 1;
  }
}

int CString::Find(const wchar_t *pzSub, int nStart) const {
  if (nStart < 0 || size_t(nStart) > m_s.size()) return -1;
  const size_t n = m_s.find(pzSub ? pzSub : L"", size_t(nStart));
  return n == std::wstring::npos ? -1 : static_cast<int>(n);
}

int CString::Find(wchar_t ch, int nStart) const {
  if (nStart < 0 || size_t(nStart) > m_s.size()) return -1;
  const size_t n = m_s.find(ch, size_t(nStart));
  return n == std::wstring::npos ? -1 : static_cast<int>(n);
}

int CString::Replace(const wchar_t *pzOld, const wchar_t *pzNew) {
  const std::wstring sOld(pzOld ? pzOld : L"");
  const std::wstring sNew(pzNew ? pzNew : L"");
  if (sOld.empty()) return 0;
  int nCount = 0;
  for (size_t pos = m_s.find(sOld); pos != std::wstring::npos; pos = m_s.find(sOld, pos + sNew.size())) {
    m_s.replace(pos, sOld.size(), sNew);
    ++nCount;
  }
  return nCount;
}

int CString::Replace(wchar_t chOld, wchar_t chNew) {
  int nCount = 0;
  for (wchar_t &c : m_s)
    if (c == chOld) {
      c = chNew;
      ++nCount;
    }
  return nCount;
}

CString &CString::TrimLeft() {
  size_t n = 0;
  while (n < m_s.size() && std::iswspace(static_cast<wint_t>(m_s[n]))) ++n;
  m_s.erase(0, n);
  return *this;
}

CString &CString::TrimRight() {
  size_t n = m_s.size();
  while (n > 0 && std::iswspace(static_cast<wint_t>(m_s[n - 1]))) --n;
  m_s.resize(n);
  return *this;
}

CString &CString::Trim() { return TrimRight().TrimLeft(); }

CString CString::Left(int nCount) const {
  if (nCount <= 0) return CString();
  return CString(m_s.substr(0, size_t(nCount)));
}

CString CString::Right(int nCount) const {
  if (nCount <= 0) return CString();
  const size_t n = std::min(size_t(nCount), m_s.size());
  return CString(m_s.substr(m_s.size() - n));
}

CString CString::Mid(int nFirst) const { return Mid(nFirst, GetLength()); }

CString CString::Mid(int nFirst, int nCount) const {
  if (nFirst < 0) nFirst = 0;
  if (nCount <= 0 || size_t(nFirst) >= m_s.size()) return CString();
  return CString(m_s.substr(size_t(nFirst), size_t(nCount)));
}

void CString::appendUtf8(std::string &out, wchar_t wc) {
  const uint32_t c = static_cast<uint32_t>(wc);
  if (c < 0x80) {
    out += static_cast<char>(c);
  } else if (c >= 0xDC80 && c <= 0xDCFF) {
    out += static_cast<char>(c - 0xDC00);  // a byte kept from undecodable input
  } else if (c < 0x800) {
    out += static_cast<char>(0xC0 | (c >> 6));
    out += static_cast<char>(0x80 | (c & 0x3F));
  } else if (c < 0x10000) {
    out += static_cast<char>(0xE0 | (c >> 12));
    out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (c & 0x3F));
  } else if (c < 0x110000) {
    out += static_cast<char>(0xF0 | (c >> 18));
    out += static_cast<char>(0x80 | ((c >> 12) & 0x3F));
    out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (c & 0x3F));
  } else {
    out += "\xEF\xBF\xBD";  // not a Unicode scalar: replacement character
  }
}

std::string CString::toUtf8() const {
  std::string out;
  out.reserve(m_s.size());
  const size_t n = m_s.size();
  for (size_t i = 0; i < n;) {
    if (static_cast<uint32_t>(m_s[i]) < 0x80) {  // an ASCII run is copied a byte per character
      size_t j = i + 1;
      while (j < n && static_cast<uint32_t>(m_s[j]) < 0x80) ++j;
      const size_t nAt = out.size();
      out.resize(nAt + (j - i));
      char *pOut = &out[nAt];
      for (; i < j; ++i) *pOut++ = static_cast<char>(m_s[i]);
      continue;
    }
    appendUtf8(out, m_s[i++]);
  }
  return out;
}

CString CString::fromUtf8(std::string_view bytes) {
  CString s;
  decodeUtf8(bytes, s);
  return s;
}

void CString::decodeUtf8(std::string_view bytes, CString &sOut) {
  std::wstring &out = sOut.m_s;
  out.clear();
  out.reserve(bytes.size());
  const size_t n = bytes.size();
  size_t i = 0;
  while (i < n) {
    const unsigned char b0 = static_cast<unsigned char>(bytes[i]);
    if (b0 < 0x80) {  // ASCII, nearly every byte of a program: copied a run at a time
      size_t j = i + 1;
      while (j < n && static_cast<unsigned char>(bytes[j]) < 0x80) ++j;
      const size_t nAt = out.size();
      out.resize(nAt + (j - i));
      wchar_t *pOut = &out[nAt];
      for (; i < j; ++i) *pOut++ = static_cast<wchar_t>(static_cast<unsigned char>(bytes[i]));
      continue;
    }
    int nTrail = -1;
    uint32_t c = 0;
    uint32_t nMin = 0;
    if (b0 >= 0xC2 && b0 <= 0xDF) {
      nTrail = 1;
      c = b0 & 0x1F;
      nMin = 0x80;
    } else if (b0 >= 0xE0 && b0 <= 0xEF) {
      nTrail = 2;
      c = b0 & 0x0F;
      nMin = 0x800;
    } else if (b0 >= 0xF0 && b0 <= 0xF4) {
      nTrail = 3;
      c = b0 & 0x07;
      nMin = 0x10000;
    }
    bool bValid = nTrail >= 0 && i + size_t(nTrail) < n;
    if (bValid && nTrail > 0) {
      for (int k = 1; k <= nTrail; ++k) {
        const unsigned char b = static_cast<unsigned char>(bytes[i + size_t(k)]);
        if ((b & 0xC0) != 0x80) {
          bValid = false;
          break;
        }
        c = (c << 6) | (b & 0x3F);
      }
      // Overlong forms, surrogates and values past U+10FFFF are not UTF-8.
      if (bValid && (c < nMin || (c >= 0xD800 && c <= 0xDFFF) || c > 0x10FFFF)) bValid = false;
    }
    if (bValid) {
      out += static_cast<wchar_t>(c);
      i += size_t(nTrail) + 1;
    } else {
      out += static_cast<wchar_t>(0xDC00 + b0);
      ++i;
    }
  }
}
