// Reading the date and time that a person types, in the compact form
// "05-Jan-2003.14:07:09" and its looser and relative forms, into fields.
//
// This is the text half of the compact parser: no clock, no zone. The caller
// gives today's local date, and builds an instant from the fields; the fields are
// not carried here (day 0, day 31 of April and hour 25 are handed on as read).
#ifndef DATETIMELIB_TEXT_COMPACT_TEXT_H_
#define DATETIMELIB_TEXT_COMPACT_TEXT_H_

#include <cstdint>
#include <optional>
#include <string_view>

namespace datetimelib {

// The local date that keywords count from.
struct LocalToday {
  int year;     // with century
  int month;    // [1:12]
  int day;      // [1:31]
  int weekday;  // [0:6], 0 == Sunday
};

struct TypedDateTime {
  int year = 0;    // 0 for an empty date part
  int month = 0;   // [1:12], 0 for an empty date part
  int day = 0;     // as typed or counted from today: may be 0, negative or 32+
  int hour = 0;    // any 32-bit number
  int minute = 0;  // any 32-bit number
  int second = 0;  // any 32-bit number
  bool year_defaulted = false;  // a day and month without a year: today's year
  bool utc = false;             // the fields are UTC ("UTC" followed the time)
  // Signed seconds to add to the instant read: "UTC+2" gives +7200, "UTC-1:30"
  // -5400. Within +/-2^43, since hours and minutes are each read in 32 bits.
  std::int64_t offset_seconds = 0;
};

// text := date "." time | time-with-":" | date
//
// Fields from the whole text, or nothing when it is refused. The word "now" is
// not read here. See ParseTolvaneDateTime in AdDateTime.h for the forms.
std::optional<TypedDateTime> ReadTypedDateTime(std::string_view text,
                                               const LocalToday& today);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_COMPACT_TEXT_H_
