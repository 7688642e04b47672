// TZ set to arbitrary text: rule strings, zone names, paths. The first four
// bytes shift the counts looked at. Properties: the zone questions keep their
// contracts (zone_checks.h); and where the text is a rule string the C library
// reads as we do (complete, with its transitions written out or without
// daylight time), the breakdown is localtime_r's.
#include <cstdint>
#include <string>

#include "fuzz_support.h"
#include "platform/zone/posix_rule.h"
#include "zone_checks.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  namespace platform = datetimelib::platform;
  datetimelib::fuzz::Input input(data, size);
  const std::uint32_t phase = input.Word();
  const std::string text = input.Text();

  datetimelib::fuzz::SetTz(text);
  datetimelib::fuzz::CheckZoneQuestions(phase, text);
  // A rule that names daylight time without saying when borrows the transitions
  // of "posixrules", which glibc shifts by what earlier TZ values left behind; a
  // malformed rule glibc reads in part, where we read UTC. Neither is compared.
  const std::optional<platform::PosixRule> rule = platform::ParsePosixRule(text);
  if (rule && rule->dst != platform::PosixRule::Dst::kWithoutRules) {
    datetimelib::fuzz::CheckBreakdownAgainstCLibrary(phase, text);
  }
  return 0;
}
