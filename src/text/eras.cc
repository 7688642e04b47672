#include "text/eras.h"

#include <algorithm>
#include <string_view>

namespace datetimelib {
namespace {

constexpr long long kOpenEnd = 1000000000000LL;

// Reads a signed decimal number of at most 9 digits; false when there is none.
bool ReadNumber(std::string_view text, long long* value) {
  if (text.empty()) return false;
  std::size_t i = text[0] == '-' || text[0] == '+' ? 1 : 0;
  if (i == text.size() || text.size() - i > 9) return false;
  long long number = 0;
  for (; i < text.size(); ++i) {
    if (text[i] < '0' || text[i] > '9') return false;
    number = number * 10 + (text[i] - '0');
  }
  *value = text[0] == '-' ? -number : number;
  return true;
}

// "yyyy/mm/dd" as a date key, the year made astronomical; "+*" and "-*" open.
bool ReadDate(std::string_view text, long long* key, long long* year) {
  if (text == "+*" || text == "-*") {
    *key = text[0] == '+' ? kOpenEnd : -kOpenEnd;
    return true;
  }
  const std::size_t slash1 = text.find('/', 1);
  if (slash1 == std::string_view::npos) return false;
  const std::size_t slash2 = text.find('/', slash1 + 1);
  if (slash2 == std::string_view::npos) return false;
  long long y = 0, m = 0, d = 0;
  if (!ReadNumber(text.substr(0, slash1), &y) ||
      !ReadNumber(text.substr(slash1 + 1, slash2 - slash1 - 1), &m) ||
      !ReadNumber(text.substr(slash2 + 1), &d) || m < 1 || m > 12 || d < 1 || d > 31) {
    return false;
  }
  if (y < 0) ++y;  // -1 is 1 BC, astronomical year 0
  *year = y;
  *key = y * 10000 + m * 100 + d;
  return true;
}

std::optional<Era> ParseEra(std::string_view entry) {
  std::string_view parts[6];
  for (int i = 0; i < 5; ++i) {
    const std::size_t colon = entry.find(':');
    if (colon == std::string_view::npos) return std::nullopt;
    parts[i] = entry.substr(0, colon);
    entry.remove_prefix(colon + 1);
  }
  parts[5] = entry;
  Era era;
  if (parts[0] != "+" && parts[0] != "-") return std::nullopt;
  era.direction = parts[0] == "+" ? 1 : -1;
  long long offset = 0, start_year = 0, unused = 0;
  if (!ReadNumber(parts[1], &offset) || !ReadDate(parts[2], &era.first, &start_year) ||
      era.first == kOpenEnd || era.first == -kOpenEnd ||
      !ReadDate(parts[3], &era.last, &unused)) {
    return std::nullopt;
  }
  era.offset = static_cast<int>(offset);
  era.start_year = static_cast<int>(start_year);
  era.name = std::string(parts[4]);
  era.format = std::string(parts[5]);
  return era;
}

}  // namespace

std::vector<Era> ParseEras(const std::vector<std::string>& entries) {
  std::vector<Era> eras;
  for (const std::string& entry : entries) {
    if (std::optional<Era> era = ParseEra(entry)) eras.push_back(std::move(*era));
  }
  return eras;
}

std::optional<int> YearOfEra(const Era& era, int year_in_era, int month, int day) {
  // Every number here is below 10^9 in size: no overflow in a long long.
  const long long year =
      era.start_year + (static_cast<long long>(year_in_era) - era.offset) * era.direction;
  if (year < 1 || year > 9999) return std::nullopt;
  const long long key = year * 10000 + month * 100 + day;
  if (key < std::min(era.first, era.last) || key > std::max(era.first, era.last)) {
    return std::nullopt;
  }
  return static_cast<int>(year);
}

}  // namespace datetimelib
