// ParseDateTime and ParseDateTimeGMT on arbitrary text, in a locale the first
// byte chooses. Properties: each returns 1 exactly when the value is valid; a
// refused text keeps the count (0 after ParseDateTime's outOfRange) and, when out
// of range, the text itself; both refuse the same unreadable texts, save those
// naming a zone, which each holds against its own; a valid value lies within
// the range and its canonical text reads back to it (a repeated local time: its
// first instant); ParseDateTimeGMT's count is timegm's for the fields the text
// names, less the offset it names.
#include <cstdint>
#include <ctime>
#include <string>

#include "AdDateTime.h"
#include "fuzz_support.h"
#include "text/date_time_reader.h"

namespace {

using datetimelib::fuzz::Check;

constexpr std::int32_t kBefore = 1234567890;  // the count held before each read
constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

// The fields the text names, read as the parsers read it: in the thread's locale,
// or as canonical text with a fraction of a second.
bool ReadFields(const std::string& text, datetimelib::DateTimeFields* fields) {
  using datetimelib::ReadingLocale;
  if (datetimelib::ReadDateTime(text, ReadingLocale::kThread, fields)) return true;
  return text.size() > 19 && text[19] == '.' &&
         datetimelib::ReadDateTime(std::string_view(text).substr(0, 19),
                                   ReadingLocale::kUserDefault, fields);
}

void CheckRefusal(const AdDateTime& value, const std::string& text,
                  std::int32_t out_of_range_count) {
  if (value.GetStatus() == AdDateTime::invalid) {
    Check(value.GetCTime().GetTime() == kBefore && value.Format(kCanonical).empty(),
          "an unreadable text leaves the count", text);
  } else {
    Check(value.GetStatus() == AdDateTime::outOfRange,
          "a refused text ends invalid or outOfRange", text);
    Check(value.GetCTime().GetTime() == out_of_range_count && value.Format("%Y") == text,
          "a text out of range is kept, with the count the rule gives", text);
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  datetimelib::fuzz::UseLocale(input.Byte());
  const std::string text = input.Text();

  AdDateTime local(AdTime{kBefore});
  const int local_result = local.ParseDateTime(text.c_str());
  Check(local_result == local.IsValid(), "ParseDateTime returns 1 exactly when valid",
        text);
  if (local.IsValid()) {
    Check(datetimelib::fuzz::FieldsInRange(local), "a valid value lies within the range",
          text);
    const std::string canonical = local.Format(kCanonical);
    AdDateTime back(AdTime{kBefore});
    Check(back.ParseDateTime(canonical.c_str()) == 1 &&
              back.GetCTime().GetTime() <= local.GetCTime().GetTime() &&
              back.Format(kCanonical) == canonical,
          "the canonical text reads back to the same local time", text);
  } else {
    CheckRefusal(local, text, 0);
  }

  AdDateTime gmt(AdTime{kBefore});
  const int gmt_result = gmt.ParseDateTimeGMT(text.c_str());
  Check(gmt_result == gmt.IsValid(), "ParseDateTimeGMT returns 1 exactly when valid",
        text);
  datetimelib::DateTimeFields named;
  Check((gmt.GetStatus() == AdDateTime::invalid) ==
                (local.GetStatus() == AdDateTime::invalid) ||
            (ReadFields(text, &named) && datetimelib::NamesZone(named)),
        "both parsers refuse the same unreadable texts", text);
  if (gmt.IsValid()) {
    Check(gmt.FormatGMT(kCanonical) >= "1970-01-01 00:00:00" &&
              gmt.FormatGMT(kCanonical) <= "2038-01-18 23:59:59",
          "a valid UTC value lies within the range", text);
    datetimelib::DateTimeFields fields;
    Check(ReadFields(text, &fields), "an accepted text has fields", text);
    std::tm tm{};
    tm.tm_year = fields.year - 1900;
    tm.tm_mon = fields.month - 1;
    tm.tm_mday = fields.day;
    tm.tm_hour = fields.hour;
    tm.tm_min = fields.minute;
    tm.tm_sec = fields.second;
    Check(timegm(&tm) - fields.zone_offset == gmt.GetCTime().GetTime(),
          "ParseDateTimeGMT agrees with timegm", text);
    AdDateTime back(AdTime{kBefore});
    Check(back.ParseDateTimeGMT(gmt.FormatGMT(kCanonical).c_str()) == 1 &&
              back.GetCTime().GetTime() == gmt.GetCTime().GetTime(),
          "the canonical UTC text reads back to the same count", text);
  } else {
    CheckRefusal(gmt, text, kBefore);
  }
  return 0;
}
