#include "motion/Matrix.h"

#include <limits>

#include "tests/motion/Chance.h"
#include "tests/motion/Near.h"

namespace {

using motion::Matrix;
using motion::Vector;
using testmotion::MatrixNear;
using testmotion::VectorNear;

const Matrix kSkewed{{2.0, 0.5, -1.0}, {0.25, 3.0, 1.5}, {-0.75, 1.25, 4.0}, {5.0, 6.0, 7.0}};

TEST(Matrix, APointIsARowBeforeIt) {
  EXPECT_EQ(TransformPoint({1.0, 0.0, 0.0}, kSkewed), (Vector{7.0, 6.5, 6.0}));
  EXPECT_EQ(TransformDirection({0.0, 2.0, 0.0}, kSkewed), (Vector{0.5, 6.0, 3.0}));
}

TEST(Matrix, InAProductTheFirstComesFirst) {
  const Matrix product = motion::Scaling({2.0, 3.0, 4.0}) * motion::Translation({1.0, 1.0, 1.0});
  EXPECT_EQ(TransformPoint({1.0, 1.0, 1.0}, product), (Vector{3.0, 4.0, 5.0}));
}

TEST(Matrix, AnInverseTakesBack) {
  Matrix inverse;
  ASSERT_TRUE(Invert(kSkewed, &inverse));
  EXPECT_THAT(kSkewed * inverse, MatrixNear(Matrix{}, 1e-14));
  EXPECT_THAT(inverse * kSkewed, MatrixNear(Matrix{}, 1e-14));
}

TEST(Matrix, WhatIsFlatOrNotFiniteHasNoInverse) {
  Matrix inverse = kSkewed;
  EXPECT_FALSE(Invert(motion::Scaling({1.0, 0.0, 1.0}), &inverse));
  EXPECT_FALSE(Invert(motion::Scaling({1.0, std::numeric_limits<double>::infinity(), 1.0}), &inverse));
  EXPECT_EQ(inverse, kSkewed);
}

TEST(Matrix, ADeterminantIsNegativeWhereItMirrors) {
  EXPECT_EQ(Determinant(motion::Scaling({2.0, 3.0, 4.0})), 24.0);
  EXPECT_EQ(Determinant(motion::Scaling({2.0, -3.0, 4.0})), -24.0);
}

TEST(Matrix, ItsRotationKeepsTheFirstAxisAndThePlaneOfTheSecond) {
  const Matrix rotation = RotationOf(kSkewed);
  EXPECT_THAT(rotation.x, VectorNear(kSkewed.x * (1.0 / Length(kSkewed.x)), 1e-15));
  EXPECT_NEAR(Dot(rotation.z, kSkewed.y), 0.0, 1e-15);
  EXPECT_GT(Dot(rotation.y, kSkewed.y), 0.0);
  EXPECT_NEAR(Determinant(rotation), 1.0, 1e-15);
  EXPECT_EQ(rotation.origin, Vector{});
}

TEST(Matrix, ItsRotationIsTotal) {
  const Vector axes[] = {{}, {3.0, 0.0, 0.0}, {0.0, 0.0, -2.0}, {1e-300, 2e-300, 0.0}, {1e200, 1e200, 1.0}};
  for (const Vector& x : axes) {
    for (const Vector& y : axes) {
      for (const Vector& z : axes) {
        const Matrix rotation = motion::RotationOf({x, y, z, {}});
        EXPECT_NEAR(Determinant(rotation), 1.0, 1e-14) << testing::PrintToString(Matrix{x, y, z, {}});
        EXPECT_NEAR(Dot(rotation.x, rotation.y), 0.0, 1e-14);
        EXPECT_NEAR(Dot(rotation.x, rotation.z), 0.0, 1e-14);
        EXPECT_NEAR(Length(rotation.x), 1.0, 1e-14);
      }
    }
  }
}

TEST(Matrix, AMissingAxisTakesWhatTheOthersLeave) {
  const Matrix turned{{0.0, 1.0, 0.0}, {0.0, 0.0, 1.0}, {1.0, 0.0, 0.0}, {}};
  EXPECT_THAT(motion::RotationOf({{}, {0.0, 0.0, 2.0}, {5.0, 0.0, 0.0}, {}}), MatrixNear(turned, 1e-15));
  EXPECT_THAT(motion::RotationOf({{0.0, 2.0, 0.0}, {}, {5.0, 0.0, 0.0}, {}}), MatrixNear(turned, 1e-15));
}

}  // namespace
