#include "support/glibc_agreement.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>
#include <utility>

#include "platform/civil.h"
#include "platform/local_time.h"
#include "support/tz_guard.h"

namespace datetimelib::testing {
namespace {

constexpr std::int64_t kFirst = 0;          // 1970-01-01 00:00:00 UTC
constexpr std::int64_t kLast = 2147483647;  // 2038-01-19 03:14:07 UTC
constexpr std::size_t kMismatchesKept = 8;

std::tm Libc(std::int64_t t) {
  const time_t value = static_cast<time_t>(t);
  std::tm fields{};
  localtime_r(&value, &fields);
  return fields;
}

std::string Describe(std::int64_t t, const std::tm& expected,
                     const platform::BrokenDownTime& got) {
  char text[256];
  std::snprintf(text, sizeof text,
                "t=%lld glibc %d-%d-%d %d:%d:%d off=%ld dst=%d %s | ours %d-%d-%d "
                "%d:%d:%d off=%d dst=%d %s",
                static_cast<long long>(t), expected.tm_year + 1900, expected.tm_mon + 1,
                expected.tm_mday, expected.tm_hour, expected.tm_min, expected.tm_sec,
                expected.tm_gmtoff, expected.tm_isdst, expected.tm_zone, got.year,
                got.month, got.day, got.hour, got.minute, got.second, got.utc_offset,
                got.is_dst, got.abbreviation);
  return text;
}

std::string ReadFile(const std::string& path) {
  std::ostringstream bytes;
  bytes << std::ifstream(path, std::ios::binary).rdbuf();
  return bytes.str();
}

void Note(AgreementReport* report, std::string what) {
  if (report->mismatches.size() < kMismatchesKept)
    report->mismatches.push_back(std::move(what));
}

void CheckInstant(std::int64_t t, AgreementReport* report) {
  ++report->instants_checked;
  const std::tm expected = Libc(t);
  const platform::BrokenDownTime got = platform::BreakDownLocal(t);
  const bool same =
      got.year == expected.tm_year + 1900 && got.month == expected.tm_mon + 1 &&
      got.day == expected.tm_mday && got.hour == expected.tm_hour &&
      got.minute == expected.tm_min && got.second == expected.tm_sec &&
      got.weekday == expected.tm_wday && got.yearday == expected.tm_yday &&
      got.utc_offset == expected.tm_gmtoff && got.is_dst == (expected.tm_isdst > 0) &&
      std::strcmp(got.abbreviation, expected.tm_zone) == 0;
  if (!same) Note(report, "breakdown " + Describe(t, expected, got));
}

// The first instant in (low, high] whose offset or isdst differs from low's.
std::int64_t Bisect(std::int64_t low, std::int64_t high) {
  const std::tm at_low = Libc(low);
  while (high - low > 1) {
    const std::int64_t middle = low + (high - low) / 2;
    const std::tm at_middle = Libc(middle);
    if (at_middle.tm_gmtoff == at_low.tm_gmtoff &&
        at_middle.tm_isdst == at_low.tm_isdst &&
        std::strcmp(at_middle.tm_zone, at_low.tm_zone) == 0) {
      low = middle;
    } else {
      high = middle;
    }
  }
  return high;
}

// A change of glibc's clocks, found by bisection.
struct Change {
  std::int64_t at;             // first instant of the new time
  std::int64_t offset_before;  // seconds east
  std::int64_t offset_after;
};

// The fields of local seconds `civil` (counted as if UTC), for mktime.
std::tm MktimeFields(std::int64_t civil) {
  const time_t value = static_cast<time_t>(civil);
  std::tm fields{};
  gmtime_r(&value, &fields);
  fields.tm_isdst = -1;
  return fields;
}

// `civil` occurs twice when a change sets the clocks back over it; then the
// earlier reading is the one before the change.
void CheckLocalHour(std::int64_t civil, const std::vector<Change>& changes,
                    std::size_t* next_change, AgreementReport* report) {
  while (*next_change < changes.size() &&
         changes[*next_change].at + std::max(changes[*next_change].offset_before,
                                             changes[*next_change].offset_after) <=
             civil) {
    ++*next_change;
  }
  const std::int64_t ours = platform::ComposeLocal(civil);
  for (std::size_t i = *next_change; i < changes.size() && i < *next_change + 2; ++i) {
    const Change& change = changes[i];
    if (change.offset_before > change.offset_after &&
        change.at + change.offset_after <= civil &&
        civil < change.at + change.offset_before) {
      ++report->repeated_hours;
      if (ours != civil - change.offset_before) {
        Note(report, "repeated local time " + std::to_string(civil) + ": ours " +
                         std::to_string(ours) + ", earlier reading " +
                         std::to_string(civil - change.offset_before));
      }
      return;
    }
  }
  ++report->local_hours_checked;
  std::tm fields = MktimeFields(civil);
  const std::int64_t expected = mktime(&fields);
  if (ours != expected) {
    Note(report, "local time " + std::to_string(civil) + ": ours " +
                     std::to_string(ours) + ", mktime " + std::to_string(expected));
  }
}

}  // namespace

AgreementReport CheckAgreementWithGlibc(const char* tz, int step_hours) {
  TzGuard guard(tz);
  AgreementReport report;
  const std::int64_t step = std::int64_t{step_hours} * 3600;
  std::vector<Change> changes;
  std::tm previous = Libc(kFirst);
  for (std::int64_t t = kFirst; t <= kLast; t += step) {
    CheckInstant(t, &report);
    const std::tm now = Libc(t);
    if (t > kFirst &&
        (now.tm_gmtoff != previous.tm_gmtoff || now.tm_isdst != previous.tm_isdst ||
         std::strcmp(now.tm_zone, previous.tm_zone) != 0)) {
      const std::int64_t at = Bisect(t - step, t);
      ++report.transitions_found;
      for (const std::int64_t near : {at - 1, at, at + 1}) CheckInstant(near, &report);
      changes.push_back({at, Libc(at - 1).tm_gmtoff, Libc(at).tm_gmtoff});
    }
    previous = now;
  }
  // Local hours from 1970-01-02 to 2038-01-17, clear of the ends of the 32-bit range.
  std::size_t next_change = 0;
  for (std::int64_t civil = 86400; civil <= kLast - 2 * 86400; civil += step) {
    CheckLocalHour(civil, changes, &next_change, &report);
  }
  return report;
}

std::vector<std::string> SystemZoneNames() {
  namespace fs = std::filesystem;
  const fs::path root = "/usr/share/zoneinfo";
  std::map<std::pair<std::uintmax_t, std::string>, std::string> by_content;
  std::error_code error;
  for (auto it = fs::recursive_directory_iterator(root, error);
       it != fs::recursive_directory_iterator(); it.increment(error)) {
    if (error) break;
    const fs::path relative = fs::relative(it->path(), root, error);
    const std::string name = relative.generic_string();
    if (it->is_directory() && (name == "posix" || name == "right")) {
      it.disable_recursion_pending();
      continue;
    }
    if (!it->is_regular_file() || name == "posixrules" || name == "localtime") continue;
    const std::string bytes = ReadFile(it->path().string());
    if (bytes.compare(0, 4, "TZif") != 0) continue;
    const auto key = std::make_pair(static_cast<std::uintmax_t>(bytes.size()), bytes);
    auto found = by_content.find(key);
    if (found == by_content.end() || name < found->second) by_content[key] = name;
  }
  std::vector<std::string> names;
  for (const auto& entry : by_content) names.push_back(entry.second);
  std::sort(names.begin(), names.end());
  return names;
}

}  // namespace datetimelib::testing
