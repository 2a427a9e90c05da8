// Matrices of nodes by their place in the scene, and constraints between nodes.
#include <cmath>

#include "motion/Evaluator.h"
#include "motion/KeptBelow.h"
#include "motion/Rotation.h"
#include "motion/Transform.h"
#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::Matrix;
using motion::RotationAbout;
using motion::Scaling;
using motion::Translation;
using motion::Vector;
using testing::IsEmpty;
using testmotion::MatrixNear;
using testmotion::VectorNear;

constexpr double kDegree = 0.017453292519943295;

class PlacesTest : public testmotion::EvaluatorTest {};

TEST_F(PlacesTest, EveryAttributeOfATransformIsTaken) {
  Read(
      "createNode transform -n \"rig\";\n"
      "setAttr \".t\" -type \"double3\" 1 2 3;\nsetAttr \".r\" -type \"double3\" 10 20 30;\n"
      "setAttr \".s\" -type \"double3\" 2 3 4;\nsetAttr \".sh\" -type \"double3\" 0.1 0.2 0.3;\n"
      "setAttr \".ro\" 4;\nsetAttr \".ra\" -type \"double3\" 5 6 7;\n"
      "setAttr \".rp\" -type \"double3\" 0.5 0.6 0.7;\nsetAttr \".rpt\" -type \"double3\" 0.8 0.9 1.1;\n"
      "setAttr \".sp\" -type \"double3\" 1.2 1.3 1.4;\nsetAttr \".spt\" -type \"double3\" 1.5 1.6 1.7;\n");
  motion::Transform expected;
  expected.translate = {1.0, 2.0, 3.0};
  expected.rotate = Vector{10.0, 20.0, 30.0} * kDegree;
  expected.scale = {2.0, 3.0, 4.0};
  expected.shear = {0.1, 0.2, 0.3};
  expected.order = motion::RotateOrder::kYXZ;
  expected.rotateAxis = Vector{5.0, 6.0, 7.0} * kDegree;
  expected.rotatePivot = {0.5, 0.6, 0.7};
  expected.rotatePivotTranslate = {0.8, 0.9, 1.1};
  expected.scalePivot = {1.2, 1.3, 1.4};
  expected.scalePivotTranslate = {1.5, 1.6, 1.7};
  EXPECT_THAT(Local("rig"), MatrixNear(LocalMatrix(expected), 1e-14));
  EXPECT_THAT(World("rig"), MatrixNear(LocalMatrix(expected), 1e-14));
}

TEST_F(PlacesTest, AJointTakesItsOrientAndItsParentsScaleBack) {
  Read(
      "createNode joint -n \"hip\";\nsetAttr \".s\" -type \"double3\" 2 4 5;\n"
      "createNode joint -n \"knee\" -p \"hip\";\nsetAttr \".t\" -type \"double3\" 1 0 0;\n"
      "setAttr \".jo\" -type \"double3\" 0 0 90;\nconnectAttr \"hip.s\" \"knee.is\";\n"
      "createNode joint -n \"free\" -p \"hip\";\nsetAttr \".ssc\" no;\nsetAttr \".is\" -type \"double3\" 2 4 "
      "5;\n");
  EXPECT_THAT(Local("knee"), MatrixNear(RotationAbout(2, 90 * kDegree) * Scaling({0.5, 0.25, 0.2}) *
                                            Translation({1.0, 0.0, 0.0}),
                                        1e-15));
  EXPECT_THAT(Local("free"), MatrixNear(Matrix{}, 0.0));
}

TEST_F(PlacesTest, WhatStandsBetweenANodeAndItsParentHasItsOffsetInIt) {
  Read(
      "createNode transform -n \"top\";\nsetAttr \".tx\" 100;\n"
      "createNode transform -n \"leaf\" -p \"top\";\nsetAttr \".tx\" 1;\n"
      "setAttr \".opm\" -type \"matrix\" 2 0 0 0 0 3 0 0 0 0 4 0 7 8 9 1;\n");
  const motion::MatrixId inParent = evaluator().InParent(At("leaf"));
  EXPECT_THAT(evaluator().Value(inParent),
              MatrixNear(Scaling({2.0, 3.0, 4.0}) * Translation({9.0, 8.0, 9.0}), 0.0));
}

TEST_F(PlacesTest, LimitsHoldWhereTheyAreOn) {
  Read(
      "createNode transform -n \"rig\";\nsetAttr \".t\" -type \"double3\" 5 5 5;\nsetAttr \".rz\" 90;\n"
      "setAttr \".mxtl\" -type \"double3\" 2 3 4;\nsetAttr \".xtxe\" yes;\nsetAttr \".xtze\" yes;\n"
      "setAttr \".mxrl\" -type \"double3\" 10 20 30;\nsetAttr \".xrze\" yes;\n");
  EXPECT_THAT(Local("rig"), MatrixNear(RotationAbout(2, 30 * kDegree) * Translation({2.0, 5.0, 4.0}), 1e-15));
}

TEST_F(PlacesTest, TheWorldIsWhatAllAncestorsMake) {
  Read(
      "createNode transform -n \"top\";\nsetAttr \".s\" -type \"double3\" 2 2 2;\n"
      "createNode transform -n \"middle\" -p \"top\";\nsetAttr \".rz\" 90;\n"
      "createNode transform -n \"leaf\" -p \"|top|middle\";\nsetAttr \".tx\" 1;\n"
      "createNode camera -n \"shape\" -p \"leaf\";\n");
  const Matrix expected =
      Translation({1.0, 0.0, 0.0}) * RotationAbout(2, 90 * kDegree) * Scaling({2.0, 2.0, 2.0});
  EXPECT_THAT(World("leaf"), MatrixNear(expected, 1e-15));
  EXPECT_THAT(World("shape"), MatrixNear(expected, 1e-15));
}

TEST_F(PlacesTest, WithoutInheritanceTheParentDoesNotCount) {
  Read(
      "createNode transform -n \"top\";\nsetAttr \".tx\" 5;\n"
      "createNode transform -n \"leaf\" -p \"top\";\nsetAttr \".ty\" 1;\nsetAttr \".it\" no;\n");
  EXPECT_EQ(World("leaf").origin, (Vector{0.0, 1.0, 0.0}));
}

TEST_F(PlacesTest, AnOffsetParentMatrixComesBetween) {
  Read(
      "createNode transform -n \"top\";\nsetAttr \".tx\" 5;\n"
      "createNode transform -n \"leaf\" -p \"top\";\nsetAttr \".ty\" 1;\n"
      "setAttr \".opm\" -type \"matrix\" 2 0 0 0 0 3 0 0 0 0 4 0 7 8 9 1;\n"
      "createNode transform -n \"other\";\nsetAttr \".tz\" 6;\n"
      "createNode transform -n \"driven\" -p \"top\";\nconnectAttr \"other.wm\" \"driven.opm\";\n");
  EXPECT_EQ(World("leaf").origin, (Vector{12.0, 11.0, 9.0}));
  EXPECT_EQ(World("leaf").y, (Vector{0.0, 3.0, 0.0}));
  EXPECT_EQ(World("driven").origin, (Vector{5.0, 0.0, 6.0}));
}

TEST_F(PlacesTest, AnOffsetParentMatrixThatCannotBeComputedIsTheStoredOne) {
  Read(
      "createNode transform -n \"leaf\";\nsetAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 7 8 9 "
      "1;\n"
      "createNode multMatrix -n \"product\";\nconnectAttr \"product.o\" \"leaf.opm\";\n");
  EXPECT_EQ(World("leaf").origin, (Vector{7.0, 8.0, 9.0}));
  EXPECT_EQ(Diagnostics().size(), 1u);
  const motion::MatrixId leaf = evaluator().World(At("leaf"));
  EXPECT_EQ(motion::KeptBelow(evaluator()).Of({}, {leaf}).size(), 1u);
}

TEST_F(PlacesTest, WhatItWasMadeFromIsThereAtEveryFrame) {
  Read(
      "createNode animCurveTL -n \"line\";\nsetAttr \".tan\" 2;\nsetAttr -s 2 \".ktv[0:1]\"  0 0 10 10;\n"
      "createNode transform -n \"rig\";\nsetAttr \".ro\" 2;\nconnectAttr \"line.o\" \"rig.ty\";\n");
  const motion::MatrixId local = evaluator().Local(At("rig"));
  EXPECT_TRUE(evaluator().Moves(local));
  evaluator().MoveTo(4.0);
  EXPECT_NEAR(evaluator().TransformOf(local).translate.y, 4.0, 1e-14);
  EXPECT_EQ(evaluator().TransformOf(local).order, motion::RotateOrder::kZXY);
}

TEST_F(PlacesTest, AHundredThousandAncestorsTakeNoDepth) {
  constexpr int kCount = 100000;
  std::string text = "createNode transform -n \"n0\";\nsetAttr \".tx\" 1;\n";
  for (int i = 1; i < kCount; ++i) {
    text += "createNode transform -n \"n" + std::to_string(i) + "\" -p \"n" + std::to_string(i - 1) +
            "\";\nsetAttr \".tx\" 1;\n";
  }
  Read(text);
  EXPECT_EQ(World("n" + std::to_string(kCount - 1)).origin.x, double{kCount});
}

// ---- constraints ----

TEST_F(PlacesTest, ALookAtInShortNamesTurnsItsCamera) {
  Read(
      "createNode transform -n \"stage\";\nsetAttr \".ry\" 90;\n"
      "createNode lookAt -n \"aimed\" -p \"stage\";\nsetAttr \".a\" -type \"double3\" 0 0 -1;\n"
      "createNode transform -n \"shot\" -p \"aimed\";\nsetAttr \".t\" -type \"double3\" 0 3 4;\n"
      "createNode transform -n \"point\" -p \"stage\";\nsetAttr \".t\" -type \"double3\" 2 1 -5;\n"
      "connectAttr \"point.t\" \"aimed.tg[0].tt\";\nconnectAttr \"point.pm\" \"aimed.tg[0].tpm\";\n"
      "connectAttr \"shot.pim\" \"aimed.cpim\";\nconnectAttr \"shot.t\" \"aimed.ct\";\n"
      "connectAttr \"aimed.crx\" \"shot.rx\";\nconnectAttr \"aimed.cry\" \"shot.ry\";\n"
      "connectAttr \"aimed.crz\" \"shot.rz\";\n");
  const Matrix shot = World("shot");
  const Vector toPoint = World("point").origin - shot.origin;
  EXPECT_THAT(-shot.z, VectorNear(toPoint * (1.0 / Length(toPoint)), 1e-14));
  EXPECT_NEAR(shot.x.y, 0.0, 1e-14);
  EXPECT_GT(shot.y.y, 0.0);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(PlacesTest, AnAimConstraintTakesOffsetUpObjectAndWeights) {
  Read(
      "createNode transform -n \"shot\";\nsetAttr \".ro\" 3;\n"
      "createNode transform -n \"up\";\nsetAttr \".tz\" 8;\n"
      "createNode transform -n \"left\";\nsetAttr \".tx\" -2;\n"
      "createNode transform -n \"right\";\nsetAttr \".tx\" 4;\n"
      "createNode aimConstraint -n \"aim\" -p \"shot\";\n"
      "addAttr -sn \"w0\" -ln \"leftW0\" -dv 1 -at \"double\";\n"
      "addAttr -sn \"w1\" -ln \"rightW1\" -dv 1 -at \"double\";\nsetAttr \".w0\" 0;\n"
      "setAttr \".wut\" 1;\nsetAttr \".o\" -type \"double3\" 90 0 0;\n"
      "connectAttr \"left.t\" \"aim.tg[0].tt\";\nconnectAttr \"right.t\" \"aim.tg[1].tt\";\n"
      "connectAttr \"aim.w0\" \"aim.tg[0].tw\";\nconnectAttr \"aim.w1\" \"aim.tg[1].tw\";\n"
      "connectAttr \"up.wm\" \"aim.wum\";\nconnectAttr \"shot.ro\" \"aim.cro\";\n"
      "connectAttr \"aim.cr\" \"shot.r\";\n");
  // The offset turns y to z, and the up axis goes to z: y ends at -y.
  const Matrix shot = World("shot");
  EXPECT_THAT(shot.x, VectorNear(Vector{1.0, 0.0, 0.0}, 1e-15));
  EXPECT_THAT(shot.y, VectorNear(Vector{0.0, -1.0, 0.0}, 1e-15));
}

constexpr char kTarget[] =
    "createNode transform -n \"stage\";\nsetAttr \".t\" -type \"double3\" 10 0 0;\nsetAttr \".rz\" 90;\n"
    "createNode transform -n \"target\" -p \"stage\";\nsetAttr \".t\" -type \"double3\" 1 2 3;\n"
    "setAttr \".r\" -type \"double3\" 0 0 -90;\nsetAttr \".s\" -type \"double3\" 2 2 2;\n"
    "createNode transform -n \"frame\";\nsetAttr \".t\" -type \"double3\" 0 5 0;\n"
    "setAttr \".s\" -type \"double3\" 4 4 4;\n"
    "createNode transform -n \"shot\" -p \"frame\";\n";

TEST_F(PlacesTest, APointConstraintPutsTheNodeOnItsTarget) {
  Read(std::string(kTarget) +
       "createNode pointConstraint -n \"hold\" -p \"shot\";\nconnectAttr \"target.t\" \"hold.tg[0].tt\";\n"
       "connectAttr \"target.pm\" \"hold.tg[0].tpm\";\nconnectAttr \"shot.pim\" \"hold.cpim\";\n"
       "connectAttr \"hold.ct\" \"shot.t\";\n");
  EXPECT_THAT(World("shot").origin, VectorNear(Vector{8.0, 1.0, 3.0}, 1e-14));
}

TEST_F(PlacesTest, AnOrientConstraintTurnsTheNodeAsItsTarget) {
  Read(std::string(kTarget) +
       "createNode orientConstraint -n \"hold\" -p \"shot\";\nsetAttr \".o\" -type \"double3\" 0 30 0;\n"
       "connectAttr \"target.r\" \"hold.tg[0].tr\";\nconnectAttr \"target.pm\" \"hold.tg[0].tpm\";\n"
       "connectAttr \"shot.pim\" \"hold.cpim\";\nconnectAttr \"hold.cr\" \"shot.r\";\n");
  EXPECT_THAT(Point("shot", "rotate"), VectorNear(Vector{0.0, 30.0, 0.0}, 1e-12));
}

TEST_F(PlacesTest, AParentConstraintHoldsTheNodeInItsTarget) {
  Read(std::string(kTarget) +
       "createNode parentConstraint -n \"hold\" -p \"shot\";\n"
       "setAttr \".tg[0].tot\" -type \"double3\" 1 0 0;\nsetAttr \".tg[0].tor\" -type \"double3\" 0 30 0;\n"
       "connectAttr \"target.t\" \"hold.tg[0].tt\";\nconnectAttr \"target.r\" \"hold.tg[0].tr\";\n"
       "connectAttr \"target.s\" \"hold.tg[0].ts\";\nconnectAttr \"target.pm\" \"hold.tg[0].tpm\";\n"
       "connectAttr \"shot.pim\" \"hold.cpim\";\nconnectAttr \"hold.ct\" \"shot.t\";\n"
       "connectAttr \"hold.cr\" \"shot.r\";\n");
  EXPECT_THAT(World("shot").origin, VectorNear(Vector{10.0, 1.0, 3.0}, 1e-14));
  EXPECT_THAT(Point("shot", "rotate"), VectorNear(Vector{0.0, 30.0, 0.0}, 1e-12));
}

TEST_F(PlacesTest, AScaleConstraintMakesTheNodeAsLargeAsItsTarget) {
  Read(std::string(kTarget) +
       "createNode scaleConstraint -n \"hold\" -p \"shot\";\nconnectAttr \"target.s\" \"hold.tg[0].ts\";\n"
       "connectAttr \"target.pm\" \"hold.tg[0].tpm\";\nconnectAttr \"shot.pim\" \"hold.cpim\";\n"
       "connectAttr \"hold.cs\" \"shot.s\";\n");
  EXPECT_THAT(Point("shot", "scale"), VectorNear(Vector{0.5, 0.5, 0.5}, 1e-15));
}

}  // namespace
