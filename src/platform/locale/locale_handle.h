// Folder src/platform/locale/: the locale layer. Locale handles and identifiers,
// langinfo patterns and names, case folding; the only callers of newlocale,
// uselocale and nl_langinfo_l.
//
// An open C locale, owned or borrowed, for the *_l functions of the C library.
//
// Every handle carries the time category (names, date and time forms) and the
// character-type category (how the names are encoded and how case folds) of one
// locale. A locale that cannot be opened, because the name is unknown or the
// locale is not installed, gives the invariant locale "C" instead, so a handle
// always holds a usable locale (out of memory aside, see `get`).
#ifndef DATETIMELIB_PLATFORM_LOCALE_LOCALE_HANDLE_H_
#define DATETIMELIB_PLATFORM_LOCALE_LOCALE_HANDLE_H_

#include <locale.h>

#include <cstdint>
#include <memory>
#include <utility>

namespace datetimelib::platform {

class LocaleHandle {
 public:
  // The calling thread's locale: the one uselocale installed on this thread,
  // else the process-wide one that setlocale set. Follows the thread at the
  // moment of the call.
  static LocaleHandle OfThread();

  // The user's default locale: the first of LC_ALL, LC_TIME and LANG that is
  // set and not empty names it, as setlocale(LC_TIME, "") would choose; none
  // set means "C". Read from the environment at each call.
  static LocaleHandle UserDefault();

  // The process-wide locale that setlocale set ("C" until a program sets one).
  static LocaleHandle SystemDefault();

  // "C".
  static LocaleHandle Invariant();

  // The locale a locale identifier names (see locale_ids.h); "C" for unknown
  // identifiers and for locales that are not installed.
  static LocaleHandle ForIdentifier(std::uint32_t identifier);

  LocaleHandle(LocaleHandle&& other) noexcept;
  LocaleHandle& operator=(LocaleHandle&& other) noexcept;
  LocaleHandle(const LocaleHandle&) = delete;
  LocaleHandle& operator=(const LocaleHandle&) = delete;
  ~LocaleHandle();

  // Never LC_GLOBAL_LOCALE, which the *_l functions must not be given. Null
  // only when the C library had no memory to open even "C"; callers then write
  // nothing and read nothing.
  locale_t get() const { return locale_; }

 private:
  LocaleHandle(locale_t locale, bool owned) : locale_(locale), owned_(owned) {}
  LocaleHandle(locale_t locale, std::shared_ptr<const void> keeper)
      : locale_(locale), owned_(false), keeper_(std::move(keeper)) {}

  // Opens the time and character-type categories of `name`; null on failure.
  // Each thread keeps the last few it opened, with the LOCPATH they were opened
  // under, and shares them with the handles it gives: opening a locale reads
  // its files, which takes far longer than what a call does with it.
  static LocaleHandle OpenNamed(const char* name);
  // `handle`, or "C" when it holds nothing.
  static LocaleHandle OrInvariant(LocaleHandle handle);

  locale_t locale_;
  bool owned_;                          // whether this handle frees the locale
  std::shared_ptr<const void> keeper_;  // what keeps a shared locale open
};

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_LOCALE_LOCALE_HANDLE_H_
