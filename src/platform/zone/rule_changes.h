// The instants at which a POSIX rule changes the clocks, placed as the C library
// places them, and the local time type a rule gives an instant.
//
// The C library decides daylight time for an instant from the two changes of the
// instant's *UTC* year alone: daylight time when start <= t < end, or, when the
// start falls after the end (southern zones), when t < end or t >= start. For
// years up to 1970 it counts the rule's day from 1970-01-01 instead of from the
// year's own 1 January. Both are reproduced here, so that breakdowns agree with
// localtime_r at every instant.
#ifndef DATETIMELIB_PLATFORM_ZONE_RULE_CHANGES_H_
#define DATETIMELIB_PLATFORM_ZONE_RULE_CHANGES_H_

#include <cstdint>

#include "platform/zone/posix_rule.h"

namespace datetimelib::platform {

struct RuleChanges {
  std::int64_t dst_start;  // unix seconds of the change to daylight time
  std::int64_t dst_end;    // unix seconds of the change back to standard time
};

// The changes that govern the instants of UTC year `utc_year` (|year| < 2^31).
// The rule must have transition rules (Dst::kWithRules).
RuleChanges ChangesForUtcYear(const PosixRule& rule, std::int64_t utc_year);

// Whether daylight time is in force at `unix_seconds` under `rule`. Always false
// for a rule without daylight time; a rule must not be Dst::kWithoutRules.
bool RuleIsDstAt(const PosixRule& rule, std::int64_t unix_seconds);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_RULE_CHANGES_H_
