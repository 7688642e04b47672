// Lookups on a compiled zone: breakdown and composition.
#include "platform/zone/zone_timeline.h"

#include <algorithm>

#include "platform/civil/civil.h"
#include "platform/zone/rule_changes.h"

namespace datetimelib::platform {
namespace {

// The last of `starts` at or before `value`, from a bucket index over it when
// `value` lies in the index's range, else by binary search. starts[0] is the
// smallest int64, so there always is one.
std::size_t LastAtOrBefore(const std::vector<std::int64_t>& starts,
                           const std::vector<std::uint16_t>& index, int shift,
                           std::int64_t from, std::int64_t to, std::int64_t value) {
  if (!index.empty() && value >= from && value < to) {
    std::size_t i = index[static_cast<std::size_t>((value - from) >> shift)];
    while (i + 1 < starts.size() && starts[i + 1] <= value) ++i;
    return i;
  }
  const auto after = std::upper_bound(starts.begin(), starts.end(), value);
  return static_cast<std::size_t>(after - starts.begin()) - 1;
}

}  // namespace

std::size_t ZoneTimeline::PeriodAt(std::int64_t unix_seconds) const {
  return LastAtOrBefore(starts_, instant_index_, kBucketShift, kIndexFrom, kIndexTo,
                        unix_seconds);
}

std::size_t ZoneTimeline::LocalPeriodAt(std::int64_t civil_seconds) const {
  return LastAtOrBefore(local_starts_, local_index_, kBucketShift, kIndexFrom, kIndexTo,
                        civil_seconds);
}

const ZoneTimeline::LocalType& ZoneTimeline::TypeAt(std::int64_t unix_seconds) const {
  if (unix_seconds < table_from_ || unix_seconds >= table_to_) {
    return types_[rule_types_[RuleIsDstAt(*rule_, unix_seconds) ? 1 : 0]];
  }
  return types_[period_types_[PeriodAt(unix_seconds)]];
}

BrokenDownTime ZoneTimeline::BreakDown(std::int64_t unix_seconds) const {
  const LocalType& type = TypeAt(unix_seconds);
  return BrokenDownAt(unix_seconds + type.utc_offset, type.utc_offset, type.is_dst,
                      type.abbreviation);
}

std::int64_t ZoneTimeline::Compose(std::int64_t civil_seconds) const {
  // Near or beyond the ends of the periods a rule answers, which only the pieces
  // can tell.
  const bool within_table = civil_seconds > table_from_ + 2 * offset_span_ &&
                            civil_seconds < table_to_ - 2 * offset_span_;
  if (!within_table || !local_starts_ascend_) return ComposeByPieces(civil_seconds);

  // The last period whose local time begins at or before the time sought.
  const std::size_t last = LocalPeriodAt(civil_seconds);
  // The earliest period that holds it: a period holds the local times from its
  // local start up to its local end. One that ended more than the largest offset
  // before the time sought cannot hold it, nor can any before it.
  std::size_t earliest = starts_.size();
  for (std::size_t i = last;; --i) {
    if (local_starts_[i] <= civil_seconds && civil_seconds < local_ends_[i]) earliest = i;
    if (i == 0 || starts_[i] <= civil_seconds - offset_span_) break;
  }
  if (earliest < starts_.size()) {
    return civil_seconds - types_[period_types_[earliest]].utc_offset;
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

// The stretches of constant local time type that meet [from, to), in order, the
// first starting at `from`: periods of the table, and where a rule answers
// instead, the changes of the UTC years the window touches.
void ZoneTimeline::PiecesBetween(std::int64_t from, std::int64_t to,
                                 std::vector<Piece>* out) const {
  std::vector<std::int64_t> points = {from};
  if (from < table_to_ && to > table_from_) {
    for (std::size_t i = PeriodAt(std::max(from, table_from_)) + 1;
         i < starts_.size() && starts_[i] < to; ++i) {
      points.push_back(starts_[i]);
    }
  }
  if (rule_ && (from < table_from_ || to > table_to_)) {
    const std::int64_t first_year = CivilFromDays(FloorDiv(from, kSecondsPerDay)).year;
    const std::int64_t last_year = CivilFromDays(FloorDiv(to, kSecondsPerDay)).year;
    for (std::int64_t year = first_year; year <= last_year; ++year) {
      const RuleChanges changes = ChangesForUtcYear(*rule_, year);
      for (const std::int64_t point :
           {DaysFromCivil(year, 1, 1) * kSecondsPerDay, changes.dst_start,
            changes.dst_end, table_from_, table_to_}) {
        if (point > from && point < to) points.push_back(point);
      }
    }
  }
  std::sort(points.begin(), points.end());
  out->clear();
  for (const std::int64_t point : points) {
    const LocalType* type = &TypeAt(point);
    if (!out->empty() && (out->back().start == point || out->back().type == type))
      continue;
    out->push_back({point, type});
  }
}

// Every reading of a local time lies within the largest offset of it, so the
// pieces of that window hold them all; the earliest is the answer.
std::int64_t ZoneTimeline::ComposeByPieces(std::int64_t civil_seconds) const {
  std::vector<Piece> pieces;
  PiecesBetween(civil_seconds - offset_span_, civil_seconds + offset_span_ + 1, &pieces);
  for (std::size_t k = 0; k < pieces.size(); ++k) {
    const std::int64_t instant = civil_seconds - pieces[k].type->utc_offset;
    const bool after_start = k == 0 || instant >= pieces[k].start;
    const bool before_end = k + 1 == pieces.size() || instant < pieces[k + 1].start;
    if (after_start && before_end) return instant;
  }
  // A gap: the change whose local end lies at or before the time and whose
  // local start after it.
  for (std::size_t k = 0; k + 1 < pieces.size(); ++k) {
    const std::int64_t change = pieces[k + 1].start;
    if (change + pieces[k].type->utc_offset <= civil_seconds &&
        civil_seconds < change + pieces[k + 1].type->utc_offset) {
      return ChooseInGap(civil_seconds, *pieces[k].type, *pieces[k + 1].type);
    }
  }
  return civil_seconds - pieces.back().type->utc_offset;
}

}  // namespace datetimelib::platform
