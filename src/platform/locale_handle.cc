#include "platform/locale_handle.h"

#include <cstdlib>
#include <string>
#include <utility>

#include "platform/locale_names.h"

namespace datetimelib::platform {
namespace {

constexpr int kCategories = LC_TIME_MASK | LC_CTYPE_MASK;

const locale_t kNoLocale = nullptr;

// The first of the variables that is set and not empty; POSIX gives LC_ALL
// precedence over the category's own variable, and that over LANG.
const char* UserLocaleName() {
  for (const char* variable : {"LC_ALL", "LC_TIME", "LANG"}) {
    const char* value = std::getenv(variable);
    if (value != nullptr && value[0] != '\0') return value;
  }
  return "C";
}

}  // namespace

LocaleHandle LocaleHandle::OpenNamed(const char* name) {
  return LocaleHandle(newlocale(kCategories, name, kNoLocale), true);
}

LocaleHandle LocaleHandle::OrInvariant(LocaleHandle handle) {
  if (handle.locale_ != kNoLocale) return handle;
  return OpenNamed("C");
}

LocaleHandle LocaleHandle::OfThread() {
  const locale_t current = uselocale(kNoLocale);
  if (current != LC_GLOBAL_LOCALE) return LocaleHandle(current, false);
  return SystemDefault();
}

LocaleHandle LocaleHandle::UserDefault() {
  return OrInvariant(OpenNamed(UserLocaleName()));
}

LocaleHandle LocaleHandle::SystemDefault() {
  // duplocale is the one function that accepts LC_GLOBAL_LOCALE: it copies the
  // process-wide locale into an object the *_l functions take.
  return OrInvariant(LocaleHandle(duplocale(LC_GLOBAL_LOCALE), true));
}

LocaleHandle LocaleHandle::Invariant() { return OpenNamed("C"); }

LocaleHandle LocaleHandle::ForIdentifier(std::uint32_t identifier) {
  switch (identifier) {
    case kUserDefaultLocale:
      return UserDefault();
    case kSystemDefaultLocale:
      return SystemDefault();
    default:
      break;
  }
  for (const std::string& name : LocaleNameCandidates(identifier)) {
    LocaleHandle handle = OpenNamed(name.c_str());
    if (handle.locale_ != kNoLocale) return handle;
  }
  return Invariant();
}

LocaleHandle::LocaleHandle(LocaleHandle&& other) noexcept
    : locale_(std::exchange(other.locale_, kNoLocale)),
      owned_(std::exchange(other.owned_, false)) {}

LocaleHandle& LocaleHandle::operator=(LocaleHandle&& other) noexcept {
  if (this != &other) {
    if (owned_ && locale_ != kNoLocale) freelocale(locale_);
    locale_ = std::exchange(other.locale_, kNoLocale);
    owned_ = std::exchange(other.owned_, false);
  }
  return *this;
}

LocaleHandle::~LocaleHandle() {
  if (owned_ && locale_ != kNoLocale) freelocale(locale_);
}

}  // namespace datetimelib::platform
