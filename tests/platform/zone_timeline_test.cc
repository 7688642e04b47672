#include "platform/zone_timeline.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <thread>
#include <vector>

#include "platform/civil.h"
#include "platform/current_zone.h"
#include "platform/local_time.h"
#include "support/env_guard.h"
#include "support/glibc_agreement.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::platform::BreakDownLocal;
using datetimelib::platform::ComposeLocal;
using datetimelib::testing::CheckAgreementWithGlibc;
using datetimelib::testing::TzGuard;

// A sample of the full sweep (datetimelib_zone_sweep): zones that each stress
// one reading rule, and rule strings in TZ.
TEST(ZoneEngine, AgreesWithGlibcOnSampleZones) {
  const char* zones[] = {
      "America/New_York",                // ordinary northern DST, 2007 rule change
      "Australia/Sydney",                // southern: DST spans the new year
      "Australia/Lord_Howe",             // half-hour DST
      "Europe/Dublin",                   // winter written as daylight time (negative DST)
      "Africa/Casablanca",               // daylight time suspended each Ramadan
      "Pacific/Apia",                    // skipped a whole day in 2011
      "Asia/Kolkata",                    // fractional offset, no DST since 1945
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
      "Foo/Bar",                          // unreadable: UTC named "Foo"
      "",                                 // empty: UTC
  };
  for (const char* zone : zones) {
    SCOPED_TRACE(zone);
    const auto report = CheckAgreementWithGlibc(zone, /*step_hours=*/3);
    EXPECT_GT(report.instants_checked, 190000);
    EXPECT_TRUE(report.mismatches.empty()) << report.mismatches.front();
  }
}

// A daylight name without rules borrows posixrules' transitions, moved to its
// own offsets: with New York's offsets they are New York's transitions exactly.
// (glibc moves them by a daylight offset left from an earlier TZ, so they depend
// on the process's history; that is not reproduced.)
TEST(ZoneEngine, RuleWithoutDatesBorrowsPosixrulesTransitions) {
  std::vector<std::int32_t> new_york;
  {
    TzGuard tz("America/New_York");
    for (std::int64_t t = 0; t < INT32_MAX; t += 3600 * 7)
      new_york.push_back(BreakDownLocal(t).utc_offset);
  }
  TzGuard tz("XST5XDT");
  std::size_t i = 0;
  for (std::int64_t t = 0; t < INT32_MAX; t += 3600 * 7, ++i) {
    const auto fields = BreakDownLocal(t);
    ASSERT_EQ(fields.utc_offset, new_york[i]) << t;
    // After posixrules' last transition (2037) its footer rule speaks, names and all.
    if (t < 2120000000) {
      ASSERT_STREQ(fields.abbreviation, fields.is_dst ? "XDT" : "XST") << t;
    }
  }
}

// Which side of a skipped hour a local time lands on, and the first of two
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
    SCOPED_TRACE(c.zone);
    const auto civil =
        datetimelib::platform::CivilSeconds(c.year, c.month, c.day, c.hour, c.minute, 0);
    for (const std::int64_t before :
         {std::int64_t{1057000000}, std::int64_t{1073000000}}) {
      BreakDownLocal(before);  // summer, then winter, asked first
      EXPECT_EQ(ComposeLocal(*civil), c.expected);
    }
  }
}

// A zone file replaced under the same name is read again within a second; a
// changed TZ at once.
TEST(CurrentZone, SeesReplacedFileAndChangedTz) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  namespace fs = std::filesystem;
  fs::copy_file("/usr/share/zoneinfo/Asia/Tokyo", folder.Path("Here"));
  datetimelib::testing::EnvGuard tzdir("TZDIR", folder.path().c_str());
  TzGuard tz("Here");
  EXPECT_EQ(BreakDownLocal(0).utc_offset, 9 * 3600);

  fs::copy_file("/usr/share/zoneinfo/Asia/Kolkata", folder.Path("Here.new"));
  fs::rename(folder.Path("Here.new"), folder.Path("Here"));
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  EXPECT_EQ(BreakDownLocal(0).utc_offset, 19800);

  TzGuard::Set("UTC");
  EXPECT_EQ(BreakDownLocal(0).utc_offset, 0);
}

// Threads share no zone: each compiles its own, and all agree.
TEST(CurrentZone, ThreadsAgree) {
  TzGuard tz("Australia/Lord_Howe");
  const auto expected = [](std::int64_t t) { return BreakDownLocal(t).utc_offset; };
  std::vector<std::int32_t> offsets;
  for (std::int64_t t = 0; t < INT32_MAX; t += 86400 * 11) offsets.push_back(expected(t));
  std::vector<std::thread> threads;
  std::vector<int> failures(4, 0);
  for (int n = 0; n < 4; ++n) {
    threads.emplace_back([&offsets, &failures, n] {
      std::size_t i = 0;
      for (std::int64_t t = 0; t < INT32_MAX; t += 86400 * 11, ++i) {
        if (BreakDownLocal(t).utc_offset != offsets[i])
          ++failures[static_cast<std::size_t>(n)];
        if (ComposeLocal(t + offsets[i]) != t) ++failures[static_cast<std::size_t>(n)];
      }
    });
  }
  for (auto& thread : threads) thread.join();
  EXPECT_EQ(failures, std::vector<int>(4, 0));
}

}  // namespace
