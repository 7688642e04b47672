// Composition and breakdown through the compiled zone of the current TZ.
#include "platform/zone/local_time.h"

#include "platform/zone/current_zone.h"

namespace datetimelib::platform {

BrokenDownTime BreakDownLocal(std::int64_t unix_seconds) {
  return CurrentZone().BreakDown(unix_seconds);
}

std::int64_t ComposeLocal(std::int64_t civil_seconds) {
  return CurrentZone().Compose(civil_seconds);
}

}  // namespace datetimelib::platform
