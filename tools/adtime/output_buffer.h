// Buffered standard output: batch mode writes a million short lines, so output
// goes out in large blocks, never a flush per line.
#ifndef DATETIMELIB_TOOLS_ADTIME_OUTPUT_BUFFER_H_
#define DATETIMELIB_TOOLS_ADTIME_OUTPUT_BUFFER_H_

#include <cstdio>
#include <string>

namespace adtime {

class OutputBuffer {
 public:
  explicit OutputBuffer(std::FILE* out);
  OutputBuffer(const OutputBuffer&) = delete;
  OutputBuffer& operator=(const OutputBuffer&) = delete;

  // The text being built; callers append to it and then call LineDone.
  std::string* text() { return &pending_; }
  // Ends the current line, writing the buffer out when it is full.
  void LineDone();
  // Writes out everything; false if any write failed.
  bool Flush();

 private:
  std::FILE* out_;
  std::string pending_;
  bool failed_ = false;
};

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_OUTPUT_BUFFER_H_
