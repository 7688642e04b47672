// Folder src/value/: the AdDateTime value (construction, status, setters,
// fields), AdDuration, the arithmetic between them and the calendar members.
//
// Arithmetic on 32-bit counts that wraps modulo 2^32 instead of overflowing.
#ifndef DATETIMELIB_VALUE_WRAP_H_
#define DATETIMELIB_VALUE_WRAP_H_

#include <cstdint>

namespace datetimelib {

// Unsigned arithmetic is defined to wrap; converting back is two's complement
// (defined since C++20, and by GCC and Clang before it).
inline std::int32_t WrapAdd(std::int32_t a, std::int32_t b) {
  return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) +
                                   static_cast<std::uint32_t>(b));
}
inline std::int32_t WrapSub(std::int32_t a, std::int32_t b) {
  return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) -
                                   static_cast<std::uint32_t>(b));
}
inline std::int32_t WrapMul(std::int32_t a, std::int32_t b) {
  return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) *
                                   static_cast<std::uint32_t>(b));
}

}  // namespace datetimelib

#endif  // DATETIMELIB_VALUE_WRAP_H_
