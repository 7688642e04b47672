// Writing a value as text with a strftime pattern, in local time or in UTC.
#include "AdDateTime.h"
#include "platform/local_time.h"
#include "text/strftime_text.h"

void AdDateTime::FormatInto(std::string& out, const char* pattern) const {
  if (status_ != valid || pattern == nullptr) {
    out.assign(status_ == outOfRange ? kept_text_ : std::string());
    return;
  }
  datetimelib::WritePattern(datetimelib::platform::BreakDownLocal(seconds_), pattern,
                            &out);
}

void AdDateTime::FormatGMTInto(std::string& out, const char* pattern) const {
  if (status_ != valid || pattern == nullptr) {
    out.assign(status_ == outOfRange ? kept_text_ : std::string());
    return;
  }
  datetimelib::WritePattern(datetimelib::platform::BreakDownUtc(seconds_), pattern, &out);
}

std::string AdDateTime::Format(const char* pattern) const {
  std::string text;
  FormatInto(text, pattern);
  return text;
}

std::string AdDateTime::FormatGMT(const char* pattern) const {
  std::string text;
  FormatGMTInto(text, pattern);
  return text;
}
