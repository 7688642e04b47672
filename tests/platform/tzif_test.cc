#include "platform/tzif.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <ctime>
#include <filesystem>
#include <string>

#include "platform/posix_rule.h"
#include "support/temp_dir.h"
#include "support/tz_guard.h"
#include "support/tzif_bytes.h"

namespace {

using datetimelib::platform::ParsePosixRule;
using datetimelib::platform::ParseTzif;
using datetimelib::platform::Tzif;
using datetimelib::platform::TzifType;
using datetimelib::testing::ReadFileBytes;
using datetimelib::testing::TzGuard;
using datetimelib::testing::TzifBytes;
using datetimelib::testing::TzifParts;

constexpr char kZoneFolder[] = "/usr/share/zoneinfo";

std::string SystemZoneBytes(const std::string& name) {
  return ReadFileBytes(std::string(kZoneFolder) + "/" + name);
}

// The type in force at an instant within the transitions.
const TzifType& TypeAt(const Tzif& zone, std::int64_t unix_seconds) {
  const auto after = std::upper_bound(zone.transition_times.begin(),
                                      zone.transition_times.end(), unix_seconds);
  if (after == zone.transition_times.begin()) return zone.types[0];
  return zone.types[zone.transition_types[static_cast<std::size_t>(
      after - zone.transition_times.begin() - 1)]];
}

// Real files read back to what the C library makes of them: the same offset,
// daylight flag and abbreviation at instants every 11.6 days, 1970-2037.
TEST(ParseTzif, RealFilesAgreeWithLocaltimeR) {
  const struct {
    const char* zone;
    const char* footer;
  } cases[] = {
      {"America/New_York", "EST5EDT,M3.2.0,M11.1.0"},
      {"Europe/Dublin", "IST-1GMT0,M10.5.0,M3.5.0/1"},
      {"Australia/Lord_Howe", "<+1030>-10:30<+11>-11,M10.1.0,M4.1.0"},
      {"Asia/Kolkata", "IST-5:30"},
      {"Etc/UTC", "UTC0"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.zone);
    const std::string bytes = SystemZoneBytes(c.zone);
    if (bytes.empty()) GTEST_SKIP() << "no system zone folder";
    const auto zone = ParseTzif(bytes);
    ASSERT_TRUE(zone.has_value());
    EXPECT_GE(zone->version, 2);
    EXPECT_EQ(zone->footer, c.footer);
    TzGuard tz(c.zone);
    const std::int64_t last =
        zone->transition_times.empty()
            ? 0
            : std::min<std::int64_t>(zone->transition_times.back(), INT32_MAX);
    for (std::int64_t t = 0; t < last; t += 1000003) {
      const time_t instant = static_cast<time_t>(t);
      std::tm expected{};
      ASSERT_NE(localtime_r(&instant, &expected), nullptr);
      const TzifType& type = TypeAt(*zone, t);
      ASSERT_EQ(type.utc_offset, expected.tm_gmtoff) << t;
      ASSERT_EQ(type.is_dst, expected.tm_isdst > 0) << t;
      ASSERT_EQ(type.abbreviation, expected.tm_zone) << t;
    }
  }
}

// Every zone file of the system reads, and its footer is a rule that parses.
TEST(ParseTzif, EverySystemZoneFileReads) {
  std::error_code error;
  int files = 0;
  for (const auto& entry :
       std::filesystem::recursive_directory_iterator(kZoneFolder, error)) {
    if (!entry.is_regular_file()) continue;
    const std::string bytes = ReadFileBytes(entry.path().string());
    if (bytes.compare(0, 4, "TZif") != 0) continue;  // zone.tab and the like
    SCOPED_TRACE(entry.path().string());
    const auto zone = ParseTzif(bytes);
    ASSERT_TRUE(zone.has_value());
    if (!zone->footer.empty()) {
      EXPECT_TRUE(ParsePosixRule(zone->footer).has_value());
    }
    ++files;
  }
  if (files == 0) GTEST_SKIP() << "no system zone folder";
  EXPECT_GT(files, 300);
}

TEST(ParseTzif, EveryTruncationIsRefused) {
  const std::string bytes = SystemZoneBytes("America/New_York");
  if (bytes.empty()) GTEST_SKIP() << "no system zone folder";
  for (std::size_t length = 0; length < bytes.size(); ++length) {
    ASSERT_FALSE(ParseTzif(std::string_view(bytes).substr(0, length)).has_value())
        << length;
  }
}

// Corrupt bytes give a result or none, never undefined behaviour (the sanitizer
// build checks).
TEST(ParseTzif, SurvivesEveryCorruptedByte) {
  std::string bytes = SystemZoneBytes("Europe/Dublin");
  if (bytes.empty()) GTEST_SKIP() << "no system zone folder";
  int refused = 0;
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    for (const int flip : {0x01, 0x80, 0xff}) {
      bytes[i] = static_cast<char>(static_cast<unsigned char>(bytes[i]) ^ flip);
      refused += ParseTzif(bytes).has_value() ? 0 : 1;
      bytes[i] = static_cast<char>(static_cast<unsigned char>(bytes[i]) ^ flip);
    }
  }
  EXPECT_GT(refused, 0);
}

// Two types, one transition to daylight time, rule "XST3XDT,...".
TzifParts GoodParts() {
  TzifParts parts;
  parts.times = {1000000000};
  parts.type_indices = {1};
  parts.types = {{-10800, 0, 0}, {-7200, 1, 4}};
  parts.designations = std::string("XST\0XDT\0", 8);
  parts.footer = "\nXST3XDT,M3.2.0,M11.1.0\n";
  return parts;
}

TEST(ParseTzif, ReadsEachVersion) {
  for (const char version : {'\0', '2', '3', '4'}) {
    SCOPED_TRACE(static_cast<int>(version));
    TzifParts parts = GoodParts();
    parts.version = version;
    parts.leap_count = 2;
    parts.indicators = true;
    const auto zone = ParseTzif(TzifBytes(parts) + "trailing bytes");
    ASSERT_TRUE(zone.has_value());
    EXPECT_EQ(zone->version, version == '\0' ? 1 : version - '0');
    EXPECT_EQ(zone->transition_times, std::vector<std::int64_t>{1000000000});
    EXPECT_EQ(zone->transition_types, std::vector<std::uint8_t>{1});
    ASSERT_EQ(zone->types.size(), 2u);
    EXPECT_EQ(zone->types[1].utc_offset, -7200);
    EXPECT_TRUE(zone->types[1].is_dst);
    EXPECT_EQ(zone->types[1].abbreviation, "XDT");
    EXPECT_EQ(zone->footer, version == '\0' ? "" : "XST3XDT,M3.2.0,M11.1.0");
  }
}

// Times beyond 32 bits come from the 64-bit block, and an empty footer is kept.
TEST(ParseTzif, ReadsWideTimesAndEmptyFooter) {
  TzifParts parts = GoodParts();
  parts.times = {-(std::int64_t{1} << 59), std::int64_t{1} << 40};
  parts.type_indices = {0, 1};
  parts.footer = "\n\n";
  const auto zone = ParseTzif(TzifBytes(parts));
  ASSERT_TRUE(zone.has_value());
  EXPECT_EQ(zone->transition_times, parts.times);
  EXPECT_EQ(zone->footer, "");
}

TEST(ParseTzif, RefusesMalformedData) {
  const struct {
    const char* fault;
    void (*corrupt)(TzifParts*);
  } cases[] = {
      // Header.
      {"version 1 written as '1'", [](TzifParts* p) { p->version = '1'; }},
      {"version 5", [](TzifParts* p) { p->version = '5'; }},
      {"no types",
       [](TzifParts* p) {
         p->types.clear();
         p->times.clear();
         p->type_indices.clear();
       }},
      {"257 types",
       [](TzifParts* p) {
         p->types.resize(257, {0, 0, 0});
       }},
      {"no designations", [](TzifParts* p) { p->designations.clear(); }},
      {"time count beyond the data", [](TzifParts* p) { p->time_count_override = 2; }},
      {"time count 2^32 - 1", [](TzifParts* p) { p->time_count_override = 0xffffffff; }},
      // Transitions.
      {"type index = type count", [](TzifParts* p) { p->type_indices = {2}; }},
      {"times not ascending",
       [](TzifParts* p) {
         p->times = {5, 5};
         p->type_indices = {0, 1};
       }},
      // Types.
      {"daylight flag 2", [](TzifParts* p) { p->types[1].is_dst = 2; }},
      {"offset -2^31", [](TzifParts* p) { p->types[1].utc_offset = INT32_MIN; }},
      {"designation index = designation count",
       [](TzifParts* p) { p->types[1].designation = 8; }},
      {"designation without NUL",
       [](TzifParts* p) {
         p->designations = "XSTXDT";
         p->types[1].designation = 3;
       }},
      // Footer.
      {"footer without opening newline", [](TzifParts* p) { p->footer = "UTC0\n"; }},
      {"footer without closing newline", [](TzifParts* p) { p->footer = "\nUTC0"; }},
      {"no footer", [](TzifParts* p) { p->footer = ""; }},
  };
  ASSERT_TRUE(ParseTzif(TzifBytes(GoodParts())).has_value());
  for (const auto& c : cases) {
    TzifParts parts = GoodParts();
    c.corrupt(&parts);
    EXPECT_FALSE(ParseTzif(TzifBytes(parts)).has_value()) << c.fault;
  }
  EXPECT_FALSE(ParseTzif("TZjf" + TzifBytes(GoodParts()).substr(4)).has_value());
}

}  // namespace
