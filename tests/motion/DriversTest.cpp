// What one channel takes from another: connections, driven keys, and the nodes that stand between.
#include <cmath>
#include <string>

#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::Vector;
using testing::IsEmpty;
using testmotion::kLine;
using testmotion::VectorNear;

constexpr double kRounding = 1e-13;

class DriversTest : public testmotion::EvaluatorTest {};

TEST_F(DriversTest, AChannelPassesOnToAnother) {
  Read(std::string(kLine) +
       "createNode transform -n \"a\";\ncreateNode transform -n \"b\";\ncreateNode transform -n \"c\";\n"
       "connectAttr \"line.o\" \"a.ty\";\nsetAttr \"a.tz\" 0.3;\nconnectAttr \"a.t\" \"b.t\";\n"
       "connectAttr \"b.ty\" \"c.sx\";\n");
  EXPECT_EQ(Point("b", "translate", 24.0), (Vector{0.0, 24.0, 0.3}));
  EXPECT_EQ(Number("c", "sx", 24.0), 24.0);
}

TEST_F(DriversTest, WhatIsConnectedPassesOnInternalUnits) {
  Read(
      "currentUnit -l meter -a degree -t film;\n"
      "createNode transform -n \"a\";\nsetAttr \".tx\" 2;\nsetAttr \".ry\" 90;\n"
      "createNode transform -n \"b\";\nconnectAttr \"a.tx\" \"b.sx\";\nconnectAttr \"a.ry\" \"b.sy\";\n");
  EXPECT_NEAR(Number("b", "sx"), 200.0, kRounding);
  EXPECT_NEAR(Number("b", "sy"), 1.5707963267948966, kRounding);
}

TEST_F(DriversTest, AUnitConversionMultiplies) {
  Read(
      "currentUnit -l meter -a degree -t film;\n"
      "createNode transform -n \"a\";\nsetAttr \".tx\" 2;\n"
      "createNode unitConversion -n \"factor\";\nsetAttr \".cf\" 0.017453292519943295;\n"
      "createNode transform -n \"b\";\nconnectAttr \"a.tx\" \"factor.i\";\nconnectAttr \"factor.o\" "
      "\"b.rz\";\n");
  EXPECT_NEAR(Number("b", "rz"), 200.0, 1e-12);
}

TEST_F(DriversTest, AnAttributeThatWasAddedDrivesAFocalLength) {
  Read(
      "createNode transform -n \"control\";\n"
      "addAttr -ci true -sn \"zoom\" -ln \"zoomOfCamera\" -dv 50 -at \"double\";\n"
      "createNode camera -n \"shape\";\nsetAttr \".fl\" 20;\n"
      "connectAttr \"control.zoom\" \"shape.fl\";\n");
  EXPECT_EQ(Number("shape", "focalLength"), 50.0);
}

TEST_F(DriversTest, AnAddedAttributeMeasuresWhatItsTypeSays) {
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

TEST_F(DriversTest, ADrivenKeyGoesByItsNumber) {
  Read(std::string(kLine) +
       "createNode transform -n \"a\";\nconnectAttr \"line.o\" \"a.tx\";\n"
       "createNode animCurveUL -n \"key\";\nsetAttr \".tan\" 2;\nsetAttr \".wgt\" no;\n"
       "setAttr -s 2 \".ktv[0:1]\"  10 100 20 300;\nconnectAttr \"a.tx\" \"key.i\";\n"
       "createNode transform -n \"b\";\nconnectAttr \"key.o\" \"b.ty\";\n");
  EXPECT_NEAR(Number("b", "ty", 15.0), 200.0, 1e-11);
  EXPECT_EQ(Number("b", "ty", 5.0), 100.0);
}

TEST_F(DriversTest, ATimeWarpMovesTheTimeOfACurve) {
  Read(std::string(kLine) +
       "createNode animCurveTT -n \"warp\";\nsetAttr \".tan\" 2;\nsetAttr -s 2 \".ktv[0:1]\"  0 0 10 20;\n"
       "connectAttr \"warp.o\" \"line.i\";\n"
       "createNode transform -n \"rig\";\nconnectAttr \"line.o\" \"rig.tx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 5.0), 10.0, kRounding);
}

TEST_F(DriversTest, TheSceneTimeMayStandBeforeACurve) {
  Read(std::string(kLine) +
       "connectAttr \":time1.o\" \"line.i\";\n"
       "createNode transform -n \"rig\";\nconnectAttr \"line.o\" \"rig.tx\";\n");
  EXPECT_NEAR(Number("rig", "tx", 5.0), 5.0, kRounding);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(DriversTest, AWeightedBlendAdds) {
  Read(
      "createNode transform -n \"a\";\nsetAttr \".t\" -type \"double3\" 1 10 100;\n"
      "createNode blendWeighted -n \"sum\";\nsetAttr -s 3 \".i\";\nsetAttr \".w[2]\" 0.5;\n"
      "connectAttr \"a.tx\" \"sum.i[0]\";\nconnectAttr \"a.ty\" \"sum.i[2]\";\n"
      "createNode transform -n \"b\";\nconnectAttr \"sum.o\" \"b.tx\";\n");
  EXPECT_NEAR(Number("b", "tx"), 6.0, kRounding);
}

TEST_F(DriversTest, AnAdditiveBlendAddsByItsWeights) {
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

TEST_F(DriversTest, APairBlendGoesByWeightAndMode) {
  Read(kPair);
  EXPECT_THAT(Point("rig", "translate"), VectorNear(Vector{2.0, 2.0, 7.0}, kRounding));
  EXPECT_THAT(Point("rig", "rotate"), VectorNear(Vector{20.0, 30.0, 40.0}, 1e-12));
}

TEST_F(DriversTest, APairBlendMayTurnAlongTheShorterArc) {
  Read(std::string(kPair) +
       "setAttr \"pair.ri\" 1;\nsetAttr \"first.r\" -type \"double3\" 0 0 -170;\n"
       "setAttr \"second.r\" -type \"double3\" 0 0 170;\n");
  EXPECT_THAT(Point("rig", "rotate"), VectorNear(Vector{0.0, 0.0, -175.0}, 1e-12));
}

TEST_F(DriversTest, TheEyesOfAStereoRigStandBesideItsCentre) {
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

}  // namespace
