#include "platform/local_time.h"

#include <gtest/gtest.h>

#include <ctime>

#include "platform/civil.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::platform::BreakDownLocal;
using datetimelib::platform::BreakDownUtc;
using datetimelib::platform::ComposeLocal;
using datetimelib::testing::TzGuard;

constexpr const char* kZones[] = {
    "UTC",
    "<+01>-1",
    "America/New_York",
    "Europe/Berlin",
    "Australia/Sydney",
    "Asia/Kolkata",
    "Pacific/Chatham",
    "Europe/Dublin",
    "XST5XDT,M4.1.0/2,M10.5.0/2",
};

// Breakdown agrees with localtime_r, and every local time that occurs once
// composes back to its instant, over 1970-2038 every 7 hours and 13 minutes.
TEST(LocalTime, AgreesWithLocaltimeR) {
  for (const char* zone : kZones) {
    TzGuard tz(zone);
    SCOPED_TRACE(zone);
    for (std::int64_t t = 0; t < INT32_MAX - 26180; t += 26180) {
      const time_t tt = static_cast<time_t>(t);
      std::tm expected{};
      ASSERT_NE(localtime_r(&tt, &expected), nullptr);
      const auto got = BreakDownLocal(t);
      ASSERT_EQ(got.year, expected.tm_year + 1900) << t;
      ASSERT_EQ(got.month, expected.tm_mon + 1) << t;
      ASSERT_EQ(got.day, expected.tm_mday) << t;
      ASSERT_EQ(got.hour, expected.tm_hour) << t;
      ASSERT_EQ(got.minute, expected.tm_min) << t;
      ASSERT_EQ(got.second, expected.tm_sec) << t;
      ASSERT_EQ(got.weekday, expected.tm_wday) << t;
      ASSERT_EQ(got.yearday, expected.tm_yday) << t;
      ASSERT_EQ(got.utc_offset, expected.tm_gmtoff) << t;
      ASSERT_EQ(got.is_dst, expected.tm_isdst > 0) << t;

      const std::int64_t civil = t + got.utc_offset;
      const std::int64_t composed = ComposeLocal(civil);
      // Where the local time repeats, the earlier instant is chosen.
      if (composed != t) {
        ASSERT_LT(composed, t) << t;
        ASSERT_EQ(composed + BreakDownLocal(composed).utc_offset, civil) << t;
      }
    }
  }
}

TEST(LocalTime, UtcBreakdown) {
  const auto epoch = BreakDownUtc(0);
  EXPECT_EQ(epoch.year, 1970);
  EXPECT_EQ(epoch.weekday, 4);
  EXPECT_STREQ(epoch.abbreviation, "GMT");
  const auto before = BreakDownUtc(-1);
  EXPECT_EQ(before.year, 1969);
  EXPECT_EQ(before.hour, 23);
  EXPECT_EQ(before.yearday, 364);
  const auto last = BreakDownUtc(INT32_MAX);
  EXPECT_EQ(last.day, 19);
  EXPECT_EQ(last.second, 7);
}

// Composition carries the pre-change offset across a gap and takes the first of
// two readings, in zones whose changes differ in size and direction.
TEST(LocalTime, GapsAndFolds) {
  const struct {
    const char* zone;
    int year, month, day, hour, minute;
    int utc_hour, utc_minute, utc_day;  // expected instant, UTC
  } cases[] = {
      // New York, spring 2003: 02:30 does not exist; read as EST.
      {"America/New_York", 2003, 4, 6, 2, 30, 7, 30, 6},
      // New York, autumn 2003: 01:30 twice; EDT first.
      {"America/New_York", 2003, 10, 26, 1, 30, 5, 30, 26},
      // Chatham, spring 2010: 02:45 -> 03:45, a 1-hour gap at a quarter hour.
      {"Pacific/Chatham", 2010, 9, 26, 3, 0, 14, 15, 25},
      // Lord Howe changes by half an hour: 02:15 on 2010-10-03 does not exist.
      {"Australia/Lord_Howe", 2010, 10, 3, 2, 15, 15, 45, 2},
      // Sydney, autumn 2010: 02:30 twice on 4 April; AEDT (+11) first.
      {"Australia/Sydney", 2010, 4, 4, 2, 30, 15, 30, 3},
  };
  for (const auto& c : cases) {
    TzGuard tz(c.zone);
    SCOPED_TRACE(c.zone);
    const auto civil =
        datetimelib::platform::CivilSeconds(c.year, c.month, c.day, c.hour, c.minute, 0);
    ASSERT_TRUE(civil);
    const auto utc = BreakDownUtc(ComposeLocal(*civil));
    EXPECT_EQ(utc.day, c.utc_day);
    EXPECT_EQ(utc.hour, c.utc_hour);
    EXPECT_EQ(utc.minute, c.utc_minute);
  }
}

}  // namespace
