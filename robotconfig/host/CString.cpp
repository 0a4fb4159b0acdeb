#include "robotconfig/host/CString.h"

#include <algorithm>
#include <cwchar>
#include <cwctype>

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
void appendPadded(std::wstring &out, const std::wstring &body, const TConversionLayout &layout, bool bNumeric) {
  const int nPad = layout.nWidth > static_cast<int>(body.size()) ? layout.nWidth - static_cast<int>(body.size()) : 0;
  if (layout.bLeft) {
    out += body;
    out.append(size_t(nPad), L' ');
  } else if (layout.bZero && bNumeric && layout.nPrecision < 0) {
    size_t nSign = (!body.empty() && (body[0] == L'-' || body[0] == L'+')) ? 1 : 0;
    out.append(body, 0, nSign);
    out.append(size_t(nPad), L'0');
    out.append(body, nSign, std::wstring::npos);
  } else {
    out.append(size_t(nPad), L' ');
    out += body;
  }
}

// Digits of `value` in `base`, at least `nMinDigits` long.
std::wstring digits(unsigned long long value, unsigned base, bool bUpper, int nMinDigits) {
  const wchar_t *pzDigits = bUpper ? L"0123456789ABCDEF" : L"0123456789abcdef";
  std::wstring s;
  while (value != 0) {
    s.insert(s.begin(), pzDigits[value % base]);
    value /= base;
  }
  const int nMin = nMinDigits < 0 ? 1 : nMinDigits;
  if (static_cast<int>(s.size()) < nMin) s.insert(0, size_t(nMin) - s.size(), L'0');
  return s;
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

}  // namespace

std::wstring formatWide(const wchar_t *pzFormat, const TFormatArg *pArgs, size_t nArgs) {
  std::wstring out;
  if (!pzFormat) return out;
  size_t nNext = 0;
  const wchar_t *p = pzFormat;
  while (*p) {
    if (*p != L'%') {
      out += *p++;
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
        std::wstring body = stringOf(arg);
        if (layout.nPrecision >= 0 && static_cast<int>(body.size()) > layout.nPrecision) body.resize(size_t(layout.nPrecision));
        appendPadded(out, body, layout, false);
        break;
      }
      case L'c':
      case L'C': {
        wchar_t c = arg.nKind == TFormatArg::Kind::kChar       ? arg.cChar
                    : arg.nKind == TFormatArg::Kind::kUnsigned ? static_cast<wchar_t>(arg.nUnsigned)
                                                               : static_cast<wchar_t>(arg.nSigned);
        if (arg.nKind == TFormatArg::Kind::kString) c = (arg.pzString && *arg.pzString) ? *arg.pzString : L'\0';
        appendPadded(out, std::wstring(1, c), layout, false);
        break;
      }
      case L'd':
      case L'i': {
        if (arg.nKind == TFormatArg::Kind::kString) {
          appendPadded(out, stringOf(arg), layout, false);
          break;
        }
        const long long v = arg.nKind == TFormatArg::Kind::kUnsigned ? static_cast<long long>(arg.nUnsigned) : arg.nSigned;
        const unsigned long long mag = v < 0 ? 0ULL - static_cast<unsigned long long>(v) : static_cast<unsigned long long>(v);
        std::wstring body = digits(mag, 10, false, layout.nPrecision);
        if (v < 0) body.insert(body.begin(), L'-');
        else if (layout.bPlus) body.insert(body.begin(), L'+');
        appendPadded(out, body, layout, true);
        break;
      }
      case L'u':
      case L'x':
      case L'X': {
        if (arg.nKind == TFormatArg::Kind::kString) {
          appendPadded(out, stringOf(arg), layout, false);
          break;
        }
        // Like C, a negative int printed unsigned shows its 32-bit pattern.
        unsigned long long v = arg.nUnsigned;
        if (arg.nKind != TFormatArg::Kind::kUnsigned && arg.nSigned < 0 && arg.nSigned >= INT32_MIN)
          v = static_cast<uint32_t>(static_cast<int32_t>(arg.nSigned));
        appendPadded(out, digits(v, conv == L'u' ? 10 : 16, conv == L'X', layout.nPrecision), layout, true);
        break;
      }
      default:
        appendPadded(out, stringOf(arg), layout, true);
        break;
    }
  }
  return out;
}

}  // namespace robotconfig_detail

int CString::Compare(const wchar_t *pz) const { return m_s.compare(pz ? pz : L""); }

int CString::CompareNoCase(const wchar_t *pz) const {
  const wchar_t *a = m_s.c_str();
  const wchar_t *b = pz ? pz : L"";
  for (;; ++a, ++b) {
    const wint_t ca = std::towlower(static_cast<wint_t>(*a));
    const wint_t cb = std::towlower(static_cast<wint_t>(*b));
    if (ca != cb) return ca < cb ? -1 : 1;
    if (ca == 0) return 0;
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

std::string CString::toUtf8() const {
  std::string out;
  out.reserve(m_s.size());
  for (wchar_t wc : m_s) {
    const uint32_t c = static_cast<uint32_t>(wc);
    if (c >= 0xDC80 && c <= 0xDCFF) {
      out += static_cast<char>(c - 0xDC00);  // a byte kept from undecodable input
    } else if (c < 0x80) {
      out += static_cast<char>(c);
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
  return out;
}

CString CString::fromUtf8(std::string_view bytes) {
  std::wstring out;
  out.reserve(bytes.size());
  const size_t n = bytes.size();
  size_t i = 0;
  while (i < n) {
    const unsigned char b0 = static_cast<unsigned char>(bytes[i]);
    int nTrail = -1;
    uint32_t c = 0;
    uint32_t nMin = 0;
    if (b0 < 0x80) {
      nTrail = 0;
      c = b0;
    } else if (b0 >= 0xC2 && b0 <= 0xDF) {
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
  return CString(std::move(out));
}
