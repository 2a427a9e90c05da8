// Files by what their paths lead to.
#include "tools/mayascene/FileSet.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "tests/support/TemporaryFolder.h"

namespace {

namespace fs = std::filesystem;

void write(const fs::path& path) { std::ofstream(path) << "text"; }

TEST(FileSet, AFileIsFoundUnderEveryPathThatLeadsToIt) {
  const testsupport::TemporaryFolder folder;
  write(folder.path() / "shot.ma");
  write(folder.path() / "other.ma");
  fs::create_directory(folder.path() / "in");
  fs::create_symlink(folder.path() / "shot.ma", folder.path() / "link.ma");
  fs::create_hard_link(folder.path() / "shot.ma", folder.path() / "hard.ma");
  mayascene::FileSet set;
  set.add((folder.path() / "in" / ".." / "shot.ma").string());
  for (const char* const name : {"shot.ma", "link.ma", "hard.ma", "in/../link.ma"}) {
    EXPECT_TRUE(set.contains((folder.path() / name).string())) << name;
  }
  EXPECT_FALSE(set.contains((folder.path() / "other.ma").string()));
}

TEST(FileSet, AFileThatIsNotThereIsKnownByItsWholePath) {
  const testsupport::TemporaryFolder folder;
  fs::create_directory(folder.path() / "out");
  fs::create_directory_symlink(folder.path() / "out", folder.path() / "linked");
  mayascene::FileSet set;
  set.add((folder.path() / "linked" / "shot.ma").string());
  EXPECT_TRUE(set.contains((folder.path() / "out" / "." / "shot.ma").string()));
  EXPECT_FALSE(set.contains((folder.path() / "shot.ma").string()));
}

}  // namespace
