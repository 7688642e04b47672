// English month and weekday names, matched without regard to ASCII case.
//
// The compact form is locale-independent: its names are English in every locale,
// and matching them must not depend on the C library's locale either, so the
// comparison folds ASCII letters only (strcasecmp folds by the current locale).
#ifndef DATETIMELIB_TEXT_ENGLISH_NAMES_H_
#define DATETIMELIB_TEXT_ENGLISH_NAMES_H_

#include <string_view>

namespace datetimelib {

// True when both texts have the same length and the same bytes, ASCII letters
// compared without regard to case. Every other byte, also one above 0x7F, must
// be equal.
bool EqualsIgnoringAsciiCase(std::string_view a, std::string_view b);

// "Jan" ... "Dec": the three-letter abbreviation of `month` [1:12].
std::string_view MonthAbbreviation(int month);

// The month [1:12] that a full or three-letter English month name gives
// ("January", "jan", "MAY"); 0 for any other text. The whole text is compared:
// "Sept" and "Jan " are no names.
int MonthFromName(std::string_view name);

// The weekday [0:6] (0 == Sunday) that a full or three-letter English weekday
// name gives ("Sunday", "sun"); -1 for any other text. "Thurs" is no name.
int WeekdayFromName(std::string_view name);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_ENGLISH_NAMES_H_
