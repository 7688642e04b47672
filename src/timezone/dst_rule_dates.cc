// Daylight-saving dates computed from the zone's current rule.
#include "timezone/dst_rule_dates.h"

#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "platform/zone/current_zone.h"
#include "platform/zone/local_time.h"
#include "text/canonical_text.h"
#include "text/strftime_text.h"

namespace datetimelib {
namespace {

// The text of a transition's local date-time moved by `shift_seconds`.
//
// The text is written from the rule's own local fields, not from a value
// composed from them: the end of a rule with negative daylight saving (Dublin's
// 01:00 GMT in March) is a local time that the clocks skip, and composing it
// would move it to 02:00. Fields outside the range give the text that an
// outOfRange value keeps for them.
// Written into `out` in place, so that a caller's strings keep their buffers.
void WriteTransitionText(const platform::TransitionRule& transition, int year,
                         std::int32_t shift_seconds, std::string* out) {
  // |civil| < 2^47 for every int year: 2^31 years of 2^25 seconds.
  const std::int64_t civil =
      platform::TransitionInYear(transition, year).CivilSeconds() + shift_seconds;
  const platform::BrokenDownTime fields = platform::BreakDownUtc(civil);
  const AdDateTime value(fields.year, fields.month, fields.day, fields.hour,
                         fields.minute, fields.second);
  if (!value.IsValid()) {
    value.FormatInto(*out, kCanonicalPattern);
    return;
  }
  WritePattern(fields, kCanonicalPattern, out);
}

}  // namespace

void WriteRuleDates(const platform::PosixRule& rule, int year, std::string* start,
                    std::string* end) {
  if (rule.dst != platform::PosixRule::Dst::kWithRules) {
    start->clear();
    end->clear();
    return;
  }
  WriteTransitionText(rule.start, year, -1, start);
  WriteTransitionText(rule.end, year, 0, end);
}

}  // namespace datetimelib

int AdDateTime::GenerateDSTDates(int year, std::string& start, std::string& end) {
  // A copy: writing the dates builds values, which may compile the zone anew.
  const datetimelib::platform::PosixRule rule =
      datetimelib::platform::CurrentZone().current_rule();
  datetimelib::WriteRuleDates(rule, year, &start, &end);
  return 1;
}
