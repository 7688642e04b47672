// Eight threads calling the whole public API at once, each in its own locale,
// must get exactly what the same calls give when made one thread at a time.
//
// The same threads live through several TZ phases. TZ changes only between
// phases, while every thread waits (setenv may not run beside getenv), so in each
// phase every thread notices the change and compiles its zone again while the
// others do the same.
#include <gtest/gtest.h>

#include <atomic>
#include <condition_variable>
#include <cstdint>
#include <ctime>
#include <functional>
#include <iterator>
#include <mutex>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "AdDateTime.h"
#include "support/fixed_clock.h"
#include "support/temp_dir.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define DATETIMELIB_STRESS_SANITIZED 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define DATETIMELIB_STRESS_SANITIZED 1
#endif
#endif

namespace {

using datetimelib::testing::FixedNow;
using datetimelib::testing::TempDir;
using datetimelib::testing::ThreadLocale;
using datetimelib::testing::TzGuard;

// Sanitizers slow every call tenfold or more; a fifth of the iterations still
// makes several hundred calls per thread and phase.
#ifdef DATETIMELIB_STRESS_SANITIZED
constexpr int kIterations = 12;
#else
constexpr int kIterations = 60;
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

// Zone files with summer time, with winter as the daylight part, a rule string
// with day-of-year changes at odd hours, and no zone rule at all.
constexpr const char* kZones[] = {
    "America/New_York",
    "Europe/Dublin",
    "<+0330>-3:30<+0430>,J79/24,J263/25:30",
    "UTC",
};

// Identifiers for Format(flags, locale): installed ones, the user's and the
// process's defaults, one known but not installed (Russian) and one unknown.
constexpr std::uint32_t kLocaleIds[] = {1033, 2057, 1031, 1036, 1041,
                                        127,  1024, 2048, 1049, 4242};

constexpr const char* kPatterns[] = {
    "%Y-%m-%d %H:%M:%S", "%c %A %B", "%x %X %p %a %b %Z %z %j %U %W", "%e %h %y", "%", "",
};

// Typed dates, with now fixed (Wednesday 2003-01-08 10:00 UTC).
constexpr std::int64_t kNow = 1042020000;
constexpr const char* kTypedTexts[] = {
    "now",
    "today.12:30",
    "yesterday.23:59:59",
    "mon",
    "Sunday",
    "05-Jan",
    "29-Feb.11:00",
    "31-Apr-2003",
    "tomorrow",
    "05-Jan-1969",
    "05-Jan-2003.10:00UTC-1:30",
    "08-JANUARY.9:5 UTC+2",
    "",
    "05-Jan-2003.",
    "10:30:15",
    "18-Jan-2038.23:59:59",
};

// Texts in many locales' forms; each thread's locale reads some and refuses
// others.
constexpr const char* kLocaleTexts[] = {
    "17.05.2003 14:03:09",
    "05/17/2003 02:03:09 PM",
    "17/05/03",
    "2003年05月17日",
    "17 MÄRZ 2003",
    "May 17, 2003",
    "2:30 PM",
    "14:30",
    "30.02.2003",
    "2003-05-17T14:03:09",
    "1969-12-31",
    "2038-01-19 00:00:00",
    "not a date",
    "",
};

constexpr const char kTable[] =
    "# Daylight saving as our region decided it\n"
    "2003-04-06 01:59:59;2003-10-26 02:00:00\n"
    "2004-04-04 01:59:59;2004-10-31 02:00:00\r\n"
    " #2005-01-01 00:00:00;2005-02-01 00:00:00\n"
    "2006-03-26 01:59:59\n"
    ";2007-01-01 00:00:00\n"
    "06.04.2008 01:59:59;26.10.2008 02:00:00\n"
    "04/05/2009 01:59:59;10/25/2009 02:00:00\n"
    "2010-03-28 01:59:59;2010-10-31 02:00:00";

using Transcript = std::vector<std::string>;

// The entry of a table for iteration `i`, round and round.
template <typename T, std::size_t N>
const T& Pick(const T (&table)[N], int i) {
  return table[static_cast<std::size_t>(i) % N];
}

std::string Describe(const AdDateTime& value) {
  return std::to_string(value.GetStatus()) + "/" +
         std::to_string(value.GetCTime().GetTime()) + "/" + value.Format("%F %T") + "/" +
         value.FormatTolvane();
}

std::string Describe(const AdDuration& span) {
  return std::to_string(span.GetDays()) + "d" + std::to_string(span.GetHours()) + "h" +
         std::to_string(span.GetMinutes()) + "m" + std::to_string(span.GetSeconds()) +
         "s";
}

// A count from the whole range, fixed by thread and iteration.
std::int32_t CountFor(std::size_t thread, int iteration) {
  std::uint64_t x = std::uint64_t{thread} * 0x9E3779B97F4A7C15u +
                    static_cast<std::uint64_t>(iteration) * 0xBF58476D1CE4E5B9u;
  x ^= x >> 31;
  x *= 0x94D049BB133111EBu;
  x ^= x >> 29;
  return static_cast<std::int32_t>(x & 0x7FFFFFFFu);
}

void WriteAndRead(const AdDateTime& value, const ThreadPlan& plan, int i,
                  Transcript* out) {
  for (const char* pattern : kPatterns) {
    out->push_back(value.Format(pattern));
    out->push_back(value.FormatGMT(pattern));
  }
  std::string reused;
  value.FormatInto(reused, "%A %d %B %Y");
  out->push_back(reused);
  value.FormatGMTInto(reused, "%c");
  out->push_back(reused);
  value.FormatTolvaneInto(reused);
  out->push_back(reused);
  for (std::uint32_t flags : {0u, 1u, 2u}) {
    out->push_back(value.Format(flags, Pick(kLocaleIds, i + static_cast<int>(flags))));
  }

  // What this thread's locale writes, read back in it, as local time and as UTC.
  AdDateTime reader;
  const std::string texts[] = {value.Format("%Y-%m-%d %H:%M:%S"),
                               value.Format("%Y-%m-%d %H:%M:%S") + ".250",
                               value.Format(AdDateTime::dateAndTime, plan.locale_id),
                               value.Format("%d %B %Y"), value.Format("%b %d, %Y")};
  for (const std::string& text : texts) {
    out->push_back(std::to_string(reader.ParseDateTime(text.c_str())) + Describe(reader));
    out->push_back(std::to_string(reader.ParseDateTimeGMT(text.c_str())) +
                   Describe(reader));
  }
  const char* other = Pick(kLocaleTexts, i);
  out->push_back(std::to_string(reader.ParseDateTime(other)) + Describe(reader));
  out->push_back(std::to_string(reader.ParseDateTimeGMT(other)) + Describe(reader));

  reader.ParseTolvaneDateTime(value.FormatTolvane().c_str());
  out->push_back(Describe(reader));
  reader.ParseTolvaneDateTime(Pick(kTypedTexts, i));
  out->push_back(Describe(reader));
}

void FieldsAndArithmetic(const AdDateTime& value, int i, Transcript* out) {
  const long year = value.GetYear();
  out->push_back(
      std::to_string(year) + " " + std::to_string(value.GetMonth()) + " " +
      std::to_string(value.GetDay()) + " " + std::to_string(value.GetHour()) + " " +
      std::to_string(value.GetMinute()) + " " + std::to_string(value.GetSecond()) + " " +
      std::to_string(value.GetDayOfWeek()) + " " + std::to_string(value.GetDayOfYear()) +
      " " + std::to_string(value.IsLeapYear()) + " " +
      std::to_string(value.GetDaysInMonth()));

  // Local times around the spring and autumn changes of the northern zones,
  // carried fields, and fields out of range.
  out->push_back(Describe(AdDateTime(year, 3, 8 + i % 7, 2, 30, 0)));
  out->push_back(Describe(AdDateTime(year, 10, 25 + i % 7, 1, 30, 0)));
  out->push_back(Describe(AdDateTime(year, 13, 0, 25, -1, 61)));
  out->push_back(Describe(AdDateTime(1899, 12, 30, i % 24, 7, 9)));
  out->push_back(Describe(AdDateTime(2038 + i % 2, 1, 18 + i % 3, 23, 0, 0)));
  AdDateTime set;
  set.SetDate(static_cast<int>(year), 2, 29);
  out->push_back(Describe(set));
  set.SetTime(i % 30, 0, 0);
  out->push_back(Describe(set));
  std::tm fields{};
  fields.tm_year = static_cast<int>(year) - 1900;
  fields.tm_mon = i % 12;
  fields.tm_mday = 1 + i % 31;
  set.SetOleDateTime(fields);
  out->push_back(Describe(set));

  const AdDateTime later = value + AdDuration(1.5);
  const AdDateTime earlier = value - AdDuration(0, 25, 0, 1);
  out->push_back(Describe(later) + Describe(earlier) + Describe(later - earlier));
  out->push_back(std::to_string(later > earlier) + std::to_string(later <= value) +
                 std::to_string(earlier == value) + std::to_string(earlier != value));
  AdDateTime moved = value;
  moved += AdDuration::FromSeconds(i * 3607);
  moved -= AdDuration(0.25);
  out->push_back(Describe(moved));

  out->push_back(Describe(value.GetWeekStartDate()) + Describe(value.GetWeekEndDate()));
  out->push_back(Describe(GetWeekStartDate(year, value.GetMonth(), i % 40)) +
                 Describe(GetWeekEndDate(1970 + i % 70, 1, 1)));
}

void ZoneQuestions(const std::string& table_folder, int i, Transcript* out) {
  out->push_back(std::to_string(AdDateTime::GetGMTOffset()) + " " +
                 std::to_string(AdDateTime::UsesDST()) + " " +
                 Describe(AdDateTime::GetTickCount()));
  const int year = 1969 + (i * 7) % 72;
  std::string start, end;
  const int generated = AdDateTime::GenerateDSTDates(year, start, end);
  out->push_back(std::to_string(generated) + start + ";" + end);
  const int table_year = 2002 + i % 10;
  const int read = AdDateTime::GetDSTDates(table_folder.c_str(), table_year, start, end);
  out->push_back(std::to_string(read) + start + ";" + end);
}

// The same calls in the same order, whichever thread makes them.
Transcript RunScript(std::size_t thread, const std::string& table_folder) {
  const ThreadPlan& plan = kPlans[thread];
  // A weekday and a month name: what each locale writes differently.
  Transcript out{AdDateTime(AdTime(0)).Format("%A %B")};
  for (int i = 0; i < kIterations; ++i) {
    const AdDateTime value{AdTime(CountFor(thread, i))};
    WriteAndRead(value, plan, i, &out);
    FieldsAndArithmetic(value, i, &out);
    ZoneQuestions(table_folder, i, &out);
  }
  return out;
}

// Threads that each install their locale once and then run one job per phase,
// all released together.
class PhasedThreads {
 public:
  explicit PhasedThreads(std::function<void(std::size_t thread)> job)
      : job_(std::move(job)) {
    for (std::size_t t = 0; t < kThreads; ++t)
      threads_.emplace_back([this, t] { Loop(t); });
  }
  ~PhasedThreads() {
    {
      const std::lock_guard<std::mutex> lock(mutex_);
      stopping_ = true;
    }
    wake_.notify_all();
    for (std::thread& thread : threads_) thread.join();
  }
  PhasedThreads(const PhasedThreads&) = delete;
  PhasedThreads& operator=(const PhasedThreads&) = delete;

  // Runs the job once on every thread and returns when all are done.
  void RunPhase() {
    std::unique_lock<std::mutex> lock(mutex_);
    finished_ = 0;
    started_.store(0);
    ++phase_;
    wake_.notify_all();
    done_.wait(lock, [this] { return finished_ == kThreads; });
  }

  bool all_locales_installed() const { return locales_installed_.load() == kThreads; }

 private:
  void Loop(std::size_t thread) {
    const ThreadLocale locale(kPlans[thread].locale);
    if (locale.ok()) locales_installed_.fetch_add(1);
    int seen = 0;
    for (;;) {
      {
        std::unique_lock<std::mutex> lock(mutex_);
        wake_.wait(lock, [&] { return stopping_ || phase_ != seen; });
        if (stopping_) return;
        seen = phase_;
      }
      // Wait for the others, so that the phase's first calls overlap too.
      started_.fetch_add(1);
      while (started_.load() < kThreads) std::this_thread::yield();
      job_(thread);
      {
        const std::lock_guard<std::mutex> lock(mutex_);
        ++finished_;
      }
      done_.notify_one();
    }
  }

  std::function<void(std::size_t)> job_;
  std::mutex mutex_;
  std::condition_variable wake_, done_;
  int phase_ = 0;
  std::size_t finished_ = 0;
  bool stopping_ = false;
  std::atomic<std::size_t> started_{0};
  std::atomic<std::size_t> locales_installed_{0};
  std::vector<std::thread> threads_;
};

TEST(ThreadStress, ConcurrentCallsAgreeWithOneThreadAtATime) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const TempDir folder;
  ASSERT_TRUE(folder.ok());
  folder.Write("dst_dates.dat", kTable);
  const FixedNow now(kNow);
  const TzGuard restore_tz(nullptr);

  std::vector<Transcript> concurrent(kThreads);
  PhasedThreads threads(
      [&](std::size_t thread) { concurrent[thread] = RunScript(thread, folder.path()); });

  // Twice round, so that every thread also goes back to a zone it had before.
  for (int phase = 0; phase < 2 * static_cast<int>(std::size(kZones)); ++phase) {
    const char* zone = Pick(kZones, phase);
    SCOPED_TRACE(zone);
    TzGuard::Set(zone);
    // The threads go first, so that they find the new TZ before any other thread
    // of the process has compiled it.
    threads.RunPhase();
    ASSERT_TRUE(threads.all_locales_installed());

    std::vector<Transcript> alone;
    for (std::size_t t = 0; t < kThreads; ++t) {
      const ThreadLocale locale(kPlans[t].locale);
      ASSERT_TRUE(locale.ok()) << kPlans[t].locale;
      alone.push_back(RunScript(t, folder.path()));
    }
    // German and English must write differently, or the locales are not in play.
    ASSERT_NE(alone[0].front(), alone[2].front());

    for (std::size_t t = 0; t < kThreads; ++t) {
      SCOPED_TRACE(kPlans[t].locale);
      ASSERT_EQ(concurrent[t].size(), alone[t].size());
      for (std::size_t k = 0; k < alone[t].size(); ++k) {
        ASSERT_EQ(concurrent[t][k], alone[t][k])
            << "thread " << t << ", entry " << k << " of " << alone[t].size();
      }
    }
  }
}

}  // namespace
