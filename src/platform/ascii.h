// ASCII character classes. Those of <cctype> follow the current locale, while
// zone names, rule strings and the digits of a date are ASCII in every locale.
#ifndef DATETIMELIB_PLATFORM_ASCII_H_
#define DATETIMELIB_PLATFORM_ASCII_H_

namespace datetimelib::platform {

constexpr bool IsAsciiDigit(char c) { return c >= '0' && c <= '9'; }

constexpr bool IsAsciiLetter(char c) {
  return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ASCII_H_
