// format and compact: a seconds count out as text.
#include <AdDateTime.h>

#include <cstdint>
#include <cstdio>
#include <limits>

#include "commands.h"
#include "numbers.h"
#include "output_buffer.h"

namespace adtime {
namespace {

constexpr const char kFormatHelp[] =
    "Usage: adtime format [--gmt] [--output text|tsv|json] SECONDS|now [PATTERN]\n"
    "       adtime format --locale ID [--only date|time] [--output ...] SECONDS|now\n"
    "\n"
    "Writes a seconds count since 1970-01-01 00:00:00 UTC (a signed 32-bit number,\n"
    "or \"now\") with a strftime PATTERN, in the local time of TZ or, with --gmt,\n"
    "in UTC. PATTERN defaults to \"%Y-%m-%d %H:%M:%S\". Names such as %a and %b\n"
    "are written in the environment's locale (LC_ALL, LC_TIME, LANG).\n"
    "\n"
    "With --locale, writes the local time in the form of the locale with that\n"
    "identifier: 1024 the user's default, 2048 the system's, 127 the invariant \"C\",\n"
    "1033 en_US, 2057 en_GB, 1031 de_DE, 1036 fr_FR, 1041 ja_JP, ... A locale that\n"
    "is not installed writes as \"C\". --only date or --only time writes one part.\n"
    "\n"
    "Output: the text alone (text), or the columns seconds and text (tsv, json).\n";

constexpr const char kCompactHelp[] =
    "Usage: adtime compact [--output text|tsv|json] SECONDS|now\n"
    "\n"
    "Writes a seconds count (or \"now\") in the compact form DD-Mon-YYYY.HH:MM:SS,\n"
    "in the local time of TZ, with English month names in every locale. adtime\n"
    "parse reads the form back.\n"
    "\n"
    "Output: the text alone (text), or the columns seconds and compact (tsv, json).\n";

// Writes `text` bare for the text format, else as a record with the count.
int WriteResult(OutputFormat format, std::int32_t seconds, const char* name,
                std::string text) {
  if (format == OutputFormat::kText) {
    OutputBuffer out(stdout);
    out.text()->append(text);
    out.LineDone();
    return FinishOutput(&out, 0);
  }
  std::vector<Record> records(1);
  records[0].AddNumber("seconds", seconds);
  records[0].AddText(name, std::move(text));
  return WriteRecords(records, format, 0);
}

// format --locale ID [--only date|time] SECONDS|now
int FormatInLocale(const CommandLine& command_line, OutputFormat format) {
  if (command_line.Has("gmt")) throw UsageError("--gmt and --locale do not go together");
  if (command_line.operands.size() != 1) {
    throw UsageError("with --locale, give SECONDS (or now) and no PATTERN");
  }
  const auto locale = static_cast<std::uint32_t>(
      ParseNumber(command_line.Get("locale", ""), 0,
                  std::numeric_limits<std::uint32_t>::max(), "ID"));
  std::uint32_t flags = AdDateTime::dateAndTime;
  if (command_line.Has("only")) {
    const std::string only = command_line.Get("only", "");
    if (only == "date") {
      flags = AdDateTime::dateOnly;
    } else if (only == "time") {
      flags = AdDateTime::timeOnly;
    } else {
      throw UsageError("--only must be date or time");
    }
  }
  const std::int32_t seconds = ParseSecondsOrNow(command_line.operands[0]);
  return WriteResult(format, seconds, "text",
                     AdDateTime(AdTime(seconds)).Format(flags, locale));
}

}  // namespace

int RunFormat(const Args& args) {
  const CommandLine command_line = ParseCommandLine(
      args,
      {kHelpOption, kOutputOption, {"gmt", false}, {"locale", true}, {"only", true}});
  if (command_line.Has("help")) return PrintHelp(kFormatHelp);
  const OutputFormat format = OutputFormatOf(command_line);
  const auto& operands = command_line.operands;
  if (command_line.Has("locale")) return FormatInLocale(command_line, format);
  if (command_line.Has("only")) throw UsageError("--only goes with --locale");
  if (operands.empty() || operands.size() > 2) {
    throw UsageError("give SECONDS (or now) and at most one PATTERN");
  }
  const std::int32_t seconds = ParseSecondsOrNow(operands[0]);
  const char* pattern = operands.size() == 2 ? operands[1].c_str() : kCanonicalPattern;
  const AdDateTime value{AdTime(seconds)};
  std::string text =
      command_line.Has("gmt") ? value.FormatGMT(pattern) : value.Format(pattern);
  return WriteResult(format, seconds, "text", std::move(text));
}

int RunCompact(const Args& args) {
  const CommandLine command_line = ParseCommandLine(args, {kHelpOption, kOutputOption});
  if (command_line.Has("help")) return PrintHelp(kCompactHelp);
  const OutputFormat format = OutputFormatOf(command_line);
  if (command_line.operands.size() != 1) throw UsageError("give one SECONDS (or now)");
  const std::int32_t seconds = ParseSecondsOrNow(command_line.operands[0]);
  return WriteResult(format, seconds, "compact",
                     AdDateTime(AdTime(seconds)).FormatTolvane());
}

}  // namespace adtime
