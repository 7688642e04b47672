#include "line_reader.h"

#include <algorithm>
#include <cstring>

namespace adtime {
namespace {

// Large enough that a refill is rare and any line within the limit fits whole.
constexpr std::size_t kMinBufferBytes = std::size_t{1} << 16;

}  // namespace

LineReader::LineReader(std::FILE* in, std::size_t max_line_bytes)
    : in_(in),
      max_line_bytes_(max_line_bytes),
      buffer_(std::max(kMinBufferBytes, 2 * max_line_bytes + 2) + 1) {}

bool LineReader::Refill() {
  if (at_end_) return false;
  if (begin_ > 0) {
    std::memmove(buffer_.data(), buffer_.data() + begin_, end_ - begin_);
    end_ -= begin_;
    begin_ = 0;
  }
  const std::size_t room = buffer_.size() - 1 - end_;
  const std::size_t got = std::fread(buffer_.data() + end_, 1, room, in_);
  end_ += got;
  if (got < room) {
    at_end_ = true;
    failed_ = std::ferror(in_) != 0;
  }
  return got > 0;
}

void LineReader::SkipRestOfLine() {
  for (;;) {
    const void* feed = std::memchr(buffer_.data() + begin_, '\n', end_ - begin_);
    if (feed != nullptr) {
      begin_ =
          static_cast<std::size_t>(static_cast<const char*>(feed) - buffer_.data()) + 1;
      return;
    }
    begin_ = end_;
    if (!Refill()) return;
  }
}

Line LineReader::Finish(char* begin, std::size_t length, bool too_long) {
  if (length > max_line_bytes_) {
    length = max_line_bytes_;
    too_long = true;
  }
  if (!too_long && length > 0 && begin[length - 1] == '\r') --length;
  begin[length] = '\0';  // the line feed, the '\r', a dropped byte or the spare byte
  Line line;
  line.text = std::string_view(begin, length);
  line.too_long = too_long;
  line.has_nul = std::memchr(begin, '\0', length) != nullptr;
  return line;
}

bool LineReader::Next(Line* line) {
  for (;;) {
    char* begin = buffer_.data() + begin_;
    const std::size_t available = end_ - begin_;
    if (void* feed = std::memchr(begin, '\n', available)) {
      const auto length = static_cast<std::size_t>(static_cast<char*>(feed) - begin);
      begin_ += length + 1;
      *line = Finish(begin, length, false);
      return true;
    }
    if (available > max_line_bytes_) {
      long_line_.assign(begin, max_line_bytes_);
      begin_ = end_;
      SkipRestOfLine();
      line->text = long_line_;
      line->too_long = true;
      line->has_nul = long_line_.find('\0') != std::string::npos;
      return true;
    }
    if (!Refill()) {
      if (end_ == begin_) return false;
      // A last line without a line feed: the spare byte holds its '\0'.
      const std::size_t length = end_ - begin_;
      begin_ = end_;
      *line = Finish(begin, length, false);
      return true;
    }
  }
}

}  // namespace adtime
