// What the fuzz targets share: the locales and zones they run in, and a failure
// report that names the input's property that broke.
#ifndef DATETIMELIB_FUZZ_FUZZ_SUPPORT_H_
#define DATETIMELIB_FUZZ_FUZZ_SUPPORT_H_

#include <locale.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>

#include "AdDateTime.h"

namespace datetimelib::fuzz {

// Reports a broken property and stops, so that libFuzzer keeps the input.
[[noreturn]] inline void Fail(const char* property, std::string_view detail = {}) {
  const std::string shown(detail);
  std::fprintf(stderr, "property broken: %s [%s]\n", property, shown.c_str());
  std::abort();
}

inline void Check(bool holds, const char* property, std::string_view detail = {}) {
  if (!holds) Fail(property, detail);
}

// The input, taken apart: leading bytes choose how to run, the rest is text.
class Input {
 public:
  Input(const std::uint8_t* data, std::size_t size)
      : data_(reinterpret_cast<const char*>(data)), size_(size) {}

  std::uint8_t Byte() {
    if (size_ == 0) return 0;
    --size_;
    return static_cast<std::uint8_t>(*data_++);
  }
  std::uint32_t Word() {
    std::uint32_t word = 0;
    for (int i = 0; i < 4; ++i) word = word << 8 | Byte();
    return word;
  }
  // What is left, as a C string: up to the first NUL byte, as the library reads it.
  std::string Text() const { return std::string(data_, strnlen(data_, size_)); }
  std::string_view Rest() const { return {data_, size_}; }

 private:
  const char* data_;
  std::size_t size_;
};

// The locales the targets read and write in: "C" and those the fuzz build
// compiles into its folder (LOCPATH is set before the first input).
inline constexpr const char* kLocaleNames[] = {
    "C", "en_US.UTF-8", "en_GB.UTF-8", "de_DE.UTF-8", "fr_FR.UTF-8", "ja_JP.UTF-8"};
inline constexpr std::size_t kLocaleCount = sizeof kLocaleNames / sizeof kLocaleNames[0];

// Installs locale `choice` (modulo their number) on the calling thread; opened
// once each, "C" where one is missing.
void UseLocale(std::uint8_t choice);

// Sets TZ without setenv's copy of every value ever set, which grows without
// bound over millions of inputs: two buffers given to putenv take turns, so TZ's
// entry changes at every call as it would with setenv.
void SetTz(std::string_view value);

// Whether the value's local fields lie within the range a valid value holds,
// 1970-01-01 00:00:00 .. 2038-01-18 23:59:59.
bool FieldsInRange(const AdDateTime& value);

// A folder of the fuzzer's own for the files a target writes, on tmpfs where
// there is one.
const std::string& ScratchFolder();

// Writes `bytes` to `path`, replacing it; false on any failure.
bool WriteFile(const std::string& path, std::string_view bytes);

}  // namespace datetimelib::fuzz

#endif  // DATETIMELIB_FUZZ_FUZZ_SUPPORT_H_
