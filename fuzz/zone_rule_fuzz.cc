// TZ set to arbitrary text: rule strings, zone names, paths. The first four
// bytes shift the counts looked at. Properties: the zone questions keep their
// contracts (zone_checks.h); a rule string's own timeline composes back to the
// first instant of each local time; and where the text is a rule string the C
// library reads as we do (complete, with its transitions written out or without
// daylight time), the breakdown is localtime_r's.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "fuzz_support.h"
#include "platform/posix_rule.h"
#include "platform/zone_source.h"
#include "platform/zone_timeline.h"
#include "zone_checks.h"

namespace {

using datetimelib::fuzz::Check;
namespace platform = datetimelib::platform;

void CheckRuleTimeline(const platform::PosixRule& rule, const std::string& text) {
  platform::LoadedZone zone;
  zone.source = platform::LoadedZone::Source::kRule;
  zone.rule = rule;
  const platform::ZoneTimeline timeline = platform::ZoneTimeline::Build(zone, text);
  for (std::int64_t t = -86400; t < INT32_MAX; t += 86400 * 97 + 3601) {
    const std::int64_t civil = t + timeline.BreakDown(t).utc_offset;
    const std::int64_t back = timeline.Compose(civil);
    Check(back <= t && back + timeline.OffsetAt(back) == civil,
          "a local time composes to its first instant", text);
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  const std::uint32_t phase = input.Word();
  const std::string text = input.Text();

  const std::optional<platform::PosixRule> rule = platform::ParsePosixRule(text);
  if (rule) CheckRuleTimeline(*rule, text);

  datetimelib::fuzz::SetTz(text);
  datetimelib::fuzz::CheckZoneQuestions(phase, text);
  // A rule that names daylight time without saying when borrows the transitions
  // of "posixrules", which glibc shifts by what earlier TZ values left behind; a
  // malformed rule glibc reads in part, where we read UTC. Neither is compared.
  if (rule && rule->dst != platform::PosixRule::Dst::kWithoutRules) {
    datetimelib::fuzz::CheckBreakdownAgainstCLibrary(phase, text);
  }
  return 0;
}
