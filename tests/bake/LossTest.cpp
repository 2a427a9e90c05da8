// Each kind of loss in a plain import is found, and none where all came over.
#include "bake/Loss.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <string_view>

#include "tests/bake/BakeFixture.h"

namespace {

using bake_test::CameraScene;
using bake_test::CurveOf;

constexpr const char* kResolution =
    "select -ne :defaultResolution;\n\tsetAttr \".w\" 640;\n\tsetAttr \".h\" 360;\n"
    "\tsetAttr \".dar\" 1.7777777;\n";

std::string Scene(std::string_view transform, std::string_view shape = "", std::string_view rest = "") {
  return CameraScene(transform, shape, std::string(rest) + kResolution);
}

// The import of the camera of `Scene`, of which all came over.
bake::CameOver Whole(std::size_t keys = 2, std::size_t zoomKeys = 0) {
  bake::CameOver import;
  import.cameras = {{.name = "shotCamShape", .keys = keys, .zoomKeys = zoomKeys, .above = {} }};
  import.layers = 1;
  import.width = 640;
  import.height = 360;
  import.pixelAspect = 1.0;
  import.framesPerSecond = 24.0;
  return import;
}

class Reading {
 public:
  explicit Reading(std::string text)
      : text_(std::move(text)), collector_(text_), scene_(scene::Read(text_, collector_)) {}

  // The sentence, empty where nothing is lost.
  std::string Lost(const bake::CameOver& import) {
    loss_ = bake::FindLoss(scene_, import);
    return loss_ ? loss_->sentence : "";
  }
  std::string Stopped(bake::Stop stop, std::uint32_t line, std::string_view layer = "") {
    loss_ = bake::FindStop(scene_, &collector_, stop, line, layer);
    return loss_ ? loss_->sentence : "";
  }
  // Of the last loss; 0 where the file does not say it.
  std::uint32_t Line() { return loss_->place ? collector_.lines().At(loss_->place->offset).line : 0; }
  const bake::Loss& loss() const { return *loss_; }

 private:
  std::string text_;
  diag::Collector collector_;
  scene::Scene scene_;
  std::optional<bake::Loss> loss_;
};

std::string Lost(const std::string& text, const bake::CameOver& import) { return Reading(text).Lost(import); }

// Two keys of spline tangents, ten frames apart, with an extreme between them.
constexpr const char* kCurved =
    "createNode animCurveTL -n \"c\";\n\tsetAttr \".tan\" 3;\n\tsetAttr \".wgt\" no;\n"
    "\tsetAttr -s 2 \".ktv[0:1]\" 1 0 11 5;\nconnectAttr \"c.o\" \"shotCam.tx\";\n";

TEST(LossTest, NothingIsLostOfAStillCameraAndOfStraightLines) {
  EXPECT_EQ(Lost(Scene(""), Whole(0)), "");
  EXPECT_EQ(Lost(Scene("", "", CurveOf("animCurveTL", "c", "1 0 11 5", "shotCam.tx")), Whole()), "");
}

TEST(LossTest, AKeyAtEveryFrameIsABakeWhateverItsTangents) {
  const std::string baked =
      "createNode animCurveTL -n \"c\";\n\tsetAttr \".tan\" 3;\n"
      "\tsetAttr -s 3 \".ktv[0:2]\" 1 0 2 5 3 -5;\nconnectAttr \"c.o\" \"shotCam.tx\";\n";
  EXPECT_EQ(Lost(Scene("", "", baked), Whole(3)), "");
}

TEST(LossTest, ThePathBetweenFewKeysWithCurvedTangentsIsLost) {
  Reading reading(Scene("", "", kCurved));
  EXPECT_EQ(reading.Lost(Whole()),
            "the path between the keys of \"shotCam\" on translateX does not come over");
  EXPECT_EQ(reading.Line(), 5u);
  EXPECT_TRUE(reading.loss().comesWithBake);
}

TEST(LossTest, HalfATurnBetweenTwoKeysComesOverTurningTheShorterWay) {
  EXPECT_EQ(
      Lost(Scene("", "", CurveOf("animCurveTA", "c", "1 0 11 180", "shotCam.ry")), Whole()),
      "\"shotCam\" turns by half a turn or more between two keys on rotateY, and comes over turning the "
      "shorter way");
  EXPECT_EQ(Lost(Scene("", "", CurveOf("animCurveTA", "c", "1 0 11 179", "shotCam.ry")), Whole()), "");
}

TEST(LossTest, ASingleKeyIsLostUnlessItIsTheStoredValue) {
  const std::string key =
      "createNode animCurveTL -n \"c\";\n\tsetAttr \".ktv[0]\" 1 7;\nconnectAttr \"c.o\" \"shotCam.ty\";\n";
  EXPECT_EQ(Lost(Scene("", "", key), Whole(0)),
            "\"shotCam\" has a single key on translateY, which does not come over");
  EXPECT_EQ(Lost(Scene("\tsetAttr \".t\" -type \"double3\" 0 7 0 ;\n", "", key), Whole(0)), "");
  // Beside a channel with two keys it comes over with each of them.
  EXPECT_EQ(Lost(Scene("", "", key + CurveOf("animCurveTL", "d", "1 0 11 5", "shotCam.tx")), Whole()), "");
}

TEST(LossTest, KeysThatTheImportDoesNotShowAreLost) {
  EXPECT_EQ(Lost(Scene("", "", CurveOf("animCurveTL", "c", "1 0 11 5", "shotCam.tx")), Whole(0)),
            "no key of \"shotCam\" on translateX comes over");
}

TEST(LossTest, KeysAtOtherTimesThanTheFirstChannelsAreLost) {
  EXPECT_EQ(Lost(Scene("", "",
                       CurveOf("animCurveTL", "c", "1 0 11 5", "shotCam.tx") +
                           CurveOf("animCurveTL", "d", "1 0 12 5", "shotCam.ty")),
                 Whole()),
            "the keys of \"shotCam\" on translateY stand at other times than those on translateX, and come "
            "over at the times of translateX");
}

TEST(LossTest, WhatOtherNodesMakeOfAChannelIsLost) {
  const std::string driven =
      "createNode unitConversion -n \"u\";\n\tsetAttr \".cf\" 2;\n"
      "connectAttr \"u.o\" \"shotCam.tz\";\n" +
      CurveOf("animCurveTU", "c", "1 0 2 5", "u.i");
  Reading reading(Scene("", "", driven));
  EXPECT_EQ(reading.Lost(Whole(0)),
            "what the node \"u\" makes of \"shotCam\" on translateZ does not come over");
  EXPECT_EQ(reading.Line(), 7u);
}

TEST(LossTest, ADriverThatGivesTheStoredValueLosesNothing) {
  const std::string driven =
      "createNode unitConversion -n \"u\";\n\tsetAttr \".cf\" 2;\n\tsetAttr \".i\" 3;\n"
      "connectAttr \"u.o\" \"shotCam.sx\";\n";
  EXPECT_EQ(Lost(Scene("\tsetAttr \".s\" -type \"double3\" 6 1 1 ;\n", "", driven), Whole(0)), "");
  EXPECT_NE(Lost(Scene("\tsetAttr \".s\" -type \"double3\" 5 1 1 ;\n", "", driven), Whole(0)), "");
}

TEST(LossTest, WhatABakeCannotEvaluateEitherIsReportedLastAndWithoutABake) {
  const std::string expression =
      "createNode expression -n \"e\";\nconnectAttr \"e.out[0]\" \"shotCam.tx\";\n";
  Reading reading(Scene("", "", expression));
  EXPECT_EQ(reading.Lost(Whole(0)),
            "what the node \"e\" makes of \"shotCam\" on translateX does not come over, and a bake cannot "
            "evaluate it either");
  EXPECT_FALSE(reading.loss().comesWithBake);
  EXPECT_EQ(Lost(Scene("\tsetAttr \".shxy\" 1;\n", "", expression), Whole(0)),
            "the shear of \"shotCam\" does not come over");
}

std::string LookAtScene() {
  return Scene("", "",
               "createNode transform -n \"target\";\n\tsetAttr \".t\" -type \"double3\" 5 5 5 ;\n"
               "createNode lookAt -n \"look\";\n\tsetAttr \".a\" -type \"double3\" 0 0 -1 ;\n"
               "connectAttr \"target.t\" \"look.tg[0].tt\";\nconnectAttr \"shotCam.t\" \"look.ct\";\n"
               "connectAttr \"look.crx\" \"shotCam.rx\";\n");
}

TEST(LossTest, ALookAtIsLostWhereTheCameraIsNotAimed) {
  EXPECT_EQ(Lost(LookAtScene(), Whole(0)),
            "what the look-at \"look\" makes of \"shotCam\" on rotateX does not come over");
  bake::CameOver aimed = Whole(0);
  aimed.cameras[0].aimed = true;
  EXPECT_EQ(Lost(LookAtScene(), aimed), "");
}

TEST(LossTest, AFocalLengthThatIsPassedOnIsLost) {
  const std::string passedOn =
      "createNode transform -n \"rig\";\n\taddAttr -ln \"lens\" -at double;\n\tsetAttr \".lens\" 50;\n"
      "connectAttr \"rig.lens\" \"shotCamShape.fl\";\n";
  EXPECT_EQ(Lost(Scene("", "", passedOn), Whole(0)),
            "what the node \"rig\" makes of \"shotCamShape\" on focalLength does not come over");
  EXPECT_EQ(Lost(Scene("", "\tsetAttr \".fl\" 50;\n", passedOn), Whole(0)), "");
}

TEST(LossTest, TheFormsOfATransformThatTheImportDoesNotReadAreLost) {
  const std::string turned = "\tsetAttr \".r\" -type \"double3\" 10 20 0 ;\n";
  const auto lost = [](const std::string& text) { return Lost(Scene(text), Whole(0)); };
  EXPECT_EQ(lost(turned + "\tsetAttr \".ro\" 1;\n"), "the rotate order of \"shotCam\" does not come over");
  EXPECT_EQ(lost(turned + "\tsetAttr \".ro\" 2;\n"), "");  // x before y there, too
  EXPECT_EQ(lost("\tsetAttr \".r\" -type \"double3\" 10 0 0 ;\n\tsetAttr \".ro\" 2;\n"), "");
  EXPECT_EQ(lost("\tsetAttr \".r\" -type \"double3\" 10 0 20 ;\n\tsetAttr \".ro\" 3;\n"), "");
  EXPECT_EQ(lost("\tsetAttr \".ra\" -type \"double3\" 0 0 9 ;\n"),
            "the rotate axis of \"shotCam\" does not come over");
  EXPECT_EQ(lost("\tsetAttr \".rpt\" -type \"double3\" 0 0 9 ;\n"),
            "the translation of the rotate pivot of \"shotCam\" does not come over");
  EXPECT_EQ(lost("\tsetAttr \".spt\" -type \"double3\" 0 9 0 ;\n"),
            "the translation of the scale pivot of \"shotCam\" does not come over");
  EXPECT_EQ(lost("\tsetAttr \".rp\" -type \"double3\" 0 0 9 ;\n"), "");
}

TEST(LossTest, WhatStandsAboveACameraComesOverByItsNames) {
  const std::string text =
      "createNode transform -n \"top\";\ncreateNode transform -n \"rig\" -p \"top\";\n"
      "createNode transform -n \"cam\" -p \"rig\";\ncreateNode camera -n \"shotCamShape\" -p \"cam\";\n" +
      std::string(kResolution);
  bake::CameOver import = Whole(0);
  const std::string lost = "what stands above the camera \"shotCamShape\" does not come over";
  EXPECT_EQ(Lost(text, import), lost);
  import.cameras[0].above = {{ "rig", 0 }};
  EXPECT_EQ(Lost(text, import), lost);
  import.cameras[0].above = {{"rig", 0}, { "other", 0 }};
  EXPECT_EQ(Lost(text, import), lost);
  import.cameras[0].above = {{"rig", 0}, { "top", 0 }};
  EXPECT_EQ(Lost(text, import), "");
}

TEST(LossTest, ANodeThatTakesNothingOverFromAboveIsLost) {
  const std::string text =
      "createNode transform -n \"rig\";\ncreateNode transform -n \"cam\" -p \"rig\";\n"
      "\tsetAttr \".it\" no;\ncreateNode camera -n \"shotCamShape\" -p \"cam\";\n";
  EXPECT_EQ(Lost(text, Whole(0)), "the independence from what stands above of \"cam\" does not come over");
}

TEST(LossTest, AParentInAnotherFileIsLostForABakeToo) {
  const std::string text =
      "createNode transform -n \"cam\" -p \"ref:rig\";\n"
      "createNode camera -n \"shotCamShape\" -p \"cam\";\n" +
      std::string(kResolution);
  bake::CameOver import = Whole(0);
  import.cameras[0].above = {{ "ref:rig", 0 }};
  Reading reading(text);
  EXPECT_EQ(reading.Lost(import),
            "the camera \"shotCamShape\" stands under \"ref:rig\", which is in another file");
  EXPECT_FALSE(reading.loss().comesWithBake);
}

TEST(LossTest, NodesThatAreKeyedFromDifferentFramesAreLost) {
  const std::string lens = CurveOf("animCurveTU", "f", "5 35 11 50", "shotCamShape.fl");
  const std::string place = CurveOf("animCurveTL", "c", "1 0 11 5", "shotCam.tx");
  EXPECT_EQ(
      Lost(Scene("", "", place + lens), Whole(2, 2)),
      "the keys of \"shotCamShape\" begin at another frame than those below it, and come over from the same "
      "frame on");
  EXPECT_EQ(Lost(Scene("", "", lens), Whole(0, 2)), "");
  std::string clock = Scene("", "", place + lens);
  clock.replace(clock.find("film"), 4, "game");
  EXPECT_EQ(Lost(clock, Whole(2, 2)),
            "the rate of 15 frames a second comes over as 24");  // keys keep their times
  EXPECT_EQ(Lost(Scene("", "", lens), Whole(0, 0)), "no key of \"shotCamShape\" on focalLength comes over");
}

TEST(LossTest, WhatOfALensTheImportDoesNotReadIsLost) {
  const auto lost = [](const std::string& lens, const std::string& rest = "") {
    return Lost(Scene("", lens, rest), Whole(0));
  };
  const std::string high = "\tsetAttr \".cap\" -type \"double2\" 1 0.2 ;\n";
  EXPECT_EQ(lost(high + "\tsetAttr \".ff\" 0;\n"),
            "the film fit of \"shotCamShape\" comes over as horizontal, and is vertical");
  EXPECT_EQ(lost(high + "\tsetAttr \".ff\" 2;\n"), "");
  EXPECT_EQ(lost("\tsetAttr \".ff\" 0;\n"), "");
  EXPECT_EQ(lost("\tsetAttr \".cs\" 2;\n"), "the camera scale of \"shotCamShape\" does not come over");
  EXPECT_EQ(lost("\tsetAttr \".lsr\" 2;\n"), "the lens squeeze of \"shotCamShape\" does not come over");
  EXPECT_EQ(lost("", CurveOf("animCurveTU", "a", "1 1 11 2", "shotCamShape.hfa")),
            "no key of \"shotCamShape\" on horizontalFilmAperture comes over");
}

TEST(LossTest, ACameraThatIsNotThereIsLost) {
  bake::CameOver import = Whole(0);
  import.cameras.clear();
  EXPECT_EQ(Lost(Scene(""), import), "the camera \"shotCamShape\" does not come over");
}

TEST(LossTest, OfTwoCamerasOfOneNameEachHasItsLayer) {
  const std::string text = Scene("", "",
                                 "createNode transform -n \"b\";\n"
                                 "createNode camera -n \"shotCamShape\" -p \"b\";\n" +
                                     CurveOf("animCurveTL", "c", "1 0 11 5", "b.tx"));
  bake::CameOver import = Whole(0);
  EXPECT_EQ(Lost(text, import), "the camera \"shotCamShape\" does not come over");
  import.cameras.push_back(import.cameras[0]);
  EXPECT_EQ(Lost(text, import), "no key of \"b\" on translateX comes over");
  import.cameras[1].keys = 2;
  EXPECT_EQ(Lost(text, import), "");
}

TEST(LossTest, ThePictureAndTheRateComeLast) {
  bake::CameOver import = Whole(0);
  import.width = 720;
  import.height = 486;
  Reading reading(Scene(""));
  EXPECT_EQ(reading.Lost(import),
            "the picture of 640 by 360, pixel aspect 1, comes over as 720 by 486, pixel aspect 1");
  EXPECT_EQ(reading.Line(), 5u);
  import = Whole(0);
  import.framesPerSecond = 30;
  EXPECT_EQ(reading.Lost(import), "the rate of 24 frames a second comes over as 30");
  EXPECT_EQ(reading.Line(), 2u);
}

TEST(LossTest, OrthographicAndStartupCamerasAreNoLoss) {
  const std::string text =
      "createNode camera -s -n \"perspShape\";\ncreateNode camera -n \"plan\";\n"
      "\tsetAttr \".o\" yes;\n";
  EXPECT_EQ(Lost(text, {}), "");
}

TEST(LossTest, LocatorsWithoutAMarkAreReportedWhereNothingElseComesOver) {
  const std::string locator = "createNode transform -n \"l\";\ncreateNode locator -n \"lShape\" -p \"l\";\n";
  Reading reading(locator);
  EXPECT_EQ(reading.Lost({}), "the locator \"lShape\" has no \"null\" in its name");
  EXPECT_FALSE(reading.loss().comesWithBake);
  EXPECT_EQ(Lost(Scene("", "", locator), Whole(0)), "");
  EXPECT_EQ(Lost("createNode locator -n \"a_null\";\n", {}),
            "the locator \"a_null\" does not come over without a camera");
}

TEST(LossTest, NamesAreEscapedAndShort) {
  const std::string name = "\x1b[31m" + std::string(300, 'x');
  const std::string sentence = Lost("createNode camera -n \"" + name + "\";\n", {});
  EXPECT_EQ(sentence, "the camera \"\\x1b[31m" + std::string(95, 'x') + "...\" does not come over");
}

TEST(LossTest, ALayerHasTheNameAsItIsWritten) {
  bake::CameOver import = Whole(0);
  import.cameras[0].name = "a\\\"b";
  EXPECT_EQ(Lost("createNode camera -n \"a\\\"b\";\n" + std::string(kResolution), import), "");
}

TEST(LossTest, AByteThatEndsTheReadingIsExplainedByItsLine) {
  Reading reading(
      "file -rdi 1 -ns \"a|b\" -rfn\n\t\t2 |rig|head \"v\";\n\tsetAttr \".aal\" -type \"attributeAlias\" "
      "{\"a\",\"b\"} ;\n"
      "<<<<<<< HEAD\ncurrentUnit -t {{FPS}};\nx = {1};\ny #;\n");
  EXPECT_EQ(reading.Stopped(bake::Stop::kByte, 2),
            "a path without quotes, as edits of references have them, ends the import");
  EXPECT_EQ(reading.Line(), 2u);
  EXPECT_EQ(reading.Stopped(bake::Stop::kByte, 3), "a list of attribute aliases ends the import");
  EXPECT_EQ(reading.Stopped(bake::Stop::kByte, 4), "the mark of a merge conflict ends the import");
  EXPECT_EQ(reading.Stopped(bake::Stop::kByte, 5), "a template field that nobody filled in ends the import");
  EXPECT_EQ(reading.Stopped(bake::Stop::kByte, 7), "a character that no word can begin with ends the import");
  EXPECT_EQ(reading.Stopped(bake::Stop::kByte, 1), "a character that no word can begin with ends the import");
  EXPECT_EQ(reading.Stopped(bake::Stop::kNumber, 6), "a number that cannot be read ends the import");
  EXPECT_EQ(reading.Line(), 6u);
}

TEST(LossTest, ALineEndsWithALineFeedACarriageReturnOrBoth) {
  const std::string text = "createNode transform;\rcreateNode camera;\r\nsetAttr \".fl\" 1e999;\rselect x;\n";
  Reading reading(text);
  EXPECT_EQ(reading.Stopped(bake::Stop::kNumber, 3), "a number that cannot be read ends the import");
  const diag::Range place = reading.loss().place.value();
  EXPECT_EQ(text.substr(place.offset, place.length), "setAttr \".fl\" 1e999;");
}

TEST(LossTest, TheEndOfTheTextIsExplainedByWhatItCutsOff) {
  const auto stopped = [](const std::string& text) { return Reading(text).Stopped(bake::Stop::kEnd, 1); };
  EXPECT_EQ(stopped("createNode camera;\n// End of scene.ma"),
            "a comment in the last line, without a line end, ends the import");
  EXPECT_EQ(stopped("createNode camera;\nsetAttr \".b\" \"open"),
            "a string without its closing quote ends the import");
  EXPECT_EQ(stopped("createNode camera;\n/* open\n"), "a comment without its end ends the import");
  EXPECT_EQ(stopped("createNode camera;\nsetAttr \".fl\" 3"),
            "a command that the file cuts off ends the import");
}

TEST(LossTest, UnequalKeyCountsNameTheNodeOfTheLastLayer) {
  const auto unequal = [](const std::string& node) {
    return CurveOf("animCurveTL", node + "x", "1 0 11 5", node + ".tx") + "createNode animCurveTL -n \"" +
           node + "y\";\n\tsetAttr \".ktv[0:2]\" 1 0 2 1 3 4;\nconnectAttr \"" + node + "y.o\" \"" + node +
           ".ty\";\n";
  };
  Reading reading(
      "createNode transform -n \"a\";\ncreateNode camera -n \"aShape\" -p \"a\";\n"
      "createNode transform -n \"b\";\ncreateNode camera -n \"bShape\" -p \"b\";\n" +
      unequal("a") + unequal("b"));
  const std::string rest =
      " has 2 keys on translateX and 3 keys on translateY: different numbers of keys end the import";
  EXPECT_EQ(reading.Stopped(bake::Stop::kKeyCounts, 0, "bShape"), "\"b\"" + rest);
  EXPECT_EQ(reading.Line(), 18u);
  EXPECT_EQ(reading.Stopped(bake::Stop::kKeyCounts, 0, "b"), "\"b\"" + rest);
  EXPECT_EQ(reading.Stopped(bake::Stop::kKeyCounts, 0, "elsewhere"), "\"a\"" + rest);
  EXPECT_EQ(Reading(Scene("")).Stopped(bake::Stop::kKeyCounts, 0, "shotCamShape"), "");
}

}  // namespace
