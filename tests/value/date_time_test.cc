#include <gtest/gtest.h>

#include <climits>
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "support/fixed_clock.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::FixedNow;
using datetimelib::testing::LocalFieldsText;
using datetimelib::testing::TzGuard;
using datetimelib::testing::UtcCount;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

struct Fields {
  long year, month, day, hour, minute, second;
};

AdDateTime Make(const Fields& f) {
  return AdDateTime(f.year, f.month, f.day, f.hour, f.minute, f.second);
}

TEST(FieldConstructor, AcceptsAndCarriesFields) {
  TzGuard tz("UTC");
  const struct {
    Fields fields;
    const char* local;
  } cases[] = {
      // Range ends.
      {{1970, 1, 1, 0, 0, 0}, "1970-01-01 00:00:00"},
      {{2038, 1, 18, 23, 59, 59}, "2038-01-18 23:59:59"},
      // Only 2038 tests month and day; the fields then carry as mktime carries them.
      {{2038, 0, 25, 0, 0, 0}, "2037-12-25 00:00:00"},
      {{2000, 13, 1, 0, 0, 0}, "2001-01-01 00:00:00"},
      {{2000, 3, 0, 0, 0, 0}, "2000-02-29 00:00:00"},
      {{2003, 1, 1, 25, 0, 0}, "2003-01-02 01:00:00"},
      // A time of day on 1899-12-30 lands on 1970-01-01.
      {{1899, 12, 30, 10, 30, 0}, "1970-01-01 10:30:00"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.local);
    const AdDateTime value = Make(c.fields);
    EXPECT_EQ(value.GetStatus(), AdDateTime::valid);
    EXPECT_EQ(LocalFieldsText(value), c.local);
  }
  const AdDateTime epoch(1970, 1, 1, 0, 0, 0);
  EXPECT_EQ(epoch.GetCTime().GetTime(), 0);
  EXPECT_EQ(epoch.GetDayOfWeek(), 5);  // Thursday
  EXPECT_EQ(epoch.GetDayOfYear(), 1);
  EXPECT_EQ(AdDateTime(2004, 12, 31, 0, 0, 0).GetDayOfYear(), 366);
}

TEST(FieldConstructor, RefusesWithKeptText) {
  TzGuard tz("UTC");
  const struct {
    Fields fields;
    const char* kept;
  } cases[] = {
      {{2038, 1, 19, 0, 0, 0}, "2038/1/19 0:0:0"},
      {{1969, 12, 31, 23, 59, 59}, "1969/12/31 23:59:59"},
      {{1969, -1, -2, -3, -4, -5}, "1969/-1/-2 -3:-4:-5"},
      {{LONG_MIN, 0, 0, 0, 0, 0}, "-9223372036854775808/0/0 0:0:0"},
      // They pass the range test, but their local time has no 32-bit count.
      {{2038, 1, 18, 1000000, 0, 0}, "2038/1/18 1000000:0:0"},
      {{1899, 12, 30, -1000000, 0, 0}, "1899/12/30 -1000000:0:0"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.kept);
    const AdDateTime value = Make(c.fields);
    EXPECT_EQ(value.GetStatus(), AdDateTime::outOfRange);
    EXPECT_EQ(value.Format(kCanonical), c.kept);
    EXPECT_EQ(value.GetCTime().GetTime(), 0);
  }
}

// East of UTC the first hours of 1970 have negative counts, mktime's -1 among
// them: valid, with correct fields. Far west, the last hours of 2038-01-18 have
// no 32-bit count: refused.
TEST(FieldConstructor, CountsNearTheEndsOfTheRange) {
  {
    TzGuard tz("<+01>-1");
    for (const auto& [fields, count] : {std::pair{Fields{1970, 1, 1, 0, 0, 0}, -3600},
                                        std::pair{Fields{1970, 1, 1, 0, 59, 59}, -1}}) {
      const AdDateTime value = Make(fields);
      ASSERT_EQ(value.GetStatus(), AdDateTime::valid) << count;
      EXPECT_EQ(value.GetCTime().GetTime(), count);
      EXPECT_EQ(value.GetYear() * 10000 + value.GetMonth() * 100 + value.GetDay(),
                19700101);
    }
  }
  TzGuard tz("<-05>5");
  EXPECT_EQ(AdDateTime(2038, 1, 18, 22, 14, 7).GetCTime().GetTime(), INT32_MAX);
  const AdDateTime beyond(2038, 1, 18, 22, 14, 8);
  EXPECT_EQ(beyond.GetStatus(), AdDateTime::outOfRange);
  EXPECT_EQ(beyond.Format(kCanonical), "2038/1/18 22:14:8");
}

// New York, 2003: clocks went forward at 02:00 on 6 April and back at 02:00 on
// 26 October. The answers must not depend on what was asked before.
TEST(FieldConstructor, SkippedAndRepeatedLocalTimesAreDeterministic) {
  TzGuard tz("America/New_York");
  for (const Fields& before :
       {Fields{2003, 7, 1, 12, 0, 0}, Fields{2003, 1, 1, 12, 0, 0}}) {
    SCOPED_TRACE(before.month);
    ASSERT_TRUE(Make(before).IsValid());
    EXPECT_EQ(AdDateTime(2003, 10, 26, 1, 30, 0).GetCTime().GetTime(),
              1067146200);  // EDT
    ASSERT_TRUE(Make(before).IsValid());
    const AdDateTime gap(2003, 4, 6, 2, 30, 0);
    EXPECT_EQ(gap.GetCTime().GetTime(), UtcCount(2003, 4, 6, 7, 30));
    EXPECT_EQ(LocalFieldsText(gap), "2003-04-06 03:30:00");
  }
}

TEST(Status, TransitionsAndKeptText) {
  TzGuard tz("UTC");
  AdDateTime value;
  EXPECT_EQ(value.IsNull(), 1);
  EXPECT_EQ(value.IsValid(), 0);
  EXPECT_EQ(value.GetCTime().GetTime(), 0);

  EXPECT_EQ(value.SetDateTime(2039, 1, 1, 0, 0, 0), 1);  // 1 also when refused
  EXPECT_EQ(value.GetStatus(), AdDateTime::outOfRange);
  const AdDateTime copy(value);
  AdDateTime assigned(AdTime(5));
  assigned = value;
  EXPECT_EQ(copy.Format(kCanonical), "2039/1/1 0:0:0");
  EXPECT_EQ(assigned.Format(kCanonical), "2039/1/1 0:0:0");

  value.SetStatus(AdDateTime::valid);  // the text stays behind
  value.SetStatus(AdDateTime::outOfRange);
  EXPECT_EQ(value.Format(kCanonical), "2039/1/1 0:0:0");

  EXPECT_EQ(value.SetTime(25, 0, 0), 1);  // a valid setting empties the text
  EXPECT_EQ(value.Format(kCanonical), "1970-01-02 01:00:00");
  value.SetStatus(AdDateTime::outOfRange);
  EXPECT_EQ(value.Format(kCanonical), "");
  EXPECT_EQ(value.SetDate(2003, 5, 17), 1);  // at midnight
  EXPECT_EQ(value.Format(kCanonical), "2003-05-17 00:00:00");
}

TEST(Status, FromCountClockAndTm) {
  TzGuard tz("UTC");
  EXPECT_EQ(AdDateTime(AdTime(-86400)).IsValid(), 1);  // no range test
  FixedNow now(1041760800);
  EXPECT_EQ(AdDateTime::GetTickCount().GetCTime().GetTime(), 1041760800);

  std::tm fields{};
  fields.tm_year = 103;
  fields.tm_mon = 5;
  fields.tm_mday = 18;
  fields.tm_hour = 14;
  AdDateTime value;
  value.SetOleDateTime(fields);
  EXPECT_EQ(value.Format(kCanonical), "2003-06-18 14:00:00");
  fields.tm_year = INT_MAX;  // tm_year + 1900 does not fit in an int
  value.SetOleDateTime(fields);
  EXPECT_EQ(value.Format(kCanonical), "2147485547/6/18 14:0:0");
}

// Each thread remembers its last breakdown, so that a getter after another on
// the same value is cheap. Every getter must still answer for its own value and
// for the zone as it stands at the call, with the same count asked again
// between changes.
TEST(Getters, FollowTheValueAndTheZoneBetweenCalls) {
  const AdDateTime value(AdTime(1000000000));  // 2001-09-09 01:46:40 UTC
  const AdDateTime next(AdTime(1000000000 + 3600 + 60 + 1));
  TzGuard tz("UTC");
  EXPECT_EQ(value.GetHour(), 1);
  EXPECT_EQ(next.GetHour(), 2);
  EXPECT_EQ(next.GetMinute(), 47);
  EXPECT_EQ(value.GetMinute(), 46);
  EXPECT_EQ(value.GetSecond(), 40);
  struct {
    const char* tz;
    long day, hour, minute;
  } const zones[] = {
      {"Asia/Tokyo", 9, 10, 46},  {"America/New_York", 8, 21, 46},
      {"Asia/Kolkata", 9, 7, 16}, {"<+0545>-5:45", 9, 7, 31},
      {"Asia/Tokyo", 9, 10, 46},
  };
  for (const auto& zone : zones) {
    TzGuard::Set(zone.tz);
    EXPECT_EQ(value.GetDay(), zone.day) << zone.tz;
    EXPECT_EQ(value.GetHour(), zone.hour) << zone.tz;
    EXPECT_EQ(value.GetMinute(), zone.minute) << zone.tz;
  }
}

}  // namespace
