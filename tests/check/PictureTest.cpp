// Where the picture of an import differs from the scene's, and by how much.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <numbers>
#include <string>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;
using testing::HasSubstr;

// The pixels that a shift is said to have.
double PixelsOf(const Checked& checked) {
  const diag::Diagnostic& shift = checked.Only(Code::PictureShifts).diagnostic;
  return shift.arguments.size() < 2 ? -1.0 : std::stod(shift.arguments[1]);
}

std::string FrameOf(const Checked& checked) {
  const diag::Diagnostic& shift = checked.Only(Code::PictureShifts).diagnostic;
  return shift.arguments.size() < 3 ? "" : shift.arguments[2];
}

// Pixels for one unit across, at ten units from the default lens.
double PixelsPerUnit() { return 960.0 * 35.0 / 25.4 / 1.41732 / 10.0; }

std::string EveryFrame(int first, int last, double step) {
  std::string keys;
  for (int frame = first; frame <= last; ++frame) {
    keys += (keys.empty() ? "" : " ") + std::to_string(frame) + ' ' + std::to_string((frame - first) * step);
  }
  return keys;
}

TEST(PictureTest, ABakeShowsThePictureOfItsScene) {
  const std::string rig =
      "createNode transform -n \"rig\";\n\tsetAttr \".r\" -type \"double3\" 10 20 30 ;\n"
      "\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n\tsetAttr \".rp\" -type \"double3\" 0 4 0 ;\n";
  const std::string text =
      kHead + rig +
      "createNode transform -n \"shotCam\" -p \"rig\";\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
      kLens + kResolution + CurveOf("moveX", EveryFrame(5, 30, 0.5), "shotCam.tx") +
      CurveOf("turnY", EveryFrame(5, 30, 11.0), "shotCam.ry", "animCurveTA") +
      CurveOf("zoom", EveryFrame(5, 30, 1.5).replace(2, 1, "20"), "shotCamShape.fl", "animCurveTU");
  const Checked checked(text);
  EXPECT_EQ(checked.All(), "");
}

TEST(PictureTest, AnAimedCameraShowsThePictureOfItsScene) {
  const Checked checked(
      CameraScene("\tsetAttr \".t\" -type \"double3\" 3 4 20 ;\n", "",
                  "createNode transform -n \"point\";\n\tsetAttr \".t\" -type \"double3\" 5 1 0 ;\n"
                  "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
                  "\tsetAttr \".a\" -type \"double3\" 0 0 -1 ;\n"
                  "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                  "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n"
                  "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n"));
  ASSERT_TRUE(checked.cameOver().layers[0].aimed);
  EXPECT_EQ(checked.CountOf(Code::PictureShifts), 0u) << checked.All();
}

TEST(PictureTest, ConvertedDistancesAreTheSamePicture) {
  for (const char* const unit : {"mm", "cm", "m", "km", "in", "ft", "yd", "mi"}) {
    std::string text = CameraScene(
        "\tsetAttr \".t\" -type \"double3\" 3 4 20 ;\n\tsetAttr \".r\" -type \"double3\" 9 8 7 ;\n");
    text.replace(text.find("centimeter"), 10, unit);
    const Checked checked(text, {}, true);
    EXPECT_EQ(checked.CountOf(Code::PictureShifts), 0u) << unit;
    const bool tooLarge = std::string_view(unit) == "m" || std::string_view(unit) == "km";
    EXPECT_EQ(checked.report().warnings, tooLarge ? 1u : 0u) << unit << checked.All();
  }
}

TEST(PictureTest, KeysThatAreNoBakeShiftByTheWayBetweenThem) {
  // A curve with level ends: a quarter of the way in, the straight way is ahead by 100 * (1/4 - 5/32).
  const Checked checked(CameraScene("", "", CurveOf("moveX", "1 0 65 100", "shotCam.tx", "animCurveTL", 3)));
  EXPECT_EQ(checked.MarkedBy(Code::KeysAreNoBake), "1 0 65 100");
  EXPECT_THAT(checked.SentenceOf(Code::KeysAreNoBake), HasSubstr("2 keys over 65 frames"));
  double largest = 0.0;
  for (int frame = 0; frame <= 64; ++frame) {
    const double part = frame / 64.0;
    largest = std::max(largest, 100.0 * std::fabs(part * part * (3.0 - 2.0 * part) - part));
  }
  EXPECT_NEAR(PixelsOf(checked), largest * PixelsPerUnit(), 0.01);
}

TEST(PictureTest, AWholeTurnBetweenTwoKeysIsLost) {
  const Checked checked(CameraScene("", "", CurveOf("turnY", "1 0 101 360", "shotCam.ry", "animCurveTA")));
  EXPECT_EQ(checked.CountOf(Code::KeysAreNoBake), 1u);
  EXPECT_THAT(checked.SentenceOf(Code::PictureShifts), HasSubstr("more than the whole picture"));
}

TEST(PictureTest, StraightKeysAreAsGoodAsABake) {
  const Checked checked(CameraScene("", "", CurveOf("moveX", "1 0 65 100", "shotCam.tx")));
  EXPECT_EQ(checked.All(), "");
}

TEST(PictureTest, ANodeHasOneListOfTimes) {
  const auto says = [](std::string_view x, std::string_view y) {
    const Checked checked(CameraScene("", "", CurveOf("x", x, "shotCam.tx") + CurveOf("y", y, "shotCam.ty")));
    return checked.CountOf(Code::KeysAreNoBake);
  };
  EXPECT_EQ(says("1 0 5 8 9 16", "1 3 5 4 9 5"), 0u);
  EXPECT_EQ(says("1 0 5 8 9 16", "1 3 6 4 9 5"), 1u);
  EXPECT_EQ(says("1 0 2 8 3 16", "1 3 3 4 5 5"), 1u);
  EXPECT_EQ(says("1 0 2 8 3 16", "2 3 3 4 4 5"), 1u);
  EXPECT_EQ(says("5 7", "1 3 2 4 3 5"), 1u);  // the one key's time is time 0
}

TEST(PictureTest, NodesThatAreKeyedFromDifferentFrames) {
  const std::string text =
      kHead +
      "createNode transform -n \"rig\";\ncreateNode transform -n \"shotCam\" -p \"rig\";\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
      kLens + kResolution + CurveOf("rigX", EveryFrame(1, 20, 0.0), "rig.tx") +
      CurveOf("moveX", EveryFrame(11, 20, 1.0), "shotCam.tx");
  const Checked checked(text);
  EXPECT_EQ(checked.SentenceOf(Code::KeysStartApart),
            "\"shotCam\" begins at frame 11, \"rig\" at frame 1: the import lets both begin at once");
  EXPECT_NEAR(PixelsOf(checked), 9.0 * PixelsPerUnit(), 0.01);
  EXPECT_EQ(FrameOf(checked), "10");
}

TEST(PictureTest, ALensThatIsKeyedApartFromItsCamera) {
  const Checked checked(CameraScene("", "",
                                    CurveOf("moveX", EveryFrame(1, 20, 1.0), "shotCam.tx") +
                                        CurveOf("zoom", "5 35 6 35", "shotCamShape.fl", "animCurveTU")));
  EXPECT_THAT(checked.SentenceOf(Code::KeysStartApart), HasSubstr("\"shotCamShape\" begins at frame 5"));
}

TEST(PictureTest, ARotateOrderIsSaidWhereItMatters) {
  const Checked checked(CameraScene("\tsetAttr \".r\" -type \"double3\" 30 40 0 ;\n\tsetAttr \".ro\" 4;\n"));
  EXPECT_THAT(checked.SentenceOf(Code::RotateOrderLost), HasSubstr("takes xyz, the scene has yxz"));
  EXPECT_GT(PixelsOf(checked), 10.0);
  // About x alone, and about x before y in both orders.
  EXPECT_EQ(Checked(CameraScene("\tsetAttr \".r\" -type \"double3\" 30 0 0 ;\n\tsetAttr \".ro\" 4;\n")).All(),
            "");
  EXPECT_EQ(
      Checked(CameraScene("\tsetAttr \".r\" -type \"double3\" 30 40 0 ;\n\tsetAttr \".ro\" 2;\n")).All(), "");
}

TEST(PictureTest, WhatOfATransformIsLost) {
  const auto given = [](const char* attribute, Code code) {
    const Checked checked(CameraScene(std::string("\tsetAttr ") + attribute + ";\n"));
    EXPECT_EQ(checked.CountOf(code), 1u) << attribute << '\n' << checked.All();
  };
  given("\".ra\" -type \"double3\" 0 30 0", Code::RotateAxisLost);
  given("\".sh\" -type \"double3\" 0.5 0 0", Code::ShearLost);
  given("\".rpt\" -type \"double3\" 0 2 0", Code::PivotTranslationLost);
  given("\".spt\" -type \"double3\" 0 0 2", Code::PivotTranslationLost);
}

TEST(PictureTest, ANodeThatDoesNotInheritAndAScaleAboveTheCamera) {
  const std::string above = kHead +
                            "createNode transform -n \"rig\";\n\tsetAttr \".t\" -type \"double3\" 5 0 0 ;\n"
                            "\tsetAttr \".s\" -type \"double3\" 2 2 2 ;\n"
                            "createNode transform -n \"shotCam\" -p \"rig\";\n";
  const std::string below = "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" + kLens + kResolution;
  const Checked scaled(above + below);
  EXPECT_EQ(scaled.SentenceOf(Code::ChainScaled), "\"rig\" scales the camera \"shotCamShape\" below it");
  const Checked alone(above + "\tsetAttr \".it\" no;\n" + below);
  EXPECT_EQ(alone.CountOf(Code::InheritanceOff), 1u);
  EXPECT_NEAR(PixelsOf(alone), 5.0 * PixelsPerUnit(), 0.01);
}

TEST(PictureTest, AFitThatIsNotHorizontal) {
  // The film is 1.5 wide, the picture 1.78: fill takes the width, overscan the height.
  EXPECT_EQ(Checked(CameraScene("", "\tsetAttr \".ff\" 0;\n")).All(), "");
  for (const char* noFit : {"1e308", "-1e308", "4", "-1"}) {
    const Checked checked(CameraScene("", std::string("\tsetAttr \".ff\" ") + noFit + ";\n"));
    EXPECT_EQ(checked.All(), "") << noFit;
  }
  const Checked overscan(CameraScene("", "\tsetAttr \".ff\" 3;\n"));
  EXPECT_THAT(overscan.SentenceOf(Code::FitDiffers), HasSubstr("the fit is overscan"));
  EXPECT_GT(PixelsOf(overscan), 10.0);
}

TEST(PictureTest, WhatOfALensIsLost) {
  EXPECT_EQ(Checked(CameraScene("", "\tsetAttr \".fio\" -type \"double2\" 0.1 0 ;\n"))
                .CountOf(Code::FilmOffsetLost),
            1u);
  EXPECT_THAT(Checked(CameraScene("", "\tsetAttr \".lsr\" 2;\n")).SentenceOf(Code::LensSqueezeLost),
              HasSubstr("is lost: it is 2"));
  EXPECT_THAT(Checked(CameraScene("", "\tsetAttr \".cs\" 1.5;\n")).SentenceOf(Code::CameraScaleLost),
              HasSubstr("is lost: it is 1.5"));
  EXPECT_EQ(Checked(CameraScene("", "\tsetAttr \".ptsc\" 2;\n")).CountOf(Code::PictureEffectLost), 1u);
  EXPECT_EQ(Checked(CameraScene("", "\tsetAttr \".ffo\" 0.2;\n")).MarkedBy(Code::PictureEffectLost), "0.2");
  const std::string pan = "\tsetAttr \".pze\" yes;\n\tsetAttr \".hpn\" 0.25;\n";
  EXPECT_EQ(Checked(CameraScene("", pan)).CountOf(Code::PictureEffectLost), 0u) << "only the view is panned";
  EXPECT_EQ(Checked(CameraScene("", pan + "\tsetAttr \".rpz\" yes;\n")).MarkedBy(Code::PictureEffectLost),
            "0.25");
}

TEST(PictureTest, AShakeOfTheFilmIsLostWhereItIsSwitchedOn) {
  const std::string shake = "\tsetAttr \".hs\" 0.1;\n\tsetAttr \".sos\" 1.5;\n";
  EXPECT_EQ(Checked(CameraScene("", shake)).All(), "");
  const Checked shaken(CameraScene("", shake + "\tsetAttr \".se\" yes;\n"));
  EXPECT_EQ(shaken.MarkedBy(Code::FilmOffsetLost), "0.1");
  EXPECT_EQ(shaken.CountOf(Code::PictureShifts), 1u);
  EXPECT_EQ(Checked(CameraScene("", shake + "\tsetAttr \".soe\" yes;\n")).MarkedBy(Code::PictureEffectLost),
            "1.5");
}

TEST(PictureTest, AFilmOffsetShiftsByItsPartOfTheAperture) {
  const Checked checked(CameraScene("", "\tsetAttr \".fio\" -type \"double2\" 0.141732 0 ;\n"));
  EXPECT_NEAR(PixelsOf(checked), 96.0, 0.01);
}

TEST(PictureTest, AResolutionThatTheFileLeavesOut) {
  const Checked checked(
      kHead +
      "createNode transform -n \"shotCam\";\ncreateNode camera -n \"shotCamShape\" -p \"shotCam\";\n");
  EXPECT_EQ(checked.SentenceOf(Code::PictureSizeAssumed),
            "the composition has width 720, height 486, pixel aspect 0.909, where the scene means 960, 540, "
            "1");
}

TEST(PictureTest, TheUnitAndTheRate) {
  std::string metres = CameraScene("");
  metres.replace(metres.find("centimeter"), 10, "meter");
  EXPECT_THAT(Checked(metres).SentenceOf(Code::OtherLengthUnit), HasSubstr("unit of length is \"meter\""));
  EXPECT_THAT(Checked(metres, {}, true).SentenceOf(Code::OtherLengthUnit),
              HasSubstr("distances come over 100 times too large"));
  std::string inches = CameraScene("");
  inches.replace(inches.find("centimeter"), 10, "inch");
  EXPECT_EQ(Checked(inches, {}, true).CountOf(Code::OtherLengthUnit), 0u);
  std::string silent = CameraScene("");
  silent.erase(silent.find(" -t film"), 8);
  EXPECT_EQ(Checked(silent).SentenceOf(Code::RateDiffers),
            "the composition has 30 frames a second, the scene 24");
}

TEST(PictureTest, FramesThatAreNegativeOrFractionsOrBeyondAllTime) {
  const auto with = [](const char* keys) {
    return CameraScene("", "", CurveOf("moveX", keys, "shotCam.tx"));
  };
  EXPECT_THAT(Checked(with("-10 0 -9 1")).SentenceOf(Code::NegativeFrames), HasSubstr("from frame -10"));
  EXPECT_THAT(Checked(with("1 0 2.5 1")).SentenceOf(Code::FractionalFrames), HasSubstr("first at 2.5"));
  EXPECT_THAT(Checked(with("1 0 3000000 1")).SentenceOf(Code::BeyondCompositionTime), HasSubstr("3000000"));
}

TEST(PictureTest, ACameraThatLandsSomewhereElseShowsNothingOfThePicture) {
  const Checked checked(CameraScene("", "", CurveOf("turnY", "1 180", "shotCam.ry", "animCurveTA")));
  EXPECT_EQ(checked.CountOf(Code::ChannelsOfOneKey), 1u);
  EXPECT_THAT(checked.SentenceOf(Code::PictureShifts), HasSubstr("more than the whole picture"));
}

TEST(PictureTest, NumbersAsNearAsARoundingErrorDoNotDiffer) {
  const auto all = [](const char* transform, const char* shape) {
    return Checked(CameraScene(transform, shape)).All();
  };
  EXPECT_EQ(all("\tsetAttr \".rpt\" -type \"double3\" 1e-14 -5e-7 2e-17 ;\n", ""), "");
  EXPECT_EQ(all("\tsetAttr \".ra\" -type \"double3\" 1e-10 0 0 ;\n", ""), "");
  EXPECT_EQ(all("", "\tsetAttr \".lsr\" 1.0000000001;\n"), "");
  EXPECT_NE(all("\tsetAttr \".rpt\" -type \"double3\" 2e-6 0 0 ;\n", ""), "");
  EXPECT_NE(all("\tsetAttr \".ra\" -type \"double3\" 2e-9 0 0 ;\n", ""), "");
}

TEST(PictureTest, KeysAtTheNeutralValueDoNotDiffer) {
  const auto rig = [](std::string_view keys) {
    return Checked(kHead +
                   "createNode transform -n \"rig\";\ncreateNode transform -n \"shotCam\" -p \"rig\";\n"
                   "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
                   kLens + kResolution + CurveOf("sizeX", keys, "rig.sx", "animCurveTU"));
  };
  EXPECT_EQ(rig("1 1 2 1 3 1").CountOf(Code::ChainScaled), 0u);
  EXPECT_EQ(rig("1 1 2 1 3 1.5").CountOf(Code::ChainScaled), 1u);
  const auto squeeze = [](std::string_view keys) {
    return Checked(CameraScene("", "", CurveOf("wide", keys, "shotCamShape.lsr", "animCurveTU")));
  };
  EXPECT_EQ(squeeze("1 1 2 1").All(), "");
  EXPECT_EQ(squeeze("1 1 2 1.5").SentenceOf(Code::LensSqueezeLost),
            "the lens squeeze of \"shotCamShape\" is lost: it has keys, one at 1.5");
}

TEST(PictureTest, AFactorThatAnotherNodeDrivesIsSaidByThatNode) {
  const Checked checked(CameraScene("", "",
                                    "createNode transform -n \"control\";\n"
                                    "\taddAttr -ln \"wide\" -at double -dv 1.5;\n"
                                    "connectAttr \"control.wide\" \"shotCamShape.lsr\";\n"));
  EXPECT_EQ(checked.SentenceOf(Code::LensSqueezeLost),
            "the lens squeeze of \"shotCamShape\" is lost: \"control\" drives it");
}

TEST(PictureTest, TheFramesBetweenKeysAreWholeOnes) {
  const Checked checked(
      CameraScene("", "", CurveOf("moveX", "1 0 64.5 100", "shotCam.tx", "animCurveTL", 3)));
  EXPECT_THAT(checked.SentenceOf(Code::KeysAreNoBake), HasSubstr("2 keys over 65 frames"));
}

}  // namespace
}  // namespace check_test
