// Real locales for the tests: compiled into the build folder by
// tests/CMakeLists.txt (those of the locale identifiers and a few more, all
// UTF-8), found through LOCPATH, which the test binary sets before any test
// runs.
#ifndef DATETIMELIB_TESTS_SUPPORT_TEST_LOCALES_H_
#define DATETIMELIB_TESTS_SUPPORT_TEST_LOCALES_H_

#include <gtest/gtest.h>
#include <locale.h>

namespace datetimelib::testing {

// Whether the compiled test locales can be opened.
bool TestLocalesAvailable();

// Skips the calling test where the test locales were not compiled.
#define DATETIMELIB_NEED_TEST_LOCALES()                                     \
  if (!::datetimelib::testing::TestLocalesAvailable()) {                    \
    GTEST_SKIP() << "test locales not compiled (localedef and the locales " \
                    "package are needed)";                                  \
  }

// Installs a locale on the calling thread for the lifetime of the guard
// (uselocale), and puts the thread's previous locale back.
class ThreadLocale {
 public:
  explicit ThreadLocale(const char* name)
      : locale_(newlocale(LC_ALL_MASK, name, nullptr)),
        previous_(locale_ != nullptr ? uselocale(locale_) : nullptr) {}
  ~ThreadLocale() {
    if (locale_ == nullptr) return;
    uselocale(previous_);
    freelocale(locale_);
  }
  ThreadLocale(const ThreadLocale&) = delete;
  ThreadLocale& operator=(const ThreadLocale&) = delete;

  bool ok() const { return locale_ != nullptr; }

 private:
  locale_t locale_;
  locale_t previous_;
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TEST_LOCALES_H_
