#include <gtest/gtest.h>

#include <string>

#include "robotconfig/host/HostMessages.h"

TEST(HostMessages, CapturingSinksKeepEveryMessageAndNest) {
  CCapturingMessageSink sink;
  EXPECT_EQ(myAppMessageBoxString(CString(L"Port 'in1' is used twice"), kMessageStyleWarning), 1);
  EXPECT_EQ(systemMessageBox(CString(L"Cannot write file"), CString(L"Save Model"), kMessageStyleError), 1);
  sink.nNeverRepeatAnswer = 7;
  {
    CCapturingMessageSink inner;
    EXPECT_EQ(bNeverRepeatMessageBoxPrompt(CString(L"inner")), 0);
    EXPECT_EQ(inner.messages.size(), 1u);
  }
  EXPECT_EQ(bNeverRepeatMessageBoxPrompt(CString(L"Quad encoder ports")), 7);
  ASSERT_EQ(sink.messages.size(), 3u);
  EXPECT_EQ(sink.messages[0].sText.str(), L"Port 'in1' is used twice");
  EXPECT_TRUE(sink.messages[0].sTitle.IsEmpty());
  EXPECT_FALSE(sink.messages[0].bNeverRepeatPrompt);
  EXPECT_EQ(sink.messages[1].sTitle.str(), L"Save Model");
  EXPECT_EQ(sink.messages[1].nStyle, kMessageStyleError);
  EXPECT_EQ(sink.messages[2].nStyle, kMessageStyleWarning);
  EXPECT_TRUE(sink.messages[2].bNeverRepeatPrompt);

  // An explicitly installed sink is replaced and handed back.
  CCapturingMessageSink other;
  CHostMessageSink *pPrevious = setHostMessageSink(&sink);
  EXPECT_EQ(pPrevious, &other);
  myAppMessageBoxString(CString(L"fourth"), 0);
  EXPECT_EQ(sink.messages.size(), 4u);
  EXPECT_EQ(setHostMessageSink(pPrevious), &sink);
}

TEST(HostMessages, DateFields) {
  struct TCase {
    const wchar_t *pzText;
    uint32_t nDate, nTime;
    const wchar_t *pzWritten;
  } kCases[] = {
      {L"2024-03-09", 20240309, 0, L"2024-03-09"},
      {L"1999-12-31T23:59:58", 19991231, 235958, L"1999-12-31T23:59:58"},
      {L"2000-01-01T00:00:07", 20000101, 7, L"2000-01-01T00:00:07"},
      {L"2000-01-01T00:00:00", 20000101, 0, L"2000-01-01"},  // midnight is written without its time
      {L"0007-02-03", 70203, 0, L"0007-02-03"},
  };
  for (const TCase &c : kCases) {
    TDateField date{1, 1};
    const CString sText(c.pzText);
    DateFieldFromCString(&date, &sText);
    EXPECT_EQ(date.nDate, c.nDate) << sText.toUtf8();
    EXPECT_EQ(date.nTime, c.nTime) << sText.toUtf8();
    CString sBack(L"stale");
    CStringFromDateField(&sBack, &date);
    EXPECT_EQ(sBack.str(), c.pzWritten);
  }
  const wchar_t *malformed[] = {
      L"", L"2024-03", L"2024-03-9", L"24-03-09", L"2024/03/09", L" 2024-03-09", L"2024-03-09x", L"2024-00-09",
      L"2024-13-09", L"2024-03-00", L"2024-03-32", L"2024-03-09T", L"2024-03-09T12:30", L"2024-03-09T12:30:45Z",
      L"2024-03-09t12:30:45", L"2024-03-09T24:00:00", L"2024-03-09T23:60:00", L"2024-03-09T23:59:60",
      L"2024-03-09T1a:00:00", L"-024-03-09", L"\uff12\uff10\uff12\uff14-03-09",
  };
  for (const wchar_t *pz : malformed) {
    TDateField date{123, 456};
    const CString sText(pz);
    DateFieldFromCString(&date, &sText);
    EXPECT_EQ(date.nDate + date.nTime, 0u) << sText.toUtf8();
  }
  TDateField date{1, 1};
  const CString sNul(std::wstring(L"2024-03-09\0T", 12));  // text after a NUL is still part of the date
  DateFieldFromCString(&date, &sNul);
  EXPECT_EQ(date.nDate, 0u);
  CString sBack(L"stale");
  CStringFromDateField(&sBack, nullptr);
  EXPECT_TRUE(sBack.IsEmpty());
  CStringFromDateField(nullptr, &date);
  DateFieldFromCString(&date, nullptr);
}
