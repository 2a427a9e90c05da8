// Which cameras' pictures are measured, at which frames, and what is said of the others.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <string>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;
using testing::HasSubstr;

std::string CameraOf(const std::string& name, const std::string& transform = "",
                     const std::string& parent = "") {
  return "createNode transform -n \"" + name + "\"" + (parent.empty() ? "" : " -p \"" + parent + "\"") +
         ";\n" + transform + "createNode camera -n \"" + name + "Shape\" -p \"" + name + "\";\n" + kLens;
}

std::string Playback(int first, int last) {
  return "createNode script -n \"sceneConfigurationScriptNode\";\n\tsetAttr \".b\" -type \"string\" "
         "\"playbackOptions -min " +
         std::to_string(first) + " -max " + std::to_string(last) + " -ast " + std::to_string(first) +
         " -aet " + std::to_string(last) + " \";\n\tsetAttr \".st\" 6;\n";
}

TEST(ShiftTest, WhatDrivesManyCamerasIsReportedOnce) {
  std::string text = kHead +
                     "createNode transform -n \"rig\";\ncreateNode expression -n \"drive\";\n"
                     "connectAttr \"drive.out[0]\" \"rig.tx\";\n";
  for (int i = 0; i < 3; ++i) text += CameraOf("shot" + std::to_string(i), "", "rig");
  check::Options evaluation;
  evaluation.only = {Code::UnsupportedDriver};
  EXPECT_EQ(Checked(text + kResolution, evaluation).CountOf(Code::UnsupportedDriver), 1u);
  EXPECT_EQ(Checked(text + kResolution).CountOf(Code::DrivenByNoCurve), 1u);
}

TEST(ShiftTest, NothingIsReportedOfWhatDrivesTheCentreOfInterest) {
  const Checked checked(CameraScene("", "",
                                    "createNode lookAt -n \"view\";\n"
                                    "connectAttr \"view.distanceBetween\" \"shotCamShape.coi\";\n"));
  EXPECT_EQ(checked.All(), "");
}

TEST(ShiftTest, TheCentreOfInterestIsTakenAtEachFrame) {
  // The nearer the points, the further they shift.
  const std::string offset = "\tsetAttr \".rpt\" -type \"double3\" 1 0 0 ;\n";
  const auto shift = [&](const std::string& rest) {
    return std::stod(
        Checked(CameraScene(offset, "", rest)).Only(Code::PictureShifts).diagnostic.arguments.at(1));
  };
  const double still = shift("");
  EXPECT_NEAR(shift(Playback(1, 5) + CurveOf("reach", "1 10 5 5", "shotCamShape.coi")), 2.0 * still, 0.01);
}

TEST(ShiftTest, KeysOfWhatDrivesTheCameraAreMeasured) {
  // Nothing is played, and no curve drives a channel of the camera itself.
  const Checked checked(CameraScene("", "",
                                    "createNode transform -n \"guide\";\n" +
                                        CurveOf("lead", "1 0 40 30", "guide.tx") +
                                        "connectAttr \"guide.tx\" \"shotCam.tx\";\n"));
  const auto& arguments = checked.Only(Code::PictureShifts).diagnostic.arguments;
  ASSERT_EQ(arguments.size(), 3u);
  EXPECT_EQ(arguments[2], "40");
}

TEST(ShiftTest, AllCamerasAreMeasuredOverTheSameFrames) {
  const std::string text = kHead + CameraOf("first") + CameraOf("second") + kResolution +
                           CurveOf("moveX", "1 0 2000000 5", "first.tx") +
                           CurveOf("secondX", "1 0 2 5", "second.tx");
  const Checked checked(text);
  EXPECT_EQ(checked.CountOf(Code::ShiftNotMeasured), 2u);
  EXPECT_EQ(checked.CountOf(Code::PictureShifts), 0u);
}

TEST(ShiftTest, ACameraThatStandsStillIsMeasuredAtOneFrame) {
  const std::string moved = "\tsetAttr \".rpt\" -type \"double3\" 3 0 0 ;\n";
  const Checked checked(kHead + CameraOf("still", moved) + kResolution + Playback(7, 2'000'000));
  EXPECT_EQ(checked.CountOf(Code::ShiftNotMeasured), 0u);
  const auto& arguments = checked.Only(Code::PictureShifts).diagnostic.arguments;
  EXPECT_EQ(arguments[2], "7");
}

TEST(ShiftTest, TooManyFramesAreSaid) {
  const Checked checked(CameraScene("", "", CurveOf("moveX", "1 0 100001 1", "shotCam.tx")));
  EXPECT_EQ(checked.SentenceOf(Code::ShiftNotMeasured),
            "how far the picture of \"shotCamShape\" shifts is not measured: the scene has more than 100000 "
            "frames");
  EXPECT_EQ(Checked(CameraScene("", "", CurveOf("moveX", "1 0 100000 1", "shotCam.tx")))
                .CountOf(Code::ShiftNotMeasured),
            0u);
}

TEST(ShiftTest, TooManyFramesOfLayersAreSaidForTheCameraThatHasThem) {
  // 41 layers above each other, at 100,000 frames. The other camera has one layer.
  std::string text = kHead + "createNode transform -n \"rig0\";\n";
  for (int i = 1; i < 40; ++i) {
    text +=
        "createNode transform -n \"rig" + std::to_string(i) + "\" -p \"rig" + std::to_string(i - 1) + "\";\n";
  }
  text += CameraOf("deep", "", "rig39") + CameraOf("flat") + kResolution + Playback(1, 100'000) +
          CurveOf("deepX", "1 0 2 5", "deep.tx") + CurveOf("flatX", "1 0 2 5", "flat.tx");
  const Checked checked(text);
  EXPECT_EQ(checked.MarkedBy(Code::ShiftNotMeasured), "deepShape");
  EXPECT_THAT(checked.SentenceOf(Code::ShiftNotMeasured), HasSubstr("too many frames and layers"));
}

TEST(ShiftTest, AfterAStopTheCamerasBeforeItAreMeasured) {
  const std::string moved = "\tsetAttr \".rpt\" -type \"double3\" 3 0 0 ;\n";
  const std::string text = kHead + CameraOf("before", moved) + CameraOf("at", moved) +
                           CameraOf("after", moved) + kResolution + CurveOf("x", "1 0 2 1", "at.tx") +
                           CurveOf("y", "1 0 2 1 3 2", "at.ty");
  const Checked checked(text);
  ASSERT_EQ(checked.cameOver().stop, check::Stop::UnequalKeys);
  EXPECT_EQ(checked.MarkedBy(Code::PictureShifts), "beforeShape");
  EXPECT_EQ(checked.CountOf(Code::ShiftNotMeasured), 0u);  // the stop says enough of the others
}

TEST(ShiftTest, WhatCannotBeComputedIsNotMeasured) {
  const std::string driven =
      "createNode expression -n \"shake\";\nconnectAttr \"shake.out[0]\" \"shotCam.tx\";\n";
  const Checked checked(CameraScene("\tsetAttr \".rpt\" -type \"double3\" 3 0 0 ;\n", "", driven));
  EXPECT_EQ(checked.CountOf(Code::PictureShifts), 0u);
  EXPECT_THAT(checked.SentenceOf(Code::ShiftNotMeasured),
              HasSubstr("\"shotCam.translateX\" cannot be computed"));
}

TEST(ShiftTest, ACameraWithoutAUsablePlaceIsSaid) {
  const Checked checked(CameraScene("", "\tsetAttr \".coi\" -1;\n"));
  EXPECT_THAT(checked.SentenceOf(Code::ShiftNotMeasured), HasSubstr("no usable number"));
}

std::string InSeconds(std::string text) { return text.replace(text.find("-t film"), 7, "-t sec"); }

TEST(ShiftTest, SecondsAreLookedAtFrameByFrame) {
  // Level at both ends: the straight way leaves the curve between the two keys, which are a second apart.
  const Checked checked(
      InSeconds(CameraScene("", "", CurveOf("moveX", "0 0 1 100", "shotCam.tx", "animCurveTL", 3))));
  EXPECT_THAT(checked.SentenceOf(Code::KeysAreNoBake), HasSubstr("2 keys over 25 frames"));
  EXPECT_EQ(checked.CountOf(Code::PictureShifts), 1u) << checked.All();
}

TEST(ShiftTest, KeysOfEachSecondAreNoBakeAndThoseOfEachFrameAre) {
  const auto keyedAt = [](int step) {
    std::string keys;
    for (int frame = 0; frame <= 48; frame += step) {
      keys += (keys.empty() ? "" : " ") + std::to_string(frame / 24.0) + ' ' +
              std::to_string(0.001 * frame * frame);
    }
    return InSeconds(CameraScene("", "", CurveOf("moveX", keys, "shotCam.tx", "animCurveTL", 9)));
  };
  const Checked seconds(keyedAt(24));
  EXPECT_EQ(seconds.CountOf(Code::KeysAreNoBake), 1u) << seconds.All();
  const Checked frames(keyedAt(1));
  EXPECT_EQ(frames.CountOf(Code::KeysAreNoBake) + frames.CountOf(Code::FractionalFrames), 0u);
  EXPECT_EQ(frames.CountOf(Code::PictureShifts), 0u) << frames.All();
}

TEST(ShiftTest, ASceneInSecondsKeepsItsTimes) {
  const Checked checked(InSeconds(CameraScene("", "", CurveOf("moveX", "1 0 3 100", "shotCam.tx"))));
  EXPECT_EQ(checked.CountOf(Code::PictureShifts), 0u) << checked.All();
}

// The scene shows twice as much at the last key: its edges land twice as far from the middle.
TEST(ShiftTest, AnApertureThatIsKeyedOrDriven) {
  const Checked keyed(
      CameraScene("", "", CurveOf("wide", "1 1.41732 5 2.83464", "shotCamShape.hfa", "animCurveTU")));
  EXPECT_EQ(keyed.SentenceOf(Code::ApertureMotionLost),
            "the film aperture of \"shotCamShape\" stands still: it has keys, one at 2.835");
  EXPECT_EQ(keyed.MarkedBy(Code::ApertureMotionLost), "shotCamShape.hfa");
  const auto& shift = keyed.Only(Code::PictureShifts).diagnostic.arguments;
  EXPECT_NEAR(std::stod(shift.at(1)), std::hypot(480.0, 270.0), 0.01);
  EXPECT_EQ(shift.at(2), "5");
  const Checked driven(CameraScene("", "",
                                   "createNode expression -n \"film\";\n"
                                   "connectAttr \"film.out[0]\" \"shotCamShape.vfa\";\n"));
  EXPECT_EQ(driven.SentenceOf(Code::ApertureMotionLost),
            "the film aperture of \"shotCamShape\" stands still: \"film\" drives it");
  EXPECT_EQ(driven.CountOf(Code::UnsupportedDriver), 0u);
  EXPECT_EQ(
      Checked(CameraScene("", "", CurveOf("wide", "1 1.41732 5 1.41732", "shotCamShape.hfa", "animCurveTU")))
          .All(),
      "");
}

TEST(ShiftTest, AFilmFitThatIsKeyed) {
  const Checked checked(CameraScene("", "", CurveOf("fit", "1 1 5 2", "shotCamShape.ff", "animCurveTU")));
  EXPECT_EQ(checked.SentenceOf(Code::FitMotionLost),
            "the film fit of \"shotCamShape\" stands still: it has keys, one at 2");
  EXPECT_EQ(checked.MarkedBy(Code::FitMotionLost), "shotCamShape.ff");
  EXPECT_EQ(checked.CountOf(Code::PictureShifts), 1u);
}

std::string CurveThatGoesOn(const std::string& infinity, const std::string& frames) {
  return CameraScene("", "",
                     frames + "createNode animCurveTL -n \"moveX\";\n\tsetAttr \".tan\" 9;\n" +
                         "\tsetAttr \".wgt\" no;\n\tsetAttr -s 2 \".ktv[0:1]\" 10 0 20 10;\n" + infinity +
                         "connectAttr \"moveX.o\" \"shotCam.tx\";\n");
}

TEST(ShiftTest, ACurveThatGoesOnOutsideItsKeys) {
  const auto sentence = [](const char* infinity) {
    return Checked(CurveThatGoesOn(infinity, Playback(1, 30))).SentenceOf(Code::InfinityLost);
  };
  const std::string held = "\"shotCam\" stands still in translateX ";
  EXPECT_EQ(sentence("\tsetAttr \".pre\" 1;\n"), held + "before its keys, where the scene goes on: linear");
  EXPECT_EQ(sentence("\tsetAttr \".pst\" 3;\n"), held + "after its keys, where the scene goes on: cycle");
  EXPECT_EQ(sentence("\tsetAttr \".pst\" 4;\n"),
            held + "after its keys, where the scene goes on: cycle with offset");
  EXPECT_EQ(sentence("\tsetAttr \".pst\" 5;\n"), held + "after its keys, where the scene goes on: oscillate");
  const Checked linear(CurveThatGoesOn("\tsetAttr \".pst\" 1;\n", Playback(10, 30)));
  EXPECT_EQ(linear.MarkedBy(Code::InfinityLost), "1");
  // Ten frames on, a unit a frame, ten units away.
  const auto& shift = linear.Only(Code::PictureShifts).diagnostic.arguments;
  EXPECT_NEAR(std::stod(shift.at(1)), 960.0 * 35.0 / 25.4 / 1.41732, 0.01);
  EXPECT_EQ(shift.at(2), "30");
}

TEST(ShiftTest, ACurveThatGoesOnOutsideTheFramesLosesNothing) {
  EXPECT_EQ(Checked(CurveThatGoesOn("\tsetAttr \".pre\" 1;\n\tsetAttr \".pst\" 4;\n", "")).All(), "");
  EXPECT_EQ(Checked(CurveThatGoesOn("\tsetAttr \".pst\" 0;\n", Playback(10, 30))).All(), "");
}

}  // namespace
}  // namespace check_test
