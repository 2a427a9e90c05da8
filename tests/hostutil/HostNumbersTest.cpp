#include "hostutil/HostNumbers.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <limits>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

constexpr double kUntouched = 4711.25;

TEST(HostNumberScanTest, ANumberIsHandedOutAndAnythingElseIsACode) {
  double value = kUntouched;
  EXPECT_EQ(HostNumberScan("-23.976fps", 10, &value), HOST_ERR_NONE);
  EXPECT_EQ(value, -23.976);
  value = kUntouched;
  EXPECT_EQ(HostNumberScan("0x10", 4, &value), HOST_ERR_NUMBER_SYNTAX);
  EXPECT_EQ(HostNumberScan("1e309", 5, &value), HOST_ERR_NUMBER_RANGE);
  EXPECT_EQ(value, kUntouched);
}

TEST(HostNumberScanTest, NullPointersAndNegativeLengthsAreRefused) {
  double value = kUntouched;
  EXPECT_EQ(HostNumberScan(nullptr, 1, &value), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostNumberScan(nullptr, 0, &value), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostNumberScan("1", 1, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostNumberScan("1", -1, &value), HOST_ERR_NUMBER_SYNTAX);
  EXPECT_EQ(value, kUntouched);
}

std::int32_t Order(const HostRatio& a, const HostRatio& b) {
  std::int32_t order = 9;
  EXPECT_EQ(HostRatioCompare(&a, &b, &order), HOST_ERR_NONE);
  return order;
}

TEST(HostRatioCompareTest, RatiosAreComparedByValue) {
  EXPECT_EQ(Order({1, 2}, {2, 4}), 0);
  EXPECT_EQ(Order({1, 3}, {1, 2}), -1);
  EXPECT_EQ(Order({1, 2}, {1, 3}), 1);
  EXPECT_EQ(Order({-1, 2}, {1, 2}), -1);
  EXPECT_EQ(Order({-1, 2}, {-1, 3}), -1);
  EXPECT_EQ(Order({0, 5}, {0, 7}), 0);
  EXPECT_EQ(Order({0, 1}, {-1, 7}), 1);
}

TEST(HostRatioCompareTest, TheLargestValuesAreComparedExactly) {
  const std::uint32_t largest = UINT32_MAX;
  EXPECT_EQ(Order({INT32_MAX, largest}, {INT32_MAX, largest - 1}), -1);
  EXPECT_EQ(Order({INT32_MIN, largest}, {INT32_MIN, largest - 1}), 1);
  EXPECT_EQ(Order({INT32_MIN, 1}, {INT32_MAX, largest}), -1);
  EXPECT_EQ(Order({INT32_MAX, 1}, {INT32_MAX - 1, 1}), 1);
  EXPECT_EQ(Order({INT32_MAX, largest}, {INT32_MAX, largest}), 0);
  EXPECT_EQ(Order({INT32_MIN, 1}, {INT32_MIN, largest}), -1);
}

TEST(HostRatioCompareTest, AZeroDenominatorIsOutOfRangeAndTheOrderStays) {
  const HostRatio sound{1, 1};
  const HostRatio broken{1, 0};
  std::int32_t order = 9;
  EXPECT_EQ(HostRatioCompare(&sound, &broken, &order), HOST_ERR_NUMBER_RANGE);
  EXPECT_EQ(HostRatioCompare(&broken, &sound, &order), HOST_ERR_NUMBER_RANGE);
  EXPECT_EQ(order, 9);
  EXPECT_EQ(HostRatioCompare(nullptr, &sound, &order), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostRatioCompare(&sound, nullptr, &order), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostRatioCompare(&sound, &sound, nullptr), HOST_ERR_UTILITY_NULL);
}

TEST(TruncateTest, DoublesAreTruncatedTowardZero) {
  EXPECT_EQ(TruncateToInt32(0.999), 0);
  EXPECT_EQ(TruncateToInt32(-0.999), 0);
  EXPECT_EQ(TruncateToInt32(1.999), 1);
  EXPECT_EQ(TruncateToInt32(-1.999), -1);
  EXPECT_EQ(TruncateToUInt32(0.999), 0u);
  EXPECT_EQ(TruncateToUInt32(7.999), 7u);
}

TEST(TruncateTest, Int32IsHeldAtItsEnds) {
  const double inf = std::numeric_limits<double>::infinity();
  EXPECT_EQ(TruncateToInt32(2147483646.0), 2147483646);
  EXPECT_EQ(TruncateToInt32(2147483646.999), 2147483646);
  EXPECT_EQ(TruncateToInt32(2147483647.0), INT32_MAX);
  EXPECT_EQ(TruncateToInt32(2147483647.5), INT32_MAX);
  EXPECT_EQ(TruncateToInt32(2147483648.0), INT32_MAX);
  EXPECT_EQ(TruncateToInt32(1e300), INT32_MAX);
  EXPECT_EQ(TruncateToInt32(inf), INT32_MAX);
  EXPECT_EQ(TruncateToInt32(-2147483647.0), -2147483647);
  EXPECT_EQ(TruncateToInt32(-2147483647.999), -2147483647);
  EXPECT_EQ(TruncateToInt32(-2147483648.0), INT32_MIN);
  EXPECT_EQ(TruncateToInt32(-2147483648.999), INT32_MIN);
  EXPECT_EQ(TruncateToInt32(-2147483649.0), INT32_MIN);
  EXPECT_EQ(TruncateToInt32(-inf), INT32_MIN);
}

TEST(TruncateTest, UInt32IsHeldAtItsEnds) {
  const double inf = std::numeric_limits<double>::infinity();
  EXPECT_EQ(TruncateToUInt32(4294967294.0), 4294967294u);
  EXPECT_EQ(TruncateToUInt32(4294967294.999), 4294967294u);
  EXPECT_EQ(TruncateToUInt32(4294967295.0), UINT32_MAX);
  EXPECT_EQ(TruncateToUInt32(4294967296.0), UINT32_MAX);
  EXPECT_EQ(TruncateToUInt32(inf), UINT32_MAX);
  EXPECT_EQ(TruncateToUInt32(-0.5), 0u);
  EXPECT_EQ(TruncateToUInt32(-1.0), 0u);
  EXPECT_EQ(TruncateToUInt32(-inf), 0u);
}

TEST(TruncateTest, NaNIsZero) {
  const double nan = std::numeric_limits<double>::quiet_NaN();
  EXPECT_EQ(TruncateToInt32(nan), 0);
  EXPECT_EQ(TruncateToInt32(-nan), 0);
  EXPECT_EQ(TruncateToUInt32(nan), 0u);
}

}  // namespace
}  // namespace hostutil_tests
