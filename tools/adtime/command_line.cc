#include "command_line.h"

#include <cstddef>

namespace adtime {
namespace {

const OptionRule* FindOption(const std::string& name,
                             const std::vector<OptionRule>& options) {
  for (const OptionRule& option : options) {
    if (name == option.name) return &option;
  }
  return nullptr;
}

bool IsDigit(char c) { return c >= '0' && c <= '9'; }

// "-" is standard input and "-5" a number; anything else with a leading dash is
// meant as an option.
bool LooksLikeOption(const std::string& arg) {
  return arg.size() > 1 && arg[0] == '-' && !IsDigit(arg[1]);
}

}  // namespace

std::string CommandLine::Get(const std::string& name, const std::string& fallback) const {
  auto found = options.find(name);
  return found == options.end() ? fallback : found->second;
}

CommandLine ParseCommandLine(const std::vector<std::string>& args,
                             const std::vector<OptionRule>& options) {
  CommandLine parsed;
  bool options_ended = false;
  for (std::size_t i = 0; i < args.size(); ++i) {
    const std::string& arg = args[i];
    if (options_ended || !LooksLikeOption(arg)) {
      parsed.operands.push_back(arg);
      continue;
    }
    if (arg == "--") {
      options_ended = true;
      continue;
    }
    if (arg == "-h") {
      parsed.options["help"] = "";
      continue;
    }
    if (arg.compare(0, 2, "--") != 0) throw UsageError("unknown option " + arg);

    const std::size_t equals = arg.find('=');
    const std::string name =
        arg.substr(2, equals == std::string::npos ? equals : equals - 2);
    const OptionRule* option = FindOption(name, options);
    if (option == nullptr) throw UsageError("unknown option --" + name);
    if (!option->takes_value) {
      if (equals != std::string::npos) throw UsageError("--" + name + " takes no value");
      parsed.options[name] = "";
    } else if (equals != std::string::npos) {
      parsed.options[name] = arg.substr(equals + 1);
    } else if (i + 1 < args.size()) {
      parsed.options[name] = args[++i];
    } else {
      throw UsageError("--" + name + " needs a value");
    }
  }
  return parsed;
}

}  // namespace adtime
