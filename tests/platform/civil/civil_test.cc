#include "platform/civil/civil.h"

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
  // Huge fields that cancel are still exact (the 128-bit path).
  EXPECT_EQ(CivilSeconds(1970, 1, 1, 1000000000000LL, -60000000000000LL, 0), 0);
}

}  // namespace
