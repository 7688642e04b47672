// Compares the zone engine with glibc on every zone of the system tz database.
//
//   datetimelib_zone_sweep [--shard I --shards N] [--step-hours H] [ZONE...]
//
// With no ZONE, every zone file under /usr/share/zoneinfo; shard I of N takes
// every N-th of them, so that N processes share the work (glibc's localtime_r
// and mktime take one process-wide lock, so threads would not).
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include "support/glibc_agreement.h"

int main(int argc, char** argv) {
  int shard = 0;
  int shards = 1;
  int step_hours = 1;
  std::vector<std::string> zones;
  for (int i = 1; i < argc; ++i) {
    const std::string argument = argv[i];
    if (argument == "--shard" && i + 1 < argc) {
      shard = std::atoi(argv[++i]);
    } else if (argument == "--shards" && i + 1 < argc) {
      shards = std::atoi(argv[++i]);
    } else if (argument == "--step-hours" && i + 1 < argc) {
      step_hours = std::atoi(argv[++i]);
    } else {
      zones.push_back(argument);
    }
  }
  if (shards < 1 || shard < 0 || shard >= shards || step_hours < 1) {
    std::fprintf(stderr, "usage: %s [--shard I --shards N] [--step-hours H] [ZONE...]\n",
                 argv[0]);
    return 2;
  }
  if (zones.empty()) zones = datetimelib::testing::SystemZoneNames();

  long long instants = 0;
  long long transitions = 0;
  long long hours = 0;
  long long repeated = 0;
  int checked = 0;
  int failed = 0;
  for (std::size_t i = static_cast<std::size_t>(shard); i < zones.size();
       i += static_cast<std::size_t>(shards)) {
    const auto report =
        datetimelib::testing::CheckAgreementWithGlibc(zones[i].c_str(), step_hours);
    ++checked;
    instants += report.instants_checked;
    transitions += report.transitions_found;
    hours += report.local_hours_checked;
    repeated += report.repeated_hours;
    if (!report.mismatches.empty()) {
      ++failed;
      std::printf("MISMATCH %s\n", zones[i].c_str());
      for (const auto& line : report.mismatches) std::printf("  %s\n", line.c_str());
    }
  }
  std::printf(
      "zones %d (of %zu, shard %d/%d), disagreeing %d; breakdowns %lld, transitions "
      "%lld, "
      "compositions %lld, repeated local times %lld\n",
      checked, zones.size(), shard, shards, failed, instants, transitions, hours,
      repeated);
  return failed == 0 ? 0 : 1;
}
