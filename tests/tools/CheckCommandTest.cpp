// mayascene check, as a user runs it.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using nlohmann::json;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;
using testing::StartsWith;

class CheckCommand : public ToolTest {};

TEST_F(CheckCommand, ReportsWhatCameOver) {
  write("crane.ma", sceneText(craneCamera()));
  const ToolResult check = run({"check", "crane.ma"});
  EXPECT_EQ(check.status, 0) << check.err;
  EXPECT_THAT(check.out, StartsWith("crane.ma\n"));
  EXPECT_THAT(check.out,
              HasSubstr("  came over      1 camera, 1 null; 0.125 s (3 frames) of 640 x 360 pixels\n"));
  EXPECT_THAT(check.out, HasSubstr("animCurveTA"));
  EXPECT_THAT(check.err, IsEmpty());
}

// With a free processor the scene is read while it is imported; a file that is not a scene is not read.
TEST_F(CheckCommand, TheReportIsTheSameWithOneProcessorAndWithMore) {
  write("crane.ma", sceneText(craneCamera()));
  write("cut.ma", sceneText(std::string(craneCamera()) + "setAttr \".t"));
  write("other.ma", "//Maya is not all of a header\n");
  write("packed.ma", "\x1f\x8b");
  for (const char* const scene : {"crane.ma", "cut.ma", "other.ma", "packed.ma"}) {
    const ToolResult one = run({"check", "--jobs", "1", scene});
    const ToolResult more = run({"check", "--jobs", "2", scene});
    EXPECT_EQ(one.status, more.status) << scene;
    EXPECT_EQ(one.out, more.out);
    EXPECT_EQ(one.err, more.err);
    EXPECT_THAT(one.out, StartsWith(scene));
  }
}

TEST_F(CheckCommand, SaysWhereEachSettingStandsOrThatItIsTheDefault) {
  write("still.ma", "//Maya ASCII 2018 scene\ncurrentUnit -l centimeter -a degree -t pal;\n");
  const std::string out = run({"check", "still.ma"}).out;
  EXPECT_THAT(out, HasSubstr("  frame rate     25, pal (line 2)\n"));
  EXPECT_THAT(out, HasSubstr("  width          960 (default: the file does not say)\n"));
  EXPECT_THAT(out, HasSubstr("  range          the file does not say\n"));
}

// Every row of a driven lens, a locator and a look-at.
TEST_F(CheckCommand, TheHeadShowsLensesLocatorsAndLookAts) {
  write("shot.ma",
        sceneText("createNode transform -n \"cam\";\ncreateNode camera -n \"camShape\" -p \"cam\";\n"
                  "createNode locator -n \"nullShape\" -p \"cam\";\ncreateNode lookAt -n \"look\";\n"
                  "createNode animCurveTU -n \"zoom\";\n\tsetAttr \".tan\" 2;\n"
                  "\tsetAttr \".ktv[0:1]\" 1 40 5 80;\n"
                  "connectAttr \"zoom.o\" \"camShape.fl\";\n"
                  "connectAttr \"look.cr\" \"cam.r\";\n"
                  "createNode transform -n \"flat\";\n"
                  "createNode camera -n \"flatShape\" -p \"flat\";\n\tsetAttr \".o\" yes;\n"));
  const std::string out = run({"check", "shot.ma"}).out;
  EXPECT_THAT(out, HasSubstr("    focal length 40 to 80 mm, frames 1 to 5\n"
                             "      driven by  animCurveTU zoom, 2 keys (line "));
  EXPECT_THAT(out,
              HasSubstr("    angle        25.361 to 48.455 degrees across the picture, frames 1 to 5\n"));
  EXPECT_THAT(out,
              HasSubstr("    orthographic 10 centimeter across the picture (default: the file does not say)\n"
                        "    under        flat\n"));
  EXPECT_THAT(out, HasSubstr("    came over    a null layer with 0 keys for its place, under 0 nulls\n"));
  EXPECT_THAT(out, HasSubstr("    turns        cam\n    came over    nothing: it aims no camera\n"));
}

TEST_F(CheckCommand, LongListsOfTheHeadAreCutUnlessAllIsAskedFor) {
  std::string nodes = "createNode transform -n \"t0\";\n";
  std::string wires;
  for (int i = 1; i < 12; ++i) {
    const std::string n = std::to_string(i);
    nodes += "createNode transform -n \"t" + n + "\" -p \"t" + std::to_string(i - 1) + "\";\n";
    nodes += "createNode camera -n \"c" + n + "\" -p \"t" + n + "\";\n";
    wires += "connectAttr \"t0.tx\" \"t" + n + ".tx\";\nconnectAttr \"t0.ty\" \"t" + n + ".ty\";\n";
  }
  write("deep.ma", sceneText(nodes + wires));
  const std::string out = run({"check", "deep.ma"}).out;
  EXPECT_THAT(out, HasSubstr("  cameras        3 more (--all shows them)\n"));
  // The eighth camera: nine transforms, of which the topmost is not driven.
  EXPECT_THAT(out, HasSubstr("    under        1 more (--all shows them)\n"
                             "    channels     7 more (--all shows them)\n"));
  EXPECT_THAT(run({"check", "--all", "deep.ma"}).out, Not(HasSubstr("--all shows them")));
}

TEST_F(CheckCommand, AnErrorIsShownWithItsLineAndEndsWithOne) {
  write("refused.ma", sceneText("select -ne |shotcam;\n"));
  const ToolResult check = run({"check", "refused.ma"});
  EXPECT_EQ(check.status, 1);
  EXPECT_THAT(check.out, HasSubstr("refused.ma:"));
  EXPECT_THAT(check.out, HasSubstr(": error: "));
  EXPECT_THAT(check.out, HasSubstr("\nselect -ne |shotcam;\n"));
  EXPECT_THAT(check.out, HasSubstr("\nhelp: "));
  EXPECT_THAT(check.out, HasSubstr("refused.ma: 1 error, "));
}

TEST_F(CheckCommand, AFileThatIsNoSceneIsReported) {
  write("usd.ma", "#usda 1.0\n");
  const ToolResult check = run({"check", "usd.ma"});
  EXPECT_EQ(check.status, 1);
  EXPECT_THAT(check.out, HasSubstr("usd.ma: error: "));
  EXPECT_THAT(check.out, EndsWith("usd.ma: 1 error, no warnings, no notes\n"));
}

TEST_F(CheckCommand, AFileThatCannotBeReadStopsNoOtherScene) {
  write("still.ma", sceneText(stillCamera()));
  const ToolResult check = run({"check", "missing.ma", "still.ma"});
  EXPECT_EQ(check.status, 3);
  EXPECT_THAT(check.err, HasSubstr("missing.ma"));
  EXPECT_THAT(check.out, StartsWith("still.ma\n"));
}

TEST_F(CheckCommand, StrictCountsWarnings) {
  write("still.ma", sceneText(std::string(stillCamera()) + "currentUnit -t parsec;\n"));
  EXPECT_EQ(run({"check", "still.ma"}).status, 0);
  EXPECT_EQ(run({"check", "--strict", "still.ma"}).status, 1);
}

TEST_F(CheckCommand, QuietPrintsErrorsAlone) {
  write("warned.ma", sceneText(std::string(stillCamera()) + "currentUnit -t parsec;\n"));
  write("refused.ma", sceneText("currentUnit -t parsec;\nselect -ne |shotcam;\n"));
  EXPECT_THAT(run({"check", "--quiet", "warned.ma"}).out, IsEmpty());
  const std::string out = run({"check", "--quiet", "refused.ma"}).out;
  EXPECT_THAT(out, HasSubstr("error"));
  EXPECT_THAT(out, Not(HasSubstr("warning")));
}

TEST_F(CheckCommand, VerboseSaysALineForEachScene) {
  write("a.ma", sceneText(stillCamera()));
  write("b.ma", sceneText("select -ne |shotcam;\n"));
  const std::string err = run({"check", "--verbose", "a.ma", "b.ma"}).err;
  EXPECT_THAT(err, HasSubstr("mayascene: a.ma: no errors, "));
  EXPECT_THAT(err, HasSubstr("mayascene: b.ma: 1 error, "));
}

TEST_F(CheckCommand, OnlyShowsAndCountsOneCode) {
  write("shot.ma", sceneText("currentUnit -t parsec;\ncurrentUnit -l furlong;\nselect -ne |shotcam;\n"));
  const ToolResult units = run({"check", "--only", "ma0209", "shot.ma"});
  EXPECT_EQ(units.status, 0);
  EXPECT_THAT(units.out, EndsWith("shot.ma: no errors, 2 warnings, no notes\n"));
  EXPECT_THAT(units.out, Not(HasSubstr("error:")));
  EXPECT_EQ(run({"check", "--only", "MA9999", "shot.ma"}).status, 2);
}

TEST_F(CheckCommand, MoreThanTwentyOfACodeAreCounted) {
  std::string units;
  for (int i = 0; i < 25; ++i) units += "currentUnit -t parsec;\n";
  write("shot.ma", sceneText(units));  // nothing comes over: one more warning
  const std::string out = run({"check", "shot.ma"}).out;
  EXPECT_THAT(out, HasSubstr("shot.ma: 5 more of MA0209 (--all shows them)\n"));
  EXPECT_THAT(out, HasSubstr("no errors, 26 warnings"));
  EXPECT_THAT(run({"check", "--all", "shot.ma"}).out, Not(HasSubstr("more of")));
}

TEST_F(CheckCommand, SeveralScenesAreOneDocument) {
  write("a.ma", sceneText(craneCamera()));
  write("b.ma", sceneText("select -ne |shotcam;\n"));
  const ToolResult check = run({"check", "--json", "-", "a.ma", "b.ma", "missing.ma"});
  const json document = json::parse(check.out);
  EXPECT_EQ(document["format"], "mayascene-check-report");
  ASSERT_EQ(document["scenes"].size(), 3u);
  EXPECT_EQ(document["scenes"][0]["path"], "a.ma");
  EXPECT_EQ(document["scenes"][0]["head"]["cameras"][0]["layer"]["parents"], 1);
  EXPECT_EQ(document["scenes"][0]["head"]["timeUnit"]["value"], "film");
  EXPECT_EQ(document["scenes"][1]["errors"], 1);
  EXPECT_EQ(document["scenes"][1]["diagnostics"][0]["severity"], "error");
  EXPECT_EQ(document["scenes"][1]["status"], 1);
  EXPECT_EQ(document["scenes"][2]["head"], nullptr);
  EXPECT_EQ(document["scenes"][2]["status"], 3);
}

TEST_F(CheckCommand, ColourGoesToATerminalAlone) {
  write("refused.ma", sceneText("select -ne |shotcam;\n"));
  EXPECT_THAT(run({"check", "refused.ma"}).out, Not(HasSubstr("\x1b[")));
  EXPECT_THAT(runOnTerminal({"check", "refused.ma"}).out, HasSubstr("\x1b[31m"));
  environment["NO_COLOR"] = "1";
  EXPECT_THAT(runOnTerminal({"check", "refused.ma"}).out, Not(HasSubstr("\x1b[")));
}

TEST_F(CheckCommand, HostileNamesAreEscaped) {
  write("shot.ma", sceneText("createNode transform -n \"bad\x1b]0;name\";\n"
                             "createNode camera -n \"worse\xff\" -p \"bad\x1b]0;name\";\n"));
  const std::string out = run({"check", "shot.ma"}).out;
  EXPECT_THAT(out, HasSubstr("bad\\x1b]0;name"));
  EXPECT_THAT(out, HasSubstr("worse\\xff"));
  EXPECT_THAT(out, Not(HasSubstr("\x1b")));
  EXPECT_TRUE(json::accept(run({"check", "--json", "-", "shot.ma"}).out));
}

}  // namespace
}  // namespace mayascene_test
