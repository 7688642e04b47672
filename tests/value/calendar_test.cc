#include <gtest/gtest.h>

#include <climits>
#include <cstdio>

#include "AdDateTime.h"
#include "platform/civil.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::LocalFieldsText;
using datetimelib::testing::TzGuard;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

TEST(IsLeapYear, GregorianRuleForEveryYearNumber) {
  const struct {
    long year;
    int leap;
  } cases[] = {{1900, 0}, {2000, 1}, {2004, 1}, {2100, 0}, {2003, 0}, {1600, 1},
               {0, 1},    {-4, 1},   {-100, 0}, {-400, 1}, {-1, 0},   {LONG_MIN, 1}};
  for (const auto& c : cases) {
    EXPECT_EQ(IsLeapYear(c.year), c.leap) << c.year;
  }
}

TEST(GetDaysInMonth, AnyMonthNumber) {
  const struct {
    long year, month, days;
  } cases[] = {
      {2000, 2, 29},  {1900, 2, 28}, {2100, 2, 28},  {1600, 2, 29}, {2003, 4, 30},
      {2003, 12, 31}, {2003, 1, 31}, {2003, 7, 31},  {2003, 8, 31}, {2003, 11, 30},
      {2003, 13, 30}, {2003, 0, 30}, {2003, -2, 30}, {-4, 2, 29},   {2003, LONG_MIN, 30},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(GetDaysInMonth(c.year, c.month), c.days) << c.year << "-" << c.month;
  }
}

TEST(Week, StartAndEndDates) {
  TzGuard tz("America/New_York");
  const struct {
    long year, month, day;
    const char* start;
    const char* end;
  } cases[] = {
      {2003, 6, 18, "2003-06-15 00:00:00", "2003-06-21 00:00:00"},  // Wednesday
      {2003, 6, 15, "2003-06-15 00:00:00", "2003-06-21 00:00:00"},  // Sunday
      {2003, 6, 21, "2003-06-15 00:00:00", "2003-06-21 00:00:00"},  // Saturday
      {2004, 1, 1, "2003-12-28 00:00:00", "2004-01-03 00:00:00"},   // across a year
      {2003, 4, 1, "2003-03-30 00:00:00", "2003-04-05 00:00:00"},   // across a month
      {2000, 13, 1, "2000-12-31 00:00:00", "2001-01-06 00:00:00"},  // carried date
      {2003, 4, 8, "2003-04-06 00:00:00", "2003-04-12 00:00:00"},   // DST starts 04-06
      {2003, 10, 24, "2003-10-19 00:00:00", "2003-10-25 00:00:00"},
      {2003, 10, 27, "2003-10-26 00:00:00", "2003-11-01 00:00:00"},  // DST ends 10-26
      {2038, 1, 12, "2038-01-10 00:00:00", "2038-01-16 00:00:00"},
      {1970, 1, 4, "1970-01-04 00:00:00", "1970-01-10 00:00:00"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.start);
    const AdDateTime start = GetWeekStartDate(c.year, c.month, c.day);
    const AdDateTime end = GetWeekEndDate(c.year, c.month, c.day);
    EXPECT_EQ(start.GetStatus(), AdDateTime::valid);
    EXPECT_EQ(start.Format(kCanonical), c.start);
    EXPECT_EQ(end.GetStatus(), AdDateTime::valid);
    EXPECT_EQ(end.Format(kCanonical), c.end);
  }
}

TEST(Week, RefusedDatesAndRangeEnds) {
  TzGuard tz("UTC");
  const struct {
    long year, month, day;
    bool end;
    AdDateTime::AdDateTimeStatus status;
    const char* kept;
  } cases[] = {
      // The date itself is refused: invalid, with the noon fields kept.
      {1969, 12, 31, false, AdDateTime::invalid, "1969/12/31 12:0:0"},
      {2039, 1, 1, true, AdDateTime::invalid, "2039/1/1 12:0:0"},
      // The date is fine, but its week leaves the range.
      {1970, 1, 1, false, AdDateTime::outOfRange, "1969/12/28 0:0:0"},
      {1970, 1, 3, false, AdDateTime::outOfRange, "1969/12/28 0:0:0"},
      {1899, 12, 30, false, AdDateTime::outOfRange, "1969/12/28 0:0:0"},
      {2038, 1, 17, true, AdDateTime::outOfRange, "2038/1/23 0:0:0"},
      {2038, 1, 18, true, AdDateTime::outOfRange, "2038/1/23 0:0:0"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.kept);
    const AdDateTime result = c.end ? GetWeekEndDate(c.year, c.month, c.day)
                                    : GetWeekStartDate(c.year, c.month, c.day);
    EXPECT_EQ(result.GetStatus(), c.status);
    // Format hands the text back only for outOfRange; SetStatus shows it anyway.
    AdDateTime shown = result;
    shown.SetStatus(AdDateTime::outOfRange);
    EXPECT_EQ(shown.Format(kCanonical), c.kept);
  }
  EXPECT_EQ(GetWeekStartDate(1970, 1, 4).GetStatus(), AdDateTime::valid);
  EXPECT_EQ(GetWeekEndDate(2038, 1, 16).GetStatus(), AdDateTime::valid);
}

// Every day of the range: the start is a Sunday no later than the date, the end
// the Saturday six days after it, both at midnight.
TEST(Week, EveryDayOfTheRange) {
  TzGuard tz("America/New_York");
  using datetimelib::platform::CivilFromDays;
  using datetimelib::platform::DaysFromCivil;
  const std::int64_t first = DaysFromCivil(1970, 1, 4);
  const std::int64_t last = DaysFromCivil(2038, 1, 16);
  for (std::int64_t days = first; days <= last; ++days) {
    const auto date = CivilFromDays(days);
    const long year = static_cast<long>(date.year);
    const AdDateTime start = GetWeekStartDate(year, date.month, date.day);
    const AdDateTime end = GetWeekEndDate(year, date.month, date.day);
    ASSERT_TRUE(start.IsValid() && end.IsValid()) << year << "-" << date.month;
    const std::int64_t start_days =
        DaysFromCivil(start.GetYear(), static_cast<int>(start.GetMonth()),
                      static_cast<int>(start.GetDay()));
    const std::int64_t end_days = DaysFromCivil(
        end.GetYear(), static_cast<int>(end.GetMonth()), static_cast<int>(end.GetDay()));
    ASSERT_EQ(start.GetDayOfWeek(), 1) << days;
    ASSERT_LE(start_days, days);
    ASSERT_GT(start_days + 7, days);
    ASSERT_EQ(end_days, start_days + 6) << days;
    ASSERT_EQ(start.GetHour() + start.GetMinute() + start.GetSecond(), 0) << days;
    ASSERT_EQ(end.GetHour() + end.GetMinute() + end.GetSecond(), 0) << days;
  }
}

TEST(Week, MembersAskOfTheLocalDate) {
  TzGuard tz("America/New_York");
  const AdDateTime sunday_late(2003, 6, 15, 23, 30, 0);
  EXPECT_EQ(sunday_late.GetWeekStartDate().Format(kCanonical), "2003-06-15 00:00:00");
  EXPECT_EQ(sunday_late.GetWeekEndDate().Format(kCanonical), "2003-06-21 00:00:00");
  const AdDateTime leap_february(2004, 2, 10, 10, 0, 0);
  EXPECT_EQ(leap_february.GetDaysInMonth(), 29);
  EXPECT_EQ(leap_february.IsLeapYear(), 1);
  EXPECT_EQ(AdDateTime(2003, 2, 10, 10, 0, 0).GetDaysInMonth(), 28);
}

// Arithmetic is on the count: noon plus one day across the spring change reads
// 13:00 local.
TEST(Arithmetic, DayAcrossDaylightSavingChange) {
  TzGuard tz("America/New_York");
  const AdDateTime noon(2003, 4, 5, 12, 0, 0);
  EXPECT_EQ(LocalFieldsText(noon + AdDuration(1.0)), "2003-04-06 13:00:00");
  EXPECT_EQ(LocalFieldsText(AdDateTime(2000, 3, 1, 0, 0, 0) - AdDuration(1.0)),
            "2000-02-29 00:00:00");
}

}  // namespace
