#include "text/english_names.h"

#include <gtest/gtest.h>

namespace {

using datetimelib::EqualsIgnoringAsciiCase;
using datetimelib::MonthAbbreviation;
using datetimelib::MonthFromName;
using datetimelib::WeekdayFromName;

TEST(EnglishNames, FoldOnlyAsciiLetters) {
  EXPECT_TRUE(EqualsIgnoringAsciiCase("sEpTeMbEr", "September"));
  EXPECT_FALSE(EqualsIgnoringAsciiCase("@", "`"));  // 0x40 and 0x60: not letters
  EXPECT_FALSE(EqualsIgnoringAsciiCase("[", "{"));
  EXPECT_FALSE(EqualsIgnoringAsciiCase("\xC4", "\xE4"));  // Latin-1 A/a umlaut
  EXPECT_FALSE(EqualsIgnoringAsciiCase("Jan", "Jan "));
}

TEST(EnglishNames, MonthsAndWeekdays) {
  const char* const abbreviations[] = {"Jan", "Feb", "Mar", "Apr", "May", "Jun",
                                       "Jul", "Aug", "Sep", "Oct", "Nov", "Dec"};
  for (int month = 1; month <= 12; ++month) {
    EXPECT_EQ(MonthAbbreviation(month), abbreviations[month - 1]);
    EXPECT_EQ(MonthFromName(abbreviations[month - 1]), month);
  }
  EXPECT_EQ(MonthAbbreviation(0), "");
  EXPECT_EQ(MonthAbbreviation(13), "");
  EXPECT_EQ(MonthFromName("DECEMBER"), 12);
  EXPECT_EQ(MonthFromName("may"), 5);
  for (const char* refused : {"Sept", "Ja", "Janu", "", "Jan "}) {
    EXPECT_EQ(MonthFromName(refused), 0) << refused;
  }
  EXPECT_EQ(WeekdayFromName("sunday"), 0);
  EXPECT_EQ(WeekdayFromName("WED"), 3);
  EXPECT_EQ(WeekdayFromName("Saturday"), 6);
  EXPECT_EQ(WeekdayFromName("Thurs"), -1);
}

}  // namespace
