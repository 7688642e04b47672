#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <type_traits>

#include "AdDateTime.h"

namespace {

static_assert(!std::is_convertible_v<int, AdTime>, "a count is never implicit");
static_assert(std::is_nothrow_move_constructible_v<AdDateTime>);
static_assert(std::is_trivially_copyable_v<AdDuration>);

struct Parts {
  std::int32_t days, total_hours, hours, total_minutes, minutes, total_seconds, seconds;
};

void ExpectParts(const AdDuration& span, const Parts& p) {
  EXPECT_EQ(span.GetDays(), p.days);
  EXPECT_EQ(span.GetTotalHours(), p.total_hours);
  EXPECT_EQ(span.GetHours(), p.hours);
  EXPECT_EQ(span.GetTotalMinutes(), p.total_minutes);
  EXPECT_EQ(span.GetMinutes(), p.minutes);
  EXPECT_EQ(span.GetTotalSeconds(), p.total_seconds);
  EXPECT_EQ(span.GetSeconds(), p.seconds);
}

TEST(AdDuration, PartsTruncateTowardZero) {
  const struct {
    std::int32_t seconds;
    Parts parts;
  } cases[] = {
      {0, {0, 0, 0, 0, 0, 0, 0}},
      {-90, {0, 0, 0, -1, -1, -90, -30}},
      {90000, {1, 25, 1, 1500, 0, 90000, 0}},
      {-90061, {-1, -25, -1, -1501, -1, -90061, -1}},
      {86399, {0, 23, 23, 1439, 59, 86399, 59}},
      {INT32_MAX, {24855, 596523, 3, 35791394, 14, INT32_MAX, 7}},
      {INT32_MIN, {-24855, -596523, -3, -35791394, -14, INT32_MIN, -8}},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.seconds);
    ExpectParts(AdDuration::FromSeconds(c.seconds), c.parts);
  }
}

TEST(AdDuration, FromDays) {
  const struct {
    double days;
    std::int32_t seconds;
  } cases[] = {
      {0.5, 43200},
      {1.5, 129600},
      {-0.25, -21600},
      {-1.0, -86400},
      {-0.00001, 0},
      {0.00001, 0},
      {1.0 / 86400.0 * 0.999, 0},
      {24855.0, 2147472000},
      // Beyond 32 bits: saturated, never undefined.
      {1e12, INT32_MAX},
      {-1e12, INT32_MIN},
      {std::numeric_limits<double>::infinity(), INT32_MAX},
      {std::nan(""), 0},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.days);
    EXPECT_EQ(AdDuration(c.days).GetTotalSeconds(), c.seconds);
  }
}

TEST(AdDuration, FromParts) {
  EXPECT_EQ(AdDuration(0, 25, 0, 0).GetTotalSeconds(), 90000);
  EXPECT_EQ(AdDuration(-365, 0, 0, 0).GetTotalSeconds(), -31536000);
  EXPECT_EQ(AdDuration(1, -1, 1, -1).GetTotalSeconds(), 82859);
  EXPECT_EQ(AdDuration(0, 0, -90, 30).GetTotalSeconds(), -5370);
  // 24856 days are past 32 bits: the total wraps modulo 2^32.
  EXPECT_EQ(AdDuration(24856, 0, 0, 0).GetTotalSeconds(),
            static_cast<std::int32_t>(24856LL * 86400 - 4294967296LL));
  // A plain integer is a number of days.
  EXPECT_EQ(AdDuration(1).GetTotalSeconds(), 86400);
}

TEST(Arithmetic, PlusAndMinusGiveValidValues) {
  AdDateTime refused(2040, 1, 1, 0, 0, 0);
  const AdDateTime shifted = refused + AdDuration(0.0);
  EXPECT_EQ(shifted.GetStatus(), AdDateTime::valid);
  EXPECT_EQ(shifted.Format("%Y"), "1970");  // the refused count is 0

  refused += AdDuration(0.0);
  EXPECT_EQ(refused.GetStatus(), AdDateTime::outOfRange);
  EXPECT_EQ(refused.Format(""), "2040/1/1 0:0:0");

  AdDateTime nothing;
  nothing += AdDuration(1.0);
  EXPECT_EQ(nothing.GetStatus(), AdDateTime::null);
  EXPECT_EQ(nothing.GetCTime().GetTime(), 86400);
  nothing -= AdDuration(2.0);
  EXPECT_EQ(nothing.GetCTime().GetTime(), -86400);

  const AdDateTime before_epoch = AdDateTime(AdTime(0)) - AdDuration(1.0);
  EXPECT_EQ(before_epoch.GetStatus(), AdDateTime::valid);
  EXPECT_EQ(before_epoch.GetCTime().GetTime(), -86400);
}

TEST(Arithmetic, WrapsModulo2To32WithoutOverflow) {
  const AdDateTime last(AdTime(INT32_MAX));
  EXPECT_EQ((last + AdDuration::FromSeconds(1)).GetCTime().GetTime(), INT32_MIN);
  EXPECT_EQ(
      (AdDateTime(AdTime(INT32_MIN)) - AdDuration::FromSeconds(1)).GetCTime().GetTime(),
      INT32_MAX);
  EXPECT_EQ((last - AdDateTime(AdTime(-1))).GetTotalSeconds(), INT32_MIN);
  AdDateTime value(AdTime(INT32_MIN));
  value -= AdDuration::FromSeconds(INT32_MIN);
  EXPECT_EQ(value.GetCTime().GetTime(), 0);
}

TEST(Arithmetic, DifferencesAndComparisonsReadCountsOnly) {
  const AdDateTime early(AdTime(1000));
  const AdDateTime late(AdTime(91000));
  EXPECT_EQ((early - early).GetTotalSeconds(), 0);
  EXPECT_EQ((late - early).GetDays(), 1);
  EXPECT_EQ((early - late).GetTotalSeconds(), -90000);
  EXPECT_LE((early - late).GetDays(), 0);

  AdDateTime invalid_twin(AdTime(1000));
  invalid_twin.SetStatus(AdDateTime::invalid);
  EXPECT_EQ(early == invalid_twin, 1);
  EXPECT_EQ(early != invalid_twin, 0);
  EXPECT_EQ(early < invalid_twin, 0);
  EXPECT_EQ(invalid_twin < early, 0);
  EXPECT_EQ(early <= invalid_twin, 1);
  EXPECT_EQ(early >= invalid_twin, 1);

  const AdDateTime negative(AdTime(-5));  // signed comparison
  EXPECT_EQ(negative < early, 1);
  EXPECT_EQ(negative > early, 0);
  EXPECT_EQ(late > early, 1);
  EXPECT_EQ(late >= early, 1);
  EXPECT_EQ(late <= early, 0);
  EXPECT_EQ(late != early, 1);
}

}  // namespace
