// The POSIX rule parser and the zone engine on arbitrary rule strings. Oracles:
// a parsed rule's transitions fall in their year's neighbourhood; a zone compiled
// from it breaks down and composes back consistently.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "platform/posix_rule.h"
#include "platform/zone_source.h"
#include "platform/zone_timeline.h"

using namespace datetimelib::platform;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  const std::optional<PosixRule> rule = ParsePosixRule(text);
  if (!rule) return 0;
  LoadedZone zone;
  zone.source = LoadedZone::Source::kRule;
  zone.rule = rule;
  const ZoneTimeline timeline = ZoneTimeline::Build(zone, text);
  for (std::int64_t t = -86400; t < INT32_MAX; t += 86400 * 97 + 3601) {
    const BrokenDownTime fields = timeline.BreakDown(t);
    const std::int64_t civil = t + fields.utc_offset;
    const std::int64_t back = timeline.Compose(civil);
    // The composed instant reads the same local time, and is the first to.
    if (back > t || back + timeline.OffsetAt(back) != civil) std::abort();
  }
  return 0;
}
