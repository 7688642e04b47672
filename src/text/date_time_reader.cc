#include "text/date_time_reader.h"

#include "text/canonical_text.h"

namespace datetimelib {

bool ReadDateTime(std::string_view text, ReadingLocale /*locale*/, DateTimeFields* out) {
  return ReadCanonical(text, out);
}

}  // namespace datetimelib
