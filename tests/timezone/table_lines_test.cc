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

TEST(TableLines, PassesOverWhatNoEntryCanBe) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  const struct {
    const char* name;
    std::string content;
    std::vector<std::string> lines;
  } cases[] = {
      {"empty", "", {}},
      {"empty lines", "\n\r\n", {"", ""}},
      {"one line without a line end", "a;b", {"a;b"}},
      {"a NUL byte passes over its line only", std::string("a\0b\nc\n", 6), {"c"}},
      {"NUL bytes only", std::string(1 << 20, '\0'), {}},
      {"2 MB without a line end", std::string(2 << 20, 'x'), {}},
      {"a long line, then a short one", std::string(5000, 'x') + "\r\nok", {"ok"}},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.name);
    const Reading reading = ReadAll(folder.Write("table", c.content));
    EXPECT_EQ(reading.lines, c.lines);
    EXPECT_LE(reading.largest_capacity, 2 * kMaxTableLineBytes);
  }
}

// 100 MB of NUL bytes (a sparse file: nothing is written but the last line), then
// an entry: read through, the line buffer bounded by one line.
TEST(TableLines, HundredMegabytesWithBoundedMemory) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  const std::string path = folder.Path("table");
  const std::string last = "\n2003-04-06 01:59:59;2003-10-26 02:00:00\n";
  constexpr off_t kHole = 100 << 20;
  const int descriptor = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  ASSERT_GE(descriptor, 0);
  ASSERT_EQ(pwrite(descriptor, last.data(), last.size(), kHole),
            static_cast<ssize_t>(last.size()));
  close(descriptor);

  const Reading reading = ReadAll(path);
  EXPECT_EQ(reading.lines,
            std::vector<std::string>{"2003-04-06 01:59:59;2003-10-26 02:00:00"});
  EXPECT_LE(reading.largest_capacity, 2 * kMaxTableLineBytes);
}

}  // namespace
