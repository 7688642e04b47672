// Compiling a loaded zone into periods, reading it the way the C library does.
#include <algorithm>

#include "platform/ascii.h"
#include "platform/civil/civil.h"
#include "platform/zone/rule_changes.h"
#include "platform/zone/zone_timeline.h"

namespace datetimelib::platform {
namespace {

// Rule changes are laid out as periods for the UTC years [1900, 2100); outside
// them a rule is evaluated for each instant.
constexpr std::int64_t kTableFirstYear = 1900;
constexpr std::int64_t kTableEndYear = 2100;

std::int64_t NewYearInstant(std::int64_t utc_year) {
  return DaysFromCivil(utc_year, 1, 1) * kSecondsPerDay;
}

// The name a rule string that does not parse begins with, which the C library
// keeps as the name of UTC: "<...>" or a run of at least three letters.
std::string LeadingZoneName(const std::string& tz) {
  std::string_view name = tz;
  if (!name.empty() && name.front() == ':') name.remove_prefix(1);
  if (!name.empty() && name.front() == '<') {
    const std::size_t close = name.find('>');
    if (close == std::string_view::npos || close < 4) return {};
    return std::string(name.substr(1, close - 1));
  }
  std::size_t length = 0;
  while (length < name.size() && IsAsciiLetter(name[length])) ++length;
  return length >= 3 ? std::string(name.substr(0, length)) : std::string();
}

}  // namespace

std::uint16_t ZoneTimeline::AddType(std::int32_t utc_offset, bool is_dst,
                                    const std::string& name) {
  LocalType type{};
  type.utc_offset = utc_offset;
  type.is_dst = is_dst;
  const std::size_t length = std::min(name.size(), sizeof type.abbreviation - 1);
  std::copy_n(name.data(), length, type.abbreviation);
  types_.push_back(type);
  return static_cast<std::uint16_t>(types_.size() - 1);
}

void ZoneTimeline::AddPeriod(std::int64_t start, std::uint16_t type) {
  if (!starts_.empty()) {
    if (start <= starts_.back()) return;  // out of order: not a transition
    const LocalType& previous = types_[period_types_.back()];
    const LocalType& next = types_[type];
    if (previous.utc_offset == next.utc_offset && previous.is_dst == next.is_dst &&
        std::equal(std::begin(previous.abbreviation), std::end(previous.abbreviation),
                   std::begin(next.abbreviation))) {
      return;  // the clocks read the same on both sides
    }
  }
  starts_.push_back(start);
  period_types_.push_back(type);
}

void ZoneTimeline::SetRule(const PosixRule& rule) {
  rule_ = rule;
  rule_types_[0] = AddType(rule.std_seconds_east, false, rule.std_abbreviation);
  rule_types_[1] = rule.dst == PosixRule::Dst::kWithRules
                       ? AddType(rule.dst_seconds_east, true, rule.dst_abbreviation)
                       : rule_types_[0];
}

// Periods for the rule's changes from `from` (a period begins there) up to `to`.
// Daylight time of an instant depends on the changes of its UTC year only, so
// the state may also change at each new year.
void ZoneTimeline::AddRulePeriods(std::int64_t from, std::int64_t to) {
  const auto type_at = [this](std::int64_t t) {
    return rule_types_[RuleIsDstAt(*rule_, t) ? 1 : 0];
  };
  AddPeriod(from, type_at(from));
  if (rule_->dst != PosixRule::Dst::kWithRules) return;
  const std::int64_t first_year = CivilFromDays(FloorDiv(from, kSecondsPerDay)).year;
  const std::int64_t last_year = CivilFromDays(FloorDiv(to - 1, kSecondsPerDay)).year;
  for (std::int64_t year = first_year; year <= last_year; ++year) {
    const std::int64_t year_start = NewYearInstant(year);
    const std::int64_t year_end = NewYearInstant(year + 1);
    const RuleChanges changes = ChangesForUtcYear(*rule_, year);
    std::int64_t points[] = {year_start, changes.dst_start, changes.dst_end};
    std::sort(std::begin(points), std::end(points));
    for (const std::int64_t point : points) {
      if (point > from && point < to && point >= year_start && point < year_end) {
        AddPeriod(point, type_at(point));
      }
    }
  }
}

// The C library reads a zone file so: before the first transition the first
// standard-time type (the first type when all are daylight time); from the last
// transition on, the footer rule when there is one; a file without transitions
// keeps its first standard type for ever, footer or not.
void ZoneTimeline::BuildFromFile(const Tzif& file) {
  for (const TzifType& type : file.types)
    AddType(type.utc_offset, type.is_dst, type.abbreviation);
  std::uint16_t initial = 0;
  while (initial < file.types.size() && file.types[initial].is_dst) ++initial;
  if (initial == file.types.size()) initial = 0;
  AddPeriod(INT64_MIN, initial);
  if (file.transition_times.empty()) return;

  for (std::size_t i = 0; i < file.transition_times.size(); ++i) {
    AddPeriod(file.transition_times[i], file.transition_types[i]);
  }
  FollowFooterFrom(file.footer, file.transition_times.back());
}

// From the last transition on, the footer rule answers, not the last
// transition's type: as periods up to the table's end, per instant beyond it. A
// footer that does not parse, or names daylight time without rules, leaves the
// last type in force.
void ZoneTimeline::FollowFooterFrom(const std::string& footer_text,
                                    std::int64_t last_transition) {
  const std::optional<PosixRule> footer = ParsePosixRule(footer_text);
  if (!footer || footer->dst == PosixRule::Dst::kWithoutRules ||
      last_transition >= NewYearInstant(kTableEndYear)) {
    return;
  }
  if (starts_.back() == last_transition) {
    starts_.pop_back();
    period_types_.pop_back();
  }
  SetRule(*footer);
  table_to_ = NewYearInstant(kTableEndYear);
  AddRulePeriods(last_transition, table_to_);
}

void ZoneTimeline::BuildFromRule(const PosixRule& rule) {
  SetRule(rule);
  table_from_ = NewYearInstant(kTableFirstYear);
  table_to_ = NewYearInstant(kTableEndYear);
  AddPeriod(INT64_MIN, rule_types_[RuleIsDstAt(rule, table_from_) ? 1 : 0]);
  AddRulePeriods(table_from_, table_to_);
}

// A daylight name without transition rules, with a "posixrules" file: the C
// library takes the file's transitions, moves each by the difference between
// the named offsets and the file's own (the file's last standard and daylight
// offsets), as the file's standard/UT indicators say, and keeps the file's
// footer, unchanged, for the instants after them.
void ZoneTimeline::BuildFromDefaultRules(const PosixRule& rule, const Tzif& file) {
  const std::uint16_t standard =
      AddType(rule.std_seconds_east, false, rule.std_abbreviation);
  const std::uint16_t daylight =
      AddType(rule.dst_seconds_east, true, rule.dst_abbreviation);

  std::int32_t file_standard = file.types[0].utc_offset;
  std::int32_t file_daylight = file_standard;
  bool standard_found = false;
  bool daylight_found = false;
  for (std::size_t i = file.transition_types.size(); i-- > 0;) {
    const TzifType& type = file.types[file.transition_types[i]];
    if (!type.is_dst && !standard_found) {
      file_standard = type.utc_offset;
      standard_found = true;
    } else if (type.is_dst && !daylight_found) {
      file_daylight = type.utc_offset;
      daylight_found = true;
    }
    if (standard_found && daylight_found) break;
  }
  if (!daylight_found) file_daylight = file_standard;

  AddPeriod(INT64_MIN, standard);
  bool daylight_before = false;
  std::int64_t last_transition = INT64_MIN;
  for (std::size_t i = 0; i < file.transition_times.size(); ++i) {
    const TzifType& type = file.types[file.transition_types[i]];
    std::int64_t at = file.transition_times[i];
    if (type.is_ut) {
      // given in UT: stays
    } else if (daylight_before && !type.is_standard) {
      at += std::int64_t{rule.dst_seconds_east} - file_daylight;
    } else {
      at += std::int64_t{rule.std_seconds_east} - file_standard;
    }
    daylight_before = type.is_dst;
    AddPeriod(at, type.is_dst ? daylight : standard);
    last_transition = at;
  }
  if (!file.transition_times.empty()) FollowFooterFrom(file.footer, last_transition);
}

// Bucket b of the index holds the last of `starts` (ascending) at or before the
// bucket's first second. Each start's first bucket is found by arithmetic and
// the buckets between two starts are filled at once, so compiling a zone costs
// a pass over its periods and a fill, not a comparison per bucket.
static std::vector<std::uint16_t> BucketIndex(const std::vector<std::int64_t>& starts,
                                              int shift, std::int64_t from,
                                              std::int64_t to) {
  const std::size_t buckets = static_cast<std::size_t>(((to - from) >> shift) + 1);
  // The first bucket whose first second is at or after `start`.
  const auto first_bucket = [&](std::int64_t start) -> std::size_t {
    if (start <= from) return 0;
    if (start > to) return buckets;
    const std::int64_t rounded_up =
        (start - from + (std::int64_t{1} << shift) - 1) >> shift;
    return std::min(buckets, static_cast<std::size_t>(rounded_up));
  };
  std::vector<std::uint16_t> index(buckets);
  for (std::size_t period = 0; period < starts.size(); ++period) {
    const std::size_t begin = period == 0 ? 0 : first_bucket(starts[period]);
    const std::size_t end =
        period + 1 == starts.size() ? buckets : first_bucket(starts[period + 1]);
    if (begin >= end) continue;
    std::fill(index.begin() + static_cast<std::ptrdiff_t>(begin),
              index.begin() + static_cast<std::ptrdiff_t>(end),
              static_cast<std::uint16_t>(period));
  }
  return index;
}

// The local time of an instant. A zone file may place a transition anywhere in
// 64 bits; its local time saturates rather than wraps, which moves only
// instants that no 32-bit count comes near.
static std::int64_t LocalTimeOf(std::int64_t instant, std::int32_t utc_offset) {
  if (utc_offset > 0 && instant > INT64_MAX - utc_offset) return INT64_MAX;
  if (utc_offset < 0 && instant < INT64_MIN - utc_offset) return INT64_MIN;
  return instant + utc_offset;
}

void ZoneTimeline::Finish() {
  offset_span_ = 1;
  for (const LocalType& type : types_) {
    offset_span_ = std::max(offset_span_, std::int64_t{type.utc_offset} < 0
                                              ? 1 - std::int64_t{type.utc_offset}
                                              : 1 + std::int64_t{type.utc_offset});
  }
  local_starts_.resize(starts_.size());
  local_ends_.resize(starts_.size());
  for (std::size_t i = 0; i < starts_.size(); ++i) {
    const std::int32_t offset = types_[period_types_[i]].utc_offset;
    local_starts_[i] = i == 0 ? INT64_MIN : LocalTimeOf(starts_[i], offset);
    local_ends_[i] =
        i + 1 == starts_.size() ? INT64_MAX : LocalTimeOf(starts_[i + 1], offset);
    if (i > 0 && local_starts_[i] <= local_starts_[i - 1]) local_starts_ascend_ = false;
  }
  if (starts_.size() < UINT16_MAX) {
    instant_index_ = BucketIndex(starts_, kBucketShift, kIndexFrom, kIndexTo);
    if (local_starts_ascend_) {
      local_index_ = BucketIndex(local_starts_, kBucketShift, kIndexFrom, kIndexTo);
    }
  }
}

ZoneTimeline ZoneTimeline::Build(const LoadedZone& zone,
                                 const std::optional<std::string>& tz) {
  ZoneTimeline timeline;
  switch (zone.source) {
    case LoadedZone::Source::kFile:
      timeline.BuildFromFile(*zone.tzif);
      break;
    case LoadedZone::Source::kRule:
      if (zone.rule->dst == PosixRule::Dst::kWithoutRules && zone.default_rules) {
        timeline.BuildFromDefaultRules(*zone.rule, *zone.default_rules);
      } else {
        timeline.BuildFromRule(CurrentRule(zone));
      }
      break;
    case LoadedZone::Source::kUtc: {
      // TZ unset, empty or ":" reads as "UTC"; a rule string that does not parse
      // keeps the name it begins with.
      const bool named = tz && !tz->empty() && *tz != ":";
      timeline.AddPeriod(
          INT64_MIN, timeline.AddType(0, false, named ? LeadingZoneName(*tz) : "UTC"));
      break;
    }
  }
  timeline.current_rule_ = CurrentRule(zone);
  timeline.Finish();
  return timeline;
}

}  // namespace datetimelib::platform
