#include "text/date_time_reader.h"

#include "platform/locale/locale_handle.h"
#include "text/canonical_text.h"
#include "text/locale_forms.h"

namespace datetimelib {

bool ReadDateTime(std::string_view text, ReadingLocale locale, DateTimeFields* out) {
  // The canonical text is what the library itself writes and reads back: it is
  // read directly, before any locale is opened.
  if (ReadCanonical(text, out)) return true;
  const platform::LocaleHandle handle = locale == ReadingLocale::kThread
                                            ? platform::LocaleHandle::OfThread()
                                            : platform::LocaleHandle::UserDefault();
  return ReadInLocale(text, handle.get(), out);
}

}  // namespace datetimelib
