#include "text/Numbers.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace {

TEST(NumbersTest, TheShortestDigitsGiveTheSameBits) {
  EXPECT_EQ(text::ShortestNumber(0.1), "0.1");
  EXPECT_EQ(text::ShortestNumber(24.0), "24");
  EXPECT_EQ(text::ShortestNumber(1.0 / 3.0), "0.3333333333333333");
  EXPECT_EQ(text::ShortestNumber(-1e300), "-1e+300");
  EXPECT_EQ(text::ShortestNumber(std::numeric_limits<double>::denorm_min()), "5e-324");
  EXPECT_EQ(text::ShortestNumber(-std::numeric_limits<double>::max()), "-1.7976931348623157e+308");
}

TEST(NumbersTest, ARoundedNumberHasThreeDecimalsAtMost) {
  EXPECT_EQ(text::RoundedNumber(1.0 / 3.0), "0.333");
  EXPECT_EQ(text::RoundedNumber(2.9996), "3");
  EXPECT_EQ(text::RoundedNumber(12.5), "12.5");
  EXPECT_EQ(text::RoundedNumber(1200.0), "1200");
  EXPECT_EQ(text::RoundedNumber(-999999999999999.875), "-999999999999999.875");
}

TEST(NumbersTest, WhatIsRoundedToZeroHasNoSign) {
  EXPECT_EQ(text::RoundedNumber(-0.0001), "0");
  EXPECT_EQ(text::RoundedNumber(-0.0), "0");
}

TEST(NumbersTest, VeryLargeNumbersAndNoNumbersAreNotRounded) {
  EXPECT_EQ(text::RoundedNumber(1e15), "1e+15");
  EXPECT_EQ(text::RoundedNumber(-1e300), "-1e+300");
  EXPECT_EQ(text::RoundedNumber(INFINITY), "inf");
  EXPECT_EQ(text::RoundedNumber(NAN), "nan");
}

}  // namespace
