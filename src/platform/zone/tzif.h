// TZif zone files (versions 1 to 4, as zic writes them): a parser over bytes.
//
// Layout: a 44-byte header ("TZif", version, 15 reserved bytes, six big-endian
// 32-bit counts) and a data block with 32-bit times; from version 2 on, a second
// header and data block with 64-bit times, then a footer "\n<POSIX rule>\n" that
// governs every instant after the last transition. Version 3 only widens what the
// footer may say; version 4 only what the leap-second records may say, which are
// skipped here, so both read like version 2.
//
// Hardened for hostile input: every count is checked against the bytes that are
// actually there before anything is read, every index is checked against its
// table, and malformed data gives no result, never undefined behaviour.
#ifndef DATETIMELIB_PLATFORM_ZONE_TZIF_H_
#define DATETIMELIB_PLATFORM_ZONE_TZIF_H_

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace datetimelib::platform {

// A local time type: what a transition switches to.
struct TzifType {
  std::int32_t utc_offset;  // seconds east of UTC, never -2^31
  bool is_dst;
  std::string abbreviation;  // "EST", "+0530"; may be empty
  // How the rules the file was made from wrote the times of transitions to this
  // type (false where the file leaves them out). Only a "posixrules" file, whose
  // transitions are moved to other offsets, needs them.
  bool is_standard = false;  // in standard time rather than wall-clock time
  bool is_ut = false;        // in UT rather than local time
};

struct Tzif {
  int version = 1;  // 1 to 4; 4 also for versions this reader does not know
  // Transition instants, strictly ascending, in seconds since 1970-01-01
  // 00:00:00 UTC, and for each the index into `types` of the time that begins
  // there. From the 64-bit data for version 2 and later.
  std::vector<std::int64_t> transition_times;
  std::vector<std::uint8_t> transition_types;
  // At least one. Instants before the first transition (or all instants, when
  // there is none) use types[0].
  std::vector<TzifType> types;
  // The POSIX rule for instants after the last transition, without its newlines.
  // Empty for version 1, and where the file says the future is unknown.
  std::string footer;
};

// Reads a whole zone file. Bytes after the data (version 1) or after the footer
// (later versions) are ignored, as the C library ignores them. A version byte
// other than NUL, "2" and "3" reads as version 4, and a malformed footer as the
// C library reads it (see ReadFooter).
std::optional<Tzif> ParseTzif(std::string_view bytes);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_TZIF_H_
