#include "platform/civil.h"

#include <gtest/gtest.h>

#include <climits>
#include <ctime>

#include "support/value_text.h"

namespace {

using datetimelib::platform::CivilFromDays;
using datetimelib::platform::CivilSeconds;
using datetimelib::platform::DaysFromCivil;
using datetimelib::platform::WeekdayFromDays;
using datetimelib::platform::YearDay;

// Every day from 1900 to 2100 agrees with the C library's UTC calendar.
TEST(Civil, DaysAgreeWithGmtime) {
  for (std::int64_t days = DaysFromCivil(1900, 1, 1); days < DaysFromCivil(2100, 1, 1);
       ++days) {
    const time_t t = static_cast<time_t>(days * 86400);
    std::tm utc{};
    ASSERT_NE(gmtime_r(&t, &utc), nullptr);
    const auto date = CivilFromDays(days);
    ASSERT_EQ(date.year, utc.tm_year + 1900) << days;
    ASSERT_EQ(date.month, utc.tm_mon + 1) << days;
    ASSERT_EQ(date.day, utc.tm_mday) << days;
    ASSERT_EQ(WeekdayFromDays(days), utc.tm_wday) << days;
    ASSERT_EQ(YearDay(date.year, date.month, date.day), utc.tm_yday) << days;
    ASSERT_EQ(DaysFromCivil(date.year, date.month, date.day), days);
  }
}

TEST(Civil, SecondsCarryLikeTimegm) {
  const struct {
    int year, month, day, hour, minute, second;
  } cases[] = {
      {2000, 13, 1, 0, 0, 0},
      {2000, 0, 1, 0, 0, 0},
      {2000, -13, 1, 0, 0, 0},
      {2000, 3, 0, 0, 0, 0},
      {2001, 3, -400, 0, 0, 0},
      {2003, 1, 1, 25, 0, 0},
      {2003, 1, 1, 0, -1, 0},
      {2003, 1, 1, -49, 61, -3},
      {1970, 1, 1, 0, 0, -1},
      {2038, 1, 19, 3, 14, 7},
      {1999, 25, 400, 1000, -7000, 123456},
  };
  for (const auto& c : cases) {
    std::tm fields{};
    fields.tm_year = c.year - 1900;
    fields.tm_mon = c.month - 1;
    fields.tm_mday = c.day;
    fields.tm_hour = c.hour;
    fields.tm_min = c.minute;
    fields.tm_sec = c.second;
    const std::int64_t expected = timegm(&fields);
    EXPECT_EQ(CivilSeconds(c.year, c.month, c.day, c.hour, c.minute, c.second), expected)
        << c.year << "/" << c.month << "/" << c.day;
  }
}

TEST(Civil, ExtremeFieldsAreExactOrRefused) {
  EXPECT_FALSE(
      CivilSeconds(LLONG_MAX, LLONG_MAX, LLONG_MAX, LLONG_MAX, LLONG_MAX, LLONG_MAX));
  EXPECT_FALSE(
      CivilSeconds(LLONG_MIN, LLONG_MIN, LLONG_MIN, LLONG_MIN, LLONG_MIN, LLONG_MIN));
  EXPECT_FALSE(CivilSeconds(40000, 1, 1, 0, 0, 0));
  // Huge fields that cancel out are still exact.
  EXPECT_EQ(CivilSeconds(1970, 1, 1, 1000000000000LL, -60000000000000LL, 0), 0);
  EXPECT_EQ(CivilSeconds(1970, 12000000000001LL, 1, 0, 0, 0).has_value(), false);
}

}  // namespace

namespace {

// The 32-bit forms agree with the general algorithms over their whole range, at
// every day and at seconds that fall on each side of midnight.
TEST(Civil, FastFieldsAgreeWithGeneral) {
  using datetimelib::platform::FastCivilFields;
  using datetimelib::platform::kFastCivilLimit;
  using datetimelib::platform::WeekdayFromDays;
  for (std::int64_t days = -kFastCivilLimit + 1; days < kFastCivilLimit - 1; days += 3) {
    for (const std::int64_t second_of_day : {std::int64_t{0}, std::int64_t{86399}}) {
      const auto fast = FastCivilFields(days * 86400 + second_of_day);
      const auto general = CivilFromDays(days);
      ASSERT_EQ(fast.date.year, general.year) << days;
      ASSERT_EQ(fast.date.month, general.month) << days;
      ASSERT_EQ(fast.date.day, general.day) << days;
      ASSERT_EQ(fast.yearday, YearDay(general.year, general.month, general.day)) << days;
      ASSERT_EQ(fast.weekday, WeekdayFromDays(days)) << days;
      ASSERT_EQ(fast.hour * 3600 + fast.minute * 60 + fast.second, second_of_day) << days;
    }
  }
}

}  // namespace
