#include <gtest/gtest.h>

#include <climits>
#include <ctime>

#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::LocalFieldsText;
using datetimelib::testing::TzGuard;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

TEST(Calendar, LeapYearsAndMonthLengthsForAnyNumber) {
  const struct {
    long year, month, days;
  } cases[] = {
      {2000, 2, 29},  {1900, 2, 28}, {2004, 2, 29},     {2100, 2, 28},  // the leap rule
      {0, 2, 29},     {-100, 2, 28}, {LONG_MIN, 2, 29},                 // any year number
      {2003, 13, 30}, {2003, 0, 30},  // any month number
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(std::to_string(c.year) + "-" + std::to_string(c.month));
    EXPECT_EQ(GetDaysInMonth(c.year, c.month), c.days);
    if (c.month == 2) {
      EXPECT_EQ(IsLeapYear(c.year), c.days == 29 ? 1 : 0);
    }
  }
  // Every month against the C library: day 0 of the next month.
  for (int month = 1; month <= 12; ++month) {
    std::tm fields{};
    fields.tm_year = 103;
    fields.tm_mon = month;
    timegm(&fields);
    EXPECT_EQ(GetDaysInMonth(2003, month), fields.tm_mday) << month;
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
      // The week leaves the range: the day that could not be built is kept.
      {1970, 1, 3, false, AdDateTime::outOfRange, "1969/12/28 0:0:0"},
      {1899, 12, 30, false, AdDateTime::outOfRange, "1969/12/28 0:0:0"},
      {2038, 1, 17, true, AdDateTime::outOfRange, "2038/1/23 0:0:0"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.kept);
    AdDateTime result = c.end ? GetWeekEndDate(c.year, c.month, c.day)
                              : GetWeekStartDate(c.year, c.month, c.day);
    EXPECT_EQ(result.GetStatus(), c.status);
    result.SetStatus(AdDateTime::outOfRange);  // Format shows the text only then
    EXPECT_EQ(result.Format(kCanonical), c.kept);
  }
  EXPECT_TRUE(GetWeekStartDate(1970, 1, 4).IsValid());
  EXPECT_TRUE(GetWeekEndDate(2038, 1, 16).IsValid());
}

// Every day of the range: the start is a Sunday no later than the date, the end
// the Saturday six days after it, both at midnight.
TEST(Week, EveryDayOfTheRange) {
  TzGuard tz("America/New_York");
  using datetimelib::platform::CivilFromDays;
  using datetimelib::platform::DaysFromCivil;
  const auto days_of = [](const AdDateTime& value) {
    return DaysFromCivil(value.GetYear(), static_cast<int>(value.GetMonth()),
                         static_cast<int>(value.GetDay()));
  };
  for (std::int64_t days = DaysFromCivil(1970, 1, 4); days <= DaysFromCivil(2038, 1, 16);
       ++days) {
    const auto date = CivilFromDays(days);
    const long year = static_cast<long>(date.year);
    const AdDateTime start = GetWeekStartDate(year, date.month, date.day);
    const AdDateTime end = GetWeekEndDate(year, date.month, date.day);
    ASSERT_TRUE(start.IsValid() && end.IsValid()) << days;
    ASSERT_EQ(start.GetDayOfWeek(), 1) << days;
    ASSERT_LE(days_of(start), days);
    ASSERT_GT(days_of(start) + 7, days);
    ASSERT_EQ(days_of(end), days_of(start) + 6) << days;
    ASSERT_EQ(start.GetHour() + start.GetMinute() + end.GetHour() + end.GetMinute(), 0)
        << days;
  }
}

// The members ask of the local date (Sunday 23:30 in New York is Monday in
// UTC), and arithmetic is on the count: noon plus a day across the spring
// change reads 13:00.
TEST(Calendar, MembersAskOfTheLocalDate) {
  TzGuard tz("America/New_York");
  const AdDateTime sunday_late(2003, 6, 15, 23, 30, 0);
  EXPECT_EQ(sunday_late.GetWeekStartDate().Format(kCanonical), "2003-06-15 00:00:00");
  EXPECT_EQ(sunday_late.GetWeekEndDate().Format(kCanonical), "2003-06-21 00:00:00");
  const AdDateTime leap_february(2004, 2, 10, 10, 0, 0);
  EXPECT_EQ(leap_february.GetDaysInMonth() * 10 + leap_february.IsLeapYear(), 291);
  EXPECT_EQ(LocalFieldsText(AdDateTime(2003, 4, 5, 12, 0, 0) + AdDuration(1.0)),
            "2003-04-06 13:00:00");
}

}  // namespace
