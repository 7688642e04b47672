// The process's time zone as it stands at this call, compiled.
//
// Every local-time answer and every zone question of the library comes from
// here. Each thread keeps the zone it compiled last, and its last breakdown
// (BreakDownLocal is defined beside it), so the read path takes no lock and
// shares nothing. Every call checks that TZ still says what it said
// (tz_watch.h), so a TZ changed with setenv is seen by the next call. A replaced
// zone file (TZ naming a file, or /etc/localtime when TZ is unset) is seen within
// a second: its identity is checked at most once a second of the coarse clock. TZDIR is
// read when the zone is compiled, as the C library reads it. Each thread holds at most
// one compiled zone, however often TZ changes, and keeps it until the thread has run its
// thread_local destructors, which may therefore call in (as may exit handlers on the main
// thread).
#ifndef DATETIMELIB_PLATFORM_ZONE_CURRENT_ZONE_H_
#define DATETIMELIB_PLATFORM_ZONE_CURRENT_ZONE_H_

#include "platform/zone/zone_timeline.h"

namespace datetimelib::platform {

// Valid until this thread's next call.
const ZoneTimeline& CurrentZone();

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_CURRENT_ZONE_H_
