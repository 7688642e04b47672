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
};

// Builds the steps of a pattern and of the patterns it refers to.
class FormBuilder {
 public:
  explicit FormBuilder(const LangInfo& words) : words_(words) {}

  // pattern := { blank | literal-byte | "%" flags* width? conversion }
  // flags   := "_" | "-" | "0" | "^" | "#"      ("_" pads numbers with blanks)
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
      if (i == pattern.size()) return false;
      if (!AppendConversion(pattern[i++], blank_padded, nesting)) return false;
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
  bool AppendConversion(char conversion, bool blank_padded, int nesting) {
    for (const FieldConversion& field : kFieldConversions) {
      if (field.conversion == conversion) {
        return AddField(field.step, blank_padded || field.blank_padded);
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
      case 'Z':
      case 'z':
        DropZone();
        return true;
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

  bool Nested(std::string_view pattern, int nesting) {
    return nesting < kMaxNesting && Append(pattern, nesting + 1);
  }

  bool AddField(FormStep step, bool blank_padded) {
    tokens_.push_back(FormToken{step, {}, blank_padded});
    drop_next_blanks_ = false;
    return true;
  }

  void AddLiteral(char c) {
    drop_next_blanks_ = false;
    if (!tokens_.empty() && tokens_.back().step == FormStep::kLiteral) {
      tokens_.back().literal.push_back(c);
    } else {
      tokens_.push_back(FormToken{FormStep::kLiteral, std::string(1, c), false});
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
    tokens_.push_back(FormToken{step, {}, false});
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
  const int years = count(FormStep::kYear4) + count(FormStep::kYear2);
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
  if (count(FormStep::kHour12) != count(FormStep::kAmPm)) return false;
  if (weekdays > 1 || (weekdays == 1 && !form->has_date)) return false;
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

void SkipBlanks(std::string_view text, std::size_t* position) {
  while (*position < text.size() && IsBlank(text[*position])) ++*position;
}

// The field each step reads, in the order of FormStep; none for blanks and
// literals.
constexpr int FormValues::*kFieldOfStep[] = {
    nullptr,               // kLiteral
    nullptr,               // kBlanks
    nullptr,               // kAnyBlanks
    &FormValues::year,     // kYear4
    &FormValues::year,     // kYear2
    &FormValues::month,    // kMonth
    &FormValues::month,    // kMonthName
    &FormValues::day,      // kDay
    &FormValues::hour,     // kHour
    &FormValues::hour12,   // kHour12
    &FormValues::minute,   // kMinute
    &FormValues::second,   // kSecond
    &FormValues::pm,       // kAmPm
    &FormValues::weekday,  // kWeekdayName
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

std::optional<ReadingForm> CompileForm(std::string_view pattern, const LangInfo& words) {
  FormBuilder builder(words);
  if (!builder.Append(pattern, 0)) return std::nullopt;
  ReadingForm form;
  form.tokens = builder.Finish();
  if (!Classify(&form)) return std::nullopt;
  return form;
}

bool MatchForm(const ReadingForm& form, const LocaleVocabulary& vocabulary,
               std::string_view text, std::size_t* position, FormValues* values) {
  std::size_t at = *position;
  FormValues read;
  for (const FormToken& token : form.tokens) {
    std::size_t length = 0;
    switch (token.step) {
      case FormStep::kLiteral:
        if (text.substr(at, token.literal.size()) != token.literal) return false;
        at += token.literal.size();
        break;
      case FormStep::kBlanks:
        if (at >= text.size() || !IsBlank(text[at])) return false;
        SkipBlanks(text, &at);
        break;
      case FormStep::kAnyBlanks:
        SkipBlanks(text, &at);
        break;
      case FormStep::kYear4:
        if (!ReadDigits(text, &at, 4, 4, &read.year)) return false;
        break;
      case FormStep::kYear2:
        if (!ReadDigits(text, &at, 2, 2, &read.year)) return false;
        read.year += read.year < 69 ? 2000 : 1900;
        break;
      case FormStep::kMonthName:
      case FormStep::kWeekdayName:
      case FormStep::kAmPm: {
        int* const field = FieldOf(token.step, &read);
        *field = vocabulary.Match(token.step, text, at, &length);
        if (*field < 0) return false;
        at += length;
        break;
      }
      default:  // a one- or two-digit number
        if (token.blank_padded) SkipBlanks(text, &at);
        if (!ReadDigits(text, &at, 1, 2, FieldOf(token.step, &read))) return false;
        break;
    }
  }
  *position = at;
  *values = read;
  return true;
}

}  // namespace datetimelib
