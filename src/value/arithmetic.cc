// Shifting, subtracting and comparing AdDateTime values by their seconds counts.
#include "AdDateTime.h"
#include "value/wrap.h"

using datetimelib::WrapAdd;
using datetimelib::WrapSub;

AdDateTime AdDateTime::operator+(const AdDuration& span) const {
  return AdDateTime(AdTime(WrapAdd(seconds_, span.GetTotalSeconds())));
}

AdDateTime AdDateTime::operator-(const AdDuration& span) const {
  return AdDateTime(AdTime(WrapSub(seconds_, span.GetTotalSeconds())));
}

AdDuration AdDateTime::operator-(const AdDateTime& other) const {
  return AdDuration::FromSeconds(WrapSub(seconds_, other.seconds_));
}

const AdDateTime& AdDateTime::operator+=(const AdDuration& span) {
  seconds_ = WrapAdd(seconds_, span.GetTotalSeconds());
  return *this;
}

const AdDateTime& AdDateTime::operator-=(const AdDuration& span) {
  seconds_ = WrapSub(seconds_, span.GetTotalSeconds());
  return *this;
}

int AdDateTime::operator==(const AdDateTime& other) const {
  return seconds_ == other.seconds_;
}
int AdDateTime::operator!=(const AdDateTime& other) const {
  return seconds_ != other.seconds_;
}
int AdDateTime::operator<(const AdDateTime& other) const {
  return seconds_ < other.seconds_;
}
int AdDateTime::operator<=(const AdDateTime& other) const {
  return seconds_ <= other.seconds_;
}
int AdDateTime::operator>(const AdDateTime& other) const {
  return seconds_ > other.seconds_;
}
int AdDateTime::operator>=(const AdDateTime& other) const {
  return seconds_ >= other.seconds_;
}
