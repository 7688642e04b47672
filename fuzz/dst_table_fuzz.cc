// GetDSTDates with arbitrary table files. The first byte chooses the year.
// Property: the result is what a plain reading of the table's rules gives: lines
// split at "\n" with a "\r" before it dropped; lines over 4096 bytes or holding
// NUL passed over; "#" first is a comment; the first entry whose two texts read
// as valid local times and whose start lies in the year wins; else the dates the
// rule gives.
#include <cstdint>
#include <string>
#include <string_view>

#include "AdDateTime.h"
#include "fuzz_support.h"

namespace {

using datetimelib::fuzz::Check;

constexpr const char* kCanonical = "%Y-%m-%d %H:%M:%S";

bool ReadEntry(std::string_view line, int year, std::string* start, std::string* end) {
  if (line.size() > 4096 || line.find('\0') != std::string_view::npos) return false;
  if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
  if (line.empty() || line[0] == '#') return false;
  const std::size_t split = line.find(';');
  if (split == std::string_view::npos || split == 0) return false;
  AdDateTime first, second;
  if (first.ParseDateTime(std::string(line.substr(0, split)).c_str()) != 1 ||
      second.ParseDateTime(std::string(line.substr(split + 1)).c_str()) != 1 ||
      first.GetYear() != year) {
    return false;
  }
  *start = first.Format(kCanonical);
  *end = second.Format(kCanonical);
  return true;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  const int year = 1968 + input.Byte() % 74;
  const std::string_view table = input.Rest();
  const std::string& folder = datetimelib::fuzz::ScratchFolder();
  if (!datetimelib::fuzz::WriteFile(folder + "/dst_dates.dat", table)) std::abort();

  std::string expected_start, expected_end;
  bool found = false;
  for (std::size_t at = 0; at < table.size() && !found;) {
    std::size_t newline = table.find('\n', at);
    if (newline == std::string_view::npos) newline = table.size();
    found =
        ReadEntry(table.substr(at, newline - at), year, &expected_start, &expected_end);
    at = newline + 1;
  }
  if (!found) AdDateTime::GenerateDSTDates(year, expected_start, expected_end);

  std::string start = "left over", end = "left over";
  Check(AdDateTime::GetDSTDates(folder.c_str(), year, start, end) == 1 &&
            start == expected_start && end == expected_end,
        "the table reads as its rules say",
        std::to_string(year) + ": " + start + " / " + end);
  return 0;
}
