#include "diag/Diagnostic.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace diag {
namespace {

TEST(DiagnosticTest, HasTheFormOfACompilers) {
  const Diagnostic diagnostic{.code = Code::ParentMissing,
                              .range = {40, 3},
                              .place = {12, 9},
                              .arguments = {"shotCam", "shotCamShape"}};
  EXPECT_EQ(
      Render("shots/a.ma", diagnostic),
      "shots/a.ma:12:9: warning: the parent \"shotCam\" of \"shotCamShape\" is not in the file [MA0204]\n"
      "help: Export the camera together with everything above it.\n");
}

TEST(DiagnosticTest, TheSeverityIsTheTables) {
  EXPECT_THAT(Render("a", {.code = Code::NameTaken, .range = {0, 1}, .arguments = {"b", "c"}}),
              testing::StartsWith("a:1:1: note: "));
  EXPECT_THAT(Render("a", {.code = Code::TextTooLong, .arguments = {"5"}}),
              testing::StartsWith("a: error: "));
}

TEST(DiagnosticTest, ThatOfTheWholeFileHasNoLine) {
  EXPECT_EQ(HeadLineOf("a", {.code = Code::NoCamera}),
            "a: warning: the scene has no camera that somebody set up [MA0601]");
  EXPECT_TRUE(IsOfWholeFile({.code = Code::NoCamera}));
  EXPECT_FALSE(IsOfWholeFile({.code = Code::NoCamera, .range = {0, 1}}));
}

TEST(DiagnosticTest, HostileNamesAreEscaped) {
  const Diagnostic diagnostic{.code = Code::CommandCutOff, .arguments = {"a\n\x1b[2J\xff"}};
  EXPECT_EQ(SentenceOf(diagnostic), "the file ends inside the command \"a\\n\\x1b[2J\\xff\"");
  EXPECT_THAT(Render("x\ny", diagnostic), testing::StartsWith("x\\ny: "));
}

TEST(DiagnosticTest, AnArgumentIsNotLookedThroughForPlaceholders) {
  const Diagnostic diagnostic{.code = Code::ParentMissing, .arguments = {"{1}{0}", "b"}};
  EXPECT_EQ(SentenceOf(diagnostic), "the parent \"{1}{0}\" of \"b\" is not in the file");
}

}  // namespace
}  // namespace diag
