#include "text/compact_text.h"

#include "text/colon_numbers.h"
#include "text/english_names.h"

namespace datetimelib {
namespace {

constexpr std::string_view kUtcMarker = "UTC";  // case-sensitive, unlike the words

struct DateAndTime {
  std::string_view date;
  std::string_view time;  // never empty
};

// text := date "." time   split at the first "."; later ones stay in the time
//       | time            no "." but a ":" somewhere: today at that time
//       | date            neither: that date at 00:00:00
// A "." first or last is refused.
std::optional<DateAndTime> SplitDateAndTime(std::string_view text) {
  const std::size_t dot = text.find('.');
  if (dot == std::string_view::npos) {
    if (text.find(':') != std::string_view::npos) return DateAndTime{"today", text};
    return DateAndTime{text, "00:00:00"};
  }
  if (dot == 0 || dot == text.size() - 1) return std::nullopt;
  return DateAndTime{text.substr(0, dot), text.substr(dot + 1)};
}

// keyword := "today" | "yesterday" | weekday-name   (whole text, any ASCII case)
// The days from today: a weekday name names that day of the Sunday-to-Saturday
// week that holds today, so it may lie up to six days ahead.
std::optional<int> KeywordDays(std::string_view word, int today_weekday) {
  if (EqualsIgnoringAsciiCase(word, "today")) return 0;
  if (EqualsIgnoringAsciiCase(word, "yesterday")) return -1;
  const int weekday = WeekdayFromName(word);
  if (weekday < 0) return std::nullopt;
  return weekday - today_weekday;
}

// day := one or two bytes that start with a number up to 31
// ("5", "05", "5x", " 5"). No lower bound: "0" and "-1" pass and are carried
// later into the month before.
std::optional<int> ReadDay(std::string_view text) {
  if (text.size() != 1 && text.size() != 2) return std::nullopt;
  const ColonNumbers read = ReadColonNumbers(text, 1);
  if (read.count != 1 || read.values[0] > 31) return std::nullopt;
  return read.values[0];
}

// year := four bytes that start with a number from 1969 ("2003"). Two-digit
// years are refused; the range of a value is decided later, by the read-back.
std::optional<int> ReadYear(std::string_view text) {
  if (text.size() != 4) return std::nullopt;
  const ColonNumbers read = ReadColonNumbers(text, 1);
  if (read.count != 1 || read.values[0] < 1969) return std::nullopt;
  return read.values[0];
}

// day-month := day "-" month [ "-" year ]   month: an English name, full or short
// A "-" first or last in the date or in "month-year" is refused; a year text
// holding more "-" is refused by its length or its number.
bool ReadDayMonth(std::string_view date, std::size_t dash, const LocalToday& today,
                  TypedDateTime* out) {
  if (dash == 0 || dash == date.size() - 1) return false;
  const std::string_view day_text = date.substr(0, dash);
  const std::string_view month_year = date.substr(dash + 1);
  std::string_view month_text = month_year;
  std::string_view year_text;
  const std::size_t second_dash = month_year.find('-');
  if (second_dash != std::string_view::npos) {
    if (second_dash == 0 || second_dash == month_year.size() - 1) return false;
    month_text = month_year.substr(0, second_dash);
    year_text = month_year.substr(second_dash + 1);
  }

  const std::optional<int> day = ReadDay(day_text);
  if (!day) return false;
  const int month = MonthFromName(month_text);
  if (month == 0) return false;
  std::optional<int> year = today.year;
  if (!year_text.empty()) year = ReadYear(year_text);
  if (!year) return false;

  out->year = *year;
  out->month = month;
  out->day = *day;
  out->year_defaulted = year_text.empty();
  return true;
}

// date := keyword | day-month | ""   (the empty date leaves year, month, day 0)
//
// A keyword counts calendar days from today's local date; the day number may
// leave the month (today 1 January, "yesterday" gives day 0) and the field
// constructor carries it, so a daylight-saving change never shifts the date.
bool ReadDatePart(std::string_view date, const LocalToday& today, TypedDateTime* out) {
  if (date.empty()) return true;
  const std::size_t dash = date.find('-');
  if (dash != std::string_view::npos) return ReadDayMonth(date, dash, today, out);
  const std::optional<int> days = KeywordDays(date, today.weekday);
  if (!days) return false;
  out->year = today.year;
  out->month = today.month;
  out->day = today.day + *days;
  return true;
}

// offset := ("+" | "-") hours [ ":" minutes ]   hours up to 13, minutes up to 59
// A sign inside a number still reads ("+-2" is minus two hours, as it always
// has), but never beyond 13 hours or 59 minutes either way: "+-159" would move
// the time by a week.
std::optional<std::int64_t> ReadOffset(std::string_view text) {
  if (text.empty()) return 0;
  const char sign = text[0];
  if (sign != '+' && sign != '-') return std::nullopt;
  const ColonNumbers read = ReadColonNumbers(text.substr(1), 2);
  if (read.too_long || read.count == 0) return std::nullopt;
  const std::int32_t hours = read.values[0];
  const std::int32_t minutes = read.count > 1 ? read.values[1] : 0;
  if (hours < -13 || hours > 13 || minutes < -59 || minutes > 59) return std::nullopt;
  // 64 bits: negating or scaling a 32-bit extreme must not overflow.
  const std::int64_t seconds = std::int64_t{hours} * 3600 + std::int64_t{minutes} * 60;
  return sign == '-' ? -seconds : seconds;
}

// time := hour ":" minute [ ":" second ] any* [ "UTC" offset ]
// Whatever follows the numbers up to the marker is ignored ("10:00:00.123",
// "10:00 UTC"). No range test: hour 25 and minute 75 are carried later.
bool ReadTimePart(std::string_view time, TypedDateTime* out) {
  const std::size_t marker = time.find(kUtcMarker);
  if (marker != std::string_view::npos) {
    const std::optional<std::int64_t> offset =
        ReadOffset(time.substr(marker + kUtcMarker.size()));
    if (!offset) return false;
    out->utc = true;
    out->offset_seconds = *offset;
    time = time.substr(0, marker);
  }
  const ColonNumbers read = ReadColonNumbers(time, 3);
  if (read.too_long || read.count < 2) return false;
  out->hour = read.values[0];
  out->minute = read.values[1];
  out->second = read.count > 2 ? read.values[2] : 0;
  return true;
}

}  // namespace

std::optional<TypedDateTime> ReadTypedDateTime(std::string_view text,
                                               const LocalToday& today) {
  const std::optional<DateAndTime> parts = SplitDateAndTime(text);
  if (!parts) return std::nullopt;
  TypedDateTime fields;
  if (!ReadDatePart(parts->date, today, &fields)) return std::nullopt;
  if (!ReadTimePart(parts->time, &fields)) return std::nullopt;
  return fields;
}

}  // namespace datetimelib
