// Lookups on a compiled zone: breakdown and composition.
#include "platform/zone_timeline.h"

#include <algorithm>

#include "platform/civil.h"
#include "platform/rule_changes.h"

namespace datetimelib::platform {
namespace {

constexpr std::int64_t kSecondsPerDay = 86400;

// Periods before the one found that may still hold a local time: a local time
// lies in at most two periods unless a zone changed its clocks several times
// within a day, which no zone has done more than twice.
constexpr std::size_t kPeriodsToLookBack = 4;

}  // namespace

std::size_t ZoneTimeline::PeriodAt(std::int64_t unix_seconds) const {
  const auto after = std::upper_bound(starts_.begin(), starts_.end(), unix_seconds);
  return static_cast<std::size_t>(after - starts_.begin()) -
         1;  // starts_[0] is the minimum
}

const ZoneTimeline::LocalType& ZoneTimeline::TypeAt(std::int64_t unix_seconds) const {
  if (unix_seconds < table_from_ || unix_seconds >= table_to_) {
    return types_[rule_types_[RuleIsDstAt(*rule_, unix_seconds) ? 1 : 0]];
  }
  return types_[period_types_[PeriodAt(unix_seconds)]];
}

BrokenDownTime ZoneTimeline::BreakDown(std::int64_t unix_seconds) const {
  const LocalType& type = TypeAt(unix_seconds);
  const std::int64_t civil = unix_seconds + type.utc_offset;
  const std::int64_t days = FloorDiv(civil, kSecondsPerDay);
  const int second_of_day = static_cast<int>(civil - days * kSecondsPerDay);
  CivilDayOfYear civil_day;
  if (days > -kFastCivilLimit && days < kFastCivilLimit) {
    civil_day = FastCivilFromDays(days);
  } else {
    civil_day.date = CivilFromDays(days);
    civil_day.yearday =
        YearDay(civil_day.date.year, civil_day.date.month, civil_day.date.day);
  }
  BrokenDownTime out;
  out.year = static_cast<int>(civil_day.date.year);
  out.month = civil_day.date.month;
  out.day = civil_day.date.day;
  out.hour = second_of_day / 3600;
  out.minute = second_of_day / 60 % 60;
  out.second = second_of_day % 60;
  out.weekday = WeekdayFromDays(days);
  out.yearday = civil_day.yearday;
  out.utc_offset = type.utc_offset;
  out.is_dst = type.is_dst;
  static_assert(sizeof out.abbreviation == sizeof type.abbreviation);
  std::copy(std::begin(type.abbreviation), std::end(type.abbreviation), out.abbreviation);
  return out;
}

std::int64_t ZoneTimeline::Compose(std::int64_t civil_seconds) const {
  // Near or beyond the ends of the periods a rule answers, which only probing
  // can ask; a day's margin covers every offset.
  const bool within_table = civil_seconds > table_from_ + 2 * kSecondsPerDay &&
                            civil_seconds < table_to_ - 2 * kSecondsPerDay;
  if (!within_table || !local_starts_ascend_) return ComposeByProbing(civil_seconds);

  // The last period whose local time begins at or before the time sought.
  const auto after =
      std::upper_bound(local_starts_.begin(), local_starts_.end(), civil_seconds);
  const std::size_t last = static_cast<std::size_t>(after - local_starts_.begin()) - 1;

  // The earliest period that holds it: a period holds the local times from its
  // local start up to its end read in its own offset.
  const std::size_t first = last >= kPeriodsToLookBack ? last - kPeriodsToLookBack : 0;
  for (std::size_t i = first; i <= last; ++i) {
    const std::int32_t offset = types_[period_types_[i]].utc_offset;
    const bool ends_after =
        i + 1 == starts_.size() || civil_seconds < starts_[i + 1] + offset;
    if (local_starts_[i] <= civil_seconds && ends_after) return civil_seconds - offset;
  }
  // Skipped by the change that starts the next period.
  const std::size_t next = std::min(last + 1, starts_.size() - 1);
  return ChooseInGap(civil_seconds, types_[period_types_[last]],
                     types_[period_types_[next]]);
}

// Two instants are a gap's length apart from a skipped local time: the one read
// with the offset before the change lands after it, the other before it. Like
// mktime, prefer the one that lands in daylight time: forward by the size of the
// change where daylight time is summer time (02:30 becomes 03:30 daylight time),
// back where a zone writes its winter as daylight time (Europe/Dublin). When both
// sides are alike, forward.
std::int64_t ZoneTimeline::ChooseInGap(std::int64_t civil_seconds,
                                       const LocalType& before, const LocalType& after) {
  const std::int64_t forward = civil_seconds - before.utc_offset;  // lands in `after`
  const std::int64_t back = civil_seconds - after.utc_offset;      // lands in `before`
  return before.is_dst && !after.is_dst ? back : forward;
}

std::int64_t ZoneTimeline::ComposeByProbing(std::int64_t civil_seconds) const {
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
  // In a gap: the instant read with the largest offset lies before the change.
  const std::int64_t largest = *std::max_element(offsets, offsets + count);
  const LocalType& before = TypeAt(civil_seconds - largest);
  const std::int64_t forward = civil_seconds - before.utc_offset;
  return ChooseInGap(civil_seconds, before, TypeAt(forward));
}

}  // namespace datetimelib::platform
