#include "platform/locale/locale_handle.h"

#include <algorithm>
#include <cstdlib>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "platform/locale/locale_ids.h"
#include "platform/thread_slot.h"

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

// A locale opened by name, or the failure to open it (a null locale), under the
// LOCPATH it was looked for in.
struct OpenedLocale {
  OpenedLocale(std::string name_, std::optional<std::string> locale_path_)
      : name(std::move(name_)),
        locale_path(std::move(locale_path_)),
        locale(newlocale(kCategories, name.c_str(), kNoLocale)) {}
  OpenedLocale(const OpenedLocale&) = delete;
  OpenedLocale& operator=(const OpenedLocale&) = delete;
  ~OpenedLocale() {
    if (locale != kNoLocale) freelocale(locale);
  }

  const std::string name;
  const std::optional<std::string> locale_path;
  const locale_t locale;
};

// The thread's last few, most recently used first.
using OpenedLocales = std::vector<std::shared_ptr<const OpenedLocale>>;
constexpr std::size_t kOpenedLocalesKept = 4;

std::optional<std::string> LocalePath() {
  const char* value = std::getenv("LOCPATH");
  return value != nullptr ? std::optional<std::string>(value) : std::nullopt;
}

}  // namespace

LocaleHandle LocaleHandle::OpenNamed(const char* name) {
  OpenedLocales& opened = ThreadSlot<OpenedLocales>::Get();
  const std::optional<std::string> locale_path = LocalePath();
  auto found = std::find_if(opened.begin(), opened.end(), [&](const auto& entry) {
    return entry->name == name && entry->locale_path == locale_path;
  });
  if (found == opened.end()) {
    if (opened.size() == kOpenedLocalesKept) opened.pop_back();
    opened.push_back(std::make_shared<const OpenedLocale>(name, locale_path));
    found = opened.end() - 1;
  }
  std::rotate(opened.begin(), found, found + 1);
  return LocaleHandle(opened.front()->locale, opened.front());
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
      owned_(std::exchange(other.owned_, false)),
      keeper_(std::move(other.keeper_)) {}

LocaleHandle& LocaleHandle::operator=(LocaleHandle&& other) noexcept {
  if (this != &other) {
    if (owned_ && locale_ != kNoLocale) freelocale(locale_);
    locale_ = std::exchange(other.locale_, kNoLocale);
    owned_ = std::exchange(other.owned_, false);
    keeper_ = std::move(other.keeper_);
  }
  return *this;
}

LocaleHandle::~LocaleHandle() {
  if (owned_ && locale_ != kNoLocale) freelocale(locale_);
}

}  // namespace datetimelib::platform
