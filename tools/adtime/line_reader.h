// Reading standard input one line at a time for batch mode, fast and with
// bounded memory whatever the input holds.
#ifndef DATETIMELIB_TOOLS_ADTIME_LINE_READER_H_
#define DATETIMELIB_TOOLS_ADTIME_LINE_READER_H_

#include <cstddef>
#include <cstdio>
#include <string>
#include <string_view>
#include <vector>

namespace adtime {

struct Line {
  // The line without its line feed and without one carriage return before it.
  // Cut to the reader's limit when `too_long`. Always followed by a '\0' in
  // memory, so `text.data()` is a C string (of the text up to any NUL inside it).
  // Valid until the next call to Next.
  std::string_view text;
  bool too_long = false;  // the line held more bytes than the limit
  bool has_nul = false;   // `text` holds a NUL byte
};

// Splits a stream at line feeds. A last line without a line feed is a line; an
// input that ends with a line feed has no empty line after it. Memory stays
// within a fixed buffer: the bytes of a line beyond `max_line_bytes` are read and
// dropped.
class LineReader {
 public:
  LineReader(std::FILE* in, std::size_t max_line_bytes);

  // The next line; false at the end of the input.
  bool Next(Line* line);
  // True when reading stopped on an error rather than at the end of the input.
  bool failed() const { return failed_; }

 private:
  // Moves unread bytes to the front and reads more behind them; false when
  // nothing more came.
  bool Refill();
  // Reads and drops input up to and including the next line feed.
  void SkipRestOfLine();
  // The line of `length` bytes at `begin`, which must be followed by one
  // writable byte.
  Line Finish(char* begin, std::size_t length, bool too_long);

  std::FILE* in_;
  std::size_t max_line_bytes_;
  std::vector<char> buffer_;  // one byte more than is ever filled, for the '\0'
  std::size_t begin_ = 0;     // first unread byte in buffer_
  std::size_t end_ = 0;       // one past the last byte read into buffer_
  std::string long_line_;     // the kept start of a line beyond the limit
  bool at_end_ = false;
  bool failed_ = false;
};

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_LINE_READER_H_
