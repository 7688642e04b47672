// What nl_langinfo_l gives of a locale's time category: its date and time
// patterns (%x, %X, %c, %r) and its names of months, weekdays and AM/PM.
#ifndef DATETIMELIB_PLATFORM_LOCALE_LANGINFO_H_
#define DATETIMELIB_PLATFORM_LOCALE_LANGINFO_H_

#include <locale.h>

#include <array>
#include <string>
#include <vector>

namespace datetimelib::platform {

struct LangInfo {
  // strftime patterns of the locale; they may refer to one another (%r, %x).
  std::string date_form;       // %x, e.g. "%d.%m.%Y"
  std::string time_form;       // %X, e.g. "%H:%M:%S" or "%r"
  std::string date_time_form;  // %c, e.g. "%a %d %b %Y %T %Z"
  std::string time_form_12h;   // %r, e.g. "%I:%M:%S %p"
  // The words of %p; both empty where the locale has no 12-hour clock.
  std::string am;
  std::string pm;
  // Names of each month ([0] January): full, abbreviated and the stand-alone
  // forms some languages use, trimmed of blanks, without empty ones or repeats.
  std::array<std::vector<std::string>, 12> month_names;
  // Names of each weekday ([0] Sunday): full and abbreviated.
  std::array<std::vector<std::string>, 7> weekday_names;
};

// The patterns and names of the time category of `locale`, which must not be LC_GLOBAL_LOCALE.
LangInfo ReadLangInfo(locale_t locale);

// The C library's texts that a locale's words and its case folding come from:
// every item ReadLangInfo reads, and the name and codeset of the character
// types. Two locales with the same texts read and fold alike, so what was
// compiled from one serves the other.
std::vector<std::string> LocaleSourceTexts(locale_t locale);
bool SameLocaleSourceTexts(const std::vector<std::string>& texts, locale_t locale);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_LOCALE_LANGINFO_H_
