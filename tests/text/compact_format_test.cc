#include <gtest/gtest.h>

#include <string>

#include "AdDateTime.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::TzGuard;
using datetimelib::testing::UtcCount;

AdDateTime At(std::int64_t count) {
  return AdDateTime(AdTime(static_cast<std::int32_t>(count)));
}

TEST(FormatTolvane, WritesLocalTime) {
  const struct {
    const char* zone;
    std::int64_t count;
    const char* text;
  } cases[] = {
      {"America/New_York", UtcCount(2003, 1, 5, 19, 7, 9), "05-Jan-2003.14:07:09"},
      {"America/New_York", UtcCount(2001, 1, 1, 4, 59, 59), "31-Dec-2000.23:59:59"},
      {"America/New_York", UtcCount(2004, 3, 1, 5), "01-Mar-2004.00:00:00"},
      {"America/New_York", UtcCount(2003, 6, 1, 5, 2, 3), "01-Jun-2003.01:02:03"},  // EDT
      {"<+01>-1", 0, "01-Jan-1970.01:00:00"},
      {"UTC", 2147483647, "19-Jan-2038.03:14:07"},
      // Counts no value holds validly are still written, sign-free and whole.
      {"UTC", -1, "31-Dec-1969.23:59:59"},
      {"UTC", INT32_MIN, "13-Dec-1901.20:45:52"},
  };
  for (const auto& c : cases) {
    TzGuard tz(c.zone);
    EXPECT_EQ(At(c.count).FormatTolvane(), c.text) << c.zone << " " << c.count;
  }
}

// The writer agrees with strftime's "%d-%b-%Y.%H:%M:%S" in the "C" locale (whose
// month names are the English abbreviations) across the range, in every month.
TEST(FormatTolvane, AgreesWithStrftime) {
  for (const char* zone : {"America/New_York", "Australia/Sydney", "<-0930>9:30"}) {
    TzGuard tz(zone);
    for (std::int64_t t = INT32_MIN; t <= INT32_MAX; t += 29 * 86400 + 3 * 3600 + 61) {
      const AdDateTime value = At(t);
      const std::string text = value.FormatTolvane();
      ASSERT_EQ(text, value.Format("%d-%b-%Y.%H:%M:%S")) << zone << " " << t;
      ASSERT_EQ(text.size(), 20u);
    }
  }
}

TEST(FormatTolvane, IgnoresTheStatus) {
  TzGuard tz("UTC");
  AdDateTime refused_parse = At(1000000000);
  refused_parse.ParseDateTime("not a date");             // invalid; count and text kept
  const AdDateTime refused_fields(2040, 1, 5, 7, 3, 0);  // outOfRange, count 0
  AdDateTime status_set = At(1000000000);
  status_set.SetStatus(AdDateTime::null);

  EXPECT_EQ(refused_parse.FormatTolvane(), "09-Sep-2001.01:46:40");
  EXPECT_EQ(refused_parse.Format("%Y"), "");
  EXPECT_EQ(refused_fields.FormatTolvane(), "01-Jan-1970.00:00:00");
  EXPECT_EQ(refused_fields.Format("%Y"), "2040/1/5 7:3:0");
  EXPECT_EQ(status_set.FormatTolvane(), "09-Sep-2001.01:46:40");
  EXPECT_EQ(AdDateTime().FormatTolvane(), "01-Jan-1970.00:00:00");
}

}  // namespace
