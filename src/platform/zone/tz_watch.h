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
#ifndef DATETIMELIB_PLATFORM_ZONE_TZ_WATCH_H_
#define DATETIMELIB_PLATFORM_ZONE_TZ_WATCH_H_

#include <optional>
#include <string>
#include <vector>

namespace datetimelib::platform {

class TzWatch {
 public:
  // Whether TZ reads as it did when Refresh() was last called (false before).
  bool Unchanged() const;

  // Reads the environment afresh.
  void Refresh();

  // TZ's value at the last Refresh(); nothing when it was unset.
  const std::optional<std::string>& value() const { return value_; }

 private:
  char** environment_ = nullptr;  // `environ` at the last Refresh()
  std::vector<char*> entries_;    // its entries up to TZ's, or all of them
  std::optional<std::string> value_;
};

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_TZ_WATCH_H_
