#include "platform/current_zone.h"

#include <pthread.h>
#include <time.h>
#include <unistd.h>

#include <atomic>
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
// every access. Eight bytes of static TLS are all it takes.
__attribute__((tls_model("initial-exec"))) thread_local ThreadZone* this_thread_zone =
    nullptr;

// The state is freed by the destructor of a pthread key, not by a thread_local
// owner: glibc runs key destructors after every thread_local destructor of the
// ending thread, so a caller's thread_local object whose destructor asks for
// local time still finds the state alive, whenever that object was made. (An
// owner made after that object was destroyed before it.) A later key
// destructor that calls in gets a fresh state, which glibc's next round of key
// destructors frees.
void FreeThreadZone(void* state) {
  delete static_cast<ThreadZone*>(state);
  this_thread_zone = nullptr;
}

pthread_key_t zone_key;
std::atomic<bool> zone_key_made{false};

bool MakeZoneKeyOnce() {
  static const bool made = [] {
    const bool ok = pthread_key_create(&zone_key, FreeThreadZone) == 0;
    zone_key_made.store(ok, std::memory_order_release);
    return ok;
  }();
  return made;
}

// Unloading the library (dlclose) must not leave glibc a key destructor in
// unmapped code; the states of threads still alive then are left behind.
__attribute__((destructor)) void DeleteZoneKey() {
  if (zone_key_made.load(std::memory_order_acquire)) pthread_key_delete(zone_key);
}

// Where every key of the process is taken, a thread_local owner frees the state
// at thread end instead; a call after it is gone gets a state never freed.
__attribute__((tls_model("initial-exec"))) thread_local bool fallback_owner_gone = false;
struct FallbackOwner {
  ThreadZone* state = nullptr;
  ~FallbackOwner() {
    fallback_owner_gone = true;
    if (state != nullptr) FreeThreadZone(state);
  }
};
thread_local FallbackOwner fallback_owner;

ThreadZone* NewThreadZone() {
  auto state = std::make_unique<ThreadZone>();
  if (MakeZoneKeyOnce() && pthread_setspecific(zone_key, state.get()) == 0) {
    return state.release();
  }
  if (!fallback_owner_gone) fallback_owner.state = state.get();
  return state.release();
}

ThreadZone& ThisThreadZone() {
  if (this_thread_zone == nullptr) this_thread_zone = NewThreadZone();
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
