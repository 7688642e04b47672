#include "text/english_names.h"

#include <gtest/gtest.h>

namespace {

using datetimelib::EqualsIgnoringAsciiCase;

// Month and weekday names match in any case, folding ASCII letters only.
TEST(EqualsIgnoringAsciiCase, FoldsOnlyAsciiLetters) {
  EXPECT_TRUE(EqualsIgnoringAsciiCase("sEpTeMbEr", "September"));
  EXPECT_FALSE(EqualsIgnoringAsciiCase("@", "`"));  // 0x40 and 0x60: not letters
  EXPECT_FALSE(EqualsIgnoringAsciiCase("[", "{"));
  EXPECT_FALSE(EqualsIgnoringAsciiCase("\xC4", "\xE4"));  // Latin-1 A/a umlaut
  EXPECT_FALSE(EqualsIgnoringAsciiCase("Jan", "Jan "));
}

}  // namespace
