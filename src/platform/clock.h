// The current time.
#ifndef DATETIMELIB_PLATFORM_CLOCK_H_
#define DATETIMELIB_PLATFORM_CLOCK_H_

#include <cstdint>

namespace datetimelib::platform {

// Seconds since 1970-01-01 00:00:00 UTC, now.
//
// Defined in clock.cc for the library; tests link a clock of their own in its
// place (tests/support/test_clock.cc) to fix "now".
std::int64_t NowSeconds();

// The same from the coarse clock, which may lag by a clock tick: one word read,
// cheap enough for a check on every call.
std::int64_t CoarseNowSeconds();

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_CLOCK_H_
