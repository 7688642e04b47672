// Writing a value in the compact form "05-Jan-2003.14:07:09", local time.
#include <string>

#include "AdDateTime.h"
#include "platform/local_time.h"
#include "text/english_names.h"

namespace {

// `value` in decimal with at least `min_digits` digits, zero-padded, as printf's
// "%0*d" writes it; a negative number gets its sign before the digits.
void AppendDecimal(std::string* out, int value, int min_digits) {
  char digits[12];  // 10 digits of a 32-bit magnitude, and room to spare
  int length = 0;
  // The magnitude in 64 bits: negating INT_MIN in int would overflow.
  std::int64_t magnitude = value < 0 ? -std::int64_t{value} : std::int64_t{value};
  do {
    digits[length++] = static_cast<char>('0' + magnitude % 10);
    magnitude /= 10;
  } while (magnitude > 0);
  while (length < min_digits && length < static_cast<int>(sizeof digits)) {
    digits[length++] = '0';
  }
  if (value < 0) out->push_back('-');
  while (length > 0) out->push_back(digits[--length]);
}

}  // namespace

std::string AdDateTime::FormatTolvane() const {
  // One breakdown, so that all six fields describe the same instant. The status
  // is not consulted: every value writes the count it holds.
  const auto local = datetimelib::platform::BreakDownLocal(seconds_);
  std::string text;
  text.reserve(20);  // "DD-Mon-YYYY.HH:MM:SS"
  AppendDecimal(&text, local.day, 2);
  text.push_back('-');
  text.append(datetimelib::MonthAbbreviation(local.month));
  text.push_back('-');
  AppendDecimal(&text, local.year, 1);
  text.push_back('.');
  AppendDecimal(&text, local.hour, 2);
  text.push_back(':');
  AppendDecimal(&text, local.minute, 2);
  text.push_back(':');
  AppendDecimal(&text, local.second, 2);
  return text;
}
