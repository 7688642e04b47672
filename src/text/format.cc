// Writing a value as text with a strftime pattern, in local time or in UTC.
#include "AdDateTime.h"
#include "platform/zone/local_time.h"
#include "text/strftime_text.h"

namespace {

// `fields` written with `pattern` into a new string. The canonical text is built
// straight into it: constructing a string from the 19 bytes costs less than
// assigning them to an empty one.
std::string FieldsText(const datetimelib::platform::BrokenDownTime& fields,
                       const char* pattern) {
  char canonical[datetimelib::kCanonicalLength];
  if (datetimelib::WriteCanonicalText(fields, pattern, canonical)) {
    return std::string(canonical, sizeof canonical);
  }
  std::string text;
  datetimelib::WritePattern(fields, pattern, &text);
  return text;
}

}  // namespace

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

std::string AdDateTime::Format(const char* pattern) const {
  std::string text;
  if (status_ != valid || pattern == nullptr) {
    WriteNotValid(text);
    return text;
  }
  return FieldsText(datetimelib::platform::BreakDownLocal(seconds_), pattern);
}

std::string AdDateTime::FormatGMT(const char* pattern) const {
  std::string text;
  if (status_ != valid || pattern == nullptr) {
    WriteNotValid(text);
    return text;
  }
  return FieldsText(datetimelib::platform::BreakDownUtc(seconds_), pattern);
}
