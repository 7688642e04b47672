#include "peers.h"

#include "inputs.h"

namespace bench {

#if DATETIMELIB_BENCH_ABSEIL
const absl::TimeZone& AbseilZone() {
  static const absl::TimeZone zone = [] {
    absl::TimeZone loaded;
    if (!absl::LoadTimeZone(ZoneName(), &loaded)) loaded = absl::UTCTimeZone();
    return loaded;
  }();
  return zone;
}
#endif

#if DATETIMELIB_BENCH_DATE
const date::time_zone* DateZone() {
  static const date::time_zone* const zone = date::locate_zone(ZoneName());
  return zone;
}
#endif

}  // namespace bench
