// What a locale writes reads back in that locale, and a zone named in the text
// picks the reading of its local time.
#include "support/locale_round_trip.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

#include "AdDateTime.h"
#include "platform/locale/locale_handle.h"
#include "platform/locale/locale_ids.h"
#include "platform/zone/local_time.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"
#include "text/strftime_text.h"

namespace {

using datetimelib::testing::FirstRoundTripFailure;
using datetimelib::testing::LocaleForm;
using datetimelib::testing::ThreadLocale;
using datetimelib::testing::TzGuard;

std::uint32_t Flags(LocaleForm form) {
  switch (form) {
    case LocaleForm::kTime:
      return AdDateTime::timeOnly;
    case LocaleForm::kDate:
      return AdDateTime::dateOnly;
    default:
      return 0;
  }
}

// Every language-region identifier; the numbers run up to 6153 (en_IE).
TEST(LocaleRoundTrip, EveryIdentifierReadsBackItsThreeForms) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("America/New_York");
  int locales = 0;
  for (std::uint32_t id = 1025; id < 0x10000; ++id) {
    const char* name = datetimelib::platform::LanguageRegionName(id);
    if (name == nullptr) continue;
    ++locales;
    ThreadLocale thread((std::string(name) + ".UTF-8").c_str());
    ASSERT_TRUE(thread.ok()) << name << " was not compiled for the tests";
    EXPECT_EQ(FirstRoundTripFailure([id](const AdDateTime& value, LocaleForm form) {
                return value.Format(Flags(form), id);
              }),
              "")
        << name;
  }
  EXPECT_EQ(locales, 52);
}

// Forms no identifier's locale has: the locale's own digits (fa_IR), and a
// century and year in them (mnw_MM).
TEST(LocaleRoundTrip, LocalesWithTheirOwnDigits) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("America/New_York");
  for (const char* name : {"fa_IR.UTF-8", "mnw_MM.UTF-8"}) {
    ThreadLocale thread(name);
    ASSERT_TRUE(thread.ok()) << name;
    const datetimelib::platform::LocaleHandle handle =
        datetimelib::platform::LocaleHandle::OfThread();
    EXPECT_EQ(FirstRoundTripFailure([&handle](const AdDateTime& value, LocaleForm form) {
                std::string text;
                datetimelib::WritePatternInLocale(
                    datetimelib::platform::BreakDownLocal(value.GetCTime().GetTime()),
                    form == LocaleForm::kTime   ? "%X"
                    : form == LocaleForm::kDate ? "%x"
                                                : "%x %X",
                    handle.get(), &text);
                return text;
              }),
              "")
        << name;
  }
}

struct ZoneRow {
  const char* tz;
  const char* locale;
  const char* text;
  std::int64_t seconds;  // -1: refused (invalid)
};

// 01:30 on 2004-10-31 in New York is 1099200600 (EDT, -0400) and 1099204200
// (EST, -0500); 01:45 on 2010-04-04 at Lord Howe, where the clocks go back half
// an hour, is 1270305900 (+11) and 1270307700 (+1030).
TEST(NamedZone, PicksTheReadingOfALocalTime) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const ZoneRow rows[] = {
      {"America/New_York", "en_US", "Sun 31 Oct 2004 01:30:00 AM EDT", 1099200600},
      {"America/New_York", "en_US", "Sun 31 Oct 2004 01:30:00 AM EST", 1099204200},
      {"America/New_York", "en_US", "Sun 31 Oct 2004 01:30:00 AM", 1099200600},
      {"America/New_York", "en_US", "Sun 31 Oct 2004 01:30:00 AM PST", -1},
      {"America/New_York", "en_US", "Sun 04 Jan 2004 01:30:00 AM EDT", -1},
      {"America/New_York", "nb_NO", "31. okt. 2004 kl. 01.30 -0500", 1099204200},
      {"America/New_York", "nb_NO", "31. okt. 2004 kl. 01.30 -0400", 1099200600},
      {"America/New_York", "nb_NO", "31. okt. 2004 kl. 01.30 -0300", -1},
      {"Australia/Lord_Howe", "en_US", "Sun 04 Apr 2010 01:45:00 AM +1030", 1270307700},
      {"Australia/Lord_Howe", "en_US", "Sun 04 Apr 2010 01:45:00 AM +11", 1270305900},
      {"Australia/Lord_Howe", "nb_NO", "04. april 2010 kl. 01.45 +1030", 1270307700},
      {"Australia/Lord_Howe", "nb_NO", "04. april 2010 kl. 01.45 +1100", 1270305900},
      // A time alone has no date to hold the zone against: one the zone's rule
      // names keeps the usual reading, on 1970-01-01.
      {"America/New_York", "nb_NO", "kl. 04.05 -0400", 32700},
      {"America/New_York", "nb_NO", "kl. 04.05 +0100", -1},
  };
  for (const ZoneRow& row : rows) {
    TzGuard tz(row.tz);
    ThreadLocale thread((std::string(row.locale) + ".UTF-8").c_str());
    AdDateTime value(AdTime(1234567890));
    const int read = value.ParseDateTime(row.text);
    EXPECT_EQ(read == 1 ? value.GetCTime().GetTime() : -1, row.seconds) << row.text;
    if (read == 0) {  // refused: the count as it was
      EXPECT_EQ(value.GetStatus(), AdDateTime::invalid) << row.text;
      EXPECT_EQ(value.GetCTime().GetTime(), 1234567890) << row.text;
    }
  }
}

// Read as UTC, an offset in the text moves the fields to UTC, and the count
// must stay within the range; an abbreviation other than GMT or UTC is refused.
TEST(NamedZone, ReadAsUtc) {
  DATETIMELIB_NEED_TEST_LOCALES();
  ThreadLocale nb("nb_NO.UTF-8");
  AdDateTime value;
  EXPECT_EQ(value.ParseDateTimeGMT("31. okt. 2004 kl. 01.30 -0500"), 1);
  EXPECT_EQ(value.GetCTime().GetTime(), 1099204200);
  EXPECT_EQ(value.ParseDateTimeGMT("01. jan. 1970 kl. 00.30 +0100"), 0);  // 23:30 UTC
  EXPECT_EQ(value.GetStatus(), AdDateTime::outOfRange);
  ThreadLocale en("en_US.UTF-8");
  EXPECT_EQ(value.ParseDateTimeGMT("Sun 31 Oct 2004 06:30:00 AM GMT"), 1);
  EXPECT_EQ(value.GetCTime().GetTime(), 1099204200);
  EXPECT_EQ(value.ParseDateTimeGMT("Sun 31 Oct 2004 01:30:00 AM EST"), 0);
  EXPECT_EQ(value.GetStatus(), AdDateTime::invalid);
}

}  // namespace
