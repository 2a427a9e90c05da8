// What cameras look at and marked locators stand under has diagnostics of its own.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;
using testing::AllOf;
using testing::HasSubstr;

std::string Transform(const std::string& name, const std::string& parent, const std::string& rest) {
  return "createNode transform -n \"" + name + (parent.empty() ? "" : "\" -p \"" + parent) + "\";\n" + rest;
}

// "shotCam" looks at "aim", which the caller makes.
std::string AimedScene(const std::string& aim,
                       const std::string& look = "\tsetAttr \".a\" -type \"double3\" 0 0 -1 ;\n") {
  return CameraScene("\tsetAttr \".t\" -type \"double3\" 0 0 10 ;\n", "",
                     aim + "createNode lookAt -n \"look\";\n" + look +
                         "connectAttr \"look.constraintRotate\" \"shotCam.rotate\";\n"
                         "connectAttr \"shotCam.translate\" \"look.constraintTranslate\";\n"
                         "connectAttr \"aim.translate\" \"look.target[0].targetTranslate\";\n");
}

TEST(LinksTest, ATargetThatComesOverAsItIsGetsNoWarning) {
  const Checked checked(AimedScene(Transform("aim", "", "\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n")));
  ASSERT_EQ(checked.cameOver().layers.size(), 1u);
  EXPECT_TRUE(checked.cameOver().layers.front().aimed);
  EXPECT_EQ(checked.All(), "");
}

TEST(LinksTest, ATargetUnderAMovedNodeLosesIt) {
  const Checked checked(AimedScene(Transform("still", "", "") +
                                   Transform("rig", "still", "\tsetAttr \".t\" -type \"double3\" 0 7 0 ;\n") +
                                   Transform("aim", "rig", "")));
  EXPECT_THAT(checked.SentenceOf(Code::TargetLosesItsChain),
              AllOf(HasSubstr("\"aim\""), HasSubstr("\"shotCamShape\""), HasSubstr("\"rig\"")));
  const Checked unmoved(AimedScene(Transform("rig", "", "") + Transform("aim", "rig", "")));
  EXPECT_EQ(unmoved.CountOf(Code::TargetLosesItsChain), 0u);
}

TEST(LinksTest, WhatMovesATargetIsLookedAtAsWhatMovesACamera) {
  const std::string aim = Transform("aim", "", "");
  const Checked one(AimedScene(aim + CurveOf("aimX", "5 3", "aim.tx")));
  EXPECT_THAT(one.SentenceOf(Code::ChannelsOfOneKey), HasSubstr("\"aim\""));
  const Checked curved(AimedScene(aim + CurveOf("aimX", "1 0 65 100", "aim.tx", "animCurveTL", 3)));
  EXPECT_THAT(curved.SentenceOf(Code::KeysAreNoBake), HasSubstr("\"aim\""));
  const Checked driven(AimedScene(aim + "createNode multiplyDivide -n \"half\";\n"
                                        "connectAttr \"half.ox\" \"aim.tx\";\n"));
  EXPECT_THAT(driven.SentenceOf(Code::DrivenByNoCurve), AllOf(HasSubstr("\"aim\""), HasSubstr("\"half\"")));
  // The importer takes the translation of a target alone.
  const Checked turned(AimedScene(aim + CurveOf("aimR", "5 30", "aim.rx", "animCurveTA")));
  EXPECT_EQ(turned.CountOf(Code::ChannelsOfOneKey), 0u);
}

TEST(LinksTest, ALocatorUnderANodeThatIsNotTakenLosesItsPlace) {
  const std::string locator =
      "createNode joint -n \"hand\";\n\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n"
      "createNode locator -n \"hand_null\" -p \"hand\";\n";
  const Checked joint(CameraScene("", "", locator));
  EXPECT_THAT(joint.SentenceOf(Code::ParentNotImported),
              AllOf(HasSubstr("\"hand_null\""), HasSubstr("\"hand\""), HasSubstr("joint")));
  const Checked path(
      CameraScene("", "", Transform("rig", "", "") + "createNode locator -n \"rig_null\" -p \"|rig\";\n"));
  EXPECT_EQ(path.MarkedBy(Code::ParentIsPath), "|rig");
}

TEST(LinksTest, WithoutACameraNothingComesOverAndOneDiagnosticSaysSo) {
  const std::string locators = Transform("a", "", "") +
                               "createNode locator -n \"a_null\" -p \"a\";\n"
                               "createNode joint -n \"b\";\n"
                               "createNode locator -n \"b_null\" -p \"b\";\n";
  const Checked marked(kHead + kResolution + locators);
  EXPECT_THAT(marked.SentenceOf(Code::LocatorsWithoutCamera), HasSubstr(": 2, "));
  EXPECT_EQ(marked.MarkedBy(Code::LocatorsWithoutCamera), "a_null");
  EXPECT_EQ(marked.CountOf(Code::ParentNotImported), 0u);
  const Checked empty(kHead + kResolution + Transform("a", "", ""));
  EXPECT_EQ(empty.CountOf(Code::NoCameraToImport), 1u);
  EXPECT_EQ(empty.report().warnings, 1u);
  const Checked some(CameraScene("", "", locators));
  EXPECT_EQ(some.CountOf(Code::LocatorsWithoutCamera) + some.CountOf(Code::NoCameraToImport), 0u);
}

TEST(LinksTest, WhatStandsAboveALostParentIsLostWithItAndIsNotNamed) {
  const std::string chain =
      "createNode transform -n \"top\";\n\tsetAttr \".ro\" 3;\n\tsetAttr \".r\" -type \"double3\" 10 20 30 "
      ";\n"
      "createNode joint -n \"bone\" -p \"top\";\n"
      "createNode transform -n \"shotCam\" -p \"bone\";\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n";
  const Checked checked(kHead + kResolution + chain + CurveOf("topX", "2 0 3 5", "top.tx") +
                        CurveOf("camX", "10 0 11 5", "shotCam.tx"));
  EXPECT_EQ(checked.CountOf(Code::ParentNotImported), 1u);
  EXPECT_EQ(checked.CountOf(Code::RotateOrderLost) + checked.CountOf(Code::KeysStartApart), 0u);
}

TEST(LinksTest, AParentCommandIsNotRead) {
  const std::string rig = "createNode transform -n \"rig\";\n\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n";
  const Checked under(CameraScene("", "", rig + "parent \"shotCam\" \"rig\";\n"));
  EXPECT_THAT(under.SentenceOf(Code::ParentByCommand),
              AllOf(HasSubstr("\"shotCam\""), HasSubstr("under \"rig\"")));
  EXPECT_EQ(under.CountOf(Code::PictureShifts), 1u);
  const std::string camera =
      "createNode transform -n \"shotCam\" -p \"rig\";\ncreateNode camera -n \"shape\" -p \"shotCam\";\n";
  const Checked outOf(kHead + kResolution + rig + camera + "parent -w \"shotCam\";\n");
  EXPECT_THAT(outOf.SentenceOf(Code::ParentByCommand), HasSubstr("out of \"rig\""));
  const Checked same(kHead + kResolution + rig + camera + "parent \"shotCam\" \"rig\";\n");
  EXPECT_EQ(same.CountOf(Code::ParentByCommand), 0u);
}

TEST(LinksTest, WhatALookAtTurnsBesidesItsAimIsLost) {
  const auto aimed = [](const std::string& values) {
    return Checked(AimedScene(Transform("aim", "", "\tsetAttr \".t\" -type \"double3\" 5 0 -9 ;\n"), values));
  };
  const std::string own = "\tsetAttr \".a\" -type \"double3\" 0 0 -2 ;\n";
  EXPECT_EQ(aimed(own).CountOf(Code::LookAtTurnLost), 0u);
  EXPECT_THAT(aimed(own + "\tsetAttr \".o\" -type \"double3\" 0 15 0 ;\n").SentenceOf(Code::LookAtTurnLost),
              HasSubstr("its offset is lost"));
  EXPECT_THAT(aimed(own + "\tsetAttr \".tws\" 30;\n").SentenceOf(Code::LookAtTurnLost),
              HasSubstr("its twist is lost"));
  EXPECT_THAT(aimed("\tsetAttr \".a\" -type \"double3\" 1 0 0 ;\n").SentenceOf(Code::LookAtTurnLost),
              HasSubstr("its aim vector is lost"));
}

TEST(LinksTest, LocatorsAndTargetsThatStartApartFromTheCameraAreNamed) {
  const std::string moving = CurveOf("camX", "10 0 11 5", "shotCam.tx");
  const std::string locator = Transform("mark", "", "") +
                              "createNode locator -n \"mark_null\" -p \"mark\";\n" +
                              CurveOf("markX", "4 0 5 2", "mark.tx");
  const Checked late(CameraScene("", "", moving + locator));
  EXPECT_THAT(late.SentenceOf(Code::KeysStartApart),
              AllOf(HasSubstr("\"mark\" begins at frame 4"), HasSubstr("\"shotCam\" at frame 10")));
  const Checked aim(AimedScene(Transform("aim", "", "") + CurveOf("aimX", "6 0 7 2", "aim.tx") + moving));
  EXPECT_THAT(aim.SentenceOf(Code::KeysStartApart), HasSubstr("\"aim\" begins at frame 6"));
  const Checked together(CameraScene("", "", CurveOf("camX", "4 0 5 5", "shotCam.tx") + locator));
  EXPECT_EQ(together.CountOf(Code::KeysStartApart), 0u);
}

}  // namespace
}  // namespace check_test
