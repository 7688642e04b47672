// Writing a value in the compact form "05-Jan-2003.14:07:09", local time.
#include <cstring>
#include <string>

#include "AdDateTime.h"
#include "platform/zone/local_time.h"
#include "text/digits.h"
#include "text/english_names.h"

void AdDateTime::FormatTolvaneInto(std::string& out) const {
  // One breakdown, so that all six fields describe the same instant. The status
  // is not consulted: every value writes the count it holds.
  const auto local = datetimelib::platform::BreakDownLocal(seconds_);
  char text[32];  // "DD-Mon-YYYY.HH:MM:SS"; the year takes at most 11 bytes
  char* p = datetimelib::WriteTwoDigits(text, local.day);
  *p++ = '-';
  const std::string_view month = datetimelib::MonthAbbreviation(local.month);
  std::memcpy(p, month.data(), month.size());
  p += month.size();
  *p++ = '-';
  p = datetimelib::WriteDecimal(p, local.year);
  *p++ = '.';
  p = datetimelib::WriteTwoDigits(p, local.hour);
  *p++ = ':';
  p = datetimelib::WriteTwoDigits(p, local.minute);
  *p++ = ':';
  p = datetimelib::WriteTwoDigits(p, local.second);
  out.assign(text, static_cast<std::size_t>(p - text));
}

std::string AdDateTime::FormatTolvane() const {
  std::string text;
  FormatTolvaneInto(text);
  return text;
}
