#include "fuzz_support.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <filesystem>
#include <vector>

namespace datetimelib::fuzz {
namespace {

// The two TZ entries SetTz hands to putenv in turn.
std::string tz_entries[2];
int tz_turn = 0;

// Runs before the first input, while the process has one thread. TZ goes first
// in the environment: the library checks TZ at every call by comparing the
// environment's entries up to TZ's, and coverage instrumentation makes each
// comparison cost; where TZ lies makes no other difference.
[[maybe_unused]] const bool kEnvironmentSet = [] {
#ifdef DATETIMELIB_FUZZ_LOCALE_DIR
  setenv("LOCPATH", DATETIMELIB_FUZZ_LOCALE_DIR, 1);
#endif
  static std::vector<char*> environment;
  tz_entries[0] = "TZ=America/New_York";
  environment.push_back(tz_entries[0].data());
  for (char** entry = environ; *entry != nullptr; ++entry) {
    if (std::strncmp(*entry, "TZ=", 3) != 0) environment.push_back(*entry);
  }
  environment.push_back(nullptr);
  environ = environment.data();
  return true;
}();

}  // namespace

void UseLocale(std::uint8_t choice) {
  static std::array<locale_t, kLocaleCount> locales = [] {
    std::array<locale_t, kLocaleCount> opened{};
    for (std::size_t i = 0; i < kLocaleCount; ++i) {
      opened[i] = newlocale(LC_ALL_MASK, kLocaleNames[i], nullptr);
      if (opened[i] == nullptr) opened[i] = newlocale(LC_ALL_MASK, "C", nullptr);
    }
    return opened;
  }();
  uselocale(locales[choice % kLocaleCount]);
}

void SetTz(std::string_view value) {
  tz_turn ^= 1;
  tz_entries[tz_turn].assign("TZ=").append(
      value.substr(0, strnlen(value.data(), value.size())));
  putenv(tz_entries[tz_turn].data());
}

bool FieldsInRange(const AdDateTime& value) {
  const long year = value.GetYear(), month = value.GetMonth(), day = value.GetDay();
  if (year < 1970 || year > 2038) return false;
  return year < 2038 || (month == 1 && day <= 18);
}

const std::string& ScratchFolder() {
  // The name outlives the string, which is destroyed before the handler runs.
  static char in_memory[] = "/dev/shm/datetimelib-fuzz-XXXXXX";
  static char on_disk[] = "/tmp/datetimelib-fuzz-XXXXXX";
  static char* const name = access("/dev/shm", W_OK) == 0 ? in_memory : on_disk;
  static const std::string folder = [] {
    if (mkdtemp(name) == nullptr) Fail("a scratch folder can be made");
    std::atexit([] {
      std::error_code ignored;
      std::filesystem::remove_all(name, ignored);
    });
    return std::string(name);
  }();
  return folder;
}

bool WriteFile(const std::string& path, std::string_view bytes) {
  const int fd = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
  if (fd < 0) return false;
  bool ok = true;
  while (!bytes.empty()) {
    const ssize_t written = write(fd, bytes.data(), bytes.size());
    if (written <= 0) {
      ok = false;
      break;
    }
    bytes.remove_prefix(static_cast<std::size_t>(written));
  }
  return close(fd) == 0 && ok;
}

}  // namespace datetimelib::fuzz

// glibc 2.36 newlocale does not free the search path it builds from LOCPATH
// (__argz_add_sep), a few dozen bytes per call; only that allocation is excused.
extern "C" const char*
__lsan_default_suppressions() {  // NOLINT(bugprone-reserved-identifier)
  return "leak:argz_add_sep\n";
}
