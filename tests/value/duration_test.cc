#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <type_traits>

#include "AdDateTime.h"

namespace {

static_assert(!std::is_convertible_v<int, AdTime>, "a count is never implicit");
static_assert(std::is_nothrow_move_constructible_v<AdDateTime>);

// Every part truncates toward zero, so the parts of a negative span are never
// positive; the extremes show that no part overflows.
TEST(AdDuration, PartsTruncateTowardZero) {
  const struct {
    std::int32_t seconds;
    std::int32_t days, total_hours, hours, total_minutes, minutes, parts_seconds;
  } cases[] = {
      {-90, 0, 0, 0, -1, -1, -30},
      {90000, 1, 25, 1, 1500, 0, 0},
      {-90061, -1, -25, -1, -1501, -1, -1},
      {INT32_MAX, 24855, 596523, 3, 35791394, 14, 7},
      {INT32_MIN, -24855, -596523, -3, -35791394, -14, -8},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.seconds);
    const AdDuration span = AdDuration::FromSeconds(c.seconds);
    EXPECT_EQ(span.GetDays(), c.days);
    EXPECT_EQ(span.GetTotalHours(), c.total_hours);
    EXPECT_EQ(span.GetHours(), c.hours);
    EXPECT_EQ(span.GetTotalMinutes(), c.total_minutes);
    EXPECT_EQ(span.GetMinutes(), c.minutes);
    EXPECT_EQ(span.GetSeconds(), c.parts_seconds);
  }
}

TEST(AdDuration, Construction) {
  const struct {
    const char* what;
    AdDuration span;
    std::int32_t seconds;
  } cases[] = {
      {"0.5 day", AdDuration(0.5), 43200},
      {"truncated toward zero", AdDuration(-0.00001), 0},
      {"an int is days", AdDuration(1), 86400},
      {"saturated above", AdDuration(1e12), INT32_MAX},
      {"saturated below", AdDuration(-1e12), INT32_MIN},
      {"NaN", AdDuration(std::nan("")), 0},
      {"parts", AdDuration(1, -1, 1, -1), 82859},
      // 24856 days are past 32 bits: the total wraps modulo 2^32.
      {"wraps", AdDuration(24856, 0, 0, 0),
       static_cast<std::int32_t>(24856LL * 86400 - 4294967296LL)},
  };
  for (const auto& c : cases) EXPECT_EQ(c.span.GetTotalSeconds(), c.seconds) << c.what;
}

TEST(Arithmetic, StatusRules) {
  AdDateTime refused(2040, 1, 1, 0, 0, 0);
  const AdDateTime shifted = refused + AdDuration(0.0);
  EXPECT_EQ(shifted.GetStatus(), AdDateTime::valid);  // + makes a new valid value
  EXPECT_EQ(shifted.Format("%Y"), "1970");            // from the refused count, 0
  refused += AdDuration(0.0);                         // += keeps status and text
  EXPECT_EQ(refused.Format(""), "2040/1/1 0:0:0");

  AdDateTime nothing;
  nothing -= AdDuration(1.0);
  EXPECT_EQ(nothing.GetStatus(), AdDateTime::null);
  EXPECT_EQ(nothing.GetCTime().GetTime(), -86400);
  EXPECT_EQ((AdDateTime(AdTime(0)) - AdDuration(1.0)).GetStatus(), AdDateTime::valid);
}

TEST(Arithmetic, WrapsModulo2To32WithoutOverflow) {
  const AdDateTime last(AdTime(INT32_MAX));
  EXPECT_EQ((last + AdDuration::FromSeconds(1)).GetCTime().GetTime(), INT32_MIN);
  EXPECT_EQ(
      (AdDateTime(AdTime(INT32_MIN)) - AdDuration::FromSeconds(1)).GetCTime().GetTime(),
      INT32_MAX);
  EXPECT_EQ((last - AdDateTime(AdTime(-1))).GetTotalSeconds(), INT32_MIN);
}

TEST(Arithmetic, ComparisonsReadCountsOnly) {
  const AdDateTime early(AdTime(1000));
  AdDateTime invalid_twin(AdTime(1000));
  invalid_twin.SetStatus(AdDateTime::invalid);
  EXPECT_EQ(early == invalid_twin, 1);
  EXPECT_EQ(early < invalid_twin, 0);
  EXPECT_EQ(invalid_twin < early, 0);
  EXPECT_EQ(early >= invalid_twin, 1);

  const AdDateTime negative(AdTime(-5));  // signed comparison
  EXPECT_EQ(negative < early, 1);
  EXPECT_EQ(negative > early, 0);
  EXPECT_EQ((negative - early).GetTotalSeconds(), -1005);
}

}  // namespace
