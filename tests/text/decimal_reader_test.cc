#include "text/decimal_reader.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

using datetimelib::ReadColonNumbers;

TEST(ReadColonNumbers, ReadsAsScanfDoes) {
  const struct {
    const char* text;
    int max_count;
    std::vector<std::int32_t> values;  // the numbers read
  } cases[] = {
      {"10:30:15", 3, {10, 30, 15}},
      {"10:30", 3, {10, 30}},
      // Blanks before each number, none before the ":".
      {" \t\n\v\f\r10: 30", 3, {10, 30}},
      {"10 :30", 3, {10}},
      // Signs.
      {"+5:-7", 2, {5, -7}},
      {"+-5", 1, {}},
      {"- 5", 1, {}},
      // Whatever follows a number is ignored.
      {"5x", 1, {5}},
      {"10::30", 3, {10}},
      {"10:30x99999999999", 3, {10, 30}},
      {"", 3, {}},
      // The ends of 32 bits.
      {"2147483647", 1, {2147483647}},
      {"-2147483648", 1, {INT32_MIN}},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    const auto read = ReadColonNumbers(c.text, c.max_count);
    EXPECT_FALSE(read.too_long);
    ASSERT_EQ(read.count, static_cast<int>(c.values.size()));
    for (std::size_t i = 0; i < c.values.size(); ++i)
      EXPECT_EQ(read.values[i], c.values[i]);
  }
}

TEST(ReadColonNumbers, NumbersBeyond32BitsAreReported) {
  const struct {
    const char* text;
    int count_before;
  } cases[] = {
      {"2147483648", 0},         {"-2147483649", 0}, {"+99999999999999999999999999", 0},
      {"10:4294967296", 1},  // would wrap to 0 in 32 bits
      {"10:30:-99999999999", 2},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    const auto read = ReadColonNumbers(c.text, 3);
    EXPECT_TRUE(read.too_long);
    EXPECT_EQ(read.count, c.count_before);
  }
}

}  // namespace
