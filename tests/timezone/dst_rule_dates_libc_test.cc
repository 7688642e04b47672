// GenerateDSTDates against the changes that the C library itself makes, in every
// zone of the system tz database whose current rule has daylight saving.
//
// What is compared, for each zone and each year Y of 2008-2037:
//   * the C library's changes: the instants T at which localtime_r's tm_isdst
//     flips, found by stepping 12 hours and bisecting to the second. A change
//     belongs to the year of the local date-time just before it;
//   * our start text must equal localtime_r(T - 1) written "%Y-%m-%d %H:%M:%S"
//     for the one change of Y into daylight time (tm_isdst 0 -> 1);
//   * our end text must equal T written in the offset in force before it, that
//     is localtime_r(T - 1) plus one second, for the one change of Y out of
//     daylight time (1 -> 0).
// A year agrees when it has exactly one change of each kind and both texts match.
//
// GenerateDSTDates applies today's rule to every year, while the C library
// follows each zone's history; a zone that changed its rule in 2013 differs
// before 2013. So each zone must agree in every year from some year on, that
// year being 2026 at the latest: today's rule must hold for the years to come.
#include <gtest/gtest.h>

#include <cstdio>
#include <ctime>
#include <filesystem>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "AdDateTime.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::ReadFileBytes;
using datetimelib::testing::TzGuard;

constexpr char kZoneFolder[] = "/usr/share/zoneinfo";
constexpr int kFirstYear = 2008;
constexpr int kLastYear = 2037;
constexpr int kLatestRuleYear = 2026;

// Zones whose data lists every change up to 2086 because they do not follow
// their footer rule: Palestine suspends daylight time during Ramadan.
const std::set<std::string> kNotRuleFollowing = {"Asia/Gaza", "Asia/Hebron"};

std::string Canonical(const std::tm& fields) {
  char text[64];
  return std::string(text,
                     std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", &fields));
}

std::tm Local(std::int64_t unix_seconds) {
  const time_t instant = static_cast<time_t>(unix_seconds);
  std::tm fields{};
  localtime_r(&instant, &fields);
  return fields;
}

struct Change {
  std::string start_text;  // local time one second before
  std::string end_text;    // local time of the change, before-offset
};

struct YearChanges {
  std::vector<Change> to_dst;
  std::vector<Change> from_dst;
};

// The C library's tm_isdst changes in the process's zone, by local year.
std::map<int, YearChanges> LibcChanges() {
  constexpr std::int64_t kStep = 12 * 3600;
  std::map<int, YearChanges> changes;
  const std::int64_t from = 1199145600 - 4 * 86400;  // 2008-01-01 UTC, less 4 days
  const std::int64_t to = INT32_MAX;
  bool dst = Local(from).tm_isdst > 0;
  for (std::int64_t t = from + kStep; t <= to; t += kStep) {
    if ((Local(t).tm_isdst > 0) == dst) continue;
    std::int64_t low = t - kStep, high = t;  // dst at low, not at high
    while (high - low > 1) {
      const std::int64_t middle = low + (high - low) / 2;
      ((Local(middle).tm_isdst > 0) == dst ? low : high) = middle;
    }
    const std::tm before = Local(low);
    std::tm change = before;
    change.tm_sec += 1;
    const time_t civil = timegm(&change);  // normalises, as if UTC
    std::tm change_fields{};
    gmtime_r(&civil, &change_fields);
    YearChanges& year = changes[before.tm_year + 1900];
    (dst ? year.from_dst : year.to_dst)
        .push_back({Canonical(before), Canonical(change_fields)});
    dst = !dst;
  }
  return changes;
}

// The first year from which every year to kLastYear agrees; kLastYear + 1 when
// even the last one does not.
int FirstAgreeingYear(const std::string& zone, std::string* first_difference) {
  TzGuard tz(zone.c_str());
  const std::map<int, YearChanges> changes = LibcChanges();
  for (int year = kLastYear; year >= kFirstYear; --year) {
    std::string start, end;
    AdDateTime::GenerateDSTDates(year, start, end);
    const auto found = changes.find(year);
    const bool agrees = found != changes.end() && found->second.to_dst.size() == 1 &&
                        found->second.from_dst.size() == 1 &&
                        found->second.to_dst[0].start_text == start &&
                        found->second.from_dst[0].end_text == end;
    if (!agrees) {
      *first_difference = std::to_string(year) + ": ours " + start + " / " + end;
      return year + 1;
    }
  }
  return kFirstYear;
}

// Zone names of the system database: every zone file outside posix/ and right/
// (which repeat the others, right/ with leap seconds the C library applies).
std::vector<std::string> SystemZoneNames() {
  std::vector<std::string> names;
  std::error_code error;
  for (auto it = std::filesystem::recursive_directory_iterator(kZoneFolder, error);
       it != std::filesystem::recursive_directory_iterator(); it.increment(error)) {
    const std::string name = it->path().lexically_relative(kZoneFolder).string();
    if (it->is_directory() && (name == "posix" || name == "right")) {
      it.disable_recursion_pending();
      continue;
    }
    if (!it->is_regular_file() || name == "posixrules" || name == "localtime") continue;
    if (ReadFileBytes(it->path().string()).compare(0, 4, "TZif") == 0)
      names.push_back(name);
  }
  return names;
}

TEST(GenerateDSTDates, AgreesWithTheCLibraryInEveryRuleZone) {
  const std::vector<std::string> zones = SystemZoneNames();
  if (zones.empty()) GTEST_SKIP() << "no system zone folder";
  int checked = 0;
  int agreeing_years = 0;
  for (const std::string& zone : zones) {
    {
      TzGuard tz(zone.c_str());
      if (!AdDateTime::UsesDST()) continue;
    }
    ++checked;
    if (kNotRuleFollowing.count(zone) != 0) continue;
    std::string difference;
    const int first = FirstAgreeingYear(zone, &difference);
    EXPECT_LE(first, kLatestRuleYear) << zone << " differs in " << difference;
    agreeing_years += kLastYear + 1 - first;
  }
  std::printf("%d of %zu zones have a daylight-saving rule; %d zone-years agree\n",
              checked, zones.size(), agreeing_years);
  EXPECT_GT(checked, 100);
}

// Zones whose current rule has been in force since a known year agree from that
// year on; this pins the rule forms that matter (second Sunday, the south,
// Thursday + 26 h, minutes, negative hours, winter as daylight time).
TEST(GenerateDSTDates, AgreesWithTheCLibrarySinceTheRuleBegan) {
  const struct {
    const char* zone;
    int since;
  } cases[] = {
      {"America/New_York", 2008},     // M3.2.0, M11.1.0 since 2007
      {"Europe/Berlin", 2008},        // last Sundays, 01:00 UTC
      {"Australia/Sydney", 2008},     // the south, since 2008
      {"Pacific/Chatham", 2008},      // 02:45 and 03:45
      {"Europe/Dublin", 2008},        // winter as the daylight part
      {"Australia/Lord_Howe", 2008},  // half-hour daylight saving
      {"Asia/Jerusalem", 2013},       // M3.4.4/26 since 2013
      {"America/Nuuk", 2024},         // M3.5.0/-1 since 2024
  };
  for (const auto& c : cases) {
    if (ReadFileBytes(std::string(kZoneFolder) + "/" + c.zone).empty()) continue;
    std::string difference;
    EXPECT_LE(FirstAgreeingYear(c.zone, &difference), c.since)
        << c.zone << " differs in " << difference;
  }
}

}  // namespace
