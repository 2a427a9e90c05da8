#include "motion/FrameEnds.h"

#include <limits>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::FrameEnds;
using testing::Optional;
using testing::Pair;

using Ends = std::optional<std::pair<double, double>>;

class FrameEndsTest : public testmotion::EvaluatorTest {
 protected:
  // Of the named nodes of a text.
  Ends Find(std::string_view text, const std::optional<FrameEnds>& played,
            const std::vector<std::string_view>& names) {
    Read(text);
    std::vector<scene::NodeId> nodes;
    for (const std::string_view name : names) nodes.push_back(At(name));
    const auto ends = motion::FindFrameEnds(scene(), played, nodes, motion::MeasuresOf(scene()));
    if (!ends) return std::nullopt;
    return std::pair(ends->first, ends->last);
  }
};

std::string Curve(const std::string& name, const std::string& keys, int count,
                  const std::string& type = "animCurveTL") {
  return "createNode " + type + " -n \"" + name + "\";\n\tsetAttr -s " + std::to_string(count) +
         " \".ktv[0:" + std::to_string(count - 1) + "]\"  " + keys + ";\n";
}

TEST_F(FrameEndsTest, NothingPlayedAndNothingKeyedHasNoEnds) {
  EXPECT_EQ(Find("createNode transform -n \"a\";\n", std::nullopt, {"a"}), std::nullopt);
  EXPECT_EQ(Find("createNode animCurveTL -n \"a\";\n", std::nullopt, {"a"}), std::nullopt);
}

TEST_F(FrameEndsTest, WhatIsPlayedGoesOutwardToWholeFrames) {
  EXPECT_THAT(Find("", FrameEnds{1.5, 40.25}, {}), Optional(Pair(1.0, 41.0)));
  EXPECT_THAT(Find("", FrameEnds{-3.5, -1.5}, {}), Optional(Pair(-4.0, -1.0)));
}

TEST_F(FrameEndsTest, OneFrameIsARange) {
  EXPECT_THAT(Find("", FrameEnds{7.0, 7.0}, {}), Optional(Pair(7.0, 7.0)));
}

TEST_F(FrameEndsTest, NothingIsPlayedWhereTheLastFrameLiesBeforeTheFirst) {
  EXPECT_EQ(Find("", FrameEnds{20.0, 10.0}, {}), std::nullopt);
  EXPECT_THAT(Find(Curve("a", "3 0 5 1", 2), FrameEnds{20.0, 10.0}, {"a"}), Optional(Pair(3.0, 5.0)));
}

TEST_F(FrameEndsTest, KeysWidenWhatIsPlayedAtBothEnds) {
  const std::string text = Curve("early", "-12 0 4 1", 2) + Curve("late", "5 0 88 1", 2);
  EXPECT_THAT(Find(text, FrameEnds{1.0, 50.0}, {"early"}), Optional(Pair(-12.0, 50.0)));
  EXPECT_THAT(Find(text, FrameEnds{1.0, 50.0}, {"late"}), Optional(Pair(1.0, 88.0)));
  EXPECT_THAT(Find(text, FrameEnds{1.0, 50.0}, {"early", "late"}), Optional(Pair(-12.0, 88.0)));
}

TEST_F(FrameEndsTest, OnlyTheCurvesOfTimeAmongTheNodesCount) {
  const std::string text = Curve("asked", "3 0 9 1", 2) + Curve("other", "2 0 70 1", 2) +
                           Curve("driven", "-40 0 60 1", 2, "animCurveUL");
  EXPECT_THAT(Find(text, std::nullopt, {"asked", "driven"}), Optional(Pair(3.0, 9.0)));
}

TEST_F(FrameEndsTest, TimesVeryNearAWholeFrameAreThatFrame) {
  EXPECT_THAT(Find("", FrameEnds{1.9999995, 6.0000005}, {}), Optional(Pair(2.0, 6.0)));
  EXPECT_THAT(Find("", FrameEnds{1.999998, 6.000002}, {}), Optional(Pair(1.0, 7.0)));
}

TEST_F(FrameEndsTest, AnEndThatIsNoNumberIsPassedOver) {
  const double infinite = std::numeric_limits<double>::infinity();
  EXPECT_THAT(Find(Curve("a", "3 0 5 1", 2), FrameEnds{-infinite, 12.0}, {"a"}), Optional(Pair(3.0, 12.0)));
  EXPECT_EQ(Find("", FrameEnds{-infinite, infinite}, {}), std::nullopt);
}

TEST_F(FrameEndsTest, KeysAreCountedInFramesOfTheScenesRate) {
  EXPECT_THAT(Find("currentUnit -t ntsc;\n" + Curve("a", "10 0 20 1", 2), FrameEnds{12.0, 13.0}, {"a"}),
              Optional(Pair(10.0, 20.0)));
}

TEST_F(FrameEndsTest, AUnitWithoutFramesHasTwentyFourASecond) {
  EXPECT_THAT(Find("currentUnit -t sec;\n" + Curve("a", "0.5 0 2.01 1", 2), std::nullopt, {"a"}),
              Optional(Pair(12.0, 49.0)));
}

}  // namespace
