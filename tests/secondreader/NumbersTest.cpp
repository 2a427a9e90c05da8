// The second reader's own numbers, against values that were worked out by hand.
#include "tests/secondreader/Numbers.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <limits>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "tests/secondreader/Dice.h"

namespace secondreader {
namespace {

double read(std::string_view text) {
  double value = -777.0;
  EXPECT_EQ(readNumber(text, &value), HOST_ERR_NONE) << text;
  return value;
}

void expectFailure(std::string_view text, HostError code) {
  double value = -777.0;
  EXPECT_EQ(readNumber(text, &value), code) << text;
  EXPECT_EQ(value, -777.0) << text;
}

TEST(ReadNumberTest, ASignAPointAnExponentAndLettersAreRead) {
  EXPECT_EQ(read("12"), 12.0);
  EXPECT_EQ(read("+12"), 12.0);
  EXPECT_EQ(read("-12"), -12.0);
  EXPECT_EQ(read(".5"), 0.5);
  EXPECT_EQ(read("5."), 5.0);
  EXPECT_EQ(read("-2.5e-1"), -0.25);
  EXPECT_EQ(read("25E+1"), 250.0);
  EXPECT_EQ(read("1e"), 1.0);
  EXPECT_EQ(read("2e3fps"), 2000.0);
  EXPECT_EQ(read("24fps"), 24.0);
}

TEST(ReadNumberTest, WhatIsNoNumberFails) {
  for (const char* text :
       {"", "-", "+", ".", "e5", "--1", "+-1", "1.2.3", "0x10", "1e+", "1e-", "1.#QNAN", "1 ", "inf", "1_"}) {
    expectFailure(text, HOST_ERR_NUMBER_SYNTAX);
  }
}

TEST(ReadNumberTest, TheNearestDoubleIsTaken) {
  EXPECT_EQ(read("0.1"), 0x1.999999999999ap-4);
  EXPECT_EQ(read("0.3"), 0x1.3333333333333p-2);
  EXPECT_EQ(read("1e23"), 0x1.52d02c7e14af6p+76);
  EXPECT_EQ(read("123456789012345678901234567890"), 0x1.8ee90ff6c373ep+96);
}

TEST(ReadNumberTest, OfTwoEquallyNearTheEvenOneIsTaken) {
  // 2^53 is 9007199254740992; from there on every second whole number is a double.
  EXPECT_EQ(read("9007199254740993"), 9007199254740992.0);
  EXPECT_EQ(read("9007199254740995"), 9007199254740996.0);
  EXPECT_EQ(read("9007199254740993.000000000000000000001"), 9007199254740994.0);
  EXPECT_EQ(read("9007199254740994.999999999999999999999"), 9007199254740994.0);
}

TEST(ReadNumberTest, TheEndsOfTheDoublesAreKnown) {
  EXPECT_EQ(read("1.7976931348623158e308"), std::numeric_limits<double>::max());
  expectFailure("1.7976931348623159e308", HOST_ERR_NUMBER_RANGE);
  expectFailure("-1e309", HOST_ERR_NUMBER_RANGE);
  expectFailure("1e99999999999999999999", HOST_ERR_NUMBER_RANGE);
  EXPECT_EQ(read("5e-324"), 0x1p-1074);
  EXPECT_EQ(read("2.4703282292062328e-324"), 0x1p-1074);
  EXPECT_EQ(read("2.4703282292062327e-324"), 0.0);
  EXPECT_EQ(read("2.2250738585072011e-308"), 0x0.fffffffffffffp-1022);
  EXPECT_EQ(read("1e-99999999999999999999"), 0.0);
  EXPECT_EQ(read("0e99999999999999999999"), 0.0);
  EXPECT_TRUE(std::signbit(read("-0")));
  EXPECT_TRUE(std::signbit(read("-1e-400")));
}

TEST(ReadNumberTest, RandomNumbersAreThoseOfTheStandardLibrary) {
  Dice dice(20261122);
  for (int i = 0; i < 3000; ++i) {
    std::string text;
    for (int digits = dice.between(1, 30); digits > 0; --digits) {
      text += static_cast<char>('0' + dice.between(0, 9));
      if (digits == 7) text += '.';
    }
    text += "e" + std::to_string(dice.between(-330, 270));
    EXPECT_EQ(read(text), std::strtod(text.c_str(), nullptr)) << text;
  }
}

TEST(CompareRatiosTest, RatiosAreComparedExactly) {
  EXPECT_EQ(compareRatios({1, 1}, {1000, 1000}), 0);
  EXPECT_EQ(compareRatios({1, 1}, {909, 1000}), 1);
  EXPECT_EQ(compareRatios({1, 1}, {1001, 1000}), -1);
  EXPECT_EQ(compareRatios({-1, 3}, {-1, 2}), 1);
  EXPECT_EQ(compareRatios({-1, 2}, {1, 1000}), -1);
  EXPECT_EQ(compareRatios({0, 7}, {-1, 1000}), 1);
  EXPECT_EQ(compareRatios({2147483647, 4294967295u}, {2147483646, 4294967294u}), 1);
  EXPECT_EQ(compareRatios({-2147483647 - 1, 4294967295u}, {-2147483647, 4294967295u}), -1);
}

TEST(WholePartTest, WhatIsAfterThePointIsCutOffAndTheEndsHold) {
  EXPECT_EQ(wholePart(2.9), 2);
  EXPECT_EQ(wholePart(-2.9), -2);
  EXPECT_EQ(wholePart(2147483647.5), 2147483647);
  EXPECT_EQ(wholePart(-1e300), -2147483647 - 1);
  EXPECT_EQ(wholePart(std::nan("")), 0);
  EXPECT_EQ(wholePartUnsigned(4294967294.9), 4294967294u);
  EXPECT_EQ(wholePartUnsigned(1e300), 4294967295u);
  EXPECT_EQ(wholePartUnsigned(-0.5), 0u);
  EXPECT_EQ(wholePartUnsigned(-7.0), 0u);
  EXPECT_EQ(wholePartUnsigned(std::nan("")), 0u);
}

}  // namespace
}  // namespace secondreader
