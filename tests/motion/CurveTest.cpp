#include "motion/Curve.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>

#include "tests/motion/CurveGenerator.h"

namespace {

using motion::Curve;
using motion::CurveCursor;
using motion::CurveData;
using motion::Tangent;
namespace tangent = motion::tangent;
namespace infinity = motion::infinity;

constexpr double kRounding = 1e-14;

CurveData TwoKeys(std::uint8_t type, bool weighted) {
  CurveData data;
  data.keys = {{1.0, 10.0}, {3.0, 14.0}};
  data.type = type;
  data.weighted = weighted;
  return data;
}

// Slopes 6 and 0 a second at the two keys.
CurveData Hermite() {
  CurveData data = TwoKeys(tangent::kFixed, false);
  data.out.tangents = {{1.0, 6.0}};
  data.in.firstTangent = 1;
  data.in.tangents = {{1.0, 0.0}};
  return data;
}

CurveData Weighted(Tangent out, Tangent in) {
  CurveData data = TwoKeys(tangent::kFixed, true);
  data.out.tangents = {out};
  data.in.firstTangent = 1;
  data.in.tangents = {in};
  return data;
}

TEST(Curve, WithoutKeysIsZero) { EXPECT_EQ(Curve(CurveData{}).At(2.0), 0.0); }

TEST(Curve, OfOneKeyIsItsValueAtAnyTime) {
  CurveData data;
  data.keys = {{1.0, 7.25}};
  data.preInfinity = infinity::kCycle;
  data.postInfinity = infinity::kLinear;
  const Curve curve(data);
  for (const double time : {-5.0, 1.0, 9.0}) EXPECT_EQ(curve.At(time), 7.25);
}

TEST(Curve, HasAKeysValueToTheBitAtItsTime) {
  CurveData data;
  data.keys = {{0.1, 0.3}, {0.2, 1e-17}, {0.7, 123456.789}};
  data.type = tangent::kSpline;
  const Curve curve(data);
  for (const motion::CurveKey& key : data.keys) {
    EXPECT_EQ(curve.At(key.time), key.value);
    EXPECT_EQ(curve.At(key.time + 0.9e-10), key.value);
    EXPECT_EQ(curve.At(key.time - 0.9e-10), key.value);
  }
  EXPECT_NE(curve.At(0.2 + 2e-10), 1e-17);
}

TEST(Curve, UnweightedIsTheCubicOfItsSlopes) {
  const Curve curve(Hermite());
  // At half way 0.5 (10 + 14) + 0.125 * 2 * (6 - 0); at a quarter likewise.
  EXPECT_NEAR(curve.At(2.0), 13.5, kRounding * 13.5);
  EXPECT_NEAR(curve.At(1.5), 10.0 * 0.84375 + 14.0 * 0.15625 + 12.0 * 0.140625, kRounding * 13.0);
}

TEST(Curve, ATangentWithoutXIsFlat) {
  CurveData data = Hermite();
  data.out.tangents = {{0.0, 6.0}};
  EXPECT_NEAR(Curve(data).At(2.0), 12.0, kRounding * 12.0);
}

TEST(Curve, TangentsAreInInternalUnits) {
  CurveData data = Hermite();
  data.internalUnits = 100.0;  // metres: six centimetres a second are 0.06 metres
  EXPECT_NEAR(Curve(data).At(2.0), 12.0 + 0.125 * 2.0 * 0.06, kRounding * 12.0);
}

TEST(Curve, WeightedWithHandlesAtAThirdIsTheCubic) {
  const Curve weighted(Weighted({2.0, 12.0}, {2.0, 0.0}));
  const Curve cubic(Hermite());
  for (const double time : {1.1, 1.7, 2.0, 2.9}) {
    EXPECT_NEAR(weighted.At(time), cubic.At(time), kRounding * 14.0);
  }
}

TEST(Curve, WeightedIsTheBezierOfItsHandles) {
  // Handles at 1.5 of the span's 2 seconds, level with the first key, and at 0.2, level with the second one.
  const Curve curve(Weighted({4.5, 0.0}, {5.4, 0.0}));
  // Time and value at u = 0.25: 1 + 2 (3 u (1-u)² 0.75 + 3 u² (1-u) 0.1 + u³), 10 + 4 (3 u² (1-u) + u³).
  const double time = 1.0 + 2.0 * (0.421875 * 0.75 + 0.140625 * 0.1 + 0.015625);
  EXPECT_NEAR(curve.At(time), 10.0 + 4.0 * 0.15625, 1e-12);
}

TEST(Curve, AHandleBeforeItsKeyLiesOnIt) {
  const Curve beyond(Weighted({-3.0, 6.0}, {2.0, 0.0}));
  const Curve on(Weighted({0.0, 0.0}, {2.0, 0.0}));
  EXPECT_EQ(beyond.At(1.5), on.At(1.5));
  EXPECT_NE(beyond.At(1.5), Curve(Weighted({0.0, 6.0}, {2.0, 0.0})).At(1.5));
}

TEST(Curve, AHandleBeyondTheSpanStaysWhereTimeRunsOnNevertheless) {
  // Reaches 1.2 and 0.3 of the span: inside the ellipse.
  const Curve curve(Weighted({7.2, 0.0}, {1.8, 0.0}));
  const double time = 1.0 + 2.0 * (0.421875 * 1.2 + 0.140625 * 0.7 + 0.015625);
  EXPECT_NEAR(curve.At(time), 10.0 + 4.0 * 0.15625, 1e-12);
}

TEST(Curve, TheOtherHandleIsMovedToTheNearerEdgeAndKeepsItsSlope) {
  // Reaches 1 + 1/5 and 0 with a slope: the edge is at (0.8 - sqrt(0.48)) / 2.
  const double edge = (0.8 - std::sqrt(0.48)) / 2.0 + 1e-10;
  const Curve curve(Weighted({7.2, 0.0}, {0.06, 0.03}));
  const double u = 0.25;
  const double time = 1.0 + 2.0 * (0.421875 * 1.2 + 0.140625 * (1.0 - edge) + 0.015625);
  const double handle = 14.0 - 0.5 * edge * 2.0;
  EXPECT_NEAR(curve.At(time), 0.421875 * 20.0 / 2.0 + 10.0 * 0.421875 + 0.140625 * handle + 14.0 * u * u * u,
              1e-11);
}

TEST(Curve, AHandleBeyondFourThirdsComesBackToThem) {
  const Curve far(Weighted({30.0, 3.0}, {2.0, 0.0}));
  const Curve edge(Weighted({8.0, 0.8}, {2.0, 0.0}));
  for (const double time : {1.2, 2.0, 2.9}) EXPECT_NEAR(far.At(time), edge.At(time), 1e-9);
}

TEST(Curve, LinearOnBothSidesIsAStraightLineAlsoWhenWeighted) {
  CurveData data = TwoKeys(tangent::kLinear, true);
  data.out.tangents = {{5.0, -30.0}};
  EXPECT_NEAR(Curve(data).At(1.5), 11.0, kRounding * 11.0);
}

TEST(Curve, AStepHoldsItsKeyAndAStepNextTakesTheNextAtOnce) {
  EXPECT_EQ(Curve(TwoKeys(tangent::kStep, false)).At(2.9), 10.0);
  EXPECT_EQ(Curve(TwoKeys(tangent::kStepNext, true)).At(1.001), 14.0);
}

TEST(Curve, TheTypeOnTheWayOutDecidesOnAStep) {
  CurveData data = TwoKeys(tangent::kLinear, false);
  data.in.types = {tangent::kLinear, tangent::kStep};
  EXPECT_NE(Curve(data).At(2.9), 10.0);
}

CurveData Repeating(int code) {
  CurveData data;  // 3 seconds long, rises by 4; straight lines
  data.keys = {{1.0, 10.0}, {2.0, 20.0}, {4.0, 14.0}};
  data.type = tangent::kLinear;
  data.weighted = false;
  data.preInfinity = code;
  data.postInfinity = code;
  return data;
}

TEST(Curve, IsConstantOutsideItsKeysByDefault) {
  const Curve curve(Repeating(CurveData{}.postInfinity));
  EXPECT_EQ(curve.At(-100.0), 10.0);
  EXPECT_EQ(curve.At(100.0), 14.0);
}

TEST(Curve, GoesOnLevelFromLinearKeys) {
  const Curve curve(Repeating(infinity::kLinear));
  EXPECT_EQ(curve.At(0.0), 10.0);
  EXPECT_EQ(curve.At(6.0), 14.0);
}

TEST(Curve, GoesOnWithTheSlopeOfItsOuterTangents) {
  CurveData data = Repeating(infinity::kLinear);
  data.type = tangent::kSpline;
  const Curve curve(data);
  EXPECT_EQ(curve.At(0.5), 5.0);
  EXPECT_EQ(curve.At(6.0), 8.0);
}

TEST(Curve, CyclesFromItsFirstKey) {
  const Curve curve(Repeating(infinity::kCycle));
  EXPECT_NEAR(curve.At(4.5), 15.0, 1e-12);
  EXPECT_NEAR(curve.At(4.5 + 6.0), 15.0, 1e-12);
  EXPECT_NEAR(curve.At(0.0), 17.0, 1e-12);
  EXPECT_NEAR(curve.At(0.0 - 6.0), 17.0, 1e-12);
}

TEST(Curve, AWholeTurnAfterItsLastKeyHasTheValueOfItsFirst) {
  const Curve curve(Repeating(infinity::kCycle));
  EXPECT_EQ(curve.At(7.0), 10.0);
  EXPECT_EQ(curve.At(std::nextafter(7.0, 0.0)), 10.0);
  EXPECT_EQ(curve.At(-2.0), 14.0);
  EXPECT_EQ(curve.At(std::nextafter(-2.0, 0.0)), 14.0);
}

TEST(Curve, CyclesWithAnOffsetOfItsRise) {
  const Curve curve(Repeating(infinity::kCycleWithOffset));
  EXPECT_NEAR(curve.At(4.5), 15.0 + 4.0, 1e-12);
  EXPECT_NEAR(curve.At(7.5), 15.0 + 8.0, 1e-12);
  EXPECT_EQ(curve.At(7.0), 10.0 + 8.0);
  EXPECT_NEAR(curve.At(0.0), 17.0 - 4.0, 1e-12);
  EXPECT_NEAR(curve.At(-3.0), 17.0 - 8.0, 1e-12);
}

TEST(Curve, OscillatesBackFirst) {
  const Curve curve(Repeating(infinity::kOscillate));
  EXPECT_NEAR(curve.At(4.5), 15.5, 1e-12);
  EXPECT_NEAR(curve.At(7.5), 15.0, 1e-12);
  EXPECT_NEAR(curve.At(0.5), 15.0, 1e-12);
  EXPECT_NEAR(curve.At(-2.5), 15.5, 1e-12);
}

TEST(Curve, KeysInAnyOrderAreSortedWithWhatBelongsToThem) {
  CurveData data;
  data.keys = {{3.0, 30.0}, {1.0, 10.0}, {2.0, 21.0}, {2.0, 20.0}};
  data.type = tangent::kLinear;
  data.out.types = {tangent::kLinear, tangent::kStep, tangent::kLinear, tangent::kFixed};
  data.out.firstTangent = 3;
  data.out.tangents = {{1.0, 0.0}};
  data.weighted = false;
  const Curve curve(data);
  EXPECT_EQ(curve.At(1.9), 10.0);
  EXPECT_EQ(curve.At(2.0), 20.0);
  // From slope 0 to slope 10 over 10: (20 + 30) / 2 - 10 / 8.
  EXPECT_NEAR(curve.At(2.5), 23.75, 1e-13);
  EXPECT_EQ(curve.At(5.0), 30.0);
}

TEST(Curve, KeysThatAreNotFiniteAreDropped) {
  CurveData data;
  data.keys = {{1.0, 10.0}, {2.0, std::nan("")}, {std::nan(""), 5.0}, {HUGE_VAL, 5.0}};
  data.type = tangent::kLinear;
  EXPECT_EQ(Curve(data).At(5.0), 10.0);
}

TEST(Curve, ATimeThatIsNoNumberEnds) {
  for (const int code : {infinity::kConstant, infinity::kCycle, infinity::kOscillate}) {
    EXPECT_TRUE(std::isnan(Curve(Repeating(code)).At(std::nan(""))));
  }
}

TEST(Curve, ACursorChangesNoValue) {
  for (std::uint64_t seed = 1; seed <= 300; ++seed) {
    const testmotion::GeneratedCurve generated = testmotion::GenerateCurve(seed);
    const Curve curve(generated.data);
    CurveCursor cursor;
    for (const double time : generated.times) EXPECT_EQ(curve.At(time, &cursor), curve.At(time));
  }
}

}  // namespace
