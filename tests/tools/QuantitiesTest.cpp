#include "tools/mayascene/Quantities.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <memory>
#include <utility>
#include <vector>

namespace mayascene {
namespace {

constexpr double kInfinity = std::numeric_limits<double>::infinity();

TEST(Quantities, NumbersHaveAtMostThreeDecimalsAndNoTrailingZeros) {
  EXPECT_EQ(numberText(0.0), "0");
  EXPECT_EQ(numberText(-0.0), "0");
  EXPECT_EQ(numberText(100.0), "100");
  EXPECT_EQ(numberText(-12.5), "-12.5");
  EXPECT_EQ(numberText(2057.3862), "2057.386");
  EXPECT_EQ(numberText(0.9995), "1");
  EXPECT_EQ(numberText(123456789.25), "123456789.25");
}

TEST(Quantities, RoundingNoiseIsZeroAndSmallValuesKeepThreeDigits) {
  EXPECT_EQ(numberText(1.0842021724855044e-19), "0");
  EXPECT_EQ(numberText(-4e-10), "0");
  EXPECT_EQ(numberText(0.00012345), "0.000123");
  EXPECT_EQ(numberText(-2e-7), "-2e-07");
}

TEST(Quantities, WhatIsTooLargeForDigitsHasAnExponent) {
  EXPECT_EQ(numberText(1e15), "1e+15");
  EXPECT_EQ(numberText(-1.7976931348623157e308), "-1.79769e+308");
}

TEST(Quantities, WhatIsNoNumberIsNamed) {
  EXPECT_EQ(numberText(kInfinity), "inf");
  EXPECT_EQ(numberText(-kInfinity), "-inf");
  EXPECT_EQ(numberText(std::nan("")), "nan");
}

TEST(Quantities, OneIsSingularAllElseIsPlural) {
  EXPECT_EQ(countText(0, "key"), "0 keys");
  EXPECT_EQ(countText(1, "key"), "1 key");
  EXPECT_EQ(countText(12, "camera"), "12 cameras");
}

TEST(Quantities, RatiosAreDividedAndNeverByZero) {
  EXPECT_EQ(ratioText({23976, 1000}), "23.976");
  EXPECT_EQ(ratioText({909, 1000}), "0.909");
  EXPECT_EQ(ratioText({24, 0}), "24/0");
}

TEST(Quantities, DurationsAreShownInSecondsAndFrames) {
  EXPECT_EQ(durationText({120000, 24000}, {24, 1}), "5 s (120 frames)");
  EXPECT_EQ(durationText({1000, 24000}, {24, 1}), "0.042 s (1 frame)");
  EXPECT_EQ(durationText({29970, 2997}, {30, 1}), "10 s (300 frames)");
}

TEST(Quantities, WithoutARateThereAreNoFrames) {
  EXPECT_EQ(durationText({120000, 24000}, {0, 1000}), "5 s");
  EXPECT_EQ(durationText({120000, 24000}, {24, 0}), "5 s");
  EXPECT_EQ(durationText({7, 0}, {24, 1}), "7/0 s");
}

refhost::Stream keyed(std::vector<T_Time> times, std::vector<double> values) {
  refhost::Stream stream;
  stream.dimension = 1;
  stream.keys = std::make_unique<refhost::KeyColumns>();
  stream.keys->times = refhost::KeyTimes(std::move(times));
  stream.keys->values = std::move(values);
  return stream;
}

TEST(Quantities, KeysAreShownWithTheirSpan) {
  EXPECT_EQ(keysText(keyed({{0, 24000}}, {5}), {24, 1}), "1 key, frame 0 (0 s)");
  const refhost::Stream several = keyed({{-1000, 24000}, {500, 24000}, {119000, 24000}}, {1, 2, 1});
  EXPECT_EQ(keysText(several, {24, 1}), "3 keys, frames -1 to 119 (-0.042 s to 4.958 s)");
  EXPECT_EQ(keysText(several, {0, 1}), "3 keys, -0.042 s to 4.958 s");
}

TEST(Quantities, KeysOfOneValueAreConstant) {
  EXPECT_EQ(keysText(keyed({{0, 1}, {1, 1}}, {100, 100 + 1e-13}), {24, 1}),
            "2 keys, frames 0 to 24 (0 s to 1 s), constant");
  EXPECT_EQ(keysText(keyed({{0, 1}, {1, 1}}, {kInfinity, kInfinity}), {24, 1}),
            "2 keys, frames 0 to 24 (0 s to 1 s)");
}

TEST(Quantities, ValuesHaveAsManyNumbersAsTheStreamHasDimensions) {
  refhost::Stream stream;
  stream.value[0] = 1.25;
  stream.value[1] = -2.0;
  stream.value[2] = 3.0;
  stream.dimension = 1;
  EXPECT_EQ(valueText(stream), "1.25");
  stream.dimension = 3;
  EXPECT_EQ(valueText(stream), "1.25, -2, 3");
}

}  // namespace
}  // namespace mayascene
