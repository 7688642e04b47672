#include <gtest/gtest.h>

#include <clocale>
#include <cstdlib>
#include <string>

#include "AdDateTime.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::EnvGuard;
using datetimelib::testing::TzGuard;

const AdDateTime kMay17(AdTime(1053180189));  // 2003-05-17 14:03:09 UTC

// Each locale writes its own forms: %x, %X, and "%x %X" for both flags or none;
// other bits play no part. (The round_trip fuzz corpus reads them back.)
TEST(FormatInLocale, EachLocaleWritesItsOwnForms) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  const struct {
    std::uint32_t id;
    const char* date;
    const char* time;
  } locales[] = {
      {127, "05/17/03", "14:03:09"},    {1033, "05/17/2003", "02:03:09 PM"},
      {2057, "17/05/03", "14:03:09"},   {1031, "17.05.2003", "14:03:09"},
      {1036, "17/05/2003", "14:03:09"}, {1041, "2003年05月17日", "14時03分09秒"},
  };
  for (const auto& l : locales) {
    SCOPED_TRACE(l.id);
    const std::string both = std::string(l.date) + " " + l.time;
    EXPECT_EQ(kMay17.Format(0x80000000u | AdDateTime::dateOnly, l.id), l.date);
    EXPECT_EQ(kMay17.Format(AdDateTime::timeOnly, l.id), l.time);
    EXPECT_EQ(kMay17.Format(AdDateTime::dateAndTime, l.id), both);
    EXPECT_EQ(kMay17.Format(AdDateTime::dateOnly | AdDateTime::timeOnly, l.id), both);
  }
}

// The user's default locale (1024) follows LC_ALL, else LC_TIME, else LANG, at
// each call. Format writes in it, and ParseDateTime reads in it a second time a
// text that the thread's locale ("C" here) refuses, cut before a "." in 20th
// place. The system default (2048) is the process-wide locale.
TEST(FormatInLocale, DefaultLocales) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  const struct {
    const char* lc_all;
    const char* lc_time;
    const char* lang;
    const char* both;
    bool second_read;  // of `both` with ".5": 19 bytes that "C" refuses
  } cases[] = {
      {nullptr, nullptr, "de_DE.UTF-8", "17.05.2003 14:03:09", true},
      {nullptr, "fr_FR.UTF-8", "de_DE.UTF-8", "17/05/2003 14:03:09", true},
      {"en_US.UTF-8", "fr_FR.UTF-8", "de_DE.UTF-8", "05/17/2003 02:03:09 PM", false},
      {"", "", "de_DE.utf8", "17.05.2003 14:03:09", true},  // empty counts as unset
      {"xx_XX.UTF-8", "fr_FR.UTF-8", nullptr, "05/17/03 14:03:09", false},  // "C"
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(testing::Message() << "row " << &c - cases);
    const EnvGuard lc_all("LC_ALL", c.lc_all);
    const EnvGuard lc_time("LC_TIME", c.lc_time);
    const EnvGuard lang("LANG", c.lang);
    EXPECT_EQ(kMay17.Format(AdDateTime::dateAndTime, AdDateTime::userDefaultLocale),
              c.both);
    AdDateTime read;
    EXPECT_EQ(read.ParseDateTime((std::string(c.both) + ".5").c_str()), c.second_read);
  }
  ASSERT_NE(std::setlocale(LC_ALL, "de_DE.UTF-8"), nullptr);
  EXPECT_EQ(kMay17.Format(AdDateTime::dateOnly, AdDateTime::systemDefaultLocale),
            "17.05.2003");
  std::setlocale(LC_ALL, "C");
}

// An identifier that names no locale, or one that is not installed, writes as
// "C"; so do the default locales when the environment names garbage. LOCPATH,
// set with the compiled test locales, keeps ru_RU, zh_CN and ko_KR out of reach.
TEST(FormatInLocale, UnknownAndMissingLocalesWriteAsC) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  constexpr const char* kC = "05/17/03 14:03:09";
  const std::string long_name(4096, 'x');
  const char* const garbage[] = {"de_DE.NOSUCHCODESET", "../../../../etc/passwd",
                                 "\xFF\xFE\x80", long_name.c_str()};
  for (const char* name : garbage) {
    SCOPED_TRACE(testing::PrintToString(name));
    const EnvGuard lc_all("LC_ALL", name);
    const EnvGuard lang("LANG", name);
    for (const std::uint32_t id :
         {0u, 0xFFFFFFFFu, 1024u + 0x10000u, 1049u, 1024u, 2048u}) {
      EXPECT_EQ(kMay17.Format(AdDateTime::dateAndTime, id), kC) << id;
    }
    // The second read of a text with a fraction is in "C" too.
    AdDateTime read;
    EXPECT_EQ(read.ParseDateTime("2003-05-17 14:03:09.5"), 1);
    EXPECT_EQ(read.GetCTime().GetTime(), 1053180189);
  }
}

// A thread keeps the locales it opened, each with the LOCPATH it was found
// under: a LOCPATH that no longer holds a locale, or holds it again, is seen at
// the next call, as are more locales than the thread keeps.
TEST(FormatInLocale, FollowsLocalePath) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  const char* const test_locales = std::getenv("LOCPATH");
  const struct {
    const char* locale_path;
    std::uint32_t id;
    const char* text;
  } in_turn[] = {
      {test_locales, 1031, "17.05.2003 14:03:09"},
      {"/nonexistent", 1031, "05/17/03 14:03:09"},
      {test_locales, 1031, "17.05.2003 14:03:09"},
      {test_locales, 1036, "17/05/2003 14:03:09"},
      {test_locales, 1033, "05/17/2003 02:03:09 PM"},
      {test_locales, 2057, "17/05/03 14:03:09"},
      {test_locales, 1041, "2003年05月17日 14時03分09秒"},
      {test_locales, 1031, "17.05.2003 14:03:09"},  // more locales than a thread keeps
  };
  for (const auto& step : in_turn) {
    const EnvGuard locale_path("LOCPATH", step.locale_path);
    EXPECT_EQ(kMay17.Format(AdDateTime::dateAndTime, step.id), step.text)
        << step.id << " under " << step.locale_path;
  }
}

}  // namespace
