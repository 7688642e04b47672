// Every parser and formatter handed what no person types: texts of a megabyte,
// bytes that are no character, numbers of hundreds of digits, signs where no
// sign belongs. Each must give the outcome its rules give, keep the text exactly
// where it keeps one, and take time in proportion to the text.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "AdDateTime.h"
#include "support/fixed_clock.h"
#include "support/test_locales.h"
#include "support/tz_guard.h"
#include "support/value_text.h"

namespace {

using datetimelib::testing::Dirty;
using datetimelib::testing::FixedNow;
using datetimelib::testing::KeptText;
using datetimelib::testing::ThreadLocale;
using datetimelib::testing::TzGuard;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";
constexpr const char* kRefused = "refused";
constexpr int kCountBefore = datetimelib::testing::kDirtyCount;

// Wednesday 2003-01-08 10:00:00 UTC, the now of compact texts without a date.
const std::int64_t kNow = datetimelib::testing::UtcCount(2003, 1, 8, 10);

// The canonical UTC text that ParseTolvaneDateTime reads, or kRefused after
// checking that a refusal left the count and the kept text alone.
std::string Compact(const std::string& text) {
  AdDateTime value = Dirty();
  value.ParseTolvaneDateTime(text.c_str());
  if (value.IsValid()) {
    EXPECT_EQ(KeptText(value), "");
    return value.FormatGMT(kCanonical);
  }
  EXPECT_EQ(value.GetCTime().GetTime(), kCountBefore);
  EXPECT_EQ(KeptText(value), "kept");
  return kRefused;
}

// The same for ParseDateTime (gmt false) and ParseDateTimeGMT, whose refusal
// keeps the whole text, byte for byte.
std::string Locale(const std::string& text, bool gmt) {
  AdDateTime value = Dirty();
  const int read =
      gmt ? value.ParseDateTimeGMT(text.c_str()) : value.ParseDateTime(text.c_str());
  if (read == 1) {
    EXPECT_TRUE(value.IsValid());
    EXPECT_EQ(KeptText(value), "");
    return value.FormatGMT(kCanonical);
  }
  EXPECT_EQ(value.GetStatus(), AdDateTime::invalid);
  EXPECT_EQ(value.GetCTime().GetTime(), kCountBefore);
  EXPECT_TRUE(KeptText(value) == text)
      << "kept text differs, " << text.size() << " bytes";
  return kRefused;
}

std::string Repeat(const std::string& unit, std::size_t times) {
  std::string text;
  text.reserve(unit.size() * times);
  for (std::size_t i = 0; i < times; ++i) text += unit;
  return text;
}

struct Row {
  const char* name;
  std::string text;
  const char* compact;  // ParseTolvaneDateTime: UTC text or kRefused
  const char* locale;   // ParseDateTime and ParseDateTimeGMT, with TZ=UTC
};

void ExpectRows(const std::vector<Row>& rows) {
  for (const Row& row : rows) {
    SCOPED_TRACE(row.name);
    EXPECT_EQ(Compact(row.text), row.compact);
    EXPECT_EQ(Locale(row.text, false), row.locale);
    EXPECT_EQ(Locale(row.text, true), row.locale);
  }
}

// Locale names to read in: "C" always, the UTF-8 ones where they were compiled.
std::vector<const char*> ReadingLocales(std::vector<const char*> utf8) {
  std::vector<const char*> names = {"C"};
  if (datetimelib::testing::TestLocalesAvailable()) {
    names.insert(names.end(), utf8.begin(), utf8.end());
  }
  return names;
}

TEST(HostileText, MegabyteTexts) {
  TzGuard tz("UTC");
  FixedNow now(kNow);
  const std::string letters(1 << 20, 'x'), blanks(1 << 20, ' ');
  const std::vector<Row> rows = {
      {"letters", letters, kRefused, kRefused},
      {"dots", std::string(1 << 20, '.'), kRefused, kRefused},
      {"colons", std::string(1 << 20, ':'), kRefused, kRefused},
      {"digits", std::string(1 << 20, '7'), kRefused, kRefused},
      {"dashes", std::string(1 << 20, '-'), kRefused, kRefused},
      {"canonical text, then blanks", "2003-05-17 14:03:09" + blanks, kRefused,
       "2003-05-17 14:03:09"},
      {"blanks between date and time", "2003-05-17" + blanks + "14:03", kRefused,
       "2003-05-17 14:03:00"},
      {"blanks first", blanks + "2003-05-17 14:03:09", kRefused, kRefused},
      {"a fraction of a megabyte", "2003-05-17 14:03:09." + letters, kRefused,
       "2003-05-17 14:03:09"},
      {"compact text, then letters", "05-Jan-2003.10:00" + letters, "2003-01-05 10:00:00",
       kRefused},
      {"letters before UTC", "05-Jan-2003.10:00" + letters + "UTC+2",
       "2003-01-05 12:00:00", kRefused},
      {"blanks before the hour", "05-Jan-2003." + blanks + "10:00", "2003-01-05 10:00:00",
       kRefused},
      {"a date part of a megabyte", letters + ".10:00", kRefused, kRefused},
  };
  for (const char* name : ReadingLocales({"ja_JP.UTF-8"})) {
    SCOPED_TRACE(name);
    const ThreadLocale locale(name);
    ASSERT_TRUE(locale.ok());
    ExpectRows(rows);
  }
}

// A long pattern is written whole: its text is that of its parts, end to end.
// (strftime takes 100 to 250 ms for a megabyte of "%c", so the locales that
// write names of their own get a quarter of one.)
TEST(HostileText, MegabytePatterns) {
  TzGuard tz("America/New_York");
  const AdDateTime value(AdTime(1053194589));  // 2003-05-17 14:03:09 EDT
  const auto repeated = [](const std::string& unit, std::size_t bytes) {
    return Repeat(unit, bytes / unit.size());
  };
  constexpr std::size_t kMegabyte = 1 << 20;
  const std::string megabyte_of_c = repeated("%c", kMegabyte);
  EXPECT_TRUE(value.Format(megabyte_of_c.c_str()) ==
              Repeat("Sat May 17 14:03:09 2003", kMegabyte / 2));
  EXPECT_TRUE(value.FormatGMT(megabyte_of_c.c_str()) ==
              Repeat("Sat May 17 18:03:09 2003", kMegabyte / 2));
  for (const char* name : ReadingLocales({"de_DE.UTF-8", "ja_JP.UTF-8"})) {
    const ThreadLocale locale(name);
    ASSERT_TRUE(locale.ok());
    const std::pair<std::string, std::size_t> units[] = {
        {"a", kMegabyte}, {"%c", kMegabyte / 4}, {"%a %x %X %p ", kMegabyte / 4}};
    for (const auto& [unit, bytes] : units) {
      SCOPED_TRACE(testing::Message() << name << " " << unit);
      const std::string text = value.Format(repeated(unit, bytes).c_str());
      EXPECT_TRUE(text == Repeat(value.Format(unit.c_str()), bytes / unit.size()))
          << text.size() << " bytes";
    }
  }
  // An outOfRange value gives back its kept text of a megabyte unchanged.
  AdDateTime refused;
  const std::string text = "1969-12-31 23:59:59" + std::string(kMegabyte, ' ');
  EXPECT_EQ(refused.ParseDateTimeGMT(text.c_str()), 0);
  EXPECT_TRUE(refused.Format(megabyte_of_c.c_str()) == text);
}

// Bytes that are no character in the locale's codeset: refused, kept exactly,
// nowhere read as a name. Words of the locale read as its own words.
TEST(HostileText, BinaryBytesAndInvalidUtf8) {
  DATETIMELIB_NEED_TEST_LOCALES();
  TzGuard tz("UTC");
  FixedNow now(kNow);
  const struct {
    const char* text;
    const char* compact;
    const char *c, *german, *japanese;  // ParseDateTime in C, de_DE, ja_JP
  } cases[] = {
      {"\x80", kRefused, kRefused, kRefused, kRefused},
      {"\xC0\xAF", kRefused, kRefused, kRefused, kRefused},  // overlong "/"
      {"\xFF\xFE\xFD\x01\x02\x7F", kRefused, kRefused, kRefused, kRefused},
      {"17 M\xC3\x84RZ 2003", kRefused, kRefused, "2003-03-17 00:00:00", kRefused},
      {"17 M\xE4rz 2003", kRefused, kRefused, kRefused, kRefused},      // Latin-1
      {"17 M\xC3rz 2003", kRefused, kRefused, kRefused, kRefused},      // cut short
      {"17 M\xC3\xC4rz 2003", kRefused, kRefused, kRefused, kRefused},  // no continuation
      {"17 M\xE0\x83\x84rz 2003", kRefused, kRefused, kRefused, kRefused},  // overlong
      {"17 M\x84rz 2003", kRefused, kRefused, kRefused, kRefused},  // lone continuation
      // 2003年05月17日, whole and with its last character cut.
      {"2003\xE5\xB9\xB4"
       "05\xE6\x9C\x88"
       "17\xE6\x97\xA5",
       kRefused, kRefused, kRefused, "2003-05-17 00:00:00"},
      {"2003\xE5\xB9\xB4"
       "05\xE6\x9C\x88"
       "17\xE6\x97",
       kRefused, kRefused, kRefused, kRefused},
      // An afternoon (午後) after the date, whole and cut.
      {"2003-05-17 2:30 \xE5\x8D\x88\xE5\xBE\x8C", kRefused, kRefused, kRefused,
       "2003-05-17 14:30:00"},
      {"2003-05-17 2:30 \xE5\x8D\x88\xE5\xBE", kRefused, kRefused, kRefused, kRefused},
      // Blanks that are not blanks: a byte-order mark, no-break spaces.
      {"\xEF\xBB\xBF"
       "2003-05-17 14:03:09",
       kRefused, kRefused, kRefused, kRefused},
      {"2003-05-17\xC2\xA0"
       "14:03:09",
       kRefused, kRefused, kRefused, kRefused},
      {"2003-05-17 14:03:09\xC2\xA0", kRefused, kRefused, kRefused, kRefused},
      {"2003-05-17 14:03:09\xA0", kRefused, kRefused, kRefused, kRefused},
      // The compact reader ignores what follows the time, and reads only English.
      {"05-Jan-2003.10:00\xFF\xC0\x80", "2003-01-05 10:00:00", kRefused, kRefused,
       kRefused},
      {"05-J\xC3\xA1n-2003", kRefused, kRefused, kRefused, kRefused},
      {"05-\xE6\x9C\x88-2003", kRefused, kRefused, kRefused, kRefused},
  };
  const char* const locales[] = {"C", "de_DE.UTF-8", "ja_JP.UTF-8"};
  for (const auto& c : cases) {
    const char* const expected[] = {c.c, c.german, c.japanese};
    for (int i = 0; i < 3; ++i) {
      SCOPED_TRACE(testing::Message()
                   << locales[i] << " " << testing::PrintToString(c.text));
      const ThreadLocale locale(locales[i]);
      ASSERT_TRUE(locale.ok());
      EXPECT_EQ(Compact(c.text), c.compact);
      EXPECT_EQ(Locale(c.text, false), expected[i]);
      EXPECT_EQ(Locale(c.text, true), expected[i]);
    }
  }
}

// A number beyond 32 bits refuses the text wherever it stands; leading zeros
// do not make a number large.
TEST(HostileText, NumbersOfHundredsOfDigits) {
  TzGuard tz("UTC");
  FixedNow now(kNow);
  const std::string big(300, '9'), zeros(300, '0');
  const std::vector<Row> rows = {
      // The compact form: day, year, hour, minute, second, offset.
      {"day", big + "-Jan-2003", kRefused, kRefused},
      {"year", "05-Jan-" + big, kRefused, kRefused},
      {"hour", "05-Jan-2003." + big + ":00", kRefused, kRefused},
      {"negative hour", "05-Jan-2003.-" + big + ":00", kRefused, kRefused},
      {"minute", "05-Jan-2003.10:" + big, kRefused, kRefused},
      {"second", "05-Jan-2003.10:00:" + big, kRefused, kRefused},
      {"time of today", big + ":00", kRefused, kRefused},
      {"offset hours", "05-Jan-2003.10:00UTC+" + big, kRefused, kRefused},
      {"negative offset hours", "05-Jan-2003.10:00UTC+-" + big, kRefused, kRefused},
      {"offset minutes", "05-Jan-2003.10:00UTC+1:" + big, kRefused, kRefused},
      {"leading zeros", "05-Jan-2003." + zeros + "10:" + zeros + "30:" + zeros + "15",
       "2003-01-05 10:30:15", kRefused},
      {"leading zeros in the offset",
       "05-Jan-2003.10:00UTC+" + zeros + "2:" + zeros + "30", "2003-01-05 12:30:00",
       kRefused},
      // The canonical and the locale forms read at most four digits a field.
      {"canonical year", big + "-05-17 14:03:09", kRefused, kRefused},
      {"canonical month", "2003-" + big + "-17 14:03:09", kRefused, kRefused},
      {"canonical day", "2003-05-" + big + " 14:03:09", kRefused, kRefused},
      {"canonical hour", "2003-05-17 " + big + ":03:09", kRefused, kRefused},
      {"canonical minute", "2003-05-17 14:" + big + ":09", kRefused, kRefused},
      {"canonical second", "2003-05-17 14:03:" + big, kRefused, kRefused},
      {"canonical, zero-padded", "2003-05-17 " + zeros + "14:03:09", kRefused, kRefused},
      {"ISO form", "2003-05-17T14:" + zeros + "3", kRefused, kRefused},
      {"month name form", "May " + big + ", 2003", kRefused, kRefused},
      {"locale date", "05/17/" + big, kRefused, kRefused},
      {"time alone", "14:" + big, kRefused, kRefused},
      {"12-hour time", big + ":30 PM", kRefused, kRefused},
  };
  for (const char* name : ReadingLocales({"de_DE.UTF-8"})) {
    SCOPED_TRACE(name);
    const ThreadLocale locale(name);
    ASSERT_TRUE(locale.ok());
    ExpectRows(rows);
    ExpectRows({{"German date", "17." + big + ".2003", kRefused, kRefused}});
  }
}

// Signs inside the numbers of the compact time and its offset. Each number is
// read as the time's numbers are: blanks, then a sign of its own, then digits,
// and a ":" directly after it; what follows the last number is ignored. The
// offset's numbers, as read, lie within 13 hours and 59 minutes either way
// before the offset's own sign applies.
TEST(HostileText, SignsInsideCompactNumbers) {
  TzGuard tz("UTC");
  FixedNow now(kNow);
  const std::pair<const char*, const char*> cases[] = {
      // The offset after "UTC".
      {"05-Jan-2003.10:00UTC+1-2", "2003-01-05 11:00:00"},  // "-2" ignored
      {"05-Jan-2003.10:00UTC--2", "2003-01-05 12:00:00"},
      {"05-Jan-2003.10:00UTC-+2", "2003-01-05 08:00:00"},
      {"05-Jan-2003.10:00UTC++2", "2003-01-05 12:00:00"},
      {"05-Jan-2003.10:00UTC+ 2", "2003-01-05 12:00:00"},
      {"05-Jan-2003.10:00UTC+1:-30", "2003-01-05 10:30:00"},
      {"05-Jan-2003.10:00UTC-1:-30", "2003-01-05 09:30:00"},
      {"05-Jan-2003.10:00UTC+1: 30", "2003-01-05 11:30:00"},
      {"05-Jan-2003.10:00UTC+1 :30", "2003-01-05 11:00:00"},
      {"05-Jan-2003.10:00UTC+1:-", "2003-01-05 11:00:00"},
      {"05-Jan-2003.10:00UTC--13:-59", "2003-01-05 23:59:00"},
      {"05-Jan-2003.10:00UTC+-13:-59", "2003-01-04 20:01:00"},
      {"05-Jan-2003.10:00UTC+1:-60", kRefused},
      {"05-Jan-2003.10:00UTC--14", kRefused},
      {"05-Jan-2003.10:00UTC+-14:-59", kRefused},
      {"05-Jan-2003.10:00UTC+2UTC+3", "2003-01-05 12:00:00"},
      {"05-Jan-2003.10:00UTC-+14", kRefused},
      {"05-Jan-2003.10:00UTC+1:+60", kRefused},
      {"05-Jan-2003.10:00UTC+-", kRefused},
      {"05-Jan-2003.10:00UTC+ ", kRefused},
      {"05-Jan-2003.10:00UTC+ -", kRefused},
      {"05-Jan-2003.10:00UTC +2", kRefused},
      {"05-Jan-2003.10:00UTC+-+2", kRefused},
      // The time's own numbers.
      {"05-Jan-2003.1-0:00", kRefused},  // one number, then "-0:00"
      {"05-Jan-2003.-1:-0", "2003-01-04 23:00:00"},
      {"05-Jan-2003.+10:+30:-15", "2003-01-05 10:29:45"},
      {"05-Jan-2003.10:30-15", "2003-01-05 10:30:00"},
      {"05-Jan-2003.10:-0:-0UTC", "2003-01-05 10:00:00"},
      {"05-Jan-2003.--10:00", kRefused},
      {"05-Jan-2003.- 10:00", kRefused},
      {"05-Jan-2003.10:+-30", kRefused},
      // Day and year.
      {"+5-Jan-2003", "2003-01-05 00:00:00"},
      {"05-Jan-+2003", kRefused},
      {"05-Jan-+999", kRefused},
  };
  for (const auto& [text, expected] : cases) EXPECT_EQ(Compact(text), expected) << text;
}

}  // namespace
