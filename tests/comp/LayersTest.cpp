#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

std::string Scene(const std::string& nodes) { return SceneHead() + RenderSize(640, 480) + nodes; }

// "name<parent" of each layer, in order.
std::vector<std::string> Tree(const ImportRun& run) {
  std::vector<std::string> tree;
  for (const refhost::Layer& layer : run.host->project().layers()) {
    tree.push_back(layer.name + "<" + (layer.parent != nullptr ? layer.parent->name : ""));
  }
  return tree;
}

TEST(LayersTest, ACameraLayerIsMadeAtTheCentreThatTheHostLikes) {
  const ImportRun run = ImportText(Scene(TransformText("rig") + CameraText("lens", "rig")));
  EXPECT_EQ(run.result.code, 0);
  const std::vector<std::string> calls = CallsOf(run.trace, "NewCameraLayer");
  ASSERT_EQ(calls.size(), 1u);
  EXPECT_EQ(Field(calls[0], "name"), "\"lens\"");
  EXPECT_EQ(Field(calls[0], "center"), "[-2147483648,-2147483648]");
  EXPECT_EQ(run.host->project().layers()[0].kind, refhost::LayerKind::Camera);
}

TEST(LayersTest, EachTransformAboveTheCamerasBecomesANullAndTheParentOfTheLayerBefore) {
  const ImportRun run = ImportText(Scene(TransformText("world") + TransformText("crane", "world") +
                                         TransformText("arm", "crane") + TransformText("rig", "arm") +
                                         CameraText("lens", "rig")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<arm", "arm<crane", "crane<world", "world<"));
}

TEST(LayersTest, ANullIsMadeWithAZeroTimeAndIsThreeDimensional) {
  const ImportRun run =
      ImportText(Scene(TransformText("arm") + TransformText("rig", "arm") + CameraText("lens", "rig")));
  const std::vector<std::string> nulls = CallsOf(run.trace, "NewNullLayer");
  ASSERT_EQ(nulls.size(), 1u);
  EXPECT_EQ(Field(nulls[0], "time"), "[0,0]");
  const std::vector<std::string> flags = CallsOf(run.trace, "SetLayerFlag");
  ASSERT_EQ(flags.size(), 2u);
  EXPECT_EQ(Field(flags[1], "flag"), "2048");
  EXPECT_EQ(Field(flags[1], "value"), "1");
  EXPECT_TRUE(FindLayer(*run.host, "arm")->threeDimensional);
}

TEST(LayersTest, ANullIsFlaggedThenMadeTheParentThenPlacedThenAnimated) {
  const ImportRun run =
      ImportText(Scene(TransformText("arm") + TransformText("rig", "arm") + CameraText("lens", "rig") +
                       Animation("arm.tx", KeysFrom(1, {1, 2}))));
  std::vector<std::string> calls;
  bool inNull = false;
  for (const std::string& line : run.trace) {
    const std::string_view call = Field(line, "call");
    inNull = inNull || call == "\"NewNullLayer\"";
    if (inNull && (calls.empty() || calls.back() != call)) calls.emplace_back(call);
  }
  ASSERT_GE(calls.size(), 4u);
  EXPECT_EQ(calls[1], "\"SetLayerFlag\"");
  EXPECT_EQ(calls[2], "\"SetLayerParent\"");
  EXPECT_EQ(calls[3], "\"AcquireLayerStream\"");
  EXPECT_EQ(FindLayer(*run.host, "arm")->findStream(kPosition)->keyCount(), 2u);
}

TEST(LayersTest, ParentNamesAreFoundWithoutRegardToCase) {
  const ImportRun run = ImportText(Scene(TransformText("Arm") + Triple(".t", 4, 0, 0) +
                                         TransformText("RIG", "aRM") + CameraText("lens", "rig")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<aRM", "aRM<"));
  EXPECT_NEAR(FindLayer(*run.host, "aRM")->findStream(kPosition)->value[0], 4.0, 1e-12);
}

TEST(LayersTest, ANullAboveACameraTakesItsNameFromTheChildsParentField) {
  const ImportRun run =
      ImportText(Scene(TransformText("ARM") + TransformText("rig", "arm") + CameraText("lens", "rig")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<arm", "arm<"));
}

TEST(LayersTest, AParentNameThatNamesNoTransformEndsTheChainAfterOneNull) {
  const ImportRun run = ImportText(Scene(TransformText("rig", "ghost") + CameraText("lens", "rig")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<ghost", "ghost<"));
  for (const std::string& line : CallsOf(run.trace, "AcquireLayerStream")) {
    EXPECT_EQ(Field(line, "layer"), "\"layer:1\"");  // the null keeps its defaults
  }
}

TEST(LayersTest, ACameraWithoutATransformHasNoNulls) {
  const ImportRun run = ImportText(Scene(TransformText("arm") + CameraText("lens", "ghost")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<"));
}

TEST(LayersTest, AChainThatComesBackToATransformEndsThere) {
  const ImportRun run = ImportText(Scene(TransformText("a", "b") + TransformText("b", "c") +
                                         TransformText("c", "a") + CameraText("lens", "a")));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_THAT(Tree(run), ElementsAre("lens<b", "b<c", "c<"));
}

TEST(LayersTest, ATransformThatIsItsOwnParentGetsNoNull) {
  const ImportRun run = ImportText(Scene(TransformText("a", "A") + CameraText("lens", "a")));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_THAT(Tree(run), ElementsAre("lens<"));
}

TEST(LayersTest, ALoopThatDoesNotReturnToTheStartEndsWhereItCloses) {
  const ImportRun run = ImportText(Scene(TransformText("rig", "x") + TransformText("x", "y") +
                                         TransformText("y", "x") + CameraText("lens", "rig")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<x", "x<y", "y<"));
}

TEST(LayersTest, ALocatorWhoseChainIsALoopImports) {
  const ImportRun run = ImportText(Scene(CameraText("lens", "ghost") + TransformText("p", "q") +
                                         TransformText("q", "p") + LocatorText("a_null", "p")));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_THAT(Tree(run), ElementsAre("lens<", "a_null<q", "q<"));
}

TEST(LayersTest, AParentAndAChildOfOneNameImport) {
  // The look-up finds the first of the name: the chain would come back to it.
  const ImportRun run = ImportText(Scene(TransformText("same") + TransformText("same", "same") +
                                         CameraText("lens", "same") + TransformText("top", "same")));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_THAT(Tree(run), ElementsAre("lens<"));
}

TEST(LayersTest, OnlyLocatorsMarkedAsNullsGetALayer) {
  const ImportRun run =
      ImportText(Scene(CameraText("lens", "") + LocatorText("locator1", "") + LocatorText("myNull1", "") +
                       LocatorText("null_a", "") + LocatorText("NULLS", "") + LocatorText("nULL", "") +
                       LocatorText("NuLL", "")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<", "myNull1<", "null_a<", "NULLS<"));
}

TEST(LayersTest, ALocatorTakesItsTransformsPlaceAndKeysAndParents) {
  const ImportRun run = ImportText(Scene(
      CameraText("lens", "") + TransformText("set") + Triple(".t", 9, 0, 0) + TransformText("mark", "set") +
      Triple(".t", 1, 2, 3) + LocatorText("null1", "MARK") + Animation("mark.ty", KeysFrom(4, {5, 6, 7}))));
  EXPECT_THAT(Tree(run), ElementsAre("lens<", "null1<set", "set<"));
  const refhost::Layer& null = *FindLayer(*run.host, "null1");
  EXPECT_TRUE(null.threeDimensional);
  EXPECT_NEAR(null.findStream(kPosition)->value[2], -3.0, 1e-12);
  EXPECT_EQ(null.findStream(kPosition)->keyCount(), 3u);
  EXPECT_NEAR(FindLayer(*run.host, "set")->findStream(kPosition)->value[0], 9.0, 1e-12);
}

TEST(LayersTest, ALocatorIsPlacedAndAnimatedBeforeItsParentsAreMade) {
  const ImportRun run = ImportText(Scene(CameraText("lens", "") + TransformText("set") +
                                         TransformText("mark", "set") + LocatorText("null1", "mark")));
  std::size_t lastOfLocator = 0;
  std::size_t firstOfSet = 0;
  for (std::size_t i = 0; i < run.trace.size(); ++i) {
    if (Field(run.trace[i], "call") == "\"AcquireLayerStream\"" &&
        Field(run.trace[i], "layer") == "\"layer:2\"")
      lastOfLocator = i;
    if (Field(run.trace[i], "name") == "\"set\"") firstOfSet = i;
  }
  EXPECT_GT(lastOfLocator, 0u);
  EXPECT_LT(lastOfLocator, firstOfSet);
}

TEST(LayersTest, ALocatorWithoutATransformIsANullAtTheOrigin) {
  const ImportRun run = ImportText(Scene(CameraText("lens", "") + LocatorText("null1", "ghost")));
  EXPECT_THAT(Tree(run), ElementsAre("lens<", "null1<"));
}

TEST(LayersTest, AllCamerasWithTheirNullsComeBeforeAllLocators) {
  const ImportRun run =
      ImportText(Scene(TransformText("arm") + LocatorText("nullA", "arm") + TransformText("r1", "arm") +
                       CameraText("c1", "r1") + LocatorText("nullB", "r1") + TransformText("r2", "arm") +
                       CameraText("c2", "r2")));
  EXPECT_THAT(Tree(run), ElementsAre("c1<arm", "arm<", "c2<arm", "arm<", "nullA<", "nullB<arm", "arm<"));
}

TEST(LayersTest, NamesPassAsTheBytesTheyAre) {
  const ImportRun run = ImportText(Scene(CameraText("caf\xe9", "")));
  EXPECT_EQ(run.host->project().layers()[0].name, "caf\xe9");
}

TEST(LayersTest, AnEmptyNameIsALayerToo) {
  const ImportRun run = ImportText(Scene("createNode camera;\n"));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_THAT(Tree(run), ElementsAre("<"));
}

}  // namespace
}  // namespace testsupport
