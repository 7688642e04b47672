#include "platform/locale_writer.h"

#include <time.h>

#include <algorithm>
#include <cstring>
#include <vector>

namespace datetimelib::platform {

std::string WriteInLocale(const BrokenDownTime& fields, const char* pattern,
                          locale_t locale) {
  const std::size_t pattern_length = std::strlen(pattern);
  if (pattern_length == 0 || locale == nullptr) return {};
  const std::tm tm = ToTm(fields);

  // strftime_l returns 0 both when the text does not fit and when it is empty
  // (a lone "%p" in a locale without AM/PM words), so grow up to a bound that
  // no conversion of any locale reaches: every conversion takes two or more
  // pattern bytes and none writes 128 bytes.
  const std::size_t limit = 64 * pattern_length + 256;
  std::size_t size = 2 * pattern_length + 64;
  for (;;) {
    std::vector<char> buffer(size);
    const std::size_t length = strftime_l(buffer.data(), size, pattern, &tm, locale);
    if (length > 0) return std::string(buffer.data(), length);
    if (size >= limit) return {};
    size = std::min(size * 4, limit);
  }
}

}  // namespace datetimelib::platform
