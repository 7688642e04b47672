#include "platform/zone/tz_watch.h"

namespace datetimelib::platform {
namespace {

bool IsTzEntry(const char* entry) {
  return entry[0] == 'T' && entry[1] == 'Z' && entry[2] == '=';
}

// The environment array the process started with; written once, before main or
// before dlopen returns, and only read afterwards.
char** initial_environment = nullptr;

#if defined(__GLIBC__)
// glibc calls the functions of .init_array with argc, argv and envp, in the
// executable and in every shared library, also one opened later with dlopen.
// envp is `environ` as it is then, but the kernel placed the first environment
// array just after argv's terminating null, and argv is always the original.
void RecordInitialEnvironment(int argc, char** argv, char** /*envp*/) {
  if (argv != nullptr && argc >= 0) initial_environment = argv + argc + 1;
}
__attribute__((section(".init_array"), used)) void (*const record_initial_environment)(
    int, char**, char**) = &RecordInitialEnvironment;
#endif

}  // namespace

TzWatch::TzWatch() : lasting_(initial_environment) {}

// Every case but the inline one: another array, or the lasting one with TZ unset.
bool TzWatch::UnchangedAnyArray() const {
  char** const current = environ;
  if (current == nullptr || current != environment_) return false;
  if (current == lasting_)
    return true;  // TZ unset there: it can only come in a new array
  const std::size_t count = entries_.size();
  for (std::size_t i = 0; i < count; ++i) {
    if (current[i] != entries_[i]) return false;
  }
  if (!value_) return current[count] == nullptr;
  return SameBytes(entries_[count - 1] + 3, value_->c_str(), value_->size() + 1);
}

void TzWatch::Refresh() {
  environment_ = environ;
  entries_.clear();
  value_.reset();
  if (environment_ == nullptr) return;
  for (char** entry = environment_; *entry != nullptr; ++entry) {
    entries_.push_back(*entry);
    if (IsTzEntry(*entry)) {
      value_ = std::string(*entry + 3);
      return;
    }
  }
}

}  // namespace datetimelib::platform
