#include "platform/zone/rule_changes.h"

#include "platform/civil/civil.h"

namespace datetimelib::platform {
namespace {

// The change of one transition rule, its time of day read in the time in force
// before it (`offset_before_east`).
std::int64_t ChangeInstant(const TransitionRule& transition, std::int64_t year,
                           std::int32_t offset_before_east) {
  const LocalTransition local = TransitionInYear(transition, year);
  const std::int64_t new_year = DaysFromCivil(year, 1, 1);
  const std::int64_t days_into_year =
      DaysFromCivil(local.date.year, local.date.month, local.date.day) - new_year;
  // The C library counts the day from 1970-01-01 for every year up to 1970.
  const std::int64_t base_days = year > 1970 ? new_year : 0;
  return (base_days + days_into_year) * kSecondsPerDay + local.time_seconds -
         offset_before_east;
}

}  // namespace

RuleChanges ChangesForUtcYear(const PosixRule& rule, std::int64_t utc_year) {
  return RuleChanges{ChangeInstant(rule.start, utc_year, rule.std_seconds_east),
                     ChangeInstant(rule.end, utc_year, rule.dst_seconds_east)};
}

bool RuleIsDstAt(const PosixRule& rule, std::int64_t unix_seconds) {
  if (rule.dst != PosixRule::Dst::kWithRules) return false;
  const std::int64_t utc_year =
      CivilFromDays(FloorDiv(unix_seconds, kSecondsPerDay)).year;
  const RuleChanges changes = ChangesForUtcYear(rule, utc_year);
  if (changes.dst_start > changes.dst_end) {
    return unix_seconds < changes.dst_end || unix_seconds >= changes.dst_start;
  }
  return unix_seconds >= changes.dst_start && unix_seconds < changes.dst_end;
}

}  // namespace datetimelib::platform
