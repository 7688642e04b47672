// ParseTolvaneDateTime on arbitrary text, in a locale the first byte chooses.
// Properties: the status ends valid or invalid, nothing else; a valid value lies
// within the range; reading twice gives the same value; what FormatTolvane
// writes reads back to the same count (a repeated local time: its first
// instant); and a text in the exact compact form names the instant mktime gives
// for its fields.
#include <cstdint>
#include <cstdlib>
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "fuzz_support.h"

namespace {

using datetimelib::fuzz::Check;

constexpr std::int32_t kBefore = 1234567890;  // the count held before each read
constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

int Digits(const std::string& text, std::size_t at, std::size_t count) {
  int value = 0;
  for (std::size_t i = at; i < at + count; ++i) {
    if (text[i] < '0' || text[i] > '9') return -1;
    value = value * 10 + (text[i] - '0');
  }
  return value;
}

// The fields of a text of exactly the form "DD-Mon-YYYY.HH:MM:SS", when it is
// that and names a real date and time.
bool ReadExactCompact(const std::string& text, std::tm* fields) {
  static constexpr const char* kMonths[] = {"Jan", "Feb", "Mar", "Apr", "May", "Jun",
                                            "Jul", "Aug", "Sep", "Oct", "Nov", "Dec"};
  if (text.size() != 20 || text[2] != '-' || text[6] != '-' || text[11] != '.' ||
      text[14] != ':' || text[17] != ':') {
    return false;
  }
  int month = -1;
  for (int m = 0; m < 12; ++m) {
    if (text.compare(3, 3, kMonths[m]) == 0) month = m;
  }
  const int day = Digits(text, 0, 2), year = Digits(text, 7, 4);
  const int hour = Digits(text, 12, 2), minute = Digits(text, 15, 2);
  const int second = Digits(text, 18, 2);
  if (month < 0 || day < 1 || year < 0 || hour < 0 || hour > 23 || minute < 0 ||
      minute > 59 || second < 0 || second > 59) {
    return false;
  }
  if (day > GetDaysInMonth(year, month + 1)) return false;
  *fields = std::tm{};
  fields->tm_year = year - 1900;
  fields->tm_mon = month;
  fields->tm_mday = day;
  fields->tm_hour = hour;
  fields->tm_min = minute;
  fields->tm_sec = second;
  fields->tm_isdst = -1;
  return true;
}

bool InRangeDate(const std::tm& f) {
  const int year = f.tm_year + 1900;
  return year >= 1970 && (year < 2038 || (f.tm_mon == 0 && f.tm_mday <= 18));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  datetimelib::fuzz::UseLocale(input.Byte());
  const std::string text = input.Text();

  AdDateTime first(AdTime{kBefore});
  first.ParseTolvaneDateTime(text.c_str());
  const auto status = first.GetStatus();
  Check(status == AdDateTime::valid || status == AdDateTime::invalid,
        "the status ends valid or invalid", text);
  // Fields marked "UTC" are read in UTC and may then be moved by up to 13:59 h.
  Check(status != AdDateTime::valid || datetimelib::fuzz::FieldsInRange(first) ||
            (text.find("UTC") != std::string::npos &&
             first.FormatGMT(kCanonical) >= "1969-12-31 10:01:00"),
        "a valid value lies within the range", text);

  // Only "now" moves between two readings, by the time between them.
  AdDateTime second(AdTime{kBefore});
  second.ParseTolvaneDateTime(text.c_str());
  Check(second.GetStatus() == status &&
            std::llabs(std::int64_t{first.GetCTime().GetTime()} -
                       second.GetCTime().GetTime()) <= 2,
        "reading twice gives the same value", text);

  // The compact text of a local time out of the range (from "UTC") reads as none.
  if (status == AdDateTime::valid && datetimelib::fuzz::FieldsInRange(first)) {
    const std::string compact = first.FormatTolvane();
    AdDateTime back(AdTime{kBefore});
    back.ParseTolvaneDateTime(compact.c_str());
    Check(back.IsValid() && back.GetCTime().GetTime() <= first.GetCTime().GetTime() &&
              back.Format(kCanonical) == first.Format(kCanonical),
          "the compact text reads back to the same local time", text + " -> " + compact);
  }

  std::tm fields;
  if (ReadExactCompact(text, &fields) && InRangeDate(fields)) {
    const std::tm asked = fields;
    const std::int64_t expected = std::mktime(&fields);
    if (expected > INT32_MAX || expected < INT32_MIN) {
      Check(status == AdDateTime::invalid, "a date without a 32-bit count is refused",
            text);
    } else {
      Check(status == AdDateTime::valid, "the exact compact form is read", text);
      const std::int64_t got = first.GetCTime().GetTime();
      std::tm local;
      const std::time_t got_time = static_cast<std::time_t>(got);
      localtime_r(&got_time, &local);
      // mktime may give either reading of a repeated local time; ours is the first.
      const bool same_local = local.tm_hour == asked.tm_hour &&
                              local.tm_min == asked.tm_min &&
                              local.tm_mday == asked.tm_mday;
      Check(got == expected || (got < expected && same_local),
            "the compact form names mktime's instant", text);
    }
  }
  return 0;
}
