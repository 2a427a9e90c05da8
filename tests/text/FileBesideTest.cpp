// Files that appear whole or not at all.
#include "text/FileBeside.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <iterator>
#include <string>

#include "tests/support/TemporaryFolder.h"

namespace text {
namespace {

namespace fs = std::filesystem;

class FileBesideTest : public ::testing::Test {
 protected:
  std::string Path(const char* name) const { return (folder_.path() / name).string(); }
  std::ptrdiff_t FileCount() const {
    return std::distance(fs::directory_iterator(folder_.path()), fs::directory_iterator());
  }

  const testsupport::TemporaryFolder folder_;
};

TEST_F(FileBesideTest, AFileIsReplacedWithItsPermissions) {
  folder_.write("out", "earlier and longer");
  fs::permissions(Path("out"), fs::perms(0640));
  ASSERT_TRUE(ReplaceFile(Path("out"), "later"));
  EXPECT_EQ(folder_.read("out"), "later");
  EXPECT_EQ(fs::status(Path("out")).permissions(), fs::perms(0640));
  EXPECT_EQ(FileCount(), 1);
}

TEST_F(FileBesideTest, ALinkStaysALinkAndItsFileIsReplacedOrMade) {
  for (const char* const target : {"real", "new"}) {
    folder_.write("real", "earlier");
    fs::create_symlink(target, Path("link"));
    ASSERT_TRUE(ReplaceFile(Path("link"), "later"));
    EXPECT_TRUE(fs::is_symlink(Path("link")));
    EXPECT_EQ(folder_.read(target), "later");
    fs::remove(Path("link"));
  }
}

TEST_F(FileBesideTest, WhatIsNotARegularFileStays) {
  fs::create_directory(Path("folder"));
  fs::create_symlink("circle", Path("circle"));
  errno = 0;
  EXPECT_FALSE(ReplaceFile(Path("folder"), "text"));
  EXPECT_EQ(errno, EEXIST);
  EXPECT_FALSE(ReplaceFile(Path("circle"), "text"));
  EXPECT_EQ(errno, ELOOP);
  EXPECT_FALSE(ReplaceFile("/dev/null", "text"));
  EXPECT_TRUE(fs::is_character_file("/dev/null"));
  EXPECT_TRUE(fs::is_directory(Path("folder")));
  EXPECT_EQ(FileCount(), 2);
}

TEST_F(FileBesideTest, AFolderThatIsNotThereIsNotMade) {
  EXPECT_FALSE(ReplaceFile(Path("nowhere/out"), "text"));
  EXPECT_EQ(errno, ENOENT);
  EXPECT_EQ(FileCount(), 0);
}

TEST_F(FileBesideTest, WhatHasNotTakenItsPlaceIsRemoved) {
  folder_.write("out", "earlier");
  {
    FileBeside file;
    ASSERT_TRUE(file.FindPlace(Path("out")));
    EXPECT_EQ(file.place(), Path("out"));
    EXPECT_EQ(fs::path(file.beside()).parent_path(), folder_.path());
    EXPECT_FALSE(fs::exists(file.beside()));
    const int descriptor = file.Create();
    ASSERT_GE(descriptor, 0);
    EXPECT_EQ(::write(descriptor, "half", 4), 4);
    EXPECT_EQ(::close(descriptor), 0);
    EXPECT_EQ(FileCount(), 2);
  }
  EXPECT_EQ(FileCount(), 1);
  EXPECT_EQ(folder_.read("out"), "earlier");
}

TEST_F(FileBesideTest, NoTwoNamesBesideAPlaceAreTheSame) {
  EXPECT_NE(NameBeside(Path("out")), NameBeside(Path("out")));
}

}  // namespace
}  // namespace text
