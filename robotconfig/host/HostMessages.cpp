#include "robotconfig/host/HostMessages.h"

#include <cstdio>

const CString sEmptyString;

namespace {

class CStderrMessageSink : public CHostMessageSink {
 public:
  int showMessage(const THostMessage &message) override {
    std::fprintf(stderr, "warning: %s\n", message.sText.toUtf8().c_str());
    // Nobody is asked, so nobody chose to silence later warnings.
    return message.bNeverRepeatPrompt ? 0 : 1;
  }
};

CStderrMessageSink &defaultSink() {
  static CStderrMessageSink sink;
  return sink;
}

CHostMessageSink *&currentSink() {
  static CHostMessageSink *pSink = &defaultSink();
  return pSink;
}

// Parses exactly `nDigits` decimal digits at `pos`, advancing it.
bool readDigits(const CString &s, int &pos, int nDigits, uint32_t &value) {
  value = 0;
  for (int i = 0; i < nDigits; ++i, ++pos) {
    const wchar_t c = s.GetAt(pos);
    if (c < L'0' || c > L'9') return false;
    value = value * 10 + uint32_t(c - L'0');
  }
  return true;
}

}  // namespace

CHostMessageSink *setHostMessageSink(CHostMessageSink *pSink) {
  CHostMessageSink *pPrevious = currentSink();
  currentSink() = pSink ? pSink : &defaultSink();
  return pPrevious;
}

CCapturingMessageSink::CCapturingMessageSink() : m_pPrevious(setHostMessageSink(this)) {}
CCapturingMessageSink::~CCapturingMessageSink() { setHostMessageSink(m_pPrevious); }

int CCapturingMessageSink::showMessage(const THostMessage &message) {
  messages.push_back(message);
  return message.bNeverRepeatPrompt ? nNeverRepeatAnswer : 1;
}

int myAppMessageBoxString(const CString &sText, unsigned nStyle) {
  THostMessage message;
  message.sText = sText;
  message.nStyle = nStyle;
  return currentSink()->showMessage(message);
}

int bNeverRepeatMessageBoxPrompt(const CString &sText) {
  THostMessage message;
  message.sText = sText;
  message.nStyle = kMessageStyleWarning;
  message.bNeverRepeatPrompt = true;
  return currentSink()->showMessage(message);
}

int systemMessageBox(const CString &sText, const CString &sTitle, unsigned nStyle) {
  THostMessage message;
  message.sText = sText;
  message.sTitle = sTitle;
  message.nStyle = nStyle;
  return currentSink()->showMessage(message);
}

void DateFieldFromCString(TDateField *pDate, const CString *pText) {
  if (!pDate) return;
  pDate->nDate = 0;
  pDate->nTime = 0;
  if (!pText) return;
  const CString &s = *pText;
  int pos = 0;
  uint32_t year = 0, month = 0, day = 0, hour = 0, minute = 0, second = 0;
  if (!readDigits(s, pos, 4, year) || s.GetAt(pos++) != L'-' || !readDigits(s, pos, 2, month) ||
      s.GetAt(pos++) != L'-' || !readDigits(s, pos, 2, day))
    return;
  if (month < 1 || month > 12 || day < 1 || day > 31) return;
  if (pos < s.GetLength()) {
    if (s.GetAt(pos++) != L'T' || !readDigits(s, pos, 2, hour) || s.GetAt(pos++) != L':' ||
        !readDigits(s, pos, 2, minute) || s.GetAt(pos++) != L':' || !readDigits(s, pos, 2, second) ||
        pos != s.GetLength() || hour > 23 || minute > 59 || second > 59)
      return;
  }
  pDate->nDate = year * 10000 + month * 100 + day;
  pDate->nTime = hour * 10000 + minute * 100 + second;
}

void CStringFromDateField(CString *pText, const TDateField *pDate) {
  if (!pText) return;
  pText->Empty();
  if (!pDate || (pDate->nDate == 0 && pDate->nTime == 0)) return;
  pText->Format(L"%04u-%02u-%02u", pDate->nDate / 10000, pDate->nDate / 100 % 100, pDate->nDate % 100);
  if (pDate->nTime != 0)
    pText->AppendFormat(L"T%02u:%02u:%02u", pDate->nTime / 10000, pDate->nTime / 100 % 100, pDate->nTime % 100);
}
