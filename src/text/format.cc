// Writing a value as text with a strftime pattern, in local time or in UTC.
#include "AdDateTime.h"
#include "platform/zone/local_time.h"
#include "text/strftime_text.h"

// What the formatters give for a value that is not valid (and for a valid one
// with a null pattern): the kept text of an outOfRange value, else nothing.
// Copied and cleared in place, so that `out` keeps its capacity.
void AdDateTime::WriteNotValid(std::string& out) const {
  if (status_ == outOfRange) {
    out.assign(kept_text_);
  } else {
    out.clear();
  }
}

void AdDateTime::FormatInto(std::string& out, const char* pattern) const {
  if (status_ != valid || pattern == nullptr) {
    WriteNotValid(out);
    return;
  }
  datetimelib::WritePattern(datetimelib::platform::BreakDownLocal(seconds_), pattern,
                            &out);
}

void AdDateTime::FormatGMTInto(std::string& out, const char* pattern) const {
  if (status_ != valid || pattern == nullptr) {
    WriteNotValid(out);
    return;
  }
  datetimelib::WritePattern(datetimelib::platform::BreakDownUtc(seconds_), pattern, &out);
}

// The canonical text is built straight into the string returned: constructing
// it from the 19 bytes costs less than assigning them to an empty one.
std::string AdDateTime::Format(const char* pattern) const {
  if (status_ == valid && pattern != nullptr) {
    const auto fields = datetimelib::platform::BreakDownLocal(seconds_);
    char canonical[datetimelib::kCanonicalLength];
    if (datetimelib::WriteCanonicalText(fields, pattern, canonical)) {
      return std::string(canonical, sizeof canonical);
    }
  }
  std::string text;
  FormatInto(text, pattern);
  return text;
}

std::string AdDateTime::FormatGMT(const char* pattern) const {
  if (status_ == valid && pattern != nullptr) {
    const auto fields = datetimelib::platform::BreakDownUtc(seconds_);
    char canonical[datetimelib::kCanonicalLength];
    if (datetimelib::WriteCanonicalText(fields, pattern, canonical)) {
      return std::string(canonical, sizeof canonical);
    }
  }
  std::string text;
  FormatGMTInto(text, pattern);
  return text;
}
