#include <gtest/gtest.h>

#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

constexpr bool kLocal = false, kGmt = true;
constexpr auto kValid = AdDateTime::valid, kInvalid = AdDateTime::invalid,
               kOutOfRange = AdDateTime::outOfRange;

// Each read starts from a value with the count 777 and the kept text "kept". A
// refused text is kept in their place (Format shows it for outOfRange); a valid
// read keeps none.
TEST(ParseDateTime, Outcomes) {
  TzGuard tz("America/New_York");
  const struct {
    const char* text;
    bool gmt;
    AdDateTime::AdDateTimeStatus status;  // ParseDateTime(GMT) gives 1 for valid
    std::int32_t count;
  } cases[] = {
      // The fuzz target holds these rules for any text; here, the ends of the range
      // and the texts it does not make. "." as the 20th byte: the second read
      // drops the fraction.
      {"2038-01-18 23:59:59", kGmt, kValid, 2147471999},
      {"2003-05-17 14:03:09.250", kGmt, kValid, 1053180189},
      {"2003-05-17 14:03:9.5", kGmt, kInvalid, 777},
      // Out of range, a time of day alone too: the count stays.
      {"2038-01-19 00:00:00", kGmt, kOutOfRange, 777},
      {"14:30:00", kGmt, kOutOfRange, 777},
      {nullptr, kGmt, kInvalid, 777},  // read as the empty text
      // Local time: 1899-12-30, the date of a time of day read alone, is 1970-01-01;
      // out of range, the count is 0.
      {"14:30", kLocal, kValid, 19 * 3600 + 30 * 60},
      {"1899-12-31 18:00:00", kLocal, kOutOfRange, 0},
      {"2038-01-18 23:00:00", kLocal, kOutOfRange, 0},  // past 2^31 s in New York
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(testing::Message() << (c.text ? c.text : "(null)") << " gmt " << c.gmt);
    AdDateTime value(AdTime(777));
    value.ParseDateTime("kept");
    const int ok = c.status == AdDateTime::valid ? 1 : 0;
    EXPECT_EQ(c.gmt ? value.ParseDateTimeGMT(c.text) : value.ParseDateTime(c.text), ok);
    EXPECT_EQ(value.GetStatus(), c.status);
    EXPECT_EQ(value.GetCTime().GetTime(), c.count);
    value.SetStatus(AdDateTime::outOfRange);
    EXPECT_EQ(value.Format("%F %T"), ok || !c.text ? "" : c.text);
  }
}

// The UTC count is the C library's, for what it writes every 9 days and 7 hours.
TEST(ParseDateTimeGMT, AgreesWithTheCLibrary) {
  for (std::time_t t = 0; t <= 2147471999; t += 9 * 86400 + 7 * 3600 + 13) {
    std::tm fields{};
    gmtime_r(&t, &fields);
    char text[32];
    std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", &fields);
    AdDateTime read;
    ASSERT_EQ(read.ParseDateTimeGMT(text), 1) << text;
    ASSERT_EQ(read.GetCTime().GetTime(), t) << text;
  }
}

}  // namespace
