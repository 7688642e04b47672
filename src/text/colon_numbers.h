// Reading decimal numbers the way scanf's "%d", "%d:%d" and "%d:%d:%d" read
// them, without scanf's undefined behaviour on numbers that do not fit.
//
// Each number may follow white space and carry a sign; reading stops at the first
// byte that does not fit the pattern, and whatever follows is ignored. A ":"
// must follow a number directly ("10 :30" reads one number, "10: 30" two).
// Unlike scanf, a number too long for 32 bits is reported, never stored.
#ifndef DATETIMELIB_TEXT_COLON_NUMBERS_H_
#define DATETIMELIB_TEXT_COLON_NUMBERS_H_

#include <cstdint>
#include <string_view>

namespace datetimelib {

inline constexpr int kMaxColonNumbers = 3;

struct ColonNumbers {
  int count = 0;          // numbers read, [0:kMaxColonNumbers]
  bool too_long = false;  // a number beyond the signed 32-bit range was met
  std::int32_t values[kMaxColonNumbers] = {};  // the first `count` are read
};

// numbers := number { ":" number }   at most `max_count` [1:kMaxColonNumbers]
// number  := blank* [+-] digit+      blank: space, \t, \n, \v, \f, \r
//
// Reads from the start of `text`. When a number does not fit in 32 bits,
// `too_long` is set and `count` holds the numbers read before it.
ColonNumbers ReadColonNumbers(std::string_view text, int max_count);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_COLON_NUMBERS_H_
