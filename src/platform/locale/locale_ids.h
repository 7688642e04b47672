// Locale identifiers: the unsigned 32-bit numbers callers name locales by, and
// the POSIX locale names they stand for.
//
// Three numbers are special: 1024 the user's default locale (the environment),
// 2048 the system default (the process-wide locale that setlocale set) and 127
// the invariant locale ("C"). The others are language-region numbers: the
// primary language in the low 10 bits, the region variant above them (1033 is
// English as written in the United States, 2057 in Great Britain).
#ifndef DATETIMELIB_PLATFORM_LOCALE_LOCALE_IDS_H_
#define DATETIMELIB_PLATFORM_LOCALE_LOCALE_IDS_H_

#include <cstdint>
#include <string>
#include <vector>

namespace datetimelib::platform {

inline constexpr std::uint32_t kInvariantLocale = 127;
inline constexpr std::uint32_t kUserDefaultLocale = 1024;
inline constexpr std::uint32_t kSystemDefaultLocale = 2048;

// The language and region of a language-region number, as "ll_RR" ("en_US" for
// 1033); nullptr for any number the table does not hold, the special ones
// included.
const char* LanguageRegionName(std::uint32_t identifier);

// The names to hand newlocale for a language-region number, best first: the
// UTF-8 form, then the bare name (which names the region's traditional
// codeset). Empty for numbers the table does not hold.
std::vector<std::string> LocaleNameCandidates(std::uint32_t identifier);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_LOCALE_LOCALE_IDS_H_
