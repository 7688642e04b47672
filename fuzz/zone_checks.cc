#include "zone_checks.h"

#include <cmath>
#include <cstring>
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "fuzz_support.h"
#include "platform/zone/local_time.h"

namespace datetimelib::fuzz {
namespace {

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";
constexpr std::int64_t kStep = 86400 * 1553 + 3601;  // 16 counts across the range

// A canonical date-time text (its fields a real date in the range), or the kept
// text of fields out of range ("2039/3/13 1:59:59"). The canonical text need not
// read back as local time: the end of Dublin's daylight part is a time its
// clocks skip.
bool IsDateText(const std::string& text) {
  AdDateTime value;
  if (value.ParseDateTimeGMT(text.c_str()) == 1)
    return value.FormatGMT(kCanonical) == text;
  int fields = 0;
  for (const char c : text) {
    if (c == '/' || c == ' ' || c == ':') {
      ++fields;
    } else if ((c < '0' || c > '9') && c != '-') {
      return false;
    }
  }
  return fields == 5;
}

}  // namespace

void CheckZoneQuestions(std::uint32_t phase, std::string_view label) {
  const double offset = AdDateTime::GetGMTOffset();
  Check(std::isfinite(offset) && offset == std::trunc(offset),
        "GetGMTOffset gives whole minutes", label);
  const int uses_dst = AdDateTime::UsesDST();
  Check(uses_dst == 0 || uses_dst == 1, "UsesDST gives 0 or 1", label);
  const int edge_years[] = {1969, 1970, 2037, 2038, -1, 2147483647};
  for (const int year : {edge_years[phase % 6], static_cast<int>(1970 + phase % 80)}) {
    std::string start = "x", end = "x";
    Check(AdDateTime::GenerateDSTDates(year, start, end) == 1,
          "GenerateDSTDates returns 1", label);
    if (uses_dst == 0) {
      Check(start.empty() && end.empty(), "no daylight saving, no dates", label);
    } else {
      Check(IsDateText(start) && IsDateText(end), "the dates are date texts",
            std::string(label) + " " + start + " / " + end);
    }
    std::string table_start = "x", table_end = "x";
    Check(AdDateTime::GetDSTDates(nullptr, year, table_start, table_end) == uses_dst &&
              table_start == start && table_end == end,
          "GetDSTDates without a table gives the computed dates", label);
  }
  for (std::int64_t t = phase % kStep; t <= INT32_MAX; t += kStep) {
    const AdDateTime value(AdTime{static_cast<std::int32_t>(t)});
    const AdDateTime composed(value.GetYear(), value.GetMonth(), value.GetDay(),
                              value.GetHour(), value.GetMinute(), value.GetSecond());
    if (!composed.IsValid()) continue;  // local fields beyond the range's ends
    Check(composed.GetCTime().GetTime() <= t &&
              composed.Format(kCanonical) == value.Format(kCanonical),
          "fields compose back to their first instant", label);
  }
}

void CheckBreakdownAgainstCLibrary(std::uint32_t phase, std::string_view label) {
  tzset();  // localtime_r reads TZ only on its first call
  for (std::int64_t t = phase % kStep; t <= INT32_MAX; t += kStep) {
    const platform::BrokenDownTime ours = platform::BreakDownLocal(t);
    const std::time_t time = static_cast<std::time_t>(t);
    std::tm theirs;
    localtime_r(&time, &theirs);
    Check(ours.year == theirs.tm_year + 1900 && ours.month == theirs.tm_mon + 1 &&
              ours.day == theirs.tm_mday && ours.hour == theirs.tm_hour &&
              ours.minute == theirs.tm_min && ours.second == theirs.tm_sec &&
              ours.weekday == theirs.tm_wday && ours.yearday == theirs.tm_yday &&
              ours.utc_offset == theirs.tm_gmtoff &&
              ours.is_dst == (theirs.tm_isdst > 0) &&
              std::strncmp(ours.abbreviation, theirs.tm_zone,
                           sizeof ours.abbreviation - 1) == 0,
          "the breakdown is localtime_r's",
          std::string(label) + " at " + std::to_string(t));
  }
}

}  // namespace datetimelib::fuzz
