// Decimal digits written straight into a buffer, for the formatters' fast paths.
#ifndef DATETIMELIB_TEXT_DIGITS_H_
#define DATETIMELIB_TEXT_DIGITS_H_

#include <cstdint>

namespace datetimelib {

// `value` [0:99] as exactly two digits; returns the end.
inline char* WriteTwoDigits(char* out, int value) {
  out[0] = static_cast<char>('0' + value / 10);
  out[1] = static_cast<char>('0' + value % 10);
  return out + 2;
}

// `value` [0:9999] as exactly four digits; returns the end.
inline char* WriteFourDigits(char* out, int value) {
  return WriteTwoDigits(WriteTwoDigits(out, value / 100), value % 100);
}

// `value` as printf's "%d" writes it; returns the end. At most 11 bytes.
inline char* WriteDecimal(char* out, int value) {
  char reversed[10];
  int length = 0;
  // The magnitude in 64 bits: negating INT_MIN in int would overflow.
  std::int64_t magnitude = value < 0 ? -std::int64_t{value} : std::int64_t{value};
  do {
    reversed[length++] = static_cast<char>('0' + magnitude % 10);
    magnitude /= 10;
  } while (magnitude > 0);
  if (value < 0) *out++ = '-';
  while (length > 0) *out++ = reversed[--length];
  return out;
}

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_DIGITS_H_
