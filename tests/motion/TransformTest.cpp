#include "motion/Transform.h"

#include <cmath>

#include "tests/motion/Chance.h"
#include "tests/motion/Near.h"

namespace {

using motion::LocalMatrix;
using motion::Matrix;
using motion::MatrixParts;
using motion::RotateOrder;
using motion::Transform;
using motion::TransformForm;
using motion::Vector;
using testmotion::MatrixNear;
using testmotion::VectorNear;

constexpr double kPi = 3.141592653589793;

// One point on its way through a transform, in plain steps.
Vector TurnAbout(Vector p, int axis, double angle) {
  const int second = (axis + 1) % 3;
  const int third = (axis + 2) % 3;
  const double a = p[second];
  const double b = p[third];
  p[second] = a * std::cos(angle) - b * std::sin(angle);
  p[third] = a * std::sin(angle) + b * std::cos(angle);
  return p;
}

Vector TurnInOrder(Vector p, const Vector& angles, const char* order) {
  for (const char* axis = order; *axis != '\0'; ++axis) p = TurnAbout(p, *axis - 'x', angles[*axis - 'x']);
  return p;
}

constexpr const char* kOrderNames[] = {"xyz", "yzx", "zxy", "xzy", "yxz", "zyx"};

Vector Times(const Vector& a, const Vector& b) { return {a.x * b.x, a.y * b.y, a.z * b.z}; }

Vector Sheared(const Vector& p, const motion::Shear& shear) {
  return {p.x + shear.xy * p.y + shear.xz * p.z, p.y + shear.yz * p.z, p.z};
}

Vector StepByStep(const Transform& t, Vector p) {
  const char* order = kOrderNames[static_cast<int>(t.order)];
  p = Sheared(Times(p - t.scalePivot, t.scale), t.shear) + t.scalePivot + t.scalePivotTranslate;
  p = TurnInOrder(TurnInOrder(p - t.rotatePivot, t.rotateAxis, "xyz"), t.rotate, order);
  return p + t.rotatePivot + t.rotatePivotTranslate + t.translate;
}

Vector JointStepByStep(const Transform& t, Vector p) {
  p = TurnInOrder(Times(p, t.scale), t.rotateAxis, "xyz");
  p = TurnInOrder(p, t.rotate, kOrderNames[static_cast<int>(t.order)]);
  p = TurnInOrder(p, t.jointOrient, "xyz");
  if (t.segmentScale) {
    p = {p.x / t.inverseScale.x, p.y / t.inverseScale.y, p.z / t.inverseScale.z};
  }
  return p + t.translate;
}

Transform AnyTransform(testmotion::Chance* chance) {
  Transform t;
  t.translate = chance->Point(10.0);
  t.rotate = chance->Point(4.0);
  t.scale = chance->Point(3.0);
  t.shear = {chance->Between(-1, 1), chance->Between(-1, 1), chance->Between(-1, 1)};
  t.order = motion::RotateOrderOf(chance->Below(6));
  t.rotateAxis = chance->Point(2.0);
  t.rotatePivot = chance->Point(5.0);
  t.rotatePivotTranslate = chance->Point(5.0);
  t.scalePivot = chance->Point(5.0);
  t.scalePivotTranslate = chance->Point(5.0);
  t.jointOrient = chance->Point(2.0);
  t.inverseScale = chance->Point(2.0);
  t.segmentScale = chance->OneIn(2);
  return t;
}

TEST(Transform, TakesItsStepsInOrder) {
  testmotion::Chance chance(2);
  for (int round = 0; round < 500; ++round) {
    const Transform transform = AnyTransform(&chance);
    const Vector point = chance.Point(20.0);
    EXPECT_THAT(TransformPoint(point, LocalMatrix(transform)),
                VectorNear(StepByStep(transform, point), 1e-12));
  }
}

TEST(Transform, AJointHasNeitherPivotsNorShear) {
  testmotion::Chance chance(3);
  for (int round = 0; round < 500; ++round) {
    Transform joint = AnyTransform(&chance);
    joint.isJoint = true;
    const Vector point = chance.Point(20.0);
    const Vector expected = JointStepByStep(joint, point);
    EXPECT_THAT(TransformPoint(point, LocalMatrix(joint)), VectorNear(expected, 1e-12 * Length(expected)));
  }
}

TEST(Transform, AParentsScaleOfZeroIsNotTakenBack) {
  Transform joint;
  joint.isJoint = true;
  joint.inverseScale = {0.0, 2.0, 4.0};
  EXPECT_EQ(LocalMatrix(joint), motion::Scaling({1.0, 0.5, 0.25}));
}

TEST(Transform, ByDefaultChangesNothing) { EXPECT_EQ(LocalMatrix(Transform{}), Matrix{}); }

TEST(Transform, ALimitHoldsItsChannelWhereItIsOn) {
  Transform transform;
  transform.translate = {5.0, -5.0, 5.0};
  transform.scale = {3.0, 3.0, 3.0};
  transform.translateLimit[0] = {-1.0, 2.0, true, true};
  transform.translateLimit[1] = {-1.0, 2.0, true, false};
  transform.translateLimit[2] = {-1.0, 2.0, true, false};
  transform.scaleLimit[2] = {0.0, 1.5, false, true};
  EXPECT_EQ(LocalMatrix(transform), motion::Scaling({3.0, 3.0, 1.5}) * motion::Translation({2.0, -1.0, 5.0}));
  transform.rotate.y = kPi;
  transform.rotateLimit[1] = {-1.0, 0.0, false, true};
  EXPECT_EQ(LocalMatrix(transform), motion::Scaling({3.0, 3.0, 1.5}) * motion::Translation({2.0, -1.0, 5.0}));
}

TEST(Transform, ItsFormSaysWhatPlainChannelsWouldLose) {
  Transform plain;
  plain.translate = {1.0, 2.0, 3.0};
  plain.rotate = {0.1, 0.2, 0.3};
  plain.scale = {1.0, 2.0, 3.0};
  EXPECT_EQ(FormOf(plain), TransformForm::kPlain);

  Transform pivoted = plain;
  pivoted.rotatePivot.y = 1.0;
  EXPECT_EQ(FormOf(pivoted), TransformForm::kPivoted);
  pivoted = plain;
  pivoted.scalePivot.z = 1.0;
  EXPECT_EQ(FormOf(pivoted), TransformForm::kPivoted);

  Transform other = plain;
  other.order = RotateOrder::kZYX;
  EXPECT_EQ(FormOf(other), TransformForm::kOther);
  other = plain;
  other.rotateAxis.x = 0.1;
  EXPECT_EQ(FormOf(other), TransformForm::kOther);
  other = plain;
  other.rotatePivotTranslate.x = 0.1;
  EXPECT_EQ(FormOf(other), TransformForm::kOther);
  other = plain;
  other.scalePivotTranslate.x = 0.1;
  EXPECT_EQ(FormOf(other), TransformForm::kOther);
  for (double motion::Shear::*const shear : {&motion::Shear::xy, &motion::Shear::xz, &motion::Shear::yz}) {
    other = plain;
    other.shear.*shear = 0.1;
    EXPECT_EQ(FormOf(other), TransformForm::kOther);
  }
}

TEST(Transform, ALimitCountsOnlyWhereItHolds) {
  Transform limited;
  limited.translateLimit[1] = {-1.0, 1.0, true, true};
  EXPECT_EQ(FormOf(limited), TransformForm::kPlain);
  limited.translate.y = 1.5;
  EXPECT_EQ(FormOf(limited), TransformForm::kOther);
}

TEST(Transform, AJointIsPlainWithoutOrientAndWithAnUnscaledParent) {
  Transform joint;
  joint.isJoint = true;
  joint.rotatePivot.x = 1.0;  // a joint has none
  EXPECT_EQ(FormOf(joint), TransformForm::kPlain);
  joint.inverseScale.y = 2.0;
  EXPECT_EQ(FormOf(joint), TransformForm::kOther);
  joint.segmentScale = false;
  EXPECT_EQ(FormOf(joint), TransformForm::kPlain);
  joint.jointOrient.z = 0.5;
  EXPECT_EQ(FormOf(joint), TransformForm::kOther);
}

Matrix Together(const MatrixParts& parts) {
  Transform transform;
  transform.translate = parts.translate;
  transform.rotate = parts.rotate;
  transform.scale = parts.scale;
  transform.shear = parts.shear;
  return LocalMatrix(transform);
}

TEST(TakeApart, GivesPartsThatMakeTheMatrixAgain) {
  testmotion::Chance chance(4);
  for (int round = 0; round < 500; ++round) {
    const Matrix matrix = LocalMatrix(AnyTransform(&chance));
    EXPECT_THAT(Together(TakeApart(matrix)), MatrixNear(matrix, 1e-12));
  }
}

TEST(TakeApart, GivesTheChannelsOfAPlainTransformBack) {
  Transform plain;
  plain.translate = {1.0, 2.0, 3.0};
  plain.rotate = {0.1, -1.2, 7.0};
  plain.scale = {4.0, 5.0, 6.0};
  const MatrixParts parts = TakeApart(LocalMatrix(plain), {0.0, 0.0, 7.5});
  EXPECT_THAT(parts.translate, VectorNear(plain.translate, 1e-14));
  EXPECT_THAT(parts.rotate, VectorNear(plain.rotate, 1e-14));
  EXPECT_THAT(parts.scale, VectorNear(plain.scale, 1e-14));
  EXPECT_NEAR(std::fabs(parts.shear.xy) + std::fabs(parts.shear.xz) + std::fabs(parts.shear.yz), 0.0, 1e-14);
}

TEST(TakeApart, AMirrorIsANegativeXScale) {
  const MatrixParts parts = TakeApart(motion::Scaling({2.0, -3.0, 4.0}));
  EXPECT_THAT(parts.scale, VectorNear(Vector{-2.0, 3.0, 4.0}, 1e-15));
  EXPECT_THAT(Together(parts), MatrixNear(motion::Scaling({2.0, -3.0, 4.0}), 1e-14));
}

TEST(TakeApart, AnAxisOfNoLengthHasScaleZero) {
  Transform flat;
  flat.rotate = {0.3, 0.4, 0.5};
  for (const int axis : {0, 1, 2}) {
    flat.scale = {2.0, 3.0, 4.0};
    flat.scale[axis] = 0.0;
    const MatrixParts parts = TakeApart(LocalMatrix(flat));
    EXPECT_THAT(parts.scale, VectorNear(flat.scale, 1e-14));
    EXPECT_THAT(parts.rotate, VectorNear(flat.rotate, 1e-14));
  }
  EXPECT_THAT(TakeApart(motion::Scaling({0.0, 0.0, 0.0})).rotate, VectorNear(Vector{}, 0.0));
}

TEST(ViewAngles, AreThoseOfARotation) {
  const Vector angles{0.3, -1.2, 2.5};
  const Matrix matrix =
      motion::RotationMatrix(angles, motion::RotateOrder::kXYZ) * motion::Scaling({2.0, 2.0, 2.0});
  EXPECT_THAT(motion::ViewAngles(matrix), VectorNear(angles, 1e-14));
}

TEST(ViewAngles, KeepTheThirdAxisAndThePlaneOfTheSecond) {
  testmotion::Chance chance(5);
  for (int round = 0; round < 200; ++round) {
    const Matrix matrix = LocalMatrix(AnyTransform(&chance));
    const Matrix view = motion::RotationMatrix(motion::ViewAngles(matrix), motion::RotateOrder::kXYZ);
    EXPECT_THAT(view.z, VectorNear(matrix.z * (1.0 / motion::Length(matrix.z)), 1e-12));
    EXPECT_NEAR(motion::Dot(view.x, matrix.y) / motion::Length(matrix.y), 0.0, 1e-12);
    EXPECT_GT(motion::Dot(view.y, matrix.y), 0.0);
  }
}

TEST(Unevenness, IsTheLongestAxisOverTheShortest) {
  Transform transform;
  transform.rotate = {0.3, 0.4, 0.5};
  transform.scale = {3.0, -12.0, 4.0};
  EXPECT_NEAR(motion::Unevenness(LocalMatrix(transform)), 4.0, 1e-14);
  EXPECT_EQ(motion::Unevenness(motion::Scaling({0.0, 0.0, 0.0})), INFINITY);
}

TEST(Skew, IsTheCosineBetweenAxes) {
  Transform transform;
  transform.rotate = {0.3, 0.4, 0.5};
  transform.scale = {2.0, 30.0, 0.004};
  EXPECT_LT(Skew(LocalMatrix(transform)), 1e-15);
  transform.shear.xy = 0.75;  // the second axis is (0.75, 1, 0)
  EXPECT_NEAR(Skew(LocalMatrix(transform)), 0.6, 1e-14);
  EXPECT_EQ(Skew(motion::Scaling({1.0, 0.0, 0.0})), 0.0);
}

TEST(Skew, ArisesFromARotationBelowAnUnevenScale) {
  Transform below;
  below.rotate.z = kPi / 4;
  const Matrix world = LocalMatrix(below) * motion::Scaling({2.0, 1.0, 1.0});
  EXPECT_NEAR(Skew(world), 0.6, 1e-14);  // (2, 1) and (-2, 1)
}

}  // namespace
