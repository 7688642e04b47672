// Writing broken-down fields with a strftime pattern into a std::string.
#ifndef DATETIMELIB_TEXT_STRFTIME_TEXT_H_
#define DATETIMELIB_TEXT_STRFTIME_TEXT_H_

#include <string>

#include "platform/local_time.h"

namespace datetimelib {

// `fields` written with a strftime pattern in the calling thread's locale,
// replacing `out`. The canonical pattern "%Y-%m-%d %H:%M:%S" is written digit by
// digit, to the same text, without strftime.
void WritePattern(const platform::BrokenDownTime& fields, const char* pattern,
                  std::string* out);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_STRFTIME_TEXT_H_
