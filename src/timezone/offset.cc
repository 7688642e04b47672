// The zone's standard offset from GMT and whether it has daylight saving.
#include "AdDateTime.h"
#include "platform/zone_source.h"

double AdDateTime::GetGMTOffset() {
  const auto rule =
      datetimelib::platform::CurrentRule(datetimelib::platform::LoadProcessZone());
  // Integer division truncates toward zero: 12 345 s gives 205 and -12 345 s -205.
  return static_cast<double>(datetimelib::platform::StandardSecondsWest(rule) / 60);
}

int AdDateTime::UsesDST() {
  const auto rule =
      datetimelib::platform::CurrentRule(datetimelib::platform::LoadProcessZone());
  return rule.dst == datetimelib::platform::PosixRule::Dst::kNone ? 0 : 1;
}
