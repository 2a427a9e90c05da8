// A folder of a test's own, gone with the test.
#pragma once

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdint>
#include <filesystem>
#include <fstream>
#include <string>

namespace hostutil_tests {

class TemporaryFolder {
 public:
  TemporaryFolder() {
    std::string pattern = (std::filesystem::temp_directory_path() / "hostutil.XXXXXX").string();
    EXPECT_NE(mkdtemp(pattern.data()), nullptr);
    path_ = pattern;
  }
  ~TemporaryFolder() {
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
  }
  TemporaryFolder(const TemporaryFolder&) = delete;
  TemporaryFolder& operator=(const TemporaryFolder&) = delete;

  std::string Path(const std::string& name) const { return path_ + "/" + name; }

  std::string Write(const std::string& name, const std::string& bytes) const {
    std::ofstream(Path(name), std::ios::binary) << bytes;
    return Path(name);
  }

  // A file of that size without contents; it takes no room on the disk.
  std::string WriteSparse(const std::string& name, int64_t size) const {
    Write(name, "");
    EXPECT_EQ(truncate(Path(name).c_str(), size), 0);
    return Path(name);
  }

  std::string MakeFifo(const std::string& name) const {
    EXPECT_EQ(mkfifo(Path(name).c_str(), S_IRUSR | S_IWUSR), 0);
    return Path(name);
  }

 private:
  std::string path_;
};

}  // namespace hostutil_tests
