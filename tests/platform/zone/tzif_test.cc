#include "platform/zone/tzif.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/tzif_bytes.h"

namespace {

using datetimelib::platform::ParseTzif;
using datetimelib::testing::TzifBytes;
using datetimelib::testing::TzifParts;

// Two types, a transition to daylight time and back at instants that only the
// 64-bit block can hold, leap-second records and indicators (skipped), and the
// rule "XST3XDT,...".
TzifParts GoodParts() {
  TzifParts parts;
  parts.times = {-(std::int64_t{1} << 59), std::int64_t{1} << 40};
  parts.type_indices = {1, 0};
  parts.types = {{-10800, 0, 0}, {-7200, 1, 4}};
  parts.designations = std::string("XST\0XDT\0", 8);
  parts.leap_count = 2;
  parts.indicators = true;
  parts.footer = "\nXST3XDT,M3.2.0,M11.1.0\n";
  return parts;
}

// The good parts read (the times from the 64-bit block, what follows the footer
// ignored), and each fault is refused.
TEST(ParseTzif, ReadsVersion2AndRefusesMalformedData) {
  const auto good = ParseTzif(TzifBytes(GoodParts()) + "trailing bytes");
  ASSERT_TRUE(good.has_value());
  EXPECT_EQ(good->transition_times, GoodParts().times);
  TzifParts most_types = GoodParts();  // as many as one-byte indices can name
  most_types.types.resize(256, most_types.types[0]);
  EXPECT_TRUE(ParseTzif(TzifBytes(most_types)).has_value());
  const struct {
    const char* fault;
    void (*corrupt)(TzifParts*);
  } cases[] = {
      // Header.
      {"no types, nor anything else", [](TzifParts* p) { *p = TzifParts{}; }},
      {"time count beyond the data", [](TzifParts* p) { p->time_count_override = 3; }},
      {"time count 2^32 - 1", [](TzifParts* p) { p->time_count_override = 0xffffffff; }},
      {"257 types", [](TzifParts* p) { p->types.resize(257, p->types[0]); }},
      // Transitions.
      {"type index = type count", [](TzifParts* p) { p->type_indices[1] = 2; }},
      {"times not ascending", [](TzifParts* p) { p->times[1] = p->times[0]; }},
      // Types.
      {"offset -2^31", [](TzifParts* p) { p->types[1].utc_offset = INT32_MIN; }},
      {"designation index = designation count",
       [](TzifParts* p) { p->types[1].designation = 8; }},
      {"designation without NUL", [](TzifParts* p) { p->designations = "XSTXDT"; }},
      // Footer: none at all, or its "\n" alone.
      {"no footer", [](TzifParts* p) { p->footer = ""; }},
      {"a footer of one newline", [](TzifParts* p) { p->footer = "\n"; }},
  };
  for (const auto& c : cases) {
    TzifParts parts = GoodParts();
    c.corrupt(&parts);
    EXPECT_FALSE(ParseTzif(TzifBytes(parts)).has_value()) << c.fault;
  }
  EXPECT_FALSE(ParseTzif("TZjf" + TzifBytes(GoodParts()).substr(4)).has_value());
}

// What the C library makes of a footer that is not "\n" rule "\n", and of a
// version it does not know: the data is read all the same.
TEST(ParseTzif, ReadsOddFootersAndLaterVersionsAsTheCLibrary) {
  const struct {
    char version;
    const char* footer;
    int read_version;
    const char* read_footer;
  } cases[] = {
      {'2', "\nUTC0\nmore\n", 2, "UTC0"},
      {'3', "\nUTC0", 3, "UTC"},  // the last byte is taken for the "\n"
      {'2', "XUTC0\n", 2, ""},    // no "\n" first: no footer
      {'5', "\nUTC0\n", 4, "UTC0"},
  };
  for (const auto& c : cases) {
    TzifParts parts = GoodParts();
    parts.version = c.version;
    parts.footer = c.footer;
    const auto zone = ParseTzif(TzifBytes(parts));
    ASSERT_TRUE(zone.has_value()) << c.version << " " << c.footer;
    EXPECT_EQ(zone->version, c.read_version);
    EXPECT_EQ(zone->footer, c.read_footer);
    EXPECT_EQ(zone->transition_times, GoodParts().times);
  }
}

}  // namespace
