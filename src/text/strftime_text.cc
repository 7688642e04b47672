#include "text/strftime_text.h"

#include <time.h>

#include <algorithm>
#include <cstring>
#include <ctime>

#include "platform/ascii.h"
#include "text/canonical_text.h"
#include "text/digits.h"

namespace datetimelib {
namespace {

// A conversion may ask for a field width ("%10d"); wider ones are not applied,
// so that a short pattern cannot ask for gigabytes ("%2147483647d"). Such a
// conversion is written as it stands in the pattern.
constexpr std::size_t kMaxFieldWidth = 1024;

// What one conversion may write beyond twice its width: more than any name,
// date or era form of any locale. (glibc pads "%z" twice, the sign and then the
// digits, each to the width.)
constexpr std::size_t kConversionAllowance = 512;

// One conversion of a pattern: "%" [flags] [width] [modifier] character, as the
// C library reads it; the character is missing at the end of the pattern. The
// flags must be exactly the library's: a "+" it does not take is a conversion
// character, and the text after it is not part of the conversion.
struct Conversion {
  std::size_t length = 0;  // bytes of the pattern it spans
  std::size_t width = 0;   // 0 when none, or more than kMaxFieldWidth + 1
};

Conversion ReadConversion(const char* percent) {
  const char* p = percent + 1;
  while (*p != '\0' && std::strchr("_-0^#", *p) != nullptr) ++p;
  std::size_t width = 0;
  for (; platform::IsAsciiDigit(*p); ++p) {
    width = std::min(width * 10 + static_cast<std::size_t>(*p - '0'), kMaxFieldWidth + 1);
  }
  if (*p == 'E' || *p == 'O') ++p;
  if (*p != '\0') ++p;
  return {static_cast<std::size_t>(p - percent), width};
}

// Appends what strftime writes for the pattern text [begin, end), whose
// conversions may write `allowance` bytes in all. strftime returns 0 both for an
// empty text and for one that does not fit, so the buffer grows from a size that
// fits most texts to one that fits any, where 0 means empty. One call takes the
// whole run: glibc carries some flags from one conversion to the next ("%-EY"
// leaves later "%EY" unpadded), so conversions must not be written apart.
// `locale` null: the calling thread's locale.
void AppendStrftime(const std::tm& tm, const char* begin, const char* end,
                    std::size_t allowance, locale_t locale, std::string* out) {
  if (begin == end) return;
  std::string cut;  // the run as a C string, when it ends before the pattern
  const char* run = begin;
  if (*end != '\0') {
    cut.assign(begin, end);
    run = cut.c_str();
  }
  const std::size_t length = static_cast<std::size_t>(end - begin);
  const std::size_t fits_any = length + allowance + 1;  // +1: strftime's NUL
  const std::size_t start = out->size();
  std::size_t size = std::min(2 * length + 64, fits_any);
  for (;;) {
    out->resize(start + size);
    char* const buffer = out->data() + start;
    const std::size_t written = locale != nullptr
                                    ? strftime_l(buffer, size, run, &tm, locale)
                                    : std::strftime(buffer, size, run, &tm);
    if (written > 0 || size == fits_any) {
      out->resize(start + written);
      return;
    }
    size = std::min(size * 4, fits_any);
  }
}

void WriteStrftime(const platform::BrokenDownTime& fields, const char* pattern,
                   locale_t locale, std::string* out) {
  out->clear();
  const std::tm tm = platform::ToTm(fields);
  // The pattern goes to strftime in runs that end at a conversion too wide to
  // apply, which is written as it stands.
  const char* run = pattern;
  std::size_t allowance = 0;
  const char* percent = std::strchr(pattern, '%');
  while (percent != nullptr) {
    const Conversion read = ReadConversion(percent);
    if (read.width > kMaxFieldWidth) {
      AppendStrftime(tm, run, percent, allowance, locale, out);
      out->append(percent, read.length);
      run = percent + read.length;
      allowance = 0;
    } else {
      allowance += 2 * read.width + kConversionAllowance;
    }
    percent = std::strchr(percent + read.length, '%');
  }
  AppendStrftime(tm, run, run + std::strlen(run), allowance, locale, out);
}

}  // namespace

bool WriteCanonicalText(const platform::BrokenDownTime& fields, const char* pattern,
                        char (&text)[kCanonicalLength]) {
  // %Y writes four digits only for the years 1000 to 9999; every count of 32 bits
  // lies within them.
  if (fields.year < 1000 || fields.year > 9999 ||
      std::strcmp(pattern, kCanonicalPattern) != 0) {
    return false;
  }
  char* p = WriteFourDigits(text, fields.year);
  *p++ = '-';
  p = WriteTwoDigits(p, fields.month);
  *p++ = '-';
  p = WriteTwoDigits(p, fields.day);
  *p++ = ' ';
  p = WriteTwoDigits(p, fields.hour);
  *p++ = ':';
  p = WriteTwoDigits(p, fields.minute);
  *p++ = ':';
  WriteTwoDigits(p, fields.second);
  return true;
}

void WritePattern(const platform::BrokenDownTime& fields, const char* pattern,
                  std::string* out) {
  char text[kCanonicalLength];
  if (WriteCanonicalText(fields, pattern, text)) {
    out->assign(text, kCanonicalLength);
  } else {
    WriteStrftime(fields, pattern, nullptr, out);
  }
}

void WritePatternInLocale(const platform::BrokenDownTime& fields, const char* pattern,
                          locale_t locale, std::string* out) {
  if (locale == nullptr) {
    out->clear();
    return;
  }
  WriteStrftime(fields, pattern, locale, out);
}

}  // namespace datetimelib
