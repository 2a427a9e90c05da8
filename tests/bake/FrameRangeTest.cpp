#include "bake/FrameRange.h"

#include <gtest/gtest.h>

#include <string>

#include "tests/bake/BakeFixture.h"

namespace {

using bake_test::Baked;
using bake_test::CameraScene;
using bake_test::CurveOf;

std::string Playback(const std::string& options) {
  return "createNode script -n \"sceneConfigurationScriptNode\";\n\tsetAttr \".b\" -type \"string\" "
         "\"playbackOptions " +
         options + " \";\n\tsetAttr \".st\" 6;\n";
}

void ExpectFrames(const Baked& baked, double first, double last) {
  ASSERT_TRUE(baked.report().frames.has_value());
  EXPECT_DOUBLE_EQ(baked.report().frames->first, first);
  EXPECT_DOUBLE_EQ(baked.report().frames->Last(), last);
}

TEST(FrameRange, NothingThatMovesAndNothingThatPlaysIsFrame1) { ExpectFrames(Baked(CameraScene("")), 1, 1); }

TEST(FrameRange, WhatTheScenePlaysIsBaked) {
  ExpectFrames(Baked(CameraScene("", "", Playback("-min 1001 -max 1100 -ast 1 -aet 2000"))), 1001, 1100);
}

TEST(FrameRange, KeysBeyondWhatPlaysAreTakenInOutwardToWholeFrames) {
  const std::string curve = CurveOf("animCurveTL", "c", "-3.5 1 20.25 2", "shotCam.tx");
  ExpectFrames(Baked(CameraScene("", "", curve + Playback("-min 1 -max 10"))), -4, 21);
}

TEST(FrameRange, KeysThatMoveNothingThatIsWrittenDoNotCount) {
  const std::string other =
      "createNode transform -n \"other\";\n" + CurveOf("animCurveTL", "c", "1 1 500 2", "other.tx");
  ExpectFrames(Baked(CameraScene("", "", other + Playback("-min 5 -max 6"))), 5, 6);
}

TEST(FrameRange, KeysOfWhatIsNotInThePictureDoNotCount) {
  const std::string curves = CurveOf("animCurveTU", "a", "1 0 900 1", "shotCam.v") +
                             CurveOf("animCurveTL", "b", "1 0 901 1", "shotCamShape.fd") +
                             CurveOf("animCurveTU", "c", "1 0 902 1", "screen.fo") +
                             "createNode imagePlane -n \"screen\";\nconnectAttr \"screen.msg\" "
                             "\"shotCamShape.ip[0]\";\n";
  ExpectFrames(Baked(CameraScene("", "", curves + Playback("-min 5 -max 6"))), 5, 6);
}

TEST(FrameRange, InTheWorldKeysOfWhatStandsAboveCount) {
  const std::string text = "createNode transform -n \"rig\";\n" +
                           CurveOf("animCurveTL", "c", "7 1 9 2", "rig.ty") +
                           "createNode transform -n \"shotCam\" -p \"rig\";\ncreateNode camera -n "
                           "\"shotCamShape\" -p \"shotCam\";\n";
  bake::Options options;
  options.world = true;
  ExpectFrames(Baked(text, options), 7, 9);
}

TEST(FrameRange, KeysOfWhatDrivesAChannelCount) {
  const std::string driver = "createNode transform -n \"driver\";\n" +
                             CurveOf("animCurveTL", "c", "7 1 9 2", "driver.ty") +
                             "connectAttr \"driver.ty\" \"shotCam.tx\";\n";
  ExpectFrames(Baked(CameraScene("", "", driver)), 7, 9);
}

TEST(FrameRange, TheFramesOfTheOptionsAreTakenAsTheyAre) {
  bake::Options options;
  options.frames = bake::FrameSpan{1.5, 3.25};
  options.step = 0.5;
  const Baked baked(CameraScene("", "", Playback("-min 1001 -max 1100")), options);
  ExpectFrames(baked, 1.5, 3.0);
  EXPECT_EQ(baked.report().frames->count, 4u);
}

TEST(FrameRange, MoreThan100000FramesNeedTheOption) {
  const Baked most(CameraScene("", "", Playback("-min 1 -max 100000")));
  EXPECT_EQ(most.report().frames->count, 100'000u);
  const Baked more(CameraScene("", "", Playback("-min 0 -max 100000")));
  EXPECT_FALSE(more.report().frames.has_value());
  EXPECT_EQ(more.CountOf(diag::Code::TooManyFrames), 1u);
  EXPECT_EQ(more.text(), "");
}

TEST(FrameRange, NoBakeHasMoreFramesThanACompositionsTimeCanHold) {
  bake::Options options;
  options.frames = bake::FrameSpan{0, 2'000'001};
  const Baked baked(CameraScene(""), options);
  EXPECT_FALSE(baked.report().frames.has_value());
  EXPECT_EQ(baked.CountOf(diag::Code::TooManyFrames), 1u);
}

}  // namespace
