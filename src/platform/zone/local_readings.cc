#include "platform/zone/local_readings.h"

#include <algorithm>
#include <cstring>

#include "platform/zone/current_zone.h"
#include "platform/zone/local_time.h"

namespace datetimelib::platform {
namespace {

// Offsets lie within 26 hours of UTC: looking that far either side of the local
// time finds every offset that may read it, save one in force for less than a
// day between two others, which no zone has.
constexpr std::int64_t kFarthestOffset = 26 * 3600;

}  // namespace

std::vector<LocalReading> LocalReadings(std::int64_t civil_seconds) {
  std::vector<std::int32_t> offsets;
  const auto add_offset_at = [&offsets](std::int64_t unix_seconds) {
    const std::int32_t offset = BreakDownLocal(unix_seconds).utc_offset;
    if (std::find(offsets.begin(), offsets.end(), offset) == offsets.end()) {
      offsets.push_back(offset);
    }
  };
  for (const std::int64_t probe : {civil_seconds - kFarthestOffset, civil_seconds,
                                   civil_seconds + kFarthestOffset}) {
    add_offset_at(probe);
  }
  std::vector<LocalReading> readings;
  // `offsets` may grow while it is walked: each candidate's own offset joins it.
  for (std::size_t i = 0; i < offsets.size(); ++i) {
    const std::int64_t candidate = civil_seconds - offsets[i];
    const BrokenDownTime fields = BreakDownLocal(candidate);
    if (fields.utc_offset != offsets[i]) {
      add_offset_at(candidate);
      continue;
    }
    LocalReading reading{candidate, fields.utc_offset, {}};
    std::memcpy(reading.abbreviation, fields.abbreviation, sizeof reading.abbreviation);
    readings.push_back(reading);
  }
  std::sort(readings.begin(), readings.end(),
            [](const LocalReading& a, const LocalReading& b) {
              return a.unix_seconds < b.unix_seconds;
            });
  return readings;
}

bool ZoneRuleHasAbbreviation(std::string_view abbreviation) {
  const PosixRule& rule = CurrentZone().current_rule();
  return abbreviation == rule.std_abbreviation ||
         (rule.dst != PosixRule::Dst::kNone && abbreviation == rule.dst_abbreviation);
}

bool ZoneRuleHasOffset(std::int32_t seconds_east) {
  const PosixRule& rule = CurrentZone().current_rule();
  return seconds_east == rule.std_seconds_east ||
         (rule.dst != PosixRule::Dst::kNone && seconds_east == rule.dst_seconds_east);
}

}  // namespace datetimelib::platform
