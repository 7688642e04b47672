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

// What tells one version of a file from another: a file replaced (renamed over,
// rewritten) differs in one of these.
struct FileIdentity {
  unsigned long long device = 0;
  unsigned long long inode = 0;
  long long size = 0;
  long long modified_seconds = 0;
  long modified_nanoseconds = 0;

  bool operator==(const FileIdentity& other) const {
    return device == other.device && inode == other.inode && size == other.size &&
           modified_seconds == other.modified_seconds &&
           modified_nanoseconds == other.modified_nanoseconds;
  }
  bool operator!=(const FileIdentity& other) const { return !(*this == other); }
};

// The identity of what `path` names now (symbolic links followed), if anything.
std::optional<FileIdentity> IdentityOf(const std::string& path);

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

  // The identity of the file opened, taken from the open descriptor.
  const FileIdentity& Identity() const { return identity_; }

 private:
  RegularFile(int descriptor, const FileIdentity& identity)
      : descriptor_(descriptor), identity_(identity) {}

  int descriptor_ = -1;  // -1 once moved from
  FileIdentity identity_;
};

// The whole content of `path`, if it is a regular file of at most `max_bytes`
// bytes that reads without error; `identity`, when given, receives the identity
// of the very file read.
std::optional<std::string> ReadRegularFile(const std::string& path, std::size_t max_bytes,
                                           FileIdentity* identity = nullptr);

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_REGULAR_FILE_H_
