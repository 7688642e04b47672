#include "text/locale_form.h"

#include <gtest/gtest.h>

#include <string>

#include "platform/locale_handle.h"
#include "platform/locale_words.h"

namespace {

using datetimelib::CompileForm;
using datetimelib::FormValues;
using datetimelib::LocaleVocabulary;
using datetimelib::MatchForm;
using datetimelib::platform::LocaleCase;
using datetimelib::platform::LocaleHandle;
using datetimelib::platform::LocaleWords;
using datetimelib::platform::ReadLocaleWords;

// "C" holds the English names and AM/PM, and is always there.
class LocaleFormTest : public ::testing::Test {
 protected:
  LocaleHandle c_ = LocaleHandle::Invariant();
  LocaleWords words_ = ReadLocaleWords(c_.get());
  LocaleVocabulary vocabulary_{words_, LocaleCase(c_.get())};
};

std::string Describe(const FormValues& v) {
  return std::to_string(v.year) + "-" + std::to_string(v.month) + "-" +
         std::to_string(v.day) + " h" + std::to_string(v.hour) + " i" +
         std::to_string(v.hour12) + " m" + std::to_string(v.minute) + " s" +
         std::to_string(v.second) + " p" + std::to_string(v.pm) + " w" +
         std::to_string(v.weekday);
}

TEST_F(LocaleFormTest, PatternsThatGiveNoForm) {
  LocaleWords looping = words_;
  looping.date_form = "%x";
  for (const char* pattern : {
           // Conversions that name no field of ours.
           "%j %Y",
           "%Ey",
           "%Od.%m.%Y",
           "%U %Y-%m-%d",
           "%s",
           // Part of a date or a time, or more than one of a field.
           "%H",
           "%d.%m",
           "%Y-%m-%d %H",
           "%M:%S",
           "%Y-%m-%d %d",
           // A 12-hour clock without AM/PM, or AM/PM without one.
           "%I:%M",
           "%H:%M %p",
           // A weekday with no date to check it against.
           "%a %H:%M",
           // Nothing, or a lone "%".
           "",
           "%Z",
           "%Y-%m-%d %",
       }) {
    EXPECT_FALSE(CompileForm(pattern, words_)) << pattern;
  }
  EXPECT_FALSE(CompileForm("%x", looping));
}

TEST_F(LocaleFormTest, EachStepReadsItsPart) {
  const struct {
    const char* pattern;
    const char* text;
    const char* values;  // nullptr: refused
  } cases[] = {
      // %Y is four digits, %y two; other numbers one or two.
      {"%Y-%m-%d", "2003-05-17", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w-1"},
      {"%Y-%m-%d", "03-05-17", nullptr},
      {"%Y-%m-%d", "2003-005-17", nullptr},
      {"%y-%m-%d", "03-05-17", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w-1"},
      {"%y-%m-%d", "69-05-17", "1969-5-17 h-1 i-1 m-1 s-1 p-1 w-1"},
      {"%y-%m-%d", "2003-05-17", nullptr},
      {"%y-%m-%d", "3-05-17", nullptr},
      // Ranges are judged later, not here.
      {"%F %T", "2003-99-99 99:99:99", "2003-99-99 h99 i-1 m99 s99 p-1 w-1"},
      // Blank padding where strftime pads with blanks, and nowhere else.
      {"%b %e %Y", "May  7 2003", "2003-5-7 h-1 i-1 m-1 s-1 p-1 w-1"},
      {"%d.%m.%Y", "17. 5.2003", nullptr},
      {"%d.%_m.%Y", "17. 5.2003", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w-1"},
      // One blank reads many; %t reads none too.
      {"%Y-%m-%d %H:%M", "2003-05-17 \t 9:05", "2003-5-17 h9 i-1 m5 s-1 p-1 w-1"},
      {"%Y-%m-%d %H:%M", "2003-05-179:05", nullptr},
      {"%I:%M%t%p", "2:30PM", "-1--1--1 h-1 i2 m30 s-1 p1 w-1"},
      {"%I:%M%t%p", "2:30 \t am", "-1--1--1 h-1 i2 m30 s-1 p0 w-1"},
      {"%I:%M %p", "2:30PM", nullptr},
      // Names in any case, the longest first, with the weekday kept for checking.
      {"%B %d %Y", "June 5 2003", "2003-6-5 h-1 i-1 m-1 s-1 p-1 w-1"},
      {"%B %d %Y", "Juni 5 2003", nullptr},
      {"%a %b %e %Y", "SAT may 17 2003", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w6"},
      {"%a %b %e %Y", "Saturday May 17 2003", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w6"},
      // Literals byte for byte; "%%" is one "%".
      {"%Y-%m-%d%%", "2003-05-17%", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w-1"},
      {"%Y-%m-%dT%H:%M", "2003-05-17t14:03", nullptr},
      // The locale's own forms, written out; a zone is left out with its blank.
      {"%c", "Sat May 17 14:03:09 2003", "2003-5-17 h14 i-1 m3 s9 p-1 w6"},
      {"%a %b %e %H:%M:%S %Z %Y", "Sat May 17 14:03:09 2003",
       "2003-5-17 h14 i-1 m3 s9 p-1 w6"},
      {"%a %b %e %H:%M:%S %Z %Y", "Sat May 17 14:03:09 UTC 2003", nullptr},
      {"%Z %F", "2003-05-17", "2003-5-17 h-1 i-1 m-1 s-1 p-1 w-1"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(std::string(c.pattern) + " | " + c.text);
    const auto form = CompileForm(c.pattern, words_);
    ASSERT_TRUE(form);
    const std::string text = c.text;
    std::size_t position = 0;
    FormValues values;
    const bool read = MatchForm(*form, vocabulary_, text, &position, &values) &&
                      position == text.size();
    if (c.values == nullptr) {
      EXPECT_FALSE(read) << Describe(values);
    } else {
      ASSERT_TRUE(read);
      EXPECT_EQ(Describe(values), c.values);
    }
  }
}

}  // namespace
