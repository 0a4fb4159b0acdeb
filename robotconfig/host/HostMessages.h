// Formatting utilities and message-box service. Messages go to a replaceable
// sink: the command-line tool prints them as warnings, tests capture them.
#pragma once

#include <cstdint>
#include <vector>

#include "robotconfig/host/CString.h"

/// Message-box style bits that the configuration code passes.
constexpr unsigned kMessageStyleError = 0x10;
constexpr unsigned kMessageStyleWarning = 0x30;
constexpr unsigned kMessageStyleInformation = 0x40;

/// One message shown to the user.
struct THostMessage {
  CString sText;
  CString sTitle;             ///< empty for the application's own boxes
  unsigned nStyle = 0;        ///< icon and button bits
  bool bNeverRepeatPrompt = false;  ///< the box offers "do not show again"
};

/// Receiver of the messages; the result is the user's answer.
class CHostMessageSink {
 public:
  virtual ~CHostMessageSink() = default;
  /// Shows `message`. For a never-repeat prompt, non-zero means the user asked
  /// not to be shown such warnings again; otherwise the pressed button (1 = OK).
  virtual int showMessage(const THostMessage &message) = 0;
};

/// Installs a sink and returns the previous one; null restores the default
/// sink, which writes "warning: TEXT" lines to standard error.
CHostMessageSink *setHostMessageSink(CHostMessageSink *pSink);

/// A sink that keeps every message, for tests and for hosts that show them later.
class CCapturingMessageSink : public CHostMessageSink {
 public:
  /// Installs itself for its lifetime.
  CCapturingMessageSink();
  ~CCapturingMessageSink() override;
  CCapturingMessageSink(const CCapturingMessageSink &) = delete;
  CCapturingMessageSink &operator=(const CCapturingMessageSink &) = delete;

  int showMessage(const THostMessage &message) override;

  std::vector<THostMessage> messages;
  int nNeverRepeatAnswer = 0;  ///< answer given to never-repeat prompts

 private:
  CHostMessageSink *m_pPrevious;
};

/// Shows a message with the application's title and the given style.
int myAppMessageBoxString(const CString &sText, unsigned nStyle);
/// Shows a warning that offers "do not show again"; non-zero when taken.
int bNeverRepeatMessageBoxPrompt(const CString &sText);
/// Shows a message with its own title (the system message box).
int systemMessageBox(const CString &sText, const CString &sTitle, unsigned nStyle);

/// The empty string.
extern const CString sEmptyString;

/// Calendar date and time of day as two words: yyyymmdd and hhmmss.
struct TDateField {
  uint32_t nDate;
  uint32_t nTime;
};

/// Reads "YYYY-MM-DD" or "YYYY-MM-DDThh:mm:ss"; anything else gives 0/0.
void DateFieldFromCString(TDateField *pDate, const CString *pText);
/// Writes "YYYY-MM-DD", with "Thh:mm:ss" when the time is not 0; "" for 0/0.
void CStringFromDateField(CString *pText, const TDateField *pDate);
