// Composition and breakdown through the compiled zone of the current TZ.
#include "platform/zone/local_time.h"

#include "platform/zone/current_zone.h"

namespace datetimelib::platform {

// BreakDownLocal is defined in current_zone.cc, beside the breakdown it keeps.

std::int64_t ComposeLocal(std::int64_t civil_seconds) {
  return CurrentZone().Compose(civil_seconds);
}

}  // namespace datetimelib::platform
