#include "loaded_library.h"

#include <link.h>

#include <climits>
#include <cstdlib>
#include <cstring>

namespace adtime {
namespace {

struct Search {
  std::string prefix;  // "<linker name>."
  std::string name;    // dlpi_name of the object found
  std::string soname;
};

// The DT_SONAME of a mapped object, or "" when it has none.
std::string SonameOf(const dl_phdr_info& info) {
  const ElfW(Dyn)* dynamic = nullptr;
  for (ElfW(Half) i = 0; i < info.dlpi_phnum; ++i) {
    if (info.dlpi_phdr[i].p_type == PT_DYNAMIC) {
      dynamic =
          reinterpret_cast<const ElfW(Dyn)*>(info.dlpi_addr + info.dlpi_phdr[i].p_vaddr);
    }
  }
  if (dynamic == nullptr) return "";
  ElfW(Addr) strings = 0;
  ElfW(Xword) soname = 0;
  bool has_soname = false;
  for (const ElfW(Dyn)* entry = dynamic; entry->d_tag != DT_NULL; ++entry) {
    if (entry->d_tag == DT_STRTAB) strings = entry->d_un.d_ptr;
    if (entry->d_tag == DT_SONAME) {
      soname = entry->d_un.d_val;
      has_soname = true;
    }
  }
  if (!has_soname || strings == 0) return "";
  // glibc relocates the string table's address in place where the dynamic
  // section is writable, and leaves it as linked elsewhere.
  if (strings < info.dlpi_addr) strings += info.dlpi_addr;
  return reinterpret_cast<const char*>(strings + soname);
}

int Visit(dl_phdr_info* info, size_t, void* data) {
  auto* search = static_cast<Search*>(data);
  std::string soname = SonameOf(*info);
  if (soname.compare(0, search->prefix.size(), search->prefix) != 0) return 0;
  search->name = info->dlpi_name != nullptr ? info->dlpi_name : "";
  search->soname = std::move(soname);
  return 1;
}

}  // namespace

LoadedLibrary FindLoadedLibrary(const std::string& linker_name) {
  Search search{linker_name + ".", "", ""};
  LoadedLibrary library;
  if (dl_iterate_phdr(Visit, &search) == 0) return library;
  library.soname = search.soname;
  char real[PATH_MAX];
  if (!search.name.empty() && realpath(search.name.c_str(), real) != nullptr) {
    library.path = real;
    const char* slash = std::strrchr(real, '/');
    const std::string file = slash != nullptr ? slash + 1 : real;
    if (file.compare(0, search.prefix.size(), search.prefix) == 0) {
      library.version = file.substr(search.prefix.size());
    }
  }
  return library;
}

}  // namespace adtime
