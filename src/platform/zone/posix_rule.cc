#include "platform/zone/posix_rule.h"

#include "platform/ascii.h"

namespace datetimelib::platform {
namespace {

constexpr std::int32_t kMaxOffsetSeconds = 24 * 3600;
constexpr std::size_t kMinAbbreviationLength = 3;

// A cursor over the rule text; every read either advances past what it took or
// fails.
class Reader {
 public:
  explicit Reader(std::string_view text) : rest_(text) {}

  bool AtEnd() const { return rest_.empty(); }
  char Peek() const { return rest_.empty() ? '\0' : rest_.front(); }

  bool Consume(char c) {
    if (rest_.empty() || rest_.front() != c) return false;
    rest_.remove_prefix(1);
    return true;
  }

  // number = 1*DIGIT, its value in [min, max]
  bool ParseInt(int min, int max, int* value) {
    if (!IsAsciiDigit(Peek())) return false;
    long long number = 0;  // stays below 10 * max + 9
    while (IsAsciiDigit(Peek())) {
      number = number * 10 + (rest_.front() - '0');
      if (number > max) return false;
      rest_.remove_prefix(1);
    }
    if (number < min) return false;
    *value = static_cast<int>(number);
    return true;
  }

  // name = 3*ALPHA | "<" 3*(ALPHA / DIGIT / "+" / "-") ">"
  bool ParseName(std::string* name) {
    std::size_t length = 0;
    if (Consume('<')) {
      while (length < rest_.size() &&
             (IsAsciiLetter(rest_[length]) || IsAsciiDigit(rest_[length]) ||
              rest_[length] == '+' || rest_[length] == '-')) {
        ++length;
      }
      if (length >= rest_.size() || rest_[length] != '>') return false;
      name->assign(rest_.substr(0, length));
      rest_.remove_prefix(length + 1);
    } else {
      while (length < rest_.size() && IsAsciiLetter(rest_[length])) ++length;
      name->assign(rest_.substr(0, length));
      rest_.remove_prefix(length);
    }
    return name->size() >= kMinAbbreviationLength;
  }

  // hms = hours [":" mm [":" ss]], mm and ss in [0:59]; the total in seconds,
  // unsigned, at most max_seconds.
  bool ParseHms(std::int32_t max_seconds, std::int32_t* seconds) {
    int hours = 0;
    int minutes = 0;
    int secs = 0;
    if (!ParseInt(0, max_seconds / 3600, &hours)) return false;
    if (Consume(':')) {
      if (!ParseInt(0, 59, &minutes)) return false;
      if (Consume(':') && !ParseInt(0, 59, &secs)) return false;
    }
    const std::int32_t total = hours * 3600 + minutes * 60 + secs;
    if (total > max_seconds) return false;
    *seconds = total;
    return true;
  }

  // offset = ["+" / "-"] hh [":" mm [":" ss]], at most 24:00:00
  //
  // POSIX counts offsets positive west of Greenwich; this is the one place where
  // the sign is flipped into seconds east.
  bool ParseOffset(std::int32_t* seconds_east) {
    const bool west = !Consume('-');
    if (west) Consume('+');
    std::int32_t magnitude = 0;
    if (!ParseHms(kMaxOffsetSeconds, &magnitude)) return false;
    *seconds_east = west ? -magnitude : magnitude;
    return true;
  }

  // time = ["+" / "-"] hhh [":" mm [":" ss]], at most 167:00:00 either way
  bool ParseTime(std::int32_t* seconds) {
    const bool negative = Consume('-');
    if (!negative) Consume('+');
    std::int32_t magnitude = 0;
    if (!ParseHms(kMaxTransitionTimeSeconds, &magnitude)) return false;
    *seconds = negative ? -magnitude : magnitude;
    return true;
  }

  // date = "J" n [1:365] | n [0:365] | "M" m [1:12] "." w [1:5] "." d [0:6]
  // transition = date ["/" time]
  bool ParseTransition(TransitionRule* rule) {
    if (Consume('J')) {
      rule->form = TransitionRule::Form::kJulian;
      if (!ParseInt(1, 365, &rule->day)) return false;
    } else if (Consume('M')) {
      rule->form = TransitionRule::Form::kMonthWeekDay;
      if (!ParseInt(1, 12, &rule->month) || !Consume('.') ||
          !ParseInt(1, 5, &rule->week) || !Consume('.') ||
          !ParseInt(0, 6, &rule->weekday)) {
        return false;
      }
    } else {
      rule->form = TransitionRule::Form::kZeroBased;
      if (!ParseInt(0, 365, &rule->day)) return false;
    }
    if (Consume('/')) return ParseTime(&rule->time_seconds);
    return true;
  }

 private:
  std::string_view rest_;
};

bool StartsOffset(char c) { return c == '+' || c == '-' || IsAsciiDigit(c); }

}  // namespace

// rule = std offset [dst [offset] ["," transition "," transition | ","]]
std::optional<PosixRule> ParsePosixRule(std::string_view text) {
  Reader reader(text);
  PosixRule rule;
  if (!reader.ParseName(&rule.std_abbreviation) ||
      !reader.ParseOffset(&rule.std_seconds_east)) {
    return std::nullopt;
  }
  if (reader.AtEnd()) return rule;

  if (!reader.ParseName(&rule.dst_abbreviation)) return std::nullopt;
  rule.dst_seconds_east = rule.std_seconds_east + 3600;
  if (StartsOffset(reader.Peek()) && !reader.ParseOffset(&rule.dst_seconds_east)) {
    return std::nullopt;
  }
  rule.dst = PosixRule::Dst::kWithoutRules;
  if (reader.AtEnd()) return rule;
  if (!reader.Consume(',')) return std::nullopt;
  if (reader.AtEnd()) return rule;  // "EST5EDT,": the C library reads no rules

  if (!reader.ParseTransition(&rule.start) || !reader.Consume(',') ||
      !reader.ParseTransition(&rule.end) || !reader.AtEnd()) {
    return std::nullopt;
  }
  rule.dst = PosixRule::Dst::kWithRules;
  return rule;
}

std::int64_t LocalTransition::CivilSeconds() const {
  return DaysFromCivil(date.year, date.month, date.day) * kSecondsPerDay + time_seconds;
}

LocalTransition TransitionInYear(const TransitionRule& rule, std::int64_t year) {
  std::int64_t days = 0;  // days since 1970-01-01 of the rule's day
  switch (rule.form) {
    case TransitionRule::Form::kJulian:
      // Day 60 is 1 March whether or not the year has a 29 February.
      days = DaysFromCivil(year, 1, 1) + rule.day - 1 +
             (IsLeap(year) && rule.day >= 60 ? 1 : 0);
      break;
    case TransitionRule::Form::kZeroBased:
      days = DaysFromCivil(year, 1, 1) + rule.day;
      break;
    case TransitionRule::Form::kMonthWeekDay: {
      const std::int64_t first_of_month = DaysFromCivil(year, rule.month, 1);
      const int first_weekday = WeekdayFromDays(first_of_month);
      int day = 1 + (rule.weekday - first_weekday + 7) % 7 + 7 * (rule.week - 1);
      // Week 5 names the last occurrence, the 4th or the 5th.
      if (day > DaysInMonth(year, rule.month)) day -= 7;
      days = first_of_month + day - 1;
      break;
    }
  }
  return LocalTransition{CivilFromDays(days), rule.time_seconds};
}

}  // namespace datetimelib::platform
