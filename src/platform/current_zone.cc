#include "platform/current_zone.h"

#include <time.h>
#include <unistd.h>

#include <cstring>
#include <optional>
#include <string>

#include "platform/regular_file.h"
#include "platform/zone_source.h"

namespace datetimelib::platform {
namespace {

constexpr std::int64_t kFileCheckIntervalNanoseconds = 1000000000;

struct ThreadZone {
  std::optional<ZoneTimeline> zone;
  std::optional<std::string> tz;  // TZ when `zone` was compiled; nothing when unset
  // The file the zone came from, or would come from (/etc/localtime when TZ is
  // unset), and its identity then; nothing when it was absent.
  std::string watched_path;
  std::optional<FileIdentity> watched_identity;
  std::int64_t next_file_check = 0;  // CLOCK_MONOTONIC_COARSE nanoseconds
};

thread_local ThreadZone this_thread_zone;

// TZ's value, as getenv would find it, without getenv's general string search.
const char* FindTz() {
  char** entries = environ;
  if (entries == nullptr) return nullptr;
  for (; *entries != nullptr; ++entries) {
    const char* entry = *entries;
    if (entry[0] == 'T' && entry[1] == 'Z' && entry[2] == '=') return entry + 3;
  }
  return nullptr;
}

bool SameTz(const std::optional<std::string>& compiled_for, const char* now) {
  if (!compiled_for) return now == nullptr;
  return now != nullptr && *compiled_for == now;
}

bool FileCheckDue(ThreadZone* state) {
  timespec now{};
  clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
  const std::int64_t nanoseconds = std::int64_t{now.tv_sec} * 1000000000 + now.tv_nsec;
  if (nanoseconds < state->next_file_check) return false;
  state->next_file_check = nanoseconds + kFileCheckIntervalNanoseconds;
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
  FileCheckDue(state);  // the next check is a second from now
}

}  // namespace

const ZoneTimeline& CurrentZone() {
  ThreadZone& state = this_thread_zone;
  if (!state.zone || !SameTz(state.tz, FindTz())) {
    Compile(&state);
  } else if (!state.watched_path.empty() && FileCheckDue(&state) &&
             IdentityOf(state.watched_path) != state.watched_identity) {
    Compile(&state);
  }
  return *state.zone;
}

}  // namespace datetimelib::platform
