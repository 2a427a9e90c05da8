#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "motion/Curve.h"

namespace {

using motion::Curve;
using motion::CurveData;
using motion::CurveDoubt;
namespace tangent = motion::tangent;
namespace infinity = motion::infinity;

unsigned Bit(CurveDoubt doubt) { return static_cast<unsigned>(doubt); }

CurveData Keys(std::uint8_t type) {
  CurveData data;
  data.keys = {{0.0, 0.0}, {1.0, 4.0}, {2.0, 9.0}};
  data.type = type;
  return data;
}

unsigned DoubtsOf(const CurveData& data) { return Curve(data).Doubts(); }

TEST(CurveDoubts, NoneWhereEveryRuleIsCertain) {
  for (const std::uint8_t type :
       {tangent::kLinear, tangent::kFlat, tangent::kStep, tangent::kStepNext, tangent::kSpline,
        tangent::kClamped, tangent::kPlateau, tangent::kAuto, tangent::kAutoEase}) {
    EXPECT_EQ(DoubtsOf(Keys(type)), 0u) << int{type};
  }
  EXPECT_EQ(DoubtsOf(CurveData{}), 0u);
}

TEST(CurveDoubts, SlowFastAndNoType) {
  for (const std::uint8_t type : {tangent::kSlow, tangent::kFast, tangent::kNone, tangent::kUnset}) {
    EXPECT_EQ(DoubtsOf(Keys(type)), Bit(CurveDoubt::kTangentType)) << int{type};
  }
}

TEST(CurveDoubts, AutoMix) { EXPECT_EQ(DoubtsOf(Keys(tangent::kAutoMix)), Bit(CurveDoubt::kAutoMix)); }

TEST(CurveDoubts, AWrittenTangentLeavesNone) {
  CurveData data = Keys(tangent::kSlow);
  data.in.tangents = data.out.tangents = {{1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}};
  EXPECT_EQ(DoubtsOf(data), 0u);
}

TEST(CurveDoubts, OuterSidesOfTheEndsDoNotCount) {
  CurveData data = Keys(tangent::kSlow);
  data.in.types = {tangent::kSlow, tangent::kFlat, tangent::kFlat};
  data.out.types = {tangent::kFlat, tangent::kFlat, tangent::kSlow};
  EXPECT_EQ(DoubtsOf(data), 0u);
}

TEST(CurveDoubts, AStepIntoAKeyUnlessTheSpanIsHeld) {
  CurveData data = Keys(tangent::kFlat);
  data.in.types = {tangent::kFlat, tangent::kStep, tangent::kFlat};
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kStepInTangent));
  data.out.types = {tangent::kStep, tangent::kFlat, tangent::kFlat};
  EXPECT_EQ(DoubtsOf(data), 0u);
}

TEST(CurveDoubts, AFixedKeyWithoutItsTangent) {
  EXPECT_EQ(DoubtsOf(Keys(tangent::kFixed)), Bit(CurveDoubt::kFixedWithoutTangent));
}

TEST(CurveDoubts, AnEmptyFixedTangentOnTheWayOut) {
  CurveData data = Keys(tangent::kFixed);
  data.in.tangents = data.out.tangents = {{1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}};
  data.in.tangents[1] = {0.0, 0.0};
  EXPECT_EQ(DoubtsOf(data), 0u);
  data.out.tangents[1] = {0.0, 0.0};
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kFixedEmptyOutTangent));
}

TEST(CurveDoubts, APlateauBesideAFixedHandleThatOvershoots) {
  CurveData data = Keys(tangent::kPlateau);
  data.out.types = {tangent::kFixed, tangent::kPlateau, tangent::kPlateau};
  data.out.tangents = {{1.0, 6.0}};
  EXPECT_EQ(DoubtsOf(data), 0u);
  data.out.tangents = {{1.0, -6.0}};
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kPlateauBesideOvershoot));
  data.out.types[0] = tangent::kFlat;
  EXPECT_EQ(DoubtsOf(data), 0u);
}

TEST(CurveDoubts, AnUnknownInfinity) {
  CurveData data = Keys(tangent::kAuto);
  data.postInfinity = 2;
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kInfinityCode));
}

TEST(CurveDoubts, AnInfinityOfOneKey) {
  CurveData data = Keys(tangent::kAuto);
  data.keys.resize(1);
  EXPECT_EQ(DoubtsOf(data), 0u);
  data.preInfinity = infinity::kOscillate;
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kInfinityOfOneKey));
}

TEST(CurveDoubts, ALinearInfinityAtALinearKey) {
  CurveData data = Keys(tangent::kLinear);
  data.preInfinity = infinity::kLinear;
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kLinearInfinityAtLinear));
  data.type = tangent::kSpline;
  EXPECT_EQ(DoubtsOf(data), 0u);
}

TEST(CurveDoubts, RotationsThatBelongTogether) {
  CurveData data = Keys(tangent::kAuto);
  data.rotationInterpolation = 2;
  EXPECT_EQ(DoubtsOf(data), 0u);
  data.rotationInterpolation = 3;
  EXPECT_EQ(DoubtsOf(data), Bit(CurveDoubt::kRotationInterpolation));
  data.keys.resize(1);
  EXPECT_EQ(DoubtsOf(data), 0u);
}

}  // namespace
