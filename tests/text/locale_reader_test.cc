#include "text/locale_reader.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <thread>

#include "AdDateTime.h"
#include "platform/locale_handle.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::DateTimeFields;
using datetimelib::ReadInLocale;
using datetimelib::platform::LocaleHandle;
using datetimelib::testing::EnvGuard;
using datetimelib::testing::ThreadLocale;
using datetimelib::testing::TzGuard;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

// The fields as "YYYY-MM-DD HH:MM:SS", or "refused".
std::string Read(std::uint32_t locale, const char* text) {
  const LocaleHandle handle = LocaleHandle::ForIdentifier(locale);
  DateTimeFields f;
  if (!ReadInLocale(text, handle.get(), &f)) return "refused";
  char out[64];
  std::snprintf(out, sizeof out, "%04d-%02d-%02d %02d:%02d:%02d", f.year, f.month, f.day,
                f.hour, f.minute, f.second);
  return out;
}

constexpr std::uint32_t kInvariant = 127, kEnUs = 1033, kEnGb = 2057, kDeDe = 1031,
                        kFrFr = 1036, kJaJp = 1041;
constexpr std::uint32_t kLocales[] = {kInvariant, kEnUs, kEnGb, kDeDe, kFrFr, kJaJp};

// What every locale reads, and refuses, the same way.
TEST(ReadInLocale, FormsOfEveryLocale) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const struct {
    const char* text;
    const char* fields;
  } cases[] = {
      // Date and time.
      {"2003-05-17T14:03:09", "2003-05-17 14:03:09"},
      {"2003-05-17T14:03", "2003-05-17 14:03:00"},
      {"2003-05-17 14:03", "2003-05-17 14:03:00"},
      {"2003-05-17  9:03:09 \t", "2003-05-17 09:03:09"},
      {"2003-5-7 14:03:09", "2003-05-07 14:03:09"},
      // A date alone, at midnight; a time alone, on 1899-12-30.
      {"2003-05-17", "2003-05-17 00:00:00"},
      {"2004-02-29", "2004-02-29 00:00:00"},
      {"14:30", "1899-12-30 14:30:00"},
      {"14:30:00", "1899-12-30 14:30:00"},
      {"9:05", "1899-12-30 09:05:00"},
      {"00:00:00", "1899-12-30 00:00:00"},
      // Impossible fields.
      {"24:00", "refused"},
      {"23:60", "refused"},
      {"23:59:60", "refused"},
      {"2003-02-29", "refused"},
      {"2003-04-31 12:00", "refused"},
      {"2003-13-01", "refused"},
      {"2003-00-10", "refused"},
      // Not the whole text, or not a form.
      {"", "refused"},
      {" 14:30", "refused"},
      {"14:30x", "refused"},
      {"14:30:00.5", "refused"},
      {"2003-05-17T", "refused"},
      {"2003-05-17 14", "refused"},
      {"2003-05-17 14:03:09:01", "refused"},
      {"20030-05-17", "refused"},
      {"14", "refused"},
      {"17 Foo 2003", "refused"},
  };
  for (const std::uint32_t locale : kLocales) {
    for (const auto& c : cases) {
      EXPECT_EQ(Read(locale, c.text), c.fields) << "locale " << locale << ": " << c.text;
    }
  }
}

// Each locale's own forms and names. Rows list what the locale reads, then
// what it refuses.
TEST(ReadInLocale, FormsOfEachLocale) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const struct {
    std::uint32_t locale;
    const char* text;
    const char* fields;
  } cases[] = {
      // "C": %x "%m/%d/%y", %c "%a %b %e %H:%M:%S %Y", AM/PM.
      {kInvariant, "05/17/03 14:03:09", "2003-05-17 14:03:09"},
      {kInvariant, "05/17/2003", "2003-05-17 00:00:00"},
      {kInvariant, "12/31/69", "1969-12-31 00:00:00"},
      {kInvariant, "01/01/68", "2068-01-01 00:00:00"},
      {kInvariant, "Sat May 17 14:03:09 2003", "2003-05-17 14:03:09"},
      {kInvariant, "Thu Jan  1 00:00:00 1970", "1970-01-01 00:00:00"},
      {kInvariant, "2:30 PM", "1899-12-30 14:30:00"},
      {kInvariant, "02:30:15pm", "1899-12-30 14:30:15"},
      {kInvariant, "May 17, 2003 2:30 PM", "2003-05-17 14:30:00"},
      {kInvariant, "17 MAY 2003", "2003-05-17 00:00:00"},
      {kInvariant, "17-may-2003 14:03", "2003-05-17 14:03:00"},
      {kInvariant, "Sun May 17 14:03:09 2003", "refused"},  // 17 May 2003 was a Saturday
      {kInvariant, "17.05.2003", "refused"},
      {kInvariant, "5/17/3", "refused"},
      // en_US: %x "%m/%d/%Y", %X "%I:%M:%S %p", %c "%a %d %b %Y %r %Z".
      {kEnUs, "05/17/2003 02:03:09 PM", "2003-05-17 14:03:09"},
      {kEnUs, "5/7/2003", "2003-05-07 00:00:00"},
      {kEnUs, "Sat 17 May 2003 02:03:09 PM", "2003-05-17 14:03:09"},
      {kEnUs, "May 17, 2003", "2003-05-17 00:00:00"},
      {kEnUs, "SEPTEMBER 5 2003", "2003-09-05 00:00:00"},
      {kEnUs, "sep 5, 2003 12:00 AM", "2003-09-05 00:00:00"},
      {kEnUs, "12:30 PM", "1899-12-30 12:30:00"},
      {kEnUs, "12:30 am", "1899-12-30 00:30:00"},
      {kEnUs, "05/17/03", "refused"},  // writes four digits, reads no two
      {kEnUs, "Sat 17 May 2003 02:03:09 PM EDT", "refused"},
      {kEnUs, "0:30 AM", "refused"},
      {kEnUs, "13:00 PM", "refused"},
      {kEnUs, "2:30 P", "refused"},
      {kEnUs, "02/30/2003", "refused"},
      {kEnUs, "17/05/2003", "refused"},
      // en_GB: %x "%d/%m/%y", %X "%T", lower-case am/pm.
      {kEnGb, "17/05/03 14:03:09", "2003-05-17 14:03:09"},
      {kEnGb, "17/05/2003", "2003-05-17 00:00:00"},
      {kEnGb, "17/05/69", "1969-05-17 00:00:00"},
      {kEnGb, "17/05/68", "2068-05-17 00:00:00"},
      {kEnGb, "2:30 pm", "1899-12-30 14:30:00"},
      {kEnGb, " 2:30:00 PM", "refused"},
      {kEnGb, "Sat 17 May 2003 14:03:09", "2003-05-17 14:03:09"},
      {kEnGb, "17/05/3", "refused"},
      // de_DE: %x "%d.%m.%Y", %c "%a %d %b %Y %T %Z", no AM/PM words.
      {kDeDe, "17.05.2003 14:03:09", "2003-05-17 14:03:09"},
      {kDeDe, "7.5.2003", "2003-05-07 00:00:00"},
      {kDeDe, "29.02.2004", "2004-02-29 00:00:00"},
      {kDeDe, "17. März 2003", "2003-03-17 00:00:00"},
      {kDeDe, "17. MÄRZ 2003 8:15", "2003-03-17 08:15:00"},
      {kDeDe, "17 mär 2003", "2003-03-17 00:00:00"},
      {kDeDe, "1. Dezember 2003", "2003-12-01 00:00:00"},
      {kDeDe, "Sa 17 Mai 2003 14:03:09", "2003-05-17 14:03:09"},
      {kDeDe, "17.05.03", "refused"},
      {kDeDe, "2:30 PM", "refused"},
      {kDeDe, "30.02.2003", "refused"},
      {kDeDe, "17.05.2003 14:03:09 Uhr", "refused"},
      {kDeDe, "17. Mar 2003", "refused"},
      // fr_FR: %x "%d/%m/%Y", abbreviations with ".", %c without a zone.
      {kFrFr, "17/05/2003 14:03:09", "2003-05-17 14:03:09"},
      {kFrFr, "17 FÉVRIER 2003", "2003-02-17 00:00:00"},
      {kFrFr, "17 févr. 2003", "2003-02-17 00:00:00"},
      {kFrFr, "17 Févr 2003", "2003-02-17 00:00:00"},
      {kFrFr, "1 août 2003 10:00", "2003-08-01 10:00:00"},
      {kFrFr, "sam. 17 mai 2003 14:03:09", "2003-05-17 14:03:09"},
      {kFrFr, "05/17/2003", "refused"},
      {kFrFr, "17 fevrier 2003", "refused"},
      // ja_JP: %x "%Y年%m月%d日", %X "%H時%M分%S秒", %r "%p%I時%M分%S秒".
      {kJaJp, "2003年05月17日 14時03分09秒", "2003-05-17 14:03:09"},
      {kJaJp, "2003年5月7日", "2003-05-07 00:00:00"},
      {kJaJp, "14時03分09秒", "1899-12-30 14:03:09"},
      {kJaJp, "午後2時03分09秒", "1899-12-30 14:03:09"},
      {kJaJp, "2:30 午前", "1899-12-30 02:30:00"},
      {kJaJp, "2003年05月17日14時03分09秒", "refused"},
      {kJaJp, "2:30 PM", "refused"},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(Read(c.locale, c.text), c.fields)
        << "locale " << c.locale << ": " << c.text;
  }
}

// What Format(flags, locale) writes reads back in that locale, for each flag,
// over counts across the whole range.
TEST(ParseDateTime, ReadsWhatEachLocaleWrites) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("<+01>-1");  // no repeated hour to blur the comparison
  const struct {
    std::uint32_t identifier;
    const char* name;
  } locales[] = {{kInvariant, "C"},      {kEnUs, "en_US.UTF-8"}, {kEnGb, "en_GB.UTF-8"},
                 {kDeDe, "de_DE.UTF-8"}, {kFrFr, "fr_FR.UTF-8"}, {kJaJp, "ja_JP.UTF-8"}};
  for (const auto& locale : locales) {
    SCOPED_TRACE(locale.name);
    const ThreadLocale thread_locale(locale.name);
    ASSERT_TRUE(thread_locale.ok());
    for (std::int64_t t = 0; t <= INT32_MAX - 3600; t += 23 * 86400 + 3 * 3600 + 61) {
      const AdDateTime written(AdTime(static_cast<std::int32_t>(t)));
      const std::string canonical = written.Format(kCanonical);
      const std::string both = written.Format(AdDateTime::dateAndTime, locale.identifier);
      const std::string time = written.Format(AdDateTime::timeOnly, locale.identifier);
      const std::string date = written.Format(AdDateTime::dateOnly, locale.identifier);
      AdDateTime read;
      ASSERT_EQ(read.ParseDateTime(both.c_str()), 1) << both;
      ASSERT_EQ(read.GetCTime().GetTime(), t) << both;
      ASSERT_EQ(read.ParseDateTime(date.c_str()), 1) << date;
      ASSERT_EQ(read.Format(kCanonical), canonical.substr(0, 10) + " 00:00:00") << date;
      ASSERT_EQ(read.ParseDateTime(time.c_str()), 1) << time;
      ASSERT_EQ(read.Format(kCanonical), "1970-01-01" + canonical.substr(10)) << time;
    }
  }
}

// A time of day alone is read on 1899-12-30: local time on 1970-01-01, and out
// of range as UTC.
TEST(ParseDateTime, TimeOfDayAlone) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("America/New_York");
  const ThreadLocale american("en_US.UTF-8");
  for (const char* text : {"14:30", "14:30:00", "2:30 PM", "02:30:00 pm"}) {
    SCOPED_TRACE(text);
    AdDateTime local;
    EXPECT_EQ(local.ParseDateTime(text), 1);
    EXPECT_EQ(local.GetCTime().GetTime(), 19 * 3600 + 30 * 60);  // 14:30 EST
    AdDateTime utc(AdTime(777));
    EXPECT_EQ(utc.ParseDateTimeGMT(text), 0);
    EXPECT_EQ(utc.GetStatus(), AdDateTime::outOfRange);
    EXPECT_EQ(utc.GetCTime().GetTime(), 777);
    EXPECT_EQ(utc.Format(kCanonical), text);
  }
}

// The first read is in the calling thread's locale, the second (for the
// canonical shape with a fraction) in the user's default locale.
TEST(ParseDateTime, ThreadLocaleThenUserDefault) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  const EnvGuard lc_time("LC_TIME", nullptr);
  const struct {
    const char* thread;  // uselocale on a new thread
    const char* user;    // LC_ALL
    const char* text;
    int result;
  } cases[] = {
      // The 19 bytes before "." are a German form: only the second read takes them.
      {"C", "de_DE.UTF-8", "17.05.2003 14:03:09.5", 1},
      {"de_DE.UTF-8", "C", "17.05.2003 14:03:09.5", 0},
      {"de_DE.UTF-8", "en_US.UTF-8", "17.05.2003 14:03:09.5", 0},
      {"en_GB.UTF-8", "de_DE.UTF-8", "17.05.2003 14:03:09.5", 1},
      // A text the thread's locale reads is never cut.
      {"de_DE.UTF-8", "C", "17.05.2003 14:03:09", 1},
      {"C", "de_DE.UTF-8", "17.05.2003 14:03:09", 0},
      // The canonical shape reads in every locale; its fraction is dropped.
      {"ja_JP.UTF-8", "fr_FR.UTF-8", "2003-05-17 14:03:09.999", 1},
      // The 20th byte is not ".": no second read.
      {"C", "de_DE.UTF-8", "17.05.2003 14:03:9.5", 0},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(std::string(c.thread) + " / " + c.user + ": " + c.text);
    const EnvGuard lc_all("LC_ALL", c.user);
    int result = -1;
    std::int32_t count = 0;
    std::thread reader([&] {
      const ThreadLocale thread_locale(c.thread);
      AdDateTime value;
      result = value.ParseDateTime(c.text);
      count = value.GetCTime().GetTime();
    });
    reader.join();
    EXPECT_EQ(result, c.result);
    if (c.result == 1) {
      EXPECT_EQ(count, 1053180189);
    }
  }
}

// A locale installed on one thread does not reach another running at the
// same time.
TEST(ParseDateTime, ThreadLocaleStaysOnItsThread) {
  DATETIMELIB_NEED_TEST_LOCALES();
  std::thread german([] {
    const ThreadLocale thread_locale("de_DE.UTF-8");
    for (int i = 0; i < 200; ++i) {
      AdDateTime value;
      ASSERT_EQ(value.ParseDateTime("17. Mai 2003"), 1);
      ASSERT_EQ(value.ParseDateTime("05/17/2003"), 0);
    }
  });
  std::thread american([] {
    const ThreadLocale thread_locale("en_US.UTF-8");
    for (int i = 0; i < 200; ++i) {
      AdDateTime value;
      ASSERT_EQ(value.ParseDateTime("05/17/2003 2:30 PM"), 1);
      ASSERT_EQ(value.ParseDateTime("17.05.2003"), 0);
    }
  });
  german.join();
  american.join();
}

}  // namespace
