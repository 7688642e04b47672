// Sets an environment variable for the lifetime of the guard and restores it.
#ifndef DATETIMELIB_TESTS_SUPPORT_ENV_GUARD_H_
#define DATETIMELIB_TESTS_SUPPORT_ENV_GUARD_H_

#include <cstdlib>
#include <optional>
#include <string>

namespace datetimelib::testing {

class EnvGuard {
 public:
  // A null value unsets the variable.
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

#endif  // DATETIMELIB_TESTS_SUPPORT_ENV_GUARD_H_
