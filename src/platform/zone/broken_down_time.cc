#include "platform/zone/broken_down_time.h"

#include <cstring>

#include "platform/civil/civil.h"

namespace datetimelib::platform {

BrokenDownTime BrokenDownAt(std::int64_t civil_seconds, std::int32_t utc_offset,
                            bool is_dst, const Abbreviation& abbreviation) {
  const CivilFields civil = CivilFieldsOf(civil_seconds);
  BrokenDownTime out;
  out.year = static_cast<int>(civil.date.year);
  out.month = civil.date.month;
  out.day = civil.date.day;
  out.hour = civil.hour;
  out.minute = civil.minute;
  out.second = civil.second;
  out.weekday = civil.weekday;
  out.yearday = civil.yearday;
  out.utc_offset = utc_offset;
  out.is_dst = is_dst;
  std::memcpy(out.abbreviation, abbreviation, sizeof out.abbreviation);
  return out;
}

BrokenDownTime BreakDownUtc(std::int64_t unix_seconds) {
  static constexpr Abbreviation kGmt = "GMT";
  return BrokenDownAt(unix_seconds, 0, false, kGmt);
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
