// Composition and breakdown through the compiled zone of the current TZ.
#include "platform/local_time.h"

#include <algorithm>
#include <cstring>

#include "platform/civil.h"
#include "platform/current_zone.h"

namespace datetimelib::platform {
namespace {

constexpr std::int64_t kSecondsPerDay = 86400;

}  // namespace

BrokenDownTime BreakDownUtc(std::int64_t unix_seconds) {
  const std::int64_t days = FloorDiv(unix_seconds, kSecondsPerDay);
  const int second_of_day = static_cast<int>(unix_seconds - days * kSecondsPerDay);
  CivilDayOfYear civil_day;
  if (days > -kFastCivilLimit && days < kFastCivilLimit) {
    civil_day = FastCivilFromDays(days);
  } else {
    civil_day.date = CivilFromDays(days);
    civil_day.yearday =
        YearDay(civil_day.date.year, civil_day.date.month, civil_day.date.day);
  }
  BrokenDownTime out{};
  out.year = static_cast<int>(civil_day.date.year);
  out.month = civil_day.date.month;
  out.day = civil_day.date.day;
  out.hour = second_of_day / 3600;
  out.minute = second_of_day / 60 % 60;
  out.second = second_of_day % 60;
  out.weekday = WeekdayFromDays(days);
  out.yearday = civil_day.yearday;
  std::memcpy(out.abbreviation, "GMT", 4);
  return out;
}

BrokenDownTime BreakDownLocal(std::int64_t unix_seconds) {
  return CurrentZone().BreakDown(unix_seconds);
}

std::int64_t ComposeLocal(std::int64_t civil_seconds) {
  return CurrentZone().Compose(civil_seconds);
}

std::tm ToTm(const BrokenDownTime& fields) {
  std::tm out{};
  out.tm_year = fields.year - 1900;
  out.tm_mon = fields.month - 1;
  out.tm_mday = fields.day;
  out.tm_hour = fields.hour;
  out.tm_min = fields.minute;
  out.tm_sec = fields.second;
  out.tm_wday = fields.weekday;
  out.tm_yday = fields.yearday;
  out.tm_isdst = fields.is_dst ? 1 : 0;
  out.tm_gmtoff = fields.utc_offset;
  out.tm_zone = fields.abbreviation;
  return out;
}

}  // namespace datetimelib::platform
