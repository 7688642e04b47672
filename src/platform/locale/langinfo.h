// What nl_langinfo_l gives of a locale's time category: its date and time
// patterns (%x, %X, %c, %r and their era forms), its names of months, weekdays
// and AM/PM, its eras and its own digits.
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
  // The era forms of %Ex, %EX and %Ec; empty where the locale has none.
  std::string era_date_form;
  std::string era_time_form;
  std::string era_date_time_form;
  // The locale's eras, each "direction:offset:start:end:name:format" as the
  // locale source writes it ("+:1:-543/01/01:+*:B.E.:%EC %Ey").
  std::vector<std::string> eras;
  // How %O writes 0, 1, ... (at most 99); empty where the locale writes ASCII.
  std::vector<std::string> alternative_digits;
};

// The patterns and names of the time category of `locale`, which must not be
// LC_GLOBAL_LOCALE.
LangInfo ReadLangInfo(locale_t locale);

// The C library's texts that a locale's words and its case folding come from:
// every item ReadLangInfo reads, and the name and codeset of the character
// types. Two locales with the same texts read and fold alike, so what was
// compiled from one serves the other.
std::vector<std::string> LocaleSourceTexts(locale_t locale);
bool SameLocaleSourceTexts(const std::vector<std::string>& texts, locale_t locale);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_LOCALE_LANGINFO_H_
