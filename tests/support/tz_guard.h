// Test helpers for the process's time zone.
#ifndef DATETIMELIB_TESTS_SUPPORT_TZ_GUARD_H_
#define DATETIMELIB_TESTS_SUPPORT_TZ_GUARD_H_

#include <ctime>

#include "support/env_guard.h"

namespace datetimelib::testing {

// Sets `TZ` (and calls tzset) for the lifetime of the guard and restores what
// was there before (including "unset"). Pass nullptr to unset `TZ`.
class TzGuard : public EnvGuard {
 public:
  explicit TzGuard(const char* tz) : EnvGuard("TZ", tz, tzset) {}
  static void Set(const char* tz) { EnvGuard::Set("TZ", tz, tzset); }
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TZ_GUARD_H_
