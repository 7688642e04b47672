// adtime: date-times on the command line, through the datetimelib public API.
#include <clocale>
#include <cstdio>
#include <cstring>
#include <exception>
#include <string>
#include <vector>

#include "command_line.h"
#include "commands.h"
#include "escape.h"
#include "loaded_library.h"

namespace {

constexpr int kExitUsage = 2;

constexpr const char kHelp[] =
    "Usage: adtime COMMAND [OPTIONS] [ARGUMENTS]\n"
    "\n"
    "Dates and times through datetimelib, in the local time of TZ.\n"
    "\n"
    "Commands:\n"
    "  parse TEXT...              read dates as people type them (\"yesterday.14:30\")\n"
    "  read TEXT...               read dates in the locale's forms (\"2003-05-17 "
    "14:03:09\")\n"
    "  format SECONDS|now [PATTERN]  write a seconds count with a strftime pattern\n"
    "  compact SECONDS|now        write a seconds count in the compact form\n"
    "  week YEAR MONTH DAY        the Sunday-to-Saturday week around a date\n"
    "  zone                       the time zone: offset, daylight saving, its dates\n"
    "  dst YEAR...                daylight-saving start and end of years\n"
    "\n"
    "Run 'adtime COMMAND --help' for the options of a command, 'adtime --version'\n"
    "for the versions of the tool and of the library it runs with.\n"
    "\n"
    "Exit status: 0 when every input was valid, 1 when any was not, 2 for a usage\n"
    "error or an output that could not be written (the reason on standard error).\n";

struct Command {
  const char* name;
  int (*run)(const adtime::Args&);
};

constexpr Command kCommands[] = {
    {"parse", adtime::RunParse},   {"read", adtime::RunRead},
    {"format", adtime::RunFormat}, {"compact", adtime::RunCompact},
    {"week", adtime::RunWeek},     {"zone", adtime::RunZone},
    {"dst", adtime::RunDst},
};

int Usage(const std::string& reason) {
  std::fprintf(stderr, "adtime: %s\nTry 'adtime --help'.\n", reason.c_str());
  return kExitUsage;
}

}  // namespace

int main(int argc, char** argv) {
  // Dates in the user's own locale (LC_ALL, LC_TIME, LANG) for read and format.
  std::setlocale(LC_ALL, "");

  if (argc < 2) return Usage("no command given");
  const std::string name = argv[1];
  if (name == "--help" || name == "-h" || name == "help") return adtime::PrintHelp(kHelp);
  if (name == "--version") {
    // The library may have been upgraded on its own: name the one loaded.
    const adtime::LoadedLibrary library = adtime::FindLoadedLibrary(ADTIME_LIBRARY_NAME);
    std::printf("adtime %s\n%s %s (SONAME %s) from %s\n", ADTIME_VERSION,
                ADTIME_LIBRARY_NAME,
                library.version.empty() ? "unknown" : library.version.c_str(),
                library.soname.empty() ? "unknown" : library.soname.c_str(),
                library.path.empty() ? "an unknown file" : library.path.c_str());
    return 0;
  }
  const std::vector<std::string> args(argv + 2, argv + argc);
  for (const Command& command : kCommands) {
    if (name != command.name) continue;
    try {
      return command.run(args);
    } catch (const adtime::UsageError& error) {
      std::fprintf(stderr, "adtime %s: %s\nTry 'adtime %s --help'.\n", command.name,
                   error.what(), command.name);
      return kExitUsage;
    } catch (const std::exception& error) {
      std::fprintf(stderr, "adtime %s: %s\n", command.name, error.what());
      return kExitUsage;
    }
  }
  return Usage("unknown command \"" + adtime::Escaped(name) + "\"");
}
