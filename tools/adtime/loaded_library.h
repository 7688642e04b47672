// Which datetimelib the process runs with. The library can be upgraded apart from
// the tool, so `adtime --version` reports the one the loader mapped rather than
// the one the tool was built against.
#ifndef DATETIMELIB_TOOLS_ADTIME_LOADED_LIBRARY_H_
#define DATETIMELIB_TOOLS_ADTIME_LOADED_LIBRARY_H_

#include <string>

namespace adtime {

struct LoadedLibrary {
  std::string path;     // the real file, symbolic links resolved
  std::string version;  // what follows "<linker name>." in the real file's name
  std::string soname;   // DT_SONAME of the mapped object
};

// Looks among the loaded objects for the one whose SONAME is `linker_name`
// followed by a dot ("libdatetimelib.so" finds "libdatetimelib.so.0.1"). Fields
// stay empty when no such object is loaded or its file name carries no version.
LoadedLibrary FindLoadedLibrary(const std::string& linker_name);

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_LOADED_LIBRARY_H_
