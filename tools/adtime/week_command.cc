// week: the calendar around a date.
#include <AdDateTime.h>

#include <limits>

#include "commands.h"
#include "numbers.h"

namespace adtime {
namespace {

constexpr const char kWeekHelp[] =
    "Usage: adtime week [--output text|tsv|json] YEAR MONTH DAY\n"
    "\n"
    "The Sunday-to-Saturday week that holds a local date: its start (Sunday\n"
    "00:00:00) and end (Saturday 00:00:00), each with its status, and whether YEAR\n"
    "is a leap year and how many days MONTH has. Fields beyond their usual ranges\n"
    "carry (2000 13 1 is 2001-01-01). A week that leaves 1970-01-01..2038-01-18\n"
    "gives outOfRange and the date that could not be built.\n"
    "\n"
    "Fields: year month day leap_year days_in_month start_status start end_status\n"
    "end.\n"
    "\n"
    "Exit status: 0 when start and end are both valid, else 1.\n";

constexpr long kMinField = std::numeric_limits<int>::min();
constexpr long kMaxField = std::numeric_limits<int>::max();

// Adds the status and the canonical text of one end of the week; true when valid.
bool AddWeekEnd(const char* status_name, const char* text_name, const AdDateTime& value,
                Record* record) {
  record->AddText(status_name, StatusName(value.GetStatus()));
  // By the formatting status rule: the date, an outOfRange value's kept text, or "".
  std::string text = value.Format(kCanonicalPattern);
  if (text.empty()) {
    record->AddAbsent(text_name);
  } else {
    record->AddText(text_name, std::move(text));
  }
  return value.IsValid() != 0;
}

}  // namespace

int RunWeek(const Args& args) {
  const CommandLine command_line = ParseCommandLine(args, {kHelpOption, kOutputOption});
  if (command_line.Has("help")) return PrintHelp(kWeekHelp);
  const OutputFormat format = OutputFormatOf(command_line);
  const auto& operands = command_line.operands;
  if (operands.size() != 3) throw UsageError("give YEAR MONTH DAY");
  const long year = ParseNumber(operands[0], kMinField, kMaxField, "YEAR");
  const long month = ParseNumber(operands[1], kMinField, kMaxField, "MONTH");
  const long day = ParseNumber(operands[2], kMinField, kMaxField, "DAY");

  std::vector<Record> records(1);
  Record& record = records[0];
  record.AddNumber("year", year);
  record.AddNumber("month", month);
  record.AddNumber("day", day);
  record.AddNumber("leap_year", IsLeapYear(year));
  record.AddNumber("days_in_month", GetDaysInMonth(year, month));
  const bool start_valid =
      AddWeekEnd("start_status", "start", GetWeekStartDate(year, month, day), &record);
  const bool end_valid =
      AddWeekEnd("end_status", "end", GetWeekEndDate(year, month, day), &record);
  return WriteRecords(records, format, start_valid && end_valid ? 0 : 1);
}

}  // namespace adtime
