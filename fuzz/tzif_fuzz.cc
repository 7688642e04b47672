// Arbitrary bytes as a zone file, after four bytes that shift the counts looked
// at. Property: with TZ naming the bytes written to a file, the zone questions
// keep their contracts (zone_checks.h) whether the file reads or not: local
// times compose back to their first instant, and the daylight-saving dates are
// date texts.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "fuzz_support.h"
#include "zone_checks.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  datetimelib::fuzz::Input input(data, size);
  const std::uint32_t phase = input.Word();
  const std::string_view bytes = input.Rest();

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
