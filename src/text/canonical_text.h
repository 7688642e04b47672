// Folder src/text/: every text in and out: strftime patterns (every strftime
// call of the library), the locale's own forms, the compact form and what people
// type, the canonical text; the AdDateTime members that format and parse.
//
// The canonical text "%Y-%m-%d %H:%M:%S": the one form in which the library
// writes values that it reads back, read here without any locale machinery.
#ifndef DATETIMELIB_TEXT_CANONICAL_TEXT_H_
#define DATETIMELIB_TEXT_CANONICAL_TEXT_H_

#include <cstddef>
#include <string_view>

#include "text/date_time_fields.h"

namespace datetimelib {

inline constexpr char kCanonicalPattern[] = "%Y-%m-%d %H:%M:%S";
inline constexpr std::size_t kCanonicalLength = 19;  // "YYYY-MM-DD HH:MM:SS"

// Reads exactly "YYYY-MM-DD HH:MM:SS" (digits in every place), followed by
// nothing but blanks. Refuses fields that name no real date-time.
bool ReadCanonical(std::string_view text, DateTimeFields* out);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_CANONICAL_TEXT_H_
