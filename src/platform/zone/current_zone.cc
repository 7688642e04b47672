#include "platform/zone/current_zone.h"

#include <cstdint>
#include <optional>
#include <string>

#include "platform/clock.h"
#include "platform/regular_file.h"
#include "platform/thread_slot.h"
#include "platform/zone/tz_watch.h"
#include "platform/zone/zone_source.h"

namespace datetimelib::platform {
namespace {

// What each thread keeps of the zone: the one it compiled last and what it was
// compiled from.
struct ZoneCache {
  std::optional<ZoneTimeline> zone;
  std::optional<std::string> tz;  // TZ when `zone` was compiled; nothing when unset
  TzWatch tz_watch;
  // The file the zone came from, or would come from (/etc/localtime when TZ is
  // unset), and its identity then; nothing when it was absent.
  std::string watched_path;
  std::optional<FileIdentity> watched_identity;
  std::int64_t last_file_check = 0;  // wall-clock second of the last check
};

// True at most once per second of the wall clock; a clock that moves backwards
// only makes a check come early.
bool FileCheckDue(ZoneCache* cache) {
  const std::int64_t now = CoarseNowSeconds();
  if (now == cache->last_file_check) return false;
  cache->last_file_check = now;
  return true;
}

void Compile(ZoneCache* cache) {
  const ZoneSettings settings = ZoneSettings::FromEnvironment();
  const LoadedZone loaded = LoadZone(settings);
  cache->zone.emplace(ZoneTimeline::Build(loaded, settings.tz));
  cache->tz = settings.tz;
  cache->watched_path.clear();
  cache->watched_identity.reset();
  if (loaded.source == LoadedZone::Source::kFile) {
    cache->watched_path = loaded.file_path;
    cache->watched_identity = loaded.file_identity;
  } else if (!settings.tz) {
    cache->watched_path = settings.localtime_path;  // may appear later
  }
  FileCheckDue(cache);  // no check again within this second
}

}  // namespace

const ZoneTimeline& CurrentZone() {
  ZoneCache& cache = ThreadSlot<ZoneCache>::Get();
  if (!cache.tz_watch.Unchanged()) {
    cache.tz_watch.Refresh();
    if (!cache.zone || cache.tz_watch.value() != cache.tz) Compile(&cache);
  } else if (!cache.watched_path.empty() && FileCheckDue(&cache) &&
             IdentityOf(cache.watched_path) != cache.watched_identity) {
    Compile(&cache);
  }
  return *cache.zone;
}

}  // namespace datetimelib::platform
