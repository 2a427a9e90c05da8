// The small parts: plugs, values, words of units, escapes, names.
#include <cmath>

#include "scene/Names.h"
#include "scene/Text.h"
#include "scene/Units.h"
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

std::string Shown(std::string_view text) {
  const AttributePath path = ParseAttributePath(text);
  return std::string(path.name) + ' ' + std::to_string(path.first) + ' ' + std::to_string(path.last);
}

TEST(PlugTest, APathIsTakenApart) {
  EXPECT_EQ(Shown(".tx"), "tx -1 -1");
  EXPECT_EQ(Shown("t.tx"), "tx -1 -1");
  EXPECT_EQ(Shown(".ktv[3:5]"), "ktv 3 5");
  EXPECT_EQ(Shown(".ktv[3]"), "ktv 3 3");
  EXPECT_EQ(Shown("tg[2].tt.ttx"), "ttx 2 2");
  EXPECT_EQ(Shown(""), " -1 -1");
  EXPECT_EQ(Shown("."), " -1 -1");
}

TEST(PlugTest, WhatIsNoPathOfOneIndexStaysAsItIs) {
  for (const char* text : {"a[0].b[1]", "a[", "a]", "a[]", "a[x]", "a[-1]", "a[3:1]", "a[1:2", "a[1:2:3]",
                           "a[1]b", "a[#]", "a[99999999999]", "a[0][1]"}) {
    EXPECT_EQ(Shown(text), std::string(text) + " -1 -1");
  }
}

TEST(PlugTest, TheFirstDotEndsTheNode) {
  EXPECT_EQ(SplitPlug("|a|ns:b.t.tx").node, "|a|ns:b");
  EXPECT_EQ(SplitPlug("|a|ns:b.t.tx").attribute, "t.tx");
  EXPECT_EQ(SplitPlug(".tx").node, "");
  EXPECT_EQ(SplitPlug("node").node, "node");
  EXPECT_EQ(SplitPlug("node").attribute, "");
}

TEST(ValueTest, ANumberIsOneWholeWord) {
  EXPECT_EQ(NumberOf("5"), 5.0);
  EXPECT_EQ(NumberOf("-1.5e-3"), -0.0015);
  EXPECT_EQ(NumberOf("+7"), 7.0);
  EXPECT_EQ(NumberOf(".5"), 0.5);
  EXPECT_EQ(NumberOf("5."), 5.0);
  EXPECT_EQ(NumberOf("1.7976931348623157e308"), 1.7976931348623157e308);
  for (const char* word : {"", "-", "+", ".", "x", "1x", "x1", "0x10", "1.#QNAN", "-1.#IND", "nan", "-inf",
                           "inf", "1e999", "-1e999", "1 2", "--1", "+-1"}) {
    EXPECT_EQ(NumberOf(word), std::nullopt) << word;
  }
  EXPECT_EQ(NumberOf("1e-999"), 0.0);
  EXPECT_TRUE(std::signbit(*NumberOf("-1e-999")));
}

TEST(ValueTest, NumbersAreReadUpToWhatIsNone) {
  EXPECT_THAT(Value("1 2\n\t\t3 ", 0).Numbers(), ElementsAre(1, 2, 3));
  EXPECT_THAT(Value("1 2 x 3", 0).Numbers(), ElementsAre(1, 2));
  EXPECT_THAT(Value("1 2 3", 0).Numbers(2), ElementsAre(1, 2));
  EXPECT_THAT(Value("1 2 3", 0, 1).Numbers(), ElementsAre(2, 3));
  EXPECT_THAT(Value("1 2 3", 0, 5).Numbers(), IsEmpty());
  EXPECT_THAT(Value("{1, 2} // 3\n 4", 0).Numbers(), ElementsAre(1, 2, 4));
  EXPECT_THAT(Value("\"1\" 2", 0).Numbers(), IsEmpty());
  EXPECT_THAT(Value("", 0).Numbers(), IsEmpty());
}

TEST(ValueTest, AStringIsTheFirstOne) {
  EXPECT_EQ(Value("\"a\" \"b\"", 0).String(), "a");
  EXPECT_EQ(Value("(\"a\"\n+ \"b\" + \"c\")", 0).String(), "abc");
  EXPECT_EQ(Value("\"\"", 0).String(), "");
  EXPECT_EQ(Value("\"a\" + 5", 0).String(), "a");
  EXPECT_EQ(Value("5 \"a\"", 0).String(), std::nullopt);
  EXPECT_EQ(Value("", 0).String(), std::nullopt);
}

TEST(TextTest, EscapesAreRead) {
  EXPECT_EQ(Unescaped("a\\nb\\tc\\rd\\be\\ff"), "a\nb\tc\rd\be\ff");
  EXPECT_EQ(Unescaped("\\\"\\\\\\x\\$"), "\"\\x$");
  EXPECT_EQ(Unescaped("end\\"), "end\\");
  EXPECT_EQ(Unescaped(""), "");
}

TEST(UnitsTest, EveryLengthIsKnown) {
  const std::pair<const char*, double> kWords[] = {
      {"millimeter", 0.1}, {"mm", 0.1},   {"centimeter", 1},  {"cm", 1},
      {"meter", 100},      {"m", 100},    {"kilometer", 1e5}, {"km", 1e5},
      {"inch", 2.54},      {"in", 2.54},  {"foot", 30.48},    {"ft", 30.48},
      {"yard", 91.44},     {"yd", 91.44}, {"mile", 160934.4}, {"mi", 160934.4},
  };
  for (const auto& [word, centimeters] : kWords) EXPECT_EQ(LinearUnitOf(word), centimeters) << word;
  EXPECT_EQ(LinearUnitOf("Meter"), std::nullopt);
  EXPECT_EQ(LinearUnitOf(""), std::nullopt);
}

TEST(UnitsTest, EveryAngleIsKnown) {
  for (const char* word : {"degree", "deg"}) EXPECT_EQ(AngularUnitOf(word), AngularUnit::Degree);
  for (const char* word : {"radian", "rad"}) EXPECT_EQ(AngularUnitOf(word), AngularUnit::Radian);
  EXPECT_EQ(AngularUnitOf("turn"), std::nullopt);
}

TEST(UnitsTest, EveryRateIsKnown) {
  const std::pair<const char*, double> kWords[] = {{"game", 15},
                                                   {"film", 24},
                                                   {"pal", 25},
                                                   {"ntsc", 30},
                                                   {"show", 48},
                                                   {"palf", 50},
                                                   {"ntscf", 60},
                                                   {"sec", 1},
                                                   {"min", 1.0 / 60},
                                                   {"hour", 1.0 / 3600},
                                                   {"millisec", 1000},
                                                   {"23.976fps", 24000 / 1001.0},
                                                   {"29.97fps", 30000 / 1001.0},
                                                   {"29.97df", 30000 / 1001.0},
                                                   {"47.952fps", 48000 / 1001.0},
                                                   {"59.94fps", 60000 / 1001.0},
                                                   {"44100fps", 44100},
                                                   {"48000fps", 48000}};
  for (const auto& [word, rate] : kWords) {
    ASSERT_TRUE(TimeUnitOf(word)) << word;
    EXPECT_DOUBLE_EQ(TimeUnitOf(word)->perSecond(), rate) << word;
  }
  for (const int rate :
       {2,   3,   4,   5,   6,   8,   10,  12,  16,  20,  40,  75,   80,   90,   100,  120,
        125, 150, 200, 240, 250, 300, 375, 400, 500, 600, 750, 1200, 1500, 2000, 3000, 6000}) {
    EXPECT_EQ(TimeUnitOf(std::to_string(rate) + "fps"), (FrameRate{rate, 1}));
  }
  for (const char* word :
       {"", "fps", "0fps", "-1fps", "1.5fps", "99999999fps", "film ", "Film", "fps24", "24 fps"}) {
    EXPECT_EQ(TimeUnitOf(word), std::nullopt) << word;
  }
}

// Nodes "g" and "x", side by side under so many nodes "top".
NodeId AddFrequent(Names& names, std::uint32_t count) {
  NodeId id = 0;
  for (std::uint32_t i = 0; i < count; ++i) {
    names.Add(id, kNoNode, "top");
    names.Add(id + 1, id, "g");
    names.Add(id + 2, id, "x");
    id += 3;
  }
  return id;
}

TEST(NamesTest, APathIsLookedForByItsRarestName) {
  Names names;
  const NodeId id = AddFrequent(names, 2 * Names::kMostCandidates);
  names.Add(id, id - 2, "rare");  // under the last "g"
  names.Add(id + 1, id, "x");
  EXPECT_EQ(names.Find("g|rare").node, id);
  EXPECT_EQ(names.Find("rare|x").node, id + 1);
  EXPECT_EQ(names.Find("top|g|rare|x").node, id + 1);
  EXPECT_EQ(names.Find("x|rare").node, kNoNode);
  EXPECT_EQ(names.Find("g|none").node, kNoNode);
  EXPECT_EQ(names.Find("none|x").node, kNoNode);
  EXPECT_EQ(names.Find("top|x").node, 2u);
  EXPECT_TRUE(names.Find("top|x").several);
}

TEST(NamesTest, WhereVeryManyShareEveryNameSomeAreLookedAt) {
  Names names;
  const NodeId id = AddFrequent(names, Names::kMostCandidates);
  names.Add(id, kNoNode, "g");
  names.Add(id + 1, id, "x");
  EXPECT_EQ(names.Find("g|x").node, kNoNode);
  EXPECT_EQ(names.Find("|g|x").node, id + 1);
}

TEST(NamesTest, AnInstanceIsFoundByItsPath) {
  Names names;
  names.Add(0, kNoNode, "a");
  names.Add(1, kNoNode, "b");
  names.Add(2, 0, "s");
  names.AddInstance(2, 1, "s");
  names.Add(3, kNoNode, "b");  // so that the path is looked for from its end first
  EXPECT_EQ(names.Find("b|s").node, 2u);
  EXPECT_FALSE(names.Find("b|s").several);
}

TEST(NamesTest, RemovingKeepsTheOrderOfTheRest) {
  Names names;
  for (NodeId id = 0; id < 4; ++id) names.Add(id, id + 10, "x");
  names.Remove(0, 10, "x");
  EXPECT_EQ(names.Find("x").node, 1u);
  names.Remove(2, 12, "x");
  names.Remove(1, 11, "x");
  EXPECT_EQ(names.Find("x").node, 3u);
  EXPECT_FALSE(names.Find("x").several);
  names.Remove(3, 13, "x");
  EXPECT_EQ(names.Find("x").node, kNoNode);
  names.Add(4, 14, "x");
  EXPECT_EQ(names.Find("x").node, 4u);
  EXPECT_EQ(names.ChildOf(14, "x"), 4u);
  EXPECT_EQ(names.ChildOf(13, "x"), kNoNode);
}

}  // namespace
}  // namespace scene
