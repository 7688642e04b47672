#include "text/english_names.h"

namespace datetimelib {
namespace {

struct Name {
  std::string_view full;
  std::string_view abbreviation;  // the first three letters of `full`
};

// Indexed by month - 1. "May" is its own abbreviation.
constexpr Name kMonths[] = {
    {"January", "Jan"},   {"February", "Feb"}, {"March", "Mar"},    {"April", "Apr"},
    {"May", "May"},       {"June", "Jun"},     {"July", "Jul"},     {"August", "Aug"},
    {"September", "Sep"}, {"October", "Oct"},  {"November", "Nov"}, {"December", "Dec"},
};

// Indexed by weekday, 0 == Sunday.
constexpr Name kWeekdays[] = {
    {"Sunday", "Sun"},   {"Monday", "Mon"}, {"Tuesday", "Tue"},  {"Wednesday", "Wed"},
    {"Thursday", "Thu"}, {"Friday", "Fri"}, {"Saturday", "Sat"},
};

constexpr char FoldAsciiCase(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

// The index of the first entry whose full name or abbreviation matches; -1 if none.
template <std::size_t N>
int FindName(const Name (&table)[N], std::string_view text) {
  for (std::size_t i = 0; i < N; ++i) {
    if (EqualsIgnoringAsciiCase(text, table[i].full) ||
        EqualsIgnoringAsciiCase(text, table[i].abbreviation)) {
      return static_cast<int>(i);
    }
  }
  return -1;
}

}  // namespace

bool EqualsIgnoringAsciiCase(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (FoldAsciiCase(a[i]) != FoldAsciiCase(b[i])) return false;
  }
  return true;
}

std::string_view MonthAbbreviation(int month) {
  if (month < 1 || month > 12) return {};
  return kMonths[month - 1].abbreviation;
}

int MonthFromName(std::string_view name) { return FindName(kMonths, name) + 1; }

int WeekdayFromName(std::string_view name) { return FindName(kWeekdays, name); }

}  // namespace datetimelib
