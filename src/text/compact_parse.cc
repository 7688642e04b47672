// Setting a value from what a person types: "now", keywords, the compact form.
//
// The text is read into fields (compact_text.h); the fields become an instant the
// way every other reader's do, through their canonical text and ParseDateTime or
// ParseDateTimeGMT, so that range and validity are decided in one place.
#include <cstdint>
#include <string>

#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "platform/zone/local_time.h"
#include "text/canonical_text.h"
#include "text/compact_text.h"
#include "text/english_names.h"

namespace {

using datetimelib::TypedDateTime;

datetimelib::LocalToday TodayOf(const AdDateTime& now) {
  const auto local = datetimelib::platform::BreakDownLocal(now.GetCTime().GetTime());
  return {local.year, local.month, local.day, local.weekday};
}

// The canonical text of the typed fields with `year`, as the read-back expects it.
//
// Local fields go through the field constructor, which carries them and, for
// fields the range test refuses, gives their "%d/%d/%d %d:%d:%d" text. Fields
// marked UTC that pass the range test are carried in UTC arithmetic instead: a
// local composition would move a time in the hour that the local zone skips
// ("02:30UTC" would read as 03:30 UTC) and would refuse the last hours of
// 2038-01-18 in zones west of UTC, although the UTC instant exists.
std::string CanonicalText(const TypedDateTime& typed, int year, bool in_range) {
  if (typed.utc && in_range) {
    const std::optional<std::int64_t> utc = datetimelib::platform::CivilSeconds(
        year, typed.month, typed.day, typed.hour, typed.minute, typed.second);
    if (utc && *utc >= INT32_MIN && *utc <= INT32_MAX) {
      return AdDateTime(AdTime(static_cast<std::int32_t>(*utc)))
          .FormatGMT(datetimelib::kCanonicalPattern);
    }
  }
  return AdDateTime(year, typed.month, typed.day, typed.hour, typed.minute, typed.second)
      .Format(datetimelib::kCanonicalPattern);
}

}  // namespace

void AdDateTime::ParseTolvaneDateTime(const char* text) {
  const std::string_view input = text != nullptr ? text : "";
  if (datetimelib::EqualsIgnoringAsciiCase(input, "now")) {
    *this = GetTickCount();
    return;
  }
  // One reading of the clock serves the keywords, the default year and the test
  // for a date in the future, so that they agree across midnight.
  const AdDateTime now = GetTickCount();
  const std::optional<TypedDateTime> typed =
      datetimelib::ReadTypedDateTime(input, TodayOf(now));
  if (!typed) {
    status_ = invalid;  // the count and the kept text stay as they were
    return;
  }

  // Reads the fields with `year` back into this value and adds the offset. On
  // failure the value holds what the read-back left (its count, and the text it
  // was given) or, when the offset would carry the count past 32 bits, the
  // instant read without the offset.
  const auto read_back = [this, &typed](int year) {
    const bool in_range = Valid_Range(year, typed->month, typed->day, typed->hour,
                                      typed->minute, typed->second) != 0;
    const std::string canonical = CanonicalText(*typed, year, in_range);
    const int read = typed->utc ? ParseDateTimeGMT(canonical.c_str())
                                : ParseDateTime(canonical.c_str(), 0);
    if (read == 0) return false;
    const std::int64_t shifted = std::int64_t{seconds_} + typed->offset_seconds;
    if (shifted < INT32_MIN || shifted > INT32_MAX) return false;
    seconds_ = static_cast<std::int32_t>(shifted);
    return true;
  };

  bool done = read_back(typed->year);
  // A day and month typed without a year name the last such day up to now: the
  // same month, day and time one calendar year earlier, read back the same way.
  if (done && typed->year_defaulted && *this > now) done = read_back(typed->year - 1);
  if (!done) status_ = invalid;
}
