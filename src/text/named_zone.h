// The instant of a text that names its zone ("01:30:00 EST", "kl. 01.30 -0500").
//
// Local fields name no instant in a skipped hour and two in a repeated one; a
// zone in the text picks the reading of the fields in that zone. It must be one
// the current zone reads the fields in: an abbreviation it writes there, or an
// offset it has there (which fixes the instant exactly). A time of day alone
// has no date to hold the zone against: there any zone the current rule names
// (standard or daylight) is taken, and the usual reading stays.
#ifndef DATETIMELIB_TEXT_NAMED_ZONE_H_
#define DATETIMELIB_TEXT_NAMED_ZONE_H_

#include <cstdint>
#include <optional>

#include "text/date_time_fields.h"

namespace datetimelib {

// The instant of `local` (real local fields, a time alone placed on its day)
// in the zone that `named` names; `usual` where the zone only has to be the
// current zone's. Nothing when the text's zone is not the current zone's there.
std::optional<std::int64_t> InstantInNamedZone(const DateTimeFields& local,
                                               const DateTimeFields& named,
                                               bool time_alone, std::int64_t usual);

// The UTC instant of UTC fields whose text names a zone: its offset applied,
// any offset; of abbreviations only "GMT" and "UTC", which change nothing.
std::optional<std::int64_t> UtcInstantOfNamedZone(const DateTimeFields& fields,
                                                  std::int64_t utc_instant);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_NAMED_ZONE_H_
