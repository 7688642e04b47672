#include "platform/current_zone.h"

#include <time.h>
#include <unistd.h>

#include <cstring>
#include <memory>
#include <optional>
#include <string>

#include "platform/regular_file.h"
#include "platform/thread_state.h"
#include "platform/zone_source.h"

namespace datetimelib::platform {
namespace {

// True at most once per second of the wall clock. time() through the vDSO reads
// one word; a clock that moves backwards only makes a check come early.
bool FileCheckDue(ThreadState* state) {
  const std::int64_t now = static_cast<std::int64_t>(time(nullptr));
  if (now == state->last_file_check) return false;
  state->last_file_check = now;
  return true;
}

void Compile(ThreadState* state) {
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
  ThreadState& state = ThisThreadState();
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
