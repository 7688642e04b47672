#include <gtest/gtest.h>

#include <ctime>
#include <filesystem>
#include <optional>

#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "platform/zone/local_time.h"
#include "support/fixed_clock.h"
#include "support/glibc_agreement.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::platform::BreakDownLocal;
using datetimelib::platform::ComposeLocal;
using datetimelib::testing::TzGuard;

// A sample of the full sweep (datetimelib_zone_sweep): zones that each stress
// one reading rule, and rule strings in TZ.
TEST(ZoneEngine, AgreesWithGlibcOnSampleZones) {
  const char* zones[] = {
      "America/New_York",                // ordinary northern DST, 2007 rule change
      "Australia/Sydney",                // southern: DST spans the new year
      "Australia/Lord_Howe",             // half-hour DST
      "Pacific/Chatham",                 // changes at a quarter to the hour
      "Europe/Dublin",                   // winter written as daylight time (negative DST)
      "Africa/Casablanca",               // daylight time suspended each Ramadan
      "Pacific/Apia",                    // skipped a whole day in 2011
      "Asia/Kolkata",                    // fractional offset, no DST since 1945
      "Asia/Kathmandu",                  // "+0545": a quarter-hour offset, named by it
      "America/Sao_Paulo",               // DST abolished in 2019
      "Europe/Moscow",                   // permanent summer time 2011-2014
      "Etc/GMT-14",                      // no transitions at all
      "EST5EDT,M3.2.0/-1,M11.1.0/26",    // negative and >24 h change times
      "ACST-9:30ACDT,M10.1.0,M4.1.0/3",  // southern rule string
      "<+13>-13<+14>,M9.5.0/3,M4.1.0/4",  // southern, far east of UTC
      "XXX-13YYY,J1/0,M7.1.0",            // a change in the UTC year before its own
      "XXX3YYY,J60/0,J300/25",            // Julian days without 29 February
      "ZZZ-12:45ZZY,0/0,364/-3",          // zero-based days, negative time
      "<+0530>-5:30",                     // no DST, quoted name
      "XST-1XDT0,M10.5.0/3,M3.5.0/3",     // winter as daylight time; gaps at 03:00
      "Foo/Bar",                          // unreadable: UTC named "Foo"
      ":Foo/Bar",                         // the same after the ":"
      "<+0545>",                          // unreadable: UTC named "+0545"
      "",                                 // empty: UTC
  };
  for (const char* zone : zones) {
    SCOPED_TRACE(zone);
    const auto report = datetimelib::testing::CheckAgreementWithGlibc(zone, 3);
    EXPECT_GT(report.instants_checked, 190000);
    EXPECT_TRUE(report.mismatches.empty()) << report.mismatches.front();
  }
}

// Beyond 2038 the footer rule answers, as periods laid out up to 2100 (2099 the
// last year) and per instant past them: still localtime_r's offsets, at the
// first instant of 2100 too (a change falls on it in the second zone); and the
// first type before a zone file's first transition (1800).
TEST(ZoneEngine, AgreesWithGlibcPastTheLaidOutPeriods) {
  constexpr std::int64_t k2100 = 4102444800, k2045 = 2366841600, k1800 = -5364662400;
  for (const char* zone :
       {"America/New_York", "XST0XDT-1,J1/0,J60/0", "XST-1XDT0,M10.5.0/3,M3.5.0/3"}) {
    TzGuard tz(zone);
    for (const std::int64_t from : {k2045, k2100 - 300 * 86400, k1800}) {
      for (std::int64_t t = from; t < from + 400 * 86400;
           t += t >= k2100 - 3 && t < k2100 + 3 ? 1 : 86399) {
        const std::time_t instant = static_cast<std::time_t>(t);
        std::tm libc{};
        localtime_r(&instant, &libc);
        ASSERT_EQ(BreakDownLocal(t).utc_offset, libc.tm_gmtoff) << zone << " " << t;
      }
    }
    // Local times of 2101 every half hour, gaps and folds included, as mktime
    // composes them; a repeated one at its first instant, which mktime may not give.
    for (std::int64_t civil = k2100 + 365 * 86400; civil < k2100 + 730 * 86400;
         civil += 1800) {
      const std::time_t as_utc = static_cast<std::time_t>(civil);
      std::tm fields{};
      gmtime_r(&as_utc, &fields);
      fields.tm_isdst = -1;
      const std::int64_t expected = mktime(&fields), ours = ComposeLocal(civil);
      if (ours == expected) continue;
      ASSERT_LT(ours, expected) << zone << " " << civil;
      ASSERT_EQ(ours + BreakDownLocal(ours).utc_offset, civil) << zone << " " << civil;
    }
  }
}

// A daylight name without rules borrows posixrules' transitions (New York's),
// with its own names: in 2006 daylight time began on 2 April, not on the 12 March
// of ",M3.2.0". (glibc moves them by a daylight offset left from an earlier TZ,
// so they depend on the process's history; that is not reproduced.)
TEST(ZoneEngine, RuleWithoutDatesBorrowsPosixrulesTransitions) {
  TzGuard tz("XST5XDT");
  EXPECT_STREQ(BreakDownLocal(1143961199).abbreviation, "XST");  // 01:59:59 EST
  EXPECT_STREQ(BreakDownLocal(1143961200).abbreviation, "XDT");  // 03:00:00 EDT
}

// Which side of a skipped time a local time lands on, and the first of two
// readings; the same whatever was asked before.
TEST(ZoneEngine, GapsAndFoldsAreDeterministic) {
  const struct {
    const char* zone;
    int year, month, day, hour, minute;
    std::int64_t expected;  // unix seconds
  } cases[] = {
      // New York 2003-04-06 02:30 does not exist: 03:30 EDT.
      {"America/New_York", 2003, 4, 6, 2, 30, 1049614200},
      // New York 2003-10-26 01:30 twice: the EDT reading.
      {"America/New_York", 2003, 10, 26, 1, 30, 1067146200},
      // Dublin 2019-03-31 01:30 does not exist; winter (GMT) is Dublin's
      // daylight time, so it lands back at 00:30 UTC, as mktime does.
      {"Europe/Dublin", 2019, 3, 31, 1, 30, 1553992200},
      // Dublin 2019-10-27 01:30 twice: the first (IST) reading, 00:30 UTC.
      {"Europe/Dublin", 2019, 10, 27, 1, 30, 1572136200},
  };
  for (const auto& c : cases) {
    TzGuard tz(c.zone);
    const auto civil =
        datetimelib::platform::CivilSeconds(c.year, c.month, c.day, c.hour, c.minute, 0);
    for (const std::int64_t before : {1057000000, 1073000000}) {
      BreakDownLocal(before);  // summer, then winter, asked first
      EXPECT_EQ(ComposeLocal(*civil), c.expected) << c.zone << " after " << before;
    }
  }
}

// A zone file replaced under the same name is read again in the next second.
TEST(CurrentZone, SeesReplacedZoneFile) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  std::filesystem::copy_file("/usr/share/zoneinfo/Asia/Tokyo", folder.Path("Here"));
  std::optional<datetimelib::testing::FixedNow> now(std::in_place, 1000000000);
  TzGuard tz(folder.Path("Here").c_str());
  EXPECT_EQ(BreakDownLocal(0).utc_offset, 9 * 3600);
  std::filesystem::copy_file("/usr/share/zoneinfo/Asia/Kolkata", folder.Path("Here.new"));
  std::filesystem::rename(folder.Path("Here.new"), folder.Path("Here"));
  now.reset();
  now.emplace(1000000001);
  EXPECT_EQ(AdDateTime::GetGMTOffset(), -330.0);  // the zone questions look too
  EXPECT_EQ(BreakDownLocal(0).utc_offset, 19800);
}

}  // namespace
