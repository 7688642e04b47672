// Helpers the subcommands share.
#include <AdDateTime.h>

#include <cstdio>

#include "commands.h"
#include "output_buffer.h"

namespace adtime {

OutputFormat OutputFormatOf(const CommandLine& command_line) {
  return ParseOutputFormat(command_line.Get("output", "text"));
}

int PrintHelp(const char* help) {
  std::fputs(help, stdout);
  return 0;
}

int FinishOutput(OutputBuffer* out, int status) {
  if (out->Flush()) return status;
  std::fputs("adtime: cannot write to standard output\n", stderr);
  return kExitIoError;
}

int WriteRecords(const std::vector<Record>& records, OutputFormat format, int status) {
  OutputBuffer out(stdout);
  for (const Record& record : records) {
    WriteRecord(record, format, out.text());
    out.LineDone();
  }
  return FinishOutput(&out, status);
}

std::string StatusName(int status) {
  switch (status) {
    case AdDateTime::valid:
      return "valid";
    case AdDateTime::invalid:
      return "invalid";
    case AdDateTime::null:
      return "null";
    case AdDateTime::outOfRange:
      return "outOfRange";
    default:
      return std::to_string(status);
  }
}

}  // namespace adtime
