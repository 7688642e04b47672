// Writing a value as a locale writes dates and times.
#include "AdDateTime.h"
#include "platform/locale/locale_handle.h"
#include "platform/locale/locale_ids.h"
#include "platform/zone/local_time.h"
#include "text/strftime_text.h"

namespace {

namespace platform = datetimelib::platform;

static_assert(AdDateTime::invariantLocale == platform::kInvariantLocale);
static_assert(AdDateTime::userDefaultLocale == platform::kUserDefaultLocale);
static_assert(AdDateTime::systemDefaultLocale == platform::kSystemDefaultLocale);

const char* LocalePattern(std::uint32_t flags) {
  switch (flags & (AdDateTime::timeOnly | AdDateTime::dateOnly)) {
    case AdDateTime::timeOnly:
      return "%X";
    case AdDateTime::dateOnly:
      return "%x";
    default:
      return "%x %X";
  }
}

}  // namespace

std::string AdDateTime::Format(std::uint32_t flags, std::uint32_t locale) const {
  if (status_ != valid) return status_ == outOfRange ? kept_text_ : std::string();
  const platform::LocaleHandle handle = platform::LocaleHandle::ForIdentifier(locale);
  std::string text;
  datetimelib::WritePatternInLocale(platform::BreakDownLocal(seconds_),
                                    LocalePattern(flags), handle.get(), &text);
  return text;
}
