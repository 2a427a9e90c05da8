#include "motion/Rotation.h"

#include <cmath>
#include <limits>

#include "tests/motion/Chance.h"
#include "tests/motion/Near.h"

namespace {

using motion::AnglesOf;
using motion::Matrix;
using motion::NearestAngles;
using motion::RotateOrder;
using motion::RotateOrderOf;
using motion::RotationAbout;
using motion::RotationMatrix;
using motion::Vector;
using testmotion::MatrixNear;
using testmotion::VectorNear;

constexpr double kPi = 3.141592653589793;
constexpr RotateOrder kOrders[] = {RotateOrder::kXYZ, RotateOrder::kYZX, RotateOrder::kZXY,
                                   RotateOrder::kXZY, RotateOrder::kYXZ, RotateOrder::kZYX};

TEST(Rotation, TurnsEachAxisToTheNext) {
  EXPECT_THAT(TransformPoint({0.0, 1.0, 0.0}, RotationAbout(0, kPi / 2)),
              VectorNear(Vector{0.0, 0.0, 1.0}, 1e-15));
  EXPECT_THAT(TransformPoint({0.0, 0.0, 1.0}, RotationAbout(1, kPi / 2)),
              VectorNear(Vector{1.0, 0.0, 0.0}, 1e-15));
  EXPECT_THAT(TransformPoint({1.0, 0.0, 0.0}, RotationAbout(2, kPi / 2)),
              VectorNear(Vector{0.0, 1.0, 0.0}, 1e-15));
}

TEST(Rotation, TheCodesNameTheOrderInWhichTheAxesTurn) {
  const Vector angles{0.3, 0.5, 0.7};
  const Matrix x = RotationAbout(0, 0.3);
  const Matrix y = RotationAbout(1, 0.5);
  const Matrix z = RotationAbout(2, 0.7);
  const Matrix products[] = {x * y * z, y * z * x, z * x * y, x * z * y, y * x * z, z * y * x};
  for (int code = 0; code < 6; ++code) {
    EXPECT_THAT(RotationMatrix(angles, RotateOrderOf(code)), MatrixNear(products[code], 1e-15)) << code;
  }
}

TEST(Rotation, AnUnknownOrderIsXYZ) {
  EXPECT_EQ(RotateOrderOf(-1), RotateOrder::kXYZ);
  EXPECT_EQ(RotateOrderOf(6), RotateOrder::kXYZ);
}

TEST(Rotation, AnglesGiveTheRotationBackInEveryOrder) {
  testmotion::Chance chance(1);
  for (const RotateOrder order : kOrders) {
    for (int round = 0; round < 500; ++round) {
      const Vector angles = chance.Point(2.0 * kPi);
      const Matrix rotation = RotationMatrix(angles, order);
      EXPECT_THAT(RotationMatrix(AnglesOf(rotation, order), order), MatrixNear(rotation, 1e-14));
      EXPECT_THAT(NearestAngles(AnglesOf(rotation, order), order, angles), VectorNear(angles, 1e-10));
    }
  }
}

TEST(Rotation, AnglesGiveTheRotationBackAtThePoleAndBesideIt) {
  for (const RotateOrder order : kOrders) {
    for (const double away : {0.0, 1e-15, 1e-12, 0.9e-9, 2e-9, 1e-8, 1e-6}) {
      for (const double pole : {kPi / 2, -kPi / 2}) {
        const Matrix near = RotationMatrix({pole - away, 0.4, 0.7}, order);
        const Matrix nearY = RotationMatrix({0.4, pole - away, 0.7}, order);
        const Matrix nearZ = RotationMatrix({0.4, 0.7, pole - away}, order);
        for (const Matrix& rotation : {near, nearY, nearZ}) {
          EXPECT_THAT(RotationMatrix(AnglesOf(rotation, order), order), MatrixNear(rotation, 2e-9));
        }
      }
    }
  }
}

TEST(Rotation, AtThePoleTheLastAngleIsThatOfBefore) {
  const Matrix rotation = RotationMatrix({0.4, kPi / 2, 0.7}, RotateOrder::kXYZ);
  EXPECT_THAT(AnglesOf(rotation, RotateOrder::kXYZ), VectorNear(Vector{-0.3, kPi / 2, 0.0}, 1e-15));
  EXPECT_THAT(AnglesOf(rotation, RotateOrder::kXYZ, {9.0, 9.0, 0.7}),
              VectorNear(Vector{0.4, kPi / 2, 0.7}, 1e-15));
}

TEST(Rotation, AnglesFollowThoseOfBefore) {
  EXPECT_THAT(NearestAngles({0.1, 0.2, -3.1}, RotateOrder::kXYZ, {0.1, 0.2, 3.1}),
              VectorNear(Vector{0.1, 0.2, -3.1 + 2 * kPi}, 1e-15));
  EXPECT_THAT(NearestAngles({0.1, 0.2, 0.3}, RotateOrder::kXYZ, {20 * kPi, 0.0, 0.0}),
              VectorNear(Vector{20 * kPi + 0.1, 0.2, 0.3}, 1e-13));
  // A tilt over the top: the angle between -90° and 90° goes on beyond.
  EXPECT_THAT(NearestAngles({kPi, 1.5, kPi}, RotateOrder::kXYZ, {0.0, 1.6, 0.0}),
              VectorNear(Vector{0.0, kPi - 1.5, 0.0}, 1e-15));
}

TEST(Rotation, TheOtherWayToTurnIsTheSameRotationInEveryOrder) {
  for (const RotateOrder order : kOrders) {
    const Vector angles{0.3, 0.5, 0.7};
    const Vector near = angles + Vector{kPi, kPi, kPi};
    EXPECT_THAT(RotationMatrix(NearestAngles(angles, order, near), order),
                MatrixNear(RotationMatrix(angles, order), 1e-14));
  }
}

TEST(Rotation, ATurnThatIsNoNumberMovesNothing) {
  const double infinite = std::numeric_limits<double>::infinity();
  EXPECT_EQ(NearestAngles({0.5, 0.25, 1.0}, RotateOrder::kXYZ, {infinite, 0.25, 1.0}),
            (Vector{0.5, 0.25, 1.0}));
}

}  // namespace
