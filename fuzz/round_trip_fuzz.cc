// Every count written in each form reads back to itself. The input chooses the
// count, the zone and the thread's locale. Properties: the compact text read by
// ParseTolvaneDateTime and the canonical text read by ParseDateTime give the
// count again, or, where the local time occurs twice, its first instant; the
// canonical UTC text read by ParseDateTimeGMT gives the count exactly; what
// Format(flags, locale) writes in the thread's locale reads back to the same
// date, time, or both.
#include <cstdint>
#include <string>

#include "AdDateTime.h"
#include "fuzz_support.h"

namespace {

using datetimelib::fuzz::Check;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

constexpr const char* kZones[] = {"America/New_York",
                                  "Europe/Dublin",
                                  "Australia/Lord_Howe",
                                  "Asia/Kolkata",
                                  "UTC",
                                  "<+0545>-5:45",
                                  "XST3XDT,M3.5.0/-1,M10.5.0/26"};

// The identifiers that write in kLocaleNames' locales, in the same order.
constexpr std::uint32_t kLocaleIds[] = {127, 1033, 2057, 1031, 1036, 1041};
static_assert(sizeof kLocaleIds / sizeof kLocaleIds[0] ==
              datetimelib::fuzz::kLocaleCount);

// The same local time as `value`, at its first instant.
bool SameLocalTime(const AdDateTime& back, const AdDateTime& value) {
  return back.IsValid() && back.GetCTime().GetTime() <= value.GetCTime().GetTime() &&
         back.Format(kCanonical) == value.Format(kCanonical);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  const std::size_t locale = input.Byte() % datetimelib::fuzz::kLocaleCount;
  const std::size_t zone = input.Byte() % (sizeof kZones / sizeof kZones[0]);
  const std::int32_t count = static_cast<std::int32_t>(input.Word() & 0x7fffffff);
  datetimelib::fuzz::UseLocale(static_cast<std::uint8_t>(locale));
  datetimelib::fuzz::SetTz(kZones[zone]);
  const std::string label = std::string(kZones[zone]) + " " + std::to_string(count);

  const AdDateTime value(AdTime{count});
  if (!datetimelib::fuzz::FieldsInRange(value)) return 0;  // local 2038-01-19 and later

  AdDateTime back;
  back.ParseTolvaneDateTime(value.FormatTolvane().c_str());
  Check(SameLocalTime(back, value), "the compact text reads back", label);

  back = AdDateTime();
  Check(back.ParseDateTime(value.Format(kCanonical).c_str()) == 1 &&
            SameLocalTime(back, value),
        "the canonical text reads back", label);

  // West of UTC the last local hours of the range are 2038-01-19 in UTC.
  const std::string utc = value.FormatGMT(kCanonical);
  back = AdDateTime();
  Check(utc > "2038-01-18 23:59:59" || (back.ParseDateTimeGMT(utc.c_str()) == 1 &&
                                        back.GetCTime().GetTime() == count),
        "the canonical UTC text reads back", label);

  const std::uint32_t id = kLocaleIds[locale];
  back = AdDateTime();
  Check(
      back.ParseDateTime(value.Format(0, id).c_str()) == 1 && SameLocalTime(back, value),
      "the locale's date and time read back", label + " " + value.Format(0, id));
  back = AdDateTime();
  Check(back.ParseDateTime(value.Format(AdDateTime::dateOnly, id).c_str()) == 1 &&
            back.Format("%Y-%m-%d") == value.Format("%Y-%m-%d"),
        "the locale's date reads back",
        label + " " + value.Format(AdDateTime::dateOnly, id));
  back = AdDateTime();
  Check(back.ParseDateTime(value.Format(AdDateTime::timeOnly, id).c_str()) == 1 &&
            back.Format("%H:%M:%S") == value.Format("%H:%M:%S"),
        "the locale's time reads back",
        label + " " + value.Format(AdDateTime::timeOnly, id));
  return 0;
}
