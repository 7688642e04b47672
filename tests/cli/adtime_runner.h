// Runs the built adtime as a child process with a given standard input and
// environment, and collects what it wrote and its exit status.
#ifndef DATETIMELIB_TESTS_CLI_ADTIME_RUNNER_H_
#define DATETIMELIB_TESTS_CLI_ADTIME_RUNNER_H_

#include <string>
#include <vector>

namespace adtime_test {

struct RunResult {
  int exit_status = -1;  // -1 when the tool did not exit normally (a signal)
  std::string out;
  std::string err;
};

struct RunOptions {
  std::string input;  // written to the tool's standard input
  std::string tz = "America/New_York";
  std::vector<std::string> extra_environment;  // "NAME=value"
  const char* stdout_path = nullptr;           // a file to write to instead of a pipe
};

// Runs adtime with `args` (without the program name). TZ and LC_ALL=C are set
// and the caller's LANG, LC_* and TZ are dropped, so the results do not depend
// on the machine.
RunResult RunAdtime(const std::vector<std::string>& args, const RunOptions& options = {});

// The lines of `text`, each without its line feed.
std::vector<std::string> Lines(const std::string& text);

}  // namespace adtime_test

#endif  // DATETIMELIB_TESTS_CLI_ADTIME_RUNNER_H_
