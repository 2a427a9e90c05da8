#include "hostutil/HostFile.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <string>

#include "TemporaryFolder.h"
#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

class HostFileTest : public UtilityTest {
 protected:
  void TearDown() override {
    if (file_ != nullptr) {
      EXPECT_EQ(HostFileDispose(file_), HOST_ERR_NONE);
    }
    UtilityTest::TearDown();
  }

  std::string Read(std::int64_t count) {
    std::string bytes(static_cast<std::size_t>(count), '?');
    EXPECT_EQ(HostFileRead(file_, count, bytes.data()), HOST_ERR_NONE);
    return bytes;
  }

  TemporaryFolder folder_;
  HostFile* file_ = nullptr;
};

TEST_F(HostFileTest, AFileIsOpenedSizedReadAndClosed) {
  file_ = MakeFile(folder_.Write("scene.ma", "//Maya ASCII 8.5 scene"));
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  std::int64_t size = -1;
  EXPECT_EQ(HostFileSize(file_, &size), HOST_ERR_NONE);
  EXPECT_EQ(size, 22);
  EXPECT_EQ(Read(22), "//Maya ASCII 8.5 scene");
  EXPECT_EQ(HostFileClose(file_), HOST_ERR_NONE);
}

TEST_F(HostFileTest, MakingAFileObjectDoesNotTouchTheFile) {
  file_ = MakeFile(folder_.Path("nothing/here.ma"));
  EXPECT_NE(file_, nullptr);
  EXPECT_FALSE(std::filesystem::exists(folder_.Path("nothing")));
}

TEST_F(HostFileTest, AReadGoesOnWhereTheLastOneEnded) {
  file_ = MakeFile(folder_.Write("scene.ma", "abcdefghij"));
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(Read(3), "abc");
  EXPECT_EQ(Read(0), "");
  EXPECT_EQ(Read(7), "defghij");
}

TEST_F(HostFileTest, AnotherOpenBeginsAtTheStart) {
  file_ = MakeFile(folder_.Write("scene.ma", "abcdefghij"));
  for (int i = 0; i < 2; ++i) {
    ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
    EXPECT_EQ(Read(4), "abcd");
    ASSERT_EQ(HostFileClose(file_), HOST_ERR_NONE);
  }
}

TEST_F(HostFileTest, AFileThatEndsBeforeIsAShortReadAndTheBufferHoldsWhatCame) {
  file_ = MakeFile(folder_.Write("scene.ma", "//Maya"));
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  std::string bytes(10, '?');
  EXPECT_EQ(HostFileRead(file_, 10, bytes.data()), HOST_ERR_FILE_SHORT_READ);
  EXPECT_EQ(bytes, "//Maya????");
}

TEST_F(HostFileTest, AnEmptyFileHasSizeZeroAndReadsNoBytes) {
  file_ = MakeFile(folder_.Write("empty.ma", ""));
  std::int64_t size = -1;
  EXPECT_EQ(HostFileSize(file_, &size), HOST_ERR_NONE);
  EXPECT_EQ(size, 0);
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(Read(0), "");
  char byte = '?';
  EXPECT_EQ(HostFileRead(file_, 1, &byte), HOST_ERR_FILE_SHORT_READ);
}

TEST_F(HostFileTest, ANegativeCountIsAShortRead) {
  file_ = MakeFile(folder_.Write("scene.ma", "abc"));
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  char byte = '?';
  EXPECT_EQ(HostFileRead(file_, -1, &byte), HOST_ERR_FILE_SHORT_READ);
  EXPECT_EQ(byte, '?');
}

TEST_F(HostFileTest, TheSizeIsGivenOpenOrClosed) {
  file_ = MakeFile(folder_.Write("scene.ma", std::string(12345, 'x')));
  std::int64_t size = 0;
  EXPECT_EQ(HostFileSize(file_, &size), HOST_ERR_NONE);
  EXPECT_EQ(size, 12345);
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  size = 0;
  EXPECT_EQ(HostFileSize(file_, &size), HOST_ERR_NONE);
  EXPECT_EQ(size, 12345);
}

TEST_F(HostFileTest, OnlyTheReadingModeOpens) {
  file_ = MakeFile(folder_.Write("scene.ma", "abc"));
  for (const std::int32_t mode : {0, 2, -1}) EXPECT_EQ(HostFileOpen(file_, mode), HOST_ERR_FILE_OPEN) << mode;
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
}

TEST_F(HostFileTest, AnOpenFileCannotBeOpenedAndAClosedOneNotRead) {
  file_ = MakeFile(folder_.Write("scene.ma", "abc"));
  char byte = '?';
  EXPECT_EQ(HostFileRead(file_, 1, &byte), HOST_ERR_FILE_STATE);
  EXPECT_EQ(HostFileRead(file_, 0, &byte), HOST_ERR_FILE_STATE);
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_FILE_STATE);
  EXPECT_EQ(Read(1), "a") << "the file is open as before";
  ASSERT_EQ(HostFileClose(file_), HOST_ERR_NONE);
  EXPECT_EQ(HostFileRead(file_, 1, &byte), HOST_ERR_FILE_STATE);
  EXPECT_EQ(byte, '?');
}

TEST_F(HostFileTest, ClosingAFileThatIsNotOpenSucceeds) {
  file_ = MakeFile(folder_.Path("missing.ma"));
  EXPECT_EQ(HostFileClose(file_), HOST_ERR_NONE);
  EXPECT_EQ(HostFileClose(file_), HOST_ERR_NONE);
}

TEST_F(HostFileTest, TheNameIsWhatFollowsTheLastSlash) {
  const struct {
    const char *path, *name;
  } cases[] = {{"/shots/a/scene.ma", "scene.ma"},
               {"scene.ma", "scene.ma"},
               {"/", ""},
               {"", ""},
               {"folder/", ""},
               {"a//b", "b"},
               {".ma", ".ma"}};
  for (const auto& one : cases) {
    HostFile* file = MakeFile(one.path);
    UTF16String* name = nullptr;
    EXPECT_EQ(HostFileName(file, &name), HOST_ERR_NONE);
    EXPECT_EQ(ShownAndReleased(name), one.name) << one.path;
    EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  }
}

TEST_F(HostFileTest, TheNameOutlivesTheFile) {
  HostFile* file = MakeFile("/shots/scene.ma");
  UTF16String* name = nullptr;
  ASSERT_EQ(HostFileName(file, &name), HOST_ERR_NONE);
  ASSERT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  EXPECT_EQ(ShownAndReleased(name), "scene.ma");
}

TEST_F(HostFileTest, TheFileOutlivesThePathText) {
  UTF16String* path = MakeText("/shots/scene.ma");
  ASSERT_EQ(HostFileCreate(path, &file_), HOST_ERR_NONE);
  UTF16StringRelease(path);
  UTF16String* name = nullptr;
  ASSERT_EQ(HostFileName(file_, &name), HOST_ERR_NONE);
  EXPECT_EQ(ShownAndReleased(name), "scene.ma");
}

TEST_F(HostFileTest, AnOpenFileCanBeDisposedOf) {
  HostFile* file = MakeFile(folder_.Write("scene.ma", "abc"));
  ASSERT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
}

// Every operation on a handle that is none.
void ExpectRefused(HostFile* file) {
  std::int64_t size = 9;
  char byte = '?';
  auto* name = reinterpret_cast<UTF16String*>(1);
  EXPECT_EQ(HostFileOpen(file, HOST_FILE_READ), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostFileSize(file, &size), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(size, 0);
  EXPECT_EQ(HostFileRead(file, 1, &byte), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostFileClose(file), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostFileName(file, &name), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(name, nullptr);
  EXPECT_EQ(HostFileDispose(file), HOST_ERR_UTILITY_NULL);
}

TEST_F(HostFileTest, ANullObjectIsRefused) { ExpectRefused(nullptr); }

TEST_F(HostFileTest, AnObjectThatTheLibraryDidNotMakeIsRefused) {
  std::array<double, 64> other{};
  ExpectRefused(reinterpret_cast<HostFile*>(other.data()));
}

TEST_F(HostFileTest, AnObjectThatWasDisposedOfIsRefused) {
  HostFile* file = MakeFile("scene.ma");
  ASSERT_EQ(HostFileDispose(file), HOST_ERR_NONE);
  ExpectRefused(file);
}

TEST_F(HostFileTest, NullPointersAreRefused) {
  file_ = MakeFile(folder_.Write("scene.ma", "abc"));
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(HostFileSize(file_, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostFileRead(file_, 1, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostFileName(file_, nullptr), HOST_ERR_UTILITY_NULL);
  auto* file = reinterpret_cast<HostFile*>(1);
  EXPECT_EQ(HostFileCreate(nullptr, &file), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(file, nullptr);
  UTF16String* path = MakeText("a");
  EXPECT_EQ(HostFileCreate(path, nullptr), HOST_ERR_UTILITY_NULL);
  UTF16StringRelease(path);
}

}  // namespace
}  // namespace hostutil_tests
