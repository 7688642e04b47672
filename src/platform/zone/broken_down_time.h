// The fields of an instant read in a given offset from UTC: the form in which the
// zone engine hands out local time, and UTC's own fields.
#ifndef DATETIMELIB_PLATFORM_ZONE_BROKEN_DOWN_TIME_H_
#define DATETIMELIB_PLATFORM_ZONE_BROKEN_DOWN_TIME_H_

#include <cstdint>
#include <ctime>

namespace datetimelib::platform {

// A zone abbreviation as the engine keeps it: NUL-terminated and NUL-padded to
// its full size, so that it is copied whole, without measuring it.
using Abbreviation = char[16];

struct BrokenDownTime {
  int year;                 // with century
  int month;                // [1:12]
  int day;                  // [1:31]
  int hour;                 // [0:23]
  int minute;               // [0:59]
  int second;               // [0:59]
  int weekday;              // [0:6], 0 == Sunday
  int yearday;              // [0:365], 0 == 1 January
  std::int32_t utc_offset;  // seconds east of UTC, daylight saving included
  bool is_dst;
  Abbreviation abbreviation;  // NUL-terminated, cut to 15 bytes
};

// The fields of `civil_seconds` (see civil.h) read in a zone whose offset is
// `utc_offset` seconds east, with that daylight flag and abbreviation.
BrokenDownTime BrokenDownAt(std::int64_t civil_seconds, std::int32_t utc_offset,
                            bool is_dst, const Abbreviation& abbreviation);

// The UTC fields of an instant; abbreviation "GMT". Pure arithmetic.
BrokenDownTime BreakDownUtc(std::int64_t unix_seconds);

// The fields as a std::tm for strftime-style formatting. `tm_zone` points into
// `fields`, which must outlive the result's use.
std::tm ToTm(const BrokenDownTime& fields);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_BROKEN_DOWN_TIME_H_
