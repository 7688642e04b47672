#include "platform/tz_watch.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace {

using datetimelib::platform::TzWatch;

// Saves the whole environment and puts it back, whatever a test did to it.
class EnvironmentGuard {
 public:
  EnvironmentGuard() {
    for (char** entry = environ; entry != nullptr && *entry != nullptr; ++entry) {
      saved_.emplace_back(*entry);
    }
  }
  ~EnvironmentGuard() {
    clearenv();
    for (const std::string& entry : saved_) {
      const std::size_t equals = entry.find('=');
      setenv(entry.substr(0, equals).c_str(), entry.substr(equals + 1).c_str(), 1);
    }
  }

 private:
  std::vector<std::string> saved_;
};

// Each step changes the environment one way; the watch must notice it, and after
// a refresh report TZ as getenv does.
TEST(TzWatch, NoticesEveryWayTzChanges) {
  EnvironmentGuard guard;
  TzWatch watch;
  EXPECT_FALSE(watch.Unchanged());  // nothing read yet

  setenv("TZ", "UTC", 1);
  watch.Refresh();
  EXPECT_TRUE(watch.Unchanged());
  EXPECT_EQ(watch.value(), "UTC");

  const struct {
    const char* what;
    void (*change)();
    const char* tz;  // getenv("TZ") afterwards; nullptr when unset
  } steps[] = {
      {"setenv TZ", [] { setenv("TZ", "Europe/Berlin", 1); }, "Europe/Berlin"},
      {"unsetenv TZ", [] { unsetenv("TZ"); }, nullptr},
      {"setenv another, TZ unset", [] { setenv("DATETIMELIB_OTHER", "1", 1); }, nullptr},
      {"setenv TZ again", [] { setenv("TZ", "Asia/Tokyo", 1); }, "Asia/Tokyo"},
      {"unsetenv one before TZ", [] { unsetenv("DATETIMELIB_OTHER"); }, "Asia/Tokyo"},
      {"clearenv, then TZ alone",
       [] {
         clearenv();
         setenv("TZ", "America/New_York", 1);
       },
       "America/New_York"},
  };
  for (const auto& step : steps) {
    SCOPED_TRACE(step.what);
    ASSERT_TRUE(watch.Unchanged());
    step.change();
    if (watch.value() != (step.tz ? std::optional<std::string>(step.tz) : std::nullopt)) {
      EXPECT_FALSE(watch.Unchanged());
    }
    watch.Refresh();
    EXPECT_TRUE(watch.Unchanged());
    const char* expected = std::getenv("TZ");
    EXPECT_EQ(watch.value().has_value(), expected != nullptr);
    if (expected != nullptr) {
      EXPECT_EQ(*watch.value(), expected);
    }
  }
}

// A putenv string that is TZ's own entry, changed in place, is seen.
TEST(TzWatch, SeesTzOwnEntryChangedInPlace) {
  EnvironmentGuard guard;
  static char entry[] = "TZ=UTC0";
  putenv(entry);
  TzWatch watch;
  watch.Refresh();
  EXPECT_TRUE(watch.Unchanged());
  std::memcpy(entry, "TZ=EST5", 7);
  EXPECT_FALSE(watch.Unchanged());
  unsetenv("TZ");  // before `entry` goes away with the guard
}

// The environment shrinks to one entry while the watch remembers forty; under
// AddressSanitizer this shows that nothing beyond the new array is read.
TEST(TzWatch, ShrunkenEnvironmentIsNotOverread) {
  EnvironmentGuard guard;
  for (int i = 0; i < 40; ++i)
    setenv(("DATETIMELIB_V" + std::to_string(i)).c_str(), "x", 1);
  unsetenv("TZ");
  TzWatch watch;
  watch.Refresh();
  for (int round = 0; round < 50; ++round) {
    clearenv();
    setenv("A", "1", 1);
    EXPECT_FALSE(watch.Unchanged());
  }
}

}  // namespace
