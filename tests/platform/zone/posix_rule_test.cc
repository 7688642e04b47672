#include "platform/zone/posix_rule.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

namespace platform = datetimelib::platform;

// Each part of a rule string just within its limits and just beyond them. What
// the forms mean is compared with glibc through the zone engine
// (zone_timeline_test) and the DST dates (dst_rule_dates_libc_test), which also
// place every month-week-day rule of the system's zones.
TEST(ParsePosixRule, AcceptsEachPartOnlyWithinItsLimits) {
  const struct {
    const char* part;
    std::vector<const char*> accepted, refused;
  } cases[] = {
      {"names: three characters at least, quotes closed, nothing else inside",
       {"XST3", "<A-1>1", "EST5EDT", "xyz3"},
       {"", "XS5", "<XS>5", "<XST5", "<X_T>5", "EST5ED"}},
      {"offsets: required for standard time, at most 24:00:00, fields in range",
       {"XST-24", "<-0325>+3:25:45", "EST5EDT2:30:15", "EST9EDT-24"},
       {"EST", "EST+", "EST24:00:01", "EST5:60", "EST5:00:60", "EST5:", "EST5EDT24:00:01",
        "EST99999999999999999999"}},
      {"dates: within their ranges, complete",
       {"EST5EDT,M1.1.0,M12.5.6", "EST5EDT,J1,J365", "EST5EDT,0,365"},
       {"EST5EDT,M0.1.0,M11.1.0", "EST5EDT,M13.1.0,M11.1.0", "EST5EDT,M3.0.0,M11.1.0",
        "EST5EDT,M3.6.0,M11.1.0", "EST5EDT,M3.2.7,M11.1.0", "EST5EDT,J0,J300",
        "EST5EDT,J366,J300", "EST5EDT,366,300", "EST5EDT,M3.2,M11.1.0"}},
      {"times: within +/-167 h, not empty",
       {"EST5EDT,M3.2.0/-167,M11.1.0/+167:00", "EST5EDT,M3.2.0/1:59:59,M11.1.0/-0:30"},
       {"EST5EDT,M3.2.0/168,M11.1.0", "EST5EDT,M3.2.0/-168,M11.1.0",
        "EST5EDT,M3.2.0/167:00:01,M11.1.0", "EST5EDT,M3.2.0/1:60,M11.1.0",
        "EST5EDT,M3.2.0/,M11.1.0"}},
      {"rule lists: both transitions or none (a lone \",\" is none), nothing after them",
       {"EST5EDT,", "EST5EDT,M3.2.0,M11.1.0"},
       {"EST5EDT,M3.2.0", "EST5EDT,M3.2.0,", "EST5EDT,,M11.1.0", "EST5EDT;M3.2.0,M11.1.0",
        "EST5EDT,M3.2.0,M11.1.0,", "EST5EDT,M3.2.0,M11.1.0x", "EST5x"}},
  };
  for (const auto& c : cases) {
    for (const char* text : c.accepted) {
      EXPECT_TRUE(platform::ParsePosixRule(text).has_value()) << c.part << ": " << text;
    }
    for (const char* text : c.refused) {
      EXPECT_FALSE(platform::ParsePosixRule(text).has_value()) << c.part << ": " << text;
    }
  }
}

}  // namespace
