// Composition (local fields to a count) and breakdown (a count to local fields).
#include <ctime>

#include "AdDateTime.h"
#include "inputs.h"
#include "peers.h"

namespace {

using bench::At;
using bench::GetInputs;

void BM_Compose_Datetimelib(benchmark::State& state) {
  const auto& fields = GetInputs().local_fields;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const std::tm& f = fields[At(i++)];
    const AdDateTime value(f.tm_year + 1900, f.tm_mon + 1, f.tm_mday, f.tm_hour, f.tm_min,
                           f.tm_sec);
    benchmark::DoNotOptimize(value.GetCTime().GetTime());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Compose_Datetimelib);

void BM_Compose_Mktime(benchmark::State& state) {
  const auto& fields = GetInputs().local_fields;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    std::tm f = fields[At(i++)];
    f.tm_isdst = -1;
    benchmark::DoNotOptimize(mktime(&f));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Compose_Mktime);

#if DATETIMELIB_BENCH_ABSEIL
void BM_Compose_Abseil(benchmark::State& state) {
  const auto& fields = GetInputs().local_fields;
  const absl::TimeZone& zone = bench::AbseilZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const std::tm& f = fields[At(i++)];
    const absl::CivilSecond civil(f.tm_year + 1900, f.tm_mon + 1, f.tm_mday, f.tm_hour,
                                  f.tm_min, f.tm_sec);
    benchmark::DoNotOptimize(absl::ToUnixSeconds(absl::FromCivil(civil, zone)));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Compose_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_Compose_Date(benchmark::State& state) {
  const auto& fields = GetInputs().local_fields;
  const date::time_zone* zone = bench::DateZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const std::tm& f = fields[At(i++)];
    const auto day = date::local_days{date::year{f.tm_year + 1900} /
                                      static_cast<unsigned>(f.tm_mon + 1) /
                                      static_cast<unsigned>(f.tm_mday)};
    const auto local = day + std::chrono::hours{f.tm_hour} +
                       std::chrono::minutes{f.tm_min} + std::chrono::seconds{f.tm_sec};
    benchmark::DoNotOptimize(zone->to_sys(local, date::choose::earliest));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Compose_Date);
#endif

void BM_Breakdown_Datetimelib(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const AdDateTime value(AdTime(counts[At(i++)]));
    benchmark::DoNotOptimize(value.GetDay());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Breakdown_Datetimelib);

void BM_Breakdown_LocaltimeR(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const time_t t = counts[At(i++)];
    std::tm fields;
    benchmark::DoNotOptimize(localtime_r(&t, &fields));
    benchmark::DoNotOptimize(fields.tm_mday);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Breakdown_LocaltimeR);

#if DATETIMELIB_BENCH_ABSEIL
void BM_Breakdown_Abseil(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const absl::TimeZone& zone = bench::AbseilZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const absl::CivilSecond civil =
        absl::ToCivilSecond(absl::FromUnixSeconds(counts[At(i++)]), zone);
    benchmark::DoNotOptimize(civil.day());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Breakdown_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_Breakdown_Date(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const date::time_zone* zone = bench::DateZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const bench::DateFields fields = bench::DateBreakdown(zone, counts[At(i++)]);
    benchmark::DoNotOptimize(fields.date);
    benchmark::DoNotOptimize(fields.time.hours());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_Breakdown_Date);
#endif

}  // namespace
