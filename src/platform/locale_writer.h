// strftime in a given locale.
#ifndef DATETIMELIB_PLATFORM_LOCALE_WRITER_H_
#define DATETIMELIB_PLATFORM_LOCALE_WRITER_H_

#include <locale.h>

#include <string>

#include "platform/local_time.h"

namespace datetimelib::platform {

// `fields` written with a strftime pattern in `locale` (not LC_GLOBAL_LOCALE);
// the empty text for an empty pattern or a null locale.
std::string WriteInLocale(const BrokenDownTime& fields, const char* pattern,
                          locale_t locale);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_LOCALE_WRITER_H_
