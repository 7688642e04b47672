#include <gtest/gtest.h>

#include <clocale>
#include <string>

#include "AdDateTime.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::EnvGuard;
using datetimelib::testing::TzGuard;

constexpr std::uint32_t kFlags[] = {AdDateTime::dateAndTime, AdDateTime::timeOnly,
                                    AdDateTime::dateOnly};

TEST(FormatInLocale, StatusRule) {
  AdDateTime never_set;
  AdDateTime unreadable(AdTime(0));
  unreadable.ParseDateTime("not a date");
  AdDateTime refused(2040, 1, 1, 0, 0, 0);
  AdDateTime refused_without_text(AdTime(0));
  refused_without_text.SetStatus(AdDateTime::outOfRange);
  AdDateTime unknown_status(2040, 1, 1, 0, 0, 0);
  unknown_status.SetStatus(static_cast<AdDateTime::AdDateTimeStatus>(4));
  for (const std::uint32_t flags : kFlags) {
    for (const std::uint32_t locale : {127u, 1033u, 1024u, 4242u}) {
      EXPECT_EQ(never_set.Format(flags, locale), "");
      EXPECT_EQ(unreadable.Format(flags, locale), "");
      EXPECT_EQ(refused.Format(flags, locale), "2040/1/1 0:0:0");
      EXPECT_EQ(refused_without_text.Format(flags, locale), "");
      EXPECT_EQ(unknown_status.Format(flags, locale), "");
    }
  }
}

// 2003-05-17 14:03:09 local time, in a zone one hour east of UTC.
TEST(FormatInLocale, EachLocaleAndFlag) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("<+01>-1");
  const AdDateTime value(AdTime(1053180189 - 3600));
  const struct {
    std::uint32_t locale;
    const char* both;
    const char* time;
    const char* date;
  } cases[] = {
      {127, "05/17/03 14:03:09", "14:03:09", "05/17/03"},
      {1033, "05/17/2003 02:03:09 PM", "02:03:09 PM", "05/17/2003"},
      {2057, "17/05/03 14:03:09", "14:03:09", "17/05/03"},
      {1031, "17.05.2003 14:03:09", "14:03:09", "17.05.2003"},
      {1036, "17/05/2003 14:03:09", "14:03:09", "17/05/2003"},
      {1041, "2003年05月17日 14時03分09秒", "14時03分09秒", "2003年05月17日"},
      // Unknown numbers, and known ones whose locale is not installed here.
      {0, "05/17/03 14:03:09", "14:03:09", "05/17/03"},
      {1047, "05/17/03 14:03:09", "14:03:09", "05/17/03"},
      {0xFFFFFFFF, "05/17/03 14:03:09", "14:03:09", "05/17/03"},
      {1049, "05/17/03 14:03:09", "14:03:09", "05/17/03"},
      {2052, "05/17/03 14:03:09", "14:03:09", "05/17/03"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.locale);
    EXPECT_EQ(value.Format(AdDateTime::dateAndTime, c.locale), c.both);
    EXPECT_EQ(value.Format(AdDateTime::timeOnly, c.locale), c.time);
    EXPECT_EQ(value.Format(AdDateTime::dateOnly, c.locale), c.date);
    // Other bits play no part; both bits write date and time.
    EXPECT_EQ(value.Format(0x80000000u | AdDateTime::dateOnly, c.locale), c.date);
    EXPECT_EQ(value.Format(AdDateTime::timeOnly | AdDateTime::dateOnly, c.locale),
              c.both);
  }
}

// 1024 follows LC_ALL, else LC_TIME, else LANG, at each call.
TEST(FormatInLocale, UserDefaultFromEnvironment) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  const AdDateTime value(AdTime(1053180189));
  const struct {
    const char* lc_all;
    const char* lc_time;
    const char* lang;
    const char* date;
  } cases[] = {
      {nullptr, nullptr, nullptr, "05/17/03"},
      {nullptr, nullptr, "de_DE.UTF-8", "17.05.2003"},
      {nullptr, "fr_FR.UTF-8", "de_DE.UTF-8", "17/05/2003"},
      {"en_US.UTF-8", "fr_FR.UTF-8", "de_DE.UTF-8", "05/17/2003"},
      {"", "", "de_DE.utf8", "17.05.2003"},                 // empty counts as unset
      {"xx_XX.UTF-8", "fr_FR.UTF-8", nullptr, "05/17/03"},  // not installed: "C"
  };
  for (const auto& c : cases) {
    const EnvGuard lc_all("LC_ALL", c.lc_all);
    const EnvGuard lc_time("LC_TIME", c.lc_time);
    const EnvGuard lang("LANG", c.lang);
    EXPECT_EQ(value.Format(AdDateTime::dateOnly, AdDateTime::userDefaultLocale), c.date)
        << (c.lc_all ? c.lc_all : "-") << " " << (c.lc_time ? c.lc_time : "-") << " "
        << (c.lang ? c.lang : "-");
  }
}

// 2048 is the process-wide locale: "C" until setlocale names another.
TEST(FormatInLocale, SystemDefaultIsProcessLocale) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  const AdDateTime value(AdTime(1053180189));
  EXPECT_EQ(value.Format(AdDateTime::dateOnly, AdDateTime::systemDefaultLocale),
            "05/17/03");
  ASSERT_NE(std::setlocale(LC_ALL, "de_DE.UTF-8"), nullptr);
  EXPECT_EQ(value.Format(AdDateTime::dateOnly, AdDateTime::systemDefaultLocale),
            "17.05.2003");
  std::setlocale(LC_ALL, "C");
}

}  // namespace
