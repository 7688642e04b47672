// Folder src/platform/zone/: the zone engine. It reads TZif files and POSIX rule
// strings, places a rule's changes, compiles a zone into a timeline, loads the
// process's zone and watches TZ for changes, and answers local time <-> UTC.
//
// Local-time composition and breakdown in the process's time zone.
//
// Every call follows the zone as the C library sees it at that moment (`TZ`, else
// /etc/localtime): a `TZ` changed with setenv between two calls is seen by the
// second, by composition and breakdown alike. The answers are those of glibc's
// localtime_r, from our own compiled zone (zone_timeline.h), without its lock.
//
// Instants are 64-bit seconds since 1970-01-01 00:00:00 UTC ("unix seconds");
// local fields are also carried as "civil seconds", the same count taken as if
// the zone were UTC (see civil.h). Both are accepted within +/-2^40.
#ifndef DATETIMELIB_PLATFORM_ZONE_LOCAL_TIME_H_
#define DATETIMELIB_PLATFORM_ZONE_LOCAL_TIME_H_

#include <cstdint>

#include "platform/zone/broken_down_time.h"

namespace datetimelib::platform {

// The local fields of an instant.
BrokenDownTime BreakDownLocal(std::int64_t unix_seconds);

// The instant of a local time given as civil seconds.
//
// A local time that a change skips lands on the side of the change that is
// daylight time, as glibc's mktime chooses: forward by the size of the gap where
// daylight time is summer time (02:30 on a spring-forward day gives 03:30
// daylight time), back where a zone writes its winter as daylight time
// (Europe/Dublin); forward when neither side is daylight time. A local time that
// occurs twice gives the earlier instant, which mktime does not promise. The
// result never depends on earlier calls.
std::int64_t ComposeLocal(std::int64_t civil_seconds);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_ZONE_LOCAL_TIME_H_
