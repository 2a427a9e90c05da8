// What a file system can put in the way of a reader.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "TemporaryFolder.h"
#include "UtilityTest.h"
#include "hostutil/HostFile.h"

namespace hostutil_tests {
namespace {

class HostFileSystemTest : public UtilityTest {
 protected:
  void TearDown() override {
    if (file_ != nullptr) {
      EXPECT_EQ(HostFileDispose(file_), HOST_ERR_NONE);
    }
    UtilityTest::TearDown();
  }

  // What neither opens nor has a size.
  void ExpectNoRegularFile(const std::string& path) {
    HostFile* file = MakeFile(path);
    EXPECT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_FILE_OPEN) << path;
    std::int64_t size = 9;
    EXPECT_EQ(HostFileSize(file, &size), HOST_ERR_FILE_SIZE) << path;
    EXPECT_EQ(size, 0);
    char byte = '?';
    EXPECT_EQ(HostFileRead(file, 1, &byte), HOST_ERR_FILE_STATE) << "the file did not stay open";
    EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  }

  TemporaryFolder folder_;
  HostFile* file_ = nullptr;
};

TEST_F(HostFileSystemTest, WhatIsNoRegularFileIsRefused) {
  ExpectNoRegularFile(folder_.Path("missing.ma"));
  ExpectNoRegularFile(folder_.Path(""));
  ExpectNoRegularFile("");
  ExpectNoRegularFile("/dev/null");
  ExpectNoRegularFile(folder_.Write("file.ma", "abc") + "/below");
  std::filesystem::create_symlink(folder_.Path("nowhere"), folder_.Path("dangling"));
  ExpectNoRegularFile(folder_.Path("dangling"));
}

TEST_F(HostFileSystemTest, AFifoIsNotWaitedFor) {
  const std::string path = folder_.MakeFifo("pipe.ma");
  const auto start = std::chrono::steady_clock::now();
  ExpectNoRegularFile(path);
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(5));
}

TEST_F(HostFileSystemTest, ALinkToAFileOpens) {
  const std::string path = folder_.Write("scene.ma", "abc");
  std::filesystem::create_symlink(path, folder_.Path("link.ma"));
  file_ = MakeFile(folder_.Path("link.ma"));
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
}

TEST_F(HostFileSystemTest, TwoGigabytesLessOneByteAreTakenAndTwoGigabytesAreNot) {
  const std::int64_t most = 2147483647;
  const struct {
    std::int64_t size;
    HostError code;
  } cases[] = {{most, HOST_ERR_NONE},
               {most + 1, HOST_ERR_FILE_SIZE},
               {std::int64_t{1} << 32, HOST_ERR_FILE_SIZE},
               {(std::int64_t{1} << 32) + 5, HOST_ERR_FILE_SIZE}};
  for (const auto& one : cases) {
    HostFile* file = MakeFile(folder_.WriteSparse("large.ma", one.size));
    for (const bool open : {false, true}) {
      if (open) {
        EXPECT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_NONE);
      }
      std::int64_t size = 9;
      EXPECT_EQ(HostFileSize(file, &size), one.code) << one.size;
      EXPECT_EQ(size, one.code == HOST_ERR_NONE ? one.size : 0);
    }
    EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  }
}

TEST_F(HostFileSystemTest, AFileThatShrinksAfterItsSizeWasAskedIsAShortRead) {
  const std::string path = folder_.Write("scene.ma", std::string(100000, 'x'));
  file_ = MakeFile(path);
  std::int64_t size = 0;
  ASSERT_EQ(HostFileSize(file_, &size), HOST_ERR_NONE);
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  ASSERT_EQ(truncate(path.c_str(), 70000), 0);
  std::string bytes(static_cast<std::size_t>(size), '?');
  EXPECT_EQ(HostFileRead(file_, size, bytes.data()), HOST_ERR_FILE_SHORT_READ);
  EXPECT_EQ(bytes, std::string(70000, 'x') + std::string(30000, '?'));
}

TEST_F(HostFileSystemTest, AFileThatIsRemovedWhileOpenIsStillSizedAndRead) {
  const std::string path = folder_.Write("scene.ma", "abc");
  file_ = MakeFile(path);
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  std::filesystem::remove(path);
  std::int64_t size = 0;
  EXPECT_EQ(HostFileSize(file_, &size), HOST_ERR_NONE);
  EXPECT_EQ(size, 3);
  char bytes[3];
  EXPECT_EQ(HostFileRead(file_, 3, bytes), HOST_ERR_NONE);
}

TEST_F(HostFileSystemTest, PathsOfAnyBytesAreFoundAgain) {
  std::string everyByte;
  for (int byte = 1; byte < 256; ++byte) {
    if (byte != '/') everyByte += static_cast<char>(byte);
  }
  const std::string names[] = {
      "plain.ma",
      "caf\xC3\xA9.ma",
      "latin\xE9.ma",
      "\xF0\x9F\x8E\xAC.ma",
      "surrogate\xED\xA0\xBC\xED\xBE\xAC.ma",
      "cut\xF0\x9F",
      "mixed\xC3\xA9\xC3\xFF\xF0\x9F\x8E\xAC\x80.ma",
      "line\nbreak\x1B[31m.ma",
      everyByte.substr(0, 200),
      everyByte.substr(127),
  };
  for (const std::string& name : names) {
    HostFile* file = MakeFile(folder_.Write(name, name));
    EXPECT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_NONE) << name;
    std::string bytes(name.size(), '?');
    EXPECT_EQ(HostFileRead(file, static_cast<std::int64_t>(name.size()), bytes.data()), HOST_ERR_NONE);
    EXPECT_EQ(bytes, name);
    EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  }
}

TEST_F(HostFileSystemTest, ALoneSurrogateThatStandsForNoByteNamesNoFileOfAnotherName) {
  folder_.Write("a\xEF\xBF\xBD.ma", "another");
  UTF16String* folderText = MakeText(folder_.Path("a"));
  std::vector<HostUTF16Unit> units = UnitsOf(folderText);
  UTF16StringRelease(folderText);
  const std::vector<HostUTF16Unit> rest = {0xD800, '.', 'm', 'a', 0};
  units.insert(units.end(), rest.begin(), rest.end());
  UTF16String* path = nullptr;
  ASSERT_EQ(UTF16StringMakeFromUnits(units.data(), &path), HOST_ERR_NONE);
  ASSERT_EQ(HostFileCreate(path, &file_), HOST_ERR_NONE);
  UTF16StringRelease(path);
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_FILE_OPEN);
}

TEST_F(HostFileSystemTest, NoDescriptorIsLeftOpen) {
  const auto openDescriptors = [] {
    constexpr int kMore = 1024;  // than a test has open
    int open = 0;
    for (int descriptor = 0; descriptor < kMore; ++descriptor)
      open += fcntl(descriptor, F_GETFD) != -1 ? 1 : 0;
    return open;
  };
  const std::string path = folder_.Write("scene.ma", "abc");
  const auto before = openDescriptors();
  HostFile* file = MakeFile(path);
  ASSERT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(openDescriptors(), before + 1);
  ASSERT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  EXPECT_EQ(openDescriptors(), before);
  file = MakeFile(folder_.MakeFifo("pipe.ma"));
  ASSERT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_FILE_OPEN);
  EXPECT_EQ(openDescriptors(), before) << "what was opened to be looked at is closed";
  ASSERT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  file = MakeFile(path);
  ASSERT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_NONE);
  HostReleaseLeftovers();
  EXPECT_EQ(openDescriptors(), before) << "a leftover file is closed";
}

}  // namespace
}  // namespace hostutil_tests
