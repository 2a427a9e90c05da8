#include "tests/secondreader/TraceComparison.h"

#include <gtest/gtest.h>

#include "tests/secondreader/AngleRounding.h"

namespace secondreader {
namespace {

TEST(TraceComparisonTest, WhatMetNoSineAgreesBitForBit) {
  EXPECT_TRUE(linesAgree({R"({"value":[1,0,-2.5,0]})"}, R"({"value":[1,0,-2.5,0]})"));
  EXPECT_FALSE(linesAgree({R"({"value":[1,0,-2.5,0]})"}, R"({"value":[1,0,-2.5000000000000004,0]})"));
  EXPECT_FALSE(linesAgree({R"({"value":[0]})"}, R"({"value":[-0]})"));
  EXPECT_FALSE(linesAgree({R"({"filmSize":102.0456})"}, R"({"filmSize":102.04560000000001})"));
}

TEST(TraceComparisonTest, WhatMetASineAgreesToTwelveDigits) {
  const auto agree = [](const std::string& predicted, const std::string& traced) {
    return linesAgree({predicted, Rounding::Last}, traced);
  };
  EXPECT_TRUE(agree(R"({"value":[100,0,-2.5,0],"error":0})",
                    R"({"value":[100.00000000000009,-0,-2.5,0],"error":0})"));
  EXPECT_FALSE(agree(R"({"value":[100,0]})", R"({"value":[100.0000000002,0]})"));
  EXPECT_FALSE(agree(R"({"value":[1,0]})", R"({"value":[-1,0]})"));
  EXPECT_FALSE(agree(R"({"value":[0,0]})", R"({"value":[1e-300,0]})"));
  EXPECT_FALSE(agree(R"({"value":[1,2]})", R"({"value":[1,2,0]})"));
  EXPECT_FALSE(agree(R"({"value":[1,2,0]})", R"({"value":[1,2]})"));
}

TEST(TraceComparisonTest, WhatIsNotFiniteAgreesExactlyAndTheNumbersBesideItAsTheyAreKnown) {
  const std::string infinite = R"({"value":[125,"inf",50,0]})";
  EXPECT_TRUE(linesAgree({R"({"value":[125,"inf",49.99999999999999,0]})", Rounding::Last}, infinite));
  EXPECT_FALSE(linesAgree({R"({"value":[125,"inf",49.9,0]})", Rounding::Last}, infinite));
  EXPECT_FALSE(linesAgree({R"({"value":[125,"-inf",50,0]})", Rounding::Last}, infinite));
  EXPECT_FALSE(linesAgree({R"({"value":[125,2,50,0]})", Rounding::Last}, infinite));
}

TEST(TraceComparisonTest, AnglesAgreeToTwelveDigitsOfHalfATurn) {
  EXPECT_TRUE(linesAgree({R"({"value":[0,0]})", Rounding::Angle}, R"({"value":[1.7e-10,0]})"));
  EXPECT_FALSE(linesAgree({R"({"value":[0,0]})", Rounding::Angle}, R"({"value":[1.9e-10,0]})"));
  EXPECT_FALSE(linesAgree({R"({"value":[180]})", Rounding::Angle}, R"({"value":[-180]})"));
}

TEST(TraceComparisonTest, AtHalfATurnAWholeTurnMoreIsAsGood) {
  EXPECT_TRUE(linesAgree({R"({"value":[180]})", Rounding::HalfTurn}, R"({"value":[-180.00000000000003]})"));
  EXPECT_TRUE(linesAgree({R"({"value":[190]})", Rounding::HalfTurn}, R"({"value":[-170]})"));
  EXPECT_FALSE(linesAgree({R"({"value":[190]})", Rounding::HalfTurn}, R"({"value":[-171]})"));
  EXPECT_FALSE(linesAgree({R"({"value":[190]})", Rounding::HalfTurn}, R"({"value":[10]})"));
}

TEST(TraceComparisonTest, EverythingElseAgreesExactly) {
  const auto agree = [](const std::string& predicted, const std::string& traced) {
    return linesAgree({predicted, Rounding::Last}, traced);
  };
  EXPECT_FALSE(agree(R"({"time":[1000,24000]})", R"({"time":[1000.0000000000001,24000]})"));
  EXPECT_FALSE(agree(R"({"value":[1,2],"error":0})", R"({"value":[1,2],"error":-0})"));
  EXPECT_FALSE(agree(R"({"value":[1,2],"layer":"layer:1"})", R"({"value":[1,2],"layer":"layer:2"})"));
  EXPECT_FALSE(agree(R"({"layer":"layer:1","value":[1,2]})", R"({"layer":"layer:2","value":[1,2]})"));
  EXPECT_FALSE(agree(R"({"name":"a1"})", R"({"name":"a1.0"})"));
}

TEST(AngleRoundingTest, AnglesAtHalfATurnAndWhatFollowsThemAreOpen) {
  constexpr double kHalf = 3.141592653589793;
  AngleRounding away;
  EXPECT_EQ(away.first(3.0), Rounding::Angle);
  EXPECT_EQ(away.next(-3.0, 3.0), Rounding::Angle);
  EXPECT_EQ(away.next(-3.0, -3.0 + kHalf), Rounding::HalfTurn);
  EXPECT_EQ(away.next(-3.0, -3.0), Rounding::HalfTurn);
  AngleRounding there;
  EXPECT_EQ(there.first(-kHalf), Rounding::HalfTurn);
  EXPECT_EQ(there.next(1.0, 1.0), Rounding::HalfTurn);
  EXPECT_EQ(AngleRounding().next(0.5, 0.5 + 5.0 * kHalf), Rounding::HalfTurn);
}

TEST(AngleRoundingTest, OnlyWhatIsTurnedIsRounded) {
  EXPECT_EQ(roundingAfter({0.0, -0.0, 0.0}), Rounding::None);
  EXPECT_EQ(roundingAfter({0.0, 0.0, 1e-300}), Rounding::Last);
}

TEST(TraceComparisonTest, TheFirstDifferenceIsShown) {
  const auto difference = firstDifference({{"a"}, {"b"}, {"c"}}, {"a", "x", "y"});
  ASSERT_TRUE(difference.has_value());
  EXPECT_EQ(difference->line, 2u);
  EXPECT_EQ(difference->predicted, "b");
  EXPECT_EQ(difference->traced, "x");
  EXPECT_FALSE(firstDifference({{"a"}, {"b"}}, {"a", "b"}).has_value());
}

TEST(TraceComparisonTest, ATraceThatEndsEarlyDiffers) {
  EXPECT_EQ(firstDifference({{"a"}, {"b"}}, {"a"})->traced, "(nothing)");
  EXPECT_EQ(firstDifference({{"a"}}, {"a", "b"})->predicted, "(nothing)");
  EXPECT_EQ(firstDifference({{"a"}}, {"a", "b"})->line, 2u);
}

TEST(TraceComparisonTest, LinesAreCutAtTheirEnds) {
  EXPECT_EQ(linesOf("a\nb\n"), (std::vector<std::string>{"a", "b"}));
  EXPECT_EQ(linesOf("a\n\nb"), (std::vector<std::string>{"a", "", "b"}));
  EXPECT_TRUE(linesOf("").empty());
}

}  // namespace
}  // namespace secondreader
