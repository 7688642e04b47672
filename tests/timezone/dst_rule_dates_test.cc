#include <gtest/gtest.h>

#include <string>

#include "AdDateTime.h"
#include "support/env_guard.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

struct DatesCase {
  const char* tz;
  int year;
  const char* start;
  const char* end;
};

void ExpectDates(const DatesCase& c) {
  TzGuard tz(c.tz);
  std::string start = "old", end = "old";
  EXPECT_EQ(AdDateTime::GenerateDSTDates(c.year, start, end), 1);
  EXPECT_EQ(start + " / " + end, std::string(c.start) + " / " + c.end)
      << c.tz << " in " << c.year;
}

// Real zones' rules (first, second and last Sundays on and off the month's
// ends, hours past 24 or below 0, minutes, the south, Dublin's negative saving)
// are checked against the C library in dst_rule_dates_libc_test; here, what no
// zone's current rule has.
TEST(GenerateDSTDates, FromTheZoneRule) {
  const DatesCase cases[] = {
      // Hour 0 on a Sunday that is the 1st: the start is the month before.
      {"XST5XDT,M4.1.0/0,M10.5.0/0", 2007, "2007-03-31 23:59:59", "2007-10-28 00:00:00"},
      // Julian days: day 365 of a common year, counted from 0, is the next
      // 1 January.
      {"XST3XDT,J59,365", 2003, "2003-02-28 01:59:59", "2004-01-01 02:00:00"},
      // Today's rule holds for every year: New York's 2006 changes were in April
      // and October.
      {"America/New_York", 2006, "2006-03-12 01:59:59", "2006-11-05 02:00:00"},
      // Outside 1970-01-01..2038-01-18: the texts that outOfRange values keep,
      // with the fields after any carry across the year's ends.
      {"EST5EDT,M3.2.0,M11.1.0", 1969, "1969/3/9 1:59:59", "1969/11/2 2:0:0"},
      {"EST5EDT,M3.2.0,M11.1.0", -2147483647 - 1, "-2147483648/3/9 1:59:59",
       "-2147483648/11/2 2:0:0"},
      {"XST3XDT,J1/-1,J365/25", 1970, "1969/12/31 22:59:59", "1971-01-01 01:00:00"},
      // No daylight saving now: 1 and empty texts.
      {"Asia/Tokyo", 2007, "", ""},
  };
  for (const auto& c : cases) ExpectDates(c);
}

// A daylight name without rules, and no "posixrules" file in the zone folder:
// the C library's own ",M3.2.0,M11.1.0".
TEST(GenerateDSTDates, DaylightNameWithoutRules) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  datetimelib::testing::EnvGuard zone_folder("TZDIR", folder.path().c_str());
  ExpectDates({"XST3XDT", 2008, "2008-03-09 01:59:59", "2008-11-02 02:00:00"});
}

}  // namespace
