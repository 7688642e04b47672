// Reading values from text: the canonical text as local time and as UTC, and the
// compact form.
#include <langinfo.h>

#include <clocale>
#include <ctime>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

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

// A text with a fraction of a second that the thread's locale refuses reads
// again in the user's default locale: here the two differ, and every call reads
// in both.
void BM_ParseLocalFraction_Datetimelib(benchmark::State& state) {
  std::vector<std::string> texts;
  for (std::string text : GetInputs().local_texts) {
    text[10] = 'T';  // "2003-05-17T14:03:09.250"
    texts.push_back(text + ".250");
  }
  const locale_t user = newlocale(LC_ALL_MASK, "", nullptr);
  const bool user_is_utf8 =
      user != nullptr && std::string_view(nl_langinfo_l(CODESET, user)) == "UTF-8";
  if (user != nullptr) freelocale(user);
  const locale_t other = newlocale(LC_ALL_MASK, user_is_utf8 ? "C" : "C.UTF-8", nullptr);
  if (other == nullptr) {
    state.SkipWithError("needs the C.UTF-8 locale");
    return;
  }
  const locale_t before = uselocale(other);
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  AdDateTime value;
  for (auto _ : state) {
    benchmark::DoNotOptimize(value.ParseDateTime(texts[At(i++)].c_str()));
  }
  uselocale(before);
  freelocale(other);
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseLocalFraction_Datetimelib);

// A locale's own form, "%x %X" of the thread's locale ("C": "05/17/03
// 14:03:09"), which takes the locale reader rather than the canonical text's.
void BM_ParseLocaleForm_Datetimelib(benchmark::State& state) {
  std::vector<std::string> texts;
  for (const std::int32_t count : GetInputs().counts) {
    texts.push_back(AdDateTime(AdTime(count)).Format("%x %X"));
  }
  std::size_t i = static_cast<std::size_t>(state.thread_index()) * 1000;
  AdDateTime value;
  for (auto _ : state) {
    benchmark::DoNotOptimize(value.ParseDateTime(texts[At(i++)].c_str()));
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_ParseLocaleForm_Datetimelib);

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
