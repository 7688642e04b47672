// zone and dst: the process's time zone as the library sees it.
#include <AdDateTime.h>
#include <unistd.h>  // readlink

#include <cstdlib>
#include <limits>

#include "commands.h"
#include "numbers.h"

namespace adtime {
namespace {

constexpr const char kZoneHelp[] =
    "Usage: adtime zone [--output text|tsv|json]\n"
    "\n"
    "The time zone the library uses: TZ, else /etc/localtime.\n"
    "\n"
    "Fields:\n"
    "  zone            TZ's value, or the zone /etc/localtime names when TZ is unset\n"
    "  offset_minutes  standard time's offset from GMT in minutes, positive WEST\n"
    "                  of Greenwich (New York 300, Berlin -60)\n"
    "  uses_dst        1 when the zone's current rule has daylight saving\n"
    "  year            the current year, in local time\n"
    "  dst_start       the last second before daylight saving starts that year\n"
    "  dst_end         the local time at which it ends (both absent without DST)\n";

constexpr const char kDstHelp[] =
    "Usage: adtime dst [--table DIR] [--output text|tsv|json] YEAR...\n"
    "\n"
    "The start and end of daylight saving in each YEAR, in the local time of TZ:\n"
    "from the table DIR/dst_dates.dat when it has an entry for the year, else\n"
    "computed from the zone's rule. The start is the last second before the change\n"
    "to daylight time, the end the local time of the change back.\n"
    "\n"
    "Fields: year, status, start, end. status is valid, none (the zone has no\n"
    "daylight saving; no dates), or outOfRange (a date lies outside\n"
    "1970-01-01..2038-01-18; the texts then give its fields as year/month/day).\n"
    "\n"
    "Exit status: 0 unless some year's dates are out of range (1), 2 for a usage\n"
    "error.\n";

// The zone the C library reads when TZ is unset: the name /etc/localtime links
// to below a zoneinfo folder, else the file's own path.
std::string LocaltimeZoneName() {
  constexpr const char* kLocaltime = "/etc/localtime";
  char target[4096];
  const ssize_t length = readlink(kLocaltime, target, sizeof target - 1);
  if (length <= 0) return kLocaltime;
  const std::string path(target, static_cast<std::size_t>(length));
  const std::string marker = "zoneinfo/";
  const std::size_t found = path.rfind(marker);
  return found == std::string::npos ? path : path.substr(found + marker.size());
}

// True when `text` is a date-time the library reads back as valid: what a DST
// date within the range looks like.
bool IsValidDateText(const std::string& text) {
  AdDateTime value;
  return value.ParseDateTime(text.c_str(), 0) != 0;
}

}  // namespace

int RunZone(const Args& args) {
  const CommandLine command_line = ParseCommandLine(args, {kHelpOption, kOutputOption});
  if (command_line.Has("help")) return PrintHelp(kZoneHelp);
  const OutputFormat format = OutputFormatOf(command_line);
  if (!command_line.operands.empty()) throw UsageError("zone takes no arguments");

  const char* tz = std::getenv("TZ");
  const auto year = static_cast<int>(AdDateTime::GetTickCount().GetYear());
  std::string start;
  std::string end;
  const int has_dst = AdDateTime::GetDSTDates(nullptr, year, start, end);

  std::vector<Record> records(1);
  Record& record = records[0];
  record.AddText("zone", tz != nullptr ? tz : LocaltimeZoneName());
  record.AddNumber("offset_minutes",
                   static_cast<std::int64_t>(AdDateTime::GetGMTOffset()));
  record.AddNumber("uses_dst", AdDateTime::UsesDST());
  record.AddNumber("year", year);
  if (has_dst != 0) {
    record.AddText("dst_start", std::move(start));
    record.AddText("dst_end", std::move(end));
  } else {
    record.AddAbsent("dst_start");
    record.AddAbsent("dst_end");
  }
  return WriteRecords(records, format, 0);
}

int RunDst(const Args& args) {
  const CommandLine command_line =
      ParseCommandLine(args, {kHelpOption, kOutputOption, {"table", true}});
  if (command_line.Has("help")) return PrintHelp(kDstHelp);
  const OutputFormat format = OutputFormatOf(command_line);
  if (command_line.operands.empty()) throw UsageError("give at least one YEAR");
  std::vector<int> years;
  for (const std::string& operand : command_line.operands) {
    years.push_back(
        static_cast<int>(ParseNumber(operand, std::numeric_limits<int>::min(),
                                     std::numeric_limits<int>::max(), "YEAR")));
  }
  const std::string table = command_line.Get("table", "");
  const char* directory = command_line.Has("table") ? table.c_str() : nullptr;

  std::vector<Record> records(years.size());
  bool all_valid = true;
  for (std::size_t i = 0; i < years.size(); ++i) {
    std::string start;
    std::string end;
    Record& record = records[i];
    record.AddNumber("year", years[i]);
    if (AdDateTime::GetDSTDates(directory, years[i], start, end) == 0) {
      record.AddText("status", "none");
      record.AddAbsent("start");
      record.AddAbsent("end");
      continue;
    }
    const bool valid = IsValidDateText(start) && IsValidDateText(end);
    all_valid = all_valid && valid;
    record.AddText("status", valid ? "valid" : "outOfRange");
    record.AddText("start", std::move(start));
    record.AddText("end", std::move(end));
  }
  return WriteRecords(records, format, all_valid ? 0 : 1);
}

}  // namespace adtime
