// Values of channels: curves, connections, and what is kept where nothing can be computed.
#include "motion/Evaluator.h"

#include <cmath>

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
using testmotion::VectorNear;

constexpr double kRounding = 1e-13;

class EvaluatorTest : public testmotion::EvaluatorTest {
 protected:
  std::vector<Kept> KeptOf(const std::vector<NumberId>& numbers,
                           const std::vector<motion::MatrixId>& matrices) {
    return motion::KeptBelow(evaluator()).Of(numbers, matrices);
  }
};

// A straight line from 0 at frame 0 to 24 at frame 24, whatever a channel measures.
constexpr char kLine[] =
    "createNode animCurveTL -n \"line\";\n"
    "setAttr \".tan\" 2;\nsetAttr \".wgt\" no;\nsetAttr -s 2 \".ktv[0:1]\"  0 0 24 24;\n";

TEST_F(EvaluatorTest, AValueThatNothingDrivesIsThatOfTheSceneToTheBit) {
  Read(
      "createNode transform -n \"rig\";\nsetAttr \".t\" -type \"double3\" 0.1 -7.25 1e-300;\n"
      "setAttr \".ry\" 33.3;\n");
  EXPECT_EQ(Point("rig", "translate"), (Vector{0.1, -7.25, 1e-300}));
  EXPECT_EQ(Number("rig", "rotateY"), 33.3);
  EXPECT_EQ(Number("rig", "scaleZ"), 1.0);
  const NumberId id = evaluator().Number(At("rig"), "tx");
  EXPECT_FALSE(evaluator().Moves(id));
}

TEST_F(EvaluatorTest, ACurveIsTakenAtTheFrame) {
  Read(std::string(kLine) + "createNode transform -n \"rig\";\nconnectAttr \"line.o\" \"rig.tx\";\n");
  EXPECT_EQ(Number("rig", "tx", 0.0), 0.0);
  EXPECT_NEAR(Number("rig", "tx", 7.5), 7.5, kRounding);
  EXPECT_EQ(Number("rig", "tx", 100.0), 24.0);
  EXPECT_TRUE(evaluator().Moves(evaluator().Number(At("rig"), "tx")));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(EvaluatorTest, FramesCanGoBackAndForth) {
  Read(std::string(kLine) + "createNode transform -n \"rig\";\nconnectAttr \"line.o\" \"rig.tx\";\n");
  const NumberId id = evaluator().Number(At("rig"), "tx");
  for (const double frame : {20.0, 3.0, 23.0, 0.5, 12.0}) {
    evaluator().MoveTo(frame);
    EXPECT_NEAR(evaluator().Value(id), frame, kRounding);
  }
}

TEST_F(EvaluatorTest, TangentsAreInCentimetresRadiansAndSeconds) {
  // A slope of one metre a second, in a scene of metres at 10 frames a second: half a metre at half way,
  // level at the end, gives 0.5 + 1 / 8.
  Read(
      "currentUnit -l meter -a degree -t 10fps;\n"
      "createNode animCurveTL -n \"move\";\nsetAttr \".tan\" 1;\nsetAttr \".wgt\" no;\n"
      "setAttr -s 2 \".ktv[0:1]\"  0 0 10 1;\n"
      "setAttr -s 2 \".kix[0:1]\"  1 1;\nsetAttr -s 2 \".kiy[0:1]\"  0 0;\n"
      "setAttr -s 2 \".kox[0:1]\"  0.01 1;\nsetAttr -s 2 \".koy[0:1]\"  1 0;\n"
      "createNode animCurveTA -n \"turn\";\nsetAttr \".tan\" 1;\nsetAttr \".wgt\" no;\n"
      "setAttr -s 2 \".ktv[0:1]\"  0 0 10 180;\n"
      "setAttr -s 2 \".kix[0:1]\"  1 1;\nsetAttr -s 2 \".kiy[0:1]\"  0 0;\n"
      "setAttr -s 2 \".kox[0:1]\"  1 1;\nsetAttr -s 2 \".koy[0:1]\"  3.141592653589793 0;\n"
      "createNode transform -n \"rig\";\nconnectAttr \"move.o\" \"rig.tx\";\nconnectAttr \"turn.o\" "
      "\"rig.rx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 5.0), 0.625, kRounding);
  EXPECT_NEAR(Number("rig", "rx", 5.0), 112.5, 1e-11);
  EXPECT_EQ(Number("rig", "rx", 10.0), 180.0);
}

TEST_F(EvaluatorTest, TypesCountFromTheFirstKeyThatIsWritten) {
  // Straight up to the second key, held there.
  Read(
      "createNode animCurveTL -n \"move\";\nsetAttr \".tan\" 2;\nsetAttr \".wgt\" no;\n"
      "setAttr -s 4 \".ktv[0:1]\"  0 0 10 10;\nsetAttr \".ktv[2:3]\" 20 30 30 0;\n"
      "setAttr -s 4 \".kot[1:3]\"  5 2 2;\n"
      "createNode transform -n \"rig\";\nconnectAttr \"move.o\" \"rig.tx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 5.0), 5.0, kRounding);
  EXPECT_EQ(Number("rig", "tx", 19.0), 10.0);
  EXPECT_NEAR(Number("rig", "tx", 25.0), 15.0, kRounding);
}

TEST_F(EvaluatorTest, KeysOfScatteredIndicesComeInTheOrderOfTheirTimes) {
  Read(
      "createNode animCurveTL -n \"move\";\nsetAttr \".tan\" 2;\nsetAttr \".wgt\" no;\n"
      "setAttr \".ktv[2000000000]\" 10 100;\nsetAttr \".ktv[7]\" 20 0;\nsetAttr \".ktv[7]\" 20 200;\n"
      "setAttr \".kot[7]\" 5;\n"
      "createNode transform -n \"rig\";\nconnectAttr \"move.o\" \"rig.tx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 15.0), 150.0, kRounding);
}

TEST_F(EvaluatorTest, KeysThatAreSetByTheirComponentsAreReported) {
  for (const char* set : {".ktv[1].kt\" 12", ".keyTimeValue[1].keyTime\" 12", ".ktv[1].kv\" 7",
                          ".keyTimeValue[1].keyValue\" 7"}) {
    Read(std::string(kLine) + "setAttr \"" + set + ";\ncreateNode transform -n \"rig\";\n" +
         "connectAttr \"line.o\" \"rig.tx\";\n");
    EXPECT_EQ(Number("rig", "tx", 6.0), 6.0) << set;
    EXPECT_THAT(Diagnostics(), testing::ElementsAre(testing::HasSubstr("[MA0311]"))) << set;
  }
}

TEST_F(EvaluatorTest, AChannelPassesOnToAnother) {
  Read(std::string(kLine) +
       "createNode transform -n \"a\";\ncreateNode transform -n \"b\";\ncreateNode transform -n \"c\";\n"
       "connectAttr \"line.o\" \"a.ty\";\nsetAttr \"a.tz\" 0.3;\nconnectAttr \"a.t\" \"b.t\";\n"
       "connectAttr \"b.ty\" \"c.sx\";\n");
  EXPECT_EQ(Point("b", "translate", 24.0), (Vector{0.0, 24.0, 0.3}));
  EXPECT_EQ(Number("c", "sx", 24.0), 24.0);
}

TEST_F(EvaluatorTest, WhatIsConnectedPassesOnInternalUnits) {
  Read(
      "currentUnit -l meter -a degree -t film;\n"
      "createNode transform -n \"a\";\nsetAttr \".tx\" 2;\nsetAttr \".ry\" 90;\n"
      "createNode transform -n \"b\";\nconnectAttr \"a.tx\" \"b.sx\";\nconnectAttr \"a.ry\" \"b.sy\";\n");
  EXPECT_NEAR(Number("b", "sx"), 200.0, kRounding);
  EXPECT_NEAR(Number("b", "sy"), 1.5707963267948966, kRounding);
}

TEST_F(EvaluatorTest, AUnitConversionMultiplies) {
  Read(
      "currentUnit -l meter -a degree -t film;\n"
      "createNode transform -n \"a\";\nsetAttr \".tx\" 2;\n"
      "createNode unitConversion -n \"factor\";\nsetAttr \".cf\" 0.017453292519943295;\n"
      "createNode transform -n \"b\";\nconnectAttr \"a.tx\" \"factor.i\";\nconnectAttr \"factor.o\" "
      "\"b.rz\";\n");
  EXPECT_NEAR(Number("b", "rz"), 200.0, 1e-12);
}

TEST_F(EvaluatorTest, AnAttributeThatWasAddedDrivesAFocalLength) {
  Read(
      "createNode transform -n \"control\";\n"
      "addAttr -ci true -sn \"zoom\" -ln \"zoomOfCamera\" -dv 50 -at \"double\";\n"
      "createNode camera -n \"shape\";\nsetAttr \".fl\" 20;\n"
      "connectAttr \"control.zoom\" \"shape.fl\";\n");
  EXPECT_EQ(Number("shape", "focalLength"), 50.0);
}

TEST_F(EvaluatorTest, AnAddedAttributeMeasuresWhatItsTypeSays) {
  Read(
      "currentUnit -l meter -a degree -t film;\ncreateNode network -n \"ctrl\";\n"
      "addAttr -ln \"reach\" -at \"doubleLinear\";\naddAttr -ln \"turn\" -at \"doubleAngle\";\n"
      "addAttr -ln \"plain\" -at \"double\" -dv 3;\nsetAttr \".reach\" 2;\nsetAttr \".turn\" 180;\n"
      "createNode transform -n \"a\";\nconnectAttr \"ctrl.reach\" \"a.tx\";\n"
      "connectAttr \"ctrl.reach\" \"a.sx\";\nconnectAttr \"ctrl.turn\" \"a.rx\";\n"
      "connectAttr \"ctrl.turn\" \"a.sy\";\nconnectAttr \"ctrl.plain\" \"a.ty\";\n");
  EXPECT_EQ(Number("a", "tx"), 2.0);
  EXPECT_EQ(Number("a", "sx"), 200.0);
  EXPECT_EQ(Number("a", "rx"), 180.0);
  EXPECT_NEAR(Number("a", "sy"), 3.141592653589793, kRounding);
  EXPECT_NEAR(Number("a", "ty"), 0.03, kRounding);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(EvaluatorTest, ADrivenKeyGoesByItsNumber) {
  Read(std::string(kLine) +
       "createNode transform -n \"a\";\nconnectAttr \"line.o\" \"a.tx\";\n"
       "createNode animCurveUL -n \"key\";\nsetAttr \".tan\" 2;\nsetAttr \".wgt\" no;\n"
       "setAttr -s 2 \".ktv[0:1]\"  10 100 20 300;\nconnectAttr \"a.tx\" \"key.i\";\n"
       "createNode transform -n \"b\";\nconnectAttr \"key.o\" \"b.ty\";\n");
  EXPECT_NEAR(Number("b", "ty", 15.0), 200.0, 1e-11);
  EXPECT_EQ(Number("b", "ty", 5.0), 100.0);
}

TEST_F(EvaluatorTest, ATimeWarpMovesTheTimeOfACurve) {
  Read(std::string(kLine) +
       "createNode animCurveTT -n \"warp\";\nsetAttr \".tan\" 2;\nsetAttr -s 2 \".ktv[0:1]\"  0 0 10 20;\n"
       "connectAttr \"warp.o\" \"line.i\";\n"
       "createNode transform -n \"rig\";\nconnectAttr \"line.o\" \"rig.tx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 5.0), 10.0, kRounding);
}

TEST_F(EvaluatorTest, TheSceneTimeMayStandBeforeACurve) {
  Read(std::string(kLine) +
       "connectAttr \":time1.o\" \"line.i\";\n"
       "createNode transform -n \"rig\";\nconnectAttr \"line.o\" \"rig.tx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 5.0), 5.0, kRounding);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(EvaluatorTest, AWeightedBlendAdds) {
  Read(
      "createNode transform -n \"a\";\nsetAttr \".t\" -type \"double3\" 1 10 100;\n"
      "createNode blendWeighted -n \"sum\";\nsetAttr -s 3 \".i\";\nsetAttr \".w[2]\" 0.5;\n"
      "connectAttr \"a.tx\" \"sum.i[0]\";\nconnectAttr \"a.ty\" \"sum.i[2]\";\n"
      "createNode transform -n \"b\";\nconnectAttr \"sum.o\" \"b.tx\";\n");
  EXPECT_NEAR(Number("b", "tx"), 6.0, kRounding);
}

TEST_F(EvaluatorTest, AnAdditiveBlendAddsByItsWeights) {
  Read(
      "createNode transform -n \"a\";\nsetAttr \".r\" -type \"double3\" 10 20 30;\n"
      "createNode animBlendNodeAdditiveDA -n \"layer\";\nsetAttr \".wb\" 0.25;\n"
      "connectAttr \"a.rx\" \"layer.ia\";\nconnectAttr \"a.ry\" \"layer.ib\";\n"
      "createNode transform -n \"b\";\nconnectAttr \"layer.o\" \"b.rx\";\n");
  EXPECT_NEAR(Number("b", "rx"), 15.0, kRounding);
}

constexpr char kPair[] =
    "createNode transform -n \"first\";\nsetAttr \".t\" -type \"double3\" 1 2 3;\n"
    "setAttr \".r\" -type \"double3\" 10 20 30;\n"
    "createNode transform -n \"second\";\nsetAttr \".t\" -type \"double3\" 5 6 7;\n"
    "setAttr \".r\" -type \"double3\" 50 60 70;\n"
    "createNode pairBlend -n \"pair\";\nsetAttr \".w\" 0.25;\nsetAttr \".tym\" 1;\nsetAttr \".tzm\" 2;\n"
    "connectAttr \"first.tx\" \"pair.itx1\";\nconnectAttr \"first.ty\" \"pair.ity1\";\n"
    "connectAttr \"first.tz\" \"pair.itz1\";\nconnectAttr \"second.tx\" \"pair.itx2\";\n"
    "connectAttr \"second.ty\" \"pair.ity2\";\nconnectAttr \"second.tz\" \"pair.itz2\";\n"
    "connectAttr \"first.r\" \"pair.ir1\";\nconnectAttr \"second.r\" \"pair.ir2\";\n"
    "createNode transform -n \"rig\";\nconnectAttr \"pair.otx\" \"rig.tx\";\nconnectAttr \"pair.oty\" "
    "\"rig.ty\";\n"
    "connectAttr \"pair.otz\" \"rig.tz\";\nconnectAttr \"pair.or\" \"rig.r\";\n";

TEST_F(EvaluatorTest, APairBlendGoesByWeightAndMode) {
  Read(kPair);
  EXPECT_THAT(Point("rig", "translate"), VectorNear(Vector{2.0, 2.0, 7.0}, kRounding));
  EXPECT_THAT(Point("rig", "rotate"), VectorNear(Vector{20.0, 30.0, 40.0}, 1e-12));
}

TEST_F(EvaluatorTest, APairBlendMayTurnAlongTheShorterArc) {
  Read(std::string(kPair) +
       "setAttr \"pair.ri\" 1;\nsetAttr \"first.r\" -type \"double3\" 0 0 -170;\n"
       "setAttr \"second.r\" -type \"double3\" 0 0 170;\n");
  EXPECT_THAT(Point("rig", "rotate"), VectorNear(Vector{0.0, 0.0, -175.0}, 1e-12));
}

TEST_F(EvaluatorTest, TheEyesOfAStereoRigStandBesideItsCentre) {
  Read(
      "createNode stereoRigTransform -n \"rig\";\nsetAttr \".isep\" 6;\nsetAttr \".zp\" 300;\n"
      "setAttr \".fli\" 25.4;\nsetAttr \".sm\" 1;\n"
      "createNode transform -n \"left\" -p \"rig\";\nconnectAttr \"rig.slo\" \"left.tx\";\n"
      "connectAttr \"rig.sla\" \"left.ry\";\n"
      "createNode transform -n \"right\" -p \"rig\";\nconnectAttr \"rig.sro\" \"right.tx\";\n"
      "connectAttr \"rig.sra\" \"right.ry\";\n"
      "createNode camera -n \"leftShape\" -p \"left\";\nconnectAttr \"rig.fbol\" \"leftShape.hfo\";\n");
  EXPECT_EQ(Number("left", "tx"), -3.0);
  EXPECT_EQ(Number("right", "tx"), 3.0);
  EXPECT_NEAR(Number("left", "ry"), -std::atan(0.01) / 0.017453292519943295, kRounding);
  EXPECT_NEAR(Number("right", "ry"), std::atan(0.01) / 0.017453292519943295, kRounding);
  EXPECT_EQ(Number("leftShape", "hfo"), 0.0);
}

// ---- what is kept ----

TEST_F(EvaluatorTest, AnUnsupportedDriverLeavesTheStoredValue) {
  Read(
      "createNode transform -n \"rig\";\nsetAttr \".tx\" 7.5;\n"
      "createNode expression -n \"shake\";\nconnectAttr \"shake.out[0]\" \"rig.tx\";\n");
  EXPECT_EQ(Number("rig", "tx"), 7.5);
  EXPECT_THAT(
      Diagnostics(),
      ElementsAre("4: \"|rig.translateX\" is driven by \"|shake.out[0]\" (expression), which cannot be "
                  "computed here [MA0401]"));
}

TEST_F(EvaluatorTest, AChannelOfAnotherFileLeavesTheStoredValue) {
  Read("createNode transform -n \"rig\";\nsetAttr \".tx\" 7.5;\nconnectAttr \"hero:head.tx\" \"rig.tx\";\n");
  EXPECT_EQ(Number("rig", "tx"), 7.5);
  ASSERT_EQ(Diagnostics().size(), 1u);
  EXPECT_THAT(Diagnostics()[0], HasSubstr("hero:head"));
}

TEST_F(EvaluatorTest, WithoutAStoredValueADriverThatIsNotKnownLeavesTheDefault) {
  Read(
      "createNode transform -n \"rig\";\ncreateNode expression -n \"shake\";\n"
      "connectAttr \"shake.out[0]\" \"rig.sx\";\n");
  EXPECT_EQ(Number("rig", "sx"), 1.0);
  EXPECT_EQ(World("rig").x.x, 1.0);
}

TEST_F(EvaluatorTest, WhatIsNotKnownGoesOnToTheNextStoredValue) {
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

TEST_F(EvaluatorTest, ItKnowsWhatWasKeptBelowAValue) {
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

TEST_F(EvaluatorTest, ACircleIsTheSameWhicheverChannelIsAskedForFirst) {
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

TEST_F(EvaluatorTest, AChannelThatDrivesItselfKeepsItsValue) {
  Read("createNode transform -n \"a\";\nsetAttr \".tx\" 5;\nconnectAttr \"a.tx\" \"a.tx\";\n");
  EXPECT_EQ(Number("a", "tx"), 5.0);
}

TEST_F(EvaluatorTest, AConstraintOntoItsOwnChildKeepsTheStoredPlace) {
  Read(
      "createNode transform -n \"rig\";\nsetAttr \".t\" -type \"double3\" 7 8 9;\n"
      "createNode transform -n \"target\" -p \"rig\";\n"
      "createNode pointConstraint -n \"hold\" -p \"rig\";\nconnectAttr \"target.t\" \"hold.tg[0].tt\";\n"
      "connectAttr \"target.pm\" \"hold.tg[0].tpm\";\nconnectAttr \"hold.ctx\" \"rig.tx\";\n");
  EXPECT_EQ(World("rig").origin, (Vector{7.0, 8.0, 9.0}));
  EXPECT_THAT(Diagnostics(), testing::Contains(HasSubstr("MA0403")));
}

TEST_F(EvaluatorTest, AConstraintWithoutAnAnswerAtSomeFramesKeepsTheStoredValueThere) {
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

// ---- bounds ----

TEST_F(EvaluatorTest, AHundredThousandChannelsInARowTakeNoDepth) {
  constexpr int kCount = 100000;
  std::string text = "createNode transform -n \"n0\";\nsetAttr \".tx\" 4;\n";
  for (int i = 1; i < kCount; ++i) {
    const std::string name = "n" + std::to_string(i);
    text += "createNode transform -n \"" + name + "\";\nconnectAttr \"n" + std::to_string(i - 1) +
            ".tx\" \"" + name + ".tx\";\n";
  }
  Read(text);
  EXPECT_EQ(Number("n" + std::to_string(kCount - 1), "tx"), 4.0);
}

TEST_F(EvaluatorTest, WhatDependsOnNothingInCommonMovesPartByPart) {
  Read(std::string(kLine) +
       "createNode animCurveTL -n \"steep\";\nsetAttr \".tan\" 2;\nsetAttr \".wgt\" no;\n"
       "setAttr -s 2 \".ktv[0:1]\"  0 0 24 240;\n"
       "createNode transform -n \"a\";\nconnectAttr \"line.o\" \"a.tx\";\n"
       "createNode transform -n \"b\" -p \"a\";\n"
       "createNode transform -n \"c\";\nconnectAttr \"steep.o\" \"c.tx\";\n"
       "createNode transform -n \"still\";\n");
  motion::Evaluator& evaluator = this->evaluator();
  const NumberId a = evaluator.Number(At("a"), "tx");
  const NumberId c = evaluator.Number(At("c"), "tx");
  const NumberId still = evaluator.Number(At("still"), "tx");
  const motion::MatrixId b = evaluator.World(At("b"));
  const std::vector<motion::Evaluator::Wanted> wanted = {{{still}, {}}, {{c}, {}}, {{}, {b}}, {{a}, {}}};
  // "b" hangs under what "a" shows, and "c" has nothing to do with either.
  EXPECT_THAT(evaluator.Split(wanted), ElementsAre(motion::Evaluator::kStill, 1, 2, 2));
  EXPECT_EQ(evaluator.partCount(), 3u);
  evaluator.MoveTo(0.0);
  evaluator.MoveTo(6.0, 2);
  EXPECT_NEAR(evaluator.Value(a), 6.0, kRounding);
  EXPECT_NEAR(evaluator.Value(b).origin.x, 6.0, kRounding);
  EXPECT_EQ(evaluator.Value(c), 0.0);
  evaluator.MoveTo(12.0, 1);
  EXPECT_NEAR(evaluator.Value(c), 120.0, 10 * kRounding);
  EXPECT_NEAR(evaluator.Value(a), 6.0, kRounding);
  // Values that are looked at together are in one part.
  EXPECT_THAT(evaluator.Split(std::vector<motion::Evaluator::Wanted>{{{a, c}, {}}, {{}, {b}}}),
              ElementsAre(1, 1));
}

}  // namespace
