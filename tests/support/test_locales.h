// Real locales for the tests: compiled into the build folder by
// tests/CMakeLists.txt (de_DE, en_GB, en_US, fr_FR and ja_JP, all UTF-8), found
// through LOCPATH, which the test binary sets before any test runs.
#ifndef DATETIMELIB_TESTS_SUPPORT_TEST_LOCALES_H_
#define DATETIMELIB_TESTS_SUPPORT_TEST_LOCALES_H_

#include <gtest/gtest.h>
#include <locale.h>

#include <cstdlib>
#include <optional>
#include <string>

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

// Sets (or, for nullptr, unsets) one environment variable for the lifetime of
// the guard, and restores it.
class EnvGuard {
 public:
  EnvGuard(const char* name, const char* value) : name_(name) {
    if (const char* old = std::getenv(name)) saved_ = old;
    Set(value);
  }
  ~EnvGuard() { Set(saved_ ? saved_->c_str() : nullptr); }
  EnvGuard(const EnvGuard&) = delete;
  EnvGuard& operator=(const EnvGuard&) = delete;

 private:
  void Set(const char* value) {
    if (value == nullptr) {
      unsetenv(name_.c_str());
    } else {
      setenv(name_.c_str(), value, 1);
    }
  }

  std::string name_;
  std::optional<std::string> saved_;
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TEST_LOCALES_H_
