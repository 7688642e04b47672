#include <gtest/gtest.h>

#include <string>

#include "AdDateTime.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

TEST(Format, CanonicalTextLocalAndGmt) {
  const struct {
    std::int32_t count;
    const char* gmt;
    const char* east;  // "<+01>-1"
  } cases[] = {
      {0, "1970-01-01 00:00:00", "1970-01-01 01:00:00"},
      {1000000000, "2001-09-09 01:46:40", "2001-09-09 02:46:40"},
      {2147483647, "2038-01-19 03:14:07", "2038-01-19 04:14:07"},
      {-1, "1969-12-31 23:59:59", "1970-01-01 00:59:59"},
  };
  TzGuard tz("<+01>-1");
  for (const auto& c : cases) {
    const AdDateTime value(AdTime(c.count));
    EXPECT_EQ(value.FormatGMT(kCanonical), c.gmt);
    EXPECT_EQ(value.Format(kCanonical), c.east);
  }
}

TEST(Format, StatusRule) {
  AdDateTime invalid_value(AdTime(0));
  invalid_value.ParseDateTime("not a date");
  AdDateTime refused(2040, 1, 1, 0, 0, 0);
  AdDateTime refused_without_text(AdTime(0));
  refused_without_text.SetStatus(AdDateTime::outOfRange);
  AdDateTime unknown_status(2040, 1, 1, 0, 0, 0);
  unknown_status.SetStatus(static_cast<AdDateTime::AdDateTimeStatus>(4));

  const struct {
    const AdDateTime* value;
    const char* text;
  } cases[] = {
      {new AdDateTime(), ""},      {&invalid_value, ""},  {&refused, "2040/1/1 0:0:0"},
      {&refused_without_text, ""}, {&unknown_status, ""},
  };
  for (const auto& c : cases) {
    for (const char* pattern : {kCanonical, "%H", "", "literal"}) {
      EXPECT_EQ(c.value->Format(pattern), c.text) << pattern;
      EXPECT_EQ(c.value->FormatGMT(pattern), c.text) << pattern;
    }
  }
  delete cases[0].value;
}

TEST(Format, PatternsAndLimits) {
  TzGuard tz("America/New_York");
  const AdDateTime summer(AdTime(1053194589));  // 2003-05-17 14:03:09 EDT
  EXPECT_EQ(summer.Format("%Z %z"), "EDT -0400");
  EXPECT_EQ(summer.FormatGMT("%Z %z %H"), "GMT +0000 18");
  EXPECT_EQ(summer.Format("%a %b %j"), "Sat May 137");
  EXPECT_EQ(summer.Format(""), "");
  EXPECT_EQ(summer.Format(nullptr), "");
  EXPECT_EQ(summer.FormatGMT(nullptr), "");
  EXPECT_EQ(summer.Format("%p"), "PM");

  // A long pattern is written whole, not cut.
  std::string pattern;
  for (int i = 0; i < 2000; ++i) pattern += "%Y-%m-%d %H:%M:%S|";
  const std::string text = summer.Format(pattern.c_str());
  EXPECT_EQ(text.size(), 2000u * 20);
  EXPECT_EQ(text.substr(0, 20), "2003-05-17 14:03:09|");
}

}  // namespace
