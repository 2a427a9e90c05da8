#include "motion/Aim.h"

#include <cmath>

#include "tests/motion/Chance.h"
#include "tests/motion/Near.h"

namespace {

using motion::Aim;
using motion::AimAngles;
using motion::ConstrainedNode;
using motion::Matrix;
using motion::RotateOrder;
using motion::RotationMatrix;
using motion::TargetPoint;
using motion::UpType;
using motion::Vector;
using testmotion::MatrixNear;
using testmotion::VectorNear;

constexpr double kPi = 3.141592653589793;

Vector Direction(const Vector& vector) { return vector * (1.0 / Length(vector)); }

Vector SquarePart(const Vector& vector, const Vector& direction) {
  return vector - direction * Dot(vector, direction);
}

TargetPoint At(const Vector& place) {
  TargetPoint target;
  target.translate = place;
  return target;
}

// The matrix of a parent that keeps directions square to each other.
Matrix Parent(testmotion::Chance* chance) {
  const double scale = chance->Between(0.5, 2.0);
  return motion::Scaling({scale, scale, scale}) * RotationMatrix(chance->Point(3.0), RotateOrder::kXYZ) *
         motion::Translation(chance->Point(10.0));
}

// How the angles turn the node in the world, directions alone.
Matrix TurnInWorld(const Vector& angles, const ConstrainedNode& node) {
  return RotationMatrix(angles, node.order) * RotationMatrix(node.jointOrient, RotateOrder::kXYZ) *
         motion::WithoutOrigin(node.parentMatrix);
}

struct Constellation {
  Aim aim;
  std::vector<TargetPoint> targets;
  ConstrainedNode node;
  Vector target;  // in the world
  Vector place;   // of the node, in the world
};

Constellation AnyConstellation(testmotion::Chance* chance) {
  Constellation any;
  any.aim.aim = chance->Point(1.0);
  any.aim.up = chance->Point(1.0);
  any.aim.worldUp = chance->Point(1.0);
  any.aim.upObject = Parent(chance);
  TargetPoint target = At(chance->Point(20.0));
  target.rotatePivot = chance->Point(3.0);
  target.rotatePivotTranslate = chance->Point(3.0);
  target.parentMatrix = Parent(chance);
  any.targets = {target};
  any.node.translate = chance->Point(5.0);
  any.node.rotatePivot = chance->Point(5.0);
  any.node.rotatePivotTranslate = chance->Point(5.0);
  any.node.parentMatrix = Parent(chance);
  any.node.order = motion::RotateOrderOf(chance->Below(6));
  any.node.jointOrient = chance->Point(1.0);
  any.target = TransformPoint(target.translate + target.rotatePivot + target.rotatePivotTranslate,
                              target.parentMatrix);
  any.place = TransformPoint(any.node.translate + any.node.rotatePivot + any.node.rotatePivotTranslate,
                             any.node.parentMatrix);
  return any;
}

Vector WantedUp(const Constellation& any) {
  switch (any.aim.upType) {
    case UpType::kScene:
      return {0.0, 1.0, 0.0};
    case UpType::kObject:
      return any.aim.upObject.origin - any.place;
    case UpType::kObjectRotation:
      return TransformDirection(any.aim.worldUp, any.aim.upObject);
    default:
      return any.aim.worldUp;
  }
}

TEST(Aim, PointsAtTheTargetWithItsUpInTheHalfPlaneOfWhatIsUp) {
  testmotion::Chance chance(5);
  for (const UpType type : {UpType::kScene, UpType::kObject, UpType::kObjectRotation, UpType::kVector}) {
    for (int round = 0; round < 200; ++round) {
      Constellation any = AnyConstellation(&chance);
      any.aim.upType = type;
      Vector angles;
      ASSERT_TRUE(AimAngles(any.aim, any.targets, any.node, {}, &angles));
      const Matrix turn = TurnInWorld(angles, any.node);
      const Vector toTarget = Direction(any.target - any.place);
      EXPECT_THAT(Direction(TransformDirection(any.aim.aim, turn)), VectorNear(toTarget, 1e-12));
      const Vector up = SquarePart(TransformDirection(any.aim.up, turn), toTarget);
      const Vector wanted = SquarePart(WantedUp(any), toTarget);
      EXPECT_THAT(Direction(up), VectorNear(Direction(wanted), 1e-10));
    }
  }
}

TEST(Aim, WithoutUpTakesTheShortestTurn) {
  Aim aim;
  aim.upType = UpType::kNone;
  Vector angles;
  ASSERT_TRUE(AimAngles(aim, {At({3.0, 3.0, 0.0})}, {}, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{0.0, 0.0, kPi / 4}, 1e-14));
  ASSERT_TRUE(AimAngles(aim, {At({0.0, 0.0, -2.0})}, {}, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{0.0, kPi / 2, 0.0}, 1e-14));
}

TEST(Aim, ACameraLooksAtItsTarget) {
  Aim aim;
  aim.aim = {0.0, 0.0, -1.0};
  ConstrainedNode node;
  node.translate = {0.0, 5.0, 10.0};
  Vector angles;
  ASSERT_TRUE(AimAngles(aim, {At({0.0, 0.0, 5.0})}, node, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{-kPi / 4, 0.0, 0.0}, 1e-14));
}

TEST(Aim, TheOffsetTurnsFirst) {
  Aim aim;
  aim.aim = {0.0, 0.0, -1.0};
  aim.offset = {0.0, 0.0, 0.25};
  ConstrainedNode node;
  Vector angles;
  ASSERT_TRUE(AimAngles(aim, {At({-4.0, 0.0, 0.0})}, node, {}, &angles));
  const Matrix expected = motion::RotationAbout(2, 0.25) * motion::RotationAbout(1, kPi / 2);
  EXPECT_THAT(RotationMatrix(angles, RotateOrder::kXYZ), MatrixNear(expected, 1e-14));
}

TEST(Aim, ATwistTurnsAboutTheAimUnderASceneOrAVector) {
  Aim aim;
  aim.twist = 0.5;
  const Matrix twisted = motion::RotationAbout(0, 0.5);
  Vector angles;
  for (const UpType type : {UpType::kScene, UpType::kVector}) {
    aim.upType = type;
    ASSERT_TRUE(AimAngles(aim, {At({2.0, 0.0, 0.0})}, {}, {}, &angles));
    EXPECT_THAT(RotationMatrix(angles, RotateOrder::kXYZ), MatrixNear(twisted, 1e-14));
  }
  aim.upType = UpType::kObjectRotation;
  ASSERT_TRUE(AimAngles(aim, {At({2.0, 0.0, 0.0})}, {}, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{}, 1e-14));
}

TEST(Aim, SeveralTargetsCountByTheirWeights) {
  TargetPoint first = At({1.0, 0.0, 0.0});
  TargetPoint second = At({0.0, 4.0, 8.0});
  first.weight = 3.0;
  Vector mean;
  ASSERT_TRUE(MeanTarget({first, second}, &mean));
  EXPECT_THAT(mean, VectorNear(Vector{0.75, 1.0, 2.0}, 1e-15));
}

TEST(Aim, TheAnglesFollowThoseOfBefore) {
  Vector angles;
  ASSERT_TRUE(AimAngles({}, {At({3.0, 4.0, 0.0})}, {}, {0.0, 0.0, 4.0 * kPi}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{0.0, 0.0, 4.0 * kPi + std::atan2(4.0, 3.0)}, 1e-14));
}

TEST(Aim, AnUpAlongTheAimStillPointsAtTheTarget) {
  Vector angles;
  ASSERT_TRUE(AimAngles({}, {At({0.0, 3.0, 0.0})}, {}, {}, &angles));
  EXPECT_THAT(TransformDirection({1.0, 0.0, 0.0}, RotationMatrix(angles, RotateOrder::kXYZ)),
              VectorNear(Vector{0.0, 1.0, 0.0}, 1e-14));
  Aim along;
  along.up = {-2.0, 0.0, 0.0};
  ASSERT_TRUE(AimAngles(along, {At({0.0, 0.0, 3.0})}, {}, {}, &angles));
  EXPECT_THAT(TransformDirection({1.0, 0.0, 0.0}, RotationMatrix(angles, RotateOrder::kXYZ)),
              VectorNear(Vector{0.0, 0.0, 1.0}, 1e-14));
}

TEST(Aim, FailsWithoutADirection) {
  Vector angles{1.0, 2.0, 3.0};
  EXPECT_FALSE(AimAngles({}, {}, {}, {}, &angles));
  EXPECT_FALSE(AimAngles({}, {At({0.0, 0.0, 0.0})}, {}, {}, &angles));
  TargetPoint weightless = At({5.0, 0.0, 0.0});
  weightless.weight = 0.0;
  EXPECT_FALSE(AimAngles({}, {weightless}, {}, {}, &angles));
  Aim nowhere;
  nowhere.aim = {};
  EXPECT_FALSE(AimAngles(nowhere, {At({5.0, 0.0, 0.0})}, {}, {}, &angles));
  ConstrainedNode flat;
  flat.parentMatrix = motion::Scaling({1.0, 1.0, 0.0});
  EXPECT_FALSE(AimAngles({}, {At({5.0, 0.0, 0.0})}, flat, {}, &angles));
  EXPECT_EQ(angles, (Vector{1.0, 2.0, 3.0}));
}

TEST(Aim, AnUnknownUpTypeIsAVector) {
  EXPECT_EQ(motion::UpTypeOf(-1), UpType::kVector);
  EXPECT_EQ(motion::UpTypeOf(5), UpType::kVector);
  EXPECT_EQ(motion::UpTypeOf(1), UpType::kObject);
}

TEST(TurnTo, TakesADirectionBackwards) {
  Matrix turn;
  ASSERT_TRUE(motion::TurnTo({1.0, 0.0, 0.0}, {}, {-2.0, 0.0, 0.0}, {}, &turn));
  EXPECT_THAT(TransformDirection({1.0, 0.0, 0.0}, turn), VectorNear(Vector{-1.0, 0.0, 0.0}, 1e-15));
  EXPECT_NEAR(Determinant(turn), 1.0, 1e-15);
}

}  // namespace
