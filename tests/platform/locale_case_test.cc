#include "platform/locale_case.h"

#include <gtest/gtest.h>

#include <string>

#include "platform/locale_handle.h"
#include "support/test_locales.h"

namespace {

using datetimelib::platform::LocaleCase;
using datetimelib::platform::LocaleHandle;

TEST(LocaleCase, FoldsInTheLocaleEncoding) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const LocaleHandle german = LocaleHandle::ForIdentifier(1031);
  const LocaleHandle c = LocaleHandle::Invariant();
  const struct {
    const LocaleHandle* locale;
    const char* text;
    std::u32string folded;
  } cases[] = {
      {&german, "MÄRZ", U"märz"},
      {&german, "Déc.", U"déc."},
      {&german, "午後", U"午後"},
      {&german, "\xF0\x9F\x98\x80", U"\U0001F600"},
      // "C" is one byte per character and lowers ASCII only.
      {&c, "MAY", U"may"},
      {&c, "\xC3\x84", U"\u00C3\u0084"},
  };
  for (const auto& test : cases) {
    std::u32string folded;
    EXPECT_TRUE(LocaleCase(test.locale->get()).Fold(test.text, &folded)) << test.text;
    EXPECT_EQ(folded, test.folded) << test.text;
  }
}

TEST(LocaleCase, RefusesMalformedUtf8) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const LocaleHandle german = LocaleHandle::ForIdentifier(1031);
  const LocaleCase folder(german.get());
  for (const char* text : {
           "\x80",              // a continuation byte first
           "\xC3",              // cut short
           "\xE6\x97",          // cut short
           "\xC0\x80",          // overlong NUL
           "\xE0\x80\xAF",      // overlong "/"
           "\xED\xA0\x80",      // a surrogate
           "\xF4\x90\x80\x80",  // above U+10FFFF
           "\xF8\x88\x80\x80",  // no such lead byte
           "M\xC3(rz",          // a bad continuation
       }) {
    std::u32string folded;
    EXPECT_FALSE(folder.Fold(text, &folded)) << testing::PrintToString(text);
  }
  char32_t code = 0;
  EXPECT_EQ(folder.ReadFolded("ab", 2, &code), 0u);
}

}  // namespace
