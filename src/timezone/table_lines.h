// The lines of a table file, read in one pass with bounded memory.
//
// A table may be anything a caller points us at: a file of gigabytes, one without
// a single line end, one full of NUL bytes. The reader holds one fixed buffer and
// at most one line of kMaxTableLineBytes, and reads every byte of the file once.
#ifndef DATETIMELIB_TIMEZONE_TABLE_LINES_H_
#define DATETIMELIB_TIMEZONE_TABLE_LINES_H_

#include <cstddef>
#include <string>

#include "platform/regular_file.h"

namespace datetimelib {

// Longer than any entry a person writes; longer lines are passed over, which
// keeps the memory of a call bounded whatever the file holds.
inline constexpr std::size_t kMaxTableLineBytes = 4096;

// Each line without its "\n" or "\r\n"; the last line needs no line end. Lines
// longer than kMaxTableLineBytes or holding a NUL byte (which no entry can hold)
// are passed over whole. A read error ends the file.
class TableLines {
 public:
  explicit TableLines(platform::RegularFile file);

  // The next line into `*line`; false at the end of the file. `*line` never
  // grows beyond kMaxTableLineBytes.
  bool Next(std::string* line);

 private:
  bool Fill();

  platform::RegularFile file_;
  char buffer_[4096];
  std::size_t begin_ = 0;  // the unread bytes are buffer_[begin_, end_)
  std::size_t end_ = 0;
  bool failed_ = false;
};

}  // namespace datetimelib

#endif  // DATETIMELIB_TIMEZONE_TABLE_LINES_H_
