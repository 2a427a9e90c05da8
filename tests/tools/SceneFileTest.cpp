#include "tools/mayascene/SceneFile.h"

#include <sys/stat.h>

#include "tests/tools/ToolRun.h"

namespace mayascene {
namespace {

using SceneFile = mayascene_test::ToolTest;

TEST_F(SceneFile, TheHeaderIsRecognisedWithoutRegardToCase) {
  for (const char* text : {"//Maya ASCII 2023 scene\n", "//MAYA", "//mAyA\n"}) {
    write("a.ma", text);
    EXPECT_TRUE(lookAtScene(path("a.ma")).readable) << text;
    EXPECT_TRUE(lookAtScene(path("a.ma")).mayaHeader) << text;
  }
}

TEST_F(SceneFile, AnythingElseIsReadableButNoScene) {
  for (const char* text : {"", "//May", "/ /Maya", " //Maya", "PNG and so on"}) {
    write("a.ma", text);
    EXPECT_TRUE(lookAtScene(path("a.ma")).readable) << text;
    EXPECT_FALSE(lookAtScene(path("a.ma")).mayaHeader) << text;
  }
}

TEST_F(SceneFile, WhatCannotBeOpenedIsNotReadable) {
  EXPECT_FALSE(lookAtScene(path("missing.ma")).readable);
  EXPECT_EQ(lookAtScene(path("missing.ma")).failure, "cannot be opened: No such file or directory");
}

TEST_F(SceneFile, ADirectoryIsNotReadable) {
  EXPECT_FALSE(lookAtScene(path("")).readable);
  EXPECT_EQ(lookAtScene(path("")).failure, "is a directory, not a file");
}

TEST_F(SceneFile, AFifoIsNotWaitedFor) {
  ASSERT_EQ(::mkfifo(path("fifo").c_str(), 0600), 0);
  EXPECT_FALSE(lookAtScene(path("fifo")).readable);
  EXPECT_EQ(lookAtScene(path("fifo")).failure, "is not a regular file");
}

TEST_F(SceneFile, ADeviceIsNotReadable) { EXPECT_FALSE(lookAtScene("/dev/zero").readable); }

}  // namespace
}  // namespace mayascene
