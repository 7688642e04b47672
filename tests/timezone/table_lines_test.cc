#include "timezone/table_lines.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <string>
#include <vector>

#include "support/temp_dir.h"

namespace {

using datetimelib::kMaxTableLineBytes;
using datetimelib::TableLines;
using datetimelib::platform::RegularFile;

struct Reading {
  std::vector<std::string> lines;
  std::size_t largest_capacity = 0;  // of the line buffer, over the whole read
};

Reading ReadAll(const std::string& path) {
  Reading reading;
  std::optional<RegularFile> file = RegularFile::Open(path);
  if (!file) return reading;
  TableLines lines(std::move(*file));
  std::string line;
  for (;;) {
    const bool more = lines.Next(&line);
    reading.largest_capacity = std::max(reading.largest_capacity, line.capacity());
    if (!more) break;
    reading.lines.push_back(line);
  }
  return reading;
}

// A long line, a line with a NUL byte, 100 MB of NUL bytes (a sparse file:
// nothing is written there), then an entry: read through, the line buffer
// bounded by one line. (The dst_table fuzz target holds the line rules.)
TEST(TableLines, HundredMegabytesWithBoundedMemory) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  const std::string path = folder.Write(
      "table", std::string(5000, 'x') + "\r\nok\n" + std::string("a\0b\n", 4));
  const std::string last = "\n2003-04-06 01:59:59;2003-10-26 02:00:00\n";
  constexpr off_t kHole = 100 << 20;
  const int descriptor = open(path.c_str(), O_WRONLY);
  ASSERT_GE(descriptor, 0);
  ASSERT_EQ(pwrite(descriptor, last.data(), last.size(), kHole),
            static_cast<ssize_t>(last.size()));
  close(descriptor);

  const Reading reading = ReadAll(path);
  EXPECT_EQ(reading.lines,
            (std::vector<std::string>{"ok", "2003-04-06 01:59:59;2003-10-26 02:00:00"}));
  EXPECT_LE(reading.largest_capacity, 2 * kMaxTableLineBytes);
}

}  // namespace
