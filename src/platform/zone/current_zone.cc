#include "platform/zone/current_zone.h"

#include <cstdint>
#include <optional>
#include <string>

#include "platform/clock.h"
#include "platform/regular_file.h"
#include "platform/thread_slot.h"
#include "platform/zone/local_time.h"
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
  // The last breakdown in `zone`: users read a value's fields one getter at a
  // time, and each getter after the first finds them here.
  bool memo_filled = false;
  std::int64_t memo_instant = 0;
  BrokenDownTime memo_fields;
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
  cache->memo_filled = false;
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

// The thread's cache, its zone compiled anew if TZ or the zone file changed.
ZoneCache& CheckedCache() {
  ZoneCache& cache = ThreadSlot<ZoneCache>::Get();
  if (!cache.tz_watch.Unchanged()) {
    cache.tz_watch.Refresh();
    if (!cache.zone || cache.tz_watch.value() != cache.tz) Compile(&cache);
  } else if (!cache.watched_path.empty() && FileCheckDue(&cache) &&
             IdentityOf(cache.watched_path) != cache.watched_identity) {
    Compile(&cache);
  }
  return cache;
}

}  // namespace

const ZoneTimeline& CurrentZone() { return *CheckedCache().zone; }

// Here rather than in local_time.cc: the breakdown is remembered in the cache.
// The thread's last breakdown is answered again without being worked out, until
// the zone is compiled anew; a getter after another on the same value costs the
// checks above and no more.
BrokenDownTime BreakDownLocal(std::int64_t unix_seconds) {
  ZoneCache& cache = CheckedCache();
  if (!cache.memo_filled || cache.memo_instant != unix_seconds) {
    cache.memo_fields = cache.zone->BreakDown(unix_seconds);
    cache.memo_instant = unix_seconds;
    cache.memo_filled = true;
  }
  return cache.memo_fields;
}

}  // namespace datetimelib::platform
