#include <gtest/gtest.h>

#include <string>

#include "robotconfig/host/HostMessages.h"

TEST(HostMessages, CapturingSinkKeepsEveryMessage) {
  CCapturingMessageSink sink;
  EXPECT_EQ(myAppMessageBoxString(CString(L"Port 'in1' is used twice"), kMessageStyleWarning), 1);
  EXPECT_EQ(systemMessageBox(CString(L"Cannot write file"), CString(L"Save Model"), kMessageStyleError), 1);
  sink.nNeverRepeatAnswer = 0;
  EXPECT_EQ(bNeverRepeatMessageBoxPrompt(CString(L"Digital ports out of order")), 0);
  sink.nNeverRepeatAnswer = 7;
  EXPECT_EQ(bNeverRepeatMessageBoxPrompt(CString(L"Quad encoder ports")), 7);

  ASSERT_EQ(sink.messages.size(), 4u);
  EXPECT_EQ(sink.messages[0].sText.str(), L"Port 'in1' is used twice");
  EXPECT_TRUE(sink.messages[0].sTitle.IsEmpty());
  EXPECT_EQ(sink.messages[0].nStyle, kMessageStyleWarning);
  EXPECT_FALSE(sink.messages[0].bNeverRepeatPrompt);

  EXPECT_EQ(sink.messages[1].sText.str(), L"Cannot write file");
  EXPECT_EQ(sink.messages[1].sTitle.str(), L"Save Model");
  EXPECT_EQ(sink.messages[1].nStyle, kMessageStyleError);
  EXPECT_FALSE(sink.messages[1].bNeverRepeatPrompt);

  EXPECT_EQ(sink.messages[2].sText.str(), L"Digital ports out of order");
  EXPECT_TRUE(sink.messages[2].sTitle.IsEmpty());
  EXPECT_EQ(sink.messages[2].nStyle, kMessageStyleWarning);
  EXPECT_TRUE(sink.messages[2].bNeverRepeatPrompt);
  EXPECT_EQ(sink.messages[3].sText.str(), L"Quad encoder ports");
  EXPECT_TRUE(sink.messages[3].bNeverRepeatPrompt);

  // Plain boxes answer OK whatever the never-repeat answer is.
  EXPECT_EQ(myAppMessageBoxString(CString(L"info"), kMessageStyleInformation), 1);
  EXPECT_EQ(sink.messages.back().nStyle, kMessageStyleInformation);
}

TEST(HostMessages, NestedSinksRestoreTheOuterOne) {
  CCapturingMessageSink outer;
  myAppMessageBoxString(CString(L"first"), kMessageStyleWarning);
  {
    CCapturingMessageSink inner;
    inner.nNeverRepeatAnswer = 1;
    EXPECT_EQ(bNeverRepeatMessageBoxPrompt(CString(L"second")), 1);
    ASSERT_EQ(inner.messages.size(), 1u);
    EXPECT_EQ(inner.messages[0].sText.str(), L"second");
  }
  myAppMessageBoxString(CString(L"third"), kMessageStyleWarning);
  ASSERT_EQ(outer.messages.size(), 2u);
  EXPECT_EQ(outer.messages[0].sText.str(), L"first");
  EXPECT_EQ(outer.messages[1].sText.str(), L"third");

  // An explicitly installed sink is replaced and handed back.
  CCapturingMessageSink other;
  CHostMessageSink *pPrevious = setHostMessageSink(&outer);
  EXPECT_EQ(pPrevious, &other);
  myAppMessageBoxString(CString(L"fourth"), 0);
  EXPECT_EQ(outer.messages.size(), 3u);
  EXPECT_TRUE(other.messages.empty());
  EXPECT_EQ(setHostMessageSink(pPrevious), &outer);
}

TEST(HostMessages, DateFieldRoundTrip) {
  TDateField date{1, 1};
  CString sText(L"2024-03-09");
  DateFieldFromCString(&date, &sText);
  EXPECT_EQ(date.nDate, 20240309u);
  EXPECT_EQ(date.nTime, 0u);
  CString sBack(L"stale");
  CStringFromDateField(&sBack, &date);
  EXPECT_EQ(sBack.str(), L"2024-03-09");

  sText = CString(L"1999-12-31T23:59:58");
  DateFieldFromCString(&date, &sText);
  EXPECT_EQ(date.nDate, 19991231u);
  EXPECT_EQ(date.nTime, 235958u);
  CStringFromDateField(&sBack, &date);
  EXPECT_EQ(sBack.str(), L"1999-12-31T23:59:58");

  sText = CString(L"2000-01-01T00:00:07");
  DateFieldFromCString(&date, &sText);
  EXPECT_EQ(date.nTime, 7u);
  CStringFromDateField(&sBack, &date);
  EXPECT_EQ(sBack.str(), L"2000-01-01T00:00:07");

  // Midnight is written without its time.
  sText = CString(L"2000-01-01T00:00:00");
  DateFieldFromCString(&date, &sText);
  EXPECT_EQ(date.nDate, 20000101u);
  EXPECT_EQ(date.nTime, 0u);
  CStringFromDateField(&sBack, &date);
  EXPECT_EQ(sBack.str(), L"2000-01-01");

  // The year is written with four digits.
  sText = CString(L"0007-02-03");
  DateFieldFromCString(&date, &sText);
  EXPECT_EQ(date.nDate, 70203u);
  CStringFromDateField(&sBack, &date);
  EXPECT_EQ(sBack.str(), L"0007-02-03");

  const TDateField none{0, 0};
  CStringFromDateField(&sBack, &none);
  EXPECT_TRUE(sBack.IsEmpty());
  CStringFromDateField(&sBack, nullptr);
  EXPECT_TRUE(sBack.IsEmpty());
  CStringFromDateField(nullptr, &date);
  DateFieldFromCString(nullptr, &sText);
  date = TDateField{5, 5};
  DateFieldFromCString(&date, nullptr);
  EXPECT_EQ(date.nDate, 0u);
  EXPECT_EQ(date.nTime, 0u);
}

TEST(HostMessages, MalformedDatesGiveZero) {
  const wchar_t *malformed[] = {
      L"",
      L"2024",
      L"2024-03",
      L"2024-03-9",
      L"24-03-09",
      L"2024/03/09",
      L"2024-3-09",
      L" 2024-03-09",
      L"2024-03-09 ",
      L"2024-03-09x",
      L"2024-00-09",
      L"2024-13-09",
      L"2024-03-00",
      L"2024-03-32",
      L"2024-03-09T",
      L"2024-03-09T12",
      L"2024-03-09T12:30",
      L"2024-03-09T12:30:4",
      L"2024-03-09T12:30:45Z",
      L"2024-03-09t12:30:45",
      L"2024-03-09T24:00:00",
      L"2024-03-09T23:60:00",
      L"2024-03-09T23:59:60",
      L"2024-03-09T1a:00:00",
      L"-024-03-09",
      L"\uff12\uff10\uff12\uff14-03-09",
  };
  for (const wchar_t *pz : malformed) {
    TDateField date{123, 456};
    const CString sText(pz);
    DateFieldFromCString(&date, &sText);
    EXPECT_EQ(date.nDate, 0u) << sText.toUtf8();
    EXPECT_EQ(date.nTime, 0u) << sText.toUtf8();
  }
  // Text after an embedded NUL is still part of the date.
  TDateField date{1, 1};
  const CString sNul(std::wstring(L"2024-03-09\0T", 12));
  DateFieldFromCString(&date, &sNul);
  EXPECT_EQ(date.nDate, 0u);
}
