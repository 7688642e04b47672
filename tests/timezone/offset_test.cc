#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "AdDateTime.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

TEST(GetGMTOffset, StandardMinutesPositiveWest) {
  const struct {
    const char* tz;
    double minutes;
  } cases[] = {
      // West of Greenwich: positive, daylight saving never counted.
      {"EST5EDT,M3.2.0,M11.1.0", 300.0},
      {"America/New_York", 300.0},
      {"America/St_Johns", 210.0},  // UTC-3:30
      {"<-0325>3:25:45", 205.0},    // 12 345 s: truncated, not 205.75
      // East: negative.
      {"<+01>-1", -60.0},
      {"Europe/Berlin", -60.0},
      {"Asia/Kolkata", -330.0},
      {"<+0325>-3:25:45", -205.0},  // truncated toward zero, not -206
      // Europe/Dublin's standard time is Irish summer time, UTC+1.
      {"Europe/Dublin", -60.0},
      // GMT itself, and TZ empty.
      {"UTC0", 0.0},
      {"", 0.0},
  };
  for (const auto& c : cases) {
    TzGuard tz(c.tz);
    EXPECT_EQ(AdDateTime::GetGMTOffset(), c.minutes) << c.tz;
  }
}

TEST(UsesDST, WhetherTheCurrentRuleHasDaylightSaving) {
  const struct {
    const char* tz;
    int uses;
  } cases[] = {
      {"EST5EDT,M3.2.0,M11.1.0", 1},
      {"XST3XDT", 1},  // a daylight name without rules gets the C library's rules
      {"America/New_York", 1},
      {"Europe/Dublin", 1},  // winter is its daylight part
      {"<+0530>-5:30", 0},
      {"UTC0", 0},
      // Daylight saving in the past only; the C library's `daylight` says 1.
      {"Asia/Tokyo", 0},         // last used in 1951
      {"Asia/Kolkata", 0},       // last used in 1945
      {"Europe/Moscow", 0},      // permanent standard time since 2014
      {"America/Sao_Paulo", 0},  // abolished in 2019
  };
  for (const auto& c : cases) {
    TzGuard tz(c.tz);
    EXPECT_EQ(AdDateTime::UsesDST(), c.uses) << c.tz;
  }
}

// Every call reads TZ afresh: setenv alone, without tzset(), is enough.
TEST(TimeZoneQueries, FollowTzChangedBetweenCalls) {
  TzGuard tz("EST5EDT,M3.2.0,M11.1.0");
  std::string start, end;
  EXPECT_EQ(AdDateTime::GetGMTOffset(), 300.0);
  EXPECT_EQ(AdDateTime::UsesDST(), 1);
  EXPECT_EQ(AdDateTime::GetDSTDates(nullptr, 2007, start, end), 1);
  EXPECT_EQ(start, "2007-03-11 01:59:59");

  setenv("TZ", "CET-1CEST,M3.5.0,M10.5.0/3", 1);
  EXPECT_EQ(AdDateTime::GetGMTOffset(), -60.0);
  EXPECT_EQ(AdDateTime::GetDSTDates(nullptr, 2007, start, end), 1);
  EXPECT_EQ(start, "2007-03-25 01:59:59");
  EXPECT_EQ(end, "2007-10-28 03:00:00");

  setenv("TZ", "JST-9", 1);
  EXPECT_EQ(AdDateTime::GetGMTOffset(), -540.0);
  EXPECT_EQ(AdDateTime::UsesDST(), 0);
  EXPECT_EQ(AdDateTime::GetDSTDates(nullptr, 2007, start, end), 0);
}

}  // namespace
