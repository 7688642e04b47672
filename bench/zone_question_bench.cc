// The zone questions: the standard offset, whether the zone has daylight saving,
// and the daylight-saving dates of a year from the zone's rule.
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "peers.h"

namespace {

void BM_GmtOffset_Datetimelib(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(AdDateTime::GetGMTOffset());
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_GmtOffset_Datetimelib);

// What a C program does to learn the same: tzset() then the `timezone` global.
void BM_GmtOffset_TzsetTimezone(benchmark::State& state) {
  for (auto _ : state) {
    tzset();
    benchmark::DoNotOptimize(timezone);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_GmtOffset_TzsetTimezone);

void BM_UsesDst_Datetimelib(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(AdDateTime::UsesDST());
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_UsesDst_Datetimelib);

void BM_UsesDst_TzsetDaylight(benchmark::State& state) {
  for (auto _ : state) {
    tzset();
    benchmark::DoNotOptimize(daylight);
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_UsesDst_TzsetDaylight);

void BM_DstDates_Datetimelib(benchmark::State& state) {
  std::string start;
  std::string end;
  int year = 1970;
  for (auto _ : state) {
    benchmark::DoNotOptimize(AdDateTime::GenerateDSTDates(year, start, end));
    year = year == 2037 ? 1970 : year + 1;
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_DstDates_Datetimelib);

// Without a table folder the dates come from the zone's rule, as above.
void BM_DstDatesNoTable_Datetimelib(benchmark::State& state) {
  std::string start;
  std::string end;
  int year = 1970;
  for (auto _ : state) {
    benchmark::DoNotOptimize(AdDateTime::GetDSTDates(nullptr, year, start, end));
    year = year == 2037 ? 1970 : year + 1;
  }
  state.SetItemsProcessed(state.iterations());
}
DATETIMELIB_BENCHMARK(BM_DstDatesNoTable_Datetimelib);

}  // namespace
