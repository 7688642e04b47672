#include "platform/locale_handle.h"

#include <gtest/gtest.h>
#include <langinfo.h>

#include <clocale>
#include <string>
#include <thread>

#include "support/test_locales.h"

namespace {

using datetimelib::platform::LocaleHandle;
using datetimelib::testing::ThreadLocale;

// The date form of the locale a handle holds tells which locale it is.
std::string DateForm(const LocaleHandle& handle) {
  return nl_langinfo_l(D_FMT, handle.get());
}

constexpr const char* kC = "%m/%d/%y";
constexpr const char* kGerman = "%d.%m.%Y";
constexpr const char* kJapanese = "%Y年%m月%d日";

TEST(LocaleHandle, ForIdentifier) {
  DATETIMELIB_NEED_TEST_LOCALES();
  const struct {
    std::uint32_t identifier;
    const char* date_form;
  } cases[] = {
      {1031, kGerman},   {1033, "%m/%d/%Y"}, {2057, "%d/%m/%y"}, {1036, "%d/%m/%Y"},
      {1041, kJapanese}, {127, kC},          {1049, kC},         {0, kC},
      {1024 + 1, kC},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(DateForm(LocaleHandle::ForIdentifier(c.identifier)), c.date_form)
        << c.identifier;
  }
}

// uselocale(0) answers LC_GLOBAL_LOCALE on a thread without a locale of its
// own; the handle then holds a copy of the process-wide locale.
TEST(LocaleHandle, ThreadLocaleOrProcessLocale) {
  DATETIMELIB_NEED_TEST_LOCALES();
  ASSERT_EQ(uselocale(nullptr), LC_GLOBAL_LOCALE);
  EXPECT_EQ(DateForm(LocaleHandle::OfThread()), kC);

  ASSERT_NE(std::setlocale(LC_TIME, "ja_JP.UTF-8"), nullptr);
  EXPECT_EQ(DateForm(LocaleHandle::OfThread()), kJapanese);
  EXPECT_EQ(DateForm(LocaleHandle::SystemDefault()), kJapanese);
  std::string on_other_thread;
  std::thread other([&] {
    const ThreadLocale german("de_DE.UTF-8");
    on_other_thread = DateForm(LocaleHandle::OfThread());
    // The system default stays the process-wide locale on any thread.
    EXPECT_EQ(DateForm(LocaleHandle::SystemDefault()), kJapanese);
  });
  other.join();
  EXPECT_EQ(on_other_thread, kGerman);
  EXPECT_EQ(DateForm(LocaleHandle::OfThread()), kJapanese);
  std::setlocale(LC_TIME, "C");
}

}  // namespace
