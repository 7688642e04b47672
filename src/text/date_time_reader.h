// Reading a date and time from text in a locale's forms.
#ifndef DATETIMELIB_TEXT_DATE_TIME_READER_H_
#define DATETIMELIB_TEXT_DATE_TIME_READER_H_

#include <string_view>

#include "text/date_time_fields.h"

namespace datetimelib {

enum class ReadingLocale {
  kThread,       // the calling thread's locale
  kUserDefault,  // the user's default locale, from the environment
};

// Reads the whole text (trailing blanks aside) as a date and time in the given
// locale. Every locale reads the canonical text "%Y-%m-%d %H:%M:%S".
bool ReadDateTime(std::string_view text, ReadingLocale locale, DateTimeFields* out);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_DATE_TIME_READER_H_
