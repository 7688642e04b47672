// Case-insensitive comparison of text in a locale's encoding.
//
// Month names are compared in any case ("MÄRZ", "märz"), so characters are
// decoded in the locale's codeset and lowered with the locale's character
// types: UTF-8 when that is the codeset, else one byte per character.
#ifndef DATETIMELIB_PLATFORM_LOCALE_CASE_FOLDING_H_
#define DATETIMELIB_PLATFORM_LOCALE_CASE_FOLDING_H_

#include <locale.h>

#include <cstddef>
#include <string>
#include <string_view>

namespace datetimelib::platform {

class CaseFolder {
 public:
  // `locale` must outlive this object and must not be LC_GLOBAL_LOCALE.
  explicit CaseFolder(locale_t locale);

  // Decodes the character at `text[position]` and lowers it into `*folded`.
  // Returns the bytes it takes, or 0 at the end of the text or at a byte
  // sequence that is not a character of the codeset.
  std::size_t ReadFolded(std::string_view text, std::size_t position,
                         char32_t* folded) const;

  // The whole text lowered; false when some part does not decode.
  bool Fold(std::string_view text, std::u32string* folded) const;

 private:
  locale_t locale_;
  bool utf8_;
};

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_LOCALE_CASE_FOLDING_H_
