#include "platform/clock.h"

#include <ctime>

namespace datetimelib::platform {

std::int64_t NowSeconds() {
  timespec now{};
  clock_gettime(CLOCK_REALTIME, &now);
  return static_cast<std::int64_t>(now.tv_sec);
}

std::int64_t CoarseNowSeconds() { return static_cast<std::int64_t>(time(nullptr)); }

}  // namespace datetimelib::platform
