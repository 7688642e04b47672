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
      {"<+0530>-5:30", "+0530 19800"},
      {"<-0325>+3:25:45", "-0325 -12345"},
      {"XST-24", "XST 86400"},
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
