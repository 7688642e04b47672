// Test helpers for the process's time zone.
#ifndef DATETIMELIB_TESTS_SUPPORT_TZ_GUARD_H_
#define DATETIMELIB_TESTS_SUPPORT_TZ_GUARD_H_

#include <cstdlib>
#include <ctime>
#include <optional>
#include <string>

namespace datetimelib::testing {

// Sets `TZ` for the lifetime of the guard and restores what was there before
// (including "unset"). Pass nullptr to unset `TZ`.
class TzGuard {
 public:
  explicit TzGuard(const char* tz) {
    if (const char* old = std::getenv("TZ")) saved_ = old;
    Set(tz);
  }
  ~TzGuard() { Set(saved_ ? saved_->c_str() : nullptr); }
  TzGuard(const TzGuard&) = delete;
  TzGuard& operator=(const TzGuard&) = delete;

  static void Set(const char* tz) {
    if (tz == nullptr) {
      unsetenv("TZ");
    } else {
      setenv("TZ", tz, 1);
    }
    tzset();
  }

 private:
  std::optional<std::string> saved_;
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TZ_GUARD_H_
