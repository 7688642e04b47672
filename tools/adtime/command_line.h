// Splitting a subcommand's arguments into options and operands.
#ifndef DATETIMELIB_TOOLS_ADTIME_COMMAND_LINE_H_
#define DATETIMELIB_TOOLS_ADTIME_COMMAND_LINE_H_

#include <map>
#include <stdexcept>
#include <string>
#include <vector>

namespace adtime {

// A command line the tool cannot act on; main prints the message and exits 2.
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

struct OptionRule {
  const char* name;  // long name without the dashes: "output"
  bool takes_value;
};

struct CommandLine {
  std::map<std::string, std::string> options;  // name -> value ("" for a switch)
  std::vector<std::string> operands;

  bool Has(const std::string& name) const { return options.count(name) != 0; }
  // The option's value, or `fallback` when it was not given.
  std::string Get(const std::string& name, const std::string& fallback) const;
};

// Reads "--name", "--name VALUE", "--name=VALUE" and "-h" anywhere among the
// operands; "--" ends the options. "-" and negative numbers ("-5") are operands,
// so that standard input and counts before 1970 need no "--". An option given
// twice keeps its last value. Throws UsageError for an unknown option or a
// missing value.
CommandLine ParseCommandLine(const std::vector<std::string>& args,
                             const std::vector<OptionRule>& options);

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_COMMAND_LINE_H_
