// Composition and breakdown on top of the C library's localtime_r.
//
// glibc reloads `TZ` in localtime() and mktime() but not in localtime_r(), so each
// public entry point calls tzset() first. mktime() is not used for composition: with
// tm_isdst = -1 its reading of a repeated hour depends on the call before it. The
// offsets in force around the local time are asked of localtime_r instead, and the
// choice between two readings is made here.
#include "platform/local_time.h"

#include <time.h>

#include <algorithm>
#include <cstring>

#include "platform/civil.h"

namespace datetimelib::platform {
namespace {

constexpr std::int64_t kSecondsPerDay = 86400;

void CopyAbbreviation(const char* source, char (&target)[16]) {
  std::size_t length = source == nullptr ? 0 : std::strlen(source);
  length = std::min(length, sizeof target - 1);
  if (length > 0) std::memcpy(target, source, length);
  target[length] = '\0';
}

// localtime_r without a tzset() of its own; false when the C library has no answer.
bool LibcLocalTime(std::int64_t unix_seconds, std::tm* out) {
  const time_t t = static_cast<time_t>(unix_seconds);
  return localtime_r(&t, out) != nullptr;
}

// Seconds east of UTC in force at an instant (0 where the C library has none).
std::int64_t OffsetAt(std::int64_t unix_seconds) {
  std::tm fields{};
  return LibcLocalTime(unix_seconds, &fields) ? fields.tm_gmtoff : 0;
}

}  // namespace

BrokenDownTime BreakDownUtc(std::int64_t unix_seconds) {
  const std::int64_t days = FloorDiv(unix_seconds, kSecondsPerDay);
  const int second_of_day = static_cast<int>(unix_seconds - days * kSecondsPerDay);
  const CivilDay date = CivilFromDays(days);
  BrokenDownTime out{};
  out.year = static_cast<int>(date.year);
  out.month = date.month;
  out.day = date.day;
  out.hour = second_of_day / 3600;
  out.minute = second_of_day / 60 % 60;
  out.second = second_of_day % 60;
  out.weekday = WeekdayFromDays(days);
  out.yearday = YearDay(date.year, date.month, date.day);
  out.utc_offset = 0;
  out.is_dst = false;
  CopyAbbreviation("GMT", out.abbreviation);
  return out;
}

BrokenDownTime BreakDownLocal(std::int64_t unix_seconds) {
  tzset();
  std::tm fields{};
  if (!LibcLocalTime(unix_seconds, &fields)) return BreakDownUtc(unix_seconds);
  BrokenDownTime out{};
  out.year = fields.tm_year + 1900;
  out.month = fields.tm_mon + 1;
  out.day = fields.tm_mday;
  out.hour = fields.tm_hour;
  out.minute = fields.tm_min;
  out.second = fields.tm_sec;
  out.weekday = fields.tm_wday;
  out.yearday = fields.tm_yday;
  out.utc_offset = static_cast<std::int32_t>(fields.tm_gmtoff);
  out.is_dst = fields.tm_isdst > 0;
  CopyAbbreviation(fields.tm_zone, out.abbreviation);
  return out;
}

std::int64_t ComposeLocal(std::int64_t civil_seconds) {
  tzset();
  // Offsets stay within +/-26 hours, so every instant that reads as this local
  // time lies within a day of it; the offsets in force a day before, at and a day
  // after it, and at the instants they point to, cover every reading.
  std::int64_t offsets[6];
  std::size_t count = 0;
  for (const std::int64_t probe :
       {civil_seconds - kSecondsPerDay, civil_seconds, civil_seconds + kSecondsPerDay}) {
    const std::int64_t offset = OffsetAt(probe);
    offsets[count++] = offset;
    offsets[count++] = OffsetAt(civil_seconds - offset);
  }

  bool found = false;
  std::int64_t earliest = 0;
  for (std::size_t i = 0; i < count; ++i) {
    const std::int64_t instant = civil_seconds - offsets[i];
    if (OffsetAt(instant) != offsets[i]) continue;
    if (!found || instant < earliest) earliest = instant;
    found = true;
  }
  if (found) return earliest;

  // Skipped by a forward change: read with the offset in force before the change.
  // The earliest candidate instant lies before the change.
  const std::int64_t largest = *std::max_element(offsets, offsets + count);
  return civil_seconds - OffsetAt(civil_seconds - largest);
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
