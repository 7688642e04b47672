// The fields a text reader gives, and the test that they name a real date-time.
#ifndef DATETIMELIB_TEXT_DATE_TIME_FIELDS_H_
#define DATETIMELIB_TEXT_DATE_TIME_FIELDS_H_

#include <string_view>

#include "platform/civil/civil.h"

namespace datetimelib {

// A date and time as read from text. A text holding only a time of day gives the
// date 1899-12-30, which the field constructor turns into that time on 1970-01-01.
struct DateTimeFields {
  int year = 1899;  // with century
  int month = 12;   // [1:12]
  int day = 30;     // [1:31]
  int hour = 0;     // [0:23]
  int minute = 0;   // [0:59]
  int second = 0;   // [0:59]
  // The zone the text names, if it names one: a numeric offset ("-0500") or
  // an abbreviation ("EST"), which points into the text read.
  bool has_zone_offset = false;
  int zone_offset = 0;  // seconds east of UTC
  std::string_view zone_name;
};

inline bool NamesZone(const DateTimeFields& f) {
  return f.has_zone_offset || !f.zone_name.empty();
}

// Readers refuse what no calendar has: month 13, 30 February, hour 24, minute
// 60, second 60. Years run from 1 to 9999.
inline bool IsPossibleDateTime(const DateTimeFields& f) {
  return f.year >= 1 && f.year <= 9999 && f.month >= 1 && f.month <= 12 && f.day >= 1 &&
         f.day <= platform::DaysInMonth(f.year, f.month) && f.hour >= 0 && f.hour <= 23 &&
         f.minute >= 0 && f.minute <= 59 && f.second >= 0 && f.second <= 59;
}

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_DATE_TIME_FIELDS_H_
