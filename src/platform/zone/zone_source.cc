#include "platform/zone/zone_source.h"

#include <cstdlib>
#include <string_view>
#include <utility>

#include "platform/regular_file.h"

namespace datetimelib::platform {
namespace {

// Real zone files stay below 10 KiB; a bound keeps a hostile TZ from making a
// call read without limit.
constexpr std::size_t kMaxZoneFileBytes = 1 << 20;

TransitionRule SundayRule(int month, int week) {  // at the default 02:00
  TransitionRule rule;
  rule.month = month;
  rule.week = week;
  return rule;
}

std::optional<Tzif> ReadZoneFile(const std::string& path,
                                 FileIdentity* identity = nullptr) {
  const std::optional<std::string> bytes =
      ReadRegularFile(path, kMaxZoneFileBytes, identity);
  if (!bytes) return std::nullopt;
  return ParseTzif(*bytes);
}

PosixRule Utc() {
  PosixRule rule;
  rule.std_abbreviation = "UTC";
  return rule;
}

// The type in force after the last transition, read as standard time. When it is
// a daylight type, the standard type last in force before it gives the offset
// (types[0] is in force before the first transition).
PosixRule LastTypeRule(const Tzif& zone) {
  const std::vector<std::uint8_t>& order = zone.transition_types;
  TzifType last = zone.types[order.empty() ? 0 : order.back()];
  for (std::size_t i = order.size(); last.is_dst && i > 0; --i) {
    const TzifType& before = zone.types[i >= 2 ? order[i - 2] : 0];
    if (!before.is_dst) last = before;
  }
  PosixRule rule;
  rule.std_abbreviation = last.abbreviation;
  rule.std_seconds_east = last.utc_offset;
  return rule;
}

PosixRule FileRule(const Tzif& zone) {
  std::optional<PosixRule> footer = ParsePosixRule(zone.footer);
  if (footer && footer->dst != PosixRule::Dst::kWithoutRules) return *footer;
  return LastTypeRule(zone);
}

// The transitions that the C library gives a daylight name without rules.
void SupplyDefaultTransitions(const LoadedZone& zone, PosixRule* rule) {
  std::optional<PosixRule> source;
  if (zone.default_rules) source = ParsePosixRule(zone.default_rules->footer);
  if (source && source->dst == PosixRule::Dst::kWithRules) {
    rule->start = source->start;
    rule->end = source->end;
  } else {
    // Without a usable "posixrules": ",M3.2.0,M11.1.0", the United States rule
    // since 2007.
    rule->start = SundayRule(3, 2);
    rule->end = SundayRule(11, 1);
  }
  rule->dst = PosixRule::Dst::kWithRules;
}

}  // namespace

ZoneSettings ZoneSettings::FromEnvironment() {
  ZoneSettings settings;
  if (const char* tz = std::getenv("TZ")) settings.tz = tz;
  const char* folder = std::getenv("TZDIR");
  if (folder != nullptr && *folder != '\0') settings.zone_folder = folder;
  return settings;
}

LoadedZone LoadZone(const ZoneSettings& settings) {
  LoadedZone zone;
  if (!settings.tz) {
    zone.tzif = ReadZoneFile(settings.localtime_path, &zone.file_identity);
    if (zone.tzif) {
      zone.source = LoadedZone::Source::kFile;
      zone.file_path = settings.localtime_path;
    }
    return zone;
  }

  std::string_view name = *settings.tz;
  if (!name.empty() && name.front() == ':') name.remove_prefix(1);
  if (name.empty()) return zone;

  const std::string path = name.front() == '/'
                               ? std::string(name)
                               : settings.zone_folder + "/" + std::string(name);
  zone.tzif = ReadZoneFile(path, &zone.file_identity);
  if (zone.tzif) {
    zone.source = LoadedZone::Source::kFile;
    zone.file_path = path;
    return zone;
  }

  zone.rule = ParsePosixRule(name);
  if (!zone.rule) return zone;
  zone.source = LoadedZone::Source::kRule;
  if (zone.rule->dst == PosixRule::Dst::kWithoutRules) {
    // The C library ignores a "posixrules" file with fewer than two types.
    std::optional<Tzif> defaults = ReadZoneFile(settings.zone_folder + "/posixrules");
    if (defaults && defaults->types.size() >= 2) zone.default_rules = std::move(defaults);
  }
  return zone;
}

PosixRule CurrentRule(const LoadedZone& zone) {
  switch (zone.source) {
    case LoadedZone::Source::kUtc:
      break;
    case LoadedZone::Source::kFile:
      if (zone.tzif) return FileRule(*zone.tzif);
      break;
    case LoadedZone::Source::kRule:
      if (zone.rule) {
        PosixRule rule = *zone.rule;
        if (rule.dst == PosixRule::Dst::kWithoutRules)
          SupplyDefaultTransitions(zone, &rule);
        return rule;
      }
      break;
  }
  return Utc();
}

}  // namespace datetimelib::platform
