// Daylight-saving dates from the table file dst_dates.dat, else from the rule.
#include <cstring>
#include <optional>
#include <string>
#include <utility>

#include "AdDateTime.h"
#include "platform/regular_file.h"
#include "platform/zone_source.h"
#include "text/canonical_text.h"
#include "timezone/rule_dates.h"

namespace datetimelib {
namespace {

constexpr char kTableName[] = "dst_dates.dat";

// Longer than any entry a person writes; longer lines are passed over, which
// keeps the memory of a call bounded whatever the file holds.
constexpr std::size_t kMaxLineBytes = 4096;

// The lines of a file, each without its "\n" or "\r\n". Lines longer than
// kMaxLineBytes or holding a NUL byte (which no entry can hold) are passed over
// whole. A read error ends the file.
class LineReader {
 public:
  explicit LineReader(platform::RegularFile file) : file_(std::move(file)) {}

  bool Next(std::string* line) {
    line->clear();
    bool seen = false;         // a byte of this line has been read
    bool passed_over = false;  // too long, or holds a NUL byte
    for (;;) {
      if (begin_ == end_ && !Fill()) {
        // The last line needs no line end.
        return seen && !passed_over && !failed_ && Finish(line);
      }
      const char* chunk = buffer_ + begin_;
      const std::size_t available = end_ - begin_;
      const void* newline = std::memchr(chunk, '\n', available);
      const std::size_t length =
          newline != nullptr
              ? static_cast<std::size_t>(static_cast<const char*>(newline) - chunk)
              : available;
      seen = true;
      if (!passed_over && (std::memchr(chunk, '\0', length) != nullptr ||
                           line->size() + length > kMaxLineBytes)) {
        passed_over = true;
        line->clear();
      }
      if (!passed_over) line->append(chunk, length);
      begin_ += length;
      if (newline == nullptr) continue;
      ++begin_;
      if (!passed_over) return Finish(line);
      seen = false;
      passed_over = false;
    }
  }

 private:
  static bool Finish(std::string* line) {
    if (!line->empty() && line->back() == '\r') line->pop_back();
    return true;
  }

  bool Fill() {
    if (failed_) return false;
    const long count = file_.Read(buffer_, sizeof buffer_);
    failed_ = count < 0;
    begin_ = 0;
    end_ = count > 0 ? static_cast<std::size_t>(count) : 0;
    return count > 0;
  }

  platform::RegularFile file_;
  char buffer_[4096];
  std::size_t begin_ = 0;  // the unread bytes are buffer_[begin_, end_)
  std::size_t end_ = 0;
  bool failed_ = false;
};

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
  LineReader lines(std::move(*file));
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
  const datetimelib::platform::PosixRule rule =
      datetimelib::platform::CurrentRule(datetimelib::platform::LoadProcessZone());
  if (rule.dst == datetimelib::platform::PosixRule::Dst::kNone) return 0;
  if (directory != nullptr &&
      datetimelib::ReadTable(std::string(directory) + "/" + datetimelib::kTableName, year,
                             &start, &end)) {
    return 1;
  }
  datetimelib::WriteRuleDates(rule, year, &start, &end);
  return 1;
}
