#include "maya/SceneRecords.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstddef>

#include "tests/support/ReaderFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::Each;
using ::testing::ElementsAre;

TEST(SceneRecordsTest, ATransformIsUnscaledAndUnconnected) {
  const MAYA_Transform transform = DefaultTransform();
  EXPECT_THAT(Values(transform.name), Each('\0'));
  EXPECT_THAT(Values(transform.parent), Each('\0'));
  EXPECT_THAT(Values(transform.translate), Each(0.0));
  EXPECT_THAT(Values(transform.rotate), Each(0.0));
  EXPECT_THAT(Values(transform.scale), Each(1.0));
  EXPECT_THAT(Values(transform.rotatePivot), Each(0.0));
  EXPECT_THAT(Values(transform.scalePivot), Each(0.0));
  EXPECT_THAT(Values(transform.curve), Each(-1));
  EXPECT_EQ(Values(transform.curve).size(), 12u);
}

TEST(SceneRecordsTest, ACameraHasItsLensAndItsFilmBack) {
  const MAYA_Camera camera = DefaultCamera();
  EXPECT_THAT(Values(camera.name), Each('\0'));
  EXPECT_THAT(Values(camera.parent), Each('\0'));
  EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(1.4173, 0.9449));
  EXPECT_THAT(Values(camera.worldCenterOfInterest), Each(0.0));
  EXPECT_DOUBLE_EQ(camera.focalLength, 35.0);
  EXPECT_EQ(camera.filmFit, 0);
  EXPECT_EQ(camera.orthographic, 0);
  EXPECT_EQ(camera.focalLengthCurve, -1);
}

TEST(SceneRecordsTest, AKeyIsTwoDoubles) {
  EXPECT_EQ(sizeof(MAYA_Key), 16u);
  EXPECT_LT(offsetof(MAYA_Key, time), offsetof(MAYA_Key, value));
}

TEST(SceneRecordsTest, NamesHold255BytesAndTheirEnd) {
  EXPECT_EQ(sizeof(MAYA_Transform::name), 256u);
  EXPECT_EQ(sizeof(MAYA_Transform::parent), 256u);
  EXPECT_EQ(sizeof(MAYA_Camera::name), 256u);
  EXPECT_EQ(sizeof(MAYA_Camera::parent), 256u);
  EXPECT_EQ(sizeof(MAYA_Locator), 512u);
  EXPECT_EQ(offsetof(MAYA_AnimCurve, keys), 512u);
}

TEST(SceneRecordsTest, TheKindsHaveTheirFixedNumbers) {
  EXPECT_EQ(kNoNode, 0);
  EXPECT_EQ(kTransformNode, 1);
  EXPECT_EQ(kCameraNode, 2);
  EXPECT_EQ(kCurveNode, 3);
  EXPECT_EQ(kRenderSettings, 4);
  EXPECT_EQ(kLocatorNode, 5);
}

}  // namespace
}  // namespace testsupport
