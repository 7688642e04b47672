// What one thread keeps between calls: its compiled zone, the locales it opened
// by name and the locale reader's compiled forms. Nothing is shared between threads, so
// the read paths take no lock.
//
// The state lives until the thread has run the destructors of its thread_local
// objects, which may therefore call in (as may exit handlers on the main
// thread); see thread_state.cc.
#ifndef DATETIMELIB_PLATFORM_THREAD_STATE_H_
#define DATETIMELIB_PLATFORM_THREAD_STATE_H_

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

#include "platform/regular_file.h"
#include "platform/tz_watch.h"
#include "platform/zone_timeline.h"

namespace datetimelib::platform {

struct ThreadState {
  // The zone compiled last (current_zone.cc).
  std::optional<ZoneTimeline> zone;
  std::optional<std::string> tz;  // TZ when `zone` was compiled; nothing when unset
  TzWatch tz_watch;
  // The file the zone came from, or would come from (/etc/localtime when TZ is
  // unset), and its identity then; nothing when it was absent.
  std::string watched_path;
  std::optional<FileIdentity> watched_identity;
  std::int64_t last_file_check = 0;  // wall-clock second of the last check

  // The forms of the locales read in last, of a type this layer does not know
  // (text/locale_reader.cc).
  std::shared_ptr<void> locale_forms;

  // The locales opened by name last (locale_handle.cc).
  std::shared_ptr<void> opened_locales;
};

// The thread's state lives on the heap behind a pointer in initial-exec TLS: a
// read is one %fs-relative load, where the general model calls __tls_get_addr on
// every access. Eight bytes of static TLS are all it takes. The constant
// initializer, in sight of every user, spares them a TLS initialization check.
inline __attribute__((
    tls_model("initial-exec"))) thread_local ThreadState* this_thread_state = nullptr;

ThreadState* NewThreadState();

inline ThreadState& ThisThreadState() {
  if (this_thread_state == nullptr) this_thread_state = NewThreadState();
  return *this_thread_state;
}

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_THREAD_STATE_H_
