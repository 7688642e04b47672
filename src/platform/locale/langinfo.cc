#include "platform/locale/langinfo.h"

#include <langinfo.h>

#include <algorithm>
#include <cstdint>
#include <string_view>

namespace datetimelib::platform {
namespace {

std::string Item(nl_item item, locale_t locale) {
  const char* text = nl_langinfo_l(item, locale);
  return text != nullptr ? text : "";
}

// Adds a name without the blanks some locales pad it with (" 1月"), unless it
// is empty or already there.
void AddName(std::string name, std::vector<std::string>* names) {
  const std::size_t first = name.find_first_not_of(" \t");
  if (first == std::string::npos) return;
  name = name.substr(first, name.find_last_not_of(" \t") - first + 1);
  if (std::find(names->begin(), names->end(), name) == names->end()) {
    names->push_back(std::move(name));
  }
}

// nl_item numbers of one kind of name run consecutively from the first.
nl_item Nth(nl_item first, std::size_t index) {
  return static_cast<nl_item>(first + static_cast<nl_item>(index));
}

// Every item a locale's words and folding come from, in a fixed order.
const std::vector<nl_item>& SourceItems() {
  static const std::vector<nl_item> items = [] {
    // ERA and ALT_DIGITS compare by their first string: the name of the
    // time category tells locales with the same first era apart.
    std::vector<nl_item> all = {D_FMT,
                                T_FMT,
                                D_T_FMT,
                                T_FMT_AMPM,
                                AM_STR,
                                PM_STR,
                                CODESET,
                                _NL_LOCALE_NAME(LC_CTYPE),
                                _NL_LOCALE_NAME(LC_TIME),
                                ERA_D_FMT,
                                ERA_T_FMT,
                                ERA_D_T_FMT,
                                ERA,
                                ALT_DIGITS};
    for (const nl_item first : {MON_1, ABMON_1, ALTMON_1, _NL_ABALTMON_1}) {
      for (std::size_t month = 0; month < 12; ++month) all.push_back(Nth(first, month));
    }
    for (const nl_item first : {DAY_1, ABDAY_1}) {
      for (std::size_t day = 0; day < 7; ++day) all.push_back(Nth(first, day));
    }
    return all;
  }();
  return items;
}

// ERA and ALT_DIGITS hold their strings one after another, each ended by a
// NUL; ERA says how many through _NL_TIME_ERA_NUM_ENTRIES, and ALT_DIGITS ends
// at an empty string or after 100.
std::vector<std::string> Strings(nl_item item, std::size_t count, locale_t locale) {
  std::vector<std::string> strings;
  const char* text = nl_langinfo_l(item, locale);
  if (text == nullptr) return strings;
  for (std::size_t i = 0; i < count && *text != '\0'; ++i) {
    strings.emplace_back(text);
    text += strings.back().size() + 1;
  }
  return strings;
}

// The C library hands this count out in place of a pointer (its value union
// holds a word there), so its low 32 bits are the number. No locale has many.
std::size_t EraCount(locale_t locale) {
  constexpr std::size_t kMostEras = 256;
  const auto count = static_cast<std::uint32_t>(
      reinterpret_cast<std::uintptr_t>(nl_langinfo_l(_NL_TIME_ERA_NUM_ENTRIES, locale)));
  return count < kMostEras ? count : kMostEras;
}

}  // namespace

std::vector<std::string> LocaleSourceTexts(locale_t locale) {
  std::vector<std::string> texts;
  for (const nl_item item : SourceItems()) texts.push_back(Item(item, locale));
  return texts;
}

bool SameLocaleSourceTexts(const std::vector<std::string>& texts, locale_t locale) {
  const std::vector<nl_item>& items = SourceItems();
  if (texts.size() != items.size()) return false;
  for (std::size_t i = 0; i < items.size(); ++i) {
    const char* text = nl_langinfo_l(items[i], locale);
    if (texts[i] != (text != nullptr ? text : "")) return false;
  }
  return true;
}

LangInfo ReadLangInfo(locale_t locale) {
  LangInfo words;
  words.date_form = Item(D_FMT, locale);
  words.time_form = Item(T_FMT, locale);
  words.date_time_form = Item(D_T_FMT, locale);
  words.time_form_12h = Item(T_FMT_AMPM, locale);
  words.am = Item(AM_STR, locale);
  words.pm = Item(PM_STR, locale);
  for (std::size_t month = 0; month < 12; ++month) {
    for (const nl_item first : {MON_1, ABMON_1, ALTMON_1, _NL_ABALTMON_1}) {
      AddName(Item(Nth(first, month), locale), &words.month_names[month]);
    }
  }
  for (std::size_t day = 0; day < 7; ++day) {
    for (const nl_item first : {DAY_1, ABDAY_1}) {
      AddName(Item(Nth(first, day), locale), &words.weekday_names[day]);
    }
  }
  words.era_date_form = Item(ERA_D_FMT, locale);
  words.era_time_form = Item(ERA_T_FMT, locale);
  words.era_date_time_form = Item(ERA_D_T_FMT, locale);
  words.eras = Strings(ERA, EraCount(locale), locale);
  words.alternative_digits = Strings(ALT_DIGITS, 100, locale);
  return words;
}

}  // namespace datetimelib::platform
