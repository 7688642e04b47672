// AdDuration: a signed span of whole seconds.
#include <cmath>

#include "AdDateTime.h"
#include "value/wrap.h"

using datetimelib::WrapAdd;
using datetimelib::WrapMul;

AdDuration::AdDuration(double days) {
  const double seconds = (days * 24.0) * 3600.0;
  if (std::isnan(seconds)) {
    seconds_ = 0;
  } else if (seconds >= 2147483648.0) {
    seconds_ = INT32_MAX;
  } else if (seconds <= -2147483649.0) {
    seconds_ = INT32_MIN;
  } else {
    seconds_ = static_cast<std::int32_t>(seconds);  // truncates toward zero
  }
}

AdDuration::AdDuration(std::int32_t days, std::int32_t hours, std::int32_t minutes,
                       std::int32_t seconds) {
  const std::int32_t total_hours = WrapAdd(WrapMul(days, 24), hours);
  const std::int32_t total_minutes = WrapAdd(WrapMul(total_hours, 60), minutes);
  seconds_ = WrapAdd(WrapMul(total_minutes, 60), seconds);
}

AdDuration AdDuration::FromSeconds(std::int32_t seconds) {
  AdDuration span(0.0);
  span.seconds_ = seconds;
  return span;
}

std::int32_t AdDuration::GetDays() const { return seconds_ / 86400; }
std::int32_t AdDuration::GetTotalHours() const { return seconds_ / 3600; }
std::int32_t AdDuration::GetHours() const { return GetTotalHours() - GetDays() * 24; }
std::int32_t AdDuration::GetTotalMinutes() const { return seconds_ / 60; }
std::int32_t AdDuration::GetMinutes() const {
  return GetTotalMinutes() - GetTotalHours() * 60;
}
std::int32_t AdDuration::GetTotalSeconds() const { return seconds_; }
std::int32_t AdDuration::GetSeconds() const {
  return GetTotalSeconds() - GetTotalMinutes() * 60;
}
