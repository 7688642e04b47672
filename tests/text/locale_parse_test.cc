#include <gtest/gtest.h>

#include <string>

#include "AdDateTime.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::TzGuard;
using datetimelib::testing::UtcCount;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

struct Outcome {
  int result;
  AdDateTime::AdDateTimeStatus status;
  std::int32_t count;  // checked when the result is 1, or when `unchanged`
  const char* kept;    // what Format shows for outOfRange; "" otherwise
};

// Every outcome starts from a value that holds a count and a kept text, to show
// what a call replaces and what it leaves.
AdDateTime Dirty() {
  AdDateTime value(AdTime(777));
  value.SetStatus(AdDateTime::outOfRange);
  return value;
}

TEST(ParseDateTimeGMT, Outcomes) {
  TzGuard tz("America/New_York");  // must not matter
  const struct {
    const char* text;
    Outcome outcome;
  } cases[] = {
      {"1970-01-01 00:00:00", {1, AdDateTime::valid, 0, ""}},
      {"2001-09-09 01:46:40", {1, AdDateTime::valid, 1000000000, ""}},
      {"2000-02-29 12:00:00", {1, AdDateTime::valid, 951825600, ""}},
      {"2038-01-18 23:59:59", {1, AdDateTime::valid, 2147471999, ""}},
      {"2003-05-17 14:03:09   ", {1, AdDateTime::valid, 1053180189, ""}},
      // A fraction of a second: the second read drops it.
      {"2003-05-17 14:03:09.250", {1, AdDateTime::valid, 1053180189, ""}},
      {"2003-05-17 14:03:09.9", {1, AdDateTime::valid, 1053180189, ""}},
      // Out of range: the text is kept, the count left alone.
      {"2038-01-19 00:00:00", {0, AdDateTime::outOfRange, 777, "2038-01-19 00:00:00"}},
      {"1969-12-31 23:59:59", {0, AdDateTime::outOfRange, 777, "1969-12-31 23:59:59"}},
      {"1899-12-30 18:00:00", {0, AdDateTime::outOfRange, 777, "1899-12-30 18:00:00"}},
      {"14:30:00", {0, AdDateTime::outOfRange, 777, "14:30:00"}},  // a time alone
      // Unreadable.
      {"", {0, AdDateTime::invalid, 777, ""}},
      {"not a date", {0, AdDateTime::invalid, 777, ""}},
      {"2003-05-17 14:03:9.5", {0, AdDateTime::invalid, 777, ""}},  // 20th byte "5"
      {"2003-05-17 14:03:09x", {0, AdDateTime::invalid, 777, ""}},
      {"2003-05-17 14:03:09,250", {0, AdDateTime::invalid, 777, ""}},
      {"2003-02-30 00:00:00", {0, AdDateTime::invalid, 777, ""}},
      {"2003-13-01 00:00:00", {0, AdDateTime::invalid, 777, ""}},
      {"2003-01-01 24:00:00", {0, AdDateTime::invalid, 777, ""}},
      {"2003-01-01 23:60:00", {0, AdDateTime::invalid, 777, ""}},
      {"2003-01-01 23:59:60", {0, AdDateTime::invalid, 777, ""}},
      {"2003-01-01 23", {0, AdDateTime::invalid, 777, ""}},
      // Every locale reads a time without seconds.
      {"2003-01-01 23:59", {1, AdDateTime::valid, 1041465540, ""}},
      {" 2003-01-01 23:59:59", {0, AdDateTime::invalid, 777, ""}},
      {"2003-01-01 23:59:59.", {1, AdDateTime::valid, 1041465599, ""}},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    AdDateTime value = Dirty();
    EXPECT_EQ(value.ParseDateTimeGMT(c.text), c.outcome.result);
    EXPECT_EQ(value.GetStatus(), c.outcome.status);
    EXPECT_EQ(value.GetCTime().GetTime(), c.outcome.count);
    EXPECT_EQ(value.Format(kCanonical), c.outcome.status == AdDateTime::valid
                                            ? value.Format(kCanonical)
                                            : std::string(c.outcome.kept));
    // An invalid value keeps the text, though Format does not show it.
    if (c.outcome.status == AdDateTime::invalid) {
      value.SetStatus(AdDateTime::outOfRange);
      EXPECT_EQ(value.Format(kCanonical), c.text);
    }
  }
}

// The UTC count agrees with timegm on a date every 9 days and 7 hours.
TEST(ParseDateTimeGMT, AgreesWithTimegm) {
  for (std::int64_t t = 0; t <= 2147471999; t += 9 * 86400 + 7 * 3600 + 13) {
    const AdDateTime written(AdTime(static_cast<std::int32_t>(t)));
    const std::string text = written.FormatGMT(kCanonical);
    AdDateTime read;
    ASSERT_EQ(read.ParseDateTimeGMT(text.c_str()), 1) << text;
    ASSERT_EQ(read.GetCTime().GetTime(), t) << text;
  }
}

TEST(ParseDateTime, Outcomes) {
  TzGuard tz("America/New_York");
  const struct {
    const char* text;
    Outcome outcome;
  } cases[] = {
      {"2003-05-17 14:03:09", {1, AdDateTime::valid, 1053194589, ""}},
      {"2003-05-17 14:03:09.250", {1, AdDateTime::valid, 1053194589, ""}},
      {"1970-01-01 00:00:00", {1, AdDateTime::valid, 5 * 3600, ""}},
      // 1899-12-30 is the date of a time of day read alone: 1970-01-01.
      {"1899-12-30 18:00:00", {1, AdDateTime::valid, 23 * 3600, ""}},
      {"1899-12-30 14:30:00", {1, AdDateTime::valid, 19 * 3600 + 1800, ""}},
      // The count of a refused local read is 0; the text is kept.
      {"1899-12-31 18:00:00", {0, AdDateTime::outOfRange, 0, "1899-12-31 18:00:00"}},
      {"2038-01-19 00:00:00", {0, AdDateTime::outOfRange, 0, "2038-01-19 00:00:00"}},
      {"1969-12-31 23:59:59", {0, AdDateTime::outOfRange, 0, "1969-12-31 23:59:59"}},
      // 2038-01-18 23:00 EST is past 2^31 seconds.
      {"2038-01-18 23:00:00", {0, AdDateTime::outOfRange, 0, "2038-01-18 23:00:00"}},
      {"not a date", {0, AdDateTime::invalid, 777, ""}},
      {"", {0, AdDateTime::invalid, 777, ""}},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.text);
    AdDateTime value = Dirty();
    EXPECT_EQ(value.ParseDateTime(c.text), c.outcome.result);
    EXPECT_EQ(value.GetStatus(), c.outcome.status);
    EXPECT_EQ(value.GetCTime().GetTime(), c.outcome.count);
    if (c.outcome.status == AdDateTime::outOfRange) {
      EXPECT_EQ(value.Format(kCanonical), c.outcome.kept);
    }
    if (c.outcome.status == AdDateTime::valid) {
      EXPECT_EQ(value.Format("%H:%M:%S"), std::string(c.text).substr(11, 8));
    }
  }
}

TEST(ParseDateTime, NullTextReadsAsEmpty) {
  AdDateTime value(AdTime(5));
  EXPECT_EQ(value.ParseDateTime(nullptr), 0);
  EXPECT_EQ(value.GetStatus(), AdDateTime::invalid);
  EXPECT_EQ(value.ParseDateTimeGMT(nullptr), 0);
  value.SetStatus(AdDateTime::outOfRange);
  EXPECT_EQ(value.Format(kCanonical), "");
}

// The canonical text reads back to its count, in zones with and without
// daylight saving, except within the repeated hour, where the first reading wins.
TEST(ParseDateTime, CanonicalRoundTrip) {
  for (const char* zone : {"UTC", "<+01>-1", "America/New_York", "Australia/Sydney"}) {
    TzGuard tz(zone);
    SCOPED_TRACE(zone);
    for (std::int64_t t = 86400; t <= INT32_MAX - 2 * 86400; t += 3 * 86400 + 3599) {
      const AdDateTime written(AdTime(static_cast<std::int32_t>(t)));
      const std::string text = written.Format(kCanonical);
      ASSERT_EQ(text.size(), 19u);
      AdDateTime read;
      ASSERT_EQ(read.ParseDateTime(text.c_str()), 1) << text;
      const std::int64_t back = read.GetCTime().GetTime();
      if (back != t) {  // the repeated hour: the earlier instant
        ASSERT_LT(back, t) << text;
        ASSERT_EQ(read.Format(kCanonical), text);
      }
    }
  }
}

}  // namespace
