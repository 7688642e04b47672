// A thread's compiled zone must outlive everything the thread runs as it ends:
// the destructors of its thread_local objects, and on the main thread the
// handlers that exit() runs.
#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <thread>

#include "AdDateTime.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

constexpr char kPattern[] = "%F %T %Z";

std::string LocalText() { return AdDateTime(AdTime(1000000000)).Format(kPattern); }

// Asks for local time from its destructor, when `out` is set.
struct FormatsAtThreadEnd {
  std::string* out = nullptr;
  ~FormatsAtThreadEnd() {
    if (out != nullptr) *out = LocalText();
  }
};
thread_local FormatsAtThreadEnd formats_at_thread_end;

TEST(ThreadEnd, ThreadLocalDestructorMayAskForLocalTime) {
  const TzGuard tz("America/New_York");
  std::string during, at_end;
  std::thread([&] {
    // Made before the thread's first call, so destroyed after anything the
    // library keeps in thread_local objects of its own.
    formats_at_thread_end.out = &at_end;
    during = LocalText();
  }).join();
  EXPECT_EQ(during, "2001-09-08 21:46:40 EDT");
  EXPECT_EQ(at_end, during);
}

TEST(ThreadEndDeathTest, ExitHandlerMayAskForLocalTime) {
  EXPECT_EXIT(
      {
        TzGuard::Set("America/New_York");
        std::fprintf(stderr, "before exit %s\n", LocalText().c_str());
        std::atexit([] { std::fprintf(stderr, "at exit %s\n", LocalText().c_str()); });
        std::exit(0);
      },
      ::testing::ExitedWithCode(0),
      "before exit 2001-09-08 21:46:40 EDT\nat exit 2001-09-08 21:46:40 EDT");
}

}  // namespace
