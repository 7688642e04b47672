// Eight threads calling the whole public API at once, each in its own locale,
// must get exactly what the same calls give when made one thread at a time.
//
// TZ changes only between rounds, while no thread runs (setenv may not run
// beside getenv).
#include <gtest/gtest.h>

#include <cstdint>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

#include "AdDateTime.h"
#include "support/fixed_clock.h"
#include "support/temp_dir.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::ThreadLocale;
using datetimelib::testing::TzGuard;

// Sanitizers slow every call tenfold or more.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr int kIterations = 12;
#else
constexpr int kIterations = 40;
#endif

struct ThreadPlan {
  const char* locale;       // installed on the thread with uselocale
  std::uint32_t locale_id;  // the same locale by identifier
};
constexpr ThreadPlan kPlans[] = {
    {"de_DE.UTF-8", 1031}, {"en_GB.UTF-8", 2057}, {"en_US.UTF-8", 1033},
    {"fr_FR.UTF-8", 1036}, {"ja_JP.UTF-8", 1041}, {"C", 127},
    {"de_DE.UTF-8", 1031}, {"ja_JP.UTF-8", 1041},
};
constexpr std::size_t kThreads = std::size(kPlans);

// Summer time, winter as the daylight part, a rule string, no rule at all.
constexpr const char* kZones[] = {"America/New_York", "Europe/Dublin",
                                  "<+0330>-3:30<+0430>,J79/24,J263/25:30", "UTC"};
// Installed locales, the defaults, one not installed (Russian), one unknown.
constexpr std::uint32_t kLocaleIds[] = {1033, 2057, 1031, 1036, 1041,
                                        127,  1024, 2048, 1049, 4242};
constexpr const char* kPatterns[] = {"%Y-%m-%d %H:%M:%S", "%c %A %B",
                                     "%x %X %p %a %b %Z %z %j %U %W", "%e %h %y", "%"};
constexpr const char* kTypedTexts[] = {
    "now",      "yesterday.23:59:59",       "mon", "29-Feb.11:00", "31-Apr-2003",
    "10:30:15", "05-Jan-2003.10:00UTC-1:30"};
constexpr const char* kLocaleTexts[] = {"17.05.2003 14:03:09", "05/17/2003 02:03:09 PM",
                                        "2003年05月17日",      "17 MÄRZ 2003",
                                        "May 17, 2003",        "2:30 PM",
                                        "30.02.2003",          "not a date"};
constexpr const char kTable[] =
    "2003-04-06 01:59:59;2003-10-26 02:00:00\n"
    "06.04.2008 01:59:59;26.10.2008 02:00:00\n"
    "2010-03-28 01:59:59;2010-10-31 02:00:00";

using Transcript = std::vector<std::string>;

template <typename T, std::size_t N>
const T& Pick(const T (&table)[N], int i) {
  return table[static_cast<std::size_t>(i) % N];
}

std::string Describe(const AdDateTime& value) {
  return std::to_string(value.GetStatus()) + "/" +
         std::to_string(value.GetCTime().GetTime()) + "/" + value.Format("%F %T");
}

// A count from the whole range, fixed by thread and iteration.
std::int32_t CountFor(std::size_t thread, int iteration) {
  const std::uint64_t x =
      (thread * 40 + static_cast<std::uint64_t>(iteration)) * 0x9E3779B97F4A7C15u;
  return static_cast<std::int32_t>((x >> 33) & 0x7FFFFFFFu);
}

// Every formatter, parser, field and zone question, the same calls in the same
// order whichever thread makes them.
Transcript RunScript(std::size_t thread, const std::string& table_folder) {
  Transcript out{AdDateTime(AdTime(0)).Format("%A %B")};
  const auto add = [&out](const AdDateTime& value) { out.push_back(Describe(value)); };
  for (int i = 0; i < kIterations; ++i) {
    const AdDateTime value{AdTime(CountFor(thread, i))};
    for (const char* pattern : kPatterns) {
      out.push_back(value.Format(pattern) + "|" + value.FormatGMT(pattern));
    }
    std::string into;
    value.FormatTolvaneInto(into);
    out.push_back(into +
                  value.Format(static_cast<std::uint32_t>(i % 3), Pick(kLocaleIds, i)));

    AdDateTime reader;
    for (const std::string& text :
         {value.Format("%Y-%m-%d %H:%M:%S") + ".250",
          value.Format(AdDateTime::dateAndTime, kPlans[thread].locale_id),
          value.Format("%d %B %Y"), std::string(Pick(kLocaleTexts, i))}) {
      out.push_back(std::to_string(reader.ParseDateTime(text.c_str())) +
                    Describe(reader));
      out.push_back(std::to_string(reader.ParseDateTimeGMT(text.c_str())) +
                    Describe(reader));
    }
    reader.ParseTolvaneDateTime(value.FormatTolvane().c_str());
    add(reader);
    reader.ParseTolvaneDateTime(Pick(kTypedTexts, i));
    add(reader);

    const long year = value.GetYear();
    out.push_back(std::to_string(value.GetDayOfWeek() + 10 * value.GetDayOfYear()) +
                  std::to_string(value.IsLeapYear() + 10 * value.GetDaysInMonth()));
    add(AdDateTime(year, 3, 8 + i % 7, 2, 30, 0));  // around the changes
    add(AdDateTime(year, 10, 25 + i % 7, 1, 30, 0));
    AdDateTime set;
    set.SetDate(static_cast<int>(year), 2, 29);
    set.SetTime(i % 30, 0, 0);
    add(set);
    add(value.GetWeekStartDate());
    add(GetWeekEndDate(year, value.GetMonth(), i % 40));

    std::string start, end;
    const int generated = AdDateTime::GenerateDSTDates(1969 + (i * 7) % 72, start, end);
    out.push_back(std::to_string(AdDateTime::GetGMTOffset()) +
                  std::to_string(AdDateTime::UsesDST() + 10 * generated) + start + end);
    const int read =
        AdDateTime::GetDSTDates(table_folder.c_str(), 2002 + i % 10, start, end);
    out.push_back(std::to_string(read) + start + end +
                  Describe(AdDateTime::GetTickCount()));
  }
  return out;
}

TEST(ThreadStress, ConcurrentCallsAgreeWithOneThreadAtATime) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  folder.Write("dst_dates.dat", kTable);
  const datetimelib::testing::FixedNow now(1042020000);
  const TzGuard restore_tz(nullptr);
  for (const char* zone : kZones) {
    TzGuard::Set(zone);
    // The threads go first, so that they compile the new zone side by side.
    std::vector<Transcript> concurrent(kThreads);
    std::vector<std::thread> threads;
    for (std::size_t t = 0; t < kThreads; ++t) {
      threads.emplace_back([&, t] {
        const ThreadLocale locale(kPlans[t].locale);
        if (locale.ok()) concurrent[t] = RunScript(t, folder.path());
      });
    }
    for (std::thread& thread : threads) thread.join();
    std::vector<Transcript> alone;
    for (std::size_t t = 0; t < kThreads; ++t) {
      const ThreadLocale locale(kPlans[t].locale);
      alone.push_back(RunScript(t, folder.path()));
      ASSERT_EQ(concurrent[t], alone[t]) << zone << ", " << kPlans[t].locale;
    }
    // German and English must write differently, or the locales are not in play.
    EXPECT_NE(alone[0].front(), alone[2].front());
  }
}

}  // namespace
