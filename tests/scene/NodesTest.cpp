// Nodes: their names, places and parents.
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class NodesTest : public SceneTest {
 protected:
  std::vector<std::string> ChildrenOf(std::string_view name) const {
    std::vector<std::string> children;
    for (NodeId at = scene_.node(At(name)).firstChild; at != kNoNode; at = scene_.node(at).nextSibling) {
      children.push_back(scene_.PathOf(at));
    }
    return children;
  }
};

TEST_F(NodesTest, ANodeHasWhatItsCommandSays) {
  Read("// x\ncreateNode transform -n \"rig\";\n  createNode camera -s -n \"lens\" -p \"rig\";\n");
  ASSERT_EQ(scene_.nodes().size(), 2u);
  const Node& lens = scene_.node(1);
  EXPECT_EQ(lens.type, "camera");
  EXPECT_EQ(lens.name, "lens");
  EXPECT_EQ(lens.parent, 0u);
  EXPECT_TRUE(lens.shared);
  EXPECT_FALSE(scene_.node(0).shared);
  EXPECT_EQ(lens.origin, Origin::Created);
  EXPECT_EQ(TextAt(lens.place), "lens");
  EXPECT_EQ(PlaceOf(lens.place), "3:28");
  EXPECT_THAT(Paths(), ElementsAre("|rig", "|rig|lens"));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(NodesTest, LongOptionsAndWordsWithoutQuotesAreTheSame) {
  Read("createNode \"transform\" -name rig;createNode camera -parent rig -shared -name lens -skipSelect;");
  EXPECT_THAT(Paths(), ElementsAre("|rig", "|rig|lens"));
  EXPECT_TRUE(scene_.node(1).shared);
}

TEST_F(NodesTest, AParentIsNamedByItsPathToo) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"b\";"
      "createNode transform -n \"x\" -p \"a\";createNode transform -n \"x\" -p \"b\";"
      "createNode locator -n \"l\" -p \"|b|x\";createNode locator -n \"m\" -p \"a|x\";");
  EXPECT_THAT(Paths(), ElementsAre("|a", "|b", "|a|x", "|b|x", "|b|x|l", "|a|x|m"));
  EXPECT_EQ(At("|a|x"), 2u);
  EXPECT_EQ(At("b|x"), 3u);
  EXPECT_EQ(At("x|l"), 4u);
  EXPECT_EQ(scene_.Find("a|l"), kNoNode);
  EXPECT_EQ(scene_.Find("|x"), kNoNode);
  EXPECT_EQ(scene_.Find("|"), kNoNode);
  EXPECT_EQ(scene_.Find(""), kNoNode);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(NodesTest, ChildrenAreInTheOrderOfTheFile) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"b\" -p \"a\";createNode transform -n \"c\";"
      "createNode transform -n \"d\" -p \"a\";createNode transform -n \"e\" -p \"b\";");
  EXPECT_THAT(ChildrenOf("a"), ElementsAre("|a|b", "|a|d"));
  EXPECT_THAT(ChildrenOf("b"), ElementsAre("|a|b|e"));
  EXPECT_THAT(ChildrenOf("c"), IsEmpty());
}

TEST_F(NodesTest, AnAmbiguousNameMeansTheFirstNode) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"b\";"
      "createNode transform -n \"x\" -p \"b\";createNode transform -n \"x\" -p \"a\";"
      "\ncreateNode locator -n \"l\" -p \"x\";");
  EXPECT_EQ(scene_.PathOf(At("l")), "|b|x|l");
  EXPECT_THAT(Diagnostics(),
              ElementsAre("2:31: \"x\" is the name of several nodes; the first of them is meant [MA0203]"));
}

TEST_F(NodesTest, ANameThatIsTakenGetsANumber) {
  Read(
      "createNode transform -n \"cam\";createNode transform -n \"cam\";createNode transform -n \"cam\";"
      "createNode transform -n \"cam2\";createNode transform -n \"cam\" -p \"cam1\";");
  EXPECT_THAT(Paths(), ElementsAre("|cam", "|cam1", "|cam2", "|cam3", "|cam1|cam"));
  EXPECT_EQ(collector().CountOf(diag::Code::NameTaken), 3u);
  EXPECT_EQ(At("|cam"), 0u);
}

TEST_F(NodesTest, ASharedNodeThatIsThereIsTakenUpAgain) {
  Read(
      "createNode transform -s -n \"persp\";createNode transform -n \"x\";"
      "createNode transform -s -n \"persp\";setAttr \".tx\" 5;");
  EXPECT_THAT(Paths(), ElementsAre("|persp", "|x"));
  EXPECT_EQ(scene_.Number(0, "tx"), 5.0);
}

TEST_F(NodesTest, ANodeWithoutANameIsNamedAfterItsType) {
  Read("createNode camera;createNode camera;createNode transform -p \"camera1\";");
  EXPECT_THAT(Paths(), ElementsAre("|camera1", "|camera2", "|camera1|transform1"));
  EXPECT_EQ(TextAt(scene_.node(0).place), "camera");
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(NodesTest, NamespacesArePartOfNames) {
  Read(
      "createNode transform -n \"hero:head\";createNode camera -n \"hero:lens\" -p \"hero:head\";"
      "createNode locator -n \":l\" -p \":hero:head\";");
  EXPECT_THAT(Paths(), ElementsAre("|hero:head", "|hero:head|hero:lens", "|hero:head|l"));
  EXPECT_EQ(At("|:hero:head|:hero:lens"), 1u);
}

TEST_F(NodesTest, ANamespaceThatIsSetHoldsForNamesToCome) {
  Read(
      "namespace -add \"a\";namespace -set \"a\";createNode transform -n \"x\";"
      "createNode transform -n \":y\";createNode locator -n \"l\" -p \"x\";"
      "namespace -set \":\";createNode transform -n \"x\";createNode locator -n \"m\" -p \"x\";");
  EXPECT_THAT(Paths(), ElementsAre("|a:x", "|y", "|a:x|a:l", "|x", "|x|m"));
}

TEST_F(NodesTest, RenameRenames) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"b\";\trename -uid \"12-34\";"
      "rename \"a\" \"c\";rename \"d\";createNode locator -n \"l\" -p \"c\";\nrename \"nobody\" \"e\";\n "
      "rename;");
  EXPECT_THAT(Paths(), ElementsAre("|c", "|d", "|c|l"));
  EXPECT_EQ(scene_.Find("a"), kNoNode);
  EXPECT_EQ(scene_.Find("b"), kNoNode);
  EXPECT_THAT(
      Diagnostics(),
      ElementsAre("2:9: the command \"rename\" names \"nobody\", which the file does not create [MA0207]",
                  "3:2: the command \"rename\" lacks a name [MA0108]"));
}

TEST_F(NodesTest, ARenamedNodeGivesItsNameFree) {
  Read("createNode transform -n \"a\";rename \"a\" \"b\";createNode transform -n \"a\";rename \"b\" \"a\";");
  EXPECT_THAT(Paths(), ElementsAre("|a1", "|a"));
}

TEST_F(NodesTest, ANodeFromElsewhereIsNeitherRenamedNorMoved) {
  Read(
      "createNode transform -n \"a\";select -ne \"hero:b\";\nrename \"c\";\nparent \"a\";\nparent -w "
      "\"hero:b\";");
  EXPECT_EQ(scene_.Find("c"), kNoNode);
  EXPECT_EQ(scene_.PathOf(At("hero:b")), "hero:b");
  EXPECT_THAT(
      Diagnostics(),
      ElementsAre("2:9: the command \"rename\" names \"hero:b\", which the file does not create [MA0207]",
                  "3:9: the command \"parent\" names \"hero:b\", which the file does not create [MA0207]",
                  "4:12: the command \"parent\" names \"hero:b\", which the file does not create [MA0207]"));
}

TEST_F(NodesTest, ParentMovesNodes) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"b\";createNode transform -n \"c\" -p \"a\";"
      "createNode transform -n \"d\";parent -s -nc -r \"|a|c\" \"d\" \"b\";");
  EXPECT_THAT(Paths(), ElementsAre("|a", "|b", "|b|c", "|b|d"));
  EXPECT_EQ(scene_.Find("|a|c"), kNoNode);
  EXPECT_EQ(At("|b|c"), 2u);
  EXPECT_THAT(ChildrenOf("b"), ElementsAre("|b|c", "|b|d"));
}

TEST_F(NodesTest, ParentToTheWorldMovesNodesToTheTop) {
  Read(
      "createNode transform -n \"a\";createNode transform -n \"c\" -p \"a\";createNode transform -n \"d\" -p "
      "\"a\";"
      "parent -w \"|a|c\" \"d\";");
  EXPECT_THAT(Paths(), ElementsAre("|a", "|c", "|d"));
}

TEST_F(NodesTest, ParentWithoutANodeMovesTheCurrentOne) {
  Read("createNode transform -n \"a\";createNode transform -n \"b\";parent \"a\";");
  EXPECT_THAT(Paths(), ElementsAre("|a", "|a|b"));
}

TEST_F(NodesTest, AnInstanceIsFoundUnderBothParents) {
  Read(
      "createNode transform -n \"a\";createNode mesh -n \"s\" -p \"a\";createNode transform -n \"b\";"
      "parent -s -nc -r -add \"|a|s\" \"b\" ;");
  EXPECT_THAT(Paths(), ElementsAre("|a", "|a|s", "|b"));
  EXPECT_EQ(At("|b|s"), 1u);
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(NodesTest, AParentThatComesLaterIsFound) {
  Read(
      "createNode camera -n \"lens\" -p \"rig\";setAttr \"rig.tx\" 3;connectAttr \"c.o\" \"rig.ty\";"
      "createNode transform -n \"rig\";createNode animCurveTL -n \"c\";");
  EXPECT_THAT(Paths(), ElementsAre("|rig|lens", "|rig", "|c"));
  EXPECT_EQ(At("|rig|lens"), 1u);
  EXPECT_EQ(scene_.node(0).origin, Origin::Forward);
  EXPECT_EQ(scene_.Number(At("rig"), "translateX"), 3.0);
  EXPECT_EQ(SourceOf("rig", "translateY"), "c.output");
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(NodesTest, AParentThatIsNotThereIsReported) {
  Read("createNode camera -n \"lens\" -p \"|rig|cam\";");
  EXPECT_THAT(Diagnostics(),
              ElementsAre("1:23: the parent \"|rig|cam\" of \"lens\" is not in the file [MA0204]"));
  const Node& parent = scene_.node(scene_.node(At("lens")).parent);
  EXPECT_EQ(parent.origin, Origin::Elsewhere);
  EXPECT_EQ(scene_.PathOf(At("lens")), "|rig|cam|lens");
}

TEST_F(NodesTest, AParentInAReferencedFileIsReportedWithTheFile) {
  Read(
      "file -r -ns \"hero\" -dr 1 -rfn \"heroRN\" \"hero.ma\";\ncreateNode transform -n \"faceCam\" -p "
      "\"hero:head\";\n"
      "createNode fosterParent -n \"heroRNfosterParent1\";\ncreateNode camera -n \"c\" -p "
      "\"heroRNfosterParent1\";\n"
      "file -r -ns \"prop\" -rfn \"propRN\" \"prop.ma\";\ncreateNode reference -n \"propRN\";\n"
      "createNode fosterParent -n \"f\";\ncreateNode camera -n \"d\" -p \"f\";\nconnectAttr \"f.msg\" "
      "\"propRN.fp\";");
  EXPECT_THAT(
      Diagnostics(),
      ElementsAre(
          "1:41: referenced files are not read: 2, the first \"hero.ma\" [MA0211]",
          "2:26: \"faceCam\" stands under \"hero:head\", which belongs to the referenced file \"hero.ma\" "
          "[MA0205]",
          "4:23: \"c\" stands under \"heroRNfosterParent1\", which belongs to the referenced file "
          "\"hero.ma\" "
          "[MA0205]",
          "8:23: \"d\" stands under \"f\", which belongs to the referenced file \"prop.ma\" [MA0205]"));
  EXPECT_EQ(scene_.PathOf(At("faceCam")), "hero:head|faceCam");
}

TEST_F(NodesTest, ACircleOfParentsIsCut) {
  Read(
      "createNode transform -n \"a\" -p \"b\";createNode transform -n \"b\" -p \"a\";"
      "createNode transform -n \"s\" -p \"s\";createNode transform -n \"t\";parent \"t\" \"t\";");
  EXPECT_EQ(collector().CountOf(diag::Code::ParentCircle), 3u);
  // Every chain ends.
  for (const std::string& path : Paths()) EXPECT_LE(path.size(), 6u);
  EXPECT_EQ(scene_.node(At("s")).parent, kNoNode);
  EXPECT_EQ(scene_.node(At("t")).parent, kNoNode);
}

TEST_F(NodesTest, ANodeThatEverySceneHasIsThereOnceItIsNamed) {
  Read("select -ne :time1;setAttr \".o\" 7;select -ne :time1;setAttr \".unw\" 8;");
  ASSERT_EQ(scene_.nodes().size(), 1u);
  EXPECT_EQ(scene_.node(0).origin, Origin::Program);
  EXPECT_EQ(scene_.node(0).type, "time");
  EXPECT_EQ(scene_.node(0).name, "time1");
  EXPECT_EQ(At("time1"), 0u);
  EXPECT_EQ(scene_.Number(0, "outTime"), 7.0);
}

}  // namespace
}  // namespace scene
