// Writing a value in the compact form "05-Jan-2003.14:07:09", local time.
#include <cstring>
#include <string>

#include "AdDateTime.h"
#include "platform/zone/local_time.h"
#include "text/digits.h"
#include "text/english_names.h"

namespace {

// "DD-Mon-YYYY.HH:MM:SS" into `text`; returns its length.
std::size_t WriteCompact(std::int32_t seconds, char (&text)[32]) {
  // One breakdown, so that all six fields describe the same instant.
  const auto local = datetimelib::platform::BreakDownLocal(seconds);
  char* p =
      datetimelib::WriteTwoDigits(text, local.day);  // the year takes at most 11 bytes
  *p++ = '-';
  // Every abbreviation has three letters.
  std::memcpy(p, datetimelib::MonthAbbreviation(local.month).data(), 3);
  p += 3;
  *p++ = '-';
  // Four digits for every count of 32 bits; the general writer for the rest.
  p = local.year >= 1000 && local.year <= 9999
          ? datetimelib::WriteFourDigits(p, local.year)
          : datetimelib::WriteDecimal(p, local.year);
  *p++ = '.';
  p = datetimelib::WriteTwoDigits(p, local.hour);
  *p++ = ':';
  p = datetimelib::WriteTwoDigits(p, local.minute);
  *p++ = ':';
  p = datetimelib::WriteTwoDigits(p, local.second);
  return static_cast<std::size_t>(p - text);
}

}  // namespace

// The status is not consulted: every value writes the count it holds.
void AdDateTime::FormatTolvaneInto(std::string& out) const {
  char text[32];
  out.assign(text, WriteCompact(seconds_, text));
}

std::string AdDateTime::FormatTolvane() const {
  char text[32];
  return std::string(text, WriteCompact(seconds_, text));
}
