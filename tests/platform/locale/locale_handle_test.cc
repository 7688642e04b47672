// The locale layer: identifiers to locales, the thread's own locale, and case
// folding in a UTF-8 locale.
#include "platform/locale/locale_handle.h"

#include <gtest/gtest.h>
#include <langinfo.h>

#include <clocale>
#include <string>
#include <thread>

#include "platform/locale/case_folding.h"
#include "platform/locale/locale_ids.h"
#include "support/test_locales.h"

namespace {

using datetimelib::platform::LocaleHandle;

// The date form of the locale a handle holds tells which locale it is.
std::string DateForm(const LocaleHandle& handle) {
  return nl_langinfo_l(D_FMT, handle.get());
}

constexpr const char* kJapanese = "%Y年%m月%d日";

TEST(LanguageRegionName, NamedNumbersAndOthers) {
  using datetimelib::platform::LanguageRegionName;
  EXPECT_STREQ(LanguageRegionName(1033), "en_US");
  // Not in the table: before its first entry, between two, past its last.
  for (const std::uint32_t identifier : {0u, 1047u, 0xFFFFFFFFu}) {
    EXPECT_EQ(LanguageRegionName(identifier), nullptr) << identifier;
  }
}

// uselocale(0) answers LC_GLOBAL_LOCALE on a thread without a locale of its
// own; the handle then holds a copy of the process-wide locale.
TEST(LocaleHandle, ThreadLocaleOrProcessLocale) {
  DATETIMELIB_NEED_TEST_LOCALES();
  ASSERT_EQ(uselocale(nullptr), LC_GLOBAL_LOCALE);
  EXPECT_EQ(DateForm(LocaleHandle::OfThread()), "%m/%d/%y");  // "C"

  ASSERT_NE(std::setlocale(LC_TIME, "ja_JP.UTF-8"), nullptr);
  EXPECT_EQ(DateForm(LocaleHandle::OfThread()), kJapanese);
  EXPECT_EQ(DateForm(LocaleHandle::SystemDefault()), kJapanese);
  std::string on_other_thread;
  std::thread other([&] {
    const datetimelib::testing::ThreadLocale german("de_DE.UTF-8");
    on_other_thread = DateForm(LocaleHandle::OfThread());
    // The system default stays the process-wide locale on any thread.
    EXPECT_EQ(DateForm(LocaleHandle::SystemDefault()), kJapanese);
  });
  other.join();
  EXPECT_EQ(on_other_thread, "%d.%m.%Y");
  // A handle given an owned copy by assignment frees it (LeakSanitizer watches).
  LocaleHandle assigned = LocaleHandle::ForIdentifier(1031);
  assigned = LocaleHandle::OfThread();
  EXPECT_EQ(DateForm(assigned), kJapanese);
  std::setlocale(LC_TIME, "C");
}

// Characters are decoded whole and lowered (the text tests read month names in
// any case); malformed UTF-8 does not fold.
TEST(CaseFolder, RefusesMalformedUtf8) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const LocaleHandle german = LocaleHandle::ForIdentifier(1031);
  const datetimelib::platform::CaseFolder folder(german.get());
  std::u32string folded;
  ASSERT_TRUE(folder.Fold("M\xC3\x84RZ \xF0\x9F\x98\x80", &folded));
  EXPECT_EQ(folded, U"m\u00E4rz \U0001F600");
  // A continuation byte first, cut short, overlong (NUL and "/"), a surrogate,
  // above U+10FFFF, no such lead byte, a bad continuation.
  for (const char* text : {"\x80", "\xC3", "\xC0\x80", "\xE0\x80\xAF", "\xED\xA0\x80",
                           "\xF4\x90\x80\x80", "\xF8\x88\x80\x80", "M\xC3(rz"}) {
    EXPECT_FALSE(folder.Fold(text, &folded)) << ::testing::PrintToString(text);
  }
}

}  // namespace
