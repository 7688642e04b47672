#include "platform/locale/case_folding.h"

#include <ctype.h>
#include <langinfo.h>
#include <wctype.h>

#include <cstring>

namespace datetimelib::platform {
namespace {

// One UTF-8 character at `text[position]`: its code point and length, or 0 for
// a truncated, overlong or surrogate sequence.
std::size_t DecodeUtf8(std::string_view text, std::size_t position, char32_t* code) {
  const auto byte = [&](std::size_t i) {
    return static_cast<unsigned char>(text[position + i]);
  };
  const unsigned lead = byte(0);
  std::size_t length = 0;
  char32_t value = 0;
  char32_t smallest = 0;  // below this the sequence is overlong
  if (lead < 0x80) {
    *code = lead;
    return 1;
  } else if ((lead & 0xE0) == 0xC0) {
    length = 2, value = lead & 0x1F, smallest = 0x80;
  } else if ((lead & 0xF0) == 0xE0) {
    length = 3, value = lead & 0x0F, smallest = 0x800;
  } else if ((lead & 0xF8) == 0xF0) {
    length = 4, value = lead & 0x07, smallest = 0x10000;
  } else {
    return 0;
  }
  if (text.size() - position < length) return 0;
  for (std::size_t i = 1; i < length; ++i) {
    if ((byte(i) & 0xC0) != 0x80) return 0;
    value = (value << 6) | (byte(i) & 0x3F);
  }
  if (value < smallest || value > 0x10FFFF || (value >= 0xD800 && value <= 0xDFFF)) {
    return 0;
  }
  *code = value;
  return length;
}

}  // namespace

CaseFolder::CaseFolder(locale_t locale)
    : locale_(locale), utf8_(std::strcmp(nl_langinfo_l(CODESET, locale), "UTF-8") == 0) {}

std::size_t CaseFolder::ReadFolded(std::string_view text, std::size_t position,
                                   char32_t* folded) const {
  if (position >= text.size()) return 0;
  if (!utf8_) {
    const int lowered = tolower_l(static_cast<unsigned char>(text[position]), locale_);
    *folded = static_cast<char32_t>(static_cast<unsigned char>(lowered));
    return 1;
  }
  char32_t code = 0;
  const std::size_t length = DecodeUtf8(text, position, &code);
  if (length == 0) return 0;
  // wchar_t holds UCS-4 code points in glibc, so a code point is a wide character.
  *folded = static_cast<char32_t>(towlower_l(static_cast<wint_t>(code), locale_));
  return length;
}

bool CaseFolder::Fold(std::string_view text, std::u32string* folded) const {
  folded->clear();
  for (std::size_t position = 0; position < text.size();) {
    char32_t code = 0;
    const std::size_t length = ReadFolded(text, position, &code);
    if (length == 0) return false;
    folded->push_back(code);
    position += length;
  }
  return true;
}

}  // namespace datetimelib::platform
