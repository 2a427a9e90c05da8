#include "motion/BetweenKeys.h"

#include <gtest/gtest.h>

namespace {

using motion::Curve;
using motion::CurveData;

constexpr double kRate = 24.0;

// Keys at frames of 24 a second.
CurveData Keys(std::uint8_t type, std::vector<motion::CurveKey> keys) {
  for (motion::CurveKey& key : keys) key.time /= kRate;
  CurveData data;
  data.keys = std::move(keys);
  data.type = type;
  return data;
}

TEST(BetweenKeys, OnlyAtFramesACurveLeavesTheStraightWay) {
  using namespace motion::tangent;
  EXPECT_TRUE(motion::IsCurvedAtFrames(Curve(Keys(kFlat, {{1, 0}, {11, 5}})), kRate));
  EXPECT_FALSE(motion::IsCurvedAtFrames(Curve(Keys(kLinear, {{1, 0}, {11, 5}})), kRate));
  // No frame lies between the keys, or the one in the middle, where the curve crosses the straight way.
  EXPECT_FALSE(motion::IsCurvedAtFrames(Curve(Keys(kFlat, {{1, 0}, {2, 5}, {3, 0}})), kRate));
  EXPECT_FALSE(motion::IsCurvedAtFrames(Curve(Keys(kFlat, {{2, 0}, {4, 5}})), kRate));
  EXPECT_TRUE(motion::IsCurvedAtFrames(Curve(Keys(kFlat, {{2.5, 0}, {4.25, 5}})), kRate));
  EXPECT_FALSE(motion::IsCurvedAtFrames(Curve(CurveData()), kRate));
}

TEST(BetweenKeys, HalfATurnCountsWhereAFrameLiesBetween) {
  const auto turns = [](std::vector<motion::CurveKey> keys) {
    return motion::TurnsFarBetweenFrames(Keys(motion::tangent::kLinear, std::move(keys)), 180.0, kRate);
  };
  EXPECT_TRUE(turns({{1, 0}, {5, 20}, {9, -160}}));
  EXPECT_FALSE(turns({{1, 0}, {5, 20}, {9, -159}}));
  EXPECT_FALSE(turns({{1, 0}, {2, 180}, {3, 720}}));
  EXPECT_FALSE(turns({}));
}

}  // namespace
