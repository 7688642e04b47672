#include "support/test_locales.h"

namespace datetimelib::testing {
namespace {

// Runs before main, while the process has one thread: LOCPATH is read by
// every newlocale, and setenv must not race with it.
[[maybe_unused]] const bool kLocalePathSet = [] {
#ifdef DATETIMELIB_TEST_LOCALE_DIR
  setenv("LOCPATH", DATETIMELIB_TEST_LOCALE_DIR, 1);
#endif
  return true;
}();

}  // namespace

bool TestLocalesAvailable() {
  const locale_t locale = newlocale(LC_ALL_MASK, "ja_JP.UTF-8", nullptr);
  if (locale == nullptr) return false;
  freelocale(locale);
  return true;
}

}  // namespace datetimelib::testing

// glibc 2.36 newlocale does not free the search path it builds from LOCPATH
// (newlocale.c, __argz_add_sep), a few dozen bytes per call; the tests set
// LOCPATH, so LeakSanitizer would blame every test that opens a locale. Only
// that allocation is excused: a locale object never freed is still reported.
extern "C" const char*
__lsan_default_suppressions() {  // NOLINT(bugprone-reserved-identifier)
  return "leak:__argz_add_sep\n";
}
