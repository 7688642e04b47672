#include "inputs.h"

#include <cstdlib>

namespace bench {
namespace {

std::string Strftime(const char* pattern, const std::tm& fields) {
  char text[64];
  const std::size_t length = std::strftime(text, sizeof text, pattern, &fields);
  return std::string(text, length);
}

Inputs Build() {
  Inputs inputs;
  std::uint64_t state = 0x9e3779b97f4a7c15u;
  constexpr std::int64_t kFirst = 2 * 86400;             // away from the range ends, so
  constexpr std::int64_t kLast = INT32_MAX - 2 * 86400;  // every zone is in range
  for (int i = 0; i < 4096; ++i) {
    state = state * 6364136223846793005u + 1442695040888963407u;
    const auto count = static_cast<std::int32_t>(
        kFirst + static_cast<std::int64_t>((state >> 33) % (kLast - kFirst)));
    const time_t t = count;
    std::tm local{};
    std::tm utc{};
    localtime_r(&t, &local);
    gmtime_r(&t, &utc);
    inputs.counts.push_back(count);
    inputs.local_fields.push_back(local);
    inputs.local_texts.push_back(Strftime("%Y-%m-%d %H:%M:%S", local));
    inputs.gmt_texts.push_back(Strftime("%Y-%m-%d %H:%M:%S", utc));
    inputs.compact_texts.push_back(Strftime("%d-%b-%Y.%H:%M:%S", local));
  }
  return inputs;
}

}  // namespace

const Inputs& GetInputs() {
  static const Inputs inputs = Build();
  return inputs;
}

const char* ZoneName() {
  const char* tz = std::getenv("TZ");
  if (tz == nullptr || *tz == '\0') return "UTC";
  return *tz == ':' ? tz + 1 : tz;
}

}  // namespace bench
