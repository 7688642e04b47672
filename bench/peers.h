// The peer libraries' zones, loaded once, and the registration every benchmark
// shares: one thread and two, measured in real time, so that the ratio of the two
// runs' items per second is the throughput gained from a second thread.
#ifndef DATETIMELIB_BENCH_PEERS_H_
#define DATETIMELIB_BENCH_PEERS_H_

#include <benchmark/benchmark.h>

#include <cstdint>

#if DATETIMELIB_BENCH_ABSEIL
#include <absl/time/civil_time.h>
#include <absl/time/time.h>
#endif
#if DATETIMELIB_BENCH_DATE
#include <date/date.h>
#include <date/tz.h>
#endif

#define DATETIMELIB_BENCHMARK(function) \
  BENCHMARK(function)->Threads(1)->Threads(2)->UseRealTime()

namespace bench {

#if DATETIMELIB_BENCH_ABSEIL
const absl::TimeZone& AbseilZone();
#endif
#if DATETIMELIB_BENCH_DATE
const date::time_zone* DateZone();

// date's one breakdown: a zoned_time, then the date and the time of day.
struct DateFields {
  date::year_month_day date;
  date::hh_mm_ss<std::chrono::seconds> time;
};
inline DateFields DateBreakdown(const date::time_zone* zone, std::int32_t count) {
  const date::sys_seconds instant{std::chrono::seconds{count}};
  const auto local =
      date::zoned_time<std::chrono::seconds>{zone, instant}.get_local_time();
  const auto day = date::floor<date::days>(local);
  return {date::year_month_day{day}, date::hh_mm_ss<std::chrono::seconds>{local - day}};
}
#endif

}  // namespace bench

#endif  // DATETIMELIB_BENCH_PEERS_H_
