#include <gtest/gtest.h>

#include <string>

#include "AdDateTime.h"
#include "support/env_guard.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::EnvGuard;
using datetimelib::testing::TempDir;
using datetimelib::testing::TzGuard;

struct DatesCase {
  const char* tz;
  int year;
  const char* start;
  const char* end;
};

void ExpectDates(const DatesCase& c) {
  SCOPED_TRACE(::testing::Message() << c.tz << " in " << c.year);
  TzGuard tz(c.tz);
  std::string start = "old", end = "old";
  EXPECT_EQ(AdDateTime::GenerateDSTDates(c.year, start, end), 1);
  EXPECT_EQ(start, c.start);
  EXPECT_EQ(end, c.end);
}

TEST(GenerateDSTDates, RuleDayAndTime) {
  const DatesCase cases[] = {
      // First and last Sunday, each also on the 1st or the 31st itself.
      {"XST5XDT,M4.1.0/2,M10.5.0/2", 2004, "2004-04-04 01:59:59", "2004-10-31 02:00:00"},
      {"XST5XDT,M4.1.0/2,M10.5.0/2", 2007, "2007-04-01 01:59:59", "2007-10-28 02:00:00"},
      {"XST5XDT,M3.5.0/2,M10.5.0/3", 2004, "2004-03-28 01:59:59", "2004-10-31 03:00:00"},
      // The second Sunday is the second, not the last (America/New_York).
      {"EST5EDT,M3.2.0,M11.1.0", 2007, "2007-03-11 01:59:59", "2007-11-04 02:00:00"},
      {"EST5EDT,M3.2.0,M11.1.0", 2008, "2008-03-09 01:59:59", "2008-11-02 02:00:00"},
      // Thursday plus 26 hours: the Friday before the last Sunday (Asia/Jerusalem).
      {"IST-2IDT,M3.4.4/26,M10.5.0", 2013, "2013-03-29 01:59:59", "2013-10-27 02:00:00"},
      // Hour 0 on a Sunday that is the 1st: the start is the month before.
      {"XST5XDT,M4.1.0/0,M10.5.0/0", 2007, "2007-03-31 23:59:59", "2007-10-28 00:00:00"},
      // Negative hours (America/Nuuk): the Saturday evening before.
      {"<-02>2<-01>,M3.5.0/-1,M10.5.0/0", 2024, "2024-03-30 22:59:59",
       "2024-10-27 00:00:00"},
      // Minutes count (Pacific/Chatham).
      {"<+1245>-12:45<+1345>,M9.5.0/2:45,M4.1.0/3:45", 2010, "2010-09-26 02:44:59",
       "2010-04-04 03:45:00"},
      // Julian days: Jn never counts 29 February, n does.
      {"XST3XDT,J60,J300", 2004, "2004-03-01 01:59:59", "2004-10-27 02:00:00"},
      {"XST3XDT,59,300", 2004, "2004-02-29 01:59:59", "2004-10-27 02:00:00"},
      {"XST3XDT,59,300", 2003, "2003-03-01 01:59:59", "2003-10-28 02:00:00"},
      {"XST3XDT,J59,365", 2004, "2004-02-28 01:59:59", "2004-12-31 02:00:00"},
      {"XST3XDT,J59,365", 2003, "2003-02-28 01:59:59", "2004-01-01 02:00:00"},
      // Carried across the year's ends.
      {"XST3XDT,J1/-1,J365/25", 2010, "2009-12-31 22:59:59", "2011-01-01 01:00:00"},
      // The south: daylight time ends before it starts in the same year.
      {"ACST-9:30ACDT,M10.1.0,M4.1.0/3", 2010, "2010-10-03 01:59:59",
       "2010-04-04 03:00:00"},
  };
  for (const auto& c : cases) ExpectDates(c);
}

TEST(GenerateDSTDates, RealZones) {
  const DatesCase cases[] = {
      {"America/New_York", 2007, "2007-03-11 01:59:59", "2007-11-04 02:00:00"},
      {"Australia/Sydney", 2010, "2010-10-03 01:59:59", "2010-04-04 03:00:00"},
      // Winter is the daylight part; its end is 01:00 GMT, a time the clocks skip.
      {"Europe/Dublin", 2008, "2008-10-26 01:59:59", "2008-03-30 01:00:00"},
      // Today's rule for every year: New York's 2006 changes were in April and
      // October.
      {"America/New_York", 2006, "2006-03-12 01:59:59", "2006-11-05 02:00:00"},
  };
  for (const auto& c : cases) ExpectDates(c);
}

// Outside 1970-01-01..2038-01-18 the texts are those outOfRange values keep.
TEST(GenerateDSTDates, YearsOutsideTheRange) {
  const DatesCase cases[] = {
      {"EST5EDT,M3.2.0,M11.1.0", 1969, "1969/3/9 1:59:59", "1969/11/2 2:0:0"},
      {"EST5EDT,M3.2.0,M11.1.0", 2038, "2038/3/14 1:59:59", "2038/11/7 2:0:0"},
      {"EST5EDT,M3.2.0,M11.1.0", -2147483647 - 1, "-2147483648/3/9 1:59:59",
       "-2147483648/11/2 2:0:0"},
      // Carried out of the range: the fields after the carry.
      {"XST3XDT,J1/-1,J365/25", 1970, "1969/12/31 22:59:59", "1971-01-01 01:00:00"},
  };
  for (const auto& c : cases) ExpectDates(c);
}

TEST(GenerateDSTDates, ZonesWithoutDaylightSavingGiveEmptyTexts) {
  for (const char* zone : {"JST-9", "Asia/Tokyo", "UTC0", ""}) {
    const DatesCase c = {zone, 2007, "", ""};
    ExpectDates(c);
  }
}

// A daylight name without rules gets the C library's: those of the folder's
// "posixrules" file, else ",M3.2.0,M11.1.0".
TEST(GenerateDSTDates, DaylightNameWithoutRules) {
  TempDir folder;
  ASSERT_TRUE(folder.ok());
  EnvGuard zone_folder("TZDIR", folder.path().c_str());
  ExpectDates({"XST3XDT", 2008, "2008-03-09 01:59:59", "2008-11-02 02:00:00"});
}

}  // namespace
