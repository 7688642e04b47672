#include "text/strftime_text.h"

#include <algorithm>
#include <cstring>
#include <ctime>

#include "text/canonical_text.h"
#include "text/digits.h"

namespace datetimelib {
namespace {

constexpr std::size_t kCanonicalLength = 19;  // "YYYY-MM-DD HH:MM:SS"

// A conversion may ask for a field width ("%10d"); wider ones are not applied,
// so that a short pattern cannot ask for gigabytes ("%2147483647d"). Such a
// conversion is written as it stands in the pattern.
constexpr std::size_t kMaxFieldWidth = 1024;

// No conversion of any locale writes this many bytes beyond its width (glibc
// pads "%z" twice, the sign and then the digits to the width each).
constexpr std::size_t kMaxConversionBytes = 4096;

bool IsDigit(char c) { return c >= '0' && c <= '9'; }

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
  for (; IsDigit(*p); ++p) {
    width = std::min(width * 10 + static_cast<std::size_t>(*p - '0'), kMaxFieldWidth + 1);
  }
  if (*p == 'E' || *p == 'O') ++p;
  if (*p != '\0') ++p;
  return {static_cast<std::size_t>(p - percent), width};
}

bool HasFieldWidth(const char* pattern) {
  for (const char* p = std::strchr(pattern, '%'); p != nullptr;
       p = std::strchr(p + 1, '%')) {
    const char* after_flags = p + 1;
    while (*after_flags != '\0' && std::strchr("_-0^#", *after_flags) != nullptr) {
      ++after_flags;
    }
    if (IsDigit(*after_flags)) return true;
    if (*after_flags == '%') p = after_flags;  // "%%" is a conversion of its own
  }
  return false;
}

// strftime returns 0 both when the text does not fit and when it is empty (a
// lone "%p" in a locale without AM/PM words); a size that any conversion of
// `width` fits tells the two apart.
void AppendConversion(const std::tm& tm, const std::string& conversion, std::size_t width,
                      std::string* out) {
  const std::size_t start = out->size();
  const std::size_t size = width + kMaxConversionBytes;
  out->resize(start + size);
  const std::size_t length =
      std::strftime(out->data() + start, size, conversion.c_str(), &tm);
  out->resize(start + length);
}

// Conversion by conversion, each with room for what it can write; the text
// between them is copied as strftime would copy it.
void WritePieces(const std::tm& tm, const char* pattern, std::string* out) {
  out->clear();
  std::string conversion;
  for (const char* p = pattern; *p != '\0';) {
    const char* percent = std::strchr(p, '%');
    if (percent == nullptr) {
      out->append(p);
      return;
    }
    out->append(p, percent);
    const Conversion read = ReadConversion(percent);
    if (read.width > kMaxFieldWidth) {
      out->append(percent, read.length);
    } else {
      conversion.assign(percent, read.length);
      AppendConversion(tm, conversion, read.width, out);
    }
    p = percent + read.length;
  }
}

void WriteStrftime(const platform::BrokenDownTime& fields, const char* pattern,
                   std::string* out) {
  out->clear();
  const std::size_t pattern_length = std::strlen(pattern);
  if (pattern_length == 0) return;
  const std::tm tm = platform::ToTm(fields);

  // One call for the whole pattern in the common case: no field widths, and a
  // text that fits twice the pattern's length.
  if (!HasFieldWidth(pattern)) {
    const std::size_t size = 2 * pattern_length + 64;
    out->resize(size);
    const std::size_t length = std::strftime(out->data(), size, pattern, &tm);
    if (length > 0) {
      out->resize(length);
      return;
    }
  }
  WritePieces(tm, pattern, out);
}

}  // namespace

void WritePattern(const platform::BrokenDownTime& fields, const char* pattern,
                  std::string* out) {
  // %Y writes four digits only for the years 1000 to 9999; every count of 32 bits
  // lies within them.
  if (std::strcmp(pattern, kCanonicalPattern) != 0 || fields.year < 1000 ||
      fields.year > 9999) {
    WriteStrftime(fields, pattern, out);
    return;
  }
  out->resize(kCanonicalLength);
  char* p = out->data();
  p = WriteFourDigits(p, fields.year);
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
}

}  // namespace datetimelib
