#include "platform/civil/civil.h"

#include <gtest/gtest.h>

#include <ctime>

#include "support/value_text.h"

namespace {

using namespace datetimelib::platform;

bool SameAsGmtime(std::int64_t t, const CivilFields& got) {
  const time_t value = static_cast<time_t>(t);
  std::tm e{};
  gmtime_r(&value, &e);
  return got.date.year == e.tm_year + 1900 && got.date.month == e.tm_mon + 1 &&
         got.date.day == e.tm_mday && got.hour == e.tm_hour && got.minute == e.tm_min &&
         got.second == e.tm_sec && got.weekday == e.tm_wday && got.yearday == e.tm_yday;
}

// The 32-bit forms over their whole range and the general algorithms beyond it
// (a few centuries each side, and 2^40), at both ends of each day tested.
TEST(Civil, FieldsAgreeWithGmtime) {
  constexpr std::int64_t kBeyond = 200000;
  for (std::int64_t days = -kFastCivilLimit - kBeyond; days < kFastCivilLimit + kBeyond;
       days += 5) {
    for (const std::int64_t t : {days * 86400, days * 86400 + 86399})
      ASSERT_TRUE(SameAsGmtime(t, CivilFieldsOf(t))) << t;
  }
  EXPECT_TRUE(SameAsGmtime(std::int64_t{1} << 40, CivilFieldsOf(std::int64_t{1} << 40)));
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
    EXPECT_EQ(CivilSeconds(c[0], c[1], c[2], c[3], c[4], c[5]),
              datetimelib::testing::UtcCount(c[0], c[1], c[2], c[3], c[4], c[5]))
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
  // Months within the year take a shorter path for most years: the same days.
  for (std::int64_t year = -kFastCivilYears - 2; year <= kFastCivilYears + 2; ++year) {
    for (int month = 1; month <= 12; ++month) {
      ASSERT_EQ(CivilSeconds(year, month, 31, 0, 0, 0),
                (DaysFromCivilByEras(year, month, 1) + 30) * kSecondsPerDay)
          << year << "/" << month;
    }
  }
  for (const std::int64_t t : {kWide - 1, 1 - kWide})
    EXPECT_EQ(CivilSeconds(1970, 1, 1, 0, 0, t), t);
  EXPECT_FALSE(CivilSeconds(1970, 1, 1, 0, 0, kWide));
  EXPECT_FALSE(CivilSeconds(1970, 1, 1, 0, 0, -kWide));
}

}  // namespace
