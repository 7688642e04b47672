// strftime into a std::string, with a bounded buffer.
#ifndef DATETIMELIB_TEXT_STRFTIME_TEXT_H_
#define DATETIMELIB_TEXT_STRFTIME_TEXT_H_

#include <string>

#include "platform/local_time.h"

namespace datetimelib {

// `fields` written with a strftime pattern in the calling thread's locale.
std::string StrftimeText(const platform::BrokenDownTime& fields, const char* pattern);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_STRFTIME_TEXT_H_
