// Rules written out compactly, so that tables can say what a rule should be.
#ifndef DATETIMELIB_TESTS_SUPPORT_RULE_TEXT_H_
#define DATETIMELIB_TESTS_SUPPORT_RULE_TEXT_H_

#include <string>

#include "platform/zone/posix_rule.h"

namespace datetimelib::testing {

// "M3.2.0@7200", "J60@0", "59@-3600": the date form and the time in seconds.
inline std::string RuleText(const platform::TransitionRule& rule) {
  using Form = platform::TransitionRule::Form;
  const std::string day = std::to_string(rule.day);
  return (rule.form == Form::kMonthWeekDay
              ? "M" + std::to_string(rule.month) + "." + std::to_string(rule.week) + "." +
                    std::to_string(rule.weekday)
          : rule.form == Form::kJulian ? "J" + day
                                       : day) +
         "@" + std::to_string(rule.time_seconds);
}

// "EST -18000", "EST -18000 EDT -14400 no-rules",
// "EST -18000 EDT -14400 M3.2.0@7200 M11.1.0@7200": offsets in seconds east.
inline std::string RuleText(const platform::PosixRule& rule) {
  using Dst = platform::PosixRule::Dst;
  std::string text = rule.std_abbreviation + " " + std::to_string(rule.std_seconds_east);
  if (rule.dst == Dst::kNone) return text;
  text += " " + rule.dst_abbreviation + " " + std::to_string(rule.dst_seconds_east);
  if (rule.dst == Dst::kWithoutRules) return text + " no-rules";
  return text + " " + RuleText(rule.start) + " " + RuleText(rule.end);
}

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_RULE_TEXT_H_
