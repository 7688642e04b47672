// Which time zone the process has, and the rule in force in it now.
//
// The zone is decided the way the C library (glibc) decides it in tzset():
//
//   TZ unset           the file /etc/localtime; UTC when it cannot be read
//   TZ "" or ":"       UTC
//   TZ ":name", "name" the zone file `name` (an absolute path as it stands,
//                      anything else under TZDIR, or /usr/share/zoneinfo when
//                      TZDIR is unset or empty); when there is no such file, or
//                      it is not a zone file, `name` is read as a POSIX rule
//                      string; when that fails too, UTC
//
// A rule string with a daylight name and no transition rules ("EST5EDT" when no
// zone file of that name exists) takes its transitions from the "posixrules" zone
// file of the same folder, when that file has at least two local time types, and
// otherwise from ",M3.2.0,M11.1.0", as the C library does. The rule keeps those
// transitions' own local times. glibc 2.36 does not quite: it moves the file's
// transition instants by an amount that depends on TZ's offsets, so with the
// usual posixrules (America/New_York) localtime_r changes at 06:00 in spring
// under TZ=XST3XDT, and at 22:00 the evening before in autumn under XST5XDT.
//
// All file access of the zone engine happens here. Nothing is kept here: each
// LoadZone reads the files afresh, and current_zone.h keeps what it compiled. Files are
// read only when they are regular files (a FIFO or a device named by TZ never blocks).
#ifndef DATETIMELIB_PLATFORM_ZONE_ZONE_SOURCE_H_
#define DATETIMELIB_PLATFORM_ZONE_ZONE_SOURCE_H_

#include <cstdint>
#include <optional>
#include <string>

#include "platform/regular_file.h"
#include "platform/zone/posix_rule.h"
#include "platform/zone/tzif.h"

namespace datetimelib::platform {

// What the decision depends on; FromEnvironment() reads the process's.
struct ZoneSettings {
  std::optional<std::string> tz;                    // TZ; nothing when unset
  std::string zone_folder = "/usr/share/zoneinfo";  // TZDIR when set and not empty
  std::string localtime_path = "/etc/localtime";    // the zone when TZ is unset

  static ZoneSettings FromEnvironment();
};

struct LoadedZone {
  enum class Source {
    kUtc,   // no zone could be read: UTC all the time
    kFile,  // a zone file: `file_path`, `tzif`
    kRule,  // TZ as a POSIX rule string: `rule`
  };
  Source source = Source::kUtc;
  std::string file_path;
  FileIdentity file_identity;  // of the file read, with kFile
  std::optional<Tzif> tzif;
  std::optional<PosixRule> rule;
  // With a rule that names daylight time without transition rules: the
  // "posixrules" file, when the C library takes the transitions from it.
  std::optional<Tzif> default_rules;
};

LoadedZone LoadZone(const ZoneSettings& settings);

// The rule in force now and for every later instant, with the missing parts
// supplied: its `dst` is kNone or kWithRules, never kWithoutRules.
//
// For a file zone it is the footer of its data. A file without a usable footer
// (version 1, an empty footer, one that does not parse) keeps the local time type
// of its last transition forever: a rule without daylight saving.
PosixRule CurrentRule(const LoadedZone& zone);

// The offset of standard time, positive west of Greenwich as the C library's
// `timezone` counts it (New York 18000, Kolkata -19800).
inline std::int32_t StandardSecondsWest(const PosixRule& rule) {
  return -rule.std_seconds_east;  // never -2^31 (see PosixRule and TzifType)
}

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_ZONE_SOURCE_H_
