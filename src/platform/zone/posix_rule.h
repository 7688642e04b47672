// POSIX TZ rule strings ("EST5EDT,M3.2.0,M11.1.0", "<+0530>-5:30"): a pure
// parser and the arithmetic from a transition rule and a year to a local date.
//
// No I/O and no process state: the same string gives the same rule anywhere.
// Where the rule string comes from (TZ itself, or the footer of a zone file) is
// decided in zone_source.h.
//
// Sign convention. POSIX writes offsets positive *west* of Greenwich ("EST5" is
// five hours behind UTC). Every offset stored here is seconds *east* of UTC, the
// way tm_gmtoff counts; the parser flips the sign once, where it reads an offset,
// and fields carry "east" in their names so that the flip is never repeated.
#ifndef DATETIMELIB_PLATFORM_ZONE_POSIX_RULE_H_
#define DATETIMELIB_PLATFORM_ZONE_POSIX_RULE_H_

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "platform/civil/civil.h"

namespace datetimelib::platform {

// The day of the year and the time of day of one change between standard and
// daylight time.
struct TransitionRule {
  enum class Form {
    kMonthWeekDay,  // "Mm.w.d": the w-th weekday d of month m
    kJulian,        // "Jn": day n of [1:365]; 29 February is never counted
    kZeroBased,     // "n": day n of [0:365] counted from 1 January; 29 February counts
  };
  Form form = Form::kMonthWeekDay;
  int month = 1;    // [1:12], kMonthWeekDay
  int week = 1;     // [1:5], 5 == last; kMonthWeekDay
  int weekday = 0;  // [0:6], 0 == Sunday; kMonthWeekDay
  int day = 1;      // [1:365] for kJulian, [0:365] for kZeroBased
  // Local time of day of the change, in the time in force before it. It may lie
  // before 00:00 or beyond 24:00 of the rule's day ("M3.4.4/26" is Friday 02:00).
  std::int32_t time_seconds = 2 * 3600;  // [-167 h, +167 h]
};

inline constexpr std::int32_t kMaxTransitionTimeSeconds = 167 * 3600;

struct PosixRule {
  enum class Dst {
    kNone,          // standard time all year ("<+0530>-5:30")
    kWithoutRules,  // a daylight name but no transition rules ("EST5EDT"); the
                    // reader of the rule decides when daylight time applies
    kWithRules,     // complete ("EST5EDT,M3.2.0,M11.1.0")
  };

  std::string std_abbreviation;
  std::int32_t std_seconds_east = 0;  // [-24 h, +24 h]
  Dst dst = Dst::kNone;
  std::string dst_abbreviation;       // empty with kNone
  std::int32_t dst_seconds_east = 0;  // [-24 h, +24 h]; std + 1 h when not written
  TransitionRule start;  // standard to daylight time; meaningful with kWithRules
  TransitionRule end;    // daylight to standard time; meaningful with kWithRules
};

// Reads a whole rule string; nothing when it is malformed or any number is out of
// its range. A rule that ends just after its daylight part with a lone ","
// ("EST5EDT,") is read as having no transition rules, as the C library reads it.
std::optional<PosixRule> ParsePosixRule(std::string_view text);

// A transition placed in a year: the local date of the rule's day and the rule's
// time of day on it, not carried into the neighbouring day.
struct LocalTransition {
  CivilDay date;              // the rule's day; day 365 of "n" in a common year
                              // is 1 January of the next year
  std::int32_t time_seconds;  // as in the rule, [-167 h, +167 h]

  // The local date and time as civil seconds (see civil.h), carries included.
  std::int64_t CivilSeconds() const;
};

// Where `rule` falls in `year` (|year| < 2^31). Week 1 to 4 is that occurrence
// of the weekday in the month, week 5 the last one.
LocalTransition TransitionInYear(const TransitionRule& rule, std::int64_t year);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_POSIX_RULE_H_
