// Several outputs that take their places together. The calls that move files are the test's own: they count
// and fail on demand.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "tests/tools/ToolRun.h"
#include "tools/mayascene/OutputFile.h"

namespace {

constexpr int kNever = 1 << 30;

struct Moves {
  bool links = true;  // the file system has hard links
  int renamed = 0;
  int firstFailure = kNever;
  int lastFailure = kNever;
};
Moves moves;

}  // namespace

extern "C" int rename(const char* from, const char* to) noexcept {
  const int call = ++moves.renamed;
  if (call < moves.firstFailure || call > moves.lastFailure) return ::renameat(AT_FDCWD, from, AT_FDCWD, to);
  errno = EACCES;
  return -1;
}

extern "C" int link(const char* from, const char* to) noexcept {
  if (moves.links) return ::linkat(AT_FDCWD, from, AT_FDCWD, to, 0);
  errno = EPERM;
  return -1;
}

namespace mayascene {
namespace {

using Names = std::vector<std::string>;

class OutputFilesTest : public mayascene_test::ToolTest {
 protected:
  void SetUp() override { moves = {}; }
  void TearDown() override { moves = {}; }

  // Two new files around two that are there, with "after" in each.
  bool commitFour() {
    write("b", "b before");
    write("c", "c before");
    std::vector<std::unique_ptr<OutputFile>> outputs;
    std::vector<OutputFile*> all;
    for (const char* name : {"a", "b", "c", "d"}) {
      outputs.push_back(OutputFile::open(path(name).string(), &failure));
      outputs.back()->stream() << name << " after";
      all.push_back(outputs.back().get());
    }
    moves.renamed = 0;
    return OutputFile::commitAll(all, &failure);
  }

  std::string failure;
};

TEST_F(OutputFilesTest, AllTakeTheirPlacesAndNothingElseStays) {
  for (const bool links : {true, false}) {
    moves.links = links;
    ASSERT_TRUE(commitFour()) << failure;
    EXPECT_EQ(files(), (Names{"a", "b", "c", "d"}));
    for (const char* name : {"a", "b", "c", "d"}) EXPECT_EQ(read(name), std::string(name) + " after");
  }
}

TEST_F(OutputFilesTest, WhereAnyCannotTakeItsPlaceAllIsAsItWas) {
  for (const bool links : {true, false}) {
    int call = 1;
    for (;; ++call) {
      moves = {.links = links, .firstFailure = call, .lastFailure = call};
      if (commitFour()) break;
      SCOPED_TRACE(call);
      EXPECT_NE(failure.find(" cannot be written: Permission denied"), std::string::npos) << failure;
      EXPECT_EQ(files(), (Names{"b", "c"}));
      EXPECT_EQ(read("b"), "b before");
      EXPECT_EQ(read("c"), "c before");
    }
    EXPECT_EQ(call, links ? 5 : 7);
    for (const char* name : {"a", "d"}) ASSERT_EQ(::unlink(path(name).c_str()), 0);
  }
}

TEST_F(OutputFilesTest, WhatCannotBePutBackIsKeptAndNamed) {
  for (const bool links : {true, false}) {
    int call = 1;
    for (;; ++call) {
      moves = {.links = links, .firstFailure = call};
      if (commitFour()) break;
      SCOPED_TRACE(call);
      for (const std::string name : {"b", "c"}) {
        const std::string said = "; what was in " + path(name).string() + " is in ";
        const std::size_t at = failure.find(said);
        if (at == std::string::npos) {
          EXPECT_EQ(read(name), name + " before");
          continue;
        }
        const std::size_t from = at + said.size();
        const std::string kept = failure.substr(from, failure.find(';', from) - from);
        EXPECT_EQ(read(std::filesystem::path(kept).filename().string()), name + " before");
        ASSERT_EQ(::unlink(kept.c_str()), 0);
      }
      for (const std::string& name : files()) EXPECT_TRUE(name == "b" || name == "c") << name;
    }
    EXPECT_EQ(call, links ? 5 : 7);
    for (const char* name : {"a", "d"}) ASSERT_EQ(::unlink(path(name).c_str()), 0);
  }
}

TEST_F(OutputFilesTest, AFullDiskIsNoticedBeforeTheFirstTakesItsPlace) {
  const auto first = OutputFile::open(path("a").string(), &failure);
  const auto full = OutputFile::open("/dev/full", &failure);
  first->stream() << "whole";
  full->stream() << "too much";
  EXPECT_FALSE(OutputFile::commitAll({first.get(), full.get()}, &failure));
  EXPECT_EQ(failure, "/dev/full cannot be written: No space left on device");
  EXPECT_EQ(moves.renamed, 0);
}

}  // namespace
}  // namespace mayascene
