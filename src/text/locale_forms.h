// Reading a date and time in the forms of one locale.
//
// Every locale reads, the whole text being used (trailing blanks aside, no
// leading ones):
//
//   date and time    a date form, blanks, a time form; or the locale's own
//                    date-time form (%c, without its zone); or the ISO form
//                    "%Y-%m-%dT%H:%M[:%S]"
//   date alone       "%Y-%m-%d"; the locale's date form (%x); and with a month
//                    name: "%d %B %Y", "%d. %B %Y", "%d-%B-%Y", "%B %d %Y",
//                    "%B %d, %Y". A date alone is read at 00:00:00.
//   time alone       "%H:%M", "%H:%M:%S", the locale's time form (%X), and
//                    where the locale has AM/PM words "%I:%M %p", "%I:%M:%S %p"
//                    (the blank optional) and its 12-hour form (%r). A time
//                    alone is read on 1899-12-30.
//
// A locale form with a two-digit year (%y) is also read with four digits; a
// locale whose forms write four digits reads no two-digit years. What
// each step of a form accepts is set out in reading_form.h. Fields that no
// calendar has (30 February, hour 24, second 60) are refused, as is a weekday
// name that is not the weekday of the date.
#ifndef DATETIMELIB_TEXT_LOCALE_FORMS_H_
#define DATETIMELIB_TEXT_LOCALE_FORMS_H_

#include <locale.h>

#include <string_view>
#include <vector>

#include "platform/locale/langinfo.h"
#include "text/date_time_fields.h"
#include "text/reading_form.h"

namespace datetimelib {

struct LocaleForms {
  std::vector<ReadingForm> date_times;  // date and time in one form
  std::vector<ReadingForm> dates;
  std::vector<ReadingForm> times;
};

// The forms above for a locale with these words, without repeats.
LocaleForms BuildLocaleForms(const platform::LangInfo& words);

// Reads the whole text by the first form that takes all of it and gives
// possible fields.
bool ReadWithForms(std::string_view text, const LocaleForms& forms,
                   const LocaleVocabulary& vocabulary, DateTimeFields* out);

// Reads the whole text in `locale` (not LC_GLOBAL_LOCALE); false for a null one.
bool ReadInLocale(std::string_view text, locale_t locale, DateTimeFields* out);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_LOCALE_FORMS_H_
