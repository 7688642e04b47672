// Writing broken-down fields with a strftime pattern into a std::string: every
// strftime call of the library.
#ifndef DATETIMELIB_TEXT_STRFTIME_TEXT_H_
#define DATETIMELIB_TEXT_STRFTIME_TEXT_H_

#include <locale.h>

#include <string>

#include "platform/zone/local_time.h"
#include "text/canonical_text.h"

namespace datetimelib {

// `fields` written with a strftime pattern in the calling thread's locale,
// replacing `out`. The canonical pattern "%Y-%m-%d %H:%M:%S" is written digit by
// digit, to the same text, without strftime.
void WritePattern(const platform::BrokenDownTime& fields, const char* pattern,
                  std::string* out);

// Writes the canonical text of `fields` into `text` when `pattern` is the
// canonical pattern and the year has four digits, as strftime would; false
// otherwise, with nothing written.
bool WriteCanonicalText(const platform::BrokenDownTime& fields, const char* pattern,
                        char (&text)[kCanonicalLength]);

// The same in `locale` (not LC_GLOBAL_LOCALE); the empty text for a null locale,
// which a handle holds only when the C library had no memory to open one.
void WritePatternInLocale(const platform::BrokenDownTime& fields, const char* pattern,
                          locale_t locale, std::string* out);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_STRFTIME_TEXT_H_
