// Writing values as text: the canonical pattern in local time and in UTC, and
// the compact form.
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "inputs.h"
#include "peers.h"

namespace {

using bench::At;
using bench::GetInputs;

constexpr char kCanonical[] = "%Y-%m-%d %H:%M:%S";
constexpr char kCompact[] = "%d-%b-%Y.%H:%M:%S";

std::string Strftime(const char* pattern, const std::tm& fields) {
  char text[64];
  return std::string(text, std::strftime(text, sizeof text, pattern, &fields));
}

void BM_FormatLocal_Datetimelib(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    benchmark::DoNotOptimize(AdDateTime(AdTime(counts[At(i++)])).Format(kCanonical));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatLocal_Datetimelib);

void BM_FormatLocal_LocaltimeStrftime(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const time_t t = counts[At(i++)];
    std::tm fields;
    localtime_r(&t, &fields);
    benchmark::DoNotOptimize(Strftime(kCanonical, fields));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatLocal_LocaltimeStrftime);

#if DATETIMELIB_BENCH_ABSEIL
void BM_FormatLocal_Abseil(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const absl::TimeZone& zone = bench::AbseilZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    benchmark::DoNotOptimize(
        absl::FormatTime(kCanonical, absl::FromUnixSeconds(counts[At(i++)]), zone));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatLocal_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_FormatLocal_Date(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  const date::time_zone* zone = bench::DateZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const date::sys_seconds instant{std::chrono::seconds{counts[At(i++)]}};
    benchmark::DoNotOptimize(
        date::format("%F %T", date::zoned_time<std::chrono::seconds>{zone, instant}));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatLocal_Date);
#endif

void BM_FormatGmt_Datetimelib(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    benchmark::DoNotOptimize(AdDateTime(AdTime(counts[At(i++)])).FormatGMT(kCanonical));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatGmt_Datetimelib);

void BM_FormatGmt_GmtimeStrftime(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const time_t t = counts[At(i++)];
    std::tm fields;
    gmtime_r(&t, &fields);
    benchmark::DoNotOptimize(Strftime(kCanonical, fields));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatGmt_GmtimeStrftime);

#if DATETIMELIB_BENCH_ABSEIL
void BM_FormatGmt_Abseil(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    benchmark::DoNotOptimize(absl::FormatTime(
        kCanonical, absl::FromUnixSeconds(counts[At(i++)]), absl::UTCTimeZone()));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatGmt_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_FormatGmt_Date(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const date::sys_seconds instant{std::chrono::seconds{counts[At(i++)]}};
    benchmark::DoNotOptimize(date::format("%F %T", instant));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatGmt_Date);
#endif

void BM_FormatCompact_Datetimelib(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    benchmark::DoNotOptimize(AdDateTime(AdTime(counts[At(i++)])).FormatTolvane());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatCompact_Datetimelib);

void BM_FormatCompact_LocaltimeStrftime(benchmark::State& state) {
  const auto& counts = GetInputs().counts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    const time_t t = counts[At(i++)];
    std::tm fields;
    localtime_r(&t, &fields);
    benchmark::DoNotOptimize(Strftime(kCompact, fields));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_FormatCompact_LocaltimeStrftime);

}  // namespace
