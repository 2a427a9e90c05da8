#include "motion/Constraints.h"

#include "motion/Quaternion.h"
#include "motion/Transform.h"
#include "tests/motion/Chance.h"
#include "tests/motion/Near.h"

namespace {

using motion::ConstrainedNode;
using motion::Matrix;
using motion::Pose;
using motion::RotateOrder;
using motion::RotationAbout;
using motion::RotationMatrix;
using motion::TargetParent;
using motion::TargetPoint;
using motion::TargetRotation;
using motion::TargetScale;
using motion::Transform;
using motion::Vector;
using testmotion::MatrixNear;
using testmotion::VectorNear;

Matrix AnyMatrix(testmotion::Chance* chance) {
  const double scale = chance->Between(0.5, 2.0);
  return motion::Scaling({scale, scale, scale}) * RotationMatrix(chance->Point(3.0), RotateOrder::kXYZ) *
         motion::Translation(chance->Point(10.0));
}

ConstrainedNode AnyNode(testmotion::Chance* chance) {
  ConstrainedNode node;
  node.rotatePivot = chance->Point(5.0);
  node.rotatePivotTranslate = chance->Point(5.0);
  node.parentMatrix = AnyMatrix(chance);
  node.order = motion::RotateOrderOf(chance->Below(6));
  node.jointOrient = chance->Point(1.0);
  return node;
}

Matrix TurnInWorld(const Vector& angles, const ConstrainedNode& node) {
  return motion::RotationOf(RotationMatrix(angles, node.order) *
                            RotationMatrix(node.jointOrient, RotateOrder::kXYZ) * node.parentMatrix);
}

TEST(PointConstraint, PutsThePivotOnTheTarget) {
  testmotion::Chance chance(6);
  for (int round = 0; round < 200; ++round) {
    const ConstrainedNode node = AnyNode(&chance);
    TargetPoint target;
    target.translate = chance.Point(5.0);
    target.rotatePivot = chance.Point(5.0);
    target.rotatePivotTranslate = chance.Point(5.0);
    target.parentMatrix = AnyMatrix(&chance);
    Vector translate;
    ASSERT_TRUE(PointConstraint({target}, node, {}, &translate));
    const Vector pivot =
        TransformPoint(translate + node.rotatePivot + node.rotatePivotTranslate, node.parentMatrix);
    const Vector wanted = target.translate + target.rotatePivot + target.rotatePivotTranslate;
    EXPECT_THAT(pivot, VectorNear(TransformPoint(wanted, target.parentMatrix), 1e-12));
  }
}

TEST(PointConstraint, AddsItsOffsetInTheParentsSpace) {
  ConstrainedNode node;
  node.parentMatrix = motion::Scaling({2.0, 2.0, 2.0});
  TargetPoint target;
  target.translate = {4.0, 6.0, 8.0};
  Vector translate;
  ASSERT_TRUE(PointConstraint({target}, node, {0.1, 0.2, 0.3}, &translate));
  EXPECT_THAT(translate, VectorNear(Vector{2.1, 3.2, 4.3}, 1e-15));
}

TEST(PointConstraint, FailsWithoutWeightsAndWithAFlatParent) {
  Vector translate{1.0, 2.0, 3.0};
  EXPECT_FALSE(motion::PointConstraint({}, {}, {}, &translate));
  ConstrainedNode flat;
  flat.parentMatrix = motion::Scaling({0.0, 1.0, 1.0});
  EXPECT_FALSE(PointConstraint({TargetPoint{}}, flat, {}, &translate));
  EXPECT_EQ(translate, (Vector{1.0, 2.0, 3.0}));
}

TEST(OrientConstraint, TurnsTheNodeAsTheTargetIsTurned) {
  testmotion::Chance chance(7);
  for (int round = 0; round < 200; ++round) {
    const ConstrainedNode node = AnyNode(&chance);
    TargetRotation target;
    target.rotate = chance.Point(3.0);
    target.order = motion::RotateOrderOf(chance.Below(6));
    target.jointOrient = chance.Point(3.0);
    target.parentMatrix = AnyMatrix(&chance);
    const Vector offset = chance.Point(3.0);
    Vector angles;
    ASSERT_TRUE(OrientConstraint({target}, node, offset, {}, &angles));
    const Matrix wanted = RotationMatrix(offset, RotateOrder::kXYZ) *
                          RotationMatrix(target.rotate, target.order) *
                          RotationMatrix(target.jointOrient, RotateOrder::kXYZ) * target.parentMatrix;
    EXPECT_THAT(TurnInWorld(angles, node), MatrixNear(motion::RotationOf(wanted), 1e-12));
  }
}

TEST(OrientConstraint, OfTwoTargetsIsHalfWay) {
  TargetRotation first;
  TargetRotation second;
  second.rotate = {0.0, 0.8, 0.0};
  Vector angles;
  ASSERT_TRUE(OrientConstraint({first, second}, {}, {}, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{0.0, 0.4, 0.0}, 1e-14));
  second.weight = 3.0;
  ASSERT_TRUE(OrientConstraint({first, second}, {}, {}, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{0.0, 0.6, 0.0}, 1e-14));
  first.weight = 0.0;
  ASSERT_TRUE(OrientConstraint({first, second}, {}, {}, {}, &angles));
  EXPECT_THAT(angles, VectorNear(Vector{0.0, 0.8, 0.0}, 1e-14));
  second.weight = 0.0;
  EXPECT_FALSE(OrientConstraint({first, second}, {}, {}, {}, &angles));
}

// The matrix of the target as it stands in the scene, both pivots at one place.
Matrix WorldOf(const TargetParent& target) {
  Transform transform;
  transform.translate = target.translate;
  transform.rotate = target.rotate;
  transform.scale = target.scale;
  transform.order = target.order;
  transform.rotatePivot = target.rotatePivot;
  transform.scalePivot = target.rotatePivot;
  transform.rotatePivotTranslate = target.rotatePivotTranslate;
  return LocalMatrix(transform) * target.parentMatrix;
}

TEST(ParentConstraint, HoldsTheNodeInTheTargetsSpace) {
  testmotion::Chance chance(8);
  for (int round = 0; round < 200; ++round) {
    const ConstrainedNode node = AnyNode(&chance);
    TargetParent target;
    target.translate = chance.Point(5.0);
    target.rotate = chance.Point(3.0);
    target.scale = Vector{2.0, 2.0, 2.0} + chance.Point(1.0);
    target.order = motion::RotateOrderOf(chance.Below(6));
    target.rotatePivot = chance.Point(5.0);
    target.rotatePivotTranslate = chance.Point(5.0);
    target.parentMatrix = AnyMatrix(&chance);
    target.offsetTranslate = chance.Point(5.0);
    target.offsetRotate = chance.Point(3.0);
    Pose pose;
    ASSERT_TRUE(ParentConstraint({target}, node, {}, &pose));
    const Vector pivot =
        TransformPoint(pose.translate + node.rotatePivot + node.rotatePivotTranslate, node.parentMatrix);
    EXPECT_THAT(
        pivot,
        VectorNear(TransformPoint(target.offsetTranslate + target.rotatePivot, WorldOf(target)), 1e-11));
    const Matrix turn = RotationMatrix(target.offsetRotate, RotateOrder::kXYZ) *
                        RotationMatrix(target.rotate, target.order) * motion::RotationOf(target.parentMatrix);
    EXPECT_THAT(TurnInWorld(pose.rotate, node), MatrixNear(turn, 1e-12));
  }
}

TEST(ParentConstraint, TakesTheTargetsJointOrient) {
  TargetParent target;
  target.rotate = {0.2, 0.0, 0.0};
  target.jointOrient = {0.0, 0.0, 0.3};
  target.offsetTranslate = {1.0, 2.0, 3.0};
  Pose pose;
  ASSERT_TRUE(ParentConstraint({target}, {}, {}, &pose));
  const Matrix turn = RotationAbout(0, 0.2) * RotationAbout(2, 0.3);
  EXPECT_THAT(RotationMatrix(pose.rotate, RotateOrder::kXYZ), MatrixNear(turn, 1e-14));
  EXPECT_THAT(pose.translate, VectorNear(TransformDirection({1.0, 2.0, 3.0}, turn), 1e-14));
}

TEST(ParentConstraint, OfTwoTargetsIsBetweenThem) {
  TargetParent first;
  TargetParent second;
  second.translate = {4.0, 0.0, 0.0};
  second.rotate = {0.0, 0.0, 0.8};
  first.weight = 3.0;
  Pose pose;
  ASSERT_TRUE(ParentConstraint({first, second}, {}, {}, &pose));
  EXPECT_THAT(pose.translate, VectorNear(Vector{1.0, 0.0, 0.0}, 1e-15));
  EXPECT_THAT(pose.rotate, VectorNear(Vector{0.0, 0.0, 0.2}, 1e-14));
  first.weight = second.weight = 0.0;
  EXPECT_FALSE(ParentConstraint({first, second}, {}, {}, &pose));
}

TEST(ScaleConstraint, MakesTheNodeAsLargeAsTheTarget) {
  TargetScale target;
  target.scale = {2.0, 3.0, 4.0};
  target.parentMatrix = motion::Scaling({10.0, 20.0, 30.0}) * RotationAbout(1, 0.7);
  const Matrix parent = motion::Scaling({4.0, 5.0, 6.0}) * RotationAbout(2, 0.3);
  Vector scale;
  ASSERT_TRUE(ScaleConstraint({target}, parent, {1.0, 1.0, 0.5}, &scale));
  EXPECT_THAT(scale, VectorNear(Vector{5.0, 12.0, 10.0}, 1e-13));
}

TEST(ScaleConstraint, FailsWithoutWeightsAndUnderAFlatParent) {
  Vector scale{1.0, 2.0, 3.0};
  EXPECT_FALSE(motion::ScaleConstraint({}, {}, {}, &scale));
  EXPECT_FALSE(ScaleConstraint({TargetScale{}}, motion::Scaling({1.0, 0.0, 1.0}), {1.0, 1.0, 1.0}, &scale));
  EXPECT_EQ(scale, (Vector{1.0, 2.0, 3.0}));
}

TEST(MixRotations, GoesAlongTheShorterArc) {
  for (const int axis : {0, 1, 2}) {
    for (const double angle : {0.5, -2.5, 3.0, 1e-10}) {
      EXPECT_THAT(motion::MixRotations({}, RotationAbout(axis, angle), 0.25),
                  MatrixNear(RotationAbout(axis, angle / 4.0), 1e-14));
    }
  }
  EXPECT_THAT(motion::MixRotations(RotationAbout(0, 3.0), RotationAbout(0, -3.0), 0.5),
              MatrixNear(RotationAbout(0, 3.141592653589793), 1e-14));
}

TEST(MixRotations, EndsAtItsEnds) {
  testmotion::Chance chance(9);
  for (int round = 0; round < 200; ++round) {
    const Matrix from = RotationMatrix(chance.Point(4.0), RotateOrder::kXYZ);
    const Matrix to = RotationMatrix(chance.Point(4.0), RotateOrder::kXYZ);
    EXPECT_THAT(motion::MixRotations(from, to, 0.0), MatrixNear(from, 1e-14));
    EXPECT_THAT(motion::MixRotations(from, to, 1.0), MatrixNear(to, 1e-14));
  }
}

}  // namespace
