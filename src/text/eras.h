// A locale's eras: how %EC and %Ey write a year, and the way back.
//
// Each era of the locale's ERA entry covers the dates from its start to its
// end (in either order; an end of "+*" or "-*" is open) and numbers its years
// from `offset` at the start date's year, counting up ("+") or down ("-"). A
// year before 1 is written as the locale source writes it, -1 being 1 BC.
#ifndef DATETIMELIB_TEXT_ERAS_H_
#define DATETIMELIB_TEXT_ERAS_H_

#include <optional>
#include <string>
#include <vector>

namespace datetimelib {

struct Era {
  int direction = 1;  // +1 or -1
  int offset = 0;     // the era year of the start date's year
  // Dates as year * 10000 + month * 100 + day, astronomical years (0 == 1 BC).
  long long first = 0;
  long long last = 0;
  int start_year = 0;  // astronomical
  std::string name;    // %EC
  std::string format;  // %EY
};

// The entries that parse; a malformed one is left out.
std::vector<Era> ParseEras(const std::vector<std::string>& entries);

// The year with century in which `era` writes `year_in_era` for this month and
// day; nothing when that date lies outside the era.
std::optional<int> YearOfEra(const Era& era, int year_in_era, int month, int day);

}  // namespace datetimelib

#endif  // DATETIMELIB_TEXT_ERAS_H_
