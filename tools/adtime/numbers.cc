#include "numbers.h"

#include <AdDateTime.h>

#include <charconv>
#include <limits>

#include "command_line.h"
#include "escape.h"

namespace adtime {

long ParseNumber(const std::string& text, long min, long max, const char* what) {
  const char* first = text.data();
  const char* last = text.data() + text.size();
  if (first != last && *first == '+') ++first;  // from_chars takes "-" only
  long value = 0;
  const auto [end, error] = std::from_chars(first, last, value);
  const bool whole =
      end == last && first != last && *first != '+' && !(text[0] == '+' && *first == '-');
  if (!whole || (error != std::errc() && error != std::errc::result_out_of_range)) {
    throw UsageError(std::string(what) + " must be a whole number, not \"" +
                     Escaped(text) + "\"");
  }
  if (error == std::errc::result_out_of_range || value < min || value > max) {
    throw UsageError(std::string(what) + " " + Escaped(text) + " is outside " +
                     std::to_string(min) + ".." + std::to_string(max));
  }
  return value;
}

std::int32_t ParseSecondsOrNow(const std::string& text) {
  if (text == "now") return AdDateTime::GetTickCount().GetCTime().GetTime();
  return static_cast<std::int32_t>(
      ParseNumber(text, std::numeric_limits<std::int32_t>::min(),
                  std::numeric_limits<std::int32_t>::max(), "SECONDS"));
}

}  // namespace adtime
