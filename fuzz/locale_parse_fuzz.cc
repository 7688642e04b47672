// ParseDateTime and ParseDateTimeGMT on arbitrary text. Oracles: a valid result
// written in the canonical pattern reads back to the same count (GMT), or to a
// count no later (local: the repeated hour reads its first instant); a refused
// text is kept whole.
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

#include "AdDateTime.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  AdDateTime gmt;
  if (gmt.ParseDateTimeGMT(text.c_str()) == 1) {
    AdDateTime back;
    if (back.ParseDateTimeGMT(gmt.FormatGMT("%Y-%m-%d %H:%M:%S").c_str()) != 1 ||
        back.GetCTime().GetTime() != gmt.GetCTime().GetTime()) {
      std::abort();
    }
  } else if (gmt.GetStatus() == AdDateTime::outOfRange &&
             gmt.Format("") != std::string(text.c_str())) {
    std::abort();  // the kept text is the text up to its first NUL
  }
  AdDateTime local;
  if (local.ParseDateTime(text.c_str()) == 1) {
    AdDateTime back;
    if (back.ParseDateTime(local.Format("%Y-%m-%d %H:%M:%S").c_str()) != 1 ||
        back.GetCTime().GetTime() > local.GetCTime().GetTime()) {
      std::abort();
    }
  }
  return 0;
}
