// TZ as getenv reads it, and a cheap test, on every call, that it still reads so.
//
// Scanning the environment for "TZ=" touches every variable's text, which the
// rest of a program's work pushes out of cache: with forty variables it costs
// more than a whole breakdown. The watch instead keeps a copy of the environment's
// pointers up to TZ's entry (all of them when TZ is unset) and compares the
// pointers, reading no text but TZ's own. setenv, unsetenv, putenv and a new
// `environ` all change a pointer or the array; a string given to putenv and
// changed in place later is noticed when it is TZ's own entry.
//
// The comparison reads a slot only after the one before it matched a non-null
// pointer, so it never reads past the end of an environment that shrank, even
// one that was freed and allocated again at the same address.
//
// The environment the process started with is the exception, and the common
// case: its array lies on the main thread's stack and is never freed, so TZ's
// slot is read directly, and nothing before it. In that array nothing is ever
// added in place (setenv and putenv copy it to a new one when they add) and
// unsetenv moves every later entry down, so TZ's slot alone says whether TZ
// still reads the same. Only a program that writes a "TZ=" entry into a slot
// before it with its own hands goes unseen, as it would by glibc's localtime.
#ifndef DATETIMELIB_PLATFORM_ZONE_TZ_WATCH_H_
#define DATETIMELIB_PLATFORM_ZONE_TZ_WATCH_H_

#include <unistd.h>

#include <cstdint>
#include <cstring>
#include <optional>
#include <string>
#include <vector>

namespace datetimelib::platform {

class TzWatch {
 public:
  // `lasting`: an environment array that is never freed, read as above; by
  // default the one the process started with (none where it is not known).
  TzWatch();
  explicit TzWatch(char** lasting) : lasting_(lasting) {}

  // Whether TZ reads as it did when Refresh() was last called (false before).
  // Inline for the case of every call: the lasting array, TZ set.
  bool Unchanged() const {
    char** const current = environ;
    if (current != lasting_ || current != environment_ || current == nullptr || !value_) {
      return UnchangedAnyArray();
    }
    const std::size_t slot = entries_.size() - 1;
    // TZ's own text may have been changed in place (a string given to putenv).
    // Its entry is the same pointer as at Refresh(), so the value's bytes and
    // its NUL were there to read then and still are: a text changed in place
    // keeps its buffer.
    return current[slot] == entries_[slot] &&
           SameBytes(entries_[slot] + 3, value_->c_str(), value_->size() + 1);
  }

  // Reads the environment afresh.
  void Refresh();

  // TZ's value at the last Refresh(); nothing when it was unset.
  const std::optional<std::string>& value() const { return value_; }

 private:
  bool UnchangedAnyArray() const;

  // Whether the n bytes at a and b are equal, reading each byte of both once at
  // most and none beyond the n: words of eight, the last one overlapping the one
  // before. Zone names are short, and this costs less than a call to memcmp.
  static bool SameBytes(const char* a, const char* b, std::size_t n) {
    if (n < sizeof(std::uint64_t)) {
      for (std::size_t i = 0; i < n; ++i) {
        if (a[i] != b[i]) return false;
      }
      return true;
    }
    const auto word = [](const char* p) {
      std::uint64_t w;
      std::memcpy(&w, p, sizeof w);
      return w;
    };
    std::uint64_t differ = 0;
    for (std::size_t i = 0; i + sizeof(std::uint64_t) < n; i += sizeof(std::uint64_t)) {
      differ |= word(a + i) ^ word(b + i);
    }
    const std::size_t last = n - sizeof(std::uint64_t);
    return (differ | (word(a + last) ^ word(b + last))) == 0;
  }

  char** lasting_;
  char** environment_ = nullptr;  // `environ` at the last Refresh()
  std::vector<char*> entries_;    // its entries up to TZ's, or all of them
  std::optional<std::string> value_;
};

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_TZ_WATCH_H_
