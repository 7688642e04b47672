// Properties of the process's zone that hold whatever TZ names, shared by the
// targets that fuzz TZ strings and zone files.
#ifndef DATETIMELIB_FUZZ_ZONE_CHECKS_H_
#define DATETIMELIB_FUZZ_ZONE_CHECKS_H_

#include <cstdint>
#include <string_view>

namespace datetimelib::fuzz {

// The zone questions answer within their contracts: GetGMTOffset is whole
// minutes; UsesDST is 0 or 1; GenerateDSTDates returns 1 with both texts empty
// exactly without daylight saving, each text else a canonical local time or an
// out-of-range value's kept text; GetDSTDates without a table agrees. Values
// broken down from counts across the range (shifted by `phase`) compose back to
// their first instant with the same fields.
void CheckZoneQuestions(std::uint32_t phase, std::string_view label);

// The breakdown of the same counts equals localtime_r's: fields, weekday, day of
// the year, offset, daylight flag and abbreviation.
void CheckBreakdownAgainstCLibrary(std::uint32_t phase, std::string_view label);

}  // namespace datetimelib::fuzz

#endif  // DATETIMELIB_FUZZ_ZONE_CHECKS_H_
