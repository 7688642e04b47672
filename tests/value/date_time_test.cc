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

TEST(FieldConstructor, AcceptsAndCarriesFieldsInUtc) {
  TzGuard tz("UTC");
  const struct {
    Fields fields;
    const char* local;  // expected local fields
  } cases[] = {
      // Range ends.
      {{1970, 1, 1, 0, 0, 0}, "1970-01-01 00:00:00"},
      {{2038, 1, 18, 23, 59, 59}, "2038-01-18 23:59:59"},
      // Only the year 2038 tests month and day.
      {{2037, 0, 0, 0, 0, 0}, "2036-11-30 00:00:00"},
      {{2038, 0, 25, 0, 0, 0}, "2037-12-25 00:00:00"},
      {{2038, -3, 1, 0, 0, 0}, "2037-09-01 00:00:00"},
      // Carried as mktime carries them.
      {{2000, 13, 1, 0, 0, 0}, "2001-01-01 00:00:00"},
      {{2000, 3, 0, 0, 0, 0}, "2000-02-29 00:00:00"},
      {{2001, 3, 0, 0, 0, 0}, "2001-02-28 00:00:00"},
      {{2003, 1, 1, 25, 0, 0}, "2003-01-02 01:00:00"},
      {{2003, 1, 1, 0, -1, 0}, "2002-12-31 23:59:00"},
      {{2003, 1, 1, 0, 0, -86401}, "2002-12-30 23:59:59"},
      {{2003, 4, 31, 0, 0, 0}, "2003-05-01 00:00:00"},
      {{1971, -11, 1, 0, 0, 0}, "1970-01-01 00:00:00"},
      // A time of day on 1899-12-30 lands on 1970-01-01.
      {{1899, 12, 30, 10, 30, 0}, "1970-01-01 10:30:00"},
      {{1899, 12, 30, 25, 0, 0}, "1970-01-02 01:00:00"},
  };
  for (const auto& c : cases) {
    const AdDateTime value = Make(c.fields);
    SCOPED_TRACE(c.local);
    EXPECT_EQ(value.GetStatus(), AdDateTime::valid);
    EXPECT_EQ(LocalFieldsText(value), c.local);
    EXPECT_EQ(value.Format(kCanonical), c.local);
  }
}

TEST(FieldConstructor, RefusesWithKeptText) {
  TzGuard tz("UTC");
  const struct {
    Fields fields;
    const char* kept;
  } cases[] = {
      {{2038, 1, 19, 0, 0, 0}, "2038/1/19 0:0:0"},
      {{2038, 2, 1, 0, 0, 0}, "2038/2/1 0:0:0"},
      {{2039, 1, 1, 0, 0, 0}, "2039/1/1 0:0:0"},
      {{2040, 1, 5, 7, 3, 0}, "2040/1/5 7:3:0"},
      {{1969, 12, 31, 23, 59, 59}, "1969/12/31 23:59:59"},
      {{1899, 12, 31, 10, 30, 0}, "1899/12/31 10:30:0"},
      {{1899, 12, 29, 0, 0, 0}, "1899/12/29 0:0:0"},
      {{1969, -1, -2, -3, -4, -5}, "1969/-1/-2 -3:-4:-5"},
      {{LONG_MIN, 0, 0, 0, 0, 0}, "-9223372036854775808/0/0 0:0:0"},
      // Passes the range test, but its local time has no 32-bit count.
      {{2038, 1, 18, 1000000, 0, 0}, "2038/1/18 1000000:0:0"},
      {{2000, LONG_MAX, LONG_MAX, LONG_MAX, LONG_MAX, LONG_MAX},
       "2000/9223372036854775807/9223372036854775807 9223372036854775807:"
       "9223372036854775807:9223372036854775807"},
      {{1899, 12, 30, -1000000, 0, 0}, "1899/12/30 -1000000:0:0"},
  };
  for (const auto& c : cases) {
    const AdDateTime value = Make(c.fields);
    SCOPED_TRACE(c.kept);
    EXPECT_EQ(value.GetStatus(), AdDateTime::outOfRange);
    EXPECT_EQ(value.Format(kCanonical), c.kept);
    EXPECT_EQ(value.GetCTime().GetTime(), 0);
  }
}

TEST(FieldConstructor, UtcCountsAndCalendarFields) {
  TzGuard tz("UTC");
  const AdDateTime epoch(1970, 1, 1, 0, 0, 0);
  EXPECT_EQ(epoch.GetCTime().GetTime(), 0);
  EXPECT_EQ(epoch.GetDayOfWeek(), 5);  // Thursday
  EXPECT_EQ(epoch.GetDayOfYear(), 1);
  EXPECT_EQ(AdDateTime(2038, 1, 18, 23, 59, 59).GetCTime().GetTime(), 2147471999);
  EXPECT_EQ(AdDateTime(2004, 12, 31, 0, 0, 0).GetDayOfYear(), 366);
  EXPECT_EQ(AdDateTime(2003, 12, 31, 0, 0, 0).GetDayOfYear(), 365);
  EXPECT_EQ(AdDateTime(2003, 6, 14, 0, 0, 0).GetDayOfWeek(), 7);  // Saturday
}

TEST(FieldConstructor, ZoneEastOfUtcKeepsNegativeCounts) {
  TzGuard tz("<+01>-1");
  const struct {
    Fields fields;
    std::int32_t count;
  } cases[] = {
      {{1970, 1, 1, 0, 0, 0}, -3600},
      // mktime's -1, a real instant here: not an error.
      {{1970, 1, 1, 0, 59, 59}, -1},
      {{1970, 1, 1, 1, 0, 0}, 0},
      {{1899, 12, 30, 0, 30, 0}, -1800},
  };
  for (const auto& c : cases) {
    const AdDateTime value = Make(c.fields);
    SCOPED_TRACE(c.count);
    ASSERT_EQ(value.GetStatus(), AdDateTime::valid);
    EXPECT_EQ(value.GetCTime().GetTime(), c.count);
    EXPECT_EQ(value.GetYear(), 1970);
    EXPECT_EQ(value.GetDay(), 1);
    EXPECT_EQ(value.GetDayOfWeek(), 5);
  }
  EXPECT_EQ(LocalFieldsText(AdDateTime(1970, 1, 1, 0, 59, 59)), "1970-01-01 00:59:59");
  EXPECT_EQ(AdDateTime(AdTime(0)).Format(kCanonical), "1970-01-01 01:00:00");
}

TEST(FieldConstructor, ZoneFarWestOfUtcRefusesLocalTimesPast32Bits) {
  TzGuard tz("<-05>5");
  const AdDateTime last(2038, 1, 18, 22, 14, 7);  // 2038-01-19 03:14:07 UTC
  ASSERT_EQ(last.GetStatus(), AdDateTime::valid);
  EXPECT_EQ(last.GetCTime().GetTime(), INT32_MAX);

  const AdDateTime beyond(2038, 1, 18, 22, 14, 8);
  EXPECT_EQ(beyond.GetStatus(), AdDateTime::outOfRange);
  EXPECT_EQ(beyond.Format(kCanonical), "2038/1/18 22:14:8");
  EXPECT_EQ(beyond.GetCTime().GetTime(), 0);
}

// New York, 2003: clocks went forward at 02:00 on 6 April and back at 02:00 on
// 26 October.
TEST(FieldConstructor, SkippedAndRepeatedLocalTimesAreDeterministic) {
  TzGuard tz("America/New_York");
  const std::int64_t first_reading = 1067146200;             // 01:30 EDT == 05:30 UTC
  const std::int64_t skipped = UtcCount(2003, 4, 6, 7, 30);  // 03:30 EDT

  for (const Fields& before :
       {Fields{2003, 7, 1, 12, 0, 0}, Fields{2003, 1, 1, 12, 0, 0}}) {
    SCOPED_TRACE(before.month);
    ASSERT_TRUE(Make(before).IsValid());
    const AdDateTime repeated(2003, 10, 26, 1, 30, 0);
    EXPECT_EQ(repeated.GetCTime().GetTime(), first_reading);
    EXPECT_EQ(LocalFieldsText(repeated), "2003-10-26 01:30:00");

    ASSERT_TRUE(Make(before).IsValid());
    const AdDateTime gap(2003, 4, 6, 2, 30, 0);
    EXPECT_EQ(gap.GetCTime().GetTime(), skipped);
    EXPECT_EQ(LocalFieldsText(gap), "2003-04-06 03:30:00");
  }
}

TEST(FieldConstructor, FollowsTzChangedBetweenCalls) {
  TzGuard tz("UTC");
  const AdDateTime value(AdTime(0));
  EXPECT_EQ(value.GetHour(), 0);
  TzGuard::Set("<+03>-3");
  EXPECT_EQ(value.GetHour(), 3);
  EXPECT_EQ(AdDateTime(1970, 1, 1, 3, 0, 0).GetCTime().GetTime(), 0);
  TzGuard::Set("<-02>2");
  EXPECT_EQ(value.GetHour(), 22);
  EXPECT_EQ(value.GetDay(), 31);
  EXPECT_EQ(AdDateTime(1970, 1, 1, 3, 0, 0).GetCTime().GetTime(), 5 * 3600);
}

TEST(Status, DefaultIsNullWithCountZero) {
  const AdDateTime value;
  EXPECT_EQ(value.GetStatus(), AdDateTime::null);
  EXPECT_EQ(value.IsNull(), 1);
  EXPECT_EQ(value.IsValid(), 0);
  EXPECT_EQ(value.GetCTime().GetTime(), 0);
  EXPECT_EQ(value.Format(kCanonical), "");
}

TEST(Status, ConstructionFromCountAndClockIsValid) {
  const AdDateTime from_count(AdTime(-86400));
  EXPECT_EQ(from_count.IsValid(), 1);
  EXPECT_EQ(from_count.GetCTime().GetTime(), -86400);

  FixedNow now(1041760800);
  const AdDateTime tick = AdDateTime::GetTickCount();
  EXPECT_EQ(tick.IsValid(), 1);
  EXPECT_EQ(tick.IsNull(), 0);
  EXPECT_EQ(tick.GetCTime().GetTime(), 1041760800);
}

TEST(Status, SettersReplaceTheWholeValue) {
  TzGuard tz("UTC");
  AdDateTime value(AdTime(1000));
  EXPECT_EQ(value.SetDateTime(2039, 1, 1, 0, 0, 0), 1);
  EXPECT_EQ(value.GetStatus(), AdDateTime::outOfRange);
  EXPECT_EQ(value.Format(kCanonical), "2039/1/1 0:0:0");

  EXPECT_EQ(value.SetDateTime(2003, 6, 18, 10, 0, 0), 1);
  EXPECT_EQ(value.GetStatus(), AdDateTime::valid);
  EXPECT_EQ(value.Format("%Y"), "2003");

  value.SetStatus(AdDateTime::outOfRange);  // no kept text any more
  EXPECT_EQ(value.Format(kCanonical), "");

  EXPECT_EQ(value.SetDate(2003, 6, 18), 1);
  EXPECT_EQ(value.Format(kCanonical), "2003-06-18 00:00:00");
  EXPECT_EQ(value.SetTime(25, 0, 0), 1);
  EXPECT_EQ(value.Format(kCanonical), "1970-01-02 01:00:00");
  EXPECT_EQ(value.SetDate(1969, 12, 31), 1);
  EXPECT_EQ(value.Format(kCanonical), "1969/12/31 0:0:0");
}

TEST(Status, SetStatusKeepsTextAndCopiesCarryIt) {
  AdDateTime refused(2040, 1, 1, 0, 0, 0);
  refused.SetStatus(AdDateTime::valid);
  refused.SetStatus(AdDateTime::outOfRange);
  EXPECT_EQ(refused.Format(kCanonical), "2040/1/1 0:0:0");

  const AdDateTime copy(refused);
  EXPECT_EQ(copy.Format(kCanonical), "2040/1/1 0:0:0");
  AdDateTime assigned(AdTime(5));
  assigned = refused;
  EXPECT_EQ(assigned.GetStatus(), AdDateTime::outOfRange);
  EXPECT_EQ(assigned.Format(kCanonical), "2040/1/1 0:0:0");

  refused.SetStatus(static_cast<AdDateTime::AdDateTimeStatus>(7));
  EXPECT_EQ(refused.GetStatus(), 7);
  EXPECT_EQ(refused.Format(kCanonical), "");
}

TEST(Status, SetOleDateTimeReadsTmFields) {
  TzGuard tz("UTC");
  std::tm fields{};
  fields.tm_year = 103;
  fields.tm_mon = 5;
  fields.tm_mday = 18;
  fields.tm_hour = 14;
  fields.tm_min = 30;
  fields.tm_sec = 5;
  fields.tm_wday = 0;  // ignored
  AdDateTime value;
  value.SetOleDateTime(fields);
  EXPECT_EQ(value.Format(kCanonical), "2003-06-18 14:30:05");

  fields.tm_year = INT_MAX;  // year beyond an int: still exact in the kept text
  value.SetOleDateTime(fields);
  EXPECT_EQ(value.Format(kCanonical), "2147485547/6/18 14:30:5");
}

}  // namespace
