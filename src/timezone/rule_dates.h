// The daylight-saving start and end texts that a zone's rule gives for a year.
#ifndef DATETIMELIB_TIMEZONE_RULE_DATES_H_
#define DATETIMELIB_TIMEZONE_RULE_DATES_H_

#include <string>

#include "platform/posix_rule.h"

namespace datetimelib {

// Replaces `start` and `end` with the texts described at GenerateDSTDates, or
// empties both when `rule` has no daylight saving. `rule` is a current rule
// (see zone_source.h): never one with a daylight name but no transitions.
void WriteRuleDates(const platform::PosixRule& rule, int year, std::string* start,
                    std::string* end);

}  // namespace datetimelib

#endif  // DATETIMELIB_TIMEZONE_RULE_DATES_H_
