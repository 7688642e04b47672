// Zone file bytes built from their parts, for tests that need a zone file with
// exactly these contents (or exactly this fault).
#ifndef DATETIMELIB_TESTS_SUPPORT_TZIF_BYTES_H_
#define DATETIMELIB_TESTS_SUPPORT_TZIF_BYTES_H_

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace datetimelib::testing {

struct TzifParts {
  struct Type {
    std::int32_t utc_offset;  // seconds east
    std::uint8_t is_dst;
    std::uint8_t designation;  // index into `designations`
  };
  char version = '2';               // '\0' for version 1
  std::vector<std::int64_t> times;  // written as given, also when unordered
  std::vector<std::uint8_t> type_indices;
  std::vector<Type> types;
  std::string designations;         // NUL-terminated abbreviations, back to back
  std::uint32_t leap_count = 0;     // leap-second records, written as zeros
  bool indicators = false;          // one standard/wall and one UT/local per type
  std::string footer = "\nUTC0\n";  // written as given, newlines included
  // Replaces the time count of the header that precedes the data read.
  std::optional<std::uint32_t> time_count_override;
};

// Version 1: one block with 32-bit times. Later versions: the same block, then a
// second header and block with 64-bit times, then the footer.
inline std::string TzifBytes(const TzifParts& p) {
  std::string out;
  const auto put = [&out](std::uint64_t value, std::size_t bytes) {
    while (bytes-- > 0) out.push_back(static_cast<char>((value >> (8 * bytes)) & 0xff));
  };
  const auto block = [&](std::size_t time_bytes, bool data_read) {
    const std::size_t types = p.types.size(), indicators = p.indicators ? types : 0;
    out.append("TZif").append(1, p.version).append(15, '\0');
    for (const std::uint64_t count :
         {indicators, indicators, std::size_t{p.leap_count},
          data_read && p.time_count_override ? *p.time_count_override : p.times.size(),
          types, p.designations.size()})
      put(count, 4);
    for (const std::int64_t time : p.times)
      put(static_cast<std::uint64_t>(time), time_bytes);
    for (const std::uint8_t index : p.type_indices) put(index, 1);
    for (const auto& type : p.types) {
      put(static_cast<std::uint32_t>(type.utc_offset), 4);
      put(type.is_dst, 1);
      put(type.designation, 1);
    }
    out.append(p.designations)
        .append(p.leap_count * (time_bytes + 4) + indicators * 2, '\0');
  };
  block(4, p.version == '\0');
  if (p.version == '\0') return out;
  block(8, true);
  return out.append(p.footer);
}

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TZIF_BYTES_H_
