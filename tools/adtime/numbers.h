// Reading the numbers on the command line.
#ifndef DATETIMELIB_TOOLS_ADTIME_NUMBERS_H_
#define DATETIMELIB_TOOLS_ADTIME_NUMBERS_H_

#include <cstdint>
#include <string>

namespace adtime {

// number = ["-" | "+"] digit {digit}, the whole argument, within [min, max].
// Throws UsageError naming `what` otherwise.
long ParseNumber(const std::string& text, long min, long max, const char* what);

// seconds = "now" | number within the signed 32-bit range.
// "now" is the current time.
std::int32_t ParseSecondsOrNow(const std::string& text);

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_NUMBERS_H_
