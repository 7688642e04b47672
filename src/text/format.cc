// Writing a value as text with a strftime pattern, in local time or in UTC.
#include "AdDateTime.h"
#include "platform/local_time.h"
#include "text/strftime_text.h"

std::string AdDateTime::Format(const char* pattern) const {
  if (status_ != valid) return status_ == outOfRange ? kept_text_ : std::string();
  if (pattern == nullptr) return {};
  return datetimelib::StrftimeText(datetimelib::platform::BreakDownLocal(seconds_),
                                   pattern);
}

std::string AdDateTime::FormatGMT(const char* pattern) const {
  if (status_ != valid) return status_ == outOfRange ? kept_text_ : std::string();
  if (pattern == nullptr) return {};
  return datetimelib::StrftimeText(datetimelib::platform::BreakDownUtc(seconds_),
                                   pattern);
}
