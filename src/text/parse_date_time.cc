// Setting a value from text read in the locale's forms, as local time or as UTC.
#include <cstdint>
#include <limits>
#include <optional>
#include <string_view>

#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "text/canonical_text.h"
#include "text/date_time_reader.h"
#include "text/named_zone.h"

namespace {

using datetimelib::DateTimeFields;
using datetimelib::kCanonicalLength;
using datetimelib::ReadDateTime;
using datetimelib::ReadingLocale;

// The thread's locale first. A text the thread's locale refuses that has the
// shape of the canonical text followed by a fraction of a second ("." as its
// 20th byte) is read once more, cut to 19 bytes, in the user's default locale:
// the fraction is dropped, never rounded.
bool ParseLocaleDateTime(std::string_view text, DateTimeFields* out) {
  if (ReadDateTime(text, ReadingLocale::kThread, out)) return true;
  if (text.size() > kCanonicalLength && text[kCanonicalLength] == '.') {
    return ReadDateTime(text.substr(0, kCanonicalLength), ReadingLocale::kUserDefault,
                        out);
  }
  return false;
}

bool FitsInCount(std::int64_t seconds) {
  return seconds >= std::numeric_limits<std::int32_t>::min() &&
         seconds <= std::numeric_limits<std::int32_t>::max();
}

}  // namespace

// A text that gives no value leaves its status and keeps the text as given; the
// count stays as it was, or as the field constructor left it.
int AdDateTime::ParseDateTime(const char* text, std::uint32_t /*flags*/) {
  const std::string_view input = text != nullptr ? text : "";
  DateTimeFields f;
  if (!ParseLocaleDateTime(input, &f)) {
    status_ = invalid;
  } else {
    const std::int32_t before = seconds_;
    SetDateTime(f.year, f.month, f.day, f.hour, f.minute, f.second);
    if (status_ == valid && datetimelib::NamesZone(f)) {
      // The zone named picks the reading; the field constructor has judged the
      // range and placed a time alone on its day.
      const bool time_alone = f.year == 1899;
      DateTimeFields local = f;
      if (time_alone) local.year = 1970, local.month = 1, local.day = 1;
      const std::optional<std::int64_t> instant =
          datetimelib::InstantInNamedZone(local, f, time_alone, seconds_);
      if (!instant) {
        seconds_ = before;  // unreadable: the count stays as it was
        status_ = invalid;
      } else if (!FitsInCount(*instant)) {
        seconds_ = 0;  // as the field constructor leaves a count it cannot hold
        status_ = outOfRange;
      } else {
        seconds_ = static_cast<std::int32_t>(*instant);
      }
    }
    if (status_ == valid) return 1;
  }
  kept_text_.assign(input);
  return 0;
}

int AdDateTime::ParseDateTimeGMT(const char* text) {
  const std::string_view input = text != nullptr ? text : "";
  DateTimeFields f;
  if (!ParseLocaleDateTime(input, &f)) {
    status_ = invalid;
  } else if (!Valid_Range(f.year, f.month, f.day, f.hour, f.minute, f.second)) {
    // No 1899-12-30 rule here: a time of day alone is out of range.
    status_ = outOfRange;
  } else {
    // The reader gives real dates only, and the range test bounds them by
    // 2038-01-18 23:59:59 (2 147 471 999 s), so the count fits in 32 bits.
    const std::int64_t days =
        datetimelib::platform::DaysFromCivil(f.year, f.month, f.day);
    std::optional<std::int64_t> instant = days * datetimelib::platform::kSecondsPerDay +
                                          f.hour * 3600 + f.minute * 60 + f.second;
    if (datetimelib::NamesZone(f)) {
      instant = datetimelib::UtcInstantOfNamedZone(f, *instant);
    }
    // An offset may move the count past the range the fields were tested
    // against: 1970-01-01 to 2038-01-18 23:59:59 in UTC.
    constexpr std::int64_t kLastInRange = 2147471999;
    if (!instant) {
      status_ = invalid;
    } else if (*instant < 0 || *instant > kLastInRange) {
      status_ = outOfRange;
    } else {
      seconds_ = static_cast<std::int32_t>(*instant);
      status_ = valid;
      kept_text_.clear();
      return 1;
    }
  }
  kept_text_.assign(input);
  return 0;
}
