// Folder src/platform/civil/: Gregorian arithmetic only; no zone, no I/O, no C
// library calls.
//
// Proleptic Gregorian calendar arithmetic, free of time zones.
//
// Days are counted from 1970-01-01 (day 0). The algorithms are the era-based ones
// (400-year cycles of 146 097 days), exact for every year in [-2^31, 2^31).
#ifndef DATETIMELIB_PLATFORM_CIVIL_CIVIL_H_
#define DATETIMELIB_PLATFORM_CIVIL_CIVIL_H_

#include <cstdint>
#include <optional>

namespace datetimelib::platform {

inline constexpr std::int64_t kSecondsPerDay = 86400;

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
// DaysFromCivil below takes a shorter path for most years.
constexpr std::int64_t DaysFromCivilByEras(std::int64_t year, int month, int day) {
  const std::int64_t y = year - (month <= 2 ? 1 : 0);
  const std::int64_t era = FloorDiv(y, 400);
  const std::int64_t year_of_era = y - era * 400;                            // [0, 399]
  const std::int64_t shifted_month = (month + 9) % 12;                       // March == 0
  const std::int64_t day_of_year = (153 * shifted_month + 2) / 5 + day - 1;  // [0, 365]
  const std::int64_t day_of_era = year_of_era * 365 + year_of_era / 4 -
                                  year_of_era / 100 + day_of_year;  // [0, 146096]
  return era * 146097 + day_of_era - 719468;  // 719468: 0000-03-01 to 1970-01-01
}

// The date of a day count; CivilFromDays below takes a shorter path for most.
constexpr CivilDay CivilFromDaysByEras(std::int64_t days) {
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

// Days within which the 32-bit forms below are exact (about 23 000 years either
// side of 1970).
inline constexpr std::int64_t kFastCivilLimit = std::int64_t{1} << 23;

// Every field of a count of civil seconds, for counts within
// +/-kFastCivilSecondsLimit (about 23 000 years either side of 1970), in unsigned
// arithmetic with constant divisors only: the breakdown's hot path. Agrees with
// CivilFromDays, YearDay and WeekdayFromDays on that range.
struct CivilFields {
  CivilDay date;
  int hour;     // [0:23]
  int minute;   // [0:59]
  int second;   // [0:59]
  int weekday;  // [0:6], 0 == Sunday
  int yearday;  // [0:365], 0 == 1 January
};
inline constexpr std::int64_t kFastCivilSecondsLimit = kFastCivilLimit * kSecondsPerDay;
constexpr CivilFields FastCivilFields(std::int64_t civil_seconds) {
  constexpr std::uint32_t kEraShift = 82;  // 400-year eras that make every count positive
  constexpr std::uint32_t kDayShift = 719468 + 146097 * kEraShift;  // day 0 is 0000-03-01
  // Below 2^41 for every count in range.
  const std::uint64_t shifted = static_cast<std::uint64_t>(
      civil_seconds + std::int64_t{kDayShift} * kSecondsPerDay);
  // n stays within [2^22, 2^25), so 4 * n + 3 fits in 32 bits.
  const std::uint32_t n = static_cast<std::uint32_t>(shifted / 86400);
  const std::uint32_t second_of_day = static_cast<std::uint32_t>(shifted % 86400);
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
  // The year of this March, leap or not: the shift is whole 400-year eras.
  const bool leap =
      year_of_century != 0 ? (year_of_century & 3) == 0 : (century & 3) == 0;
  CivilFields out{};
  out.date.year = std::int64_t{100} * century + year_of_century -
                  400 * std::int64_t{kEraShift} + (january_or_february ? 1 : 0);
  out.date.month = static_cast<int>(january_or_february ? month - 12 : month);
  out.date.day = static_cast<int>(day) + 1;
  out.hour = static_cast<int>(second_of_day / 3600);
  out.minute = static_cast<int>(second_of_day / 60 % 60);
  out.second = static_cast<int>(second_of_day % 60);
  // Shifted day 0 was a Wednesday (3), so 1970-01-01, day kDayShift, is a Thursday.
  out.weekday = static_cast<int>((n + 3) % 7);
  // A January or February belongs to the year after this March's, whose leap day
  // has not come yet.
  out.yearday = january_or_february ? static_cast<int>(day_of_year) - 306
                                    : static_cast<int>(day_of_year) + 59 + (leap ? 1 : 0);
  return out;
}

// DaysFromCivil for |year| < kFastCivilYears, in unsigned arithmetic with
// constant divisors: the composition's hot path.
inline constexpr std::int64_t kFastCivilYears = 20000;
constexpr std::int64_t FastDaysFromCivil(std::int64_t year, int month, int day) {
  constexpr std::uint32_t kEraShift = 82;  // 400-year eras that make every year positive
  const std::uint32_t y = static_cast<std::uint32_t>(year + 400 * kEraShift) -
                          (month <= 2 ? 1U : 0U);  // the year of this March
  const std::uint32_t shifted_month =
      static_cast<std::uint32_t>(month <= 2 ? month + 9 : month - 3);  // March == 0
  const std::uint32_t century = y / 100;
  const std::uint32_t day_of_year = (153 * shifted_month + 2) / 5;
  // 1461 * y / 4 is 365 y + y / 4, and century / 4 is y / 400.
  const std::uint32_t days = 1461 * y / 4 - century + century / 4 + day_of_year;
  return std::int64_t{days} + day - 1 - (719468 + std::int64_t{146097} * kEraShift);
}

static_assert(FastDaysFromCivil(1970, 1, 1) == 0);
static_assert(FastDaysFromCivil(2000, 2, 29) == DaysFromCivilByEras(2000, 2, 29));
static_assert(FastDaysFromCivil(1900, 3, 1) == DaysFromCivilByEras(1900, 3, 1));
static_assert(FastDaysFromCivil(-kFastCivilYears + 1, 1, 1) ==
              DaysFromCivilByEras(-kFastCivilYears + 1, 1, 1));
static_assert(FastDaysFromCivil(kFastCivilYears - 1, 12, 31) ==
              DaysFromCivilByEras(kFastCivilYears - 1, 12, 31));

// The calendar conversions for any year or day count, by the 32-bit forms where
// they are exact.
constexpr std::int64_t DaysFromCivil(std::int64_t year, int month, int day) {
  return year > -kFastCivilYears && year < kFastCivilYears
             ? FastDaysFromCivil(year, month, day)
             : DaysFromCivilByEras(year, month, day);
}
constexpr CivilDay CivilFromDays(std::int64_t days) {
  return days > -kFastCivilLimit && days < kFastCivilLimit
             ? FastCivilFields(days * kSecondsPerDay).date
             : CivilFromDaysByEras(days);
}

// 0 == Sunday ... 6 == Saturday. Day 0 (1970-01-01) was a Thursday.
constexpr int WeekdayFromDays(std::int64_t days) {
  return static_cast<int>(FloorMod(days + 4, 7));
}

// Day of the year, 0 == 1 January.
constexpr int YearDay(std::int64_t year, int month, int day) {
  return static_cast<int>(DaysFromCivil(year, month, day) - DaysFromCivil(year, 1, 1));
}

// Every field of a count of civil seconds: the 32-bit forms within their range,
// the general algorithms beyond it.
constexpr CivilFields CivilFieldsOf(std::int64_t civil_seconds) {
  if (civil_seconds > -kFastCivilSecondsLimit && civil_seconds < kFastCivilSecondsLimit) {
    return FastCivilFields(civil_seconds);
  }
  const std::int64_t days = FloorDiv(civil_seconds, kSecondsPerDay);
  const int second_of_day = static_cast<int>(civil_seconds - days * kSecondsPerDay);
  CivilFields out{};
  out.date = CivilFromDays(days);
  out.hour = second_of_day / 3600;
  out.minute = second_of_day / 60 % 60;
  out.second = second_of_day % 60;
  out.weekday = WeekdayFromDays(days);
  out.yearday = YearDay(out.date.year, out.date.month, out.date.day);
  return out;
}

static_assert(DaysFromCivil(1970, 1, 1) == 0);
static_assert(DaysFromCivil(2000, 3, 1) == 11017);
static_assert(DaysFromCivil(1969, 12, 31) == -1);
static_assert(CivilFromDays(11016).month == 2 && CivilFromDays(11016).day == 29);
static_assert(CivilFromDays(-1).year == 1969);
static_assert(WeekdayFromDays(0) == 4 && WeekdayFromDays(-4) == 0);
static_assert(FastCivilFields(-kFastCivilSecondsLimit + 1).date.year ==
              CivilFromDaysByEras(-kFastCivilLimit).year);
static_assert(FastCivilFields(kFastCivilSecondsLimit - 1).date.day ==
              CivilFromDaysByEras(kFastCivilLimit - 1).day);
static_assert(FastCivilFields(0).weekday == 4 && FastCivilFields(-1).hour == 23 &&
              FastCivilFields(-1).yearday == 364 &&
              FastCivilFields(951782400).yearday == 59);

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

#endif  // DATETIMELIB_PLATFORM_CIVIL_CIVIL_H_
