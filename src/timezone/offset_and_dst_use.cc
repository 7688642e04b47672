// The zone's standard offset from GMT and whether it has daylight saving.
#include "AdDateTime.h"
#include "platform/zone/current_zone.h"
#include "platform/zone/zone_source.h"

namespace platform = datetimelib::platform;

double AdDateTime::GetGMTOffset() {
  const platform::PosixRule& rule = platform::CurrentZone().current_rule();
  // Integer division truncates toward zero: 12 345 s gives 205 and -12 345 s -205.
  return static_cast<double>(platform::StandardSecondsWest(rule) / 60);
}

int AdDateTime::UsesDST() {
  const platform::PosixRule& rule = platform::CurrentZone().current_rule();
  return rule.dst == platform::PosixRule::Dst::kNone ? 0 : 1;
}
