#include <cmath>

#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::DoubleNear;
using ::testing::ElementsAre;
using ::testing::Pointwise;

constexpr double kNear = 1e-9;
constexpr double kRadians = 0.017453292519943295;

void Fill(double (&triple)[3], double x, double y, double z) {
  triple[0] = x;
  triple[1] = y;
  triple[2] = z;
}

class TransformTest : public BuilderTest {
 protected:
  TransformTest() { Begin(); }

  void Set() { parser().SetTransform(NewNull(), &node_); }

  void ExpectValue(int id, const std::vector<double>& expected) {
    const refhost::Stream& stream = StreamOf(id);
    for (std::size_t i = 0; i < expected.size(); ++i) {
      EXPECT_NEAR(stream.value[i], expected[i], kNear) << "stream " << id << ", component " << i;
    }
  }

  MAYA_Transform node_ = DefaultTransform();
};

TEST_F(TransformTest, ATransformOfZerosAndUnitScaleYieldsTheDefaults) {
  Set();
  ExpectValue(kAnchor, {0, 0, 0});
  ExpectValue(kScale, {100, 100, 100});
  ExpectValue(kXRotation, {0});
  ExpectValue(kYRotation, {0});
  ExpectValue(kZRotation, {0});
  ExpectValue(kPosition, {0, 0, 0});
}

TEST_F(TransformTest, TheStreamsAreSetInAFixedOrder) {
  Set();
  std::vector<std::string> ids;
  for (const std::string& line : CallsOf(TakeTrace(), "AcquireLayerStream")) {
    ids.push_back(std::string(Field(line, "streamId")));
  }
  EXPECT_THAT(ids, ElementsAre("0", "2", "8", "9", "3", "1"));
}

TEST_F(TransformTest, APointKeepsXAndTurnsYAndZAround) {
  Fill(node_.translate, 1, 2, 3);
  Set();
  ExpectValue(kPosition, {1, -2, -3});
}

TEST_F(TransformTest, WithThePreferenceOnCentimetresBecomePoints) {
  G_use_linear_unitsL = 1;
  Fill(node_.translate, 1, 2, 3);
  Set();
  ExpectValue(kPosition, {72.0 / 2.54, -2.0 * 72.0 / 2.54, -3.0 * 72.0 / 2.54});
  EXPECT_NEAR(StreamOf(kPosition).value[0], 28.346, 1e-3);
  EXPECT_NEAR(StreamOf(kPosition).value[1], -56.692, 1e-3);
  EXPECT_NEAR(StreamOf(kPosition).value[2], -85.039, 1e-3);
}

TEST_F(TransformTest, ATurnAboutXKeepsItsSignAndAboutYAndZChangesIt) {
  Fill(node_.rotate, 90, 0, 0);
  Set();
  ExpectValue(kXRotation, {90});
  Fill(node_.rotate, 0, 90, 0);
  Set();
  ExpectValue(kYRotation, {-90});
  Fill(node_.rotate, 0, 0, 90);
  Set();
  ExpectValue(kZRotation, {-90});
}

TEST_F(TransformTest, TurnsAreTakenAboutXThenYThenZ) {
  Fill(node_.rotate, 10, 20, 30);
  Set();
  ExpectValue(kXRotation, {10});
  ExpectValue(kYRotation, {-20});
  ExpectValue(kZRotation, {-30});
}

TEST_F(TransformTest, ARotatePivotMovesThePositionAndNotTheAnchorPoint) {
  Fill(node_.rotatePivot, 0, 1, 0);
  Fill(node_.rotate, 0, 0, 90);
  Set();
  ExpectValue(kAnchor, {0, 0, 0});
  // In the scene: pivot - R·pivot = (0, 1, 0) - (-1, 0, 0) = (1, 1, 0).
  ExpectValue(kPosition, {1, -1, 0});
  ExpectValue(kZRotation, {-90});
}

TEST_F(TransformTest, AScalePivotMovesThePosition) {
  Fill(node_.scalePivot, 3, 5, 7);
  Fill(node_.scale, 2, 4, 0.5);
  Set();
  // In the scene: pivot - S·pivot.
  ExpectValue(kPosition, {3.0 - 6.0, -(5.0 - 20.0), -(7.0 - 3.5)});
  ExpectValue(kScale, {200, 400, 50});
}

TEST_F(TransformTest, PivotsAreConvertedAsDistancesAndScalesAreNot) {
  G_use_linear_unitsL = 1;
  parser().linearUnit = 5;
  Fill(node_.scalePivot, 1, 0, 0);
  Fill(node_.scale, 3, 1, 1);
  Set();
  ExpectValue(kPosition, {-144, 0, 0});
  ExpectValue(kScale, {300, 100, 100});
}

// A point of the layer through scale, X, Y and Z rotation and position, as a host shows it.
std::vector<double> Shown(const refhost::Layer& layer, const double (&point)[3]) {
  const auto turn = [&](int id) { return layer.findStream(id)->value[0] * kRadians; };
  double p[3];
  for (int i = 0; i < 3; ++i) p[i] = point[i] * layer.findStream(kScale)->value[i] / 100.0;
  const auto rotate = [&p](int a, int b, double angle) {
    const double first = p[a] * std::cos(angle) - p[b] * std::sin(angle);
    p[b] = p[a] * std::sin(angle) + p[b] * std::cos(angle);
    p[a] = first;
  };
  rotate(1, 2, turn(kXRotation));
  rotate(2, 0, turn(kYRotation));
  rotate(0, 1, turn(kZRotation));
  for (int i = 0; i < 3; ++i) p[i] += layer.findStream(kPosition)->value[i];
  return {p[0], p[1], p[2]};
}

// The same point through the scene's transform: scale about its pivot, then X, Y and Z rotation about theirs,
// then translation.
std::vector<double> InScene(const MAYA_Transform& node, const double (&point)[3]) {
  double p[3];
  for (int i = 0; i < 3; ++i) p[i] = (point[i] - node.scalePivot[i]) * node.scale[i] + node.scalePivot[i];
  for (int i = 0; i < 3; ++i) p[i] -= node.rotatePivot[i];
  const auto rotate = [&p](int a, int b, double angle) {
    const double first = p[a] * std::cos(angle) - p[b] * std::sin(angle);
    p[b] = p[a] * std::sin(angle) + p[b] * std::cos(angle);
    p[a] = first;
  };
  rotate(1, 2, node.rotate[0] * kRadians);
  rotate(2, 0, node.rotate[1] * kRadians);
  rotate(0, 1, node.rotate[2] * kRadians);
  return {p[0] + node.rotatePivot[0] + node.translate[0], p[1] + node.rotatePivot[1] + node.translate[1],
          p[2] + node.rotatePivot[2] + node.translate[2]};
}

TEST_F(TransformTest, APointLiesWhereTheSceneHasItWithPivotsAndNegativeScale) {
  Fill(node_.translate, 11, -12, 13);
  Fill(node_.rotate, 25, -40, 110);
  Fill(node_.scale, -1.5, 2.5, 0.75);
  Fill(node_.rotatePivot, 3, -4, 5);
  Fill(node_.scalePivot, -6, 7, 8);
  Set();
  constexpr double kPoints[][3] = {{0, 0, 0}, {1, 2, 3}, {-7, 0.5, 4}};
  for (const auto& point : kPoints) {
    const std::vector<double> scene = InScene(node_, point);
    const double hostPoint[3] = {point[0], -point[1], -point[2]};
    const std::vector<double> expected = {scene[0], -scene[1], -scene[2]};
    EXPECT_THAT(Shown(host().project().layers().back(), hostPoint), Pointwise(DoubleNear(1e-9), expected));
  }
}

TEST_F(TransformTest, InRadiansAValueOfOneIsScaledDownTwice) {
  parser().angleUnit = 2;
  Fill(node_.rotate, 1, 0, 0);
  Set();
  EXPECT_NEAR(StreamOf(kXRotation).value[0], kRadians * kRadians * 57.29577951308232, 1e-12);
}

TEST_F(TransformTest, TheAnchorPointTakesTheTranslateAndSwitchesAimingOn) {
  Fill(node_.translate, 1, 2, 3);
  Fill(node_.rotate, 40, 50, 60);
  Fill(node_.rotatePivot, 9, 9, 9);
  parser().SetAnchorPoint(NewCamera(), &node_);
  ExpectValue(kAnchor, {1, -2, -3});
  EXPECT_TRUE(host().project().layers().back().aimed);
  const std::vector<std::string> trace = TakeTrace();
  ASSERT_EQ(trace.size(), 4u);
  EXPECT_EQ(Field(trace[0], "flag"), "8192");
  EXPECT_EQ(Field(trace[0], "value"), "1");
}

TEST_F(TransformTest, TheAnchorPointIsConvertedAsADistance) {
  G_use_linear_unitsL = 1;
  parser().linearUnit = 5;
  Fill(node_.translate, 1, 2, 3);
  parser().SetAnchorPoint(NewCamera(), &node_);
  ExpectValue(kAnchor, {72, -144, -216});
}

TEST_F(TransformTest, AMatrixThatIsNotFiniteStopsBeforeTheFirstStream) {
  Fill(node_.scale, 1e308, 1e308, 1e308);
  Fill(node_.scalePivot, 1e308, 0, 0);
  VOR_Layer* const layer = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetTransform(layer, &node_); }), HOST_ERR_MATRIX_NOT_FINITE);
  EXPECT_TRUE(TakeTrace().empty());
}

}  // namespace
}  // namespace testsupport
