// A time zone compiled for lookups: the periods of constant UTC offset, in order.
//
// Built once from what zone_source.h loads, immutable afterwards, so any number of
// threads may read one. It answers the two questions every local-time operation
// ends in: the local fields of an instant, and the instant of local fields.
//
// The periods hold the zone's transitions and, for a zone ruled by a POSIX rule
// (a rule string in TZ, or a zone file's footer after its last transition), the
// rule's changes up to 2100; beyond that the rule is evaluated for each instant.
// Lookups go through a bucket index over the periods (see below), else a binary
// search.
#ifndef DATETIMELIB_PLATFORM_ZONE_ZONE_TIMELINE_H_
#define DATETIMELIB_PLATFORM_ZONE_ZONE_TIMELINE_H_

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/zone/broken_down_time.h"
#include "platform/zone/posix_rule.h"
#include "platform/zone/zone_source.h"

namespace datetimelib::platform {

class ZoneTimeline {
 public:
  // What a period's clocks read.
  struct LocalType {
    std::int32_t utc_offset;  // seconds east of UTC
    bool is_dst;
    Abbreviation abbreviation;  // cut to 15 bytes, NUL-padded
  };

  // The zone as the C library would read it. `tz` is TZ as it was when `zone` was
  // loaded: an unreadable rule string keeps the name it begins with, as the C
  // library keeps it ("Foo/Bar" is UTC called "Foo").
  static ZoneTimeline Build(const LoadedZone& zone, const std::optional<std::string>& tz);

  BrokenDownTime BreakDown(std::int64_t unix_seconds) const;

  // See ComposeLocal in local_time.h for the choice at gaps and repeats.
  std::int64_t Compose(std::int64_t civil_seconds) const;

  // The rule in force now and for every later instant (see CurrentRule in
  // zone_source.h): what the zone questions answer from.
  const PosixRule& current_rule() const { return current_rule_; }

 private:
  ZoneTimeline() = default;

  const LocalType& TypeAt(std::int64_t unix_seconds) const;
  std::size_t PeriodAt(std::int64_t unix_seconds) const;
  std::int64_t ComposeByPieces(std::int64_t civil_seconds) const;
  struct Piece {
    std::int64_t start;  // first instant
    const LocalType* type;
  };
  void PiecesBetween(std::int64_t from, std::int64_t to, std::vector<Piece>* out) const;
  static std::int64_t ChooseInGap(std::int64_t civil_seconds, const LocalType& before,
                                  const LocalType& after);

  std::uint16_t AddType(std::int32_t utc_offset, bool is_dst, const std::string& name);
  void AddPeriod(std::int64_t start, std::uint16_t type);
  void SetRule(const PosixRule& rule);
  void AddRulePeriods(std::int64_t from, std::int64_t to);
  void BuildFromFile(const Tzif& file);
  void BuildFromRule(const PosixRule& rule);
  void BuildFromDefaultRules(const PosixRule& rule, const Tzif& default_rules);
  void FollowFooterFrom(const std::string& footer, std::int64_t last_transition);
  void Finish();

  // Period i covers the instants [starts_[i], starts_[i + 1]); starts_[0] is the
  // smallest int64, so every instant has a period.
  std::vector<std::int64_t> starts_;
  std::vector<std::uint16_t> period_types_;  // index into types_
  // starts_[i] read in period i's own offset: where its local time begins.
  std::vector<std::int64_t> local_starts_;
  // starts_[i + 1] read in period i's offset: where its local time ends (the
  // largest int64 for the last period).
  std::vector<std::int64_t> local_ends_;
  bool local_starts_ascend_ = true;  // else composition walks the pieces
  // The largest |offset| of any type, with a second to spare: every instant that
  // reads as a local time L lies within this distance of L.
  std::int64_t offset_span_ = 0;

  std::vector<LocalType> types_;

  // Bucket indexes over the instants and local times of 32-bit counts (and a
  // little beyond): bucket b holds the last period that begins at or before the
  // bucket's first second, so a lookup is one read and a short forward scan
  // instead of a binary search. Empty when a zone has too many periods.
  static constexpr int kBucketShift = 21;  // buckets of 2^21 s, about 24 days
  static constexpr std::int64_t kIndexFrom = std::int64_t{INT32_MIN} - 4 * 86400;
  static constexpr std::int64_t kIndexTo = std::int64_t{INT32_MAX} + 4 * 86400;
  std::vector<std::uint16_t> instant_index_;
  std::vector<std::uint16_t> local_index_;
  std::size_t LocalPeriodAt(std::int64_t civil_seconds) const;

  // Instants outside [table_from_, table_to_) are governed by `rule_` and
  // computed from it directly; the periods answer for the rest. Without a rule
  // the periods answer for every instant.
  std::optional<PosixRule> rule_;
  std::uint16_t rule_types_[2] = {0, 0};  // standard, daylight
  std::int64_t table_from_ = INT64_MIN;
  std::int64_t table_to_ = INT64_MAX;

  PosixRule current_rule_;
};

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_ZONE_TIMELINE_H_
