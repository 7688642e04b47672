// The subcommands of adtime. Each takes the arguments after its name and returns
// the exit status: 0 when every input was valid, 1 when any was not. Usage errors
// are thrown as UsageError and end in exit status 2 (see main.cc).
#ifndef DATETIMELIB_TOOLS_ADTIME_COMMANDS_H_
#define DATETIMELIB_TOOLS_ADTIME_COMMANDS_H_

#include <string>
#include <vector>

#include "command_line.h"
#include "output_buffer.h"
#include "record_writer.h"

namespace adtime {

using Args = std::vector<std::string>;

int RunParse(const Args& args);    // text_commands.cc
int RunRead(const Args& args);     // text_commands.cc
int RunFormat(const Args& args);   // time_commands.cc
int RunCompact(const Args& args);  // time_commands.cc
int RunWeek(const Args& args);     // week_command.cc
int RunZone(const Args& args);     // zone_commands.cc
int RunDst(const Args& args);      // zone_commands.cc

// The exit status when standard output could not be written.
inline constexpr int kExitIoError = 2;

// The canonical text pattern in which the tool writes date-times.
inline constexpr const char* kCanonicalPattern = "%Y-%m-%d %H:%M:%S";

// The options every subcommand takes besides its own.
inline const OptionRule kHelpOption{"help", false};
inline const OptionRule kOutputOption{"output", true};

// The --output choice of `command_line`, text when not given.
OutputFormat OutputFormatOf(const CommandLine& command_line);

// Writes `help` to standard output; returns exit status 0 for the caller to
// return.
int PrintHelp(const char* help);

// Flushes `out`. Returns `status`, or kExitIoError with a message when the
// output could not be written.
int FinishOutput(OutputBuffer* out, int status);

// Writes the records (one line each) to standard output. Returns `status`, or
// kExitIoError with a message when the output could not be written.
int WriteRecords(const std::vector<Record>& records, OutputFormat format, int status);

// The name of a status as the library's header spells it: "valid", "invalid",
// "null", "outOfRange", or the number for any other value.
std::string StatusName(int status);

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_COMMANDS_H_
