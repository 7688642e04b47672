// Arbitrary bytes as a zone file, after four bytes that shift the counts looked
// at. Properties: whatever parses compiles into a timeline whose local times
// compose back to their first instant; and with TZ naming the bytes written to a
// file, the zone questions keep their contracts (zone_checks.h), whether the
// file reads or not.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "fuzz_support.h"
#include "platform/tzif.h"
#include "platform/zone_source.h"
#include "platform/zone_timeline.h"
#include "zone_checks.h"

namespace {

using datetimelib::fuzz::Check;
namespace platform = datetimelib::platform;

void CheckFileTimeline(platform::Tzif tzif) {
  platform::LoadedZone zone;
  zone.source = platform::LoadedZone::Source::kFile;
  zone.tzif = std::move(tzif);
  const platform::ZoneTimeline timeline =
      platform::ZoneTimeline::Build(zone, std::string("fuzz"));
  for (std::int64_t t = -86400; t < INT32_MAX; t += 86400 * 61 + 1801) {
    const std::int64_t civil = t + timeline.BreakDown(t).utc_offset;
    const std::int64_t back = timeline.Compose(civil);
    Check(back <= t && back + timeline.OffsetAt(back) == civil,
          "a local time composes to its first instant");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  const std::uint32_t phase = input.Word();
  const std::string_view bytes = input.Rest();

  if (std::optional<platform::Tzif> tzif = platform::ParseTzif(bytes)) {
    CheckFileTimeline(std::move(*tzif));
  }

  // Two names in turn, so that TZ changes at every input as it does when a
  // program moves between zones.
  static int turn = 0;
  turn ^= 1;
  const std::string path =
      datetimelib::fuzz::ScratchFolder() + (turn ? "/zone_a" : "/zone_b");
  if (!datetimelib::fuzz::WriteFile(path, bytes)) std::abort();
  datetimelib::fuzz::SetTz(":" + path);
  datetimelib::fuzz::CheckZoneQuestions(phase, "zone file");
  return 0;
}
