#include <gtest/gtest.h>

#include <string>

#include "AdDateTime.h"
#include "platform/civil.h"
#include "support/fixed_clock.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::platform::DaysFromCivil;
using datetimelib::testing::FixedNow;
using datetimelib::testing::TzGuard;
using datetimelib::testing::UtcCount;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

AdDateTime At(std::int64_t count) {
  return AdDateTime(AdTime(static_cast<std::int32_t>(count)));
}

// A `valid` value with the count 777 and the kept text "kept", to show what a
// call replaces and what it leaves.
AdDateTime Dirty() {
  AdDateTime value(AdTime(777));
  value.ParseDateTime("kept");
  value.SetStatus(AdDateTime::valid);
  return value;
}

std::string KeptText(AdDateTime value) {
  value.SetStatus(AdDateTime::outOfRange);  // the one status Format shows it for
  return value.Format(kCanonical);
}

// The canonical text, local or UTC, that `text` gives, or "invalid".
std::string Read(const char* text, bool utc = false) {
  AdDateTime value = Dirty();
  value.ParseTolvaneDateTime(text);
  if (!value.IsValid()) return "invalid";
  EXPECT_EQ(KeptText(value), "") << text;
  return utc ? value.FormatGMT(kCanonical) : value.Format(kCanonical);
}

// Now is Wednesday 2003-01-08 10:00:00 in New York (EST, no daylight saving).
class CompactParse : public ::testing::Test {
 protected:
  TzGuard tz_{"America/New_York"};
  FixedNow now_{UtcCount(2003, 1, 8, 15)};
};

TEST_F(CompactParse, Now) {
  for (const char* text : {"now", "NOW", "Now"}) {
    AdDateTime value = Dirty();
    value.ParseTolvaneDateTime(text);
    EXPECT_EQ(value.GetStatus(), AdDateTime::valid);
    EXPECT_EQ(value.GetCTime().GetTime(), UtcCount(2003, 1, 8, 15));
    EXPECT_EQ(KeptText(value), "");
  }
  for (const char* text : {" now", "now ", "now.10:00", "nowx"}) {
    EXPECT_EQ(Read(text), "invalid") << text;
  }
}

TEST_F(CompactParse, LocalForms) {
  const struct {
    const char* text;
    const char* local;
  } cases[] = {
      // Keywords count calendar days from today.
      {"today", "2003-01-08 00:00:00"},
      {"TODAY.12:30", "2003-01-08 12:30:00"},
      {"10:30", "2003-01-08 10:30:00"},
      {"10:30:15", "2003-01-08 10:30:15"},
      {"yesterday.23:59:59", "2003-01-07 23:59:59"},
      {"Sunday", "2003-01-05 00:00:00"},
      {"Mon", "2003-01-06 00:00:00"},
      {"Wednesday", "2003-01-08 00:00:00"},
      {"friday.08:00", "2003-01-10 08:00:00"},  // after now, and left there
      {"Sat", "2003-01-11 00:00:00"},
      // Day, month and year.
      {"05-Jan-2003.14:07:09", "2003-01-05 14:07:09"},
      {"5-jan-2003", "2003-01-05 00:00:00"},
      {"05-JANUARY-2003.9:5", "2003-01-05 09:05:00"},
      {"5x-Jan-2003", "2003-01-05 00:00:00"},
      {"05-may-2003.23:59", "2003-05-05 23:59:00"},
      {"18-Jan-2038.22:00", "2038-01-18 22:00:00"},
      // Carried by the field constructor.
      {"00-Jan-2003", "2002-12-31 00:00:00"},
      {"31-Apr-2003", "2003-05-01 00:00:00"},
      {"05-Jan-2003.25:00", "2003-01-06 01:00:00"},
      {"05-Jan-2003.-1:00", "2003-01-04 23:00:00"},
      {"06-Apr-2003.02:30", "2003-04-06 03:30:00"},  // skipped: moves forward
      // The time: blanks and signs before numbers, anything after them.
      {"05-Jan-2003.10:00:00.123", "2003-01-05 10:00:00"},
      {"05-Jan-2003.+10:30x", "2003-01-05 10:30:00"},
      {"05-Jan-2003.10:00utc", "2003-01-05 10:00:00"},  // no marker: local time
      // No year: this year up to now, time of day included, else the year before.
      {"05-Jan", "2003-01-05 00:00:00"},
      {"08-Jan.09:00", "2003-01-08 09:00:00"},
      {"08-Jan.10:00", "2003-01-08 10:00:00"},
      {"08-Jan.10:00:01", "2002-01-08 10:00:01"},
      {"08-Jan.11:00", "2002-01-08 11:00:00"},
      {"31-Dec", "2002-12-31 00:00:00"},
  };
  for (const auto& c : cases) EXPECT_EQ(Read(c.text), c.local) << c.text;
}

TEST_F(CompactParse, UtcForms) {
  const struct {
    const char* text;
    const char* utc;
  } cases[] = {
      {"05-Jan-2003.10:00UTC", "2003-01-05 10:00:00"},
      {"10:00 UTC", "2003-01-08 10:00:00"},
      // The offset is added to the instant read.
      {"05-Jan-2003.10:00 UTC+2", "2003-01-05 12:00:00"},
      {"05-Jan-2003.10:00UTC-1:30", "2003-01-05 08:30:00"},
      {"05-Jan-2003.10:00UTC+13:59", "2003-01-05 23:59:00"},
      {"05-Jan-2003.10:00UTC+-2", "2003-01-05 08:00:00"},  // no lower bound
      // UTC fields carry in UTC, whatever the local zone does.
      {"06-Apr-2003.02:30UTC", "2003-04-06 02:30:00"},  // skipped in New York
      {"18-Jan-2038.23:00UTC", "2038-01-18 23:00:00"},  // past 2^31 as New York time
      {"01-Jan-1970.00:00UTC", "1970-01-01 00:00:00"},
      // No year: compared with now, 2003-01-08 15:00:00 UTC, after the offset.
      {"08-Jan.15:00UTC", "2003-01-08 15:00:00"},
      {"08-Jan.15:00:01UTC", "2002-01-08 15:00:01"},
      {"08-Jan.13:00UTC+2", "2003-01-08 15:00:00"},
      {"08-Jan.13:00:01UTC+2", "2002-01-08 15:00:01"},
  };
  for (const auto& c : cases) EXPECT_EQ(Read(c.text, /*utc=*/true), c.utc) << c.text;
}

// Refused while reading the text: the count and the kept text stay.
TEST_F(CompactParse, RefusedTextLeavesTheValue) {
  const char* const cases[] = {
      // The split.
      ".10:00",
      "05-Jan-2003.",
      ".",
      // Words.
      "tomorrow",
      "yesterday 10:00",
      " today",
      "today ",
      "Thurs",
      "now.10:00",
      // The day-month shape.
      "-05-Jan",
      "05-Jan-",
      "05--2003",
      "05-",
      "Jan-05-2003",
      "2003-01-05",
      // Day, month, year.
      "32-Jan-2003",
      "x5-Jan-2003",
      "005-Jan-2003",
      "  -Jan-2003",
      "05-Sept-2003",
      "05-Jan -2003",
      "05-Jan-03",
      "05-Jan-20003",
      "05-Jan-1968",
      "05-Jan-20x3",
      "05-Jan-2003-",
      "05-Jan-2003-01",
      // The offset.
      "05-Jan-2003.10:00UTC2",
      "05-Jan-2003.10:00UTC+",
      "05-Jan-2003.10:00UTC+14",
      "05-Jan-2003.10:00UTC+5:60",
      "05-Jan-2003.10:00UTCUTC",
      // The time.
      "05-Jan-2003.10",
      "05-Jan-2003.UTC",
      "05-Jan-2003.10 :00",
      "05-Jan-2003.x10:00",
      "10:",
      // Numbers beyond 32 bits.
      "05-Jan-2003.2147483648:00",
      "05-Jan-2003.10:-2147483649",
      "05-Jan-2003.10:00:99999999999",
      "05-Jan-2003.10:00UTC+-99999999999",
      "05-Jan-2003.10:00UTC+1:4294967296",
  };
  for (const char* text : cases) {
    SCOPED_TRACE(text);
    AdDateTime value = Dirty();
    value.ParseTolvaneDateTime(text);
    EXPECT_EQ(value.GetStatus(), AdDateTime::invalid);
    EXPECT_EQ(value.GetCTime().GetTime(), 777);
    EXPECT_EQ(KeptText(value), "kept");
  }
}

// Refused by the read-back: the value holds what ParseDateTime or
// ParseDateTimeGMT left, with the status `invalid` in every case.
TEST_F(CompactParse, RefusedReadBackLeavesWhatTheReaderLeft) {
  const struct {
    const char* text;
    std::int32_t count;
    const char* kept;
  } cases[] = {
      // The field constructor refuses the fields; the reader refuses their text.
      {"05-Jan-1969", 777, "1969/1/5 0:0:0"},
      {"05-Jan-2039", 777, "2039/1/5 0:0:0"},
      {"", 777, "0/0/0 0:0:0"},
      {"05-Jan-1969.10:00UTC", 777, "1969/1/5 10:0:0"},
      {"18-Jan-2038.23:00", 777, "2038/1/18 23:0:0"},  // past 2^31 in New York
      {"05-Jan-2003.2147483647:00", 777, "2003/1/5 2147483647:0:0"},
      // Carried out of the range: the reader refuses the canonical text.
      {"00-Jan-1970", 0, "1969-12-31 00:00:00"},  // ParseDateTime's outOfRange
      {"00-Jan-1970.00:00UTC", 777, "1969-12-31 00:00:00"},
      {"18-Jan-2038.24:00UTC", 777, "2038-01-19 00:00:00"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    AdDateTime value = Dirty();
    value.ParseTolvaneDateTime(c.text);
    EXPECT_EQ(value.GetStatus(), AdDateTime::invalid);
    EXPECT_EQ(value.GetCTime().GetTime(), c.count);
    EXPECT_EQ(KeptText(value), c.kept);
  }
  AdDateTime value = Dirty();
  value.ParseTolvaneDateTime(nullptr);
  EXPECT_EQ(value.GetStatus(), AdDateTime::invalid);
  EXPECT_EQ(KeptText(value), "0/0/0 0:0:0");
}

// An offset that would carry the count past 32 bits is refused; the value
// keeps the instant read, without the offset.
TEST_F(CompactParse, OffsetsBeyond32BitsAreRefused) {
  const struct {
    const char* text;
    bool valid;
    std::int32_t count;
  } cases[] = {
      // Up from 2038-01-18 23:00:00 UTC (2 147 468 400) to 2 147 483 647.
      {"18-Jan-2038.23:00:07UTC+4:14", true, INT32_MAX},
      {"18-Jan-2038.23:00:08UTC+4:14", false, 2147468408},
      {"18-Jan-2038.23:00UTC+13", false, 2147468400},
      {"01-Jan-1970.00:00UTC--596523", true, 2147482800},
      {"01-Jan-1970.00:00UTC--596523:-20", false, 0},
      // Down from 1970-01-01 00:00:00 UTC towards -2 147 483 648.
      {"01-Jan-1970.00:00UTC+-596523:-14", true, -2147483640},
      {"01-Jan-1970.00:00UTC+-596523:-15", false, 0},
      // The extremes of both numbers, with either sign.
      {"01-Jan-1970.00:00UTC+-2147483648:-2147483648", false, 0},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    AdDateTime value = Dirty();
    value.ParseTolvaneDateTime(c.text);
    EXPECT_EQ(value.IsValid(), c.valid ? 1 : 0);
    EXPECT_EQ(value.GetCTime().GetTime(), c.count);
    EXPECT_EQ(KeptText(value), "");
  }
}

// Other days than the fixture's, New York time.
TEST(CompactParseAt, OtherDays) {
  TzGuard tz("America/New_York");
  const struct {
    std::int64_t now;
    const char* text;
    const char* local;
  } cases[] = {
      // No year: one calendar year back, not 365 days (2004 was a leap year).
      {UtcCount(2005, 1, 3, 17), "05-Jan", "2004-01-05 00:00:00"},
      {UtcCount(2005, 1, 3, 17), "29-Feb", "2004-02-29 00:00:00"},
      {UtcCount(2004, 1, 3, 17), "29-Feb", "2003-03-01 00:00:00"},
      // Nothing before 1970, whether named, counted or stepped back into.
      {UtcCount(1970, 1, 5, 17), "06-Jan", "invalid"},
      {UtcCount(1970, 1, 1, 17), "yesterday", "invalid"},
      {UtcCount(1970, 1, 1, 17), "Wed", "invalid"},
      {UtcCount(1970, 1, 1, 17), "Thursday", "1970-01-01 00:00:00"},
      // Keywords count calendar days, whatever the length of a day.
      // 2003-04-06 has 23 hours (02:00 EST becomes 03:00 EDT): the first hour
      // of 04-07 lies less than 86 400 s after the end of 04-05.
      {UtcCount(2003, 4, 7, 3, 59, 59), "yesterday", "2003-04-05 00:00:00"},
      {UtcCount(2003, 4, 7, 4), "yesterday", "2003-04-06 00:00:00"},
      {UtcCount(2003, 4, 7, 4, 59, 59), "yesterday", "2003-04-06 00:00:00"},
      {UtcCount(2003, 4, 7, 5), "yesterday", "2003-04-06 00:00:00"},
      {UtcCount(2003, 4, 7, 4, 30), "Sunday", "2003-04-06 00:00:00"},  // Monday 00:30
      // 2003-10-26 has 25 hours (02:00 EDT becomes 01:00 EST): its last hour
      // lies less than 86 400 s after its start.
      {UtcCount(2003, 10, 27, 3, 59, 59), "yesterday", "2003-10-25 00:00:00"},
      {UtcCount(2003, 10, 27, 4), "yesterday", "2003-10-25 00:00:00"},
      {UtcCount(2003, 10, 27, 4, 59, 59), "Yesterday.23:00", "2003-10-25 23:00:00"},
      {UtcCount(2003, 10, 27, 5), "yesterday", "2003-10-26 00:00:00"},
  };
  for (const auto& c : cases) {
    FixedNow now(c.now);
    EXPECT_EQ(Read(c.text), c.local) << c.text << " at " << c.now;
  }
}

// Days from 1970-01-01 to the value's local date.
std::int64_t LocalDays(const AdDateTime& value) {
  return DaysFromCivil(value.GetYear(), static_cast<int>(value.GetMonth()),
                       static_cast<int>(value.GetDay()));
}

// Over a year with both changes: a weekday name gives that day of today's
// Sunday-to-Saturday week, and "yesterday" the day before today.
TEST(CompactParseAt, KeywordInvariants) {
  TzGuard tz("America/New_York");
  const char* const weekdays[] = {"Sun", "Monday", "tue", "WEDNESDAY",
                                  "Thu", "Friday", "sat"};
  for (std::int64_t t = UtcCount(2003, 3, 30); t < UtcCount(2003, 11, 2);
       t += 5 * 3600 + 7 * 60) {
    FixedNow now(t);
    const AdDateTime today = At(t);
    const AdDateTime week_start = today.GetWeekStartDate();
    for (long weekday = 1; weekday <= 7; ++weekday) {
      AdDateTime value;
      value.ParseTolvaneDateTime(weekdays[weekday - 1]);
      ASSERT_EQ(value.GetDayOfWeek(), weekday) << t;
      ASSERT_EQ(value.GetWeekStartDate().GetCTime().GetTime(),
                week_start.GetCTime().GetTime())
          << t;
    }
    AdDateTime yesterday;
    yesterday.ParseTolvaneDateTime("yesterday");
    ASSERT_EQ(LocalDays(yesterday), LocalDays(today) - 1) << t;
  }
}

// What FormatTolvane writes reads back to the same count, except within the
// hour that repeats when daylight saving ends, where the first reading wins.
TEST(CompactRoundTrip, ParserReadsWhatTheWriterWrites) {
  const struct {
    const char* zone;
    std::int64_t second_reading;  // an instant in the zone's repeated hour
  } zones[] = {
      {"America/New_York", UtcCount(2003, 10, 26, 6, 30)},  // 01:30 EST
      {"Australia/Sydney", UtcCount(2003, 3, 29, 16, 30)},  // 02:30 AEST
  };
  for (const auto& z : zones) {
    TzGuard tz(z.zone);
    for (std::int64_t t = 86400; t <= INT32_MAX - 86400; t += 3 * 86400 + 3599) {
      const std::string text = At(t).FormatTolvane();
      AdDateTime read;
      read.ParseTolvaneDateTime(text.c_str());
      ASSERT_TRUE(read.IsValid()) << z.zone << " " << text;
      const std::int64_t back = read.GetCTime().GetTime();
      if (back != t) {
        ASSERT_EQ(back, t - 3600) << z.zone << " " << text;
        ASSERT_EQ(read.FormatTolvane(), text);
      }
    }
    AdDateTime read;
    read.ParseTolvaneDateTime(At(z.second_reading).FormatTolvane().c_str());
    EXPECT_EQ(read.GetCTime().GetTime(), z.second_reading - 3600) << z.zone;
  }
}

}  // namespace
