// Every zone question under TZ values and zone files that no system ships:
// malformed rule strings, names of nothing or of folders, zone files cut short or
// corrupted. Each answer is the C library's where the C library decides, UTC
// where it reads a malformed string only in part, and the questions agree with
// each other.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <climits>
#include <ctime>
#include <string>
#include <vector>

#include "AdDateTime.h"
#include "platform/zone/local_time.h"
#include "support/glibc_agreement.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

enum class Expect {
  kLikeGlibc,  // breakdown, composition and `timezone` as glibc gives them
  kUtc,        // glibc reads the string in part; we read it as UTC
  // A zone file whose footer glibc reads in part: glibc's answers up to the last
  // transition of the file (New York's, November 2037); after it, ours keep the
  // type of that transition.
  kLikeGlibcToLastChange,
};

constexpr std::int64_t kNewYorkLastChange = 2140668000;  // 2037-11-01 06:00 UTC

// What every zone question says, checked against the others: daylight saving
// in the rule shows in UsesDST, in the computed dates and in GetDSTDates alike,
// and the canonical text of an instant reads back to it.
void ExpectConsistentAnswers() {
  const int uses_dst = AdDateTime::UsesDST();
  for (const int year : {INT_MIN, -1, 0, 1969, 1970, 2003, 2037, 2038, 2039, INT_MAX}) {
    SCOPED_TRACE(year);
    std::string start = "x", end = "x";
    EXPECT_EQ(AdDateTime::GenerateDSTDates(year, start, end), 1);
    EXPECT_EQ(start.empty(), uses_dst == 0);
    EXPECT_EQ(end.empty(), uses_dst == 0);
    std::string table_start, table_end;
    EXPECT_EQ(AdDateTime::GetDSTDates(nullptr, year, table_start, table_end), uses_dst);
    EXPECT_EQ(table_start, start);
    EXPECT_EQ(table_end, end);
  }
  for (std::int64_t t = 86400; t < INT32_MAX - 86400; t += 97 * 86400 + 3601) {
    const AdDateTime value(AdTime(static_cast<std::int32_t>(t)));
    AdDateTime read;
    ASSERT_EQ(read.ParseDateTime(value.Format("%Y-%m-%d %H:%M:%S").c_str()), 1) << t;
    // The first of two readings of a repeated local time comes back.
    EXPECT_LE(t - read.GetCTime().GetTime(), 25 * 3600) << t;
    EXPECT_EQ(read.Format("%F %T"), value.Format("%F %T")) << t;
  }
}

void ExpectZone(const std::string& tz, Expect expect) {
  SCOPED_TRACE(tz);
  TzGuard guard(tz.c_str());
  ExpectConsistentAnswers();
  if (expect == Expect::kUtc) {
    EXPECT_EQ(AdDateTime::GetGMTOffset(), 0.0);
    EXPECT_EQ(AdDateTime::UsesDST(), 0);
    for (const std::int64_t t : {0, 1057000000, 1073000000, INT32_MAX}) {
      EXPECT_EQ(datetimelib::platform::BreakDownLocal(t).utc_offset, 0) << t;
      EXPECT_EQ(datetimelib::platform::ComposeLocal(t), t) << t;
    }
    return;
  }
  tzset();
  EXPECT_EQ(AdDateTime::GetGMTOffset(), static_cast<double>(timezone / 60));
  if (expect == Expect::kLikeGlibcToLastChange) {
    for (std::int64_t t = 0; t < kNewYorkLastChange; t += 7 * 86400 + 3607) {
      const std::time_t instant = static_cast<std::time_t>(t);
      std::tm libc{};
      localtime_r(&instant, &libc);
      const auto ours = datetimelib::platform::BreakDownLocal(t);
      ASSERT_EQ(ours.utc_offset, libc.tm_gmtoff) << t;
      ASSERT_EQ(ours.is_dst, libc.tm_isdst > 0) << t;
    }
    EXPECT_EQ(
        datetimelib::platform::BreakDownLocal(kNewYorkLastChange + 86400).utc_offset,
        -18000);
    return;
  }
  const auto report = datetimelib::testing::CheckAgreementWithGlibc(tz.c_str(), 24 * 7);
  EXPECT_GT(report.instants_checked, 3000);  // weekly, and around each change
  EXPECT_TRUE(report.mismatches.empty()) << report.mismatches.front();
}

// Rule strings: malformed ones, and well-formed ones at the edges of the form.
TEST(HostileZone, RuleStrings) {
  const struct {
    const char* tz;
    Expect expect;
  } cases[] = {
      // glibc reads these in part (a rule without its end, a month 13, offsets
      // cut to 24 hours, day 366): UTC.
      {"XST5XDT,M13.9.9", Expect::kUtc},
      {"XST5XDT,M3.2.0", Expect::kUtc},
      {"XST5XDT,M3.2.0,", Expect::kUtc},
      {"XST999999999", Expect::kUtc},
      {"XST-25", Expect::kUtc},
      {"XST24:00:01", Expect::kUtc},
      {"<+99999>-99999", Expect::kUtc},
      {"XST5XDT99999999999999999999,M3.2.0,M11.1.0", Expect::kUtc},
      {"XST5XDT,J0,J300", Expect::kUtc},
      {"XST5XDT,J60,J366", Expect::kUtc},
      {"XST5XDT,0,366", Expect::kUtc},
      {"XST5XDT,M3.2.0/99999999999,M11.1.0", Expect::kUtc},
      {"UTC+1-2", Expect::kUtc},
      {"<XST5", Expect::kUtc},
      {"XST5\xFF", Expect::kUtc},
      // Within the form: the C library's answers.
      {"XST-24", Expect::kLikeGlibc},
      {"<+99>-24<+98>-23,J1/0,J365/24", Expect::kLikeGlibc},
      {"XST5XDT,0/-167,365/167", Expect::kLikeGlibc},
      // Changes that carry past the ends of the range: late December plus a week
      // lands in the next year, and in 2037 in January 2038.
      {"XST3XDT,M1.1.0/-167,M12.5.6/167", Expect::kLikeGlibc},
      {"XST-13XDT,J365/167,J1/-167", Expect::kLikeGlibc},
      // No zone file by that name and no rule: UTC, for glibc too.
      {"NoSuch/Zone", Expect::kLikeGlibc},
      {":/nonexistent/zone", Expect::kLikeGlibc},
      {"/", Expect::kLikeGlibc},
      {":/tmp", Expect::kLikeGlibc},
      {"America", Expect::kLikeGlibc},
      {"..", Expect::kLikeGlibc},
  };
  for (const auto& c : cases) ExpectZone(c.tz, c.expect);
}

// The bytes of a real zone file and the offsets of its parts.
struct ZoneFileLayout {
  std::string bytes;
  std::size_t second_header = 0;  // where the 64-bit header starts
  std::size_t second_data = 0;    // where the 64-bit data starts
  std::size_t footer = 0;         // where the footer's first "\n" is
};

std::uint32_t CountAt(const std::string& bytes, std::size_t position) {
  std::uint32_t value = 0;
  for (std::size_t i = 0; i < 4; ++i) {
    value = (value << 8) | static_cast<unsigned char>(bytes[position + i]);
  }
  return value;
}

// Bytes of a data block after the header at `header` (time_width 4 or 8).
std::size_t BlockBytes(const std::string& bytes, std::size_t header, std::size_t width) {
  const std::size_t isut = CountAt(bytes, header + 20),
                    isstd = CountAt(bytes, header + 24),
                    leap = CountAt(bytes, header + 28),
                    time = CountAt(bytes, header + 32),
                    type = CountAt(bytes, header + 36),
                    chars = CountAt(bytes, header + 40);
  return time * (width + 1) + type * 6 + chars + leap * (width + 4) + isstd + isut;
}

ZoneFileLayout NewYorkLayout() {
  ZoneFileLayout layout;
  if (std::FILE* file = std::fopen("/usr/share/zoneinfo/America/New_York", "rb")) {
    char chunk[4096];
    std::size_t count;
    while ((count = std::fread(chunk, 1, sizeof chunk, file)) > 0) {
      layout.bytes.append(chunk, count);
    }
    std::fclose(file);
  }
  if (layout.bytes.size() < 44) return layout;
  layout.second_header = 44 + BlockBytes(layout.bytes, 0, 4);
  layout.second_data = layout.second_header + 44;
  layout.footer = layout.second_data + BlockBytes(layout.bytes, layout.second_header, 8);
  return layout;
}

std::string WithCount(std::string bytes, std::size_t position, std::uint32_t value) {
  for (int i = 3; i >= 0; --i, value >>= 8) {
    bytes[position + static_cast<std::size_t>(i)] = static_cast<char>(value & 0xff);
  }
  return bytes;
}

// A zone file cut at every boundary of its layout, or corrupted in one part.
TEST(HostileZone, CutAndCorruptZoneFiles) {
  const ZoneFileLayout ny = NewYorkLayout();
  ASSERT_GT(ny.footer, 0u);
  ASSERT_LT(ny.footer, ny.bytes.size());
  ASSERT_EQ(ny.bytes[4], '2');
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  const auto cut = [&](std::size_t size) { return ny.bytes.substr(0, size); };
  const struct {
    const char* name;
    std::string bytes;
    Expect expect = Expect::kLikeGlibc;
  } cases[] = {
      {"whole", ny.bytes},
      {"empty", ""},
      {"magic only", cut(4)},
      {"fixed part of the header", cut(20)},
      {"within the counts", cut(30)},
      {"header only", cut(44)},
      {"within the 32-bit data", cut(ny.second_header / 2)},
      {"32-bit part only", cut(ny.second_header)},
      {"within the second header", cut(ny.second_header + 30)},
      {"second header only", cut(ny.second_data)},
      {"within the 64-bit data", cut(ny.second_data + 100)},
      {"no footer", cut(ny.footer)},
      {"footer's first newline only", cut(ny.footer + 1)},
      {"footer without its closing newline", cut(ny.bytes.size() - 1)},
      {"wrong magic", "TZjf" + ny.bytes.substr(4)},
      {"version 5", ny.bytes.substr(0, 4) + "5" + ny.bytes.substr(5)},
      {"32-bit time count 2^32 - 1", WithCount(ny.bytes, 32, 0xffffffff)},
      {"32-bit designation count 2^32 - 1", WithCount(ny.bytes, 40, 0xffffffff)},
      {"64-bit time count 2^32 - 1",
       WithCount(ny.bytes, ny.second_header + 32, 0xffffffff)},
      {"64-bit leap count 2^31", WithCount(ny.bytes, ny.second_header + 28, 0x80000000)},
      {"64-bit type count 0", WithCount(ny.bytes, ny.second_header + 36, 0)},
      // glibc reads the rule up to its month 13.
      {"footer that does not parse", cut(ny.footer) + "\nEST5EDT,M3.2.0,M13.1.0\n",
       Expect::kLikeGlibcToLastChange},
      {"empty footer", cut(ny.footer) + "\n\n"},
      {"footer without its first newline", cut(ny.footer) + "EST5EDT,M3.2.0,M11.1.0\n"},
      {"footer of one byte", cut(ny.footer) + "\nX"},
      // Zone files stay below 10 KiB; we read none beyond 1 MB.
      {"footer of a megabyte", cut(ny.footer) + "\n" + std::string(1 << 20, 'X') + "\n",
       Expect::kUtc},
      {"bytes after the footer", ny.bytes + std::string(4096, '\xff')},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.name);
    const std::string path = folder.Write("zone", c.bytes);
    ExpectZone(path, c.expect);
    ExpectZone(":" + path, c.expect);
  }
}

}  // namespace
