// Folder src/timezone/: the zone questions of the API (the standard GMT offset,
// daylight-saving use, the daylight-saving dates of a year from the zone's rule or
// from a table file). They ask the zone engine, src/platform/zone/, and read and
// write dates through src/text/.
//
// The daylight-saving start and end texts that a zone's rule gives for a year.
#ifndef DATETIMELIB_TIMEZONE_DST_RULE_DATES_H_
#define DATETIMELIB_TIMEZONE_DST_RULE_DATES_H_

#include <string>

#include "platform/zone/posix_rule.h"

namespace datetimelib {

// Replaces `start` and `end` with the texts described at GenerateDSTDates, or
// empties both when `rule` has no daylight saving. `rule` is a current rule
// (see CurrentRule in platform/zone/zone_source.h): never one with a daylight name but no
// transitions.
void WriteRuleDates(const platform::PosixRule& rule, int year, std::string* start,
                    std::string* end);

}  // namespace datetimelib

#endif  // DATETIMELIB_TIMEZONE_DST_RULE_DATES_H_
