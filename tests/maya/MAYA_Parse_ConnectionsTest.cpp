// "connectAttr": which curve drives which channel, and how constraints are tied.
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

// Curves c0, c1, both (2); transforms t0, aim (1), obj (2), both (3), shape (4); cameras cam0, shape (1);
// a locator loc.
constexpr const char* kNodes =
    "createNode animCurveTL -n \"c0\";\ncreateNode animCurveTA -n \"c1\";\ncreateNode animCurveTU -n "
    "\"both\";\n"
    "createNode transform -n \"t0\";\ncreateNode aimConstraint -n \"aim\";\ncreateNode transform -n "
    "\"obj\";\n"
    "createNode transform -n \"both\";\ncreateNode transform -n \"shape\";\n"
    "createNode camera -n \"cam0\";\ncreateNode camera -n \"shape\";\ncreateNode locator -n \"loc\";\n";

class ConnectionsTest : public ReaderTest {
 protected:
  struct Link {
    std::string node;
    int slot;
    std::int32_t index;
    bool operator==(const Link&) const = default;
    friend void PrintTo(const Link& link, std::ostream* out) {
      *out << link.node << "[" << link.slot << "] = " << link.index;
    }
  };

  static constexpr int kFocalSlot = 100;

  // Everything that the commands connected.
  std::vector<Link> LinksOf(const std::string& commands) {
    EXPECT_EQ(Read(kNodes + commands + "\n"), 0) << commands;
    std::vector<Link> links;
    for (std::int64_t index = 0; index < TransformCount(); ++index) {
      const MAYA_Transform transform = TransformAt(index);
      for (int slot = 0; slot < kCurveSlotCount; ++slot)
        if (transform.curve[slot] != -1) links.push_back({transform.name, slot, transform.curve[slot]});
    }
    for (std::int64_t index = 0; index < CameraCount(); ++index) {
      const MAYA_Camera camera = CameraAt(index);
      if (camera.focalLengthCurve != -1) links.push_back({camera.name, kFocalSlot, camera.focalLengthCurve});
    }
    return links;
  }

  static std::string Connect(const std::string& source, const std::string& destination) {
    return "connectAttr \"" + source + "\" \"" + destination + "\";";
  }

  using Links = std::vector<Link>;
};

TEST_F(ConnectionsTest, EveryChannelInBothFormsAndAnyCase) {
  struct Row {
    const char* shortName;
    const char* longName;
  };
  const Row channels[kChannelCount] = {{"tx", "translateX"}, {"ty", "translateY"}, {"tz", "translateZ"},
                                       {"rx", "rotateX"},    {"ry", "rotateY"},    {"rz", "rotateZ"},
                                       {"sx", "scaleX"},     {"sy", "scaleY"},     {"sz", "scaleZ"}};
  for (int slot = 0; slot < kChannelCount; ++slot) {
    for (const char* const name : {channels[slot].shortName, channels[slot].longName})
      for (const std::string& form : CaseChanges(name))
        EXPECT_EQ(LinksOf(Connect("c1.o", "t0." + form)), (Links{{"t0", slot, 1}})) << form;
  }
}

TEST_F(ConnectionsTest, TheCurvesOutputInBothFormsAndAnyCase) {
  for (const char* const name : {"o", "output"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_EQ(LinksOf(Connect("c1." + form, "t0.rz")), (Links{{"t0", 5, 1}})) << form;
}

TEST_F(ConnectionsTest, AnotherAttributeOfACurveRecordsNothing) {
  for (const char* const name : {"op", "outputs", "out", "o.x", "o[0]", "", "apply", "crx", "t"})
    EXPECT_THAT(LinksOf(Connect("c1." + std::string(name), "t0.rz")), IsEmpty()) << name;
}

TEST_F(ConnectionsTest, AChannelAsAWholeRecordsNothing) {
  for (const char* const name :
       {"t", "translate", "r", "s", "visibility", "tx.x", "tx[0]", "", "fl", "translatex2"})
    EXPECT_THAT(LinksOf(Connect("c0.o", "t0." + std::string(name))), IsEmpty()) << name;
}

TEST_F(ConnectionsTest, TheIndexOfTheCurveGoesIntoTheSlot) {
  ASSERT_EQ(
      Read("createNode animCurveTL -n \"k0\";\ncreateNode animCurveTL -n \"k1\";\ncreateNode animCurveTL -n "
           "\"k2\";\n"
           "createNode animCurveTL -n \"k3\";\ncreateNode animCurveTL -n \"camera1_translateX\";\n"
           "createNode transform -n \"camera1\";\nconnectAttr \"camera1_translateX.o\" \"camera1.tx\";\n"),
      0);
  EXPECT_EQ(TransformAt(0).curve[0], 4);
}

TEST_F(ConnectionsTest, AFocalLengthIsDrivenInBothFormsAndAnyCase) {
  for (const char* const name : {"fl", "focalLength"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_EQ(LinksOf(Connect("c1.output", "cam0." + form)), (Links{{"cam0", kFocalSlot, 1}})) << form;
  EXPECT_THAT(LinksOf(Connect("c1.output", "cam0.tx")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("c1.op", "cam0.fl")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("t0.o", "cam0.fl")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("nobody.o", "cam0.fl")), IsEmpty());
}

TEST_F(ConnectionsTest, NodeNamesAreFoundInAnyCase) {
  EXPECT_EQ(LinksOf(Connect("C1.o", "T0.tx")), (Links{{"t0", 0, 1}}));
  EXPECT_EQ(LinksOf(Connect("C0.o", "CAM0.fl")), (Links{{"cam0", kFocalSlot, 0}}));
}

TEST_F(ConnectionsTest, ATransformHidesACameraOfItsName) {
  EXPECT_THAT(LinksOf(Connect("c0.o", "shape.fl")), IsEmpty());
  EXPECT_EQ(LinksOf(Connect("c0.o", "shape.tx")), (Links{{"shape", 0, 0}}));
}

TEST_F(ConnectionsTest, ACurveHidesATransformOfItsName) {
  EXPECT_EQ(LinksOf(Connect("both.o", "t0.sy")), (Links{{"t0", 7, 2}}));
  EXPECT_THAT(LinksOf(Connect("both.crx", "t0.rx")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("both.t", "aim.ct")), IsEmpty());
}

TEST_F(ConnectionsTest, AConstraintTurnsTheDestination) {
  for (const char* const name :
       {"constraintRotate", "cr", "constraintRotateX", "crx", "constraintRotateY", "cry", "constraintRotateZ",
        "crz", "constraintVector", "cv", "constraintVectorX", "constraintVectorY", "constraintVectorZ"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_EQ(LinksOf(Connect("aim." + form, "obj.rx")), (Links{{"aim", kConstrainedSlot, 2}})) << form;
}

TEST_F(ConnectionsTest, TheAxesOfAConstraintVectorHaveNoShortForms) {
  for (const char* const name : {"cvx", "cvy", "cvz", "crw", "constraint", "rotate"})
    EXPECT_THAT(LinksOf(Connect("aim." + std::string(name), "obj.rx")), IsEmpty()) << name;
}

TEST_F(ConnectionsTest, AConstraintFollowsTheSourcesPosition) {
  for (const char* const name : {"constraintTranslate", "ct", "constraintTranslateX", "ctx",
                                 "constraintTranslateY", "cty", "constraintTranslateZ", "ctz"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_EQ(LinksOf(Connect("obj.t", "aim." + form)), (Links{{"aim", kFollowedSlot, 2}})) << form;
  EXPECT_THAT(LinksOf(Connect("obj.t", "aim.ctw")), IsEmpty());
}

TEST_F(ConnectionsTest, ATargetIsAnAttributeWithTargetInItAndKeepsItsCase) {
  for (const char* const name : {"target[0].targetTranslate", "target", "xtargety", "target[0].targetWeight"})
    EXPECT_EQ(LinksOf(Connect("obj.t", "aim." + std::string(name))), (Links{{"aim", kTargetSlot, 2}}))
        << name;
  for (const char* const name : {"tg[0].tt", "Target[0].Translate", "TARGET", "targe", "tar.get"})
    EXPECT_THAT(LinksOf(Connect("obj.t", "aim." + std::string(name))), IsEmpty()) << name;
}

TEST_F(ConnectionsTest, TheRulesForTransformsStandInOrder) {
  EXPECT_EQ(LinksOf(Connect("aim.cr", "obj.ct")), (Links{{"aim", kConstrainedSlot, 2}}));
  EXPECT_EQ(LinksOf(Connect("aim.cr", "obj.target")), (Links{{"aim", kConstrainedSlot, 2}}));
  EXPECT_THAT(LinksOf(Connect("c0.o", "aim.target[0].targetTranslate")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("c0.o", "aim.ct")), IsEmpty());
}

TEST_F(ConnectionsTest, AWeightConnectionThatComesLastMakesTheConstraintItsOwnTarget) {
  EXPECT_EQ(LinksOf(Connect("obj.t", "aim.target[0].targetTranslate") +
                    Connect("aim.cameraW0", "aim.target[0].targetWeight")),
            (Links{{"aim", kTargetSlot, 1}}));
  EXPECT_EQ(LinksOf(Connect("aim.w0", "aim.tg[0].tw") + Connect("obj.t", "aim.target[0].targetTranslate")),
            (Links{{"aim", kTargetSlot, 2}}));
}

TEST_F(ConnectionsTest, UnknownSourcesAndForeignDestinationsRecordNothing) {
  for (const char* const destination : {"t0.tx", "aim.ct", "aim.target", "cam0.fl"})
    EXPECT_THAT(LinksOf(Connect("nobody.o", destination)), IsEmpty()) << destination;
  for (const char* const destination : {"loc.tx", "c1.tx", "nobody.tx"}) {
    EXPECT_THAT(LinksOf(Connect("c0.o", destination)), IsEmpty()) << destination;
    EXPECT_THAT(LinksOf(Connect("obj.t", destination)), IsEmpty()) << destination;
  }
  EXPECT_THAT(LinksOf(Connect("cam0.o", "t0.tx")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("loc.t", "aim.ct")), IsEmpty());
}

TEST_F(ConnectionsTest, APlugWithoutADotOrWithoutTextIsIgnored) {
  EXPECT_THAT(LinksOf("connectAttr -f \"c0.o\";"), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("c0", "t0.tx")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("c0.o", "t0")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("", "t0.tx")), IsEmpty());
  EXPECT_THAT(LinksOf(Connect("c0.o", "")), IsEmpty());
  EXPECT_THAT(LinksOf("connectAttr;"), IsEmpty());
}

TEST_F(ConnectionsTest, APlugThatBeginsWithADotNamesTheFirstUnnamedNode) {
  const std::string unnamed = "createNode transform;\ncreateNode animCurveTL;\ncreateNode animCurveTL;\n";
  EXPECT_EQ(LinksOf(unnamed + Connect(".o", ".tx")), (Links{{"", 0, 3}}));
  EXPECT_THAT(LinksOf(Connect(".o", "t0.tx")), IsEmpty());
}

TEST_F(ConnectionsTest, APlugOf255BytesReadsAsEmpty) {
  const std::string longest(250, 'n');
  const std::string node = "createNode animCurveTL -n \"" + longest + "\";\n";
  EXPECT_EQ(LinksOf(node + Connect(longest + ".o", "t0.tx")), (Links{{"t0", 0, 3}}));
  EXPECT_THAT(LinksOf(node + Connect(longest + ".ou", "t0.tx")), IsEmpty());
  EXPECT_THAT(
      LinksOf("createNode animCurveTL -n \"" + longest + "x\";\n" + Connect(longest + "x.o", "t0.tx")),
      IsEmpty());
}

TEST_F(ConnectionsTest, OptionsAndOtherTokensArePassedOver) {
  EXPECT_EQ(LinksOf("connectAttr -f yes 5 : ( \"c0.o\" \"t0.tx\" -na -nextAvailable;"),
            (Links{{"t0", 0, 0}}));
}

TEST_F(ConnectionsTest, WhatStandsBetweenTheTwoPlugsCutsThemApart) {
  for (const char* const between : {"-f", "/*c*/", "5", ":", "createNode"})
    EXPECT_THAT(LinksOf("connectAttr \"c0.o\" " + std::string(between) + " \"t0.tx\";"), IsEmpty())
        << between;
}

TEST_F(ConnectionsTest, ALaterPairReplacesAnEarlierOne) {
  EXPECT_EQ(LinksOf("connectAttr \"c0.o\" \"t0.tx\" \"c1.o\" \"t0.ty\";"), (Links{{"t0", 1, 1}}));
}

TEST_F(ConnectionsTest, ASourceThatNoStringFollowsLeavesTheEarlierDestination) {
  EXPECT_EQ(LinksOf("connectAttr \"c0.o\" \"t0.tx\" \"c1.o\";"), (Links{{"t0", 0, 1}}));
  EXPECT_EQ(LinksOf("connectAttr \"c0.o\" \"t0.tx\" \"c1.o\" -f;"), (Links{{"t0", 0, 1}}));
  EXPECT_EQ(LinksOf("connectAttr \"c0.o\" \"t0.tx\" \"both.o\" 5 \"c1.o\";"), (Links{{"t0", 0, 1}}));
}

TEST_F(ConnectionsTest, ALaterConnectionReplacesAnEarlierOne) {
  EXPECT_EQ(LinksOf(Connect("c0.o", "t0.tx") + Connect("c1.o", "t0.translateX")), (Links{{"t0", 0, 1}}));
}

TEST_F(ConnectionsTest, ALaterSetAttrOnTheCurrentNodeClearsItsConnections) {
  const std::string text = "createNode transform -n \"late\";\n" + Connect("c0.o", "late.tx");
  EXPECT_EQ(LinksOf(text), (Links{{"late", 0, 0}}));
  EXPECT_THAT(Values(scene().current.transform.curve), Each(-1));
  EXPECT_THAT(LinksOf(text + "setAttr \".t\" 1 2 3;"), IsEmpty());
  EXPECT_EQ(LinksOf(text + "setAttr \".v\" 1;"), (Links{{"late", 0, 0}}));

  const std::string camera = "createNode camera -n \"late\";\n" + Connect("c1.o", "late.fl");
  EXPECT_EQ(LinksOf(camera), (Links{{"late", kFocalSlot, 1}}));
  EXPECT_THAT(LinksOf(camera + "setAttr \".fl\" 50;"), IsEmpty());
}

TEST_F(ConnectionsTest, TheFirstOfSeveralEqualNamesIsConnected) {
  const std::string text = "createNode transform -n \"T0\";\ncreateNode animCurveTL -n \"C0\";\n";
  EXPECT_EQ(LinksOf(text + Connect("C0.o", "T0.tx")), (Links{{"t0", 0, 0}}));
}

TEST_F(ConnectionsTest, AConnectionBeforeItsNodesRecordsNothing) {
  EXPECT_THAT(LinksOf(Connect("c0.o", "later.tx") + "createNode transform -n \"later\";"), IsEmpty());
}

TEST_F(ConnectionsTest, MakeConnectionCutsAtTheGivenDots) {
  ASSERT_EQ(Read(kNodes), 0);
  scene().MakeConnection("c1.o", 2, "t0.sz", 2);
  EXPECT_EQ(TransformAt(0).curve[8], 1);
  scene().MakeConnection("obj.t", 3, "aim.target[0].targetTranslate", 3);
  EXPECT_EQ(TransformAt(1).curve[kTargetSlot], 2);
}

TEST_F(ConnectionsTest, TheEndInsideTheCommandIsAnUnexpectedEndAndConnectsNothing) {
  for (const char* const text :
       {"connectAttr ", "connectAttr \"c0.o\" ", "connectAttr \"c0.o\" \"t0.tx\"", "connectAttr -f "}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(Read(kNodes + std::string(text)), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
    EXPECT_THAT(Values(TransformAt(0).curve), Each(-1));
  }
}

}  // namespace
}  // namespace testsupport
