#include <gtest/gtest.h>

#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"

namespace {

using datetimelib::testing::TzGuard;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

AdDateTime At(std::int64_t count) {
  return AdDateTime(AdTime(static_cast<std::int32_t>(count)));
}

// The fuzz target holds the formatters' status rule for any pattern; the
// compact text writes the count held, whatever the status.
TEST(Formatters, CompactTextWritesTheCountWhateverTheStatus) {
  TzGuard tz("UTC");
  AdDateTime unreadable = At(1000000000);
  unreadable.ParseDateTime("not a date");         // invalid; the count is kept
  const AdDateTime refused(2040, 1, 5, 7, 3, 0);  // outOfRange, count 0
  EXPECT_EQ(unreadable.FormatTolvane(), "09-Sep-2001.01:46:40");
  EXPECT_EQ(refused.FormatTolvane(), "01-Jan-1970.00:00:00");
  EXPECT_EQ(refused.Format(AdDateTime::dateOnly, AdDateTime::invariantLocale),
            "2040/1/5 7:3:0");
  std::string out = "stale";
  unreadable.FormatInto(out, kCanonical);
  EXPECT_EQ(out, "");
}

// The format fuzz corpus compares any pattern, long texts and zone names
// included, with strftime; here, the null pattern and the widths it does not
// reach.
TEST(Format, NullPatternAndWidths) {
  TzGuard tz("America/New_York");
  const AdDateTime summer = At(1053194589);  // 2003-05-17 14:03:09 EDT
  EXPECT_EQ(summer.Format(nullptr), "");
  EXPECT_EQ(summer.FormatGMT(nullptr), "");

  // Field widths are applied however short the pattern, up to 1024; a wider one
  // is written as it stands rather than asking for the memory it names. An
  // empty conversion stays empty, and a lone "%" ends the text as strftime ends it.
  const struct {
    const char* pattern;
    std::string expected;
  } widths[] = {
      {"%600d", std::string(598, '0') + "17"},
      {"<%_1024H>", "<" + std::string(1022, ' ') + "14>"},
      {"%1025d|%2147483648Y|%99999999999999999999m",
       "%1025d|%2147483648Y|%99999999999999999999m"},
      {"%-5d%%%E", "   17%%E"},
      {"%30p", std::string(28, ' ') + "PM"},
      {"%Y%", "2003%"},
      {"%5d|%+1%M", "00017|%+103"},  // "+" is no flag: "%M" follows "%+" and "1"
  };
  for (const auto& [wide, expected] : widths) {
    EXPECT_EQ(summer.Format(wide), expected) << wide;
  }
}

// A pattern goes to strftime whole, widths or not: glibc carries a flag of one
// era year ("%-EY") to the next, so writing conversions apart would differ.
TEST(Format, ConversionsShareOneCall) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("Asia/Tokyo");
  datetimelib::testing::ThreadLocale japanese("ja_JP.UTF-8");
  const AdDateTime value = At(1679828296);  // 2023-03-26, Reiwa 5
  const std::time_t time = 1679828296;
  std::tm fields;
  localtime_r(&time, &fields);
  for (const char* pattern : {"%-EY %EY", "%-EY %5d %EY", "%_EY|%EY|%Oy"}) {
    char expected[256];
    const std::size_t length = std::strftime(expected, sizeof expected, pattern, &fields);
    EXPECT_EQ(value.Format(pattern), std::string(expected, length)) << pattern;
  }
}

// The canonical and the compact text, written digit by digit into the caller's
// buffer, are what strftime writes ("%T" is "%H:%M:%S", spelt so as to take the
// strftime path; "%b" is English in the "C" locale), across the whole range.
TEST(FormatInto, DirectDigitsAgreeWithStrftime) {
  std::string out;
  out.reserve(64);
  const char* const buffer = out.data();
  for (const char* zone : {"Australia/Lord_Howe", "America/New_York", "<-0930>9:30"}) {
    TzGuard tz(zone);
    for (std::int64_t t = INT32_MIN; t <= INT32_MAX; t += 23 * 86400 + 3 * 3600 + 61) {
      SCOPED_TRACE(testing::Message() << zone << " " << t);
      const AdDateTime value = At(t);
      value.FormatInto(out, kCanonical);
      ASSERT_EQ(out, value.Format("%Y-%m-%d %T"));
      value.FormatGMTInto(out, kCanonical);
      ASSERT_EQ(out, value.FormatGMT("%Y-%m-%d %T"));
      value.FormatTolvaneInto(out);
      ASSERT_EQ(out, value.Format("%d-%b-%Y.%H:%M:%S"));
    }
  }
  EXPECT_EQ(out.data(), buffer);  // never reallocated
}

}  // namespace
