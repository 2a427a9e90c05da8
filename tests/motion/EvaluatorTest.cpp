// Values of channels that a curve drives, and of those that nothing drives.
#include "motion/Evaluator.h"

#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::NumberId;
using motion::Vector;
using testing::ElementsAre;
using testing::IsEmpty;
using testmotion::kLine;

constexpr double kRounding = 1e-13;

class EvaluatorTest : public testmotion::EvaluatorTest {};

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
    EXPECT_THAT(Diagnostics(), ElementsAre(testing::HasSubstr("[MA0311]"))) << set;
  }
}

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
