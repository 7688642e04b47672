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

namespace tzif_detail {

inline void PutBigEndian(std::string* out, std::uint64_t value, int bytes) {
  for (int i = bytes - 1; i >= 0; --i) {
    out->push_back(static_cast<char>((value >> (8 * i)) & 0xff));
  }
}

inline void PutHeaderAndBlock(std::string* out, const TzifParts& parts, char version,
                              int time_bytes, bool override_count) {
  const auto count = [](std::size_t n) { return static_cast<std::uint32_t>(n); };
  const std::uint32_t indicator_count = parts.indicators ? count(parts.types.size()) : 0;
  out->append("TZif");
  out->push_back(version);
  out->append(15, '\0');
  PutBigEndian(out, indicator_count, 4);
  PutBigEndian(out, indicator_count, 4);
  PutBigEndian(out, parts.leap_count, 4);
  PutBigEndian(out,
               override_count && parts.time_count_override ? *parts.time_count_override
                                                           : count(parts.times.size()),
               4);
  PutBigEndian(out, count(parts.types.size()), 4);
  PutBigEndian(out, count(parts.designations.size()), 4);
  for (const std::int64_t time : parts.times) {
    PutBigEndian(out, static_cast<std::uint64_t>(time), time_bytes);
  }
  for (const std::uint8_t index : parts.type_indices)
    out->push_back(static_cast<char>(index));
  for (const auto& type : parts.types) {
    PutBigEndian(out, static_cast<std::uint32_t>(type.utc_offset), 4);
    out->push_back(static_cast<char>(type.is_dst));
    out->push_back(static_cast<char>(type.designation));
  }
  out->append(parts.designations);
  out->append(std::size_t{parts.leap_count} * static_cast<std::size_t>(time_bytes + 4),
              '\0');
  out->append(std::size_t{indicator_count} * 2, '\0');
}

}  // namespace tzif_detail

// Version 1: one block with 32-bit times. Later versions: the same block, then a
// second header and block with 64-bit times, then the footer.
inline std::string TzifBytes(const TzifParts& parts) {
  std::string out;
  const bool version1 = parts.version == '\0';
  tzif_detail::PutHeaderAndBlock(&out, parts, parts.version, 4, version1);
  if (version1) return out;
  tzif_detail::PutHeaderAndBlock(&out, parts, parts.version, 8, true);
  out.append(parts.footer);
  return out;
}

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TZIF_BYTES_H_
