// The TZif parser and the zone engine on arbitrary bytes. Oracle: whatever
// parses compiles into a zone whose breakdowns compose back consistently.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "platform/tzif.h"
#include "platform/zone_source.h"
#include "platform/zone_timeline.h"

using namespace datetimelib::platform;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view bytes(reinterpret_cast<const char*>(data), size);
  std::optional<Tzif> tzif = ParseTzif(bytes);
  if (!tzif) return 0;
  LoadedZone zone;
  zone.source = LoadedZone::Source::kFile;
  zone.tzif = std::move(tzif);
  const ZoneTimeline timeline = ZoneTimeline::Build(zone, std::string("fuzz"));
  for (std::int64_t t = -86400; t < INT32_MAX; t += 86400 * 61 + 1801) {
    const BrokenDownTime fields = timeline.BreakDown(t);
    const std::int64_t civil = t + fields.utc_offset;
    const std::int64_t back = timeline.Compose(civil);
    if (back + timeline.OffsetAt(back) != civil) std::abort();
  }
  return 0;
}
