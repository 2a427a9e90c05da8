#include <cmath>

#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;

constexpr double kNear = 1e-9;

MAYA_Camera Camera() {
  MAYA_Camera camera = DefaultCamera();
  camera.cameraAperture[0] = 1.417;
  camera.cameraAperture[1] = 0.945;
  camera.focalLength = 35.0;
  return camera;
}

class CameraTest : public BuilderTest {
 protected:
  CameraTest() { Use(""); }

  void Use(std::string_view scene) {
    Begin(scene);
    parser().resolutionWidth = 640;
    parser().resolutionHeight = 480;
    parser().pixelAspect = 1.0;
  }
};

// The calls of a lens without a transform, as "call:what matters".
std::vector<std::string> Outline(const std::vector<std::string>& trace) {
  std::vector<std::string> outline;
  for (const std::string& line : trace) {
    std::string entry(Field(line, "call"));
    for (const char* const key : {"layer", "streamId", "flag", "direction", "stream"}) {
      if (!Field(line, key).empty()) entry += " " + std::string(Field(line, key));
    }
    if (entry.find("SetLayerFlag") != std::string::npos) entry += "=" + std::string(Field(line, "value"));
    outline.push_back(entry);
  }
  return outline;
}

TEST_F(CameraTest, AThirtyFiveMillimetreLensOnAHorizontalFilmHasTheZoomOfItsWidth) {
  const MAYA_Camera camera = Camera();
  EXPECT_NEAR(parser().CalculatePixelFit(&camera), 102.024, kNear);
  const double zoom = parser().CalculateZoom(&camera, 102.024, nullptr);
  EXPECT_NEAR(zoom, 640.0 * (35.0 * 72.0 / 25.4) / 102.024, kNear);
  EXPECT_NEAR(zoom, 622.4, 0.05);
}

TEST_F(CameraTest, AVerticalFitUsesTheVerticalApertureAndTheHeight) {
  MAYA_Camera camera = Camera();
  camera.filmFit = 1;
  EXPECT_NEAR(parser().CalculatePixelFit(&camera), 0.945 * 72.0, kNear);
  EXPECT_NEAR(parser().CalculateZoom(&camera, 68.04, nullptr), 480.0 * (35.0 * 72.0 / 25.4) / 68.04, kNear);
}

TEST_F(CameraTest, EveryFitButZeroMeasuresVertically) {
  MAYA_Camera camera = Camera();
  for (const std::int32_t fit : {1, 2, 3, -1, 2147483647}) {
    camera.filmFit = fit;
    EXPECT_NEAR(parser().CalculatePixelFit(&camera), 0.945 * 72.0, kNear) << fit;
  }
}

TEST_F(CameraTest, ThePixelAspectWidensAHorizontalFitAndNotAVerticalOne) {
  parser().pixelAspect = 2.0;
  MAYA_Camera camera = Camera();
  EXPECT_NEAR(parser().CalculateZoom(&camera, 100.0, nullptr), 1280.0 * (35.0 * 72.0 / 25.4) / 100.0, kNear);
  camera.filmFit = 1;
  EXPECT_NEAR(parser().CalculateZoom(&camera, 100.0, nullptr), 480.0 * (35.0 * 72.0 / 25.4) / 100.0, kNear);
}

// Of each of these every other order of the factors gives other bits.
TEST_F(CameraTest, TheZoomIsTheImageSizeTimesTheFocalLengthByTheFilmSizeToTheBit) {
  MAYA_Camera camera = Camera();
  camera.focalLength = 34.7;
  camera.cameraAperture[0] = 1.6735;
  parser().resolutionWidth = 1280;
  parser().pixelAspect = 1.0667;
  EXPECT_EQ(parser().CalculateZoom(&camera, parser().CalculatePixelFit(&camera), nullptr),
            0x1.16a6efcb8d015p+10);
  parser().SetCamera(NewCamera(), &camera);
  EXPECT_EQ(StreamOf(kZoom).value[0], 0x1.16a6efcb8d015p+10);
  camera.filmFit = 1;
  camera.focalLength = 96.4;
  camera.cameraAperture[1] = 0.9559;
  parser().resolutionHeight = 486;
  EXPECT_EQ(parser().CalculateZoom(&camera, parser().CalculatePixelFit(&camera), nullptr),
            0x1.e2665a59ce874p+10);
}

TEST_F(CameraTest, AFocalLengthThatIsGivenStandsForTheCamerasOwn) {
  const MAYA_Camera camera = Camera();
  const double focal = 70.0;
  EXPECT_NEAR(parser().CalculateZoom(&camera, 102.024, &focal),
              2.0 * parser().CalculateZoom(&camera, 102.024, nullptr), kNear);
  const double own = 35.0;
  EXPECT_EQ(parser().CalculateZoom(&camera, 102.024, &own),
            parser().CalculateZoom(&camera, 102.024, nullptr));
}

TEST_F(CameraTest, TheLensIsSetInAFixedOrder) {
  VOR_Layer* const layer = NewCamera();
  const MAYA_Camera camera = Camera();
  parser().SetCamera(layer, &camera);
  EXPECT_THAT(
      Outline(TakeTrace()),
      ElementsAre("\"SetLayerFlag\" \"layer:1\" 8192=0", "\"AcquireLayerStream\" \"layer:1\" 1 \"stream:1\"",
                  "\"SetStreamValue\" \"stream:1\"", "\"ReleaseStream\" \"stream:1\"",
                  "\"SetCameraFilmSize\" \"layer:1\" 1", "\"AcquireLayerStream\" \"layer:1\" 11 \"stream:2\"",
                  "\"SetStreamValue\" \"stream:2\"", "\"ReleaseStream\" \"stream:2\""));
  EXPECT_NEAR(host().project().layers().back().filmSize, 102.024, kNear);
  EXPECT_EQ(StreamOf(kZoom).value[0],
            parser().CalculateZoom(&camera, parser().CalculatePixelFit(&camera), nullptr));
}

TEST_F(CameraTest, AVerticalFitIsMeasuredInDirectionTwo) {
  VOR_Layer* const layer = NewCamera();
  MAYA_Camera camera = Camera();
  camera.filmFit = 1;
  parser().SetCamera(layer, &camera);
  EXPECT_EQ(host().project().layers().back().filmDirection, 2);
  EXPECT_NEAR(host().project().layers().back().filmSize, 68.04, kNear);
}

TEST_F(CameraTest, AnOrthographicCameraGetsTheSameLens) {
  MAYA_Camera camera = Camera();
  parser().SetCamera(NewCamera(), &camera);
  const double zoom = StreamOf(kZoom).value[0];
  camera.orthographic = 1;
  parser().SetCamera(NewCamera(), &camera);
  EXPECT_EQ(StreamOf(kZoom).value[0], zoom);
}

TEST_F(CameraTest, TheLensDoesNotDependOnThePreference) {
  const MAYA_Camera camera = Camera();
  parser().SetCamera(NewCamera(), &camera);
  const double zoom = StreamOf(kZoom).value[0];
  G_use_linear_unitsL = 1;
  parser().SetCamera(NewCamera(), &camera);
  EXPECT_EQ(StreamOf(kZoom).value[0], zoom);
  EXPECT_NEAR(host().project().layers().back().filmSize, 102.024, kNear);
}

TEST_F(CameraTest, ACameraWhoseTransformIsNotThereStaysAtTheOrigin) {
  Use(TransformText("other") + Triple(".t", 1, 2, 3));
  MAYA_Camera camera = Camera();
  std::snprintf(camera.parent, sizeof camera.parent, "nobody");
  parser().SetCamera(NewCamera(), &camera);
  EXPECT_THAT(StreamOf(kPosition).value, ElementsAre(0.0, 0.0, 0.0));
  EXPECT_EQ(TakeTrace().size(), 8u);  // the lens alone
}

TEST_F(CameraTest, TheTransformIsFoundWithoutRegardToCaseAndTheFirstOfANameCounts) {
  Use(TransformText("Rig") + Triple(".t", 4, 5, 6) + TransformText("rIG") + Triple(".t", 7, 8, 9));
  // The second node's values went to the first of their name.
  MAYA_Camera camera = Camera();
  std::snprintf(camera.parent, sizeof camera.parent, "RIG");
  parser().SetCamera(NewCamera(), &camera);
  const double x = TransformAt(0).translate[0];
  EXPECT_NEAR(StreamOf(kPosition).value[0], x, kNear);
}

TEST_F(CameraTest, TheTransformsValuesFollowTheLens) {
  Use(TransformText("rig") + Triple(".t", 4, 5, 6));
  MAYA_Camera camera = Camera();
  std::snprintf(camera.parent, sizeof camera.parent, "rig");
  parser().SetCamera(NewCamera(), &camera);
  std::vector<std::string> ids;
  for (const std::string& line : CallsOf(TakeTrace(), "AcquireLayerStream")) {
    ids.push_back(std::string(Field(line, "streamId")));
  }
  EXPECT_THAT(ids, ElementsAre("1", "11", "0", "2", "8", "9", "3", "1"));
  EXPECT_NEAR(StreamOf(kPosition).value[1], -5.0, kNear);
}

TEST_F(CameraTest, AFilmOfNoSizeGivesAnInfiniteZoomThatIsPassedOn) {
  refhost::HostOptions permissive;
  permissive.permissive = true;
  Begin("", permissive);
  MAYA_Camera camera = Camera();
  camera.cameraAperture[0] = 0.0;
  parser().SetCamera(NewCamera(), &camera);
  EXPECT_EQ(Field(CallsOf(TakeTrace(), "SetStreamValue").back(), "value"), "[\"inf\",0,0,0]");

  camera.focalLength = 0.0;
  parser().SetCamera(NewCamera(), &camera);
  EXPECT_TRUE(std::isnan(StreamOf(kZoom).value[0]));
}

TEST_F(CameraTest, AFilmOfNoSizeIsRefusedByAHostThatIsNotPermissive) {
  VOR_Layer* const layer = NewCamera();
  MAYA_Camera camera = Camera();
  camera.cameraAperture[0] = 0.0;
  EXPECT_EQ(CodeOf([&] { parser().SetCamera(layer, &camera); }), HOST_ERR_BAD_FILM_SIZE);
}

}  // namespace
}  // namespace testsupport
