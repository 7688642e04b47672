// Construction, status, setters and calendar fields of AdDateTime.
#include <cstdio>

#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "platform/clock.h"
#include "platform/zone/local_time.h"

namespace {

using datetimelib::platform::BreakDownLocal;

// "%d/%d/%d %d:%d:%d": how a value keeps fields it could not hold.
std::string FieldsText(long year, long month, long day, long hour, long minute,
                       long second) {
  char text[6 * 21];
  const int length = std::snprintf(text, sizeof text, "%ld/%ld/%ld %ld:%ld:%ld", year,
                                   month, day, hour, minute, second);
  return std::string(text, static_cast<std::size_t>(length));
}

// The 32-bit count of local fields, carried as mktime carries them; nothing when
// the local time has no 32-bit count. No range test is made.
std::optional<std::int32_t> LocalCount(long year, long month, long day, long hour,
                                       long minute, long second) {
  const std::optional<std::int64_t> civil =
      datetimelib::platform::CivilSeconds(year, month, day, hour, minute, second);
  if (!civil) return std::nullopt;
  const std::int64_t instant = datetimelib::platform::ComposeLocal(*civil);
  if (instant < INT32_MIN || instant > INT32_MAX) return std::nullopt;
  return static_cast<std::int32_t>(instant);
}

}  // namespace

AdDateTime::AdDateTime(const AdTime& time) : seconds_(time.GetTime()), status_(valid) {}

AdDateTime::AdDateTime(long year, long month, long day, long hour, long minute,
                       long second) {
  std::optional<std::int32_t> count;
  if (Valid_Range(year, month, day, hour, minute, second)) {
    count = LocalCount(year, month, day, hour, minute, second);
  } else if (year == 1899 && month == 12 && day == 30) {
    // The day that locale readers give to a time of day read alone.
    count = LocalCount(1970, 1, 1, hour, minute, second);
  }
  if (count) {
    seconds_ = *count;
    status_ = valid;
  } else {
    status_ = outOfRange;
    kept_text_ = FieldsText(year, month, day, hour, minute, second);
  }
}

int AdDateTime::Valid_Range(long year, long month, long day, long /*hour*/,
                            long /*minute*/, long /*second*/) {
  if (year < 1970 || year > 2038) return 0;
  if (year == 2038 && (month > 1 || (month == 1 && day > 18))) return 0;
  return 1;
}

AdDateTime AdDateTime::GetTickCount() {
  // Two's-complement wrap past 2038 (defined since C++20, and by GCC and Clang).
  return AdDateTime(
      AdTime(static_cast<std::int32_t>(datetimelib::platform::NowSeconds())));
}

AdTime AdDateTime::GetCTime() const { return AdTime(seconds_); }

int AdDateTime::SetDateTime(int year, int month, int day, int hour, int minute,
                            int second) {
  *this = AdDateTime(year, month, day, hour, minute, second);
  return 1;
}

int AdDateTime::SetDate(int year, int month, int day) {
  return SetDateTime(year, month, day, 0, 0, 0);
}

int AdDateTime::SetTime(int hour, int minute, int second) {
  return SetDateTime(1970, 1, 1, hour, minute, second);
}

void AdDateTime::SetOleDateTime(const std::tm& fields) {
  // In long: tm_year + 1900 can overflow an int.
  *this = AdDateTime(long{fields.tm_year} + 1900, long{fields.tm_mon} + 1, fields.tm_mday,
                     fields.tm_hour, fields.tm_min, fields.tm_sec);
}

long AdDateTime::GetYear() const { return BreakDownLocal(seconds_).year; }
long AdDateTime::GetMonth() const { return BreakDownLocal(seconds_).month; }
long AdDateTime::GetDay() const { return BreakDownLocal(seconds_).day; }
long AdDateTime::GetHour() const { return BreakDownLocal(seconds_).hour; }
long AdDateTime::GetMinute() const { return BreakDownLocal(seconds_).minute; }
long AdDateTime::GetSecond() const { return BreakDownLocal(seconds_).second; }
long AdDateTime::GetDayOfWeek() const { return BreakDownLocal(seconds_).weekday + 1; }
long AdDateTime::GetDayOfYear() const { return BreakDownLocal(seconds_).yearday + 1; }
