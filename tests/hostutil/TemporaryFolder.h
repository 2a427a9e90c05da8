// A test's own folder with the kinds of file that the file services meet.
#pragma once

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdint>
#include <string>

#include "tests/support/TemporaryFolder.h"

namespace hostutil_tests {

class TemporaryFolder : public testsupport::TemporaryFolder {
 public:
  std::string Path(const std::string& name) const { return (path() / name).string(); }

  std::string Write(const std::string& name, const std::string& bytes) const {
    return write(name, bytes).string();
  }

  // A file of that size without contents; it takes no room on the disk.
  std::string WriteSparse(const std::string& name, std::int64_t size) const {
    Write(name, "");
    EXPECT_EQ(truncate(Path(name).c_str(), size), 0);
    return Path(name);
  }

  std::string MakeFifo(const std::string& name) const {
    EXPECT_EQ(mkfifo(Path(name).c_str(), S_IRUSR | S_IWUSR), 0);
    return Path(name);
  }
};

}  // namespace hostutil_tests
