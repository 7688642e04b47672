// Format and FormatGMT with arbitrary patterns, and Format with arbitrary flags
// and locale identifiers, in a locale the first byte chooses. Properties: a
// valid value writes what strftime writes for the C library's own breakdown of
// its count, however long the text; FormatInto gives the same text whatever the
// string held; the status rule holds for every other value.
#include <cstdint>
#include <cstring>
#include <ctime>
#include <memory>
#include <string>

#include "AdDateTime.h"
#include "fuzz_support.h"

namespace {

using datetimelib::fuzz::Check;

// What strftime writes for the pattern, given room for every conversion's
// width (none here exceeds 999; glibc pads "%z" twice, sign and digits) and any
// locale's longest name.
std::string Strftime(const char* pattern, const std::tm& fields) {
  const std::size_t length = std::strlen(pattern);
  std::size_t conversions = 0;
  for (const char* p = pattern; (p = std::strchr(p, '%')) != nullptr; ++p) ++conversions;
  const std::size_t size = length + conversions * (2 * 999 + 256) + 1;
  const std::unique_ptr<char[]> buffer(new char[size]);
  return std::string(buffer.get(), std::strftime(buffer.get(), size, pattern, &fields));
}

bool HasLongNumber(const std::string& text) {
  std::size_t run = 0;
  for (const char c : text) {
    run = c >= '0' && c <= '9' ? run + 1 : 0;
    if (run >= 4) return true;
  }
  return false;
}

AdDateTime WithStatus(std::uint8_t choice, std::int32_t count) {
  switch (choice % 8) {
    case 0:
      return AdDateTime{};  // null
    case 1:
      return AdDateTime(2039, 1, 1, 0, 0, 0);  // outOfRange, "2039/1/1 0:0:0"
    case 2: {
      AdDateTime value(AdTime{count});
      value.SetStatus(AdDateTime::invalid);
      return value;
    }
    default:
      return AdDateTime(AdTime{count});
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  datetimelib::fuzz::UseLocale(input.Byte());
  const std::uint8_t status_choice = input.Byte();
  const std::int32_t count = static_cast<std::int32_t>(input.Word() & 0x7fffffff);
  const std::uint32_t flags = input.Byte();
  const std::uint32_t locale = input.Word() % 4096;
  const std::string pattern = input.Text();
  const AdDateTime value = WithStatus(status_choice, count);

  const std::string local = value.Format(pattern.c_str());
  const std::string gmt = value.FormatGMT(pattern.c_str());
  std::string into = "left over";
  value.FormatInto(into, pattern.c_str());
  Check(into == local, "FormatInto writes what Format writes", pattern);
  value.FormatGMTInto(into, pattern.c_str());
  Check(into == gmt, "FormatGMTInto writes what FormatGMT writes", pattern);
  const std::string in_locale = value.Format(flags, locale);

  if (!value.IsValid()) {
    const std::string kept =
        value.GetStatus() == AdDateTime::outOfRange ? "2039/1/1 0:0:0" : "";
    Check(local == kept && gmt == kept && in_locale == kept,
          "a value that is not valid writes its kept text or nothing", pattern);
    return 0;
  }
  Check(!in_locale.empty(), "a valid value writes a date or a time in every locale");
  if (HasLongNumber(pattern)) {
    // Widths above 1024 are written as they stand: never more than the pattern
    // asks for with widths of 1024.
    Check(local.size() <= pattern.size() * (1024 + 256),
          "a wide pattern's text is bounded", pattern);
    return 0;
  }
  const std::time_t time = count;
  std::tm fields;
  localtime_r(&time, &fields);
  Check(local == Strftime(pattern.c_str(), fields), "Format writes what strftime writes",
        pattern);
  gmtime_r(&time, &fields);
  Check(gmt == Strftime(pattern.c_str(), fields), "FormatGMT writes what strftime writes",
        pattern);
  return 0;
}
