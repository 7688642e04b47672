// Inputs shared by the benchmarks: a few thousand instants spread over the whole
// range, with their local fields and texts, so that no cache flatters anyone.
#ifndef DATETIMELIB_BENCH_INPUTS_H_
#define DATETIMELIB_BENCH_INPUTS_H_

#include <cstdint>
#include <ctime>
#include <string>
#include <vector>

namespace bench {

struct Inputs {
  std::vector<std::int32_t> counts;
  std::vector<std::tm> local_fields;       // localtime_r of each count
  std::vector<std::string> local_texts;    // "%Y-%m-%d %H:%M:%S", local time
  std::vector<std::string> gmt_texts;      // the same in UTC
  std::vector<std::string> compact_texts;  // "%d-%b-%Y.%H:%M:%S", local time
};

// Built once, in the zone of the process at the first call.
const Inputs& GetInputs();

// The index of the i-th input, wrapping.
inline std::size_t At(std::size_t i) { return i & 4095; }

// The zone named by TZ, "UTC" when TZ is unset or empty.
const char* ZoneName();

}  // namespace bench

#endif  // DATETIMELIB_BENCH_INPUTS_H_
