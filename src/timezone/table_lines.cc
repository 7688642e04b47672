#include "timezone/table_lines.h"

#include <cstring>
#include <utility>

namespace datetimelib {
namespace {

bool DropCarriageReturn(std::string* line) {
  if (!line->empty() && line->back() == '\r') line->pop_back();
  return true;
}

}  // namespace

TableLines::TableLines(platform::RegularFile file) : file_(std::move(file)) {}

bool TableLines::Next(std::string* line) {
  line->clear();
  bool seen = false;         // a byte of this line has been read
  bool passed_over = false;  // too long, or holds a NUL byte
  for (;;) {
    if (begin_ == end_ && !Fill()) {
      return seen && !passed_over && !failed_ && DropCarriageReturn(line);
    }
    const char* chunk = buffer_ + begin_;
    const std::size_t available = end_ - begin_;
    const void* newline = std::memchr(chunk, '\n', available);
    const std::size_t length =
        newline != nullptr
            ? static_cast<std::size_t>(static_cast<const char*>(newline) - chunk)
            : available;
    seen = true;
    if (!passed_over && (std::memchr(chunk, '\0', length) != nullptr ||
                         line->size() + length > kMaxTableLineBytes)) {
      passed_over = true;
      line->clear();
    }
    if (!passed_over) line->append(chunk, length);
    begin_ += length;
    if (newline == nullptr) continue;
    ++begin_;
    if (!passed_over) return DropCarriageReturn(line);
    seen = false;
    passed_over = false;
  }
}

bool TableLines::Fill() {
  if (failed_) return false;
  const long count = file_.Read(buffer_, sizeof buffer_);
  failed_ = count < 0;
  begin_ = 0;
  end_ = count > 0 ? static_cast<std::size_t>(count) : 0;
  return count > 0;
}

}  // namespace datetimelib
