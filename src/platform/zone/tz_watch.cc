#include "platform/zone/tz_watch.h"

#include <unistd.h>

#include <cstdint>
#include <cstring>

namespace datetimelib::platform {
namespace {

// Whether the n bytes at a and b are equal, reading each byte of both once at
// most and none beyond the n: words of eight, the last one overlapping the one
// before. Zone names are short, and this costs less than a call to memcmp.
bool SameBytes(const char* a, const char* b, std::size_t n) {
  if (n < sizeof(std::uint64_t)) {
    for (std::size_t i = 0; i < n; ++i) {
      if (a[i] != b[i]) return false;
    }
    return true;
  }
  const auto word = [](const char* p) {
    std::uint64_t w;
    std::memcpy(&w, p, sizeof w);
    return w;
  };
  std::uint64_t differ = 0;
  for (std::size_t i = 0; i + sizeof(std::uint64_t) < n; i += sizeof(std::uint64_t)) {
    differ |= word(a + i) ^ word(b + i);
  }
  const std::size_t last = n - sizeof(std::uint64_t);
  return (differ | (word(a + last) ^ word(b + last))) == 0;
}

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
  // TZ's own text may have been changed in place (a string given to putenv).
  // Its entry is the same pointer as at Refresh(), so the value's bytes and its
  // NUL were there to read then and still are: a text changed in place keeps
  // its buffer.
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
