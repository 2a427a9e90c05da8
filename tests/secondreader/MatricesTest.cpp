// The second reader's own matrices, compared with turns that follow from the right-hand rule.
#include "tests/secondreader/Matrices.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace secondreader {
namespace {

using ::testing::DoubleNear;
using ::testing::ElementsAre;

constexpr double kQuarter = 1.5707963267948966;
constexpr double kSixth = 0.5235987755982988;  // 30 degrees

Triple moved(const Matrix& matrix, const Triple& point) {
  const std::array<double, 4> column{point[0], point[1], point[2], 1.0};
  Triple result{};
  for (std::size_t row = 0; row < result.size(); ++row) {
    for (std::size_t i = 0; i < column.size(); ++i) result[row] += matrix[row][i] * column[i];
  }
  return result;
}

void expectNear(const Triple& found, const Triple& expected) {
  constexpr double kRounding = 1e-15;
  EXPECT_THAT(found, ElementsAre(DoubleNear(expected[0], kRounding), DoubleNear(expected[1], kRounding),
                                 DoubleNear(expected[2], kRounding)));
}

Matrix turned(const Triple& angles) {
  return after(rotation(2, angles[2]), after(rotation(1, angles[1]), rotation(0, angles[0])));
}

TEST(MatricesTest, AQuarterTurnAboutXCarriesYToZ) {
  expectNear(moved(rotation(0, kQuarter), {2, 3, 0}), {2, 0, 3});
  expectNear(moved(rotation(0, kQuarter), {2, 0, 5}), {2, -5, 0});
}

TEST(MatricesTest, AQuarterTurnAboutYCarriesZToX) {
  expectNear(moved(rotation(1, kQuarter), {0, 3, 5}), {5, 3, 0});
  expectNear(moved(rotation(1, kQuarter), {2, 3, 0}), {0, 3, -2});
}

TEST(MatricesTest, AQuarterTurnAboutZCarriesXToY) {
  expectNear(moved(rotation(2, kQuarter), {2, 0, 5}), {0, 2, 5});
  expectNear(moved(rotation(2, kQuarter), {0, 3, 5}), {-3, 0, 5});
}

TEST(MatricesTest, ATwelfthOfATurnGoesHalfWayUp) {
  expectNear(moved(rotation(0, kSixth), {0, 2, 0}), {0, 1.7320508075688772, 1});
  expectNear(moved(rotation(1, kSixth), {0, 0, 2}), {1, 0, 1.7320508075688772});
  expectNear(moved(rotation(2, kSixth), {2, 0, 0}), {1.7320508075688772, 1, 0});
}

TEST(MatricesTest, TheSecondActsOnWhatTheFirstDid) {
  expectNear(moved(after(translation({1, 2, 3}), scaling({10, 20, 30})), {1, 1, 1}), {11, 22, 33});
  expectNear(moved(after(scaling({10, 20, 30}), translation({1, 2, 3})), {1, 1, 1}), {20, 60, 120});
}

TEST(TakeApartTest, TheLastColumnIsTheTranslation) {
  const auto parts = takeApart(translation({7, -8, -0.0}));
  expectNear(parts->translation, {7, -8, 0});
  EXPECT_FALSE(std::signbit(parts->translation[2]));
  expectNear(parts->scale, {1, 1, 1});
  expectNear(parts->rotation, {0, 0, 0});
}

TEST(TakeApartTest, AnglesAreThoseOfTheTurnsAboutXThenYThenZ) {
  // X carries y to z, and Z then x to y: in all, each axis to the next one.
  const Matrix cyclic{{{0, 0, 1, 0}, {1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 0, 1}}};
  expectNear(takeApart(cyclic)->rotation, {kQuarter, 0, kQuarter});
  for (const Triple& angles : {Triple{0.3, -0.4, 0.5}, {-3.0, 1.5, 2.9}, {1.6, -1.5, -1.6}}) {
    expectNear(takeApart(turned(angles))->rotation, angles);
  }
}

TEST(TakeApartTest, BeyondAQuarterTurnAboutYTheOtherTwoTakeHalfATurn) {
  constexpr double kHalf = 2 * kQuarter;
  expectNear(takeApart(turned({0, 2.0, 0}))->rotation, {kHalf, kHalf - 2.0, kHalf});
}

TEST(TakeApartTest, AtAQuarterTurnAboutYZIsZero) {
  expectNear(takeApart(turned({0.2, kQuarter, 0.5}))->rotation, {0.2 - 0.5, kQuarter, 0});
  expectNear(takeApart(turned({0.2, -kQuarter, 0.5}))->rotation, {0.2 + 0.5, -kQuarter, 0});
}

TEST(TakeApartTest, ScaleIsTheLengthOfTheAxes) {
  expectNear(takeApart(after(turned({0.1, 0.2, 0.3}), scaling({2, 0.5, 4})))->scale, {2, 0.5, 4});
  EXPECT_EQ(takeApart(scaling({1e300, 1e-300, 1}))->scale, (Triple{1e300, 1e-300, 1}));
}

TEST(TakeApartTest, AMirroredMatrixHasANegativeXScale) {
  const auto parts = takeApart(scaling({2, -3, 4}));
  expectNear(parts->scale, {-2, 3, 4});
  expectNear(parts->rotation, {0, 0, 2 * kQuarter});
  expectNear(takeApart(scaling({-2, -3, 4}))->scale, {2, 3, 4});
}

TEST(TakeApartTest, AMissingAxisIsFoundFromTheTwoOthers) {
  for (const Triple& scale : {Triple{0, 3, 4}, {2, 0, 4}, {2, 3, 0}}) {
    const auto parts = takeApart(after(turned({0.3, -0.4, 0.5}), scaling(scale)));
    expectNear(parts->scale, scale);
    expectNear(parts->rotation, {0.3, -0.4, 0.5});
  }
}

TEST(TakeApartTest, AMissingAxisHasTheLengthOfOneBetweenAxesThatAreNotAtRightAngles) {
  // X is (1, 1, 0) in the smallest doubles, Z is (1, 0, 1): the Y at right angles to both is (-1, 1, 1) /
  // sqrt 3.
  Matrix matrix = identity();
  matrix[0] = {5e-324, 0, 1, 0};
  matrix[1] = {5e-324, 0, 0, 0};
  matrix[2] = {0, 0, 1, 0};
  // An eighth of a turn about Z taken back, the second coordinate of Y is 2 / sqrt 6 and that of Z is -1 / 2.
  const Triple angles = takeApart(matrix)->rotation;
  EXPECT_DOUBLE_EQ(angles[2], kQuarter / 2);
  EXPECT_DOUBLE_EQ(angles[1], 0);
  EXPECT_DOUBLE_EQ(angles[0], std::atan2(0.5, 2.0 / std::sqrt(6.0)));
}

TEST(TakeApartTest, AnAxisAloneLeavesItsOwnAngleZero) {
  expectNear(takeApart(after(turned({0.3, -0.4, 0.5}), scaling({2, 0, 0})))->rotation, {0, -0.4, 0.5});
  expectNear(takeApart(after(turned({0.3, 0, 0.5}), scaling({0, 3, 0})))->rotation, {0.3, 0, 0.5});
  expectNear(takeApart(after(turned({0.3, -0.4, 0}), scaling({0, 0, 4})))->rotation, {0.3, -0.4, 0});
  expectNear(takeApart(scaling({0, 0, 0}))->rotation, {0, 0, 0});
}

TEST(TakeApartTest, AMatrixThatIsNotFiniteCannotBeTakenApart) {
  for (std::size_t row = 0; row < 4; ++row) {
    for (std::size_t column = 0; column < 4; ++column) {
      Matrix matrix = identity();
      matrix[row][column] = std::numeric_limits<double>::infinity();
      EXPECT_FALSE(takeApart(matrix).has_value()) << row << ' ' << column;
      matrix[row][column] = std::numeric_limits<double>::quiet_NaN();
      EXPECT_FALSE(takeApart(matrix).has_value()) << row << ' ' << column;
    }
  }
}

}  // namespace
}  // namespace secondreader
