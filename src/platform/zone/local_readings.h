// The readings of local fields in the process's time zone: each instant whose
// local time is those fields, with the offset and abbreviation it is read in.
// A text that names its zone ("01:30 EST", "01:30 -0500") picks one of them.
#ifndef DATETIMELIB_PLATFORM_ZONE_LOCAL_READINGS_H_
#define DATETIMELIB_PLATFORM_ZONE_LOCAL_READINGS_H_

#include <cstdint>
#include <string_view>
#include <vector>

namespace datetimelib::platform {

struct LocalReading {
  std::int64_t unix_seconds;
  std::int32_t utc_offset;  // seconds east of UTC, daylight saving included
  char abbreviation[16];    // NUL-terminated, possibly cut
};

// Earliest first: none for a local time that a change skips, two for one that
// a change repeats. `civil_seconds` as in civil.h, within +/-2^40.
std::vector<LocalReading> LocalReadings(std::int64_t civil_seconds);

// Whether the zone's rule in force now has this abbreviation, or this offset,
// for its standard or its daylight time.
bool ZoneRuleHasAbbreviation(std::string_view abbreviation);
bool ZoneRuleHasOffset(std::int32_t seconds_east);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_LOCAL_READINGS_H_
