// A fresh directory under $TMPDIR (or /tmp), removed with everything in it when
// the guard ends.
#ifndef DATETIMELIB_TESTS_SUPPORT_TEMP_DIR_H_
#define DATETIMELIB_TESTS_SUPPORT_TEMP_DIR_H_

#include <stdlib.h>

#include <filesystem>
#include <fstream>
#include <string>

namespace datetimelib::testing {

class TempDir {
 public:
  TempDir() {
    std::string pattern = std::filesystem::temp_directory_path() / "dtl-XXXXXX";
    if (mkdtemp(pattern.data()) != nullptr) path_ = pattern;
  }
  ~TempDir() {
    std::error_code ignored;
    if (!path_.empty()) std::filesystem::remove_all(path_, ignored);
  }
  TempDir(const TempDir&) = delete;
  TempDir& operator=(const TempDir&) = delete;

  bool ok() const { return !path_.empty(); }
  const std::string& path() const { return path_; }
  std::string Path(const std::string& name) const { return path_ + "/" + name; }

  // Writes `content` to `name` (subfolders created), replacing any file there.
  std::string Write(const std::string& name, const std::string& content) const {
    const std::string file = Path(name);
    std::filesystem::create_directories(std::filesystem::path(file).parent_path());
    std::ofstream(file, std::ios::binary) << content;
    return file;
  }

 private:
  std::string path_;
};

}  // namespace datetimelib::testing

#endif  // DATETIMELIB_TESTS_SUPPORT_TEMP_DIR_H_
