// Daylight-saving dates from the table file dst_dates.dat, else from the rule.
#include <optional>
#include <string>
#include <utility>

#include "AdDateTime.h"
#include "platform/regular_file.h"
#include "platform/zone/current_zone.h"
#include "text/canonical_text.h"
#include "timezone/dst_rule_dates.h"
#include "timezone/table_lines.h"

namespace datetimelib {
namespace {

constexpr char kTableName[] = "dst_dates.dat";

// entry = start-text ";" end-text   ; split at the first ";", nothing trimmed
//
// True when the line is an entry for `year`; the texts are then the two values
// written anew in the canonical pattern.
bool ReadEntry(const std::string& line, int year, std::string* start, std::string* end) {
  if (!line.empty() && line.front() == '#') return false;  // only column 1 counts
  const std::size_t split = line.find(';');
  if (split == std::string::npos) return false;  // the start text is empty
  AdDateTime first;
  if (!first.ParseDateTime(line.substr(0, split).c_str())) return false;
  if (first.GetYear() != year) return false;  // the local year of the start
  AdDateTime second;
  if (!second.ParseDateTime(line.substr(split + 1).c_str())) return false;
  *start = first.Format(kCanonicalPattern);
  *end = second.Format(kCanonicalPattern);
  return true;
}

// The first entry for `year` in file order, if the file is a table that has one.
bool ReadTable(const std::string& path, int year, std::string* start, std::string* end) {
  std::optional<platform::RegularFile> file = platform::RegularFile::Open(path);
  if (!file) return false;
  TableLines lines(std::move(*file));
  std::string line;
  while (lines.Next(&line)) {
    if (ReadEntry(line, year, start, end)) return true;
  }
  return false;
}

}  // namespace
}  // namespace datetimelib

int AdDateTime::GetDSTDates(const char* directory, int year, std::string& start,
                            std::string& end) {
  start.clear();
  end.clear();
  // A copy: reading the table reads dates, which may compile the zone anew.
  const datetimelib::platform::PosixRule rule =
      datetimelib::platform::CurrentZone().current_rule();
  if (rule.dst == datetimelib::platform::PosixRule::Dst::kNone) return 0;
  if (directory != nullptr &&
      datetimelib::ReadTable(std::string(directory) + "/" + datetimelib::kTableName, year,
                             &start, &end)) {
    return 1;
  }
  datetimelib::WriteRuleDates(rule, year, &start, &end);
  return 1;
}
