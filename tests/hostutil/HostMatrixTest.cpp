#include "hostutil/HostMatrix.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

#include "MatrixTestSupport.h"

namespace hostutil_tests {
namespace {

constexpr double kTolerance = 1e-14;

TEST(HostMatrixTest, TheIdentityHasOnesOnItsDiagonal) {
  TransformMatrix matrix;
  for (auto& row : matrix.m) {
    for (double& value : row) value = 7;
  }
  ASSERT_EQ(MatrixSetIdentity(&matrix), HOST_ERR_NONE);
  for (int row = 0; row < 4; ++row) {
    for (int column = 0; column < 4; ++column) EXPECT_EQ(matrix.m[row][column], row == column ? 1.0 : 0.0);
  }
}

TEST(HostMatrixTest, TheTranslationIsTheLastColumn) {
  TransformMatrix matrix = Identity();
  ASSERT_EQ(MatrixTranslate(&matrix, 2, 3, 5), HOST_ERR_NONE);
  EXPECT_EQ(matrix.m[0][3], 2);
  EXPECT_EQ(matrix.m[1][3], 3);
  EXPECT_EQ(matrix.m[2][3], 5);
  EXPECT_EQ(matrix.m[3][3], 1);
  EXPECT_EQ(matrix.m[3][0], 0);
  ExpectNear(Transformed(matrix, {10, 20, 30}), {12, 23, 35}, 0);
}

TEST(HostMatrixTest, ScalingIsAboutTheOrigin) {
  TransformMatrix matrix = Identity();
  ASSERT_EQ(MatrixTranslate(&matrix, 1, 1, 1), HOST_ERR_NONE);
  ASSERT_EQ(MatrixScale(&matrix, 2, -3, 0.5), HOST_ERR_NONE);
  ExpectNear(Transformed(matrix, {0, 0, 0}), {2, -3, 0.5}, 0);
  ExpectNear(Transformed(matrix, {1, 1, 1}), {4, -6, 1}, 0);
}

TEST(HostMatrixTest, APositiveAngleTurnsCounterClockwiseAsSeenFromTheTipOfTheAxis) {
  const struct {
    Point axis, from, to;
  } cases[] = {{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}},
               {{0, 1, 0}, {0, 0, 1}, {1, 0, 0}},
               {{0, 0, 1}, {1, 0, 0}, {0, 1, 0}}};
  for (const auto& one : cases) {
    TransformMatrix matrix = Identity();
    ASSERT_EQ(MatrixRotateAxis(&matrix, one.axis[0], one.axis[1], one.axis[2], kPi / 2), HOST_ERR_NONE);
    ExpectNear(Transformed(matrix, one.from), one.to, kTolerance);
    ExpectNear(Transformed(matrix, one.axis), one.axis, 0);
    const Point back = {-one.from[0], -one.from[1], -one.from[2]};
    ExpectNear(Transformed(matrix, one.to), back, kTolerance);
  }
}

TEST(HostMatrixTest, AboutACoordinateAxisTheEntriesAreTheCosineAndTheSineThemselves) {
  const double angle = 0.7;
  for (int axis = 0; axis < 3; ++axis) {
    TransformMatrix matrix = Identity();
    ASSERT_EQ(MatrixRotateAxis(&matrix, axis == 0, axis == 1, axis == 2, angle), HOST_ERR_NONE);
    const int next = (axis + 1) % 3;
    const int last = (axis + 2) % 3;
    EXPECT_EQ(matrix.m[axis][axis], 1.0);
    EXPECT_EQ(matrix.m[next][next], std::cos(angle));
    EXPECT_EQ(matrix.m[last][last], std::cos(angle));
    EXPECT_EQ(matrix.m[last][next], std::sin(angle));
    EXPECT_EQ(matrix.m[next][last], -std::sin(angle));
    EXPECT_EQ(matrix.m[axis][next], 0.0);
    EXPECT_EQ(matrix.m[last][axis], 0.0);
  }
}

TEST(HostMatrixTest, EachOperationActsAfterThoseInTheMatrix) {
  TransformMatrix matrix = Identity();
  MatrixTranslate(&matrix, -1, 0, 0);
  MatrixScale(&matrix, 2, 2, 2);
  MatrixRotateAxis(&matrix, 0, 0, 1, kPi / 2);
  MatrixTranslate(&matrix, 0, 10, 0);
  // (4, 1, 0): moved to (3, 1, 0), scaled to (6, 2, 0), turned to (-2, 6, 0), moved to (-2, 16, 0).
  ExpectNear(Transformed(matrix, {4, 1, 0}), {-2, 16, 0}, 1e-13);
}

TEST(HostMatrixTest, ARotationAboutAnyAxisKeepsTheAxisAndTurnsByTheAngle) {
  std::mt19937_64 random(3);
  std::uniform_real_distribution<double> uniform(-1, 1);
  for (int i = 0; i < 2000; ++i) {
    const Point axis = {uniform(random), uniform(random), uniform(random)};
    const double angle = 3 * uniform(random);
    TransformMatrix matrix = Identity();
    ASSERT_EQ(MatrixRotateAxis(&matrix, axis[0], axis[1], axis[2], angle), HOST_ERR_NONE);
    ExpectNear(Transformed(matrix, axis), axis, kTolerance);
    EXPECT_NEAR(matrix.m[0][0] + matrix.m[1][1] + matrix.m[2][2], 1 + 2 * std::cos(angle), kTolerance);
    TransformMatrix back = matrix;
    MatrixRotateAxis(&back, axis[0], axis[1], axis[2], -angle);
    EXPECT_LT(Distance(back, Identity()), kTolerance);
  }
}

// One component of 1 does not make a coordinate axis: the others count.
TEST(HostMatrixTest, AnAxisThatSharesComponentsWithACoordinateAxisIsNotTakenForIt) {
  for (const Point& axis : {Point{1, 0, 2}, Point{1, 2, 0}, Point{0, 1, 2}, Point{2, 1, 0}, Point{0, 2, 1},
                            Point{2, 0, 1}, Point{1, 1, 1}, Point{0, 0, 2}, Point{-1, 0, 0}}) {
    TransformMatrix matrix = Identity();
    ASSERT_EQ(MatrixRotateAxis(&matrix, axis[0], axis[1], axis[2], 0.7), HOST_ERR_NONE);
    ExpectNear(Transformed(matrix, axis), axis, kTolerance);
    // The trace of a rotation is 1 + 2 cos.
    EXPECT_NEAR(matrix.m[0][0] + matrix.m[1][1] + matrix.m[2][2], 1 + 2 * std::cos(0.7), kTolerance);
  }
}

TEST(HostMatrixTest, AlongACoordinateAxisLengthDoesNotMatterAndDirectionDoes) {
  for (int axis = 0; axis < 3; ++axis) {
    const auto turned = [&](double length, double angle) {
      TransformMatrix matrix = Identity();
      const auto on = [&](int which) { return which == axis ? length : 0.0; };
      EXPECT_EQ(MatrixRotateAxis(&matrix, on(0), on(1), on(2), angle), HOST_ERR_NONE);
      return matrix;
    };
    EXPECT_LT(Distance(turned(-1.0, 0.7), turned(1.0, -0.7)), kTolerance);
    EXPECT_LT(Distance(turned(2.5, 0.7), turned(1.0, 0.7)), kTolerance);
    EXPECT_LT(Distance(turned(-0.3, 0.7), turned(1.0, -0.7)), kTolerance);
  }
}

TEST(HostMatrixTest, TheLengthOfTheAxisDoesNotMatter) {
  TransformMatrix unit = Identity();
  MatrixRotateAxis(&unit, 0.6, 0, 0.8, 1.25);
  for (const double length : {5.0, 1e-300, 1e300, 2e-308, 5e307}) {
    TransformMatrix matrix = Identity();
    ASSERT_EQ(MatrixRotateAxis(&matrix, 0.6 * length, 0, 0.8 * length, 1.25), HOST_ERR_NONE);
    EXPECT_LT(Distance(matrix, unit), kTolerance) << length;
  }
}

TEST(HostMatrixTest, AnAxisOfLengthZeroTurnsNothing) {
  TransformMatrix matrix = Identity();
  MatrixTranslate(&matrix, 1, 2, 3);
  const TransformMatrix before = matrix;
  ASSERT_EQ(MatrixRotateAxis(&matrix, 0, -0.0, 0, 1), HOST_ERR_NONE);
  EXPECT_EQ(Distance(matrix, before), 0);
}

TEST(HostMatrixTest, NullMatricesAreRefused) {
  EXPECT_EQ(MatrixSetIdentity(nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(MatrixTranslate(nullptr, 1, 2, 3), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(MatrixScale(nullptr, 1, 2, 3), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(MatrixRotateAxis(nullptr, 1, 0, 0, 1), HOST_ERR_UTILITY_NULL);
}

TEST(HostMatrixTest, AValueThatIsNotFiniteIsFoundByTheDecomposition) {
  for (const double bad :
       {std::numeric_limits<double>::infinity(), std::numeric_limits<double>::quiet_NaN()}) {
    for (int operation = 0; operation < 4; ++operation) {
      TransformMatrix matrix = Identity();
      if (operation == 0) MatrixTranslate(&matrix, 0, bad, 0);
      if (operation == 1) MatrixScale(&matrix, 1, 1, bad);
      if (operation == 2) MatrixRotateAxis(&matrix, 1, 0, 0, bad);
      if (operation == 3) MatrixRotateAxis(&matrix, 1, bad, 0, 1);
      MatrixComponents components;
      EXPECT_EQ(MatrixDecompose(&matrix, &components, nullptr), HOST_ERR_MATRIX_NOT_FINITE) << operation;
    }
  }
}

}  // namespace
}  // namespace hostutil_tests
