#include "text/canonical_text.h"

#include <gtest/gtest.h>
#include <locale.h>

#include <cstring>
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "platform/local_time.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"
#include "text/locale_reader.h"
#include "text/strftime_text.h"

namespace {

using datetimelib::DateTimeFields;
using datetimelib::ReadCanonical;
using datetimelib::ReadInLocale;

bool SameFields(const DateTimeFields& a, const DateTimeFields& b) {
  return a.year == b.year && a.month == b.month && a.day == b.day && a.hour == b.hour &&
         a.minute == b.minute && a.second == b.second;
}

// The direct reading of the canonical text gives what the locale reader gives,
// in every locale, for what the library writes and for texts of the same shape
// that name no real date-time.
TEST(ReadCanonical, AgreesWithTheLocaleReader) {
  std::vector<std::string> locales = {"C"};
  if (datetimelib::testing::TestLocalesAvailable()) {
    for (const char* name :
         {"de_DE.UTF-8", "en_US.UTF-8", "fr_FR.UTF-8", "ja_JP.UTF-8"}) {
      locales.push_back(name);
    }
  }
  std::vector<std::string> texts = {
      "2003-02-29 00:00:00",   "2004-02-29 00:00:00",  "2003-13-01 00:00:00",
      "2003-00-10 00:00:00",   "2003-01-00 00:00:00",  "2003-01-01 24:00:00",
      "2003-01-01 23:60:00",   "2003-01-01 23:59:60",  "0000-01-01 00:00:00",
      "2003-01-01 12:00:00  ", "2003-01-01 12:00:00x", "2003-01-0a 12:00:00",
  };
  for (std::int64_t t = 0; t < INT32_MAX; t += 86400 * 37 + 3607) {
    std::string text;
    datetimelib::WritePattern(datetimelib::platform::BreakDownUtc(t),
                              datetimelib::kCanonicalPattern, &text);
    texts.push_back(text);
  }
  for (const std::string& name : locales) {
    locale_t locale = newlocale(LC_ALL_MASK, name.c_str(), nullptr);
    ASSERT_NE(locale, nullptr) << name;
    for (const std::string& text : texts) {
      DateTimeFields direct;
      DateTimeFields general;
      const bool read_directly = ReadCanonical(text, &direct);
      const bool read_generally = ReadInLocale(text, locale, &general);
      EXPECT_EQ(read_directly, read_generally) << name << " " << text;
      if (read_directly && read_generally) {
        EXPECT_TRUE(SameFields(direct, general)) << name << " " << text;
      }
    }
    freelocale(locale);
  }
}

// The canonical pattern written digit by digit is strftime's text.
TEST(WritePattern, CanonicalDigitsAreStrftimes) {
  datetimelib::testing::TzGuard tz("Australia/Lord_Howe");
  for (std::int64_t t = INT32_MIN; t < INT32_MAX; t += 86400 * 23 + 1801) {
    const auto fields = datetimelib::platform::BreakDownLocal(t);
    std::string text;
    datetimelib::WritePattern(fields, datetimelib::kCanonicalPattern, &text);
    const std::tm tm = datetimelib::platform::ToTm(fields);
    char expected[64];
    const std::size_t length =
        std::strftime(expected, sizeof expected, "%Y-%m-%d %H:%M:%S", &tm);
    ASSERT_EQ(text, std::string(expected, length)) << t;
  }
}

// The Into forms give the same text as the others, for every status, and reuse
// the caller's buffer.
TEST(FormatInto, SameTextReusingTheBuffer) {
  datetimelib::testing::TzGuard tz("America/New_York");
  AdDateTime refused(2040, 1, 1, 0, 0, 0);
  AdDateTime invalid_value(AdTime(5));
  invalid_value.ParseDateTime("no");
  const AdDateTime values[] = {AdDateTime(AdTime(1053194589)), AdDateTime(), refused,
                               invalid_value};
  std::string out;
  out.reserve(4096);  // room for the strftime path's scratch space
  const char* buffer = out.data();
  for (const AdDateTime& value : values) {
    for (const char* pattern : {"%Y-%m-%d %H:%M:%S", "%d.%m.%Y %Z", "", "%p"}) {
      value.FormatInto(out, pattern);
      EXPECT_EQ(out, value.Format(pattern)) << pattern;
      value.FormatGMTInto(out, pattern);
      EXPECT_EQ(out, value.FormatGMT(pattern)) << pattern;
    }
    value.FormatTolvaneInto(out);
    EXPECT_EQ(out, value.FormatTolvane());
    value.FormatInto(out, nullptr);
    EXPECT_EQ(out, value.Format(nullptr)) << value.GetStatus();
  }
  EXPECT_EQ(out.data(), buffer);  // never reallocated
}

}  // namespace
