#include "tests/scan/ExactDecimal.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>

namespace scan_tests {
namespace {

TEST(ExactDecimalTest, IntegersAreWrittenWhole) {
  EXPECT_EQ(ExactDecimal(0, 0), "0");
  EXPECT_EQ(ExactDecimal(7, 0), "7");
  EXPECT_EQ(ExactDecimal(18446744073709551615u, 0), "18446744073709551615");
  EXPECT_EQ(ExactDecimal(4294967296u, 0), "4294967296");
  EXPECT_EQ(ExactDecimal(3, 100), "3802951800684688204490109616128");
}

TEST(ExactDecimalTest, AHalfIsFiveTenths) {
  EXPECT_EQ(ExactDecimal(3, -3), "0.375");
  EXPECT_EQ(ExactDecimal(1, -20), "0.00000095367431640625");
  EXPECT_EQ(ExactDecimal(9007199254740993u, -50), "8.00000000000000088817841970012523233890533447265625");
}

TEST(ExactDecimalTest, EveryDoubleComesBackFromItsDigits) {
  for (int exponent = -1074; exponent <= 971; ++exponent) {
    const std::uint64_t significand =
        exponent == -1074 ? 1 : 9007199254740991u - static_cast<std::uint64_t>(exponent + 1074);
    const double value = std::ldexp(static_cast<double>(significand), exponent);
    EXPECT_EQ(std::strtod(ExactDecimal(significand, exponent).c_str(), nullptr), value) << exponent;
  }
}

}  // namespace
}  // namespace scan_tests
