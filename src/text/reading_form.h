// Reading forms: a locale's strftime patterns turned into strict readers.
//
// A pattern such as "%d.%m.%Y" or "%I:%M:%S %p" is compiled into steps, with the
// locale's references (%x, %X, %c, %r, and %Ex, %EX, %Ec) and the shorthands
// (%T, %R, %D, %F) written out. Each step then reads its part of a text, and
// nothing else:
//
//   %Y        exactly four digits
//   %y        exactly two digits: 69..99 are 1969..1999, 00..68 are 2000..2068,
//             as POSIX strptime takes them
//   %m %d %H %I %M %S
//             one or two digits (what strftime writes, and what people type)
//   %e %k %l  the same after any blanks (strftime pads these with a blank)
//   %O...     the same number in the locale's own digits (ALT_DIGITS), or in
//             ASCII digits, which strftime writes where the locale has none;
//             digits that run into the next number's ("廿四": 24, or 20 and 4)
//             are tried each way with the rest of the form
//   %C        the century, one or two digits, with %y (the year in it)
//   %EC %Ey   an era's name, and the year in an era (one to four digits); %EY
//             is the era's own form. Without eras: %y and %Y.
//   %b %B %h  a month name of the locale, full or abbreviated, in any case, an
//             abbreviation with or without its final "."
//   %a %A     a weekday name, likewise; it must be the weekday of the date
//   %p %P     the locale's AM or PM word, in any case; beside a 24-hour clock
//             it must be the one of the hour
//   %z        a numeric offset from UTC, "+hhmm" or "-hhmm"
//   %Z        a zone abbreviation: letters, digits, "+" and "-" ("EST", "+0530")
//   blank     one or more blanks (space or tab)
//   %n %t     any number of blanks, none included
//   other     itself, byte for byte
//
// strptime_l is not used: it takes 30 February and seconds 60 and 61, skips
// blanks anywhere, and stops before the end of a text without saying so.
//
// Ranges are not tested while reading: the reader judges the fields once the
// whole text is read. A form may be compiled without its zone (%Z, %z and the
// blank that separates them), so that the same text without a zone reads too.
// Patterns with conversions that name no field of a date-time (%j, %U) give no
// form.
#ifndef DATETIMELIB_TEXT_READING_FORM_H_
#define DATETIMELIB_TEXT_READING_FORM_H_

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/locale/case_folding.h"
#include "platform/locale/langinfo.h"
#include "text/eras.h"

namespace datetimelib {

enum class FormStep {
  kLiteral,
  kBlanks,     // one or more
  kAnyBlanks,  // zero or more
  kYear4,
  kYear2,
  kMonth,
  kMonthName,
  kDay,
  kHour,
  kHour12,
  kMinute,
  kSecond,
  kAmPm,
  kCentury,
  kEraName,
  kEraYear,
  kZoneOffset,
  kZoneName,
  kWeekdayName,  // the last: Classify counts steps up to it
};

struct FormToken {
  FormStep step;
  std::string literal;              // kLiteral only
  bool blank_padded = false;        // numbers: blanks may come first
  bool alternative_digits = false;  // numbers: the locale's own digits too
};

struct ReadingForm {
  std::vector<FormToken> tokens;
  bool has_date = false;  // year, month and day
  bool has_time = false;  // hour and minute
};

// The fields a form read, each -1 where the form has no such step.
struct FormValues {
  int year = -1;      // with century
  int month = -1;     // [1:12] when read
  int day = -1;       // [0:99] when read, judged later
  int hour = -1;      // 24-hour clock, [0:99] when read
  int hour12 = -1;    // 12-hour clock, [0:99] when read
  int minute = -1;    // [0:99]
  int second = -1;    // [0:99]
  int pm = -1;        // 0 AM, 1 PM
  int weekday = -1;   // [0:6], 0 == Sunday
  int century = -1;   // [0:99]
  int era = -1;       // index into the vocabulary's eras
  int era_year = -1;  // [0:9999]
  bool has_zone_offset = false;
  int zone_offset = 0;         // seconds east of UTC, when has_zone_offset
  std::string_view zone_name;  // into the text read; empty when none
};

// A locale's names, lowered for comparison in any case.
class LocaleVocabulary {
 public:
  LocaleVocabulary(const platform::LangInfo& words, const platform::CaseFolder& folder);

  // Reads texts with `folder` from now on: one of a locale with the same
  // character types as the one the names were lowered with.
  void set_folder(const platform::CaseFolder& folder) { folder_ = folder; }

  // The longest name that `step` (kMonthName, kWeekdayName, kAmPm or kEraName)
  // reads at `text[position]`: its number (1 == January; 0 == Sunday; 0 AM,
  // 1 PM; the index of the era), and the bytes it takes in `*length`; -1 when
  // none is there.
  int Match(FormStep step, std::string_view text, std::size_t position,
            std::size_t* length) const;

  // The number 0..99 that the locale's own digits write at `text[position]`
  // in at most `most` bytes, the longest, and the bytes it takes; -1 when none
  // is there.
  int MatchDigits(std::string_view text, std::size_t position, std::size_t most,
                  std::size_t* length) const;

  const std::vector<Era>& eras() const { return eras_; }

 private:
  using NameList = std::vector<std::pair<std::u32string, int>>;  // lowered name, number
  void Add(std::string_view name, int number, NameList* list) const;

  platform::CaseFolder folder_;
  NameList months_;
  NameList weekdays_;
  NameList am_pm_;
  NameList era_names_;
  std::vector<Era> eras_;
  std::vector<std::string> digits_;  // [n] writes n
};

// Whether a compiled form reads the zone a text may name (%z, %Z).
enum class ZoneSteps { kRead, kLeaveOut };

// Compiles a pattern, writing out the locale's references from `words`.
// Nothing for a pattern that gives no form (see the top of this file).
std::optional<ReadingForm> CompileForm(std::string_view pattern,
                                       const platform::LangInfo& words,
                                       ZoneSteps zone = ZoneSteps::kLeaveOut);

// Reads `text` from `position` by the steps of `form`. On success moves
// `*position` past what was read and fills `*values`.
bool MatchForm(const ReadingForm& form, const LocaleVocabulary& vocabulary,
               std::string_view text, std::size_t* position, FormValues* values);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_READING_FORM_H_
