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

// The fuzz target (fuzz/dst_table_fuzz.cc) holds every line rule against a
// plain reading of the table; here, what it cannot reach.
TEST_F(DstTableTest, FirstEntryOfTheYearWins) {
  folder_.Write("dst_dates.dat",
                "2004-04-04 01:59:59;2004-10-31 02:00:00\n"
                "2004-04-11 01:59:59;2004-10-24 02:00:00\n"
                "2007-10-07 01:59:59;2008-03-30 02:00:00\r\n"  // ends the next year
                "2009-04-05 01:59:59.250;2009-10-25 02:00:00");
  EXPECT_EQ(Get(2004), Dates(1, "2004-04-04 01:59:59", "2004-10-31 02:00:00"));
  EXPECT_EQ(Get(2007), Dates(1, "2007-10-07 01:59:59", "2008-03-30 02:00:00"));
  EXPECT_EQ(Get(2008), Computed(2008));  // an entry belongs to the year of its start
  EXPECT_EQ(Get(2009), Dates(1, "2009-04-05 01:59:59", "2009-10-25 02:00:00"));
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

// Tables that cannot be read give the rule's dates. (The dst_table fuzz corpus
// holds the line rules, long lines among them.)
TEST_F(DstTableTest, TablesWithoutEntries) {
  // A regular file whose first read fails (this process's memory at address 0),
  // which no user, root included, can read.
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
