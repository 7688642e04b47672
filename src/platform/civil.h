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
