// Reading a value's fields the way users do: year to second of one value, and a
// getter again on a value whose fields were just read.
#include <ctime>

#include "AdDateTime.h"
#include "inputs.h"
#include "peers.h"

namespace {

using bench::At;
using bench::GetInputs;

void BM_SixGetters_Datetimelib(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const AdDateTime value(AdTime(counts[At(i++)]));
    benchmark::DoNotOptimize(value.GetYear());
    benchmark::DoNotOptimize(value.GetMonth());
    benchmark::DoNotOptimize(value.GetDay());
    benchmark::DoNotOptimize(value.GetHour());
    benchmark::DoNotOptimize(value.GetMinute());
    benchmark::DoNotOptimize(value.GetSecond());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_SixGetters_Datetimelib);

void BM_SixGetters_LocaltimeR(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const time_t t = counts[At(i++)];
    std::tm fields;
    benchmark::DoNotOptimize(localtime_r(&t, &fields));
    benchmark::DoNotOptimize(fields);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_SixGetters_LocaltimeR);

#if DATETIMELIB_BENCH_ABSEIL
void BM_SixGetters_Abseil(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const absl::TimeZone& zone = bench::AbseilZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const absl::CivilSecond civil =
        absl::ToCivilSecond(absl::FromUnixSeconds(counts[At(i++)]), zone);
    benchmark::DoNotOptimize(civil.year());
    benchmark::DoNotOptimize(civil.month());
    benchmark::DoNotOptimize(civil.day());
    benchmark::DoNotOptimize(civil.hour());
    benchmark::DoNotOptimize(civil.minute());
    benchmark::DoNotOptimize(civil.second());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_SixGetters_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_SixGetters_Date(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const date::time_zone* zone = bench::DateZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const bench::DateFields fields = bench::DateBreakdown(zone, counts[At(i++)]);
    benchmark::DoNotOptimize(fields.date.year());
    benchmark::DoNotOptimize(fields.date.month());
    benchmark::DoNotOptimize(fields.date.day());
    benchmark::DoNotOptimize(fields.time.hours());
    benchmark::DoNotOptimize(fields.time.minutes());
    benchmark::DoNotOptimize(fields.time.seconds());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_SixGetters_Date);
#endif

// The same value's minute again and again: every call after the first follows a
// getter on the same value. Its target is absolute, so it has no peer.
void BM_GetterAgain_Datetimelib(benchmark::State& state) {
  const AdDateTime value(AdTime(
      GetInputs().counts[At(static_cast<std::size_t>(state.thread_index()) * 1000)]));
  for (auto _ : state) benchmark::DoNotOptimize(value.GetMinute());
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_GetterAgain_Datetimelib);

}  // namespace
