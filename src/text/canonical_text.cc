#include "text/canonical_text.h"

#include "platform/ascii.h"

namespace datetimelib {
namespace {

// The number written by `count` digits at `text`; -1 if any is not a digit.
int Digits(const char* text, int count) {
  int value = 0;
  for (int i = 0; i < count; ++i) {
    if (!platform::IsAsciiDigit(text[i])) return -1;
    value = value * 10 + (text[i] - '0');
  }
  return value;
}

}  // namespace

bool ReadCanonical(std::string_view text, DateTimeFields* out) {
  if (text.size() < kCanonicalLength) return false;
  const char* p = text.data();
  if (p[4] != '-' || p[7] != '-' || p[10] != ' ' || p[13] != ':' || p[16] != ':') {
    return false;
  }
  for (std::size_t i = kCanonicalLength; i < text.size(); ++i) {
    if (text[i] != ' ' && text[i] != '\t') return false;
  }
  DateTimeFields fields;
  fields.year = Digits(p, 4);
  fields.month = Digits(p + 5, 2);
  fields.day = Digits(p + 8, 2);
  fields.hour = Digits(p + 11, 2);
  fields.minute = Digits(p + 14, 2);
  fields.second = Digits(p + 17, 2);
  if (!IsPossibleDateTime(fields)) return false;  // a -1 fails here too
  *out = fields;
  return true;
}

}  // namespace datetimelib
