#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "AdDateTime.h"
#include "support/fixed_clock.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::Dirty;
using datetimelib::testing::FixedNow;
using datetimelib::testing::KeptText;
using datetimelib::testing::TzGuard;
using datetimelib::testing::UtcCount;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";
constexpr bool kLocal = false, kUtc = true;

// Now, unless a row says otherwise: Wednesday 2003-01-08 10:00:00 in New York
// (EST, no daylight saving).
const std::int64_t kWednesday = UtcCount(2003, 1, 8, 15);

// The canonical text, local or UTC, that `text` gives, or "invalid".
std::string Read(const char* text, bool utc) {
  AdDateTime value = Dirty();
  value.ParseTolvaneDateTime(text);
  if (!value.IsValid()) return "invalid";
  EXPECT_EQ(KeptText(value), "") << text;
  return utc ? value.FormatGMT(kCanonical) : value.Format(kCanonical);
}

TEST(ParseTolvaneDateTime, Forms) {
  TzGuard tz("America/New_York");
  const struct {
    std::int64_t now;
    const char* text;
    bool utc;              // the expected text is UTC, not New York time
    const char* expected;  // canonical text, or "invalid"
  } cases[] = {
      // Now, and keywords that count calendar days from today.
      {kWednesday, "NOW", kLocal, "2003-01-08 10:00:00"},
      {kWednesday, "TODAY.12:30", kLocal, "2003-01-08 12:30:00"},
      // Weekday names in any case: that day of this Sunday-to-Saturday week,
      // before or after today.
      {kWednesday, "Sun", kLocal, "2003-01-05 00:00:00"},
      {kWednesday, "sat", kLocal, "2003-01-11 00:00:00"},  // after now, and left there
      // Day, month and year; the day may have anything after its number.
      {kWednesday, "05-JANUARY-2003.9:5", kLocal, "2003-01-05 09:05:00"},
      // Day 0 and hour -1 are handed on, and carried by the field constructor.
      {kWednesday, "00-Jan-2003.-1:00", kLocal, "2002-12-30 23:00:00"},
      // The time: split at the first "."; blanks and a sign before each number,
      // anything after the last; "UTC" only in capitals.
      {kWednesday, "05-Jan-2003. \t10: +30x", kLocal, "2003-01-05 10:30:00"},
      // No year: this year up to now, time of day included, else one calendar
      // year back (not 365 days: 2004 was a leap year).
      {kWednesday, "08-Jan.10:00", kLocal, "2003-01-08 10:00:00"},
      {kWednesday, "08-Jan.10:00:01", kLocal, "2002-01-08 10:00:01"},
      {UtcCount(2005, 1, 3, 17), "05-Jan", kLocal, "2004-01-05 00:00:00"},
      {UtcCount(1970, 1, 5, 17), "06-Jan", kLocal, "invalid"},  // back to 1969
      // UTC fields, with the offset added to the instant read; its numbers may
      // carry signs of their own, within 13:59 either way.
      {kWednesday, "10:00 UTC", kUtc, "2003-01-08 10:00:00"},
      {kWednesday, "05-Jan-2003.10:00UTC-1:30", kUtc, "2003-01-05 08:30:00"},
      {kWednesday, "05-Jan-2003.10:00UTC+13:59", kUtc, "2003-01-05 23:59:00"},
      // UTC fields carry in UTC, whatever the local zone does: New York skips
      // 2003-04-06 02:30, and its 2038-01-18 23:00 lies past 2^31 s.
      {kWednesday, "06-Apr-2003.02:30UTC", kUtc, "2003-04-06 02:30:00"},
      // No year: compared with now (15:00 UTC) after the offset.
      {kWednesday, "08-Jan.13:00:01UTC+2", kUtc, "2002-01-08 15:00:01"},
      // Keywords count calendar days, whatever the length of a day. 2003-04-06
      // has 23 hours: 86 400 s before Monday 00:00 EDT is Saturday.
      {UtcCount(2003, 4, 7, 4), "yesterday", kLocal, "2003-04-06 00:00:00"},
      // 2003-10-26 has 25 hours: 86 400 s before its last second is that day.
      {UtcCount(2003, 10, 27, 5), "yesterday", kLocal, "2003-10-26 00:00:00"},
  };
  for (const auto& c : cases) {
    FixedNow now(c.now);
    EXPECT_EQ(Read(c.text, c.utc), c.expected) << c.text << " at " << c.now;
  }
}

struct Outcome {
  const char* text;
  bool valid;
  std::int32_t count;
  const char* kept;
};

// What the value holds after each kind of failure.
TEST(ParseTolvaneDateTime, Outcomes) {
  TzGuard tz("America/New_York");
  const auto expect = [](const Outcome& c) {
    SCOPED_TRACE(c.text != nullptr ? c.text : "(null)");
    AdDateTime value = Dirty();
    value.ParseTolvaneDateTime(c.text);
    EXPECT_EQ(value.GetStatus(), c.valid ? AdDateTime::valid : AdDateTime::invalid);
    EXPECT_EQ(value.GetCTime().GetTime(), c.count);
    EXPECT_EQ(KeptText(value), c.kept);
  };

  // Refused while reading the text: `invalid`, the count and the kept text stay.
  // Each text is just past what its part accepts.
  const struct {
    const char* part;
    std::vector<const char*> texts;
  } refused[] = {
      {"split", {".10:00", "05-Jan-2003."}},
      {"words", {"now ", "now.10:00", "tomorrow", "today ", "Thurs"}},
      {"day-month", {"-05-Jan", "05-", "05--2003", "05-Jan-"}},
      {"day", {"32-Jan-2003", "x5-Jan-2003", "005-Jan-2003"}},
      {"year", {"05-Jan-03", "05-Jan-20003", "05-Jan-1968", "05-Jan-2003-01"}},
      {"time", {"05-Jan-2003.10", "10 :00", "10:", "10:+-5"}},
      {"offset",
       {"10:00UTC2", "10:00UTC+", "10:00UTC+14", "10:00UTC+5:60", "10:00UTC+-14",
        "10:00UTC-1:-60", "10:00UTC+-596523:-14"}},
      {"32 bits", {"10:2147483648", "10:-2147483649", "10:00UTC+1:4294967296"}},
  };
  for (const auto& group : refused) {
    SCOPED_TRACE(group.part);
    for (const char* text : group.texts) expect({text, false, 777, "kept"});
  }

  // Read back through ParseDateTime or ParseDateTimeGMT. When they refuse, the
  // value holds what they left; when the offset would carry the count past 32
  // bits, the instant read without it.
  const Outcome cases[] = {
      // The field constructor refuses the fields; the reader refuses their text.
      {"05-Jan-1969.10:00UTC", false, 777, "1969/1/5 10:0:0"},
      {"18-Jan-2038.23:00", false, 777, "2038/1/18 23:0:0"},  // past 2^31 in New York
      {"05-Jan-2003.2147483647:00", false, 777, "2003/1/5 2147483647:0:0"},
      {nullptr, false, 777, "0/0/0 0:0:0"},
      // Carried out of the range: the reader refuses the canonical text.
      {"00-Jan-1970", false, 0, "1969-12-31 00:00:00"},  // ParseDateTime's outOfRange
      {"18-Jan-2038.24:00UTC", false, 777, "2038-01-19 00:00:00"},
      // Offsets up from 2038-01-18 23:00:00 UTC (2 147 468 400) to 2^31 - 1 ...
      {"18-Jan-2038.23:00:07UTC+4:14", true, INT32_MAX, ""},
      {"18-Jan-2038.23:00:08UTC+4:14", false, 2147468408, ""},
      // ... and down from 1970-01-01 00:00:00 UTC as far as a sign inside the
      // numbers reaches.
      {"01-Jan-1970.00:00UTC+-13:-59", true, -50340, ""},
      // New York's 01:30 on 2003-10-26 comes twice: the first, EDT, is read.
      {"26-Oct-2003.01:30", true, 1067146200, ""},
  };
  for (const auto& c : cases) expect(c);
}

}  // namespace
