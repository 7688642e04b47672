// Compares the zone engine with glibc on every zone of the system tz database.
//
//   datetimelib_zone_sweep [--shard I --shards N] [--step-hours H] [ZONE...]
//
// With no ZONE, every zone file under /usr/share/zoneinfo; shard I of N takes
// every N-th of them, so that N processes share the work (glibc's localtime_r
// and mktime take one process-wide lock, so threads would not).
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

#include "support/glibc_agreement.h"

int main(int argc, char** argv) {
  int shard = 0, shards = 1, step_hours = 1;
  std::vector<std::string> zones;
  for (int i = 1; i < argc; ++i) {
    const std::string argument = argv[i];
    int* option = argument == "--shard"        ? &shard
                  : argument == "--shards"     ? &shards
                  : argument == "--step-hours" ? &step_hours
                                               : nullptr;
    if (option != nullptr && i + 1 < argc) {
      *option = std::atoi(argv[++i]);
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
  datetimelib::testing::AgreementReport total;
  int checked = 0, failed = 0;
  for (auto i = static_cast<std::size_t>(shard); i < zones.size();
       i += static_cast<std::size_t>(shards), ++checked) {
    const auto report =
        datetimelib::testing::CheckAgreementWithGlibc(zones[i].c_str(), step_hours);
    total.instants_checked += report.instants_checked;
    total.transitions_found += report.transitions_found;
    total.local_hours_checked += report.local_hours_checked;
    total.repeated_hours += report.repeated_hours;
    if (report.mismatches.empty()) continue;
    ++failed;
    std::printf("MISMATCH %s\n", zones[i].c_str());
    for (const auto& line : report.mismatches) std::printf("  %s\n", line.c_str());
  }
  std::printf(
      "zones %d (of %zu, shard %d/%d), disagreeing %d; breakdowns %lld, transitions "
      "%lld, "
      "compositions %lld, repeated local times %lld\n",
      checked, zones.size(), shard, shards, failed,
      static_cast<long long>(total.instants_checked),
      static_cast<long long>(total.transitions_found),
      static_cast<long long>(total.local_hours_checked),
      static_cast<long long>(total.repeated_hours));
  return failed == 0 ? 0 : 1;
}
