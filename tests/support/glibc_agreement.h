// Checks that our zone engine answers as glibc does, zone by zone.
#ifndef DATETIMELIB_TESTS_SUPPORT_GLIBC_AGREEMENT_H_
#define DATETIMELIB_TESTS_SUPPORT_GLIBC_AGREEMENT_H_

#include <cstdint>
#include <string>
#include <vector>

namespace datetimelib::testing {

struct AgreementReport {
  std::int64_t instants_checked = 0;     // breakdowns compared with localtime_r
  std::int64_t transitions_found = 0;    // where localtime_r's offset or isdst changed
  std::int64_t local_hours_checked = 0;  // compositions compared with mktime
  std::int64_t repeated_hours = 0;       // compositions checked against our own rule
  std::vector<std::string> mismatches;   // the first few, described
};

// Sets TZ to `tz` (and restores it) and compares, from 1970 to 2038:
//  * breakdown with localtime_r (fields, weekday, day of year, offset, isdst,
//    abbreviation) every hour, and at every transition -1 s, at it and +1 s,
//    the transitions found by bisecting with localtime_r itself;
//  * composition with mktime (tm_isdst = -1) for every local hour that occurs
//    once or not at all; a local hour that occurs twice must give its earlier
//    instant, which mktime does not promise.
AgreementReport CheckAgreementWithGlibc(const char* tz, int step_hours = 1);

// The zone files of the system tz database (TZif files under
// /usr/share/zoneinfo, without the posix/ and right/ copies), one name for each
// distinct file, sorted.
std::vector<std::string> SystemZoneNames();

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_GLIBC_AGREEMENT_H_
