// "Now" under test control. The test binary links tests/support/test_clock.cc in
// place of the library's clock; it reads the real time until a FixedNow is alive.
#ifndef DATETIMELIB_TESTS_SUPPORT_FIXED_CLOCK_H_
#define DATETIMELIB_TESTS_SUPPORT_FIXED_CLOCK_H_

#include <atomic>
#include <cstdint>

namespace datetimelib::testing {

inline constexpr std::int64_t kRealTime = INT64_MIN;
inline std::atomic<std::int64_t> fixed_now{kRealTime};

// Fixes "now" at an instant for the lifetime of the guard.
class FixedNow {
 public:
  explicit FixedNow(std::int64_t unix_seconds) { fixed_now.store(unix_seconds); }
  ~FixedNow() { fixed_now.store(kRealTime); }
  FixedNow(const FixedNow&) = delete;
  FixedNow& operator=(const FixedNow&) = delete;
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_FIXED_CLOCK_H_
