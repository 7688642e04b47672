#include <ctime>

#include "platform/clock.h"
#include "support/fixed_clock.h"

namespace datetimelib::platform {

std::int64_t NowSeconds() {
  const std::int64_t fixed = testing::fixed_now.load();
  if (fixed != testing::kRealTime) return fixed;
  timespec now{};
  clock_gettime(CLOCK_REALTIME, &now);
  return static_cast<std::int64_t>(now.tv_sec);
}

std::int64_t CoarseNowSeconds() {
  const std::int64_t fixed = testing::fixed_now.load();
  return fixed != testing::kRealTime ? fixed : static_cast<std::int64_t>(time(nullptr));
}

}  // namespace datetimelib::platform
