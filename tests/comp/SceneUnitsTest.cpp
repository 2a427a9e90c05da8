#include <cmath>
#include <cstring>
#include <limits>

#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

class SceneUnitsTest : public BuilderTest {
 protected:
  SceneUnitsTest() { Begin(); }

  double Distance(std::int32_t linearUnit, double distance) {
    parser().linearUnit = linearUnit;
    return parser().ConvertDist(distance);
  }
};

std::uint64_t Bits(double value) {
  std::uint64_t bits = 0;
  std::memcpy(&bits, &value, sizeof bits);
  return bits;
}

constexpr double kDistances[] = {0.0, -0.0, 1.0, -3.7, 0.1, 1e-310, 123456.789, -2.5e17};

TEST_F(SceneUnitsTest, WithThePreferenceOffADistanceStaysBitForBitWhateverTheUnit) {
  G_use_linear_unitsL = 0;
  for (std::int32_t unit = -1; unit <= 9; ++unit) {
    for (const double distance : kDistances) {
      EXPECT_EQ(Bits(Distance(unit, distance)), Bits(distance)) << "unit " << unit << ", " << distance;
    }
    EXPECT_TRUE(std::isnan(Distance(unit, std::numeric_limits<double>::quiet_NaN())));
  }
}

// The operations stand in the order in which they are done; the results are the same bits.
TEST_F(SceneUnitsTest, EveryLinearUnitHasItsRow) {
  G_use_linear_unitsL = 1;
  for (const double d : kDistances) {
    EXPECT_EQ(Distance(1, d), d / 25.4 * 72.0);
    EXPECT_EQ(Distance(2, d), d / 2.54 * 72.0);
    EXPECT_EQ(Distance(3, d), d * 100.0 / 0.0254 * 72.0);
    EXPECT_EQ(Distance(4, d), d * 1000.0 * 100.0 * 72.0);
    EXPECT_EQ(Distance(5, d), d * 72.0);
    EXPECT_EQ(Distance(6, d), d * 12.0 * 72.0);
    EXPECT_EQ(Distance(7, d), d * 36.0 * 72.0);
    EXPECT_EQ(Distance(8, d), d * 5280.0 * 12.0 * 72.0);
  }
}

TEST_F(SceneUnitsTest, EveryOtherLinearCodeIsTakenForCentimetres) {
  G_use_linear_unitsL = 1;
  for (const std::int32_t unit : {0, 9, 12, -1, 2147483647}) {
    EXPECT_EQ(Distance(unit, 3.7), 3.7 / 2.54 * 72.0) << unit;
  }
}

TEST_F(SceneUnitsTest, AnyNonZeroPreferenceConverts) {
  G_use_linear_unitsL = -2;
  EXPECT_EQ(Distance(5, 2.0), 144.0);
}

TEST_F(SceneUnitsTest, AnInchIsSeventyTwoPoints) {
  G_use_linear_unitsL = 1;
  EXPECT_NEAR(Distance(1, 25.4), 72.0, 1e-12);
  EXPECT_NEAR(Distance(2, 2.54), 72.0, 1e-12);
  EXPECT_NEAR(Distance(5, 1.0), 72.0, 1e-12);
  EXPECT_NEAR(Distance(6, 1.0), 864.0, 1e-12);
  EXPECT_NEAR(Distance(7, 1.0), 2592.0, 1e-12);
  EXPECT_NEAR(Distance(8, 1.0), 4561920.0, 1e-9);
}

TEST_F(SceneUnitsTest, MetresComeOutTenThousandTimesLargerThanTheSameNumberOfCentimetres) {
  G_use_linear_unitsL = 1;
  EXPECT_NEAR(Distance(3, 3.7) / Distance(2, 3.7), 10000.0, 1e-8);
  EXPECT_NEAR(Distance(3, 1.0) / Distance(2, 100.0), 100.0, 1e-10);  // of the same length
}

TEST_F(SceneUnitsTest, KilometresLackTheStepFromCentimetresToInches) {
  G_use_linear_unitsL = 1;
  EXPECT_NEAR(Distance(4, 1.0) / Distance(2, 100000.0), 2.54, 1e-12);
}

TEST_F(SceneUnitsTest, RadiansAreMultipliedByTheFactorFromDegreesToRadians) {
  parser().angleUnit = 2;
  EXPECT_EQ(parser().ConvertRot(180.0), 180.0 * 0.017453292519943295);
  EXPECT_EQ(parser().ConvertRot(-1.0), -0.017453292519943295);
}

TEST_F(SceneUnitsTest, EveryOtherAngleCodeLeavesAnglesBitForBit) {
  for (const std::int32_t unit : {1, 0, 3, -1}) {
    parser().angleUnit = unit;
    for (const double angle : {90.0, -0.0, 0.1, 1e300}) {
      EXPECT_EQ(Bits(parser().ConvertRot(angle)), Bits(angle)) << "unit " << unit;
    }
  }
}

TEST_F(SceneUnitsTest, TheAngleDoesNotDependOnThePreference) {
  G_use_linear_unitsL = 1;
  parser().angleUnit = 1;
  EXPECT_EQ(parser().ConvertRot(33.0), 33.0);
}

}  // namespace
}  // namespace testsupport
