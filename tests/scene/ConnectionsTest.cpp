// Connections, both ways.
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// Two transforms, a camera, two curves.
constexpr char kNodes[] =
    "createNode transform -n \"a\";createNode transform -n \"b\";createNode camera -n \"c\" -p \"a\";"
    "createNode animCurveTL -n \"k\";createNode animCurveTU -n \"l\";\n";

class ConnectionsTest : public SceneTest {
 protected:
  void ReadAfterNodes(std::string_view commands) { Read(kNodes + std::string(commands)); }
};

TEST_F(ConnectionsTest, AConnectionIsSeenFromBothEnds) {
  ReadAfterNodes("connectAttr \"k.o\" \"a.tx\";connectAttr \"l.output\" \"|a|c.focalLength\" -l on;");
  EXPECT_EQ(SourceOf("a", "translateX"), "k.output");
  EXPECT_EQ(SourceOf("a", "t.tx"), "k.output");
  EXPECT_EQ(SourceOf("c", "fl"), "l.output");
  EXPECT_EQ(SourceOf("a", "ty"), "");
  EXPECT_THAT(DestinationsOf("k", "o"), ElementsAre("a.translateX"));
  EXPECT_THAT(DestinationsOf("l", "output"), ElementsAre("c.focalLength"));
  EXPECT_THAT(DestinationsOf("a", "tx"), IsEmpty());
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ConnectionsTest, AConnectionKnowsItsPlaces) {
  ReadAfterNodes("connectAttr \"k.o\"\n\t\"a.tx\";");
  const std::optional<Driver> driver = scene_.SourceOf(scene_.PlugOf(At("a"), "tx"));
  ASSERT_TRUE(driver);
  EXPECT_EQ(TextAt(driver->connection->sourcePlace), "k.o");
  EXPECT_EQ(PlaceOf(driver->connection->sourcePlace), "2:14");
  EXPECT_EQ(TextAt(driver->connection->destinationPlace), "a.tx");
  EXPECT_EQ(PlaceOf(driver->connection->destinationPlace), "3:3");
}

TEST_F(ConnectionsTest, ACompoundDrivesItsComponents) {
  ReadAfterNodes("connectAttr \"a.t\" \"b.t\";connectAttr \"a.rotate\" \"b.scale\";");
  EXPECT_EQ(SourceOf("b", "tx"), "a.translateX");
  EXPECT_EQ(SourceOf("b", "translateZ"), "a.translateZ");
  EXPECT_EQ(SourceOf("b", "t"), "a.translate");
  EXPECT_EQ(SourceOf("b", "sy"), "a.rotateY");
  EXPECT_THAT(DestinationsOf("a", "ty"), ElementsAre("b.translateY"));
  EXPECT_THAT(DestinationsOf("a", "t"), ElementsAre("b.translate"));
}

TEST_F(ConnectionsTest, ACompoundWhoseComponentsAreNotKnownSaysWhichOneItIs) {
  ReadAfterNodes("createNode plusMinusAverage -n \"p\";connectAttr \"p.o3\" \"a.t\";");
  EXPECT_EQ(SourceOf("a", "ty"), "p.o3/1");
  EXPECT_EQ(SourceOf("a", "t"), "p.o3");
}

TEST_F(ConnectionsTest, AComponentsOwnConnectionComesFirst) {
  ReadAfterNodes("connectAttr \"b.t\" \"a.t\";connectAttr \"k.o\" \"a.ty\";");
  EXPECT_EQ(SourceOf("a", "tx"), "b.translateX");
  EXPECT_EQ(SourceOf("a", "ty"), "k.output");
}

TEST_F(ConnectionsTest, ElementsOfArraysAreApart) {
  ReadAfterNodes(
      "createNode blendWeighted -n \"w\";connectAttr \"k.o\" \"w.i[0]\";connectAttr \"l.o\" \"w.input[1]\";"
      "createNode lookAt -n \"x\";connectAttr \"a.t\" \"x.tg[0].tt\";"
      "connectAttr \"b.tx\" \"x.target[1].targetTranslate.targetTranslateX\";");
  EXPECT_EQ(SourceOf("w", "i[0]"), "k.output");
  EXPECT_EQ(SourceOf("w", "i[1]"), "l.output");
  EXPECT_EQ(SourceOf("w", "i[2]"), "");
  EXPECT_EQ(SourceOf("w", "i"), "");
  EXPECT_EQ(SourceOf("x", "tg[0].ttz"), "a.translateZ");
  EXPECT_EQ(SourceOf("x", "tg[1].ttx"), "b.translateX");
  EXPECT_EQ(SourceOf("x", "tg[1].tty"), "");
  EXPECT_THAT(DestinationsOf("k", "o"), ElementsAre("w.input[0]"));
}

TEST_F(ConnectionsTest, TheFirstOfTwoDriversStays) {
  ReadAfterNodes(
      "connectAttr \"k.o\" \"a.tx\";\nconnectAttr \"l.o\" \"a.translateX\";connectAttr \"k.o\" \"a.tx\";");
  EXPECT_EQ(SourceOf("a", "tx"), "k.output");
  EXPECT_THAT(DestinationsOf("l", "o"), IsEmpty());
  EXPECT_THAT(Diagnostics(), ElementsAre("3:20: \"a.translateX\" is already driven by \"k.o\" [MA0208]"));
}

TEST_F(ConnectionsTest, WithForceTheSecondOneTakesItsPlace) {
  ReadAfterNodes("connectAttr \"k.o\" \"a.tx\";connectAttr -f \"l.o\" \"a.tx\";");
  EXPECT_EQ(SourceOf("a", "tx"), "l.output");
  EXPECT_THAT(DestinationsOf("k", "o"), IsEmpty());
  EXPECT_THAT(DestinationsOf("l", "o"), ElementsAre("a.translateX"));
  EXPECT_EQ(scene_.ConnectionsInto(At("a")).size(), 1u);
}

TEST_F(ConnectionsTest, NextAvailableAppends) {
  ReadAfterNodes(
      "connectAttr \"k.o\" \":set.dsm\" -na;connectAttr \"l.o\" \":set.dsm[6]\";"
      "connectAttr \"l.o\" \":set.dsm\" -nextAvailable;");
  EXPECT_EQ(scene_.ConnectionsInto(At("set")).size(), 3u);
  EXPECT_THAT(DestinationsOf("k", "o"), ElementsAre("set.dsm[0]"));
  EXPECT_THAT(DestinationsOf("l", "o"), ElementsAre("set.dsm[6]", "set.dsm[7]"));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ConnectionsTest, DisconnectFromTheNextAvailableFindsTheElement) {
  ReadAfterNodes(
      "connectAttr \"k.o\" \":set.dsm\" -na;connectAttr \"l.o\" \":set.dsm\" -na;"
      "disconnectAttr \"k.o\" \":set.dsm\" -na;disconnectAttr \"a.tx\" \":set.dsm\" -na;");
  EXPECT_THAT(DestinationsOf("k", "o"), IsEmpty());
  EXPECT_THAT(DestinationsOf("l", "o"), ElementsAre("set.dsm[1]"));
  EXPECT_EQ(SourceOf("set", "dsm[0]"), "");
}

TEST_F(ConnectionsTest, ComponentsOfAddedCompoundsAreDrivenAndDrive) {
  ReadAfterNodes(
      "createNode transform -n \"ctrl\";addAttr -ln \"shake\" -sn \"shk\" -at \"double3\" -nc 3;"
      "addAttr -ln \"shakeX\" -sn \"shkx\" -at \"double\" -p \"shake\";"
      "addAttr -ln \"shakeY\" -sn \"shky\" -at \"double\" -p \"shk\";"
      "addAttr -ln \"shakeZ\" -sn \"shkz\" -at \"double\" -p \"shake\";"
      "connectAttr \"ctrl.shk\" \"a.t\";connectAttr \"b.t\" \"ctrl.shake\";");
  EXPECT_EQ(SourceOf("a", "ty"), "ctrl.shakeY");
  EXPECT_EQ(SourceOf("ctrl", "shkz"), "b.translateZ");
  EXPECT_THAT(DestinationsOf("ctrl", "shakeX"), ElementsAre("a.translateX"));
  EXPECT_THAT(DestinationsOf("b", "tz"), ElementsAre("ctrl.shakeZ"));
}

TEST_F(ConnectionsTest, DisconnectTakesAConnectionOut) {
  ReadAfterNodes(
      "connectAttr \"k.o\" \"a.tx\";connectAttr \"l.o\" \"a.ty\";disconnectAttr \"k.output\" "
      "\"|a.translateX\";"
      "disconnectAttr \"k.o\" \"a.ty\";disconnectAttr \"k.o\" \"a.tz\";");
  EXPECT_EQ(SourceOf("a", "tx"), "");
  EXPECT_EQ(SourceOf("a", "ty"), "l.output");
  EXPECT_THAT(DestinationsOf("k", "o"), IsEmpty());
  EXPECT_EQ(scene_.ConnectionsInto(At("a")).size(), 1u);
}

TEST_F(ConnectionsTest, AChannelThatWasDisconnectedCanBeDrivenAgain) {
  ReadAfterNodes(
      "connectAttr \"k.o\" \"a.tx\";disconnectAttr \"k.o\" \"a.tx\";connectAttr \"l.o\" \"a.tx\";");
  EXPECT_EQ(SourceOf("a", "tx"), "l.output");
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ConnectionsTest, ANodeThatIsNotInTheFileIsNamedNevertheless) {
  ReadAfterNodes("connectAttr \"hero:ctrl.tx\" \"a.tx\";connectAttr \"a.tz\" \":time1.o\";");
  const std::optional<Driver> driver = scene_.SourceOf(scene_.PlugOf(At("a"), "tx"));
  ASSERT_TRUE(driver);
  EXPECT_EQ(Show(driver->plug), "hero:ctrl.translateX");
  EXPECT_EQ(scene_.node(driver->plug.node).origin, Origin::Elsewhere);
  EXPECT_EQ(At("hero:ctrl"), driver->plug.node);
  EXPECT_EQ(SourceOf("time1", "outTime"), "a.translateZ");
}

TEST_F(ConnectionsTest, NodesOfOneNameAreDistinguishedByTheirPaths) {
  Read(
      "createNode transform -n \"l\";createNode transform -n \"r\";createNode transform -n \"x\" -p \"l\";"
      "createNode transform -n \"x\" -p \"r\";createNode animCurveTL -n \"k\";connectAttr \"k.o\" "
      "\"|r|x.tx\";");
  EXPECT_EQ(SourceOf("|r|x", "tx"), "k.output");
  EXPECT_EQ(SourceOf("|l|x", "tx"), "");
}

TEST_F(ConnectionsTest, PathsWithSeveralIndicesStayAsTheyAreWritten) {
  ReadAfterNodes(
      "createNode blendShape -n \"s\";connectAttr \"k.o\" \"s.it[0].itg[1].iti[6000].igt\";"
      "connectAttr \"l.o\" \"s.it[0].itg[2].iti[6000].igt\";");
  EXPECT_THAT(DestinationsOf("k", "o"), ElementsAre("s.it[0].itg[1].iti[6000].igt"));
  EXPECT_THAT(DestinationsOf("l", "o"), ElementsAre("s.it[0].itg[2].iti[6000].igt"));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ConnectionsTest, AConnectionWithOneEndIsReported) {
  ReadAfterNodes("connectAttr \"k.o\";\ndisconnectAttr;");
  EXPECT_THAT(Diagnostics(),
              ElementsAre("2:1: the command \"connectAttr\" lacks a second attribute [MA0108]",
                          "3:1: the command \"disconnectAttr\" lacks two attributes [MA0108]"));
}

}  // namespace
}  // namespace scene
