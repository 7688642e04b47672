#include "platform/current_zone.h"

#include <time.h>
#include <unistd.h>

#include <cstring>
#include <memory>
#include <optional>
#include <string>

#include "platform/regular_file.h"
#include "platform/tz_watch.h"
#include "platform/zone_source.h"

namespace datetimelib::platform {
namespace {

struct ThreadZone {
  std::optional<ZoneTimeline> zone;
  std::optional<std::string> tz;  // TZ when `zone` was compiled; nothing when unset
  TzWatch tz_watch;
  // The file the zone came from, or would come from (/etc/localtime when TZ is
  // unset), and its identity then; nothing when it was absent.
  std::string watched_path;
  std::optional<FileIdentity> watched_identity;
  std::int64_t last_file_check = 0;  // wall-clock second of the last check
};

// The thread's state lives on the heap behind a pointer in initial-exec TLS: a
// read is one %fs-relative load, where the general model calls __tls_get_addr on
// every access. Eight bytes of static TLS are all it takes. The owner, in
// general-model TLS, is touched only when the state is first made, and frees it
// when the thread ends.
__attribute__((tls_model("initial-exec"))) thread_local ThreadZone* this_thread_zone =
    nullptr;
thread_local std::unique_ptr<ThreadZone> this_thread_zone_owner;

ThreadZone& ThisThreadZone() {
  if (this_thread_zone == nullptr) {
    this_thread_zone_owner = std::make_unique<ThreadZone>();
    this_thread_zone = this_thread_zone_owner.get();
  }
  return *this_thread_zone;
}

// True at most once per second of the wall clock. time() through the vDSO reads
// one word; a clock that moves backwards only makes a check come early.
bool FileCheckDue(ThreadZone* state) {
  const std::int64_t now = static_cast<std::int64_t>(time(nullptr));
  if (now == state->last_file_check) return false;
  state->last_file_check = now;
  return true;
}

void Compile(ThreadZone* state) {
  const ZoneSettings settings = ZoneSettings::FromEnvironment();
  const LoadedZone loaded = LoadZone(settings);
  state->zone.emplace(ZoneTimeline::Build(loaded, settings.tz));
  state->tz = settings.tz;
  state->watched_path.clear();
  state->watched_identity.reset();
  if (loaded.source == LoadedZone::Source::kFile) {
    state->watched_path = loaded.file_path;
    state->watched_identity = loaded.file_identity;
  } else if (!settings.tz) {
    state->watched_path = settings.localtime_path;  // may appear later
  }
  FileCheckDue(state);  // no check again within this second
}

}  // namespace

const ZoneTimeline& CurrentZone() {
  ThreadZone& state = ThisThreadZone();
  if (!state.tz_watch.Unchanged()) {
    state.tz_watch.Refresh();
    if (!state.zone || state.tz_watch.value() != state.tz) Compile(&state);
  } else if (!state.watched_path.empty() && FileCheckDue(&state) &&
             IdentityOf(state.watched_path) != state.watched_identity) {
    Compile(&state);
  }
  return *state.zone;
}

}  // namespace datetimelib::platform
