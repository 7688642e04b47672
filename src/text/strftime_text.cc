#include "text/strftime_text.h"

#include <algorithm>
#include <cstring>
#include <ctime>

#include "text/canonical_text.h"
#include "text/digits.h"

namespace datetimelib {
namespace {

constexpr std::size_t kCanonicalLength = 19;  // "YYYY-MM-DD HH:MM:SS"

void WriteStrftime(const platform::BrokenDownTime& fields, const char* pattern,
                   std::string* out) {
  out->clear();
  const std::size_t pattern_length = std::strlen(pattern);
  if (pattern_length == 0) return;
  const std::tm tm = platform::ToTm(fields);

  // strftime returns 0 both when the text does not fit and when it is empty (a
  // lone "%p" in a locale without AM/PM words), so grow up to a bound that no
  // conversion of any locale reaches: every conversion takes two or more pattern
  // bytes and none writes 128 bytes.
  const std::size_t limit = 64 * pattern_length + 256;
  std::size_t size = 2 * pattern_length + 64;
  for (;;) {
    out->resize(size);
    const std::size_t length = std::strftime(out->data(), size, pattern, &tm);
    if (length > 0) {
      out->resize(length);
      return;
    }
    if (size >= limit) {
      out->clear();
      return;
    }
    size = std::min(size * 4, limit);
  }
}

}  // namespace

void WritePattern(const platform::BrokenDownTime& fields, const char* pattern,
                  std::string* out) {
  // %Y writes four digits only for the years 1000 to 9999; every count of 32 bits
  // lies within them.
  if (std::strcmp(pattern, kCanonicalPattern) != 0 || fields.year < 1000 ||
      fields.year > 9999) {
    WriteStrftime(fields, pattern, out);
    return;
  }
  out->resize(kCanonicalLength);
  char* p = out->data();
  p = WriteFourDigits(p, fields.year);
  *p++ = '-';
  p = WriteTwoDigits(p, fields.month);
  *p++ = '-';
  p = WriteTwoDigits(p, fields.day);
  *p++ = ' ';
  p = WriteTwoDigits(p, fields.hour);
  *p++ = ':';
  p = WriteTwoDigits(p, fields.minute);
  *p++ = ':';
  WriteTwoDigits(p, fields.second);
}

}  // namespace datetimelib
