// What does not come over, and why.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;
using testing::HasSubstr;

TEST(LossTest, CamerasThatAreLeftOut) {
  const Checked checked(
      CameraScene("") +
      "createNode transform -s -n \"persp\";\ncreateNode camera -s -n \"perspShape\" -p \"persp\";\n"
      "createNode transform -s -n \"top\";\ncreateNode camera -s -n \"topShape\" -p \"top\";\n"
      "\tsetAttr \".o\" yes;\n"
      "createNode transform -n \"plan\";\ncreateNode camera -n \"planShape\" -p \"plan\";\n"
      "\tsetAttr \".o\" yes;\n"
      "createNode transform -n \"other\";\ncreateNode camera -n \"PerspShape\" -p \"other\";\n");
  EXPECT_THAT(checked.SentenceOf(Code::StartupCameras), HasSubstr("left out: 2"));
  EXPECT_EQ(checked.MarkedBy(Code::OrthographicCamera), "planShape");
  EXPECT_EQ(checked.MarkedBy(Code::CameraNotImported), "PerspShape");
}

TEST(LossTest, LocatorsWithoutAMarkAreCounted) {
  const Checked checked(CameraScene("") +
                        "createNode transform -n \"a\";\ncreateNode locator -n \"aShape\" -p \"a\";\n"
                        "createNode locator -n \"nullShape\" -p \"a\";\n"
                        "createNode locator -n \"bShape\" -p \"a\";\n");
  EXPECT_THAT(checked.SentenceOf(Code::LocatorsLeftOut), HasSubstr("are left out: 2"));
}

TEST(LossTest, AParentThatIsGivenAsAPath) {
  const Checked checked(kHead +
                        "createNode transform -n \"rig\";\ncreateNode transform -n \"shotCam\" -p \"rig\";\n"
                        "createNode camera -n \"shotCamShape\" -p \"|rig|shotCam\";\n" +
                        kResolution);
  EXPECT_EQ(checked.MarkedBy(Code::ParentIsPath), "|rig|shotCam");
}

TEST(LossTest, AParentThatIsAPathIsFoundWhateverStandsBetween) {
  for (const char* const option :
       {"-n \"lens\" -p  \"|rig\"", "-n \"lens\" -p\t\"|rig\"", "-n \"lens\"\n -p\n\"|rig\"",
        "-n \"lens\" -p /* \"rig\"; */ \"|rig\"", "-n \"lens\" -parent \"|rig\"", "-p \"|rig\" -n \"lens\"",
        "-p \"|rig\" -ss -n \"lens\""}) {
    const Checked checked(kHead + "createNode transform -n \"rig\";\ncreateNode camera " + option + ";\n" +
                          kResolution);
    EXPECT_EQ(checked.MarkedBy(Code::ParentIsPath), "|rig") << option;
  }
  const Checked named(
      kHead + "createNode transform -n \"rig\";\ncreateNode camera -p \"|rig\" -n \"createNode x\";\n");
  EXPECT_EQ(named.MarkedBy(Code::ParentIsPath), "|rig");
}

TEST(LossTest, AParentInAReferenceIsSaidWithItsFile) {
  const Checked checked(kHead +
                        "file -r -ns \"rig\" -rfn \"rigRN\" \"set/rig.ma\";\n"
                        "createNode transform -n \"shotCam\" -p \"rig:root\";\n"
                        "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
                        kResolution);
  EXPECT_THAT(checked.SentenceOf(Code::ParentElsewhere),
              HasSubstr("\"rig:root\" is not in this file, but in \"set/rig.ma\""));
}

TEST(LossTest, AFosterParentStandsForANodeOfItsFile) {
  const Checked checked(kHead +
                        "file -r -ns \"rig\" -rfn \"rigRN\" \"set/rig.ma\";\n"
                        "createNode fosterParent -n \"rigRNfosterParent1\";\n"
                        "createNode transform -n \"shotCam\" -p \"rigRNfosterParent1\";\n"
                        "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
                        kResolution);
  EXPECT_THAT(checked.SentenceOf(Code::ParentElsewhere), HasSubstr("but in \"set/rig.ma\""));
  EXPECT_EQ(checked.CountOf(Code::ParentInReference), 0u);
}

TEST(LossTest, AParentThatDoesNotComeOverIsSaidOnce) {
  const std::string child =
      "createNode transform -n \"shotCam\" -p \"rig:root\";\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
      kResolution;
  const std::string missing = kHead + child;
  const std::string referenced = kHead + "file -r -ns \"rig\" -rfn \"rigRN\" \"set/rig.ma\";\n" + child;
  for (const std::string& text : {missing, referenced}) {
    const Checked checked(text);
    EXPECT_EQ(checked.CountOf(Code::ParentElsewhere), 1u) << checked.All();
    EXPECT_EQ(checked.CountOf(Code::ParentMissing) + checked.CountOf(Code::ParentInReference), 0u)
        << checked.All();
  }
  check::Options missed;
  missed.only = {Code::ParentMissing};
  EXPECT_EQ(Checked(missing, missed).CountOf(Code::ParentMissing), 1u);
}

// No camera hangs on the node, so that no other diagnostic speaks of it.
TEST(LossTest, AParentThatIsMissedAboveNoCameraIsSaid) {
  const Checked checked(kHead + "createNode transform -n \"prop\" -p \"rig\";\n" + kResolution);
  EXPECT_EQ(checked.CountOf(Code::ParentMissing), 1u) << checked.All();
}

TEST(LossTest, AParentOfATypeThatTheImporterDoesNotKnow) {
  const Checked checked(kHead +
                        "createNode joint -n \"arm\";\ncreateNode transform -n \"shotCam\" -p \"arm\";\n"
                        "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" +
                        kResolution);
  EXPECT_THAT(checked.SentenceOf(Code::ParentNotImported), HasSubstr("of the type joint"));
  EXPECT_THAT(diag::EntryOf(Code::ParentNotImported).help, HasSubstr("mayascene bake SCENE -o OUT"));
}

TEST(LossTest, ChannelsOfOneKeyEach) {
  const Checked checked(CameraScene("", "",
                                    CurveOf("moveX", "1 12.5", "shotCam.tx") +
                                        CurveOf("moveY", "1 0", "shotCam.ty") +
                                        CurveOf("turnZ", "1 30", "shotCam.rz", "animCurveTA")));
  EXPECT_THAT(checked.SentenceOf(Code::ChannelsOfOneKey), HasSubstr("one key alone in translateX, rotateZ"));
}

TEST(LossTest, AKeyThatIsTheStoredValueLosesNothing) {
  const Checked checked(
      CameraScene("\tsetAttr \".tx\" 12.5;\n\tsetAttr \".t\" -type \"double3\" 12.5 0 0 ;\n", "",
                  CurveOf("moveX", "1 12.5", "shotCam.tx")));
  EXPECT_EQ(checked.CountOf(Code::ChannelsOfOneKey), 0u);
}

TEST(LossTest, ChannelsThatAConstraintDrivesAreNamedTogether) {
  const Checked checked(CameraScene("", "",
                                    "createNode pointConstraint -n \"hold\" -p \"shotCam\";\n"
                                    "connectAttr \"hold.ctx\" \"shotCam.tx\";\n"
                                    "connectAttr \"hold.cty\" \"shotCam.ty\";\n"));
  EXPECT_EQ(checked.SentenceOf(Code::DrivenByNoCurve),
            "\"shotCam\" stands still in translateX, translateY: \"hold\" (pointConstraint) drives it, which "
            "is not a "
            "curve");
}

// The import holds the value, and the evaluation cannot compute it: the first is said, once for each driver.
TEST(LossTest, ADriverThatCannotBeComputedIsSaidOnce) {
  const std::string text = CameraScene("", "",
                                       "createNode expression -n \"shake\";\n"
                                       "connectAttr \"shake.out[0]\" \"shotCam.tx\";\n"
                                       "connectAttr \"shake.out[1]\" \"shotCam.ty\";\n"
                                       "connectAttr \"shake.out[2]\" \"shotCamShape.fl\";\n");
  const Checked checked(text);
  EXPECT_EQ(checked.CountOf(Code::DrivenByNoCurve), 1u);
  EXPECT_EQ(checked.CountOf(Code::FocalLengthElsewhere), 1u);
  EXPECT_EQ(checked.CountOf(Code::UnsupportedDriver), 0u) << checked.All();
  check::Options wanted;
  wanted.only = {Code::UnsupportedDriver};
  EXPECT_EQ(Checked(text, wanted).CountOf(Code::UnsupportedDriver), 3u);
}

// A scene has thousands of nodes of which nothing comes over.
TEST(LossTest, NotesOfNodesAreGivenWhereALayerDependsOnThem) {
  const std::string text = CameraScene(
      "", "",
      "file -r -ns \"set\" -rfn \"setRN\" \"set.ma\";\nfile -r -ns \"sky\" -rfn \"skyRN\" \"sky.ma\";\n"
      "createNode transform -n \"prop\" -p \"set:root\";\n"
      "createNode transform -n \"guide\" -p \"set:root\";\n"
      "connectAttr \"guide.tx\" \"shotCam.tx\";\nconnectAttr \"guide.ty\" \"shotCam.tx\";\n"
      "connectAttr \"guide.tx\" \"prop.tx\";\nconnectAttr \"guide.ty\" \"prop.tx\";\n");
  const Checked checked(text);
  EXPECT_EQ(checked.MarkedBy(Code::ParentInReference), "guide");
  EXPECT_EQ(checked.MarkedBy(Code::AlreadyConnected), "shotCam.tx");
  EXPECT_EQ(checked.SentenceOf(Code::ReferenceNotRead),
            "referenced files are not read: 2, the first \"set.ma\"");
}

TEST(LossTest, ACurveThatGoesThroughAnotherNode) {
  const Checked checked(CameraScene("", "",
                                    "createNode pairBlend -n \"blend\";\n" +
                                        CurveOf("moveX", "1 0 24 5", "blend.itx2") +
                                        "connectAttr \"blend.otx\" \"shotCam.tx\";\n"));
  EXPECT_THAT(checked.SentenceOf(Code::CurveThroughNode), HasSubstr("\"blend\" (pairBlend)"));
  EXPECT_EQ(checked.MarkedBy(Code::CurveThroughNode), "shotCam.tx");
}

TEST(LossTest, ACurveThatIsConnectedToAPath) {
  const Checked checked(CameraScene("", "", CurveOf("moveX", "1 0 2 5", "|shotCam.tx")));
  EXPECT_EQ(checked.MarkedBy(Code::ConnectionToPath), "|shotCam.tx");
}

TEST(LossTest, AFocalLengthFromAnotherNode) {
  const Checked checked(
      CameraScene("", "",
                  "createNode transform -n \"control\";\n\taddAttr -ln \"zoom\" -at double;\n"
                  "connectAttr \"control.zoom\" \"shotCamShape.fl\";\n"));
  EXPECT_THAT(checked.SentenceOf(Code::FocalLengthElsewhere), HasSubstr("\"control\" (transform)"));
}

std::string LookAt(std::string_view connections) {
  return "createNode transform -n \"point\";\n\tsetAttr \".t\" -type \"double3\" 5 0 0 ;\n"
         "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
         "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
         "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n" +
         std::string(connections);
}

TEST(LossTest, ALookAtInShortNames) {
  const Checked checked(CameraScene("", "", LookAt("connectAttr \"point.t\" \"aim.tg[0].tt\";\n")));
  EXPECT_EQ(checked.MarkedBy(Code::LookAtShortNames), "aim");
}

TEST(LossTest, ALookAtWhoseWeightComesLast) {
  const Checked checked(
      CameraScene("", "",
                  LookAt("connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n"
                         "connectAttr \"aim.pointW0\" \"aim.target[0].targetWeight\";\n")));
  ASSERT_TRUE(checked.cameOver().layers[0].aimed);
  EXPECT_EQ(checked.MarkedBy(Code::LookAtWeightLast), "aim.target[0].targetWeight");
  // The look-at is no target that anybody chose, so nothing is said of what it stands under.
  EXPECT_EQ(checked.CountOf(Code::TargetLosesItsChain), 0u);
}

TEST(LossTest, ALookAtThatComesOverIsNotComplainedOf) {
  const Checked checked(
      CameraScene("", "", LookAt("connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n")));
  ASSERT_TRUE(checked.cameOver().layers[0].aimed);
  EXPECT_EQ(checked.CountOf(Code::LookAtWeightLast) + checked.CountOf(Code::LookAtShortNames) +
                checked.CountOf(Code::LookAtNotTaken) + checked.CountOf(Code::DrivenByNoCurve),
            0u);
}

TEST(LossTest, ManyCamerasAndLookAtsOfOneTransformAreNamedOnceEach) {
  constexpr std::size_t kMany = 40;
  std::string many;
  for (std::size_t i = 1; i < kMany; ++i) {
    const std::string number = std::to_string(i);
    many += "createNode camera -n \"shape" + number + "\" -p \"shotCam\";\n" + kLens +
            "createNode aimConstraint -n \"aim" + number + "\" -p \"shotCam\";\n" + "connectAttr \"aim" +
            number + ".constraintRotate\" \"shotCam.rotate" + number + "\";\n";
  }
  const Checked checked(CameraScene("", "", LookAt("connectAttr \"point.t\" \"aim.tg[0].tt\";\n") + many),
                        {.all = true, .only = {}});
  EXPECT_EQ(checked.CountOf(Code::LookAtShortNames), 2 * kMany - 1);
}

TEST(LossTest, ALookAtWithoutAPlace) {
  const Checked checked(
      CameraScene("", "",
                  "createNode transform -n \"point\";\ncreateNode aimConstraint -n \"aim\";\n"
                  "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                  "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n"));
  EXPECT_EQ(checked.MarkedBy(Code::LookAtNotTaken), "aim");
}

TEST(LossTest, SettingsThatACompositionHasNoPlaceFor) {
  const Checked checked(CameraScene("", "\tsetAttr \".dof\" yes;\n"));
  EXPECT_THAT(checked.SentenceOf(Code::AttributesWithoutPlace),
              HasSubstr("the depth of field of \"shotCamShape\""));
}

TEST(LossTest, AnOrthographicCameraThatComesOverWithAPerspective) {
  const Checked checked(CameraScene("", "\tsetAttr \".o\" on;\n"));
  ASSERT_EQ(checked.cameOver().layers.size(), 1u);
  EXPECT_EQ(checked.SentenceOf(Code::OrthographicAsPerspective),
            "the orthographic camera \"shotCamShape\" comes over with a perspective");
  EXPECT_EQ(checked.CountOf(Code::AttributesWithoutPlace), 0u);
  EXPECT_EQ(Checked(CameraScene("", "\tsetAttr \".o\" off;\n")).All(), "");
}

// Cameras under parents of one of many references.
std::string UnderReference(int references, int of, const std::string& end) {
  std::string text = kHead;
  for (int i = 0; i < references; ++i) {
    const std::string space = "n" + std::to_string(i);
    text += "file -r -ns \"" + space + "\" -rfn \"" + space + "RN\" \"" + space + ".ma\";\n";
  }
  for (int i = 0; i < references; ++i) {
    const std::string name = "t" + std::to_string(i);
    text += "createNode transform -n \"" + name + "\" -p \"n" + std::to_string(of) + end +
            "\";\ncreateNode camera -n \"" + name + "Shape\" -p \"" + name + "\";\n";
  }
  return text;
}

TEST(LossTest, TheFileOfALostParentIsThatOfItsNameSpace) {
  const Checked inner(UnderReference(1, 0, ":a:root"));
  EXPECT_THAT(inner.SentenceOf(Code::ParentElsewhere), HasSubstr("but in \"n0.ma\""));
  EXPECT_THAT(Checked(UnderReference(1, 0, "1:root")).SentenceOf(Code::ParentElsewhere),
              HasSubstr("in no file that is known"));
}

TEST(LossTest, TheLastOfManyReferencesIsFoundAsFastAsTheFirst) {
  constexpr int kReferences = 3000;
  const auto seconds = [](int of) {
    const std::string text = UnderReference(kReferences, of, ":root");
    const Checked imported(text);
    EXPECT_GT(imported.CountOf(Code::ParentElsewhere), 0u);
    const auto begin = std::chrono::steady_clock::now();
    check::Check(text, imported.cameOver(), {});
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - begin).count();
  };
  EXPECT_LT(seconds(kReferences - 1), 3.0 * seconds(0) + 0.02);
}

}  // namespace
}  // namespace check_test
