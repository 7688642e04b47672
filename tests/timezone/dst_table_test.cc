#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <string>
#include <tuple>

#include "AdDateTime.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

// GetDSTDates' result, start text and end text.
using Dates = std::tuple<int, std::string, std::string>;

class DstTableTest : public ::testing::Test {
 protected:
  void SetUp() override { ASSERT_TRUE(folder_.ok()); }

  Dates Get(int year, const char* directory) const {
    std::string start = "left over", end = "left over";
    const int result = AdDateTime::GetDSTDates(directory, year, start, end);
    return {result, start, end};
  }
  Dates Get(int year) const { return Get(year, folder_.path().c_str()); }

  // What the rule gives, for years without a table entry.
  static Dates Computed(int year) {
    std::string start, end;
    return {AdDateTime::GenerateDSTDates(year, start, end), start, end};
  }

  datetimelib::testing::TzGuard tz_{"EST5EDT,M3.2.0,M11.1.0"};
  datetimelib::testing::TempDir folder_;
};

TEST_F(DstTableTest, EveryRuleOfTheFormat) {
  // Lines that hold a NUL byte or exceed 4096 bytes are passed over whole, even
  // where their first part reads as an entry: here one for 2012 at `hour`, padded
  // with blanks (which the reader skips) to `length` bytes before its line end.
  const auto padded = [](int hour, std::size_t length) {
    const std::string time = " 0" + std::to_string(hour) + ":00:00";
    const std::string entry = "2012-03-11" + time + ";2012-11-04" + time;
    return entry + std::string(length - entry.size(), ' ') + "\n";
  };
  const std::string binary_and_long =
      std::string("2012-03-11 01:00:00\0;2012-11-04 01:00:00\n", 41) + padded(2, 4097) +
      padded(3, 1 << 20) + padded(4, 4096);
  folder_.Write(
      "dst_dates.dat",
      "# 2001-04-01 01:59:59;2001-10-28 02:00:00\n"     // comment
      "2003-04-06 01:59:59;2003-10-26 02:00:00\n"       //
      "2004-04-04 01:59:59;2004-10-31 02:00:00\n"       // the first 2004 entry wins
      "2004-04-11 01:59:59;2004-10-24 02:00:00\n"       //
      "\n"                                              // empty: no start text
      " #2005-04-03 01:59:59;2005-10-30 02:00:00\n"     // no comment, and unreadable
      "2006-04-02 01:59:59\n"                           // no ";"
      ";2006-04-02 01:59:59;2006-10-29 02:00:00\n"      // empty start text
      "2006-04-02 01:59:59;not a date\n"                // the end does not read
      "2006-04-09 01:59:59;2006-10-22 02:00:00;x\n"     // the end text is "...;x"
      "2006-04-16 01:59:59;2006-10-15 02:00:00\n"       // taken for 2006
      "2007-10-07 01:59:59;2008-03-30 02:00:00\n"       // ends the next year
      "1969-12-31 23:59:59;1970-03-01 00:00:00\n"       // the start is out of range
      "2009-04-05 01:59:59.250;2009-10-25 02:00:00 \n"  // other forms the reader takes
      "2010-03-14 05:00:00;2010-11-07 05:00:00\r\n" +   // CRLF
          binary_and_long +                             //
          "2011-03-13 03:00:00;2011-11-06 04:00:00");   // no final line end
  const std::pair<int, Dates> cases[] = {
      {2001, Computed(2001)},
      {2003, {1, "2003-04-06 01:59:59", "2003-10-26 02:00:00"}},
      {2004, {1, "2004-04-04 01:59:59", "2004-10-31 02:00:00"}},
      {2005, Computed(2005)},
      {2006, {1, "2006-04-16 01:59:59", "2006-10-15 02:00:00"}},
      {2007, {1, "2007-10-07 01:59:59", "2008-03-30 02:00:00"}},
      {2008, Computed(2008)},  // an entry belongs to the year of its start
      {1969, Computed(1969)},
      {2009, {1, "2009-04-05 01:59:59", "2009-10-25 02:00:00"}},
      {2010, {1, "2010-03-14 05:00:00", "2010-11-07 05:00:00"}},
      {2011, {1, "2011-03-13 03:00:00", "2011-11-06 04:00:00"}},
      {2012, {1, "2012-03-11 04:00:00", "2012-11-04 04:00:00"}},
  };
  for (const auto& [year, expected] : cases) EXPECT_EQ(Get(year), expected) << year;
  EXPECT_EQ(Computed(2005), Dates(1, "2005-03-13 01:59:59", "2005-11-06 02:00:00"));
}

// No table: computed dates, and never a wait on something that is not a file.
TEST_F(DstTableTest, NoTable) {
  EXPECT_EQ(Get(2005, nullptr), Computed(2005));
  EXPECT_EQ(Get(2005), Computed(2005));  // folder without the file
  for (const char* not_a_file : {"directory", "fifo", "device"}) {
    ASSERT_EQ(mkdir(folder_.Path(not_a_file).c_str(), 0700), 0);
  }
  ASSERT_EQ(mkdir(folder_.Path("directory/dst_dates.dat").c_str(), 0700), 0);
  ASSERT_EQ(mkfifo(folder_.Path("fifo/dst_dates.dat").c_str(), 0600), 0);
  ASSERT_EQ(symlink("/dev/zero", folder_.Path("device/dst_dates.dat").c_str()), 0);
  for (const char* not_a_file : {"directory", "fifo", "device"}) {
    EXPECT_EQ(Get(2005, folder_.Path(not_a_file).c_str()), Computed(2005)) << not_a_file;
  }
}

// Tables that hold nothing readable give the rule's dates, whatever their size.
TEST_F(DstTableTest, TablesWithoutEntries) {
  const struct {
    const char* name;
    std::string content;
  } cases[] = {
      {"empty", ""},
      {"NUL bytes only", std::string(1 << 20, '\0')},
      {"one line of 8 MB", std::string(8 << 20, '7')},
      {"an entry cut by a NUL byte",
       std::string("2005-04-03 01:59:59;2005-10-30\0 02:00:00", 40)},
  };
  for (const auto& c : cases) {
    folder_.Write("dst_dates.dat", c.content);
    EXPECT_EQ(Get(2005), Computed(2005)) << c.name;
  }
  // A regular file whose first read fails (this process's memory at address 0),
  // which no user, root included, can read.
  ASSERT_EQ(remove(folder_.Path("dst_dates.dat").c_str()), 0);
  ASSERT_EQ(symlink("/proc/self/mem", folder_.Path("dst_dates.dat").c_str()), 0);
  EXPECT_EQ(Get(2005), Computed(2005)) << "read error";
  // A file that cannot be opened reads as absent. Mode 000 does not stop root,
  // who reads the table.
  ASSERT_EQ(remove(folder_.Path("dst_dates.dat").c_str()), 0);
  folder_.Write("dst_dates.dat", "2005-04-10 01:59:59;2005-10-23 02:00:00\n");
  ASSERT_EQ(chmod(folder_.Path("dst_dates.dat").c_str(), 0), 0);
  const Dates table(1, "2005-04-10 01:59:59", "2005-10-23 02:00:00");
  EXPECT_EQ(Get(2005), geteuid() == 0 ? table : Computed(2005)) << "mode 000";
}

// Read afresh at every call; without daylight saving, 0 and both texts emptied
// whatever the table holds.
TEST_F(DstTableTest, ReadAfreshOnlyWithDaylightSaving) {
  folder_.Write("dst_dates.dat", "2005-04-03 01:59:59;2005-10-30 02:00:00\n");
  EXPECT_EQ(Get(2005), Dates(1, "2005-04-03 01:59:59", "2005-10-30 02:00:00"));
  folder_.Write("dst_dates.dat", "2005-04-10 01:59:59;2005-10-23 02:00:00\n");
  EXPECT_EQ(Get(2005), Dates(1, "2005-04-10 01:59:59", "2005-10-23 02:00:00"));
  datetimelib::testing::TzGuard tz("Asia/Tokyo");
  EXPECT_EQ(Get(2005), Dates(0, "", ""));
}

}  // namespace
