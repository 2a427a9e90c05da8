// The value that is kept where none can be computed.
#include <string>
#include <utility>
#include <vector>

#include "motion/KeptBelow.h"
#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::Kept;
using motion::NumberId;
using motion::Standing;
using motion::Vector;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testmotion::kLine;

class KeptValuesTest : public testmotion::EvaluatorTest {
 protected:
  std::vector<Kept> KeptOf(const std::vector<NumberId>& numbers,
                           const std::vector<motion::MatrixId>& matrices) {
    return motion::KeptBelow(evaluator()).Of(numbers, matrices);
  }
};

TEST_F(KeptValuesTest, AnUnsupportedDriverLeavesTheStoredValue) {
  Read(
      "createNode transform -n \"rig\";\nsetAttr \".tx\" 7.5;\n"
      "createNode expression -n \"shake\";\nconnectAttr \"shake.out[0]\" \"rig.tx\";\n");
  EXPECT_EQ(Number("rig", "tx"), 7.5);
  EXPECT_THAT(
      Diagnostics(),
      ElementsAre("4: \"|rig.translateX\" is driven by \"|shake.out[0]\" (expression), which cannot be "
                  "computed here [MA0401]"));
}

TEST_F(KeptValuesTest, AChannelOfAnotherFileLeavesTheStoredValue) {
  Read("createNode transform -n \"rig\";\nsetAttr \".tx\" 7.5;\nconnectAttr \"hero:head.tx\" \"rig.tx\";\n");
  EXPECT_EQ(Number("rig", "tx"), 7.5);
  ASSERT_EQ(Diagnostics().size(), 1u);
  EXPECT_THAT(Diagnostics()[0], HasSubstr("hero:head"));
}

TEST_F(KeptValuesTest, WithoutAStoredValueADriverThatIsNotKnownLeavesTheDefault) {
  Read(
      "createNode transform -n \"rig\";\ncreateNode expression -n \"shake\";\n"
      "connectAttr \"shake.out[0]\" \"rig.sx\";\n");
  EXPECT_EQ(Number("rig", "sx"), 1.0);
  EXPECT_EQ(World("rig").x.x, 1.0);
}

TEST_F(KeptValuesTest, WhatIsNotKnownGoesOnToTheNextStoredValue) {
  Read(
      "createNode transform -n \"target\";\ncreateNode expression -n \"shake\";\n"
      "connectAttr \"shake.out[0]\" \"target.tx\";\n"
      "createNode transform -n \"rig\";\nsetAttr \".t\" -type \"double3\" 7 8 9;\n"
      "createNode pointConstraint -n \"hold\" -p \"rig\";\nconnectAttr \"target.t\" \"hold.tg[0].tt\";\n"
      "connectAttr \"hold.ctx\" \"rig.tx\";\nconnectAttr \"hold.cty\" \"rig.ty\";\n");
  EXPECT_EQ(Number("rig", "tx"), 7.0);
  EXPECT_EQ(Number("rig", "ty"), 8.0);
  EXPECT_THAT(
      Diagnostics(),
      ElementsAre(HasSubstr("\"|target.translateX\" is driven by"),
                  HasSubstr("\"|rig|hold.constraintTranslateX\" gives \"|rig.translateX\" no value"),
                  HasSubstr("\"|rig|hold.constraintTranslateY\" gives \"|rig.translateY\" no value")));
}

TEST_F(KeptValuesTest, ItKnowsWhatWasKeptBelowAValue) {
  Read(
      "createNode transform -n \"free\";\ncreateNode transform -n \"a\";\ncreateNode expression -n "
      "\"shake\";\n"
      "connectAttr \"shake.out[0]\" \"a.tx\";\nsetAttr \"a.tx\" 3;\n"
      "createNode transform -n \"b\" -p \"a\";\nconnectAttr \"a.tx\" \"b.ty\";\n");
  const NumberId ty = evaluator().Number(At("b"), "ty");
  const motion::MatrixId world = evaluator().World(At("b"));
  const motion::MatrixId free = evaluator().World(At("free"));
  for (const auto& kept : {KeptOf({ty}, {}), KeptOf({}, {world}), KeptOf({ty}, {world})}) {
    ASSERT_EQ(kept.size(), 1u);
    EXPECT_EQ(kept[0].plug, scene().PlugOf(At("a"), "tx"));
    EXPECT_EQ(kept[0].standing, Standing::kUnsupported);
  }
  EXPECT_THAT(KeptOf({}, {free}), IsEmpty());
}

TEST_F(KeptValuesTest, ACircleIsTheSameWhicheverChannelIsAskedForFirst) {
  // Two circles that share c, and one channel after them.
  for (const std::string order : {"abcde", "edcba", "cabde", "debac"}) {
    std::string text;
    for (const char* name : {"a", "b", "c", "d", "e"}) {
      text += "createNode transform -n \"" + std::string(name) + "\";\nsetAttr \".tx\" " +
              std::to_string(name[0]) + ";\n";
    }
    text +=
        "connectAttr \"a.tx\" \"b.tx\";\nconnectAttr \"b.tx\" \"c.tx\";\nconnectAttr \"c.tx\" \"a.tx\";\n"
        "createNode blendWeighted -n \"sum\";\nconnectAttr \"c.tx\" \"sum.i[0]\";\n"
        "connectAttr \"sum.o\" \"d.tx\";\nconnectAttr \"d.tx\" \"sum.i[1]\";\n"
        "connectAttr \"d.tx\" \"e.tx\";\n";
    Read(text);
    for (const char name : order) (void)evaluator().Number(At(std::string(1, name)), "tx");
    for (const char* name : {"a", "b", "c", "d"}) EXPECT_EQ(Number(name, "tx"), name[0]) << order;
    EXPECT_EQ(Number("e", "tx"), 'd') << order;
    EXPECT_THAT(Diagnostics(),
                testing::UnorderedElementsAre(HasSubstr("1: \"|a.translateX\" drives itself [MA0403]"),
                                              HasSubstr("7: \"|d.translateX\" drives itself [MA0403]")))
        << order;
    EXPECT_EQ(KeptOf({evaluator().Number(At("e"), "tx")}, {}).size(), 1u) << order;
  }
}

TEST_F(KeptValuesTest, AChannelThatDrivesItselfKeepsItsValue) {
  Read("createNode transform -n \"a\";\nsetAttr \".tx\" 5;\nconnectAttr \"a.tx\" \"a.tx\";\n");
  EXPECT_EQ(Number("a", "tx"), 5.0);
}

TEST_F(KeptValuesTest, AConstraintOntoItsOwnChildKeepsTheStoredPlace) {
  Read(
      "createNode transform -n \"rig\";\nsetAttr \".t\" -type \"double3\" 7 8 9;\n"
      "createNode transform -n \"target\" -p \"rig\";\n"
      "createNode pointConstraint -n \"hold\" -p \"rig\";\nconnectAttr \"target.t\" \"hold.tg[0].tt\";\n"
      "connectAttr \"target.pm\" \"hold.tg[0].tpm\";\nconnectAttr \"hold.ctx\" \"rig.tx\";\n");
  EXPECT_EQ(World("rig").origin, (Vector{7.0, 8.0, 9.0}));
  EXPECT_THAT(Diagnostics(), testing::Contains(HasSubstr("MA0403")));
}

TEST_F(KeptValuesTest, AConstraintWithoutAnAnswerAtSomeFramesKeepsTheStoredValueThere) {
  Read(std::string(kLine) +
       "createNode transform -n \"target\";\nsetAttr \".tx\" 50;\n"
       "createNode transform -n \"rig\";\nsetAttr \".tx\" 3;\n"
       "createNode pointConstraint -n \"hold\" -p \"rig\";\n"
       "connectAttr \"target.t\" \"hold.tg[0].tt\";\nconnectAttr \"line.o\" \"hold.tg[0].tw\";\n"
       "connectAttr \"hold.ctx\" \"rig.tx\";\n");
  const NumberId tx = evaluator().Number(At("rig"), "tx");
  for (const auto& [frame, value] : {std::pair(5.0, 50.0), {0.0, 3.0}, {5.0, 50.0}, {0.0, 3.0}}) {
    evaluator().MoveTo(frame);
    EXPECT_EQ(evaluator().Value(tx), value);
  }
  EXPECT_THAT(Diagnostics(), ElementsAre(HasSubstr("gives \"|rig.translateX\" no value")));
  ASSERT_EQ(KeptOf({tx}, {}).size(), 1u);
  EXPECT_EQ(KeptOf({tx}, {})[0].standing, Standing::kFailed);
}

}  // namespace
