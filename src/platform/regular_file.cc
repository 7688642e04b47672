#include "platform/regular_file.h"

#include <errno.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <utility>

namespace datetimelib::platform {
namespace {

bool IsRegular(const struct stat& status) { return S_ISREG(status.st_mode); }

FileIdentity IdentityFromStatus(const struct stat& status) {
  FileIdentity identity;
  identity.device = status.st_dev;
  identity.inode = status.st_ino;
  identity.size = status.st_size;
  identity.modified_seconds = status.st_mtim.tv_sec;
  identity.modified_nanoseconds = status.st_mtim.tv_nsec;
  return identity;
}

}  // namespace

std::optional<FileIdentity> IdentityOf(const std::string& path) {
  struct stat status {};
  if (stat(path.c_str(), &status) != 0) return std::nullopt;
  return IdentityFromStatus(status);
}

std::optional<RegularFile> RegularFile::Open(const std::string& path) {
  // The name is tested before opening, so that no device is ever opened (opening
  // one can have effects of its own), and the descriptor after, since the name
  // may have been replaced in between. O_NONBLOCK makes the open itself return at
  // once should a FIFO slip through; it changes nothing for a regular file.
  struct stat status {};
  if (stat(path.c_str(), &status) != 0 || !IsRegular(status)) return std::nullopt;
  const int descriptor = open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC | O_NOCTTY);
  if (descriptor < 0) return std::nullopt;
  if (fstat(descriptor, &status) != 0 || !IsRegular(status)) {
    close(descriptor);
    return std::nullopt;
  }
  return RegularFile(descriptor, IdentityFromStatus(status));
}

RegularFile::RegularFile(RegularFile&& other) noexcept
    : descriptor_(std::exchange(other.descriptor_, -1)), identity_(other.identity_) {}

RegularFile& RegularFile::operator=(RegularFile&& other) noexcept {
  if (this != &other) {
    if (descriptor_ >= 0) close(descriptor_);
    descriptor_ = std::exchange(other.descriptor_, -1);
    identity_ = other.identity_;
  }
  return *this;
}

RegularFile::~RegularFile() {
  if (descriptor_ >= 0) close(descriptor_);
}

long RegularFile::Read(char* buffer, std::size_t size) {
  for (;;) {
    const ssize_t count = read(descriptor_, buffer, size);
    if (count >= 0) return static_cast<long>(count);
    if (errno != EINTR) return -1;
  }
}

std::optional<std::string> ReadRegularFile(const std::string& path, std::size_t max_bytes,
                                           FileIdentity* identity) {
  std::optional<RegularFile> file = RegularFile::Open(path);
  if (!file) return std::nullopt;
  if (identity != nullptr) *identity = file->Identity();
  std::string content;
  char chunk[4096];
  for (;;) {
    const long count = file->Read(chunk, sizeof chunk);
    if (count < 0) return std::nullopt;
    if (count == 0) return content;
    if (static_cast<std::size_t>(count) > max_bytes - content.size()) return std::nullopt;
    content.append(chunk, static_cast<std::size_t>(count));
  }
}

}  // namespace datetimelib::platform
