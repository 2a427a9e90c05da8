#include "tests/secondreader/TraceComparison.h"

#include <gtest/gtest.h>

namespace secondreader {
namespace {

TEST(TraceComparisonTest, ValuesCentresAndFilmSizesAgreeToNineDigits) {
  EXPECT_TRUE(linesAgree(R"({"call":"x","value":[100,0,-2.5,0],"error":0})",
                         R"({"call":"x","value":[99.99999999999,-0,-2.5000000000001,0],"error":0})"));
  EXPECT_TRUE(
      linesAgree(R"({"center":[1e300,2],"layer":null})", R"({"center":[1.0000000001e300,2],"layer":null})"));
  EXPECT_TRUE(linesAgree(R"({"filmSize":102.0456,"error":0})", R"({"filmSize":102.04560000001,"error":0})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,0,0,0]})", R"({"value":[1.00000001,0,0,0]})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,0,0,0]})", R"({"value":[-1,0,0,0]})"));
  EXPECT_FALSE(linesAgree(R"({"value":[0,0,0,0]})", R"({"value":[1e-300,0,0,0]})"));
}

TEST(TraceComparisonTest, EverythingElseAgreesExactly) {
  EXPECT_FALSE(linesAgree(R"({"time":[1000,24000]})", R"({"time":[1000.0000000000001,24000]})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,2],"error":0})", R"({"value":[1,2],"error":-0})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,2],"layer":"layer:1"})", R"({"value":[1,2],"layer":"layer:2"})"));
  EXPECT_FALSE(linesAgree(R"({"layer":"layer:1","value":[1,2]})", R"({"layer":"layer:2","value":[1,2]})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,2]})", R"({"value":[1,2,0]})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,"inf"]})", R"({"value":[1,"-inf"]})"));
  EXPECT_FALSE(linesAgree(R"({"value":[1,"inf"]})", R"({"value":[1,2]})"));
  EXPECT_FALSE(linesAgree(R"({"name":"a1"})", R"({"name":"a1.0"})"));
}

TEST(TraceComparisonTest, TheFirstDifferenceIsTold) {
  const auto difference = firstDifference({"a", "b", "c"}, {"a", "x", "y"});
  ASSERT_TRUE(difference.has_value());
  EXPECT_EQ(difference->line, 2u);
  EXPECT_EQ(difference->predicted, "b");
  EXPECT_EQ(difference->traced, "x");
  EXPECT_FALSE(firstDifference({"a", "b"}, {"a", "b"}).has_value());
}

TEST(TraceComparisonTest, ATraceThatEndsEarlyDiffers) {
  EXPECT_EQ(firstDifference({"a", "b"}, {"a"})->traced, "(nothing)");
  EXPECT_EQ(firstDifference({"a"}, {"a", "b"})->predicted, "(nothing)");
  EXPECT_EQ(firstDifference({"a"}, {"a", "b"})->line, 2u);
}

TEST(TraceComparisonTest, LinesAreCutAtTheirEnds) {
  EXPECT_EQ(linesOf("a\nb\n"), (std::vector<std::string>{"a", "b"}));
  EXPECT_EQ(linesOf("a\n\nb"), (std::vector<std::string>{"a", "", "b"}));
  EXPECT_TRUE(linesOf("").empty());
}

}  // namespace
}  // namespace secondreader
