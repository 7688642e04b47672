#include "adtime_runner.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <sstream>
#include <stdexcept>

extern char** environ;

namespace adtime_test {
namespace {

// A file in the temporary folder, removed with the object.
class TempFile {
 public:
  TempFile() {
    const char* dir = std::getenv("TMPDIR");
    path_ = std::string(dir != nullptr && *dir != '\0' ? dir : "/tmp") + "/adtime_XXXXXX";
    const int fd = mkstemp(path_.data());
    if (fd < 0) throw std::runtime_error("mkstemp failed");
    close(fd);
  }
  ~TempFile() { std::remove(path_.c_str()); }
  TempFile(const TempFile&) = delete;
  TempFile& operator=(const TempFile&) = delete;

  const char* path() const { return path_.c_str(); }
  std::string Read() const {
    std::ifstream in(path_, std::ios::binary);
    std::ostringstream text;
    text << in.rdbuf();
    return text.str();
  }
  void Write(const std::string& bytes) const {
    std::ofstream(path_, std::ios::binary) << bytes;
  }

 private:
  std::string path_;
};

bool StartsWith(const char* text, const char* prefix) {
  return std::strncmp(text, prefix, std::strlen(prefix)) == 0;
}

// Whether `entry` ("NAME=value") sets one of the variables that `settings` set.
bool SetByAny(const char* entry, const std::vector<std::string>& settings) {
  for (const std::string& setting : settings) {
    const std::string name = setting.substr(0, setting.find('=') + 1);
    if (StartsWith(entry, name.c_str())) return true;
  }
  return false;
}

std::vector<std::string> ChildEnvironment(const RunOptions& options) {
  std::vector<std::string> environment;
  for (char** entry = environ; *entry != nullptr; ++entry) {
    if (StartsWith(*entry, "TZ=") || StartsWith(*entry, "LANG=") ||
        StartsWith(*entry, "LC_") || StartsWith(*entry, "LOCPATH=") ||
        SetByAny(*entry, options.extra_environment)) {
      continue;
    }
    environment.emplace_back(*entry);
  }
  environment.push_back("TZ=" + options.tz);
  environment.emplace_back("LC_ALL=C");
  for (const std::string& extra : options.extra_environment) environment.push_back(extra);
  return environment;
}

std::vector<char*> Pointers(std::vector<std::string>& strings) {
  std::vector<char*> pointers;
  for (std::string& text : strings) pointers.push_back(text.data());
  pointers.push_back(nullptr);
  return pointers;
}

}  // namespace

RunResult RunAdtime(const std::vector<std::string>& args, const RunOptions& options) {
  TempFile input, out, err;
  input.Write(options.input);
  const char* out_path =
      options.stdout_path != nullptr ? options.stdout_path : out.path();

  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_addopen(&actions, 0, input.path(), O_RDONLY, 0);
  posix_spawn_file_actions_addopen(&actions, 1, out_path, O_WRONLY | O_TRUNC, 0);
  posix_spawn_file_actions_addopen(&actions, 2, err.path(), O_WRONLY | O_TRUNC, 0);

  std::vector<std::string> argv_strings = {ADTIME_PATH};
  argv_strings.insert(argv_strings.end(), args.begin(), args.end());
  std::vector<std::string> env_strings = ChildEnvironment(options);
  std::vector<char*> argv = Pointers(argv_strings);
  std::vector<char*> envp = Pointers(env_strings);

  pid_t pid = 0;
  const int spawned =
      posix_spawn(&pid, ADTIME_PATH, &actions, nullptr, argv.data(), envp.data());
  posix_spawn_file_actions_destroy(&actions);
  if (spawned != 0) throw std::runtime_error("cannot start " ADTIME_PATH);

  int wait_status = 0;
  waitpid(pid, &wait_status, 0);
  RunResult result;
  if (WIFEXITED(wait_status)) result.exit_status = WEXITSTATUS(wait_status);
  if (options.stdout_path == nullptr) result.out = out.Read();
  result.err = err.Read();
  return result;
}

std::vector<std::string> Lines(const std::string& text) {
  std::vector<std::string> lines;
  std::size_t start = 0;
  while (start < text.size()) {
    std::size_t end = text.find('\n', start);
    if (end == std::string::npos) end = text.size();
    lines.push_back(text.substr(start, end - start));
    start = end + 1;
  }
  return lines;
}

}  // namespace adtime_test
