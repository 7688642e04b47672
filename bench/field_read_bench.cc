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
// One zoned_time, then the date and the time of day: date's one breakdown.
void BM_SixGetters_Date(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const date::time_zone* zone = bench::DateZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const date::sys_seconds instant{std::chrono::seconds{counts[At(i++)]}};
    const auto local =
        date::zoned_time<std::chrono::seconds>{zone, instant}.get_local_time();
    const auto day = date::floor<date::days>(local);
    const date::year_month_day date_fields{day};
    const date::hh_mm_ss<std::chrono::seconds> time{local - day};
    benchmark::DoNotOptimize(date_fields.year());
    benchmark::DoNotOptimize(date_fields.month());
    benchmark::DoNotOptimize(date_fields.day());
    benchmark::DoNotOptimize(time.hours());
    benchmark::DoNotOptimize(time.minutes());
    benchmark::DoNotOptimize(time.seconds());
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
