// What stands at the head of a file, and the settings of a scene as a whole.
#include "scene/Settings.h"
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class HeadTest : public SceneTest {
 protected:
  Settings SettingsOf(std::string_view text) {
    Read(text);
    return ReadSettings(scene_, collector());
  }
};

TEST_F(HeadTest, RequirementsAreKept) {
  Read(
      "requires maya \"2018\";\nrequires -nodeType \"a\" -nodeType \"b\" -dataType \"c\"\n\t\t\"mtoa\" "
      "\"2.0.1\";\nrequires;");
  ASSERT_EQ(scene_.requirements().size(), 2u);
  EXPECT_EQ(scene_.requirements()[0].name, "maya");
  EXPECT_EQ(scene_.requirements()[0].version, "2018");
  EXPECT_EQ(PlaceOf(scene_.requirements()[0].place), "1:10");
  EXPECT_EQ(scene_.requirements()[1].name, "mtoa");
  EXPECT_EQ(scene_.requirements()[1].version, "2.0.1");
  EXPECT_THAT(Diagnostics(), ElementsAre("4:1: the command \"requires\" lacks a name [MA0108]"));
}

TEST_F(HeadTest, FileInfoIsKept) {
  Read("fileInfo \"product\" \"Maya 2014\";\nfileInfo \"osv\" \"a\\nb\";fileInfo \"x\";");
  ASSERT_EQ(scene_.fileInfo().size(), 2u);
  EXPECT_EQ(scene_.fileInfo()[0].key, "product");
  EXPECT_EQ(scene_.fileInfo()[0].value, "Maya 2014");
  EXPECT_EQ(PlaceOf(scene_.fileInfo()[0].place), "1:21");
  EXPECT_EQ(scene_.fileInfo()[1].value, "a\nb");
  EXPECT_THAT(Diagnostics(), ElementsAre("2:23: the command \"fileInfo\" lacks a key and a value [MA0108]"));
}

TEST_F(HeadTest, AReferenceIsNamedOnceAndNotFollowed) {
  Read(
      "file -rdi 1 -ns \"hero\" -rfn \"heroRN\" -op \"v=0;\" -typ \"mayaAscii\"\n\t\t\"hero.ma\";\n"
      "file -rdi 2 -ns \"x\" -rfn \"xRN\" \"x.ma\";\n"
      "file -r -ns \"hero\" -dr 1 -rfn \"heroRN\" \"hero.ma\";\nfile -r;file -import \"y.ma\";"
      "file -r -ns \"x\" -dr 1 -rfn \"xRN\" \"x.ma\";");
  ASSERT_EQ(scene_.references().size(), 2u);
  EXPECT_EQ(scene_.references()[0].node, "heroRN");
  EXPECT_EQ(scene_.references()[0].nameSpace, "hero");
  EXPECT_EQ(scene_.references()[0].file, "hero.ma");
  EXPECT_EQ(PlaceOf(scene_.references()[0].place), "2:4");
  EXPECT_EQ(scene_.references()[1].file, "x.ma");
  EXPECT_THAT(Diagnostics(), ElementsAre("5:1: the command \"file\" lacks a file [MA0108]",
                                         "4:41: referenced files are not read: 2, the first \"hero.ma\" "
                                         "[MA0211]"));
}

TEST_F(HeadTest, UnitsAreSaidOrTheDefault) {
  const Settings silent = SettingsOf("requires maya \"2020\";");
  EXPECT_EQ(silent.centimetersPerUnit, (Said<double>{1.0, std::nullopt}));
  EXPECT_EQ(silent.angularUnit, (Said<AngularUnit>{AngularUnit::Degree, std::nullopt}));
  EXPECT_EQ(silent.rate, (Said<FrameRate>{FrameRate{24, 1}, std::nullopt}));

  const Settings said = SettingsOf("currentUnit -l meter -a radian -t ntsc;");
  EXPECT_EQ(said.centimetersPerUnit, (Said<double>{100.0, diag::Range{15, 5}}));
  EXPECT_EQ(said.angularUnit, (Said<AngularUnit>{AngularUnit::Radian, diag::Range{24, 6}}));
  EXPECT_EQ(said.rate, (Said<FrameRate>{FrameRate{30, 1}, diag::Range{34, 4}}));

  const Settings longNames = SettingsOf("currentUnit -linear inch -angle degree -time \"23.976fps\";");
  EXPECT_EQ(longNames.centimetersPerUnit.value, 2.54);
  EXPECT_EQ(longNames.rate.value, (FrameRate{24000, 1001}));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(HeadTest, AUnitThatIsNotKnownChangesNothing) {
  const Settings settings =
      SettingsOf("currentUnit -l meter -t pal;\ncurrentUnit -l league -a turn -t 0fps;");
  EXPECT_EQ(settings.centimetersPerUnit.value, 100.0);
  EXPECT_EQ(settings.rate.value, (FrameRate{25, 1}));
  EXPECT_THAT(Diagnostics(), ElementsAre("2:16: \"league\" is not a unit of length [MA0209]",
                                         "2:26: \"turn\" is not a unit of angle [MA0209]",
                                         "2:34: \"0fps\" is not a unit of time [MA0209]"));
}

TEST_F(HeadTest, TheLastOfTwoUnitsHolds) {
  const Settings settings = SettingsOf("currentUnit -l cm -t pal;\ncurrentUnit -l cm -t film;");
  EXPECT_EQ(settings.rate, (Said<FrameRate>{FrameRate{24, 1}, diag::Range{47, 4}}));
  EXPECT_THAT(Diagnostics(),
              ElementsAre("2:22: the unit of time changes here from \"pal\" to \"film\" [MA0210]"));
}

TEST_F(HeadTest, RangesAreReadFromTheirScript) {
  const Settings settings = SettingsOf(
      "createNode script -n \"sceneConfigurationScriptNode\";\n\tsetAttr \".b\" -type \"string\" "
      "\"playbackOptions -min 1.5 -max 24 -ast -3 -aet 48 \";\n\tsetAttr \".st\" 6;\n"
      "select -ne :time1;\n\tsetAttr \".o\" 12;\nselect -ne :defaultRenderGlobals;\n\tsetAttr \".fs\" "
      "5;\n\tsetAttr \".ef\" 6;");
  ASSERT_TRUE(settings.playback && settings.animation && settings.render);
  EXPECT_EQ(settings.playback->value, (FrameRange{1.5, 24}));
  EXPECT_EQ(settings.animation->value, (FrameRange{-3, 48}));
  EXPECT_EQ(PlaceOf(*settings.playback->place), "2:30");
  EXPECT_EQ(settings.render->value, (FrameRange{5, 6}));
  EXPECT_EQ(settings.currentFrame.value, 12.0);
}

TEST_F(HeadTest, RangesInLongOptionsAndUnreadableOnes) {
  const Settings settings = SettingsOf(
      "createNode script -n \"sceneConfigurationScriptNode\";setAttr \".b\" -type \"string\" "
      "\"playbackOptions -minTime 1 -maxTime 2;playbackOptions -animationStartTime 3 -animationEndTime "
      "x;\";");
  ASSERT_TRUE(settings.playback);
  EXPECT_EQ(settings.playback->value, (FrameRange{1, 2}));
  EXPECT_FALSE(settings.animation);
  EXPECT_THAT(Diagnostics(),
              ElementsAre("1:81: \"x\" is not a value that animationEndTime can have [MA0109]"));
}

TEST_F(HeadTest, AScriptOfAnotherNameMaySetTheRange) {
  const Settings settings = SettingsOf(
      "createNode script -n \"note\";setAttr \".b\" -type \"string\" \"print 1\";\n"
      "createNode script -n \"shot:sceneConfigurationScriptNode\";setAttr \".b\" -type \"string\" "
      "\"playbackOptions -min 3 -max 4\";");
  ASSERT_TRUE(settings.playback);
  EXPECT_EQ(settings.playback->value, (FrameRange{3, 4}));
}

TEST_F(HeadTest, WithoutAScriptThereIsNoRange) {
  const Settings settings = SettingsOf("createNode script -n \"sceneConfigurationScriptNode\";");
  EXPECT_FALSE(settings.playback);
  EXPECT_FALSE(settings.render);
  EXPECT_EQ(settings.currentFrame, (Said<double>{1.0, std::nullopt}));
}

TEST_F(HeadTest, TheResolutionIsWhatTheFileSays) {
  const Settings settings = SettingsOf(
      "select -ne :defaultResolution;\n\tsetAttr \".w\" 720;\n\tsetAttr -av \".h\" 576;\n\tsetAttr \".pa\" "
      "1;\n"
      "\tsetAttr \".dar\" 1.3333333730697632;");
  EXPECT_EQ(settings.width.value, 720.0);
  EXPECT_EQ(settings.height.value, 576.0);
  EXPECT_NEAR(settings.pixelAspect(), 1.0666667, 1e-7);
  EXPECT_NEAR(settings.pictureAspect(), 1.3333333, 1e-7);
  EXPECT_EQ(PlaceOf(*settings.height.place), "3:19");
}

TEST_F(HeadTest, NearlySquarePixelsAreSquare) {
  const Settings settings = SettingsOf(
      "select -ne :defaultResolution;setAttr \".w\" 1920;setAttr \".h\" 1080;setAttr \".dar\" 1.77;");
  EXPECT_EQ(settings.pixelAspect(), 1.0);
  EXPECT_NEAR(settings.pictureAspect(), 1.7777778, 1e-7);
}

TEST_F(HeadTest, TheDefaultResolutionIsThatOfTheVersion) {
  EXPECT_EQ(SettingsOf("requires maya \"2014\";").width, (Said<double>{960.0, std::nullopt}));
  EXPECT_EQ(SettingsOf("requires maya \"2012\";").width, (Said<double>{640.0, std::nullopt}));
  EXPECT_EQ(SettingsOf("requires maya \"8.5\";").height.value, 480.0);
  EXPECT_EQ(SettingsOf("").height.value, 540.0);
  EXPECT_EQ(SettingsOf("fileInfo \"product\" \"Maya 2011 x64\";").deviceAspect.value, 1.3333333);
}

TEST_F(HeadTest, TheVersionIsARequirementOrTheProduct) {
  const Settings both = SettingsOf("requires maya \"2025ff03\";fileInfo \"product\" \"Maya 2024\";");
  EXPECT_EQ(both.version.value, 2025);
  EXPECT_EQ(both.product, "Maya 2024");
  EXPECT_EQ(SettingsOf("fileInfo \"product\" \"Maya Unlimited 7.0\";").version.value, 0);
  EXPECT_EQ(SettingsOf("requires maya \"7.0\";").version.value, 7);
}

TEST_F(HeadTest, AResolutionThatCannotBeReadIsReported) {
  const Settings settings =
      SettingsOf("select -ne :defaultResolution;\n\tsetAttr \".w\" 1e999;setAttr \".h\" 0;");
  EXPECT_EQ(settings.width.value, 960.0);
  EXPECT_EQ(settings.pixelAspect(), 1.0);
  EXPECT_EQ(settings.height.value, 540.0);
  EXPECT_THAT(Diagnostics(), ElementsAre("2:15: \"1e999\" is not a value that width can have [MA0109]",
                                         "2:34: \"0\" is not a value that height can have [MA0109]"));
}

}  // namespace
}  // namespace scene
