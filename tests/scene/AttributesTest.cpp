// Values: how they are named, where they stand, what they are where nothing is written.
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class AttributesTest : public SceneTest {
 protected:
  std::vector<double> Translate() const {
    std::vector<double> values;
    for (const char* name : {"tx", "ty", "tz"}) values.push_back(scene_.Number(0, name).value_or(-99));
    return values;
  }
};

TEST_F(AttributesTest, EveryWayToNameAnAttributeMeansTheSame) {
  for (const char* command :
       {"setAttr \".tx\" 5;", "setAttr \".translateX\" 5;", "setAttr \".t.tx\" 5;",
        "setAttr \".translate.translateX\" 5;", "setAttr \"a.tx\" 5;", "setAttr \"|a.translateX\" 5;",
        "setAttr -k off -l on \".tx\" 5 ;", "setAttr \".tx\" -type \"double\" 5;",
        "setAttr -s 1 -av \".tx\" 5;", "setAttr .tx 5;", "setAttr \".t\" -type \"double3\" 5 0 0;",
        "setAttr \".translate\" 5 0 0 ;", "setAttr \".tx\"\n\t\t5\n\t\t;",
        "setAttr \".tx\" /* five */ 5 // so\n;", "setAttr \".\\tx\" 1;setAttr \".tx\" 5.0e0;"}) {
    Read(std::string("createNode transform -n \"a\";\n") + command);
    EXPECT_THAT(Translate(), ElementsAre(5, 0, 0)) << command;
    EXPECT_EQ(scene_.Number(0, "translateX"), 5.0) << command;
    EXPECT_THAT(Diagnostics(), IsEmpty()) << command;
  }
}

TEST_F(AttributesTest, ACompoundAndItsComponentsOverwriteOneAnotherInTheOrderOfTheFile) {
  Read("createNode transform -n \"a\";setAttr \".ty\" 1;setAttr \".t\" 2 3 4;setAttr \".tz\" 5;");
  EXPECT_THAT(Translate(), ElementsAre(2, 3, 5));
}

TEST_F(AttributesTest, AValueKnowsItsPlace) {
  Read("createNode transform -n \"a\";\n\tsetAttr \".t\" -type \"double3\" 7\n\t\t8 9 ;\n");
  const std::optional<Value> value = scene_.Written(0, "ty");
  ASSERT_TRUE(value);
  EXPECT_EQ(value->text(), "7\n\t\t8 9");
  EXPECT_EQ(PlaceOf(value->range()), "2:31");
  EXPECT_EQ(TextAt(value->range()), "7\n\t\t8 9");
  EXPECT_EQ(value->Number(), 8.0);
  EXPECT_FALSE(scene_.Written(0, "rx"));
}

TEST_F(AttributesTest, WhatIsNotWrittenHasTheDefaultOfItsType) {
  Read(
      "createNode transform -n \"t\";createNode camera -n \"c\";createNode animCurveTL -n \"k\";"
      "createNode joint -n \"j\";createNode lookAt -n \"l\";");
  EXPECT_EQ(scene_.Number(At("t"), "translateX"), 0.0);
  EXPECT_EQ(scene_.Number(At("t"), "sz"), 1.0);
  EXPECT_EQ(scene_.Number(At("t"), "inheritsTransform"), 1.0);
  EXPECT_EQ(scene_.Number(At("c"), "fl"), 35.0);
  EXPECT_EQ(scene_.Number(At("c"), "horizontalFilmAperture"), 1.41732);
  EXPECT_EQ(scene_.Number(At("c"), "ff"), 1.0);
  EXPECT_EQ(scene_.Number(At("k"), "wgt"), 1.0);
  EXPECT_EQ(scene_.Number(At("k"), "tan"), 4.0);
  EXPECT_EQ(scene_.Number(At("j"), "isy"), 1.0);
  EXPECT_EQ(scene_.Number(At("j"), "jointOrientX"), 0.0);
  EXPECT_EQ(scene_.Number(At("l"), "wut"), 3.0);
  EXPECT_EQ(scene_.Number(At("l"), "tw", 4), 1.0);
  EXPECT_EQ(scene_.Number(At("t"), "nonsense"), std::nullopt);
}

TEST_F(AttributesTest, AnAttributeWithoutAValueSetsNothing) {
  Read(
      "createNode camera -n \"c\";setAttr \".fl\" 50;setAttr -k off \".fl\";setAttr -s 4 \".fl\";"
      "setAttr \".fl\" -type \"double\";");
  EXPECT_EQ(scene_.Number(0, "fl"), 50.0);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(AttributesTest, FlagsAreWrittenInManyWords) {
  for (const char* word : {"yes", "on", "true", "1"}) {
    Read(std::string("createNode camera;setAttr \".o\" ") + word + ';');
    EXPECT_EQ(scene_.Number(0, "orthographic"), 1.0) << word;
    EXPECT_TRUE(scene_.Written(0, "orthographic")->IsOn()) << word;
  }
  for (const char* word : {"no", "off", "false", "0"}) {
    Read(std::string("createNode transform;setAttr \".it\" ") + word + ';');
    EXPECT_EQ(scene_.Number(0, "it"), 0.0) << word;
    EXPECT_FALSE(scene_.Written(0, "it")->IsOn()) << word;
  }
}

TEST_F(AttributesTest, ArraysAreReadInPieces) {
  Read(
      "createNode animCurveTL -n \"k\";setAttr -s 5 \".ktv[0:2]\"  1 10 2 20 3 30;setAttr \".ktv[3]\" 4 40;"
      "setAttr -s 5 \".kit[1:4]\" 9 9 1 1;setAttr \".keyTimeValue[4:4]\"  5 50;setAttr \".ktl[2:3]\" no "
      "yes;");
  const std::vector<Piece> keys = scene_.Pieces(0, "keyTimeValue");
  ASSERT_EQ(keys.size(), 3u);
  EXPECT_EQ(keys[0].first, 0);
  EXPECT_EQ(keys[0].last, 2);
  EXPECT_THAT(keys[0].value.Numbers(), ElementsAre(1, 10, 2, 20, 3, 30));
  EXPECT_EQ(keys[1].first, 3);
  EXPECT_EQ(keys[1].last, 3);
  EXPECT_THAT(keys[2].value.Numbers(), ElementsAre(5, 50));
  EXPECT_EQ(scene_.Number(0, "kit", 3), 1.0);
  EXPECT_EQ(scene_.Number(0, "kit", 0), std::nullopt);
  EXPECT_EQ(scene_.Number(0, "keyTanLocked", 2), 0.0);
  EXPECT_EQ(scene_.Number(0, "keyTanLocked", 3), 1.0);
  EXPECT_EQ(scene_.Number(0, "kv", 1), 20.0);
  EXPECT_EQ(scene_.Number(0, "keyTime", 4), 5.0);
}

TEST_F(AttributesTest, ElementsOfAnArrayOfCompoundsAreRecognised) {
  Read(
      "createNode parentConstraint -n \"p\";setAttr \".tg[0].tot\" -type \"double3\" 1 2 3 ;"
      "setAttr \".target[1].targetOffsetTranslate.targetOffsetTranslateY\" 6;setAttr \".tg[1].tw\" 0.25;");
  EXPECT_EQ(scene_.Number(0, "toty", 0), 2.0);
  EXPECT_EQ(scene_.Number(0, "toty", 1), 6.0);
  EXPECT_EQ(scene_.Number(0, "totx", 1), 0.0);
  EXPECT_EQ(scene_.Number(0, "targetWeight", 1), 0.25);
  EXPECT_EQ(scene_.Number(0, "targetWeight", 0), 1.0);
}

TEST_F(AttributesTest, TheLastCommandThatReachesAnElementCounts) {
  Read(
      "createNode parentConstraint -n \"p\";setAttr \".tg[3].totx\" 30;"
      "setAttr \".tg[2:4].tot\" 21 22 23 31 32 33 41 42 43;setAttr \".tg[2].totz\" 20;"
      "setAttr \".tg[4:9].totz\" 40;");
  EXPECT_EQ(scene_.Number(0, "totx", 3), 31.0);
  EXPECT_EQ(scene_.Number(0, "totz", 2), 20.0);
  EXPECT_EQ(scene_.Number(0, "totz", 3), 33.0);
  EXPECT_EQ(scene_.Number(0, "totz", 4), 40.0);
  EXPECT_EQ(scene_.Number(0, "totz", 5), std::nullopt);
  EXPECT_EQ(scene_.Number(0, "toty", 4), 42.0);
  EXPECT_EQ(scene_.Number(0, "totx", 5), 0.0);
}

TEST_F(AttributesTest, AddedAttributesHaveTheirNamesAndDefaults) {
  Read(
      "createNode transform -n \"a\";\naddAttr -ci true -k true -sn \"w0\" -ln \"targetW0\" -dv 0.5 -min 0 "
      "-at \"double\";\n"
      "addAttr -uac -ln \"only\" -at \"double\";addAttr -ln \"neg\" -dv -2 -at \"double\" \"a\";"
      "setAttr \".only\" 4;addAttr -at \"double\";");
  EXPECT_EQ(scene_.Number(0, "w0"), 0.5);
  EXPECT_EQ(scene_.Number(0, "targetW0"), 0.5);
  EXPECT_EQ(scene_.Number(0, "only"), 4.0);
  EXPECT_EQ(scene_.Number(0, "neg"), -2.0);
  EXPECT_EQ(scene_.PlugOf(0, "w0").attribute, "targetW0");
  ASSERT_EQ(scene_.addedAttributes().size(), 3u);
  EXPECT_EQ(scene_.addedAttributes()[0].node, 0u);
  EXPECT_EQ(scene_.addedAttributes()[0].shortName, "w0");
  EXPECT_EQ(TextAt(scene_.addedAttributes()[0].place), "targetW0");
  EXPECT_EQ(PlaceOf(scene_.addedAttributes()[0].place), "2:40");
  EXPECT_THAT(Diagnostics(), ElementsAre("3:98: the command \"addAttr\" lacks a name [MA0108]"));
}

TEST_F(AttributesTest, ComponentsOfAnAddedCompoundAreItsNumbers) {
  Read(
      "createNode network -n \"a\";addAttr -ln \"shake\" -sn \"shk\" -at \"double3\" -nc 3;"
      "addAttr -ln \"shakeX\" -sn \"shkx\" -at \"double\" -p \"shake\";"
      "addAttr -ln \"turn\" -sn \"shky\" -at \"doubleAngle\" -p \"shk\";"
      "addAttr -ln \"shakeZ\" -sn \"shkz\" -at \"double\" -p \"shake\" -dv 9;"
      "setAttr \".shk\" -type \"double3\" 1 2 3;setAttr \".shake.turn\" 20;setAttr \".other\" 5;");
  EXPECT_EQ(scene_.Number(0, "shkx"), 1.0);
  EXPECT_EQ(scene_.Number(0, "turn"), 20.0);
  EXPECT_EQ(scene_.Number(0, "shakeZ"), 3.0);
  EXPECT_EQ(scene_.Added(0, "shky")->type, "doubleAngle");
  EXPECT_EQ(scene_.Added(0, "shky")->component, 1);
  EXPECT_EQ(scene_.Added(0, "shake")->components.size(), 3u);
  EXPECT_FALSE(scene_.Written(0, "other").has_value());
}

TEST_F(AttributesTest, AWrittenValueOfAnAddedAttributeIsFoundByEitherName) {
  Read(
      "createNode transform -n \"a\";addAttr -sn \"foc\" -ln \"focal\" -dv 1 -at \"double\";"
      "setAttr -k on \".foc\" 70;");
  EXPECT_EQ(scene_.Number(0, "focal"), 70.0);
  EXPECT_EQ(scene_.Number(0, "foc"), 70.0);
}

TEST_F(AttributesTest, ASetAttrWithANodeLeavesTheCurrentNodeCurrent) {
  Read("createNode transform -n \"a\";createNode transform -n \"b\";setAttr \"a.tx\" 1;setAttr \".tx\" 2;");
  EXPECT_EQ(scene_.Number(At("a"), "tx"), 1.0);
  EXPECT_EQ(scene_.Number(At("b"), "tx"), 2.0);
}

TEST_F(AttributesTest, ANodeThatIsSelectedIsCurrent) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"b\";select -ne \"a\";setAttr \".tx\" 1;"
      "select -r \"a\" \"b\";setAttr \".ty\" 2;select -cl;\nsetAttr \".tz\" 3;");
  EXPECT_EQ(scene_.Number(At("a"), "tx"), 1.0);
  EXPECT_EQ(scene_.Number(At("b"), "ty"), 2.0);
  EXPECT_THAT(Diagnostics(), ElementsAre("2:10: no node is current, so \".tz\" belongs to none [MA0201]"));
}

TEST_F(AttributesTest, WithoutANodeAnAttributeIsReported) {
  Read("setAttr \".fl\" 35;\naddAttr -ln \"x\";setAttr 5;setAttr;");
  EXPECT_THAT(Diagnostics(), ElementsAre("1:10: no node is current, so \".fl\" belongs to none [MA0201]",
                                         "2:14: no node is current, so \"x\" belongs to none [MA0201]",
                                         "2:17: the command \"setAttr\" lacks an attribute [MA0108]",
                                         "2:27: the command \"setAttr\" lacks an attribute [MA0108]"));
}

TEST_F(AttributesTest, OfTypesThatAreNotKnownTheTransformIsKept) {
  Read(
      "createNode someRig -n \"a\";setAttr \".t\" 1 2 3;setAttr \".speed\" 4;"
      "createNode mesh -n \"m\";setAttr \".vt[0:1]\" 1 2 3 4 5 6;");
  EXPECT_EQ(scene_.Number(At("a"), "tz"), 3.0);
  EXPECT_EQ(scene_.Number(At("a"), "speed"), std::nullopt);
  EXPECT_THAT(scene_.Pieces(At("m"), "vt"), IsEmpty());
}

TEST_F(AttributesTest, ANumberThatIsTooLargeIsNone) {
  Read("createNode camera;setAttr \".fl\" 1e999;setAttr \".coi\" 1.#QNAN;");
  EXPECT_EQ(scene_.Number(0, "fl"), std::nullopt);
  EXPECT_EQ(scene_.Number(0, "coi"), std::nullopt);
  EXPECT_EQ(scene_.Written(0, "fl")->text(), "1e999");
}

TEST_F(AttributesTest, AMatrixHasSixteenNumbers) {
  Read("createNode transform;setAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 4 5 6 1 ;");
  EXPECT_THAT(scene_.Written(0, "offsetParentMatrix")->Numbers(),
              ElementsAre(1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, 4, 5, 6, 1));
}

TEST_F(AttributesTest, AStringHasItsEscapesReadAndItsPiecesJoined) {
  Read(
      "createNode script -n \"s\";setAttr \".b\" -type \"string\" \"a \\\"b\\\" \\\\ ; \\n\\tc\";"
      "setAttr \".a\" -type \"string\" (\n\t\t\"one \"\n\t\t+ \"two\"\n\t\t+ \"\");");
  EXPECT_EQ(scene_.Written(0, "before")->String(), "a \"b\" \\ ; \n\tc");
  EXPECT_EQ(scene_.Written(0, "after")->String(), "one two");
  EXPECT_EQ(scene_.Written(0, "after")->Number(), std::nullopt);
}

TEST_F(AttributesTest, AliasListsAndReferenceEditsAreRead) {
  Read(
      "createNode transform -n \"a\";setAttr \".aal\" -type \"attributeAlias\" {\"speed\",\"weight[0]\"} ;"
      "createNode reference -n \"r\";setAttr \".ed\" -type \"dataReferenceEdits\" \n\t\t\"r\"\n\t\t\"r\" 2\n"
      "\t\t1 |hero:a|hero:b \n\t\t\"x\" \"x\" \" -ci 1\"\n\t\t5 4 \"r\" \"|hero:a.t\" \"r.phl[1]\" \"\";\n"
      "setAttr \".phl[1]\" 7;");
  EXPECT_THAT(Diagnostics(), IsEmpty());
  EXPECT_EQ(scene_.Number(At("r"), "phl", 1), 7.0);
  EXPECT_EQ(scene_.Written(At("r"), "edits")->String(), "r");
}

}  // namespace
}  // namespace scene
