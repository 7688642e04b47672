// The peer libraries' zones, loaded once, and the registration every benchmark
// shares: one thread and two, measured in real time, so that the ratio of the two
// runs' items per second is the throughput gained from a second thread.
#ifndef DATETIMELIB_BENCH_PEERS_H_
#define DATETIMELIB_BENCH_PEERS_H_

#include <benchmark/benchmark.h>

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
#endif

}  // namespace bench

#endif  // DATETIMELIB_BENCH_PEERS_H_
