#include "platform/posix_rule.h"

#include <gtest/gtest.h>

#include <string>

#include "support/rule_text.h"

namespace {

using datetimelib::platform::CivilDay;
using datetimelib::platform::DaysFromCivil;
using datetimelib::platform::DaysInMonth;
using datetimelib::platform::ParsePosixRule;
using datetimelib::platform::TransitionInYear;
using datetimelib::platform::TransitionRule;
using datetimelib::platform::WeekdayFromDays;
using datetimelib::testing::RuleText;

TEST(ParsePosixRule, ReadsEveryPart) {
  const struct {
    const char* text;
    const char* expected;
  } cases[] = {
      // Offsets: POSIX west-positive in, seconds east out.
      {"UTC0", "UTC 0"},
      {"EST5", "EST -18000"},
      {"<+0530>-5:30", "+0530 19800"},
      {"<-0325>+3:25:45", "-0325 -12345"},
      {"XST-24", "XST 86400"},
      {"XST24", "XST -86400"},
      {"<A-1>1", "A-1 -3600"},
      // Daylight offset: one hour ahead of standard unless written.
      {"EST5EDT", "EST -18000 EDT -14400 no-rules"},
      {"EST5EDT,", "EST -18000 EDT -14400 no-rules"},
      {"XST3XDT2:30:15", "XST -10800 XDT -9015 no-rules"},
      {"EST5EDT,M3.2.0,M11.1.0",
       "EST -18000 EDT -14400 M3.2.0@7200 M11.1.0@7200"},  // America/New_York
      // Europe/Dublin: winter is the daylight part, with a negative shift.
      {"IST-1GMT0,M10.5.0,M3.5.0/1", "IST 3600 GMT 0 M10.5.0@7200 M3.5.0@3600"},
      // Transition times: negative, beyond a day, with minutes, at the limits.
      {"<-02>2<-01>,M3.5.0/-1,M10.5.0/0",
       "-02 -7200 -01 -3600 M3.5.0@-3600 M10.5.0@0"},  // America/Nuuk
      {"IST-2IDT,M3.4.4/26,M10.5.0",
       "IST 7200 IDT 10800 M3.4.4@93600 M10.5.0@7200"},  // Asia/Jerusalem
      {"<+1245>-12:45<+1345>,M9.5.0/2:45,M4.1.0/3:45",
       "+1245 45900 +1345 49500 M9.5.0@9900 M4.1.0@13500"},  // Pacific/Chatham
      {"XST3XDT,M1.1.0/-167,M12.5.6/+167:00",
       "XST -10800 XDT -7200 M1.1.0@-601200 M12.5.6@601200"},
      // Julian and zero-based days.
      {"XST3XDT,J1/0,J365/23:59:59", "XST -10800 XDT -7200 J1@0 J365@86399"},
      {"XST3XDT,0,365/-0:30", "XST -10800 XDT -7200 0@7200 365@-1800"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    const auto rule = ParsePosixRule(c.text);
    ASSERT_TRUE(rule.has_value());
    EXPECT_EQ(RuleText(*rule), c.expected);
  }
}

TEST(ParsePosixRule, RefusesMalformedRules) {
  const char* const cases[] = {
      // Names: three characters at least, quotes closed, nothing else inside.
      "",
      "XS5",
      "<XS>5",
      "<XST5",
      "<X_T>5",
      "5",
      "EST5ED",
      "EST5ED,M3.2.0,M11.1.0",
      // Offsets: required for standard time, at most 24:00:00, fields in range.
      "EST",
      "EST+",
      "EST24:00:01",
      "EST25",
      "EST5:60",
      "EST5:00:60",
      "EST5:",
      "EST5::",
      "EST5EDT24:00:01",
      "EST5EDT-25",
      "EST99999999999999999999",
      // Dates just outside their ranges.
      "EST5EDT,M0.1.0,M11.1.0",
      "EST5EDT,M13.1.0,M11.1.0",
      "EST5EDT,M3.0.0,M11.1.0",
      "EST5EDT,M3.6.0,M11.1.0",
      "EST5EDT,M3.2.7,M11.1.0",
      "EST5EDT,J0,J300",
      "EST5EDT,J366,J300",
      "EST5EDT,366,300",
      "EST5EDT,M3.2,M11.1.0",
      // Times just outside +/-167 h, or empty.
      "EST5EDT,M3.2.0/168,M11.1.0",
      "EST5EDT,M3.2.0/-168,M11.1.0",
      "EST5EDT,M3.2.0/167:00:01,M11.1.0",
      "EST5EDT,M3.2.0/1:60,M11.1.0",
      "EST5EDT,M3.2.0/,M11.1.0",
      // Rule lists: both transitions or none, and nothing after them.
      "EST5EDT,M3.2.0",
      "EST5EDT,M3.2.0,",
      "EST5EDT,,M11.1.0",
      "EST5EDT;M3.2.0,M11.1.0",
      "EST5EDT,M3.2.0,M11.1.0,",
      "EST5EDT,M3.2.0,M11.1.0x",
      "EST5x",
  };
  for (const char* text : cases) {
    EXPECT_FALSE(ParsePosixRule(text).has_value()) << text;
  }
}

CivilDay Day(int year, int month, int day) { return CivilDay{year, month, day}; }

TEST(TransitionInYear, PlacesEachForm) {
  const struct {
    const char* rule;  // the start rule of "XST3XDT,<rule>,0"
    int year;
    CivilDay date;
  } cases[] = {
      {"M3.2.0", 2007, Day(2007, 3, 11)},    // the second Sunday, not the last
      {"M11.1.0", 2007, Day(2007, 11, 4)},   // the first Sunday
      {"M4.1.0", 2007, Day(2007, 4, 1)},     // the 1st is itself a Sunday
      {"M10.5.0", 2004, Day(2004, 10, 31)},  // the 31st is itself the last Sunday
      {"M3.5.0", 2004, Day(2004, 3, 28)},
      {"M2.5.0", 2004, Day(2004, 2, 29)},  // a fifth Sunday exists
      {"M2.5.0", 2003, Day(2003, 2, 23)},  // only four: the last is the fourth
      {"M3.4.4", 2013, Day(2013, 3, 28)},  // Asia/Jerusalem's Thursday
      {"M3.5.4", 2013, Day(2013, 3, 28)},
      // Jn never counts 29 February; n does.
      {"J59", 2004, Day(2004, 2, 28)},
      {"J60", 2004, Day(2004, 3, 1)},
      {"J60", 2003, Day(2003, 3, 1)},
      {"J365", 2004, Day(2004, 12, 31)},
      {"59", 2004, Day(2004, 2, 29)},
      {"59", 2003, Day(2003, 3, 1)},
      {"365", 2004, Day(2004, 12, 31)},
      {"365", 2003, Day(2004, 1, 1)},
      {"0", 2003, Day(2003, 1, 1)},
  };
  for (const auto& c : cases) {
    const std::string text = std::string("XST3XDT,") + c.rule + ",0";
    SCOPED_TRACE(text + " in " + std::to_string(c.year));
    const auto rule = ParsePosixRule(text);
    ASSERT_TRUE(rule.has_value());
    const auto placed = TransitionInYear(rule->start, c.year);
    EXPECT_EQ(placed.date.year, c.date.year);
    EXPECT_EQ(placed.date.month, c.date.month);
    EXPECT_EQ(placed.date.day, c.date.day);
  }
}

// The time of day is kept whole and carries only in CivilSeconds.
TEST(TransitionInYear, TimeCarriesIntoNeighbouringDays) {
  const auto rule = ParsePosixRule("XST3XDT,M3.4.4/26,M3.5.0/-1");
  ASSERT_TRUE(rule.has_value());
  const auto start = TransitionInYear(rule->start, 2013);
  EXPECT_EQ(start.time_seconds, 26 * 3600);
  EXPECT_EQ(start.CivilSeconds(), DaysFromCivil(2013, 3, 29) * 86400 + 2 * 3600);
  const auto end = TransitionInYear(rule->end, 2024);  // last Sunday: 31 March
  EXPECT_EQ(end.CivilSeconds(), DaysFromCivil(2024, 3, 30) * 86400 + 23 * 3600);
}

// For every month, week and weekday over 31 years: the day has the rule's
// weekday, lies in the rule's month, is the w-th occurrence for weeks 1 to 4 and
// the last one for week 5.
TEST(TransitionInYear, MonthWeekDayInvariant) {
  TransitionRule rule;
  for (int year = 2000; year <= 2030; ++year) {
    for (rule.month = 1; rule.month <= 12; ++rule.month) {
      for (rule.week = 1; rule.week <= 5; ++rule.week) {
        for (rule.weekday = 0; rule.weekday <= 6; ++rule.weekday) {
          const CivilDay date = TransitionInYear(rule, year).date;
          SCOPED_TRACE(::testing::Message() << year << " M" << rule.month << "."
                                            << rule.week << "." << rule.weekday);
          ASSERT_EQ(date.year, year);
          ASSERT_EQ(date.month, rule.month);
          ASSERT_EQ(WeekdayFromDays(DaysFromCivil(year, rule.month, date.day)),
                    rule.weekday);
          if (rule.week < 5) {
            ASSERT_EQ((date.day - 1) / 7 + 1, rule.week);
          } else {
            ASSERT_GT(date.day + 7, DaysInMonth(year, rule.month));
          }
        }
      }
    }
  }
}

}  // namespace
