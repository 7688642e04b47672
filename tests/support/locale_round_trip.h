// Round trips through a locale's own forms: what Format(flags, locale) writes
// (%x %X, %X, %x) must read back with ParseDateTime on a thread whose locale is
// the one that wrote it.
#ifndef DATETIMELIB_TESTS_SUPPORT_LOCALE_ROUND_TRIP_H_
#define DATETIMELIB_TESTS_SUPPORT_LOCALE_ROUND_TRIP_H_

#include <functional>
#include <string>

#include "AdDateTime.h"

namespace datetimelib::testing {

enum class LocaleForm { kDateAndTime, kTime, kDate };

// The strftime pattern of a form.
const char* PatternOf(LocaleForm form);

// Writes a value in one of the locale's forms.
using LocaleWriter = std::function<std::string(const AdDateTime&, LocaleForm)>;

// Writes local times across the range (each month, AM and PM, one- and
// two-digit fields, the hour New York repeats) in every form and reads each
// text back in the thread's locale. A text read back must write the same text
// again; a time alone, the text of that time on 1970-01-01. Gives the first
// text that fails and why, or "" when all read back.
std::string FirstRoundTripFailure(const LocaleWriter& write);

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_LOCALE_ROUND_TRIP_H_
