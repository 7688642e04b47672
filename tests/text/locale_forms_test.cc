#include "text/locale_forms.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <ctime>
#include <string>
#include <utility>
#include <vector>

#include "platform/locale/locale_handle.h"
#include "support/test_locales.h"
#include "text/canonical_text.h"
#include "text/reading_form.h"

namespace {

using datetimelib::DateTimeFields;
using datetimelib::platform::LocaleHandle;

constexpr std::uint32_t kInvariant = 127, kEnUs = 1033, kEnGb = 2057, kDeDe = 1031,
                        kFrFr = 1036, kJaJp = 1041;
constexpr std::uint32_t kLocales[] = {kInvariant, kEnUs, kEnGb, kDeDe, kFrFr, kJaJp};
constexpr std::uint32_t kEvery = 0xFFFFFFFF;  // a row that holds in each of them

// What a reader gave: the fields as "YYYY-MM-DD HH:MM:SS", or "refused".
std::string Fields(bool read, const DateTimeFields& f) {
  if (!read) return "refused";
  char out[64];
  std::snprintf(out, sizeof out, "%04d-%02d-%02d %02d:%02d:%02d", f.year, f.month, f.day,
                f.hour, f.minute, f.second);
  return out;
}

struct Row {
  std::uint32_t locale;
  const char* text;
  const char* fields;
};

std::string Read(std::uint32_t locale, const std::string& text) {
  DateTimeFields f;
  const LocaleHandle handle = LocaleHandle::ForIdentifier(locale);
  return Fields(datetimelib::ReadInLocale(text, handle.get(), &f), f);
}

// The direct reading of the canonical text and the locale reader give the same
// answer in every locale for texts of that shape naming no real date-time, each
// just past a limit. (The locale_parse fuzz corpus reads back what is written.)
TEST(ReadCanonical, AgreesWithTheLocaleReader) {
  DATETIMELIB_NEED_TEST_LOCALES();
  std::vector<std::pair<std::string, std::string>> cases = {
      {"2004-02-29 00:00:00 \t", "2004-02-29 00:00:00"}};
  for (const char* text :
       {"2003-02-29 00:00:00", "2003-13-01 00:00:00", "2003-00-10 00:00:00",
        "2003-01-00 00:00:00", "2003-01-01 24:00:00", "2003-01-01 23:60:00",
        "2003-01-01 23:59:60", "0000-01-01 00:00:00", "2003-01-01 12:00:00x",
        "2003-01-0a 12:00:00", "2003-01-01_12:00:00", "2003_01-01 12:00:00"}) {
    cases.emplace_back(text, "refused");
  }
  for (int month = 1; month <= 12; ++month) {  // the last day, and the day after
    std::tm last{};
    last.tm_year = 104;  // 2004, a leap year
    last.tm_mon = month;
    timegm(&last);  // day 0 of the next month
    char text[32];
    std::snprintf(text, sizeof text, "2004-%02d-%02d 00:00:00", month, last.tm_mday);
    cases.emplace_back(text, text);
    std::snprintf(text, sizeof text, "2004-%02d-%02d 00:00:00", month, last.tm_mday + 1);
    cases.emplace_back(text, "refused");
  }
  for (const auto& [text, fields] : cases) {
    DateTimeFields direct;
    EXPECT_EQ(Fields(datetimelib::ReadCanonical(text, &direct), direct), fields) << text;
    for (const std::uint32_t locale : kLocales) {
      EXPECT_EQ(Read(locale, text), fields) << "locale " << locale << ": " << text;
    }
  }
}

// What every locale reads and refuses, then each locale's own forms and names
// beyond the date and time forms that it writes (the round_trip fuzz corpus
// reads those back).
TEST(ReadInLocale, Forms) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const Row cases[] = {
      // The ISO forms, with one-digit fields and any blanks between and after; a
      // time alone is read on 1899-12-30.
      {kEvery, "2003-05-17T14:03:09", "2003-05-17 14:03:09"},
      {kEvery, "2003-5-7  9:03 \t", "2003-05-07 09:03:00"},
      {kEvery, "14:30", "1899-12-30 14:30:00"},
      // Not the whole text, or no form.
      {kEvery, " 14:30", "refused"},
      // "C": %x "%m/%d/%y" (69..99 in the 1900s), also read with four digits;
      // %c "%a %b %e %H:%M:%S %Y".
      {kInvariant, "12/31/69", "1969-12-31 00:00:00"},
      {kInvariant, "01/01/68", "2068-01-01 00:00:00"},
      {kInvariant, "Sat May 17 14:03:09 2003", "2003-05-17 14:03:09"},
      {kInvariant, "Sun May 17 14:03:09 2003", "refused"},      // a Saturday
      {kInvariant, "January May 18 14:03:09 2003", "refused"},  // no weekday
      {kInvariant, "May 17, 2003 2:30 PM", "2003-05-17 14:30:00"},
      // en_US: %x "%m/%d/%Y", %c "%a %d %b %Y %r %Z", with or without the zone
      // (ParseDateTime holds it against the current zone).
      {kEnUs, "Sat 17 May 2003 02:03:09 PM", "2003-05-17 14:03:09"},
      {kEnUs, "Sat 17 May 2003 02:03:09 PM EDT", "2003-05-17 14:03:09"},
      {kEnUs, "05/17/03", "refused"},  // writes four digits, reads no two or three
      {kEnUs, "05/17/203", "refused"},
      {kEnUs, "12:30 am", "1899-12-30 00:30:00"},
      {kEnUs, "13:00 PM", "refused"},
      // de_DE: no AM/PM words; the locale's own names, folded in its own case.
      {kDeDe, "17. MÄRZ 2003 8:15", "2003-03-17 08:15:00"},
      // fr_FR: abbreviations read with or without their ".".
      {kFrFr, "17 févr. 2003", "2003-02-17 00:00:00"},
      // ja_JP: %r "%p%I時%M分%S秒"; a blank between date and time forms.
      {kJaJp, "午後2時03分09秒", "1899-12-30 14:03:09"},
      {kJaJp, "2:30 午前", "1899-12-30 02:30:00"},
      {kJaJp, "2003年05月17日14時03分09秒", "refused"},
  };
  for (const auto& c : cases) {
    for (const std::uint32_t locale : kLocales) {
      if (c.locale != kEvery && c.locale != locale) continue;
      EXPECT_EQ(Read(locale, c.text), c.fields) << "locale " << locale << ": " << c.text;
    }
  }
}

// Which of a locale's patterns give a reading form: flags are passed over; a
// date needs year, month and day, a time hours and minutes, a weekday a date.
TEST(CompileForm, OnlyWholeDatesAndTimes) {
  const datetimelib::platform::LangInfo words;
  for (const char* pattern : {"%-d.%_m.%Y", "%I:%M %p", "%a %d %b %Y"}) {
    EXPECT_TRUE(datetimelib::CompileForm(pattern, words).has_value()) << pattern;
  }
  for (const char* pattern :
       {"%m/%Y %H:%M", "%d %H", "%a %H:%M", "%a %A %d.%m.%Y", "%I:%M"}) {
    EXPECT_FALSE(datetimelib::CompileForm(pattern, words).has_value()) << pattern;
  }
}

// A thread keeps the forms of the locale it read in last; a read in another
// locale, often opened where the last one was freed, never gets them.
TEST(ReadInLocale, ForgetsTheLastLocaleForAnother) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const Row in_turn[] = {
      {kDeDe, "17. März 2003", "2003-03-17 00:00:00"},
      {kFrFr, "17. März 2003", "refused"},
      {kFrFr, "17 mars 2003", "2003-03-17 00:00:00"},
      {kDeDe, "2:30 PM", "refused"},
  };
  for (const auto& step : in_turn) {
    EXPECT_EQ(Read(step.locale, step.text), step.fields)
        << "locale " << step.locale << ": " << step.text;
  }
}

}  // namespace
