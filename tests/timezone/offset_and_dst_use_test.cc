#include <gtest/gtest.h>

#include <cstdlib>

#include "AdDateTime.h"
#include "support/tz_guard.h"

namespace {

// The standard offset in minutes (positive west, truncated toward zero, daylight
// saving never counted) and whether the zone's current rule has daylight saving.
// Each row sets TZ with setenv alone, without tzset(): every call reads the zone
// in force at that moment. (GetDSTDates follows a changed TZ in dst_table_test.)
TEST(TimeZoneQueries, FollowTheZoneInForceAtEachCall) {
  const struct {
    const char* tz;
    double minutes;
    int uses_dst;
  } cases[] = {
      {"America/New_York", 300.0, 1},
      {"", 0.0, 0},  // TZ empty: UTC
      // 12 345 s: 205.75 minutes, truncated toward zero on both sides.
      {"<-0325>3:25:45", 205.0, 0},
      {"<+0325>-3:25:45", -205.0, 0},
      // Winter is Dublin's daylight part, so its standard time is UTC+1.
      {"Europe/Dublin", -60.0, 1},
      // Daylight saving in the past only (abolished in 2019); the C library's
      // `daylight` says 1.
      {"America/Sao_Paulo", 180.0, 0},
  };
  const datetimelib::testing::TzGuard restore(nullptr);
  for (const auto& c : cases) {
    setenv("TZ", c.tz, 1);
    EXPECT_EQ(AdDateTime::GetGMTOffset(), c.minutes) << c.tz;
    EXPECT_EQ(AdDateTime::UsesDST(), c.uses_dst) << c.tz;
  }
}

}  // namespace
