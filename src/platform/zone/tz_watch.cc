#include "platform/zone/tz_watch.h"

#include <unistd.h>

#include <cstring>

namespace datetimelib::platform {
namespace {

bool IsTzEntry(const char* entry) {
  return entry[0] == 'T' && entry[1] == 'Z' && entry[2] == '=';
}

}  // namespace

bool TzWatch::Unchanged() const {
  char** const current = environ;
  if (current == nullptr || current != environment_) return false;
  const std::size_t count = entries_.size();
  for (std::size_t i = 0; i < count; ++i) {
    if (current[i] != entries_[i]) return false;
  }
  if (!value_) return current[count] == nullptr;
  // TZ's own text may have been changed in place; strncmp stops at its end.
  const char* text = entries_[count - 1] + 3;
  const std::size_t length = value_->size();
  return std::strncmp(value_->data(), text, length) == 0 && text[length] == '\0';
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
