#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

#include "MatrixTestSupport.h"
#include "hostutil/HostMatrix.h"

namespace hostutil_tests {
namespace {

constexpr double kDegree = kPi / 180;

// Rounding of a handful of products of entries of size 1.
constexpr double kTolerance = 1e-14;

bool AllFinite(const MatrixComponents& c) {
  for (int i = 0; i < 3; ++i) {
    if (!std::isfinite(c.translation[i]) || !std::isfinite(c.scale[i]) || !std::isfinite(c.rotation[i])) {
      return false;
    }
  }
  return true;
}

void ExpectForm(const MatrixComponents& c) {
  EXPECT_TRUE(AllFinite(c));
  EXPECT_GE(c.scale[1], 0);
  EXPECT_GE(c.scale[2], 0);
  EXPECT_LE(std::fabs(c.rotation[1]), kPi / 2);
  EXPECT_LE(std::fabs(c.rotation[0]), kPi);
  EXPECT_LE(std::fabs(c.rotation[2]), kPi);
  for (const double shear : c.shear) EXPECT_EQ(shear, 0);
}

TransformMatrix FromColumns(const Point& x, const Point& y, const Point& z) {
  TransformMatrix matrix = Identity();
  for (std::size_t row = 0; row < 3; ++row) {
    matrix.m[row][0] = x[row];
    matrix.m[row][1] = y[row];
    matrix.m[row][2] = z[row];
  }
  return matrix;
}

TEST(HostMatrixDecomposeTest, TheIdentityHasScaleOneAndNoNegativeZeros) {
  const MatrixComponents c = Decomposed(Identity());
  for (int i = 0; i < 3; ++i) {
    EXPECT_EQ(c.scale[i], 1);
    for (const double zero : {c.translation[i], c.shear[i], c.rotation[i]}) {
      EXPECT_EQ(zero, 0);
      EXPECT_FALSE(std::signbit(zero));
    }
  }
}

TEST(HostMatrixDecomposeTest, EveryComponentComesBackInItsPlace) {
  const MatrixComponents made{{2, 3, 5}, {7, 11, 13}, {0, 0, 0}, {0.1, 0.2, 0.3}};
  const MatrixComponents c = Decomposed(Composed(made));
  for (int i = 0; i < 3; ++i) {
    EXPECT_EQ(c.translation[i], made.translation[i]);
    EXPECT_NEAR(c.scale[i], made.scale[i], 1e-13);
    EXPECT_NEAR(c.rotation[i], made.rotation[i], kTolerance);
  }
}

TEST(HostMatrixDecomposeTest, ScaleAloneIsExact) {
  TransformMatrix matrix = Identity();
  MatrixScale(&matrix, 0.1, 1e10, 3.7);
  const MatrixComponents c = Decomposed(matrix);
  EXPECT_EQ(c.scale[0], 0.1);
  EXPECT_EQ(c.scale[1], 1e10);
  EXPECT_EQ(c.scale[2], 3.7);
}

TEST(HostMatrixDecomposeTest, ASingleAngleComesBackUpToItsRange) {
  for (int degrees = -179; degrees <= 180; ++degrees) {
    for (int axis = 0; axis < 3; ++axis) {
      if (axis == 1 && std::abs(degrees) > 90) continue;
      TransformMatrix matrix = Identity();
      MatrixRotateAxis(&matrix, axis == 0, axis == 1, axis == 2, degrees * kDegree);
      const MatrixComponents c = Decomposed(matrix);
      for (int i = 0; i < 3; ++i) {
        EXPECT_NEAR(c.rotation[i], i == axis ? degrees * kDegree : 0.0, kTolerance) << axis << " " << degrees;
      }
    }
  }
}

TEST(HostMatrixDecomposeTest, ScaleBeforeRotationIsTheMatrixDecomposed) {
  // Rotation after a non-uniform scale: the axes keep their lengths.
  TransformMatrix matrix = Identity();
  MatrixScale(&matrix, 2, 3, 4);
  MatrixRotateAxis(&matrix, 0, 0, 1, kPi / 2);
  const MatrixComponents c = Decomposed(matrix);
  EXPECT_NEAR(c.scale[0], 2, kTolerance);
  EXPECT_NEAR(c.scale[1], 3, kTolerance);
  EXPECT_NEAR(c.scale[2], 4, kTolerance);
  EXPECT_NEAR(c.rotation[2], kPi / 2, kTolerance);
}

TEST(HostMatrixDecomposeTest, ANegativeDeterminantMakesXNegativeAndNoOther) {
  for (int signs = 0; signs < 8; ++signs) {
    const double sx = signs & 1 ? -2 : 2;
    const double sy = signs & 2 ? -3 : 3;
    const double sz = signs & 4 ? -5 : 5;
    TransformMatrix matrix = Identity();
    MatrixScale(&matrix, sx, sy, sz);
    MatrixRotateAxis(&matrix, 1, 2, 3, 0.4);
    const MatrixComponents c = Decomposed(matrix);
    ExpectForm(c);
    EXPECT_NEAR(c.scale[0], sx * sy * sz < 0 ? -2 : 2, kTolerance * 4) << signs;
    EXPECT_NEAR(c.scale[1], 3, kTolerance * 4);
    EXPECT_NEAR(c.scale[2], 5, kTolerance * 4);
    EXPECT_LT(Distance(Composed(c), matrix), kTolerance * 10) << signs;
  }
}

TEST(HostMatrixDecomposeTest, AtThePoleZIsZeroAndXTakesTheRest) {
  for (const double side : {-1.0, 1.0}) {
    for (const double x : {-2.5, -0.5, 0.0, 0.75, 3.0}) {
      for (const double z : {-1.5, 0.0, 0.25}) {
        const MatrixComponents made{{0, 0, 0}, {1, 1, 1}, {0, 0, 0}, {x, side * kPi / 2, z}};
        const TransformMatrix matrix = Composed(made);
        const MatrixComponents c = Decomposed(matrix);
        EXPECT_EQ(c.rotation[2], 0);
        EXPECT_NEAR(c.rotation[1], side * kPi / 2, kTolerance);
        EXPECT_NEAR(std::remainder(c.rotation[0] - (x - side * z), 2 * kPi), 0, kTolerance);
        EXPECT_LT(Distance(Composed(c), matrix), kTolerance);
      }
    }
  }
}

TEST(HostMatrixDecomposeTest, ThePoleBeginsWhereTheCosineOfYIsBelowABillionth) {
  for (const double cosine : {1e-6, 1e-8, 2e-9, 0.5e-9, 1e-10, 1e-12}) {
    const MatrixComponents made{{0, 0, 0}, {1, 1, 1}, {0, 0, 0}, {0.5, std::acos(cosine), 0.25}};
    const TransformMatrix matrix = Composed(made);
    const MatrixComponents c = Decomposed(matrix);
    if (cosine < 1e-9) {
      EXPECT_EQ(c.rotation[2], 0) << cosine;
      EXPECT_NEAR(c.rotation[0], 0.25, 1e-9);
    } else {
      // The two angles are uncertain by the rounding over the cosine; together they are not.
      EXPECT_NEAR(c.rotation[2], 0.25, 1e-15 / cosine) << cosine;
      EXPECT_NEAR(c.rotation[0] - c.rotation[2], 0.25, 1e-9);
    }
    EXPECT_LT(Distance(Composed(c), matrix), cosine < 1e-9 ? 1.1e-9 : kTolerance) << cosine;
  }
}

TEST(HostMatrixDecomposeTest, RandomMatricesComeBack) {
  std::mt19937_64 random(1977);
  std::uniform_real_distribution<double> angle(-kPi, kPi);
  std::uniform_real_distribution<double> offset(-1000, 1000);
  std::uniform_real_distribution<double> logarithm(-3, 3);
  for (int i = 0; i < 20000; ++i) {
    MatrixComponents made{};
    double largest = 0;
    for (int axis = 0; axis < 3; ++axis) {
      made.translation[axis] = offset(random);
      made.scale[axis] = std::pow(10, logarithm(random)) * (random() % 3 == 0 ? -1 : 1);
      // One angle in eight is a multiple of a quarter turn: poles and right angles.
      made.rotation[axis] = random() % 8 == 0 ? kPi / 2 * static_cast<double>(random() % 5) : angle(random);
      largest = std::fmax(largest, std::fabs(made.scale[axis]));
    }
    const TransformMatrix matrix = Composed(made);
    const MatrixComponents c = Decomposed(matrix);
    ExpectForm(c);
    EXPECT_LT(Distance(Composed(c), matrix), kTolerance * largest) << i;
    for (int axis = 0; axis < 3; ++axis) {
      EXPECT_EQ(c.translation[axis], made.translation[axis]);
      EXPECT_NEAR(std::fabs(c.scale[axis]), std::fabs(made.scale[axis]),
                  kTolerance * std::fabs(made.scale[axis]));
    }
    const bool mirrored = made.scale[0] * made.scale[1] * made.scale[2] < 0;
    EXPECT_EQ(c.scale[0] < 0, mirrored) << i;
    if (testing::Test::HasFailure()) return;
  }
}

TEST(HostMatrixDecomposeTest, RandomMatricesWithMissingAxesComeBack) {
  std::mt19937_64 random(11);
  std::uniform_real_distribution<double> angle(-kPi, kPi);
  for (int i = 0; i < 20000; ++i) {
    MatrixComponents made{};
    const auto present = random() % 7;  // at least one axis is missing
    for (int axis = 0; axis < 3; ++axis) {
      made.scale[axis] = present >> axis & 1 ? 2.0 + axis : 0.0;
      made.rotation[axis] = random() % 4 == 0 ? kPi / 2 * static_cast<double>(random() % 5) : angle(random);
    }
    const TransformMatrix matrix = Composed(made);
    const MatrixComponents c = Decomposed(matrix);
    ExpectForm(c);
    EXPECT_LT(Distance(Composed(c), matrix), kTolerance * 4) << i;
    for (int axis = 0; axis < 3; ++axis) EXPECT_NEAR(c.scale[axis], made.scale[axis], kTolerance * 4);
    if (testing::Test::HasFailure()) return;
  }
}

TEST(HostMatrixDecomposeTest, AMissingAxisIsCompletedFromTheTwoOthers) {
  for (int missing = 0; missing < 3; ++missing) {
    MatrixComponents made{{0, 0, 0}, {2, 3, 5}, {0, 0, 0}, {0.3, -0.4, 0.5}};
    made.scale[missing] = 0;
    const MatrixComponents c = Decomposed(Composed(made));
    EXPECT_EQ(c.scale[missing], 0) << missing;
    for (int i = 0; i < 3; ++i) EXPECT_NEAR(c.rotation[i], made.rotation[i], kTolerance) << missing;
  }
}

TEST(HostMatrixDecomposeTest, WithOneAxisTheAnglesThatItLeavesOpenAreZero) {
  const MatrixComponents x = Decomposed(Composed({{0, 0, 0}, {2, 0, 0}, {0, 0, 0}, {0.3, -0.4, 0.5}}));
  EXPECT_NEAR(x.rotation[0], 0, kTolerance);
  EXPECT_NEAR(x.rotation[1], -0.4, kTolerance);
  EXPECT_NEAR(x.rotation[2], 0.5, kTolerance);
  const MatrixComponents y = Decomposed(Composed({{0, 0, 0}, {0, 2, 0}, {0, 0, 0}, {0.3, 0, 0.5}}));
  EXPECT_NEAR(y.rotation[0], 0.3, kTolerance);
  EXPECT_NEAR(y.rotation[1], 0, kTolerance);
  EXPECT_NEAR(y.rotation[2], 0.5, kTolerance);
  for (const double angleX : {0.3, 2.5, -2.5}) {
    const MatrixComponents z = Decomposed(Composed({{0, 0, 0}, {0, 0, 2}, {0, 0, 0}, {angleX, -0.4, 0}}));
    EXPECT_NEAR(z.rotation[0], angleX, kTolerance);
    EXPECT_NEAR(z.rotation[1], -0.4, kTolerance);
    EXPECT_NEAR(z.rotation[2], 0, kTolerance);
  }
}

TEST(HostMatrixDecomposeTest, OneAxisAlongACoordinateAxisIsDecomposedWithoutNaN) {
  for (int axis = 0; axis < 3; ++axis) {
    for (int along = 0; along < 3; ++along) {
      for (const double length : {2.0, -2.0}) {
        TransformMatrix matrix{};
        matrix.m[along][axis] = length;
        matrix.m[3][3] = 1;
        const MatrixComponents c = Decomposed(matrix);
        ExpectForm(c);
        EXPECT_EQ(c.scale[axis], 2);
        EXPECT_LT(Distance(Composed(c), matrix), kTolerance) << axis << " " << along << " " << length;
      }
    }
  }
}

TEST(HostMatrixDecomposeTest, WithoutAnyAxisTheRotationIsZero) {
  TransformMatrix matrix = Identity();
  MatrixScale(&matrix, 0, -0.0, 0);
  MatrixTranslate(&matrix, 1, 2, 3);
  const MatrixComponents c = Decomposed(matrix);
  for (int i = 0; i < 3; ++i) {
    EXPECT_EQ(c.scale[i], 0);
    EXPECT_FALSE(std::signbit(c.scale[i]));
    EXPECT_EQ(c.rotation[i], 0);
    EXPECT_EQ(c.translation[i], i + 1);
  }
}

TEST(HostMatrixDecomposeTest, AxesOnOneLineOrNotAtRightAnglesGiveNoNaN) {
  const Point points[] = {{0, 0, 0}, {1, 0, 0},     {-1, 0, 0}, {0, 2, 0}, {0, 0, 3},
                          {1, 1, 0}, {1, 1, 1e-12}, {0, -1, 1}, {1, 2, 3}, {1, 2, 3.0000000001}};
  for (const Point& x : points) {
    for (const Point& y : points) {
      for (const Point& z : points) {
        const MatrixComponents c = Decomposed(FromColumns(x, y, z));
        ExpectForm(c);
        const Point* const columns[] = {&x, &y, &z};
        for (int i = 0; i < 3; ++i) {
          const Point& p = *columns[i];
          EXPECT_NEAR(std::fabs(c.scale[i]), std::hypot(p[0], p[1], p[2]), kTolerance * 4);
        }
      }
    }
  }
}

// Two directions on one line do not determine the third: the rotation is that of the first alone.
TEST(HostMatrixDecomposeTest, TwoAxesOnOneLineWithoutAThirdTurnAsTheFirstAlone) {
  const Point none{0, 0, 0};
  const Point line{-0.48, 0.6, 0.64};
  const Point same{-0.96, 1.2, 1.28};
  const Point back{0.48, -0.6, -0.64};
  for (const Point& other : {same, back}) {
    const struct {
      TransformMatrix both, alone;
    } cases[] = {{FromColumns(line, other, none), FromColumns(line, none, none)},
                 {FromColumns(line, none, other), FromColumns(line, none, none)},
                 {FromColumns(none, line, other), FromColumns(none, line, none)}};
    for (const auto& one : cases) {
      const MatrixComponents both = Decomposed(one.both);
      const MatrixComponents alone = Decomposed(one.alone);
      ExpectForm(both);
      for (int i = 0; i < 3; ++i) EXPECT_NEAR(both.rotation[i], alone.rotation[i], kTolerance) << i;
    }
  }
}

TEST(HostMatrixDecomposeTest, ThreeAxesOnACoordinateAxisTurnNothingAboutIt) {
  const MatrixComponents flat = Decomposed(FromColumns({2, 0, 0}, {3, 0, 0}, {5, 0, 0}));
  const MatrixComponents upright = Decomposed(FromColumns({0, 0, -2}, {0, 0, 3}, {0, 0, 5}));
  for (int i = 0; i < 3; ++i) EXPECT_EQ(flat.rotation[i], 0) << i;
  EXPECT_EQ(upright.rotation[0], 0);
  EXPECT_DOUBLE_EQ(upright.rotation[1], kPi / 2);
  EXPECT_EQ(upright.rotation[2], 0);
}

TEST(HostMatrixDecomposeTest, AxesNotAtRightAnglesLeaveYAndZToTheFirst) {
  const MatrixComponents sheared = Decomposed(FromColumns({3, 4, 0}, {1, 9, 2}, {5, -1, 7}));
  EXPECT_NEAR(sheared.rotation[2], std::atan2(4.0, 3.0), kTolerance);
  EXPECT_NEAR(sheared.rotation[1], 0, kTolerance);
}

TEST(HostMatrixDecomposeTest, TheLargestAndSmallestMatricesAreFinite) {
  const double largest = std::numeric_limits<double>::max();
  const double smallest = std::numeric_limits<double>::denorm_min();
  for (const double a : {largest, smallest, 1e-300, 1e300}) {
    for (const double b : {largest, smallest, 1.0, 0.0}) {
      const MatrixComponents c = Decomposed(FromColumns({a, b, a}, {b, a, -a}, {-a, a, b}));
      ExpectForm(c);
    }
  }
  EXPECT_EQ(Decomposed(FromColumns({largest, largest, 0}, {0, 0, 1}, {1, -1, 0})).scale[0], largest);
  EXPECT_EQ(Decomposed(FromColumns({smallest, 0, 0}, {0, 1, 0}, {0, 0, 1})).scale[0], smallest);
}

TEST(HostMatrixDecomposeTest, EveryEntryThatIsNotFiniteIsAnError) {
  for (const double bad : {std::numeric_limits<double>::infinity(), -std::numeric_limits<double>::infinity(),
                           std::numeric_limits<double>::quiet_NaN()}) {
    for (int row = 0; row < 4; ++row) {
      for (int column = 0; column < 4; ++column) {
        TransformMatrix matrix = Identity();
        matrix.m[row][column] = bad;
        MatrixComponents components{{9, 9, 9}, {9, 9, 9}, {9, 9, 9}, {9, 9, 9}};
        EXPECT_EQ(MatrixDecompose(&matrix, &components, nullptr), HOST_ERR_MATRIX_NOT_FINITE);
        EXPECT_EQ(components.scale[0], 0) << "nothing is handed out";
      }
    }
  }
}

TEST(HostMatrixDecomposeTest, TheOptionsAreNotReadAndNullPointersAreRefused) {
  const TransformMatrix matrix = Identity();
  MatrixComponents components;
  EXPECT_EQ(MatrixDecompose(&matrix, &components, reinterpret_cast<void*>(1)), HOST_ERR_NONE);
  EXPECT_EQ(MatrixDecompose(nullptr, &components, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(MatrixDecompose(&matrix, nullptr, nullptr), HOST_ERR_UTILITY_NULL);
}

}  // namespace
}  // namespace hostutil_tests
