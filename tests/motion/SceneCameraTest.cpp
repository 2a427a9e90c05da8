#include "motion/SceneCamera.h"

#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::Camera;
using motion::Picture;
using motion::SceneCamera;

class SceneCameraTest : public testmotion::EvaluatorTest {};

TEST_F(SceneCameraTest, EveryAttributeIsTaken) {
  Read(
      "createNode camera -n \"shot\";\nsetAttr \".fl\" 50;\nsetAttr \".cap\" -type \"double2\" 1.2 0.8;\n"
      "setAttr \".ff\" 3;\nsetAttr \".lsr\" 2;\nsetAttr \".cs\" 1.5;\nsetAttr \".fio\" -type \"double2\" 0.1 "
      "0.2;\n"
      "setAttr \".se\" yes;\nsetAttr \".hs\" 0.3;\nsetAttr \".vs\" 0.4;\nsetAttr \".soe\" yes;\nsetAttr "
      "\".sos\" 1.1;\n");
  const SceneCamera shot(&evaluator(), At("shot"));
  const Camera camera = shot.Now();
  EXPECT_EQ(camera.focalLength, 50.0);
  EXPECT_EQ(camera.horizontalAperture, 1.2);
  EXPECT_EQ(camera.verticalAperture, 0.8);
  EXPECT_EQ(camera.filmFit, motion::filmfit::kOverscan);
  EXPECT_EQ(camera.lensSqueeze, 2.0);
  EXPECT_EQ(camera.cameraScale, 1.5);
  EXPECT_EQ(camera.horizontalOffset, 0.1);
  EXPECT_EQ(camera.verticalOffset, 0.2);
  EXPECT_TRUE(camera.hasShake);
  EXPECT_EQ(camera.horizontalShake, 0.3);
  EXPECT_EQ(camera.verticalShake, 0.4);
  EXPECT_TRUE(camera.hasShakeOverscan);
  EXPECT_EQ(camera.shakeOverscan, 1.1);
  EXPECT_FALSE(shot.Moves());
  EXPECT_EQ(shot.Numbers().size(), 25u);
}

TEST_F(SceneCameraTest, WhereTheSceneIsSilentTheDefaultsHold) {
  Read("createNode camera -n \"shot\";\n");
  const Camera camera = SceneCamera(&evaluator(), At("shot")).Now();
  const Camera plain;
  EXPECT_EQ(camera.focalLength, plain.focalLength);
  EXPECT_EQ(camera.horizontalAperture, plain.horizontalAperture);
  EXPECT_EQ(camera.verticalAperture, plain.verticalAperture);
  EXPECT_EQ(camera.filmFit, plain.filmFit);
  EXPECT_EQ(camera.lensSqueeze, plain.lensSqueeze);
  EXPECT_EQ(camera.cameraScale, plain.cameraScale);
  EXPECT_FALSE(camera.hasShake);
  EXPECT_FALSE(camera.hasShakeOverscan);
}

TEST_F(SceneCameraTest, WhatChangesThePictureFurtherIsKnown) {
  const auto changes = [this](const std::string& lines) {
    Read("createNode camera -n \"shot\";\n" + lines);
    return SceneCamera(&evaluator(), At("shot")).HasFurtherChanges({});
  };
  EXPECT_FALSE(changes(""));
  for (const char* name : {"psc", "ptsc", "fth", "ftv", "frv", "frc", "ffo"}) {
    EXPECT_TRUE(changes("setAttr \"." + std::string(name) + "\" 0.5;\n")) << name;
  }
  const std::string rendered = "setAttr \".pze\" yes;\nsetAttr \".rpz\" yes;\n";
  EXPECT_FALSE(changes(rendered));
  for (const char* name : {"hpn", "vpn", "zom"}) {
    const std::string value = "setAttr \"." + std::string(name) + "\" 0.5;\n";
    EXPECT_FALSE(changes(value)) << name;
    EXPECT_TRUE(changes(value + rendered)) << name;
  }
}

TEST_F(SceneCameraTest, AnApertureMoves) {
  Read(
      "createNode animCurveTU -n \"line\";\nsetAttr \".tan\" 2;\nsetAttr -s 2 \".ktv[0:1]\"  0 1 10 2;\n"
      "createNode camera -n \"shot\";\nconnectAttr \"line.o\" \"shot.hfa\";\n");
  const SceneCamera shot(&evaluator(), At("shot"));
  EXPECT_TRUE(shot.Moves());
  evaluator().MoveTo(5.0);
  EXPECT_NEAR(shot.Now().horizontalAperture, 1.5, 1e-15);
}

TEST_F(SceneCameraTest, ThePictureIsThatOfTheSettings) {
  scene::Settings settings;
  settings.width.value = 720.0;
  settings.height.value = 576.0;
  settings.deviceAspect.value = 1.25;
  const Picture picture = motion::PictureOf(settings);
  EXPECT_EQ(picture.width, 720.0);
  EXPECT_EQ(picture.height, 576.0);
  EXPECT_EQ(picture.deviceAspect, 1.25);
  // A pixel aspect means the same to both.
  EXPECT_EQ(PixelAspect(picture), settings.pixelAspect());
}

}  // namespace
