// Reads back, in every locale compiled into a folder, what the library writes in
// that locale's own forms (%x %X, %X, %x), in New York time.
//
//   datetimelib_locale_sweep --locales DIR --readme README.md
//
// DIR holds the locales as localedef writes them (NAME.utf8/LC_TIME...); the
// README's table of locales that do not read back (lines "| `NAME` | why |"
// under "### Locales that do not read back") names the exceptions. Fails when a
// locale outside that table does not read back; prints the counts.
#include <dirent.h>
#include <locale.h>
#include <sys/stat.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <set>
#include <string>
#include <vector>

#include "platform/zone/local_time.h"
#include "support/locale_round_trip.h"
#include "text/strftime_text.h"

namespace {

using datetimelib::testing::LocaleForm;

struct CompiledLocale {
  std::string source;  // "de_DE@euro"
  std::string name;    // what newlocale takes: "de_DE.UTF-8@euro"
};

// The folders localedef wrote: "ll_CC.utf8", or "ll_CC.utf8@modifier".
std::vector<CompiledLocale> CompiledLocales(const std::string& folder) {
  std::vector<CompiledLocale> locales;
  DIR* dir = opendir(folder.c_str());
  if (dir == nullptr) return locales;
  while (const dirent* entry = readdir(dir)) {
    const std::string name = entry->d_name;
    const std::size_t codeset = name.find(".utf8");
    struct stat info {};
    if (codeset == std::string::npos ||
        stat((folder + "/" + name + "/LC_TIME").c_str(), &info) != 0) {
      continue;
    }
    const std::string modifier = name.substr(codeset + 5);
    locales.push_back({name.substr(0, codeset) + modifier,
                       name.substr(0, codeset) + ".UTF-8" + modifier});
  }
  closedir(dir);
  std::sort(locales.begin(), locales.end(),
            [](const CompiledLocale& a, const CompiledLocale& b) {
              return a.source < b.source;
            });
  return locales;
}

std::set<std::string> Exceptions(const std::string& readme) {
  std::set<std::string> names;
  std::ifstream in(readme);
  bool in_table = false;
  for (std::string line; std::getline(in, line);) {
    if (line.rfind("### ", 0) == 0 || line.rfind("## ", 0) == 0) {
      in_table = line == "### Locales that do not read back";
    } else if (in_table && line.rfind("| `", 0) == 0) {
      const std::size_t end = line.find('`', 3);
      if (end != std::string::npos) names.insert(line.substr(3, end - 3));
    }
  }
  return names;
}

}  // namespace

int main(int argc, char** argv) {
  std::string folder, readme;
  for (int i = 1; i + 1 < argc; i += 2) {
    const std::string option = argv[i];
    (option == "--locales" ? folder : readme) = argv[i + 1];
  }
  if (folder.empty() || readme.empty()) {
    std::fprintf(stderr, "usage: %s --locales DIR --readme README.md\n", argv[0]);
    return 2;
  }
  // Before any locale or zone is opened; the process has one thread.
  setenv("LOCPATH", folder.c_str(), 1);
  setenv("TZ", "America/New_York", 1);
  const std::vector<CompiledLocale> locales = CompiledLocales(folder);
  const std::set<std::string> exceptions = Exceptions(readme);
  int passed = 0, excepted = 0, failed = 0, not_locales = 0;
  for (const auto& [name, open_name] : locales) {
    // localedef writes some files even for a source that is no whole locale.
    const locale_t locale = newlocale(LC_ALL_MASK, open_name.c_str(), nullptr);
    if (locale == nullptr) {
      ++not_locales;
      continue;
    }
    const locale_t previous = uselocale(locale);
    const std::string failure = datetimelib::testing::FirstRoundTripFailure(
        [locale](const AdDateTime& value, LocaleForm form) {
          std::string text;
          datetimelib::WritePatternInLocale(
              datetimelib::platform::BreakDownLocal(value.GetCTime().GetTime()),
              datetimelib::testing::PatternOf(form), locale, &text);
          return text;
        });
    uselocale(previous);
    freelocale(locale);
    const bool excepted_here = exceptions.count(name) != 0;
    if (failure.empty()) {
      ++passed;
      if (excepted_here)
        std::printf("READS BACK, yet listed as an exception: %s\n", name.c_str());
    } else if (excepted_here) {
      ++excepted;
    } else {
      ++failed;
      std::printf("FAILS %s: %s\n", name.c_str(), failure.c_str());
    }
  }
  const int total = passed + excepted + failed;
  const double share = total == 0 ? 0.0 : 100.0 * passed / total;
  std::printf(
      "locales %d: %d read back (%.1f%%), %d exceptions, %d failing; %d sources "
      "not a locale\n",
      total, passed, share, excepted, failed, not_locales);
  return failed == 0 && total > 0 ? 0 : 1;
}
