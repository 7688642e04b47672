#include <atomic>
#include <ctime>

#include "platform/clock.h"
#include "support/fixed_clock.h"

namespace {

constexpr std::int64_t kRealTime = INT64_MIN;
std::atomic<std::int64_t> fixed_now{kRealTime};

}  // namespace

namespace datetimelib::testing {

void SetFixedNow(std::optional<std::int64_t> unix_seconds) {
  fixed_now.store(unix_seconds.value_or(kRealTime));
}

}  // namespace datetimelib::testing

namespace datetimelib::platform {

std::int64_t NowSeconds() {
  const std::int64_t fixed = fixed_now.load();
  if (fixed != kRealTime) return fixed;
  timespec now{};
  clock_gettime(CLOCK_REALTIME, &now);
  return static_cast<std::int64_t>(now.tv_sec);
}

std::int64_t CoarseNowSeconds() {
  const std::int64_t fixed = fixed_now.load();
  return fixed != kRealTime ? fixed : static_cast<std::int64_t>(time(nullptr));
}

}  // namespace datetimelib::platform
