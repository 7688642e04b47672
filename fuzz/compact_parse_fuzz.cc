// ParseTolvaneDateTime on arbitrary text. Oracles: it ends valid or invalid,
// never anything else; a valid result written in the compact form reads back to
// the same count (outside a repeated hour, where the first reading wins); the
// same text read twice gives the same value.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "AdDateTime.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  AdDateTime first;
  first.ParseTolvaneDateTime(text.c_str());
  AdDateTime second;
  second.ParseTolvaneDateTime(text.c_str());
  if (first.GetStatus() != AdDateTime::valid &&
      first.GetStatus() != AdDateTime::invalid) {
    std::abort();
  }
  // Two readings a moment apart agree (only "now" moves, by the time between).
  if (first.GetStatus() != second.GetStatus() ||
      std::llabs(std::int64_t{first.GetCTime().GetTime()} - second.GetCTime().GetTime()) >
          2) {
    std::abort();
  }
  if (first.IsValid()) {
    AdDateTime back;
    back.ParseTolvaneDateTime(first.FormatTolvane().c_str());
    if (back.IsValid() && back.GetCTime().GetTime() > first.GetCTime().GetTime())
      std::abort();
  }
  return 0;
}
