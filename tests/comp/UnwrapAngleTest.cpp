#include "comp/UnwrapAngle.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <cmath>
#include <cstring>
#include <limits>
#include <random>

using namespace mayaimport;

namespace {

constexpr double kPi = 3.141592653589793;
constexpr double kTurn = 6.283185307179586;
constexpr double kDegrees = 57.29577951308232;
constexpr double kTolerance = 1e-9;  // of a degree

// One turn at a time.
double UnwrapPlainly(double angle, double previous) {
  while (angle - previous >= kPi) angle += -kTurn;
  while (angle - previous <= -kPi) angle += kTurn;
  return angle;
}

std::uint64_t Bits(double value) {
  std::uint64_t bits = 0;
  std::memcpy(&bits, &value, sizeof bits);
  return bits;
}

TEST(UnwrapAngleTest, AnAngleWithinHalfATurnStaysBitForBit) {
  EXPECT_EQ(Bits(UnwrapAngle(0.1, 3.0)), Bits(0.1));
  EXPECT_EQ(Bits(UnwrapAngle(-3.0, 0.1)), Bits(-3.0));
  EXPECT_EQ(Bits(UnwrapAngle(-0.0, 0.0)), Bits(-0.0));
}

// At a power of two a turn may still change an angle towards 0, where doubles lie closer, and not away from
// it.
TEST(UnwrapAngleTest, AnAngleThatATurnChangesOnOneSideOnlyStays) {
  const double edge = std::ldexp(1.0, 56);
  ASSERT_NE(edge - kTurn, edge);
  ASSERT_EQ(edge + kTurn, edge);
  for (const double angle : {edge, -edge}) {
    EXPECT_EQ(Bits(UnwrapAngle(angle, 0.0)), Bits(angle));
    EXPECT_EQ(Bits(UnwrapAngle(1.0, angle)), Bits(1.0));
  }
}

TEST(UnwrapAngleTest, AnAngleAcrossTheSeamKeepsRunningOn) {
  EXPECT_DOUBLE_EQ(UnwrapAngle(-3.0, 3.0), -3.0 + kTurn);
  EXPECT_DOUBLE_EQ(UnwrapAngle(3.0, -3.0), 3.0 - kTurn);
}

// Both bounds are inclusive: the lower one looks at what the upper one has just taken down to it.
TEST(UnwrapAngleTest, ADifferenceOfExactlyHalfATurnIsReducedAndThenRaisedAgain) {
  EXPECT_EQ(UnwrapAngle(kPi, 0.0), kPi);
  EXPECT_EQ(UnwrapAngle(-kPi, 0.0), kPi);
  EXPECT_EQ(UnwrapAngle(0.0, kPi), kTurn);
  EXPECT_EQ(UnwrapAngle(0.0, -kPi), 0.0);
}

// Where the difference is half a turn, the last bit decides on which side the angle comes to lie: a spin of
// half a turn a key shows a whole turn more or less where it differs.
TEST(UnwrapAngleTest, DifferencesOfHalfTurnsComeToLieOnTheSameSideAsOneTurnAtATime) {
  for (int halfTurns = -400; halfTurns <= 400; ++halfTurns) {
    const double previous = halfTurns * kPi;
    for (const double angle : {kPi, -kPi, 0.0, std::nextafter(kPi, 0.0), std::nextafter(-kPi, 0.0)}) {
      ASSERT_NEAR(UnwrapAngle(angle, previous) * kDegrees, UnwrapPlainly(angle, previous) * kDegrees,
                  kTolerance)
          << angle << " after " << previous;
    }
  }
}

TEST(UnwrapAngleTest, AFewTurnsAgreeWithOneTurnAtATime) {
  std::mt19937_64 random(20240501);
  std::uniform_real_distribution<double> angles(-kPi, kPi);
  std::uniform_real_distribution<double> previous(-4.0 * kTurn, 4.0 * kTurn);
  for (int i = 0; i < 100000; ++i) {
    const double angle = angles(random);
    const double before = previous(random);
    ASSERT_NEAR(UnwrapAngle(angle, before) * kDegrees, UnwrapPlainly(angle, before) * kDegrees, kTolerance)
        << angle << " after " << before;
  }
}

TEST(UnwrapAngleTest, ManyTurnsAgreeWithOneTurnAtATime) {
  std::mt19937_64 random(7);
  std::uniform_real_distribution<double> angles(-kPi, kPi);
  for (double turns = 10.0; turns <= 1e5; turns *= 10.0) {
    double worst = 0.0;
    std::uniform_real_distribution<double> previous(-turns * kTurn, turns * kTurn);
    for (int i = 0; i < 200; ++i) {
      const double angle = angles(random);
      const double before = previous(random);
      const double difference = std::fabs(UnwrapAngle(angle, before) - UnwrapPlainly(angle, before));
      worst = std::max(worst, difference * kDegrees);
    }
    EXPECT_LE(worst, kTolerance) << "up to " << turns << " turns";
  }
}

TEST(UnwrapAngleTest, TheResultLiesLessThanHalfATurnFromThePreviousAngle) {
  std::mt19937_64 random(99);
  for (double range = 1.0; range < 1e12; range *= 10.0) {
    std::uniform_real_distribution<double> values(-range, range);
    for (int i = 0; i < 200; ++i) {
      const double before = values(random);
      const double angle = UnwrapAngle(values(random), before);
      // Near half a turn the steps themselves round, by a step of the larger number.
      const double slack = range * 4.0 * std::numeric_limits<double>::epsilon();
      ASSERT_LE(std::fabs(angle - before), kPi + slack);
    }
  }
}

TEST(UnwrapAngleTest, AMillionTimesAMillionTurnsTakeNoTime) {
  const auto start = std::chrono::steady_clock::now();
  double sum = 0.0;
  for (int i = 0; i < 1000; ++i) sum += UnwrapAngle(0.5, 1e12 * kTurn + i);
  const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - start;
  EXPECT_TRUE(std::isfinite(sum));
  EXPECT_LT(taken.count(), 1.0);  // one turn at a time takes hours
}

TEST(UnwrapAngleTest, AnglesThatAreNotFiniteStayAsTheyAre) {
  constexpr double kInfinity = std::numeric_limits<double>::infinity();
  const double nan = std::numeric_limits<double>::quiet_NaN();
  EXPECT_EQ(UnwrapAngle(kInfinity, 1.0), kInfinity);
  EXPECT_EQ(UnwrapAngle(-kInfinity, 1.0), -kInfinity);
  EXPECT_TRUE(std::isnan(UnwrapAngle(nan, 1.0)));
  for (const double before : {kInfinity, -kInfinity, nan})
    EXPECT_EQ(Bits(UnwrapAngle(1.5, before)), Bits(1.5));
}

TEST(UnwrapAngleTest, AnglesSoLargeThatATurnNoLongerChangesThemStayAsTheyAre) {
  for (const double huge : {1e17, -1e17, 1e300, -1e300, std::numeric_limits<double>::max()}) {
    EXPECT_EQ(Bits(UnwrapAngle(huge, 0.0)), Bits(huge)) << huge;
    EXPECT_EQ(Bits(UnwrapAngle(2.5, huge)), Bits(2.5)) << huge;
    EXPECT_EQ(Bits(UnwrapAngle(huge, -huge)), Bits(huge)) << huge;
  }
}

TEST(UnwrapAngleTest, AnglesAtTheEdgeOfWhatATurnChangesEnd) {
  for (double edge = 1e14; edge < 1e17; edge *= 1.37) {
    EXPECT_TRUE(std::isfinite(UnwrapAngle(edge, 0.25))) << edge;
    EXPECT_TRUE(std::isfinite(UnwrapAngle(0.25, edge))) << edge;
    EXPECT_TRUE(std::isfinite(UnwrapAngle(-edge, edge))) << edge;
  }
}

}  // namespace
