#include "support/glibc_agreement.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>

#include "platform/zone/local_time.h"
#include "support/tz_guard.h"

namespace datetimelib::testing {
namespace {

constexpr std::int64_t kFirst = 0;          // 1970-01-01 00:00:00 UTC
constexpr std::int64_t kLast = 2147483647;  // 2038-01-19 03:14:07 UTC

std::tm Libc(std::int64_t t) {
  const time_t value = static_cast<time_t>(t);
  std::tm fields{};
  localtime_r(&value, &fields);
  return fields;
}

bool SameClock(const std::tm& a, const std::tm& b) {
  return a.tm_gmtoff == b.tm_gmtoff && a.tm_isdst == b.tm_isdst &&
         std::strcmp(a.tm_zone, b.tm_zone) == 0;
}

void Note(AgreementReport* report, const std::string& what) {
  if (report->mismatches.size() < 8) report->mismatches.push_back(what);
}

void CheckInstant(std::int64_t t, AgreementReport* report) {
  ++report->instants_checked;
  const std::tm e = Libc(t);
  const platform::BrokenDownTime g = platform::BreakDownLocal(t);
  if (g.year == e.tm_year + 1900 && g.month == e.tm_mon + 1 && g.day == e.tm_mday &&
      g.hour == e.tm_hour && g.minute == e.tm_min && g.second == e.tm_sec &&
      g.weekday == e.tm_wday && g.yearday == e.tm_yday && g.utc_offset == e.tm_gmtoff &&
      g.is_dst == (e.tm_isdst > 0) && std::strcmp(g.abbreviation, e.tm_zone) == 0)
    return;
  char text[256];
  std::snprintf(text, sizeof text,
                "breakdown t=%lld glibc %d-%d-%d %d:%d:%d off=%ld dst=%d %s | ours "
                "%d-%d-%d %d:%d:%d off=%d dst=%d %s",
                static_cast<long long>(t), e.tm_year + 1900, e.tm_mon + 1, e.tm_mday,
                e.tm_hour, e.tm_min, e.tm_sec, e.tm_gmtoff, e.tm_isdst, e.tm_zone, g.year,
                g.month, g.day, g.hour, g.minute, g.second, g.utc_offset, g.is_dst,
                g.abbreviation);
  Note(report, text);
}

// Local seconds (counted as if UTC) that a change setting the clocks back makes
// occur twice: [start, end), the earlier reading being `civil - offset`.
struct Fold {
  std::int64_t start, end, offset;
};

// A local time that occurs twice must give its earlier instant, which mktime
// does not promise; any other must give mktime's answer.
void CheckLocalHour(std::int64_t civil, const std::vector<Fold>& folds, std::size_t* next,
                    AgreementReport* report) {
  while (*next < folds.size() && folds[*next].end <= civil) ++*next;
  const std::int64_t ours = platform::ComposeLocal(civil);
  std::int64_t expected = INT64_MIN;
  for (std::size_t i = *next; i < folds.size() && i < *next + 2; ++i) {
    if (folds[i].start <= civil && civil < folds[i].end)
      expected = civil - folds[i].offset;
  }
  if (expected != INT64_MIN) {
    ++report->repeated_hours;
  } else {
    ++report->local_hours_checked;
    const time_t as_utc = static_cast<time_t>(civil);
    std::tm fields{};
    gmtime_r(&as_utc, &fields);
    fields.tm_isdst = -1;
    expected = mktime(&fields);
  }
  if (ours != expected) {
    Note(report, "local time " + std::to_string(civil) + ": ours " +
                     std::to_string(ours) + ", expected " + std::to_string(expected));
  }
}

}  // namespace

AgreementReport CheckAgreementWithGlibc(const char* tz, int step_hours) {
  TzGuard guard(tz);
  AgreementReport report;
  const std::int64_t step = std::int64_t{step_hours} * 3600;
  std::vector<Fold> folds;
  std::tm previous = Libc(kFirst);
  for (std::int64_t t = kFirst; t <= kLast; t += step) {
    CheckInstant(t, &report);
    const std::tm now = Libc(t);
    const bool same = SameClock(now, previous);
    previous = now;
    if (same) continue;
    // Bisect for the change's first instant, and look around it.
    std::int64_t low = t - step, high = t;
    const std::tm at_low = Libc(low);
    while (high - low > 1) {
      const std::int64_t middle = low + (high - low) / 2;
      (SameClock(Libc(middle), at_low) ? low : high) = middle;
    }
    ++report.transitions_found;
    for (const std::int64_t near : {high - 1, high, high + 1})
      CheckInstant(near, &report);
    const std::int64_t before = Libc(high - 1).tm_gmtoff, after = Libc(high).tm_gmtoff;
    if (before > after) folds.push_back({high + after, high + before, before});
  }
  // Local hours from 1970-01-02 to 2038-01-17, clear of the ends of the 32-bit range.
  std::size_t next = 0;
  for (std::int64_t civil = 86400; civil <= kLast - 2 * 86400; civil += step)
    CheckLocalHour(civil, folds, &next, &report);
  return report;
}

std::vector<std::string> SystemZoneNames() {
  namespace fs = std::filesystem;
  const fs::path root = "/usr/share/zoneinfo";
  std::map<std::string, std::string> by_content;  // the first name of each file
  std::error_code error;
  for (auto it = fs::recursive_directory_iterator(root, error);
       it != fs::recursive_directory_iterator(); it.increment(error)) {
    if (error) break;
    const std::string name = fs::relative(it->path(), root, error).generic_string();
    if (it->is_directory() && (name == "posix" || name == "right"))
      it.disable_recursion_pending();
    if (!it->is_regular_file() || name == "posixrules" || name == "localtime") continue;
    std::ostringstream bytes;
    bytes << std::ifstream(it->path(), std::ios::binary).rdbuf();
    if (bytes.str().compare(0, 4, "TZif") != 0) continue;
    auto [found, added] = by_content.emplace(bytes.str(), name);
    if (!added && name < found->second) found->second = name;
  }
  std::vector<std::string> names;
  for (const auto& entry : by_content) names.push_back(entry.second);
  std::sort(names.begin(), names.end());
  return names;
}

}  // namespace datetimelib::testing
