#include "platform/civil.h"

#include <gtest/gtest.h>

#include <ctime>

namespace {

using namespace datetimelib::platform;

// The 32-bit forms agree with the general algorithms over their whole range,
// at both ends of each day tested.
TEST(Civil, FastFieldsAgreeWithGeneral) {
  for (std::int64_t days = -kFastCivilLimit + 1; days < kFastCivilLimit - 1; days += 5) {
    for (const std::int64_t second_of_day : {std::int64_t{0}, std::int64_t{86399}}) {
      const CivilFields fast = FastCivilFields(days * 86400 + second_of_day);
      const CivilDay general = CivilFromDays(days);
      ASSERT_EQ(fast.date.year, general.year) << days;
      ASSERT_EQ(fast.date.month * 100 + fast.date.day, general.month * 100 + general.day)
          << days;
      ASSERT_EQ(fast.yearday, YearDay(general.year, general.month, general.day)) << days;
      ASSERT_EQ(fast.weekday, WeekdayFromDays(days)) << days;
      ASSERT_EQ(fast.hour * 3600 + fast.minute * 60 + fast.second, second_of_day) << days;
    }
  }
}

// Beyond the 32-bit forms' range (an hour's first second among them), the
// general algorithms give gmtime_r's fields; within 1600..2400, every day
// converts to its date and back.
TEST(Civil, GeneralFieldsAgreeWithGmtime) {
  for (const std::int64_t t : {kFastCivilSecondsLimit + 7200,
                               -kFastCivilSecondsLimit - 7322, std::int64_t{1} << 40}) {
    const time_t value = static_cast<time_t>(t);
    std::tm expected{};
    gmtime_r(&value, &expected);
    const CivilFields got = CivilFieldsOf(t);
    EXPECT_EQ(got.date.year, expected.tm_year + 1900) << t;
    EXPECT_EQ(got.date.month * 100 + got.date.day,
              (expected.tm_mon + 1) * 100 + expected.tm_mday);
    EXPECT_EQ(got.hour * 3600 + got.minute * 60 + got.second,
              expected.tm_hour * 3600 + expected.tm_min * 60 + expected.tm_sec)
        << t;
    EXPECT_EQ(got.weekday * 1000 + got.yearday,
              expected.tm_wday * 1000 + expected.tm_yday);
  }
  for (std::int64_t days = DaysFromCivil(1600, 1, 1); days < DaysFromCivil(2401, 1, 1);
       ++days) {
    const CivilDay date = CivilFromDays(days);
    ASSERT_EQ(DaysFromCivil(date.year, date.month, date.day), days);
    ASSERT_LE(date.day, DaysInMonth(date.year, date.month)) << days;
  }
}

// Fields carry as timegm carries them; fields too large for any count are
// refused, not overflowed.
TEST(Civil, SecondsCarryLikeTimegm) {
  const int cases[][6] = {
      {2000, 13, 1, 0, 0, 0},
      {2000, -13, 1, 0, 0, 0},
      {2001, 3, -400, 0, 0, 0},
      {2003, 1, 1, -49, 61, -3},
      {1999, 25, 400, 1000, -7000, 123456},
  };
  for (const auto& c : cases) {
    std::tm fields{};
    fields.tm_year = c[0] - 1900;
    fields.tm_mon = c[1] - 1;
    fields.tm_mday = c[2];
    fields.tm_hour = c[3];
    fields.tm_min = c[4];
    fields.tm_sec = c[5];
    EXPECT_EQ(CivilSeconds(c[0], c[1], c[2], c[3], c[4], c[5]),
              std::int64_t{timegm(&fields)})
        << c[0] << "/" << c[1] << "/" << c[2];
  }
  EXPECT_FALSE(
      CivilSeconds(INT64_MAX, INT64_MAX, INT64_MAX, INT64_MAX, INT64_MAX, INT64_MAX));
  // Fields beyond 32 bits that cancel take the 128-bit path: the same counts, and
  // the same limit of 2^40 seconds either way.
  constexpr std::int64_t kWide = std::int64_t{1} << 40;
  for (std::int64_t year = 1599; year <= 2401; ++year) {
    for (const int month : {-1, 0, 1, 2, 3, 12, 14}) {
      ASSERT_EQ(CivilSeconds(year, month, 1, kWide, -60 * kWide, 0),
                CivilSeconds(year, month, 1, 0, 0, 0))
          << year << "/" << month;
    }
  }
  EXPECT_EQ(CivilSeconds(1970, 1, 1, 0, 0, kWide - 1), kWide - 1);
  EXPECT_EQ(CivilSeconds(1970, 1, 1, 0, 0, 1 - kWide), 1 - kWide);
  EXPECT_FALSE(CivilSeconds(1970, 1, 1, 0, 0, kWide));
  EXPECT_FALSE(CivilSeconds(1970, 1, 1, 0, 0, -kWide));
}

}  // namespace
