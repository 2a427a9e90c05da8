// What `mayascene import` prints, compared whole.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using ImportCommand = ToolTest;

constexpr const char* kStillLayers =
    "  camera \"shotcamShape\"\n"
    "      zoom               640 px\n"
    "      film size          72 pt (25.4 mm) horizontally\n"
    "      position           1.5, -2, -3 pt\n"
    "      X rotation         0 deg\n"
    "      Y rotation         0 deg\n"
    "      Z rotation         0 deg\n"
    "      scale              100, 100, 100 %\n"
    "      point of interest  0, 0, 0 pt\n";

TEST_F(ImportCommand, AStillCameraIsOneLayerWithItsValues) {
  write("still.ma", sceneText(stillCamera()));
  const ToolResult result = run({"import", "--verbose", "still.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out, std::string("still.ma: 1 composition, 1 camera, 0 nulls, 0 keys\n"
                                    "\n"
                                    "\"still\"   640 x 360 px, pixel aspect 1, 24 fps, 10 s (240 frames)\n") +
                            kStillLayers);
  EXPECT_EQ(result.err, "mayascene: still.ma: kept by design: file still.ma\n");
}

TEST_F(ImportCommand, InShortALayerIsALineAndTheFileObjectIsInTheJsonAlone) {
  write("crane.ma", sceneText(craneCamera()));
  const ToolResult result = run({"import", "crane.ma", "--json", "crane.json"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out,
            "crane.ma: 1 composition, 1 camera, 1 null, 15 keys\n"
            "\n"
            "\"crane\"   640 x 360 px, pixel aspect 1, 24 fps, 0.125 s (3 frames)\n"
            "  null \"boom\"   rotation animated, frames 0 to 2\n"
            "    camera \"shotcamShape\"   lens 25.4 mm   still\n");
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(nlohmann::json::parse(read("crane.json"))["scenes"][0]["leftovers"],
            nlohmann::json::parse(R"([{"description": "file crane.ma", "keptByDesign": true}])"));
}

TEST_F(ImportCommand, ACraneShotIsATreeWithKeys) {
  write("crane.ma", sceneText(craneCamera()));
  const ToolResult result = run({"import", "-v", "crane.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out,
            "crane.ma: 1 composition, 1 camera, 1 null, 15 keys\n"
            "\n"
            "\"crane\"   640 x 360 px, pixel aspect 1, 24 fps, 0.125 s (3 frames)\n"
            "  null \"boom\"\n"
            "      position           (0, 0, 0 pt)        3 keys, frames 0 to 2 (0 s to 0.083 s), constant\n"
            "      X rotation         (0 deg)             3 keys, frames 0 to 2 (0 s to 0.083 s)\n"
            "      Y rotation         (0 deg)             3 keys, frames 0 to 2 (0 s to 0.083 s), constant\n"
            "      Z rotation         (0 deg)             3 keys, frames 0 to 2 (0 s to 0.083 s), constant\n"
            "      scale              (100, 100, 100 %)   3 keys, frames 0 to 2 (0 s to 0.083 s), constant\n"
            "      anchor point       0, 0, 0 pt\n"
            "    camera \"shotcamShape\"\n"
            "        zoom               640 px\n"
            "        film size          72 pt (25.4 mm) horizontally\n"
            "        position           0, 0, -10 pt\n"
            "        X rotation         0 deg\n"
            "        Y rotation         0 deg\n"
            "        Z rotation         0 deg\n"
            "        scale              100, 100, 100 %\n"
            "        point of interest  0, 0, 0 pt\n");
}

TEST_F(ImportCommand, PixelsThatAreNotSquareGiveTwoCompositions) {
  write("wide.ma", sceneText("\tsetAttr \".pa\" 2;\n" + std::string(stillCamera())));
  const ToolResult result = run({"import", "-v", "wide.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out.find(
                "wide.ma: 2 compositions, 1 camera, 0 nulls, 0 keys\n\n\"Square wide\"   1280 x 360 px, "
                "pixel aspect 1, 24 fps, 10 s (240 frames)\n  camera \"shotcamShape\"\n"),
            0u)
      << result.out;
  EXPECT_NE(result.out.find("\n\"wide\"   640 x 360 px, pixel aspect 2, 24 fps, 10 s (240 frames)\n"
                            "  composition \"Square wide\"\n"),
            std::string::npos)
      << result.out;
}

TEST_F(ImportCommand, SeveralScenesFollowEachOtherInOneProject) {
  write("one.ma", sceneText(stillCamera()));
  write("two.ma", sceneText(stillCamera()));
  const ToolResult result = run({"import", "one.ma", "two.ma", "--json", "both.json"});
  EXPECT_EQ(result.status, 0);
  EXPECT_NE(result.out.find("   still\n\ntwo.ma: 1 composition"), std::string::npos) << result.out;
  const auto scenes = nlohmann::json::parse(read("both.json"))["scenes"];
  ASSERT_EQ(scenes.size(), 2u);
  EXPECT_EQ(scenes[0]["compositions"][0]["number"], 1);
  EXPECT_EQ(scenes[1]["compositions"][0]["number"], 2);
  EXPECT_EQ(scenes[1]["compositions"][0]["layers"][0]["number"], 2);
}

TEST_F(ImportCommand, ASceneWithoutCamerasIsNoFailure) {
  write("rig.ma", sceneText("createNode transform -n \"rig\";\n"));
  const ToolResult result = run({"import", "rig.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out, "rig.ma: nothing to import, the scene has no cameras\n");
}

TEST_F(ImportCommand, ASceneWithOnlyTheDefaultCameraIsAnEmptyComposition) {
  write("persp.ma", sceneText("createNode camera -n \"perspShape\";\n"));
  const ToolResult result = run({"import", "persp.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out,
            "persp.ma: 1 composition, 0 cameras, 0 nulls, 0 keys\n\n"
            "\"persp\"   640 x 360 px, pixel aspect 1, 24 fps, 10 s (240 frames)\n  no layers\n");
}

TEST_F(ImportCommand, WhatIsNoMayaAsciiIsRefusedWithTheImportersMessage) {
  write("notes.txt", "just some notes\n");
  const ToolResult result = run({"import", "notes.txt"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out,
            "notes.txt: nothing was imported\n\nmessages\n  Only Baked Maya Ascii files are supported.\n");
  EXPECT_EQ(result.err, "mayascene: notes.txt: refused: it is not a Maya ASCII scene\n");
}

TEST_F(ImportCommand, ACodeIsReportedWithNameAndMeaningAndWhatWasMadeStays) {
  write("uneven.ma", sceneText(std::string(craneCamera()) + "createNode animCurveTA -n \"boom_rotateY\";\n"
                                                            "\tsetAttr -s 2 \".ktv[0:1]\" 1 0 2 7.5;\n"
                                                            "connectAttr \"boom_rotateY.o\" \"boom.ry\";\n"));
  const ToolResult result = run({"import", "uneven.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out.find("uneven.ma: 1 composition, 1 camera, 1 null, 0 keys (incomplete)\n"), 0u);
  EXPECT_NE(result.out.find("\nmessages\n  Inconsistant number of keyframes for Maya camera.\n"),
            std::string::npos)
      << result.out;
  EXPECT_NE(result.err.find(
                "mayascene: uneven.ma: error 1289987 (MAYA_KEY_COUNTS): the animated channels of a node "
                "have different numbers of keys; bake the scene first\n"),
            std::string::npos)
      << result.err;
}

TEST_F(ImportCommand, AFailureOfTheTextIsReportedWithItsLine) {
  write("byte.ma",
        "//Maya ASCII 2016 scene\n/* two\nthree */\ncreateNode camera -n \"c\";\n\tsetAttr \".fl\" #35;\n");
  write("end.ma",
        "//Maya ASCII 2016 scene\ncreateNode camera -n \"c\";\n\tsetAttr \".fl\" 35;\nselect \"open;\n\n");
  write("number.ma", "//Maya ASCII 2016 scene\ncreateNode camera -n \"c\";\n\tsetAttr \".fl\" 1e999;\n");
  EXPECT_EQ(
      run({"import", "--quiet", "byte.ma"}).err,
      "mayascene: byte.ma: message: Error reading Maya file.\n"
      "mayascene: byte.ma: error 1289985 (MAYA_SYNTAX): the scene holds a character that cannot start a word "
      "there, line 5\n"
      "mayascene: byte.ma: line 5: a character that no word can begin with ends the import. To bring it "
      "over: "
      "mayascene import --bake byte.ma\n");
  EXPECT_EQ(
      run({"import", "--quiet", "end.ma"}).err,
      "mayascene: end.ma: message: Unexpected end of maya file.\n"
      "mayascene: end.ma: error 1289986 (MAYA_UNEXPECTED_END): the scene ends inside a string, a comment, a "
      "word or a command, line 4\n"
      "mayascene: end.ma: line 4: a string without its closing quote ends the import. To bring it over: "
      "mayascene import --bake end.ma\n");
  EXPECT_EQ(run({"import", "--quiet", "number.ma"}).err,
            "mayascene: number.ma: error 2002 (NUMBER_RANGE): a number is too large to be held, line 3\n"
            "mayascene: number.ma: line 3: a number that cannot be read ends the import. To bring it over: "
            "mayascene import --bake number.ma\n");
  const ToolResult both = run({"import", "--quiet", "--json", "-", "byte.ma", "number.ma"});
  const auto scenes = nlohmann::json::parse(both.out)["scenes"];
  EXPECT_EQ(scenes[0]["error"]["line"], 5);
  EXPECT_EQ(scenes[1]["error"]["line"], 3);
}

TEST_F(ImportCommand, QuietPrintsNothingButErrors) {
  write("still.ma", sceneText(stillCamera()));
  write("notes.txt", "just some notes\n");
  const ToolResult good = run({"import", "--quiet", "still.ma"});
  EXPECT_EQ(good.status, 0);
  EXPECT_EQ(good.out + good.err, "");
  const ToolResult bad = run({"import", "--quiet", "notes.txt"});
  EXPECT_EQ(bad.status, 1);
  EXPECT_EQ(bad.out, "");
  EXPECT_EQ(bad.err,
            "mayascene: notes.txt: message: Only Baked Maya Ascii files are supported.\n"
            "mayascene: notes.txt: refused: it is not a Maya ASCII scene\n");
}

TEST_F(ImportCommand, ItRunsFromAnyFolder) {
  write("still.ma", sceneText(stillCamera()));
  workingFolder = "/";
  EXPECT_EQ(run({"import", path("still.ma")}).status, 0);
}

}  // namespace
}  // namespace mayascene_test
