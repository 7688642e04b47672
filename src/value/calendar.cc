// Leap years, month lengths and Sunday-to-Saturday weeks.
#include "AdDateTime.h"
#include "platform/civil/civil.h"
#include "platform/zone/local_time.h"

namespace {

// The week's first or last day at 00:00:00 local time. The step is taken from
// noon in whole days of 86 400 seconds, which lands on the right calendar day
// whatever daylight saving does in between, and in 64 bits, so that a week
// reaching past either end of the 32-bit count gives the date that could not be
// built rather than a wrapped one.
AdDateTime WeekBoundary(long year, long month, long day, bool week_end) {
  AdDateTime noon(year, month, day, 12, 0, 0);
  if (!noon.IsValid()) {
    noon.SetStatus(AdDateTime::invalid);
    return noon;
  }
  const long weekday = noon.GetDayOfWeek();  // 1 == Sunday
  const std::int64_t days = week_end ? 7 - weekday : 1 - weekday;
  const auto target =
      datetimelib::platform::BreakDownLocal(std::int64_t{noon.GetCTime().GetTime()} +
                                            days * datetimelib::platform::kSecondsPerDay);
  return AdDateTime(target.year, target.month, target.day, 0, 0, 0);
}

}  // namespace

int IsLeapYear(long year) { return datetimelib::platform::IsLeap(year) ? 1 : 0; }

long GetDaysInMonth(long year, long month) {
  if (month < 1 || month > 12) return 30;
  return datetimelib::platform::DaysInMonth(year, static_cast<int>(month));
}

AdDateTime GetWeekStartDate(long year, long month, long day) {
  return WeekBoundary(year, month, day, /*week_end=*/false);
}

AdDateTime GetWeekEndDate(long year, long month, long day) {
  return WeekBoundary(year, month, day, /*week_end=*/true);
}

int AdDateTime::IsLeapYear() const { return ::IsLeapYear(GetYear()); }

long AdDateTime::GetDaysInMonth() const {
  const auto date = datetimelib::platform::BreakDownLocal(seconds_);
  return ::GetDaysInMonth(date.year, date.month);
}

AdDateTime AdDateTime::GetWeekStartDate() const {
  const auto date = datetimelib::platform::BreakDownLocal(seconds_);
  return ::GetWeekStartDate(date.year, date.month, date.day);
}

AdDateTime AdDateTime::GetWeekEndDate() const {
  const auto date = datetimelib::platform::BreakDownLocal(seconds_);
  return ::GetWeekEndDate(date.year, date.month, date.day);
}
