// Which scenes are found in folders, and in which order.
#include "tools/mayascene/SceneSearch.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "tests/support/OwnProcess.h"
#include "tests/support/TemporaryFolder.h"

namespace mayascene_test {
namespace {

namespace fs = std::filesystem;
using mayascene::FoundScenes;
using Names = std::vector<std::string>;

constexpr uid_t kNobody = 65534;

class SceneSearch : public ::testing::Test {
 protected:
  void file(const std::string& name) {
    fs::create_directories((folder_.path() / name).parent_path());
    folder_.write(name, "//Maya ASCII 2023 scene\n");
  }

  std::string path(const std::string& name) const { return (folder_.path() / name).string(); }

  // What is found, with paths as they stand below the test's folder.
  Names shortened(const Names& found) const {
    Names names;
    for (const std::string& one : found) names.push_back(one.substr(folder_.path().string().size() + 1));
    return names;
  }

  Names scenesIn(const std::string& name) const {
    return shortened(mayascene::findScenes({path(name)}).scenes);
  }

  testsupport::TemporaryFolder folder_;
};

TEST_F(SceneSearch, AnArgumentThatIsNoFolderIsASceneWhateverItsName) {
  file("shot.txt");
  const Names arguments = {path("shot.txt"), path("missing.ma"), "", path("shot.txt")};
  const FoundScenes found = mayascene::findScenes(arguments);
  EXPECT_EQ(found.scenes, arguments);
  EXPECT_TRUE(found.unread.empty());
  EXPECT_TRUE(found.empty.empty());
}

TEST_F(SceneSearch, FoldersAreSearchedInTheOrderOfNamesByteByByte) {
  for (const char* name :
       {"s/b.ma", "s/a/z.ma", "s/a/b/c.ma", "s/B.ma", "s/a.ma", "s/\xff.ma", "s/10.ma", "s/9.ma"})
    file(name);
  EXPECT_EQ(scenesIn("s"), (Names{"s/10.ma", "s/9.ma", "s/B.ma", "s/a/b/c.ma", "s/a/z.ma", "s/a.ma", "s/b.ma",
                                  "s/\xff.ma"}));
}

TEST_F(SceneSearch, ArgumentsKeepTheirOrder) {
  for (const char* name : {"a/1.ma", "b/2.ma", "c.ma"}) file(name);
  const FoundScenes found = mayascene::findScenes({path("c.ma"), path("b"), path("a")});
  EXPECT_EQ(shortened(found.scenes), (Names{"c.ma", "b/2.ma", "a/1.ma"}));
}

TEST_F(SceneSearch, TheEndingCountsInCapitalsToo) {
  for (const char* name : {"s/a.MA", "s/b.Ma", "s/c.mA", "s/d.mb", "s/e.ma.bak", "s/f.amma", "s/gma", "s/h"})
    file(name);
  EXPECT_EQ(scenesIn("s"), (Names{"s/a.MA", "s/b.Ma", "s/c.mA"}));
}

TEST_F(SceneSearch, NamesThatBeginWithADotArePassedOver) {
  for (const char* name : {"s/._shot.ma", "s/.ma", "s/.hidden/shot.ma", "s/shot.ma"}) file(name);
  EXPECT_EQ(scenesIn("s"), (Names{"s/shot.ma"}));
}

TEST_F(SceneSearch, AFolderWhoseNameEndsLikeASceneIsSearched) {
  file("s/shots.ma/first.ma");
  EXPECT_EQ(scenesIn("s"), (Names{"s/shots.ma/first.ma"}));
}

TEST_F(SceneSearch, ASlashAtTheEndIsNotDoubled) {
  file("s/a.ma");
  EXPECT_EQ(shortened(mayascene::findScenes({path("s/")}).scenes), (Names{"s/a.ma"}));
}

TEST_F(SceneSearch, LinksAreFollowedAndCirclesEnd) {
  file("s/a/shot.ma");
  file("elsewhere/other.ma");
  fs::create_directory_symlink("..", path("s/a/up"));
  fs::create_directory_symlink(".", path("s/same"));
  fs::create_directory_symlink(path("elsewhere"), path("s/z"));
  fs::create_symlink("a/shot.ma", path("s/linked.ma"));
  fs::create_symlink("itself", path("s/itself"));
  const FoundScenes found = mayascene::findScenes({path("s")});
  EXPECT_EQ(shortened(found.scenes), (Names{"s/a/shot.ma", "s/linked.ma", "s/z/other.ma"}));
  EXPECT_TRUE(found.unread.empty());
}

// Each of 40 folders is linked twice from the one before it: 2^40 ways lead to the last.
TEST_F(SceneSearch, LinksThatMeetAgainDoNotMultiplyTheWork) {
  constexpr int kDepth = 40;
  for (int i = 0; i <= kDepth; ++i) file("s" + std::to_string(i) + "/shot.ma");
  for (int i = 0; i < kDepth; ++i) {
    for (const char* link : {"/left", "/right"}) {
      fs::create_directory_symlink(path("s" + std::to_string(i + 1)), path("s" + std::to_string(i) + link));
    }
  }
  EXPECT_EQ(mayascene::findScenes({path("s0")}).scenes.size(), kDepth + 1u);
}

TEST_F(SceneSearch, AFolderGivenTwiceIsSearchedOnce) {
  for (const char* name : {"s/a.ma", "s/t/b.ma"}) file(name);
  const FoundScenes found = mayascene::findScenes({path("s/t"), path("s"), path("s/t")});
  EXPECT_EQ(shortened(found.scenes), (Names{"s/t/b.ma", "s/a.ma"}));
  EXPECT_TRUE(found.empty.empty());
}

TEST_F(SceneSearch, ALinkThatLeadsNowhereIsASceneWhereItsNameSaysSo) {
  fs::create_directory(path("s"));
  fs::create_symlink("gone", path("s/shot.ma"));
  fs::create_symlink("gone", path("s/notes"));
  const FoundScenes found = mayascene::findScenes({path("s")});
  EXPECT_EQ(shortened(found.scenes), (Names{"s/shot.ma"}));
  EXPECT_TRUE(found.unread.empty());
}

TEST_F(SceneSearch, WhatIsNoFileIsASceneByItsName) {
  fs::create_directory(path("s"));
  ASSERT_EQ(::mkfifo(path("s/pipe.ma").c_str(), 0600), 0);
  EXPECT_EQ(scenesIn("s"), (Names{"s/pipe.ma"}));
}

TEST_F(SceneSearch, AFolderWithoutScenesIsNamed) {
  fs::create_directories(path("s/t"));
  file("u/notes.txt");
  file("v/a.ma");
  const FoundScenes found = mayascene::findScenes({path("s"), path("u"), path("v")});
  EXPECT_EQ(shortened(found.empty), (Names{"s", "u"}));
  EXPECT_EQ(shortened(found.scenes), (Names{"v/a.ma"}));
}

// A user who may read everything gives that up first.
TEST_F(SceneSearch, AFolderThatMayNotBeReadIsNamedAndTheOthersAreSearched) {
  for (const char* name : {"s/a/1.ma", "s/b/2.ma", "s/c/3.ma"}) file(name);
  fs::permissions(folder_.path(), fs::perms::all);
  fs::permissions(path("s/b"), fs::perms::none);
  const std::string closed = path("s/b");
  const std::string reported = path("reported");
  const int signal = testsupport::SignalOfOwnProcess([&] {
    if (::geteuid() == 0 && ::seteuid(kNobody) != 0) throw std::runtime_error("no other user");
    const FoundScenes found = mayascene::findScenes({path("s")});
    std::ofstream out(reported);
    for (const std::string& scene : shortened(found.scenes)) out << scene << '\n';
    for (const auto& unread : found.unread)
      out << shortened({unread.path})[0] << ' ' << unread.sentence << '\n';
  });
  fs::permissions(closed, fs::perms::all);
  EXPECT_EQ(signal, 0);
  EXPECT_EQ(folder_.read("reported"), "s/a/1.ma\ns/c/3.ma\ns/b cannot be searched: Permission denied\n");
}

// The folders lie deeper than a path can be long: what cannot be named any more is named as far as it can.
TEST_F(SceneSearch, FoldersBeyondTheLongestPathAreReportedAndEndTheirOwnBranchAlone) {
  file("s/z.ma");
  const std::string name(250, 'd');
  const std::string reported = path("reported");
  // In a process of its own: it walks down by changing its own folder.
  const int signal = testsupport::SignalOfOwnProcess([&] {
    if (::chdir(path("s").c_str()) != 0) throw std::runtime_error("no folder");
    for (int depth = 0; depth < 20; ++depth) {
      if (::mkdir(name.c_str(), 0700) != 0 || ::chdir(name.c_str()) != 0)
        throw std::runtime_error("no folder");
    }
  });
  ASSERT_EQ(signal, 0);
  const FoundScenes found = mayascene::findScenes({path("s")});
  EXPECT_EQ(shortened(found.scenes), (Names{"s/z.ma"}));
  ASSERT_EQ(found.unread.size(), 1u);
  EXPECT_EQ(found.unread[0].sentence, "cannot be searched: File name too long");
}

}  // namespace
}  // namespace mayascene_test
