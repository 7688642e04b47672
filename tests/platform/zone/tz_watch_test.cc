#include "platform/zone/tz_watch.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstring>
#include <string>
#include <vector>

namespace {

using datetimelib::platform::TzWatch;

// Saves the whole environment and puts it back, whatever a test did to it.
struct EnvironmentGuard {
  std::vector<std::string> saved;
  EnvironmentGuard() {
    for (char** entry = environ; *entry != nullptr; ++entry) saved.emplace_back(*entry);
  }
  ~EnvironmentGuard() {
    clearenv();
    for (const std::string& entry : saved) {
      const std::size_t equals = entry.find('=');
      setenv(entry.substr(0, equals).c_str(), entry.c_str() + equals + 1, 1);
    }
  }
};

struct Step {
  void (*change)();
  const char* tz;  // afterwards
};

// Before each step TZ reads as the watch last saw it; after it, the watch must
// notice the change and, refreshed, report TZ's new value.
void ExpectEachStepNoticed(TzWatch* watch, const std::vector<Step>& steps) {
  for (const Step& step : steps) {
    ASSERT_TRUE(watch->Unchanged());
    step.change();
    EXPECT_FALSE(watch->Unchanged()) << step.tz;
    watch->Refresh();
    EXPECT_EQ(watch->value().value_or("(unset)"), step.tz);
  }
}

char tz_entry[] = "TZ=UTC0";  // given to putenv, then changed in place
char long_tz_entry[] = "TZ=America/Argentina/Buenos_Aires";  // likewise, by word

// Each step changes TZ in one of the ways the rest of the suite does not (there,
// TZ is set over a TZ already set); the watch must notice it, and after a
// refresh report TZ's new value.
TEST(TzWatch, NoticesEveryWayTzChanges) {
  EnvironmentGuard guard;
  unsetenv("TZ");
  TzWatch watch;
  EXPECT_FALSE(watch.Unchanged());  // nothing read yet
  watch.Refresh();
  const std::vector<Step> steps = {
      // setenv while unset: an entry past the end of the one read.
      {[] { setenv("TZ", "UTC", 1); }, "UTC"},
      // putenv: another string in TZ's place.
      {[] { putenv(tz_entry); }, "UTC0"},
      // putenv's string changed in place.
      {[] { std::memcpy(tz_entry, "TZ=EST5", 7); }, "EST5"},
      // A longer value changed in place: its first, a middle and its last byte,
      // then cut short.
      {[] { putenv(long_tz_entry); }, "America/Argentina/Buenos_Aires"},
      {[] { long_tz_entry[3] = 'a'; }, "america/Argentina/Buenos_Aires"},
      {[] { long_tz_entry[3 + 12] = 'e'; }, "america/Argeetina/Buenos_Aires"},
      {[] { long_tz_entry[3 + 29] = 'S'; }, "america/Argeetina/Buenos_AireS"},
      {[] { long_tz_entry[3 + 16] = '\0'; }, "america/Argeetin"},
      // unsetenv: nothing left of the value read before.
      {[] { unsetenv("TZ"); }, "(unset)"},
  };
  ExpectEachStepNoticed(&watch, steps);
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

// The environment the process started with is never freed, and the watch reads
// only TZ's slot of it. Here a static array stands in for it.
char lasting_a[] = "A=1";
char lasting_tz[] = "TZ=Europe/Lisbon";
char lasting_b[] = "B=2";
char* lasting[] = {lasting_a, lasting_tz, lasting_b, nullptr};

TEST(TzWatch, ReadsOnlyTzsSlotOfTheFirstEnvironment) {
  EnvironmentGuard guard;
  clearenv();  // frees glibc's own array, if it had one, before `environ` moves
  environ = lasting;
  TzWatch watch(lasting);
  watch.Refresh();
  const std::vector<Step> steps = {
      {[] { lasting_tz[3 + 12] = 'X'; }, "Europe/LisboX"},
      // unsetenv moves the later entries down in place: TZ leaves its slot.
      {[] { unsetenv("A"); }, "Europe/LisboX"},
      {[] { unsetenv("TZ"); }, "(unset)"},
      // Adding copies the array.
      {[] { setenv("TZ", "UTC", 1); }, "UTC"},
  };
  ExpectEachStepNoticed(&watch, steps);
}

}  // namespace
