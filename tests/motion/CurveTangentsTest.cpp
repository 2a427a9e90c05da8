#include "motion/CurveTangents.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using motion::CurveData;
using motion::Side;
using motion::Slope;
using motion::TangentAt;
namespace tangent = motion::tangent;

constexpr double kRounding = 1e-14;

// Slopes 2 before and 8 after the middle key, 4 across it.
CurveData Rising(std::uint8_t type) {
  CurveData data;
  data.keys = {{0.0, 0.0}, {2.0, 4.0}, {3.0, 12.0}};
  data.type = type;
  return data;
}

double SlopeAt(const CurveData& data, Side side, std::size_t key) {
  return Slope(TangentAt(data, side, key));
}

struct RuleCase {
  const char* name;
  std::uint8_t type;
  double before, in, out, after;  // out of the first key, in and out of the middle one, into the last one
};

class TangentRule : public testing::TestWithParam<RuleCase> {};

TEST_P(TangentRule, GivesTheSlopes) {
  const CurveData data = Rising(GetParam().type);
  EXPECT_NEAR(SlopeAt(data, Side::kOut, 0), GetParam().before, kRounding);
  EXPECT_NEAR(SlopeAt(data, Side::kIn, 1), GetParam().in, kRounding);
  EXPECT_NEAR(SlopeAt(data, Side::kOut, 1), GetParam().out, kRounding);
  EXPECT_NEAR(SlopeAt(data, Side::kIn, 2), GetParam().after, kRounding);
}

// Two thirds of the way: auto ease mixes by 0.5 + (1/6) (1.5 - 2/36), auto mix by 2/3; both stay below 3
// times 2.
constexpr double kEased = 2.0 + 6.0 * (0.5 + (1.5 - 1.0 / 18.0) / 6.0);

INSTANTIATE_TEST_SUITE_P(Types, TangentRule,
                         testing::Values(RuleCase{"Linear", tangent::kLinear, 2.0, 2.0, 8.0, 8.0},
                                         RuleCase{"Flat", tangent::kFlat, 0.0, 0.0, 0.0, 0.0},
                                         RuleCase{"Spline", tangent::kSpline, 2.0, 4.0, 4.0, 8.0},
                                         RuleCase{"Clamped", tangent::kClamped, 2.0, 4.0, 4.0, 8.0},
                                         RuleCase{"Plateau", tangent::kPlateau, 0.0, 4.0, 4.0, 0.0},
                                         RuleCase{"Auto", tangent::kAuto, 0.0, 4.0, 4.0, 0.0},
                                         RuleCase{"AutoEase", tangent::kAutoEase, 0.0, 6.0, 6.0, 0.0},
                                         RuleCase{"AutoMix", tangent::kAutoMix, 0.0, 6.0, 6.0, 0.0},
                                         RuleCase{"Slow", tangent::kSlow, 2.0, 4.0, 4.0, 8.0},
                                         RuleCase{"Fast", tangent::kFast, 2.0, 4.0, 4.0, 8.0},
                                         RuleCase{"None", tangent::kNone, 2.0, 4.0, 4.0, 8.0},
                                         RuleCase{"Unset", tangent::kUnset, 2.0, 4.0, 4.0, 8.0}),
                         [](const auto& testCase) { return testCase.param.name; });

TEST(CurveTangents, AutoEaseAndAutoMixLieBetweenTheNeighbours) {
  CurveData data = Rising(tangent::kAutoEase);
  data.keys = {{0.0, 0.0}, {2.0, 4.0}, {3.0, 9.0}};  // slopes 2 and 5
  EXPECT_NEAR(SlopeAt(data, Side::kOut, 1), 2.0 + (kEased - 2.0) / 2.0, kRounding);
  data.type = tangent::kAutoMix;
  EXPECT_NEAR(SlopeAt(data, Side::kIn, 1), 4.0, kRounding);
}

TEST(CurveTangents, AutoIsHeldAndPlateauIsFlatWhereTheSplineIsTooSteep) {
  CurveData data = Rising(tangent::kAuto);
  data.keys = {{0.0, 0.0}, {2.0, 1.0}, {3.0, 12.0}};  // slopes 0.5 and 11, 4 across
  EXPECT_NEAR(SlopeAt(data, Side::kIn, 1), 1.5, kRounding);
  data.type = tangent::kPlateau;
  EXPECT_EQ(SlopeAt(data, Side::kIn, 1), 0.0);
  data.keys = {{0.0, 0.0}, {2.0, -1.0}, {3.0, -12.0}};
  data.type = tangent::kAuto;
  EXPECT_NEAR(SlopeAt(data, Side::kOut, 1), -1.5, kRounding);
}

TEST(CurveTangents, ExtremesAndLevelSpansAreFlat) {
  for (const std::uint8_t type : {tangent::kPlateau, tangent::kAuto, tangent::kAutoEase, tangent::kAutoMix}) {
    CurveData data = Rising(type);
    data.keys = {{0.0, 0.0}, {2.0, 4.0}, {3.0, 3.5}};
    EXPECT_EQ(SlopeAt(data, Side::kIn, 1), 0.0) << int{type};
    data.keys = {{0.0, 0.0}, {2.0, 4.0}, {3.0, 4.0}};
    EXPECT_EQ(SlopeAt(data, Side::kOut, 1), 0.0) << int{type};
  }
}

TEST(CurveTangents, ClampedIsFlatBesideANearlyEqualNeighbourInInternalUnits) {
  CurveData data = Rising(tangent::kClamped);
  data.internalUnits = 0.01;  // 4 are 0.04
  EXPECT_EQ(SlopeAt(data, Side::kOut, 0), 0.0);
  EXPECT_EQ(SlopeAt(data, Side::kIn, 1), 0.0);
  EXPECT_EQ(SlopeAt(data, Side::kIn, 2), 8.0);  // 8 are 0.08
  data.internalUnits = 0.0126;                  // 4 are 0.0504
  EXPECT_EQ(SlopeAt(data, Side::kIn, 1), 4.0);
}

TEST(CurveTangents, TheOuterSideOfALinearEndIsFlatAndOfASplineItIsNot) {
  EXPECT_EQ(SlopeAt(Rising(tangent::kLinear), Side::kIn, 0), 0.0);
  EXPECT_EQ(SlopeAt(Rising(tangent::kLinear), Side::kOut, 2), 0.0);
  EXPECT_EQ(SlopeAt(Rising(tangent::kSpline), Side::kIn, 0), 2.0);
  EXPECT_EQ(SlopeAt(Rising(tangent::kSpline), Side::kOut, 2), 8.0);
}

TEST(CurveTangents, EachSideGoesByItsOwnType) {
  CurveData data = Rising(tangent::kFlat);
  data.in.types = {tangent::kFlat, tangent::kLinear};
  data.out.types = {tangent::kFlat, tangent::kSpline};
  EXPECT_EQ(SlopeAt(data, Side::kIn, 1), 2.0);
  EXPECT_EQ(SlopeAt(data, Side::kOut, 1), 4.0);
  EXPECT_EQ(SlopeAt(data, Side::kIn, 2), 0.0);
}

TEST(CurveTangents, AComputedHandleLiesAtAThirdOfItsSpan) {
  const CurveData data = Rising(tangent::kSpline);
  EXPECT_EQ(TangentAt(data, Side::kIn, 1).x, 2.0);
  EXPECT_EQ(TangentAt(data, Side::kIn, 1).y, 8.0);
  EXPECT_EQ(TangentAt(data, Side::kOut, 1).x, 1.0);
  EXPECT_EQ(TangentAt(data, Side::kOut, 1).y, 4.0);
}

TEST(CurveTangents, AWrittenTangentIsTakenWhateverTheType) {
  CurveData data = Rising(tangent::kSpline);
  data.internalUnits = 0.5;
  data.out.firstTangent = 1;
  data.out.tangents = {{3.0, 1.5}};
  EXPECT_EQ(TangentAt(data, Side::kOut, 1).x, 3.0);
  EXPECT_EQ(TangentAt(data, Side::kOut, 1).y, 3.0);
  EXPECT_EQ(SlopeAt(data, Side::kOut, 0), 2.0);
  EXPECT_EQ(SlopeAt(data, Side::kIn, 1), 4.0);
}

TEST(CurveTangents, WithoutXIsFlat) { EXPECT_EQ(Slope({0.0, 5.0}), 0.0); }

}  // namespace
