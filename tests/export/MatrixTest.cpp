#include "export/Matrix.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <numbers>

#include "tests/support/SplitMix.h"

namespace interchange {
namespace {

constexpr double kRadians = std::numbers::pi / 180.0;

// Turns a point about one axis, by the definition: x to y, y to z, z to x.
Vector Turned(const Vector& p, int axis, double degrees) {
  const double s = std::sin(degrees * kRadians), c = std::cos(degrees * kRadians);
  if (axis == 0) return {p.x, c * p.y - s * p.z, s * p.y + c * p.z};
  if (axis == 1) return {c * p.x + s * p.z, p.y, c * p.z - s * p.x};
  return {c * p.x - s * p.y, s * p.x + c * p.y, p.z};
}

void ExpectNear(const Vector& a, const Vector& b, double tolerance) {
  EXPECT_NEAR(a.x, b.x, tolerance);
  EXPECT_NEAR(a.y, b.y, tolerance);
  EXPECT_NEAR(a.z, b.z, tolerance);
}

struct NamedOrder {
  RotationOrder order;
  int axes[3];  // in the order of their turns
};

constexpr NamedOrder kOrders[] = {
    {RotationOrder::XYZ, {0, 1, 2}}, {RotationOrder::XZY, {0, 2, 1}}, {RotationOrder::YXZ, {1, 0, 2}},
    {RotationOrder::YZX, {1, 2, 0}}, {RotationOrder::ZXY, {2, 0, 1}}, {RotationOrder::ZYX, {2, 1, 0}},
};

double Of(const Vector& v, int axis) { return axis == 0 ? v.x : axis == 1 ? v.y : v.z; }

const Vector kPoint{1.0, 2.0, -3.0};

Vector TurnedInOrder(const Vector& point, const NamedOrder& order, const Vector& degrees) {
  Vector turned = point;
  for (const int axis : order.axes) turned = Turned(turned, axis, Of(degrees, axis));
  return turned;
}

TEST(Matrix, RotatesAboutXThenYThenZ) {
  const Vector degrees{20.0, -130.0, 75.0};
  ExpectNear(TransformPoint(RotationMatrix(degrees), kPoint), TurnedInOrder(kPoint, kOrders[0], degrees),
             1e-14);
}

TEST(Matrix, RightAnglesAreExact) {
  EXPECT_EQ(TransformPoint(RotationMatrix(Vector{90.0, 0.0, 0.0}), {0.0, 1.0, 0.0}), (Vector{0.0, 0.0, 1.0}));
  EXPECT_EQ(TransformPoint(RotationMatrix(Vector{0.0, -450.0, 0.0}), {1.0, 0.0, 0.0}),
            (Vector{0.0, 0.0, 1.0}));
  EXPECT_EQ(TransformPoint(RotationMatrix(Vector{0.0, 0.0, 180.0}), {1.0, 0.0, 0.0}),
            (Vector{-1.0, 0.0, 0.0}));
}

TEST(Matrix, AnglesOfEveryOrderGiveTheRotationBack) {
  std::uint64_t state = 7;
  for (int round = 0; round < 2000; ++round) {
    const auto angle = [&] {
      return static_cast<double>(testsupport::SplitMix(&state) % 7200) * 0.1 - 360.0;
    };
    // Every fourth stands at a pole of some order.
    const Vector degrees{angle(), round % 4 == 0 ? 90.0 : angle(), round % 8 == 0 ? -90.0 : angle()};
    const Matrix rotation = RotationMatrix(degrees);
    for (const NamedOrder& order : kOrders) {
      const Vector near{angle(), angle(), angle()};
      const Vector found = AnglesOf(rotation, order.order, near);
      ExpectNear(TurnedInOrder(kPoint, order, found), TransformPoint(rotation, kPoint), 1e-8);
      EXPECT_LE(std::fabs(found.x - near.x), 360.0);
    }
  }
}

TEST(Matrix, AnglesAreThoseNearestToTheAnglesBefore) {
  const Vector degrees{350.0, 100.0, -720.0};
  const Vector found = AnglesOf(RotationMatrix(degrees), RotationOrder::XYZ, {349.0, 99.0, -719.0});
  ExpectNear(found, degrees, 1e-11);
}

TEST(Matrix, QuaternionsTurnAsTheirMatrices) {
  std::uint64_t state = 11;
  for (int round = 0; round < 2000; ++round) {
    const auto angle = [&] {
      return static_cast<double>(testsupport::SplitMix(&state) % 7200) * 0.1 - 360.0;
    };
    const Matrix rotation = RotationMatrix(Vector{angle(), angle(), angle()});
    const Quaternion q = QuaternionOf(rotation);
    EXPECT_GE(q.w, 0.0);
    EXPECT_NEAR(q.x * q.x + q.y * q.y + q.z * q.z + q.w * q.w, 1.0, 1e-14);
    ExpectNear(TransformPoint(RotationMatrix(q), kPoint), TransformPoint(rotation, kPoint), 1e-13);
  }
}

TEST(Matrix, TheNearestQuaternionIsTheShortWay) {
  const Quaternion before{0.6, 0.0, 0.0, -0.8};
  EXPECT_EQ(Nearest({-0.6, 0.0, 0.0, 0.8}, before), before);
  EXPECT_EQ(Nearest(before, before), before);
}

TEST(Matrix, RigidKeepsTheFirstAxisAndThePlaneOfTheSecond) {
  Matrix matrix;
  matrix.SetColumn(0, {0.0, 5.0, 0.0});
  matrix.SetColumn(1, {-2.0, 9.0, 0.0});
  matrix.SetColumn(2, {0.0, 0.0, -4.0});  // mirrored
  matrix.SetColumn(3, {1.0, 2.0, 3.0});
  const Matrix rigid = RigidOf(matrix);
  ExpectNear(rigid.Column(0), {0.0, 1.0, 0.0}, 1e-15);
  ExpectNear(rigid.Column(1), {-1.0, 0.0, 0.0}, 1e-15);
  ExpectNear(rigid.Column(2), {0.0, 0.0, 1.0}, 1e-15);
  EXPECT_EQ(rigid.Column(3), (Vector{1.0, 2.0, 3.0}));
}

TEST(Matrix, VectorsOfAnyFiniteLengthAreMadeOneLong) {
  const double part = 1.0 / std::sqrt(3.0);
  for (const double size : {5e-324, 1e-320, 1e-308, 1e-270, 1.0, 1e300}) {
    ExpectNear(Normalised({size, -size, size}), {part, -part, part}, 1e-15);
  }
  EXPECT_EQ(Normalised({}), Vector{});
}

TEST(Matrix, RigidOfFlatMatricesIsARotation) {
  for (int zero = 0; zero < 8; ++zero) {
    Matrix matrix = RotationMatrix(Vector{10.0, 20.0, 30.0});
    for (int axis = 0; axis < 3; ++axis) {
      if ((zero >> axis & 1) != 0) matrix.SetColumn(axis, {});
    }
    const Matrix rigid = RigidOf(matrix);
    ExpectNear(Cross(rigid.Column(0), rigid.Column(1)), rigid.Column(2), 1e-15);
    for (int axis = 0; axis < 3; ++axis) EXPECT_NEAR(Length(rigid.Column(axis)), 1.0, 1e-15);
  }
}

}  // namespace
}  // namespace interchange
