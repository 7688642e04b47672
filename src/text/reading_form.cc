#include "text/reading_form.h"

#include <array>
#include <iterator>

#include "platform/ascii.h"

namespace datetimelib {
namespace {

using platform::LangInfo;

// %c may refer to %r or %x, which refer to nothing further in any locale; the
// bound only stops a locale whose patterns refer to themselves.
constexpr int kMaxNesting = 4;

bool IsBlank(char c) { return c == ' ' || c == '\t'; }
bool IsFlag(char c) { return c == '_' || c == '-' || c == '0' || c == '^' || c == '#'; }
bool IsBlankStep(FormStep step) {
  return step == FormStep::kBlanks || step == FormStep::kAnyBlanks;
}

struct FieldConversion {
  char conversion;
  FormStep step;
  bool blank_padded;  // strftime pads it with a blank, not a zero
};

constexpr FieldConversion kFieldConversions[] = {
    {'Y', FormStep::kYear4, false},       {'y', FormStep::kYear2, false},
    {'m', FormStep::kMonth, false},       {'d', FormStep::kDay, false},
    {'e', FormStep::kDay, true},          {'H', FormStep::kHour, false},
    {'k', FormStep::kHour, true},         {'I', FormStep::kHour12, false},
    {'l', FormStep::kHour12, true},       {'M', FormStep::kMinute, false},
    {'S', FormStep::kSecond, false},      {'b', FormStep::kMonthName, false},
    {'B', FormStep::kMonthName, false},   {'h', FormStep::kMonthName, false},
    {'a', FormStep::kWeekdayName, false}, {'A', FormStep::kWeekdayName, false},
    {'p', FormStep::kAmPm, false},        {'P', FormStep::kAmPm, false},
    {'C', FormStep::kCentury, false},
};

// The form that every era writes for %EY; none when they differ.
std::optional<std::string> CommonEraFormat(const std::vector<Era>& eras) {
  if (eras.empty()) return std::nullopt;
  for (const Era& era : eras) {
    if (era.format != eras.front().format) return std::nullopt;
  }
  return eras.front().format;
}

// Builds the steps of a pattern and of the patterns it refers to.
class FormBuilder {
 public:
  FormBuilder(const LangInfo& words, ZoneSteps zone)
      : words_(words), eras_(ParseEras(words.eras)), zone_(zone) {}

  // pattern := { blank | literal-byte | "%" flags* width? modifier? conversion }
  // flags   := "_" | "-" | "0" | "^" | "#"      ("_" pads numbers with blanks)
  // modifier := "E" | "O"                       (era forms, the locale's digits)
  bool Append(std::string_view pattern, int nesting) {
    for (std::size_t i = 0; i < pattern.size();) {
      const char c = pattern[i++];
      if (c != '%') {
        if (IsBlank(c)) {
          AddBlanks(FormStep::kBlanks);
        } else {
          AddLiteral(c);
        }
        continue;
      }
      bool blank_padded = false;
      while (i < pattern.size() && IsFlag(pattern[i])) {
        blank_padded = blank_padded || pattern[i] == '_';
        ++i;
      }
      while (i < pattern.size() && platform::IsAsciiDigit(pattern[i])) ++i;
      char modifier = '\0';
      if (i < pattern.size() && (pattern[i] == 'E' || pattern[i] == 'O')) {
        modifier = pattern[i++];
      }
      if (i == pattern.size()) return false;
      const char conversion = pattern[i++];
      const bool appended =
          modifier == 'E'
              ? AppendEraConversion(conversion, blank_padded, nesting)
              : AppendConversion(conversion, blank_padded, modifier == 'O', nesting);
      if (!appended) return false;
    }
    return true;
  }

  std::vector<FormToken> Finish() {
    while (!tokens_.empty() && IsBlankStep(tokens_.back().step)) tokens_.pop_back();
    std::size_t first = 0;
    while (first < tokens_.size() && IsBlankStep(tokens_[first].step)) ++first;
    tokens_.erase(tokens_.begin(), tokens_.begin() + static_cast<std::ptrdiff_t>(first));
    return std::move(tokens_);
  }

 private:
  // %O: numbers in the locale's own digits (strftime writes ASCII digits
  // where it has none); names as without it.
  bool AppendConversion(char conversion, bool blank_padded, bool own_digits,
                        int nesting) {
    for (const FieldConversion& field : kFieldConversions) {
      if (field.conversion == conversion) {
        return AddField(field.step, blank_padded || field.blank_padded,
                        own_digits && !words_.alternative_digits.empty());
      }
    }
    switch (conversion) {
      case 'n':
      case 't':
        AddBlanks(FormStep::kAnyBlanks);
        return true;
      case '%':
        AddLiteral('%');
        return true;
      case 'z':
        return AddZone(FormStep::kZoneOffset);
      case 'Z':
        return AddZone(FormStep::kZoneName);
      case 'x':
        return Nested(words_.date_form, nesting);
      case 'X':
        return Nested(words_.time_form, nesting);
      case 'c':
        return Nested(words_.date_time_form, nesting);
      case 'r':
        return Nested(words_.time_form_12h, nesting);
      case 'T':
        return Nested("%H:%M:%S", nesting);
      case 'R':
        return Nested("%H:%M", nesting);
      case 'D':
        return Nested("%m/%d/%y", nesting);
      case 'F':
        return Nested("%Y-%m-%d", nesting);
      default:
        return false;  // no field of ours, or an era/alternative-digit form
    }
  }

  // As strftime writes them: the era forms where the locale has them, else
  // what the conversion writes without "E".
  bool AppendEraConversion(char conversion, bool blank_padded, int nesting) {
    const auto era_or_plain = [&](const std::string& era_form, char plain) {
      return era_form.empty() ? AppendConversion(plain, blank_padded, false, nesting)
                              : Nested(era_form, nesting);
    };
    switch (conversion) {
      case 'x':
        return era_or_plain(words_.era_date_form, 'x');
      case 'X':
        return era_or_plain(words_.era_time_form, 'X');
      case 'c':
        return era_or_plain(words_.era_date_time_form, 'c');
      case 'C':
        return !eras_.empty() && AddField(FormStep::kEraName, false, false);
      case 'y':
        return eras_.empty() ? AddField(FormStep::kYear2, blank_padded, false)
                             : AddField(FormStep::kEraYear, blank_padded, false);
      case 'Y': {
        if (eras_.empty()) return AddField(FormStep::kYear4, blank_padded, false);
        const std::optional<std::string> format = CommonEraFormat(eras_);
        return format && Nested(*format, nesting);
      }
      default:
        return AppendConversion(conversion, blank_padded, false, nesting);
    }
  }

  bool Nested(std::string_view pattern, int nesting) {
    return nesting < kMaxNesting && Append(pattern, nesting + 1);
  }

  bool AddField(FormStep step, bool blank_padded, bool own_digits) {
    tokens_.push_back(FormToken{step, {}, blank_padded, own_digits});
    drop_next_blanks_ = false;
    return true;
  }

  bool AddZone(FormStep step) {
    if (zone_ == ZoneSteps::kRead) return AddField(step, false, false);
    DropZone();
    return true;
  }

  void AddLiteral(char c) {
    drop_next_blanks_ = false;
    if (!tokens_.empty() && tokens_.back().step == FormStep::kLiteral) {
      tokens_.back().literal.push_back(c);
    } else {
      tokens_.push_back(FormToken{FormStep::kLiteral, std::string(1, c)});
    }
  }

  // One or more blanks absorb any number of blanks next to them.
  void AddBlanks(FormStep step) {
    if (drop_next_blanks_) {
      drop_next_blanks_ = false;
      return;
    }
    if (!tokens_.empty() && IsBlankStep(tokens_.back().step)) {
      if (step == FormStep::kBlanks) tokens_.back().step = step;
      return;
    }
    tokens_.push_back(FormToken{step, {}});
  }

  // The zone goes with the blank that separates it: the one before it, or the
  // one after it when it opens the pattern.
  void DropZone() {
    if (!tokens_.empty() && IsBlankStep(tokens_.back().step)) {
      tokens_.pop_back();
    } else {
      drop_next_blanks_ = true;
    }
  }

  const LangInfo& words_;
  const std::vector<Era> eras_;
  const ZoneSteps zone_;
  std::vector<FormToken> tokens_;
  bool drop_next_blanks_ = false;
};

// A form gives a whole date, a whole time of day, or both; a 12-hour clock
// needs its AM/PM word and a weekday needs a date to be checked against.
bool Classify(ReadingForm* form) {
  constexpr std::size_t kSteps = static_cast<std::size_t>(FormStep::kWeekdayName) + 1;
  std::array<int, kSteps> counts{};
  for (const FormToken& token : form->tokens)
    ++counts[static_cast<std::size_t>(token.step)];
  const auto count = [&counts](FormStep step) {
    return counts[static_cast<std::size_t>(step)];
  };
  const int years =
      count(FormStep::kYear4) + count(FormStep::kYear2) + count(FormStep::kEraYear);
  const int months = count(FormStep::kMonth) + count(FormStep::kMonthName);
  const int days = count(FormStep::kDay);
  const int hours = count(FormStep::kHour) + count(FormStep::kHour12);
  const int minutes = count(FormStep::kMinute);
  const int seconds = count(FormStep::kSecond);
  const int weekdays = count(FormStep::kWeekdayName);

  form->has_date = years == 1 && months == 1 && days == 1;
  form->has_time = hours == 1 && minutes == 1 && seconds <= 1;
  if (years + months + days != 0 && !form->has_date) return false;
  if (hours + minutes + seconds != 0 && !form->has_time) return false;
  // %p goes with a 12-hour clock, and some locales write it after a 24-hour one.
  if (count(FormStep::kHour12) > count(FormStep::kAmPm) || count(FormStep::kAmPm) > 1) {
    return false;
  }
  if (weekdays > 1 || (weekdays == 1 && !form->has_date)) return false;
  if (count(FormStep::kEraName) > count(FormStep::kEraYear)) return false;
  if (count(FormStep::kCentury) > count(FormStep::kYear2)) return false;
  if (count(FormStep::kZoneOffset) + count(FormStep::kZoneName) > 1) return false;
  return form->has_date || form->has_time;
}

// Reads `min_digits` to `max_digits` ASCII digits; at most 4, so no overflow.
bool ReadDigits(std::string_view text, std::size_t* position, std::size_t min_digits,
                std::size_t max_digits, int* value) {
  std::size_t count = 0;
  int number = 0;
  while (count < max_digits && *position + count < text.size() &&
         platform::IsAsciiDigit(text[*position + count])) {
    number = number * 10 + (text[*position + count] - '0');
    ++count;
  }
  if (count < min_digits) return false;
  *position += count;
  *value = number;
  return true;
}

// "+hhmm" or "-hhmm", as strftime writes %z, in seconds east of UTC.
bool ReadOffset(std::string_view text, std::size_t* position, int* seconds_east) {
  std::size_t at = *position;
  if (at >= text.size() || (text[at] != '+' && text[at] != '-')) return false;
  const int sign = text[at] == '-' ? -1 : 1;
  ++at;
  int hours = 0;
  int minutes = 0;
  if (!ReadDigits(text, &at, 2, 2, &hours) || !ReadDigits(text, &at, 2, 2, &minutes) ||
      minutes > 59) {
    return false;
  }
  *position = at;
  *seconds_east = sign * (hours * 3600 + minutes * 60);
  return true;
}

// Zone abbreviations are letters, or digits with a sign ("+0530"); the zone
// engine keeps at most 15 bytes of one.
constexpr std::size_t kLongestZoneName = 15;
bool IsZoneNameByte(char c) {
  return platform::IsAsciiDigit(c) || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') ||
         c == '+' || c == '-';
}

void SkipBlanks(std::string_view text, std::size_t* position) {
  while (*position < text.size() && IsBlank(text[*position])) ++*position;
}

// The field each step reads, in the order of FormStep; none for blanks and
// literals.
constexpr int FormValues::*kFieldOfStep[] = {
    nullptr,                // kLiteral
    nullptr,                // kBlanks
    nullptr,                // kAnyBlanks
    &FormValues::year,      // kYear4
    &FormValues::year,      // kYear2
    &FormValues::month,     // kMonth
    &FormValues::month,     // kMonthName
    &FormValues::day,       // kDay
    &FormValues::hour,      // kHour
    &FormValues::hour12,    // kHour12
    &FormValues::minute,    // kMinute
    &FormValues::second,    // kSecond
    &FormValues::pm,        // kAmPm
    &FormValues::century,   // kCentury
    &FormValues::era,       // kEraName
    &FormValues::era_year,  // kEraYear
    nullptr,                // kZoneOffset
    nullptr,                // kZoneName
    &FormValues::weekday,   // kWeekdayName
};
static_assert(std::size(kFieldOfStep) ==
              static_cast<std::size_t>(FormStep::kWeekdayName) + 1);

int* FieldOf(FormStep step, FormValues* values) {
  return &(values->*kFieldOfStep[static_cast<std::size_t>(step)]);
}

}  // namespace

LocaleVocabulary::LocaleVocabulary(const LangInfo& words,
                                   const platform::CaseFolder& folder)
    : folder_(folder) {
  for (std::size_t month = 0; month < words.month_names.size(); ++month) {
    for (const std::string& name : words.month_names[month]) {
      Add(name, static_cast<int>(month) + 1, &months_);
    }
  }
  for (std::size_t day = 0; day < words.weekday_names.size(); ++day) {
    for (const std::string& name : words.weekday_names[day]) {
      Add(name, static_cast<int>(day), &weekdays_);
    }
  }
  if (!words.am.empty() && !words.pm.empty()) {
    Add(words.am, 0, &am_pm_);
    Add(words.pm, 1, &am_pm_);
  }
  eras_ = ParseEras(words.eras);
  for (std::size_t era = 0; era < eras_.size(); ++era) {
    Add(eras_[era].name, static_cast<int>(era), &era_names_);
  }
  digits_ = words.alternative_digits;
}

// Abbreviations such as "janv." are also read without their ".".
void LocaleVocabulary::Add(std::string_view name, int number, NameList* list) const {
  std::u32string folded;
  if (!folder_.Fold(name, &folded) || folded.empty()) return;
  list->emplace_back(folded, number);
  if (folded.size() > 1 && folded.back() == U'.') {
    folded.pop_back();
    list->emplace_back(std::move(folded), number);
  }
}

int LocaleVocabulary::Match(FormStep step, std::string_view text, std::size_t position,
                            std::size_t* length) const {
  const NameList& list = step == FormStep::kMonthName     ? months_
                         : step == FormStep::kWeekdayName ? weekdays_
                         : step == FormStep::kEraName     ? era_names_
                                                          : am_pm_;
  int found = -1;
  std::size_t longest = 0;
  for (const auto& [name, number] : list) {
    std::size_t end = position;
    bool same = true;
    for (const char32_t expected : name) {
      char32_t actual = 0;
      const std::size_t used = folder_.ReadFolded(text, end, &actual);
      if (used == 0 || actual != expected) {
        same = false;
        break;
      }
      end += used;
    }
    if (same && end - position > longest) {
      longest = end - position;
      found = number;
    }
  }
  *length = longest;
  return found;
}

int LocaleVocabulary::MatchDigits(std::string_view text, std::size_t position,
                                  std::size_t most, std::size_t* length) const {
  int found = -1;
  std::size_t longest = 0;
  for (std::size_t number = 0; number < digits_.size(); ++number) {
    const std::string& digits = digits_[number];
    if (digits.size() > longest && digits.size() <= most &&
        text.substr(position, digits.size()) == digits) {
      longest = digits.size();
      found = static_cast<int>(number);
    }
  }
  *length = longest;
  return found;
}

std::optional<ReadingForm> CompileForm(std::string_view pattern, const LangInfo& words,
                                       ZoneSteps zone) {
  FormBuilder builder(words, zone);
  if (!builder.Append(pattern, 0)) return std::nullopt;
  ReadingForm form;
  form.tokens = builder.Finish();
  if (!Classify(&form)) return std::nullopt;
  return form;
}

namespace {

// A number as a step stores it: a two-digit year with its century.
void SetNumber(FormStep step, int number, FormValues* values) {
  if (step == FormStep::kYear2) number += number < 69 ? 2000 : 1900;
  *FieldOf(step, values) = number;
}

// Reads by the steps of `form` from `first` on, at `at`, with what was read so
// far in `read`.
bool MatchSteps(const ReadingForm& form, std::size_t first,
                const LocaleVocabulary& vocabulary, std::string_view text, std::size_t at,
                FormValues read, std::size_t* position, FormValues* values) {
  for (std::size_t i = first; i < form.tokens.size(); ++i) {
    const FormToken& token = form.tokens[i];
    std::size_t length = 0;
    switch (token.step) {
      case FormStep::kLiteral:
        if (text.substr(at, token.literal.size()) != token.literal) return false;
        at += token.literal.size();
        continue;
      case FormStep::kBlanks:
        if (at >= text.size() || !IsBlank(text[at])) return false;
        SkipBlanks(text, &at);
        continue;
      case FormStep::kAnyBlanks:
        SkipBlanks(text, &at);
        continue;
      case FormStep::kYear4:
        if (!ReadDigits(text, &at, 4, 4, &read.year)) return false;
        continue;
      case FormStep::kEraYear:
        if (!ReadDigits(text, &at, 1, 4, &read.era_year)) return false;
        continue;
      case FormStep::kZoneOffset:
        if (!ReadOffset(text, &at, &read.zone_offset)) return false;
        read.has_zone_offset = true;
        continue;
      case FormStep::kZoneName: {
        const std::size_t start = at;
        while (at < text.size() && at - start < kLongestZoneName &&
               IsZoneNameByte(text[at])) {
          ++at;
        }
        if (at == start) return false;
        read.zone_name = text.substr(start, at - start);
        continue;
      }
      case FormStep::kMonthName:
      case FormStep::kWeekdayName:
      case FormStep::kEraName:
      case FormStep::kAmPm: {
        int* const field = FieldOf(token.step, &read);
        *field = vocabulary.Match(token.step, text, at, &length);
        if (*field < 0) return false;
        at += length;
        continue;
      }
      default:  // a number of one or two digits; two for %y
        break;
    }
    if (token.blank_padded) SkipBlanks(text, &at);
    if (token.alternative_digits) {
      // The locale's digits may run into those of the next number ("廿四" is 24,
      // or 20 then 4): each reading, longest first, is tried with the rest.
      for (std::size_t bound = text.size() - at;;) {
        const int number = vocabulary.MatchDigits(text, at, bound, &length);
        if (number < 0) break;
        FormValues tried = read;
        SetNumber(token.step, number, &tried);
        if (MatchSteps(form, i + 1, vocabulary, text, at + length, tried, position,
                       values)) {
          return true;
        }
        bound = length - 1;
      }
    }
    const std::size_t fewest = token.step == FormStep::kYear2 ? 2 : 1;
    int number = 0;
    if (!ReadDigits(text, &at, fewest, 2, &number)) return false;
    SetNumber(token.step, number, &read);
  }
  *position = at;
  *values = read;
  return true;
}

}  // namespace

bool MatchForm(const ReadingForm& form, const LocaleVocabulary& vocabulary,
               std::string_view text, std::size_t* position, FormValues* values) {
  return MatchSteps(form, 0, vocabulary, text, *position, FormValues{}, position, values);
}

}  // namespace datetimelib
