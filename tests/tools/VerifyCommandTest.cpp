// `mayascene verify`, compared whole.
#include <gtest/gtest.h>

#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

class VerifyCommand : public ToolTest {
 protected:
  VerifyCommand() {
    write("still.ma", sceneText(stillCamera()));
    write("CAPITALS.ma", "//MAYA ASCII 2023 scene\n");
    write("notes.txt", "just some notes\n");
    write("short.ma", "//Maya\n");
  }
};

TEST_F(VerifyCommand, AllTakenIsZero) {
  const ToolResult result = run({"verify", "still.ma", "CAPITALS.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out, "still.ma: taken\nCAPITALS.ma: taken\n");
  EXPECT_EQ(result.err, "");
}

TEST_F(VerifyCommand, SomeNotTakenIsOneAndShowsNoMessage) {
  const ToolResult result = run({"verify", "notes.txt", "still.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out, "notes.txt: not taken\nstill.ma: taken\n");
  EXPECT_EQ(result.err, "");
}

TEST_F(VerifyCommand, ACodeIsReportedAndIsNotTaken) {
  const ToolResult result = run({"verify", "short.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out, "short.ma: not taken\n");
  EXPECT_EQ(
      result.err,
      "mayascene: short.ma: error 2022 (FILE_SHORT_READ): the file ended, or could not be read, before all "
      "bytes were there\n");
}

TEST_F(VerifyCommand, WhatCannotBeReadIsThree) {
  const ToolResult result = run({"verify", "missing.ma", "notes.txt"});
  EXPECT_EQ(result.status, 3);
  EXPECT_EQ(result.out, "notes.txt: not taken\n");
  EXPECT_EQ(result.err, "mayascene: missing.ma: cannot be opened: No such file or directory\n");
}

TEST_F(VerifyCommand, QuietAnswersWithTheStatusAlone) {
  EXPECT_EQ(run({"verify", "--quiet", "still.ma"}).out, "");
  EXPECT_EQ(run({"verify", "--quiet", "notes.txt"}).status, 1);
}

TEST_F(VerifyCommand, TheTraceOnStandardOutputStandsAlone) {
  const ToolResult result = run({"verify", "still.ma", "--trace", "-"});
  EXPECT_EQ(result.out.find("{\"call\":\"enter\",\"callback\":\"GPMain_MayaImport\"}\n"), 0u) << result.out;
  EXPECT_NE(result.out.find("\"callback\":\"VerifyFileCallback\""), std::string::npos);
  EXPECT_NE(result.out.find("\"canImport\":true"), std::string::npos);
  EXPECT_EQ(result.out.find("taken"), std::string::npos);
}

}  // namespace
}  // namespace mayascene_test
