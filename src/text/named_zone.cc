#include "text/named_zone.h"

#include <string_view>
#include <vector>

#include "platform/civil/civil.h"
#include "platform/zone/local_readings.h"

namespace datetimelib {

std::optional<std::int64_t> InstantInNamedZone(const DateTimeFields& local,
                                               const DateTimeFields& named,
                                               bool time_alone, std::int64_t usual) {
  const std::int64_t civil = platform::DaysFromCivil(local.year, local.month, local.day) *
                                 platform::kSecondsPerDay +
                             local.hour * 3600 + local.minute * 60 + local.second;
  for (const platform::LocalReading& reading : platform::LocalReadings(civil)) {
    const bool same = named.has_zone_offset
                          ? reading.utc_offset == named.zone_offset
                          : named.zone_name == std::string_view(reading.abbreviation);
    if (same) return reading.unix_seconds;
  }
  const bool rule_names_it = named.has_zone_offset
                                 ? platform::ZoneRuleHasOffset(named.zone_offset)
                                 : platform::ZoneRuleHasAbbreviation(named.zone_name);
  if (time_alone && rule_names_it) return usual;
  return std::nullopt;
}

std::optional<std::int64_t> UtcInstantOfNamedZone(const DateTimeFields& fields,
                                                  std::int64_t utc_instant) {
  if (fields.has_zone_offset) return utc_instant - fields.zone_offset;
  if (fields.zone_name == "GMT" || fields.zone_name == "UTC") return utc_instant;
  return std::nullopt;
}

}  // namespace datetimelib
