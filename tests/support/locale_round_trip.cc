#include "support/locale_round_trip.h"

namespace datetimelib::testing {
namespace {

struct LocalTime {
  int year, month, day, hour, minute, second;
};

// Every month and weekday, morning and afternoon, midnight and noon, the first
// and last days a count holds in New York, and both readings of 01:30 on 2004-10-31 in
// New York.
constexpr LocalTime kLocalTimes[] = {
    {1970, 1, 4, 4, 5, 7},    {1971, 2, 28, 12, 0, 0},   {1977, 3, 1, 0, 0, 1},
    {1984, 4, 9, 13, 14, 15}, {1989, 5, 17, 23, 59, 59}, {1995, 6, 30, 9, 9, 9},
    {1999, 7, 31, 11, 59, 0}, {2000, 8, 15, 18, 30, 45}, {2004, 9, 5, 7, 7, 7},
    {2004, 10, 31, 1, 30, 0}, {2012, 11, 22, 20, 1, 2},  {2019, 12, 25, 15, 45, 0},
    {2024, 2, 29, 22, 10, 5}, {2038, 1, 18, 22, 14, 7},
};

std::string CheckOne(const LocaleWriter& write, const AdDateTime& written,
                     LocaleForm form) {
  const std::string text = write(written, form);
  AdDateTime read;
  if (read.ParseDateTime(text.c_str()) != 1) {
    return std::string(PatternOf(form)) + " \"" + text + "\" does not read";
  }
  std::string expected = text;
  if (form == LocaleForm::kTime) {
    expected = write(AdDateTime(1970, 1, 1, written.GetHour(), written.GetMinute(),
                                written.GetSecond()),
                     form);
  }
  const std::string again = write(read, form);
  if (again != expected) {
    return std::string(PatternOf(form)) + " \"" + text + "\" reads as \"" + again + "\"";
  }
  return "";
}

}  // namespace

const char* PatternOf(LocaleForm form) {
  switch (form) {
    case LocaleForm::kDateAndTime:
      return "%x %X";
    case LocaleForm::kTime:
      return "%X";
    default:
      return "%x";
  }
}

std::string FirstRoundTripFailure(const LocaleWriter& write) {
  for (const LocalTime& t : kLocalTimes) {
    AdDateTime first(t.year, t.month, t.day, t.hour, t.minute, t.second);
    // The second reading of a repeated local time, where the zone has one.
    AdDateTime second = first + AdDuration(1.0 / 24);
    const bool repeated = second.GetHour() == first.GetHour();
    for (const LocaleForm form :
         {LocaleForm::kDateAndTime, LocaleForm::kTime, LocaleForm::kDate}) {
      std::string failure = CheckOne(write, first, form);
      if (failure.empty() && repeated) failure = CheckOne(write, second, form);
      if (!failure.empty()) return failure;
    }
  }
  return "";
}

}  // namespace datetimelib::testing
