// GenerateDSTDates against the changes that the C library itself makes, in every
// zone of the system tz database whose current rule has daylight saving.
//
// The C library's changes are the instants T at which localtime_r's tm_isdst
// flips, found by stepping 12 hours and bisecting; each belongs to the year of
// the local time just before it. A year agrees when it has one change into
// daylight time, whose local time at T - 1 is our start text, and one out of it,
// whose local time at T - 1 plus one second (T in the offset in force before it)
// is our end text.
//
// GenerateDSTDates applies today's rule to every year, while the C library
// follows each zone's history, so a zone must agree in every year from some year
// on: 2026 at the latest, as today's rule must hold for the years to come. (With
// tzdata 2025b, New York, Berlin, Sydney, Chatham, Dublin and Lord Howe agree
// from 2008, Jerusalem from 2013 and Nuuk from 2024.)
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <ctime>
#include <map>
#include <set>
#include <string>

#include "AdDateTime.h"
#include "support/glibc_agreement.h"
#include "support/tz_guard.h"

namespace {

std::tm Local(std::int64_t unix_seconds) {
  const time_t instant = static_cast<time_t>(unix_seconds);
  std::tm fields{};
  localtime_r(&instant, &fields);
  return fields;
}

bool Dst(std::int64_t unix_seconds) { return Local(unix_seconds).tm_isdst > 0; }

// The last year of 2008-2037 that does not agree in the process's zone, 2007
// when all do.
int LastDifferingYear() {
  constexpr std::int64_t kStep = 12 * 3600;
  const std::int64_t from = 1199145600 - 4 * 86400;  // 2008-01-01 UTC, less 4 days
  std::map<int, int> agreeing_changes;               // by year
  int last = 2007;
  bool dst = Dst(from);
  for (std::int64_t t = from + kStep; t <= INT32_MAX; t += kStep) {
    if (Dst(t) == dst) continue;
    std::int64_t low = t - kStep, high = t;  // flips in (low, high]
    while (high - low > 1) {
      const std::int64_t middle = low + (high - low) / 2;
      (Dst(middle) == dst ? low : high) = middle;
    }
    std::tm fields = Local(low);
    const int year = fields.tm_year + 1900;
    fields.tm_sec += dst ? 1 : 0;  // the end is the change itself
    timegm(&fields);               // normalises the fields, as if UTC
    char libc[32];
    std::strftime(libc, sizeof libc, "%Y-%m-%d %H:%M:%S", &fields);
    std::string start, end;
    AdDateTime::GenerateDSTDates(year, start, end);
    if (libc == (dst ? end : start)) {
      ++agreeing_changes[year];
    } else {
      last = std::max(last, year);
    }
    dst = !dst;
  }
  for (int year = 2037; year > last; --year) {
    if (agreeing_changes[year] != 2) return year;
  }
  return last;
}

TEST(GenerateDSTDates, AgreesWithTheCLibraryInEveryRuleZone) {
  const std::vector<std::string> zones = datetimelib::testing::SystemZoneNames();
  if (zones.empty()) GTEST_SKIP() << "no system zone folder";
  // Palestine suspends daylight time during Ramadan: its zone data lists every
  // change up to 2086 rather than follow its footer rule.
  const std::set<std::string> not_rule_following = {"Asia/Gaza", "Asia/Hebron"};
  int checked = 0;
  for (const std::string& zone : zones) {
    const datetimelib::testing::TzGuard tz(zone.c_str());
    if (!AdDateTime::UsesDST() || not_rule_following.count(zone) != 0) continue;
    ++checked;
    const int last = LastDifferingYear();
    EXPECT_LT(last, 2026) << zone << " differs in " << last;
  }
  std::printf("%d of %zu zones have a daylight-saving rule\n", checked, zones.size());
  EXPECT_GT(checked, 100);
}

}  // namespace
