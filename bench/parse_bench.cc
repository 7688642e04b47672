// Reading values from text: the canonical text as local time and as UTC, and the
// compact form.
#include <ctime>
#include <sstream>
#include <string>

#include "AdDateTime.h"
#include "inputs.h"
#include "peers.h"

namespace {

using bench::At;
using bench::GetInputs;

constexpr char kCanonical[] = "%Y-%m-%d %H:%M:%S";
constexpr char kCompact[] = "%d-%b-%Y.%H:%M:%S";

void BM_ParseLocal_Datetimelib(benchmark::State& state) {
  const auto& texts = GetInputs().local_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  AdDateTime value;
  for (auto _ : state) {
    benchmark::DoNotOptimize(value.ParseDateTime(texts[At(i++)].c_str()));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseLocal_Datetimelib);

void BM_ParseLocal_StrptimeMktime(benchmark::State& state) {
  const auto& texts = GetInputs().local_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    std::tm fields{};
    strptime(texts[At(i++)].c_str(), kCanonical, &fields);
    fields.tm_isdst = -1;
    benchmark::DoNotOptimize(mktime(&fields));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseLocal_StrptimeMktime);

#if DATETIMELIB_BENCH_ABSEIL
void BM_ParseLocal_Abseil(benchmark::State& state) {
  const auto& texts = GetInputs().local_texts;
  const absl::TimeZone& zone = bench::AbseilZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    absl::Time instant;
    std::string error;
    benchmark::DoNotOptimize(
        absl::ParseTime(kCanonical, texts[At(i++)], zone, &instant, &error));
    benchmark::DoNotOptimize(instant);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseLocal_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_ParseLocal_Date(benchmark::State& state) {
  const auto& texts = GetInputs().local_texts;
  const date::time_zone* zone = bench::DateZone();
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    std::istringstream in{texts[At(i++)]};
    date::local_seconds local;
    in >> date::parse("%F %T", local);
    benchmark::DoNotOptimize(zone->to_sys(local, date::choose::earliest));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseLocal_Date);
#endif

void BM_ParseGmt_Datetimelib(benchmark::State& state) {
  const auto& texts = GetInputs().gmt_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  AdDateTime value;
  for (auto _ : state) {
    benchmark::DoNotOptimize(value.ParseDateTimeGMT(texts[At(i++)].c_str()));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseGmt_Datetimelib);

void BM_ParseGmt_StrptimeTimegm(benchmark::State& state) {
  const auto& texts = GetInputs().gmt_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    std::tm fields{};
    strptime(texts[At(i++)].c_str(), kCanonical, &fields);
    benchmark::DoNotOptimize(timegm(&fields));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseGmt_StrptimeTimegm);

#if DATETIMELIB_BENCH_ABSEIL
void BM_ParseGmt_Abseil(benchmark::State& state) {
  const auto& texts = GetInputs().gmt_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    absl::Time instant;
    std::string error;
    benchmark::DoNotOptimize(absl::ParseTime(kCanonical, texts[At(i++)],
                                             absl::UTCTimeZone(), &instant, &error));
    benchmark::DoNotOptimize(instant);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseGmt_Abseil);
#endif

#if DATETIMELIB_BENCH_DATE
void BM_ParseGmt_Date(benchmark::State& state) {
  const auto& texts = GetInputs().gmt_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    std::istringstream in{texts[At(i++)]};
    date::sys_seconds instant;
    in >> date::parse("%F %T", instant);
    benchmark::DoNotOptimize(instant);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseGmt_Date);
#endif

void BM_ParseCompact_Datetimelib(benchmark::State& state) {
  const auto& texts = GetInputs().compact_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  AdDateTime value;
  for (auto _ : state) {
    value.ParseTolvaneDateTime(texts[At(i++)].c_str());
    benchmark::DoNotOptimize(value.GetCTime().GetTime());
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseCompact_Datetimelib);

void BM_ParseCompact_StrptimeMktime(benchmark::State& state) {
  const auto& texts = GetInputs().compact_texts;
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  for (auto _ : state) {
    std::tm fields{};
    strptime(texts[At(i++)].c_str(), kCompact, &fields);
    fields.tm_isdst = -1;
    benchmark::DoNotOptimize(mktime(&fields));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseCompact_StrptimeMktime);

}  // namespace
