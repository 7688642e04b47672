#include "text/locale_forms.h"

#include <algorithm>
#include <array>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "platform/civil/civil.h"
#include "platform/locale/case_folding.h"
#include "platform/thread_slot.h"

namespace datetimelib {
namespace {

constexpr const char* kPatterns[] = {
    // Date and time in one form.
    "%Y-%m-%dT%H:%M",
    "%Y-%m-%dT%H:%M:%S",
    "%c",
    // Dates.
    "%Y-%m-%d",
    "%x",
    "%d %B %Y",
    "%d. %B %Y",
    "%d-%B-%Y",
    "%B %d %Y",
    "%B %d, %Y",
    // Times of day.
    "%H:%M",
    "%H:%M:%S",
    "%X",
    "%I:%M%t%p",
    "%I:%M:%S%t%p",
    "%r",
};

bool IsBlank(char c) { return c == ' ' || c == '\t'; }

bool OnlyBlanksFrom(std::string_view text, std::size_t position) {
  return std::all_of(text.begin() + static_cast<std::ptrdiff_t>(position), text.end(),
                     IsBlank);
}

bool Has(const ReadingForm& form, FormStep step) {
  return std::any_of(form.tokens.begin(), form.tokens.end(),
                     [step](const FormToken& token) { return token.step == step; });
}

// Two forms are the same when their steps are.
std::string Key(const ReadingForm& form) {
  std::string key;
  for (const FormToken& token : form.tokens) {
    key.push_back(static_cast<char>('A' + static_cast<int>(token.step)));
    key.push_back(token.blank_padded ? '_' : ' ');
    key.push_back(token.alternative_digits ? 'O' : ' ');
    key += token.literal;
    key.push_back('\0');
  }
  return key;
}

class FormCollector {
 public:
  void Add(ReadingForm form) {
    const std::string key = Key(form);
    if (std::find(keys_.begin(), keys_.end(), key) != keys_.end()) return;
    keys_.push_back(key);
    if (form.has_date && form.has_time) {
      forms_.date_times.push_back(std::move(form));
    } else if (form.has_date) {
      forms_.dates.push_back(std::move(form));
    } else {
      forms_.times.push_back(std::move(form));
    }
  }
  LocaleForms Take() { return std::move(forms_); }

 private:
  std::vector<std::string> keys_;
  LocaleForms forms_;
};

// The year with century of a year in an era: in the era named, else in the
// first era that holds the date.
bool ResolveEraYear(const std::vector<Era>& eras, FormValues* values) {
  for (std::size_t era = 0; era < eras.size(); ++era) {
    if (values->era >= 0 && static_cast<std::size_t>(values->era) != era) continue;
    const std::optional<int> year =
        YearOfEra(eras[era], values->era_year, values->month, values->day);
    if (year) {
      values->year = *year;
      return true;
    }
  }
  return false;
}

// The fields of a whole reading; false where no calendar has them.
bool ToFields(FormValues values, const LocaleVocabulary& vocabulary,
              DateTimeFields* out) {
  if (values.era_year >= 0 && !ResolveEraYear(vocabulary.eras(), &values)) return false;
  // A century written apart replaces the one the two-digit year implies.
  if (values.century >= 0) values.year = values.century * 100 + values.year % 100;
  DateTimeFields fields;  // 1899-12-30 00:00:00 until the text says otherwise
  if (values.year >= 0) {
    fields.year = values.year;
    fields.month = values.month;
    fields.day = values.day;
  }
  if (values.hour12 >= 0) {
    if (values.hour12 < 1 || values.hour12 > 12) return false;
    fields.hour = values.hour12 % 12 + (values.pm == 1 ? 12 : 0);
  } else if (values.hour >= 0) {
    // An AM/PM word beside a 24-hour clock must be the one of that hour.
    if (values.pm >= 0 && (values.hour >= 12) != (values.pm == 1)) return false;
    fields.hour = values.hour;
  }
  if (values.minute >= 0) fields.minute = values.minute;
  if (values.second >= 0) fields.second = values.second;
  fields.has_zone_offset = values.has_zone_offset;
  fields.zone_offset = values.zone_offset;
  fields.zone_name = values.zone_name;
  if (!IsPossibleDateTime(fields)) return false;
  if (values.weekday >= 0 &&
      platform::WeekdayFromDays(platform::DaysFromCivil(fields.year, fields.month,
                                                        fields.day)) != values.weekday) {
    return false;
  }
  *out = fields;
  return true;
}

// Reads `text` from `start` to its end (trailing blanks aside) by `form`, with
// the values already read by an earlier form merged in.
bool ReadRest(const ReadingForm& form, const LocaleVocabulary& vocabulary,
              std::string_view text, std::size_t start, FormValues* values) {
  FormValues read;
  if (!MatchForm(form, vocabulary, text, &start, &read)) return false;
  if (!OnlyBlanksFrom(text, start)) return false;
  if (form.has_date) {
    values->year = read.year;
    values->month = read.month;
    values->day = read.day;
    values->weekday = read.weekday;
    values->century = read.century;
    values->era = read.era;
    values->era_year = read.era_year;
  }
  if (read.has_zone_offset || !read.zone_name.empty()) {
    values->has_zone_offset = read.has_zone_offset;
    values->zone_offset = read.zone_offset;
    values->zone_name = read.zone_name;
  }
  if (form.has_time) {
    values->hour = read.hour;
    values->hour12 = read.hour12;
    values->pm = read.pm;
    values->minute = read.minute;
    values->second = read.second;
  }
  return true;
}

}  // namespace

LocaleForms BuildLocaleForms(const platform::LangInfo& words) {
  const bool has_am_pm = !words.am.empty() && !words.pm.empty();
  FormCollector collector;
  for (const char* pattern : kPatterns) {
    // With the zone the pattern writes, and without it.
    for (const ZoneSteps zone : {ZoneSteps::kRead, ZoneSteps::kLeaveOut}) {
      std::optional<ReadingForm> form = CompileForm(pattern, words, zone);
      if (!form || (!has_am_pm && Has(*form, FormStep::kAmPm))) continue;
      if (Has(*form, FormStep::kYear2)) {
        ReadingForm four_digits = *form;
        for (FormToken& token : four_digits.tokens) {
          if (token.step == FormStep::kYear2) token.step = FormStep::kYear4;
        }
        collector.Add(std::move(*form));
        collector.Add(std::move(four_digits));
      } else {
        collector.Add(std::move(*form));
      }
    }
  }
  return collector.Take();
}

bool ReadWithForms(std::string_view text, const LocaleForms& forms,
                   const LocaleVocabulary& vocabulary, DateTimeFields* out) {
  // A leading blank is read only by a form that opens with a blank-padded
  // number (" 4:05:07", %k).
  if (text.empty()) return false;
  for (const auto* list : {&forms.date_times, &forms.times}) {
    for (const ReadingForm& form : *list) {
      FormValues values;
      if (ReadRest(form, vocabulary, text, 0, &values) &&
          ToFields(values, vocabulary, out)) {
        return true;
      }
    }
  }
  for (const ReadingForm& date : forms.dates) {
    std::size_t end = 0;
    FormValues values;
    if (!MatchForm(date, vocabulary, text, &end, &values)) continue;
    if (OnlyBlanksFrom(text, end)) {
      if (ToFields(values, vocabulary, out)) return true;
      continue;
    }
    if (!IsBlank(text[end])) continue;
    while (end < text.size() && IsBlank(text[end])) ++end;
    for (const ReadingForm& time : forms.times) {
      FormValues both = values;
      if (ReadRest(time, vocabulary, text, end, &both) &&
          ToFields(both, vocabulary, out)) {
        return true;
      }
    }
  }
  return false;
}

namespace {

// A locale's reading forms and vocabulary, and the texts they were compiled
// from. Compiling costs some microseconds, reading a text far less, so each
// thread keeps those of the two locales it read in last: a text with a fraction
// of a second reads in the user's default locale as well as in the thread's.
struct CompiledLocale {
  std::vector<std::string> source_texts;
  LocaleForms forms;
  LocaleVocabulary vocabulary;
};

// Most recent first.
using CompiledLocales = std::array<std::unique_ptr<CompiledLocale>, 2>;

CompiledLocale& CompiledFor(locale_t locale) {
  CompiledLocales& recent = platform::ThreadSlot<CompiledLocales>::Get();
  const auto same = [locale](const std::unique_ptr<CompiledLocale>& compiled) {
    return compiled != nullptr &&
           platform::SameLocaleSourceTexts(compiled->source_texts, locale);
  };
  if (!same(recent[0])) {
    if (!same(recent[1])) {
      const platform::LangInfo words = platform::ReadLangInfo(locale);
      recent[1] = std::make_unique<CompiledLocale>(
          CompiledLocale{platform::LocaleSourceTexts(locale), BuildLocaleForms(words),
                         LocaleVocabulary(words, platform::CaseFolder(locale))});
    }
    std::swap(recent[0], recent[1]);
  }
  return *recent[0];
}

}  // namespace

bool ReadInLocale(std::string_view text, locale_t locale, DateTimeFields* out) {
  if (locale == nullptr) return false;
  CompiledLocale& compiled = CompiledFor(locale);
  // Folding goes through this call's locale: the one compiled from may be gone.
  compiled.vocabulary.set_folder(platform::CaseFolder(locale));
  return ReadWithForms(text, compiled.forms, compiled.vocabulary, out);
}

}  // namespace datetimelib
