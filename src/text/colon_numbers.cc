#include "text/colon_numbers.h"

#include <charconv>
#include <system_error>

namespace datetimelib {
namespace {

enum class NumberRead { kNumber, kNone, kTooLong };

// The bytes that scanf skips before a number, as the "C" locale classifies them.
bool IsScanBlank(char c) {
  return c == ' ' || c == '\t' || c == '\n' || c == '\v' || c == '\f' || c == '\r';
}

// number := blank* [+-] digit+
// Reads at `*pos`; on success moves `*pos` past the last digit.
NumberRead ReadNumber(std::string_view text, std::size_t* pos, std::int32_t* value) {
  std::size_t i = *pos;
  while (i < text.size() && IsScanBlank(text[i])) ++i;
  bool negative = false;
  if (i < text.size() && (text[i] == '+' || text[i] == '-')) {
    negative = text[i] == '-';
    ++i;
  }
  if (i >= text.size()) return NumberRead::kNone;

  // from_chars takes no sign and no blanks, and reports a magnitude beyond 32
  // bits instead of storing it; the whole run of digits is consumed either way.
  std::uint32_t magnitude = 0;
  const char* first = text.data() + i;
  const auto [end, error] = std::from_chars(first, text.data() + text.size(), magnitude);
  if (end == first) return NumberRead::kNone;
  const std::uint32_t limit = negative ? 2147483648u : 2147483647u;
  if (error == std::errc::result_out_of_range || magnitude > limit) {
    return NumberRead::kTooLong;
  }
  const std::int64_t signed_value =
      negative ? -std::int64_t{magnitude} : std::int64_t{magnitude};
  *value = static_cast<std::int32_t>(signed_value);  // within [-2^31, 2^31) here
  *pos = static_cast<std::size_t>(end - text.data());
  return NumberRead::kNumber;
}

}  // namespace

ColonNumbers ReadColonNumbers(std::string_view text, int max_count) {
  ColonNumbers numbers;
  if (max_count > kMaxColonNumbers) max_count = kMaxColonNumbers;
  std::size_t pos = 0;
  while (numbers.count < max_count) {
    if (numbers.count > 0) {
      if (pos >= text.size() || text[pos] != ':') break;
      ++pos;
    }
    const NumberRead read = ReadNumber(text, &pos, &numbers.values[numbers.count]);
    if (read == NumberRead::kTooLong) {
      numbers.too_long = true;
      break;
    }
    if (read == NumberRead::kNone) break;
    ++numbers.count;
  }
  return numbers;
}

}  // namespace datetimelib
