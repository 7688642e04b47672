// Test helpers that describe a value without going through the formatters.
#ifndef DATETIMELIB_TESTS_SUPPORT_VALUE_TEXT_H_
#define DATETIMELIB_TESTS_SUPPORT_VALUE_TEXT_H_

#include <cstdint>
#include <cstdio>
#include <ctime>
#include <string>

#include "AdDateTime.h"

namespace datetimelib::testing {

// "YYYY-MM-DD HH:MM:SS" of the value's local fields, read through the getters.
inline std::string LocalFieldsText(const AdDateTime& value) {
  char text[64];
  std::snprintf(text, sizeof text, "%04ld-%02ld-%02ld %02ld:%02ld:%02ld", value.GetYear(),
                value.GetMonth(), value.GetDay(), value.GetHour(), value.GetMinute(),
                value.GetSecond());
  return text;
}

// The UTC count of a UTC date and time, from the C library.
inline std::int64_t UtcCount(int year, int month, int day, int hour = 0, int minute = 0,
                             int second = 0) {
  std::tm fields{};
  fields.tm_year = year - 1900;
  fields.tm_mon = month - 1;
  fields.tm_mday = day;
  fields.tm_hour = hour;
  fields.tm_min = minute;
  fields.tm_sec = second;
  return static_cast<std::int64_t>(timegm(&fields));
}

// A valid value with the count 777 and the kept text "kept", to show what a
// call replaces and what it leaves.
inline AdDateTime Dirty() {
  AdDateTime value{AdTime(777)};
  value.ParseDateTime("kept");
  value.SetStatus(AdDateTime::valid);
  return value;
}

// The text a value keeps, shown by Format only for outOfRange.
inline std::string KeptText(AdDateTime value) {
  value.SetStatus(AdDateTime::outOfRange);
  return value.Format("%Y-%m-%d %H:%M:%S");
}

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_VALUE_TEXT_H_
