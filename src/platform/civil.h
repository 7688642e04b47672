// Proleptic Gregorian calendar arithmetic, free of time zones.
//
// Days are counted from 1970-01-01 (day 0). The algorithms are the era-based ones
// (400-year cycles of 146 097 days), exact for every year in [-2^31, 2^31).
#ifndef DATETIMELIB_PLATFORM_CIVIL_H_
#define DATETIMELIB_PLATFORM_CIVIL_H_

#include <cstdint>
#include <optional>

namespace datetimelib::platform {

struct CivilDay {
  std::int64_t year;
  int month;  // [1:12]
  int day;    // [1:31]
};

// Floor division and its remainder for a positive divisor.
constexpr std::int64_t FloorDiv(std::int64_t n, std::int64_t d) {
  return n / d - ((n % d != 0 && n < 0) ? 1 : 0);
}
constexpr std::int64_t FloorMod(std::int64_t n, std::int64_t d) {
  return n - FloorDiv(n, d) * d;
}

constexpr bool IsLeap(std::int64_t year) {
  return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
}

constexpr int DaysInMonth(std::int64_t year, int month) {  // month [1:12]
  constexpr int kDays[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
  return month == 2 && IsLeap(year) ? 29 : kDays[month - 1];
}

// Days from 1970-01-01 to year-month-day; month [1:12], day [1:31].
// For |year| < 2^31 every intermediate stays below 2^40 in magnitude.
constexpr std::int64_t DaysFromCivil(std::int64_t year, int month, int day) {
  const std::int64_t y = year - (month <= 2 ? 1 : 0);
  const std::int64_t era = FloorDiv(y, 400);
  const std::int64_t year_of_era = y - era * 400;                            // [0, 399]
  const std::int64_t shifted_month = (month + 9) % 12;                       // March == 0
  const std::int64_t day_of_year = (153 * shifted_month + 2) / 5 + day - 1;  // [0, 365]
  const std::int64_t day_of_era = year_of_era * 365 + year_of_era / 4 -
                                  year_of_era / 100 + day_of_year;  // [0, 146096]
  return era * 146097 + day_of_era - 719468;  // 719468: 0000-03-01 to 1970-01-01
}

constexpr CivilDay CivilFromDays(std::int64_t days) {
  const std::int64_t z = days + 719468;
  const std::int64_t era = FloorDiv(z, 146097);
  const std::int64_t day_of_era = z - era * 146097;  // [0, 146096]
  const std::int64_t year_of_era =
      (day_of_era - day_of_era / 1460 + day_of_era / 36524 - day_of_era / 146096) /
      365;  // [0, 399]
  const std::int64_t day_of_year =
      day_of_era - (365 * year_of_era + year_of_era / 4 - year_of_era / 100);  // [0, 365]
  const std::int64_t shifted_month = (5 * day_of_year + 2) / 153;  // [0, 11], March == 0
  const int day = static_cast<int>(day_of_year - (153 * shifted_month + 2) / 5 + 1);
  const int month =
      static_cast<int>(shifted_month < 10 ? shifted_month + 3 : shifted_month - 9);
  return CivilDay{year_of_era + era * 400 + (month <= 2 ? 1 : 0), month, day};
}

// The date and day of the year of a day, for days within +/-2^23 of 1970-01-01
// (about 23 000 years either side), in 32-bit unsigned arithmetic: the
// Euclidean affine forms of Neri and Schneider, a few multiplications and no
// division by a variable. Agrees with CivilFromDays and YearDay on that range.
struct CivilDayOfYear {
  CivilDay date;
  int yearday;  // [0:365], 0 == 1 January
};
inline constexpr std::int64_t kFastCivilLimit = std::int64_t{1} << 23;
constexpr CivilDayOfYear FastCivilFromDays(std::int64_t days) {  // |days| < 2^23
  // n below stays within [2^22, 2^25), so 4 * n + 3 fits in 32 bits.
  // Shifted by 82 eras of 146 097 days so that every day counted is positive.
  constexpr std::uint32_t kEraShift = 82;
  constexpr std::uint32_t kDayShift = 719468 + 146097 * kEraShift;  // from 0000-03-01
  const std::uint32_t n = static_cast<std::uint32_t>(days + kDayShift);
  const std::uint32_t n1 = 4 * n + 3;
  const std::uint32_t century = n1 / 146097;
  const std::uint32_t day_of_century = n1 % 146097 / 4;
  const std::uint32_t n2 = 4 * day_of_century + 3;
  const std::uint64_t p2 = std::uint64_t{2939745} * n2;
  const std::uint32_t year_of_century = static_cast<std::uint32_t>(p2 >> 32);
  const std::uint32_t day_of_year =
      static_cast<std::uint32_t>(p2) / 2939745 / 4;  // from 1 March
  const std::uint32_t n3 = 2141 * day_of_year + 197913;
  const std::uint32_t month = n3 >> 16;  // [3:14], March == 3
  const std::uint32_t day = (n3 & 0xffff) / 2141;
  const bool january_or_february = day_of_year >= 306;
  const std::int64_t year = std::int64_t{100} * century + year_of_century -
                            400 * std::int64_t{kEraShift} + (january_or_february ? 1 : 0);
  const bool leap = year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
  const int yearday = january_or_february
                          ? static_cast<int>(day_of_year) - 306
                          : static_cast<int>(day_of_year) + 59 + (leap ? 1 : 0);
  return {{year, static_cast<int>(january_or_february ? month - 12 : month),
           static_cast<int>(day) + 1},
          yearday};
}

// 0 == Sunday ... 6 == Saturday. Day 0 (1970-01-01) was a Thursday.
constexpr int WeekdayFromDays(std::int64_t days) {
  return static_cast<int>(FloorMod(days + 4, 7));
}

// Day of the year, 0 == 1 January.
constexpr int YearDay(std::int64_t year, int month, int day) {
  return static_cast<int>(DaysFromCivil(year, month, day) - DaysFromCivil(year, 1, 1));
}

static_assert(DaysFromCivil(1970, 1, 1) == 0);
static_assert(DaysFromCivil(2000, 3, 1) == 11017);
static_assert(DaysFromCivil(1969, 12, 31) == -1);
static_assert(CivilFromDays(11016).month == 2 && CivilFromDays(11016).day == 29);
static_assert(CivilFromDays(-1).year == 1969);
static_assert(WeekdayFromDays(0) == 4 && WeekdayFromDays(-4) == 0);
static_assert(FastCivilFromDays(11016).date.day == 29 &&
              FastCivilFromDays(11016).yearday == 59);
static_assert(FastCivilFromDays(-1).date.year == 1969 &&
              FastCivilFromDays(-1).yearday == 364);
static_assert(FastCivilFromDays(-kFastCivilLimit + 1).date.year ==
              CivilFromDays(-kFastCivilLimit + 1).year);
static_assert(FastCivilFromDays(kFastCivilLimit - 1).date.day ==
              CivilFromDays(kFastCivilLimit - 1).day);

// Seconds of local time counted as if the zone were UTC ("civil seconds") for
// fields normalised the way mktime normalises them: seconds carry into minutes,
// minutes into hours, hours into days, months into years, and the day counts from
// the first of the normalised month. Any 64-bit field values are accepted; the
// sum is exact. Returns nothing when the result lies beyond +/-2^40 seconds
// (about 34 800 years), far outside any count this library stores.
std::optional<std::int64_t> CivilSeconds(std::int64_t year, std::int64_t month,
                                         std::int64_t day, std::int64_t hour,
                                         std::int64_t minute, std::int64_t second);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_CIVIL_H_
