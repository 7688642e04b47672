#include "platform/civil/civil.h"

namespace datetimelib::platform {
namespace {

// Wide enough that no field combination can overflow: |year| < 2^64 after the
// month carry, days < 2^74, seconds < 2^91.
__extension__ using Int128 = __int128;

constexpr Int128 FloorDiv128(Int128 n, Int128 d) {
  return n / d - ((n % d != 0 && n < 0) ? 1 : 0);
}

constexpr Int128 DaysFromCivil128(Int128 year, int month, int day) {
  const Int128 y = year - (month <= 2 ? 1 : 0);
  const Int128 era = FloorDiv128(y, 400);
  const Int128 year_of_era = y - era * 400;
  const Int128 day_of_year = (153 * ((month + 9) % 12) + 2) / 5 + day - 1;
  const Int128 day_of_era =
      year_of_era * 365 + year_of_era / 4 - year_of_era / 100 + day_of_year;
  return era * 146097 + day_of_era - 719468;
}

constexpr Int128 kLimit = Int128{1} << 40;
constexpr std::int64_t kLimit64 = std::int64_t{1} << 40;

// Every field within 32 bits: 64-bit arithmetic is exact (days below 2^42,
// seconds below 2^59) and avoids 128-bit division.
bool FitsIn32Bits(std::int64_t value) { return value >= INT32_MIN && value <= INT32_MAX; }

std::optional<std::int64_t> CivilSeconds64(std::int64_t year, std::int64_t month,
                                           std::int64_t day, std::int64_t hour,
                                           std::int64_t minute, std::int64_t second) {
  std::int64_t days;
  if (month >= 1 && month <= 12 && year > -kFastCivilYears && year < kFastCivilYears) {
    // Fields as people and readers give them: no month carries into the year.
    days = FastDaysFromCivil(year, static_cast<int>(month), 1) + (day - 1);
  } else {
    const std::int64_t month0 = month - 1;
    const std::int64_t year_carry = FloorDiv(month0, 12);
    const int month_norm = static_cast<int>(month0 - year_carry * 12) + 1;  // [1:12]
    days = DaysFromCivil(year + year_carry, month_norm, 1) + (day - 1);
  }
  const std::int64_t total = days * kSecondsPerDay + hour * 3600 + minute * 60 + second;
  if (total <= -kLimit64 || total >= kLimit64) return std::nullopt;
  return total;
}

}  // namespace

std::optional<std::int64_t> CivilSeconds(std::int64_t year, std::int64_t month,
                                         std::int64_t day, std::int64_t hour,
                                         std::int64_t minute, std::int64_t second) {
  if (FitsIn32Bits(year) && FitsIn32Bits(month) && FitsIn32Bits(day) &&
      FitsIn32Bits(hour) && FitsIn32Bits(minute) && FitsIn32Bits(second)) {
    return CivilSeconds64(year, month, day, hour, minute, second);
  }
  const Int128 month0 = Int128{month} - 1;
  const Int128 year_carry = FloorDiv128(month0, 12);
  const int month_norm = static_cast<int>(month0 - year_carry * 12) + 1;  // [1:12]
  const Int128 days =
      DaysFromCivil128(Int128{year} + year_carry, month_norm, 1) + (Int128{day} - 1);
  const Int128 total =
      days * kSecondsPerDay + Int128{hour} * 3600 + Int128{minute} * 60 + Int128{second};
  if (total <= -kLimit || total >= kLimit) return std::nullopt;
  return static_cast<std::int64_t>(total);
}

}  // namespace datetimelib::platform
