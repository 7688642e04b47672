// Reading files that must be regular files, without ever blocking.
//
// A name given to the library may be anything: opening a FIFO for reading waits
// for a writer, a terminal may wait for a user, and /dev/zero never ends. Only a
// regular file (symbolic links followed) is opened; anything else reads as absent.
#ifndef DATETIMELIB_PLATFORM_REGULAR_FILE_H_
#define DATETIMELIB_PLATFORM_REGULAR_FILE_H_

#include <cstddef>
#include <optional>
#include <string>

namespace datetimelib::platform {

class RegularFile {
 public:
  // `path` opened for reading, if it names a regular file that can be opened.
  static std::optional<RegularFile> Open(const std::string& path);

  RegularFile(RegularFile&& other) noexcept;
  RegularFile& operator=(RegularFile&& other) noexcept;
  RegularFile(const RegularFile&) = delete;
  RegularFile& operator=(const RegularFile&) = delete;
  ~RegularFile();

  // Reads up to `size` bytes into `buffer`: the number read, 0 at the end of the
  // file, -1 on a read error.
  long Read(char* buffer, std::size_t size);

 private:
  explicit RegularFile(int descriptor) : descriptor_(descriptor) {}

  int descriptor_ = -1;  // -1 once moved from
};

// The whole content of `path`, if it is a regular file of at most `max_bytes`
// bytes that reads without error.
std::optional<std::string> ReadRegularFile(const std::string& path,
                                           std::size_t max_bytes);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_REGULAR_FILE_H_
