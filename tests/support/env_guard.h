// Sets an environment variable for the lifetime of the guard and restores it.
#ifndef DATETIMELIB_TESTS_SUPPORT_ENV_GUARD_H_
#define DATETIMELIB_TESTS_SUPPORT_ENV_GUARD_H_

#include <cstdlib>
#include <optional>
#include <string>

namespace datetimelib::testing {

class EnvGuard {
 public:
  // A null value unsets the variable; `after` runs after each change.
  EnvGuard(const char* name, const char* value, void (*after)() = nullptr)
      : name_(name), after_(after) {
    if (const char* old = std::getenv(name)) saved_ = old;
    Set(name, value, after);
  }
  ~EnvGuard() { Set(name_.c_str(), saved_ ? saved_->c_str() : nullptr, after_); }
  EnvGuard(const EnvGuard&) = delete;
  EnvGuard& operator=(const EnvGuard&) = delete;

  static void Set(const char* name, const char* value, void (*after)()) {
    value == nullptr ? unsetenv(name) : setenv(name, value, 1);
    if (after != nullptr) after();
  }

 private:
  std::string name_;
  void (*after_)();
  std::optional<std::string> saved_;
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_ENV_GUARD_H_
