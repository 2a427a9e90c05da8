// What is written of the lens.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "tests/bake/BakeFixture.h"

namespace {

using bake_test::Baked;
using bake_test::CameraScene;
using bake_test::CurveOf;
using testing::DoubleEq;
using testing::ElementsAre;
using testing::SizeIs;

constexpr const char* kPicture =
    "select -ne :defaultResolution;\n\tsetAttr \".w\" 1920;\n\tsetAttr \".h\" 1080;\n\tsetAttr \".dar\" "
    "1.7777777;\n";

TEST(Lens, DefaultsOfTheSceneAreWrittenOut) {
  const Baked baked(CameraScene(""));
  EXPECT_EQ(baked.Number("shotCamShape", "focalLength"), 35);
  EXPECT_EQ(baked.Number("shotCamShape", "horizontalFilmAperture"), 1.41732);
  EXPECT_EQ(baked.Number("shotCamShape", "verticalFilmAperture"), 0.94488);
  EXPECT_EQ(baked.Number("shotCamShape", "filmFit"), 1);
}

TEST(Lens, FillAndOverscanBecomeASideOfThePicture) {
  // The film is 1.5 wide to 1 high, the picture 16 to 9.
  EXPECT_EQ(Baked(CameraScene("", "\tsetAttr \".ff\" 0;\n", kPicture)).Number("shotCamShape", "filmFit"), 1);
  EXPECT_EQ(Baked(CameraScene("", "\tsetAttr \".ff\" 3;\n", kPicture)).Number("shotCamShape", "filmFit"), 2);
  EXPECT_EQ(Baked(CameraScene("", "\tsetAttr \".ff\" 2;\n", kPicture)).Number("shotCamShape", "filmFit"), 2);
  EXPECT_EQ(Baked(CameraScene("", "\tsetAttr \".ff\" 1;\n", kPicture)).Number("shotCamShape", "filmFit"), 1);
}

TEST(Lens, TheCameraScaleIsInTheFocalLength) {
  const Baked baked(CameraScene("", "\tsetAttr \".fl\" 50;\n\tsetAttr \".cs\" 2;\n"));
  EXPECT_EQ(baked.Number("shotCamShape", "focalLength"), 25);
}

TEST(Lens, TheSqueezeIsInTheApertureWithAWarning) {
  const Baked baked(
      CameraScene("", "\tsetAttr \".cap\" -type \"double2\" 1.2 0.8 ;\n\tsetAttr \".lsr\" 2;\n"));
  EXPECT_EQ(baked.Number("shotCamShape", "horizontalFilmAperture"), 2.4);
  EXPECT_EQ(baked.Number("shotCamShape", "verticalFilmAperture"), 0.8);
  EXPECT_EQ(baked.CountOf(diag::Code::LensSqueezeInAperture), 1u);
  EXPECT_THAT(baked.report().cameras.at(0).differences, SizeIs(1));
}

TEST(Lens, AMovingApertureIsInTheFocalLength) {
  const std::string curve = CurveOf("animCurveTU", "c", "1 1 3 2", "shotCamShape.hfa");
  const Baked baked(CameraScene("", "\tsetAttr \".fl\" 30;\n", curve));
  EXPECT_EQ(baked.Number("shotCamShape", "horizontalFilmAperture"), 1);
  EXPECT_THAT(baked.Keys("shotCamShape", "focalLength"),
              ElementsAre(DoubleEq(30), DoubleEq(20), DoubleEq(15)));
  EXPECT_TRUE(baked.report().cameras.at(0).lensMoves);
}

TEST(Lens, AFocalLengthFromATransformComesOver) {
  const std::string rest =
      "createNode transform -n \"ctrl\";\n\taddAttr -ci true -sn \"zm\" -ln \"zm\" -at \"double\" -dv 35;\n" +
      CurveOf("animCurveTU", "c", "1 20 2 60", "ctrl.zm") + "connectAttr \"ctrl.zm\" \"shotCamShape.fl\";\n";
  EXPECT_THAT(Baked(CameraScene("", "", rest)).Keys("shotCamShape", "focalLength"), ElementsAre(20, 60));
}

TEST(Lens, TheFilmOffsetAndChangesOfThePictureAreWarnings) {
  const Baked offset(CameraScene("", "\tsetAttr \".fio\" -type \"double2\" 0.1 0 ;\n"));
  EXPECT_EQ(offset.CountOf(diag::Code::FilmOffsetLost), 1u);
  EXPECT_EQ(offset.CountOf(diag::Code::PictureEffectLost), 0u);
  for (const char* effect : {".psc", ".ptsc", ".fth", ".ftv", ".frv", ".frc", ".ffo"}) {
    const Baked baked(CameraScene("", "\tsetAttr \"" + std::string(effect) + "\" 1.5;\n"));
    EXPECT_EQ(baked.CountOf(diag::Code::PictureEffectLost), 1u) << effect;
  }
}

TEST(Lens, AFilmFitOffsetChangesNothingWhereTheFilmIsAsWideAsThePicture) {
  const std::string film = "\tsetAttr \".cap\" -type \"double2\" 1.6 0.9 ;\n\tsetAttr \".ffo\" 1;\n";
  const std::string picture =
      "select -ne :defaultResolution;\n\tsetAttr \".w\" 1600;\n\tsetAttr \".h\" 900;\n";
  EXPECT_EQ(Baked(CameraScene("", film, picture)).CountOf(diag::Code::PictureEffectLost), 0u);
  EXPECT_EQ(Baked(CameraScene("", film + "\tsetAttr \".lsr\" 2;\n", picture))
                .CountOf(diag::Code::PictureEffectLost),
            1u);
}

TEST(Lens, APanOfTheViewCountsWhereItIsRendered) {
  const std::string pan = "\tsetAttr \".pze\" yes;\n\tsetAttr \".hpn\" 0.2;\n";
  EXPECT_EQ(Baked(CameraScene("", pan)).CountOf(diag::Code::PictureEffectLost), 0u);
  EXPECT_EQ(Baked(CameraScene("", pan + "\tsetAttr \".rpz\" yes;\n")).CountOf(diag::Code::PictureEffectLost),
            1u);
}

TEST(Lens, ACameraWithoutALensIsAnErrorAndTheOthersAreWritten) {
  const std::string other = "createNode transform -n \"b\";\ncreateNode camera -n \"bShape\" -p \"b\";\n";
  for (const char* value : {".fl\" 0", ".fl\" -1", ".cs\" 0"}) {
    const Baked baked(CameraScene("", "\tsetAttr \"" + std::string(value) + ";\n", other));
    EXPECT_EQ(baked.CountOf(diag::Code::CameraWithoutLens), 1u) << value;
    EXPECT_FALSE(baked.Has("shotCamShape")) << value;
    EXPECT_TRUE(baked.Has("bShape")) << value;
    EXPECT_FALSE(baked.report().cameras.at(0).written) << value;
    EXPECT_TRUE(baked.report().cameras.at(1).written) << value;
  }
}

}  // namespace
