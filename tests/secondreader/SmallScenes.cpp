#include "tests/secondreader/SmallScenes.h"

namespace secondreader {
namespace {

constexpr std::string_view kZoomingCamera = R"(//Maya ASCII
currentUnit -l in -a degree -t film;
createNode transform -n "c";
	setAttr ".t" -type "double3" 1 2.5 -3 ;
	setAttr ".r" 0 90 1e1;
createNode camera -n "s" -p "c";
	setAttr -k off ".fl" 50;
	setAttr ".cap" -type "double2" 1.4 0.9 ;
	setAttr ".ff" 2;
createNode animCurveTU -n "f";
	setAttr -s 2 ".ktv[0:1]"  3 35 9 70.5;
connectAttr "f.o" "s.fl";
)";

constexpr std::string_view kMovingRig = R"(//Maya ASCII
createNode transform -s -n "rig";
	setAttr ".rp" 0 1 0;
	setAttr ".sp" 2 0 .5;
createNode transform -n "cam" -p "RIG";
createNode stereoRigCamera -p "cam" -n "camShape";
createNode animCurveTA -n "ry";
	setAttr ".ktv[0:2]" 1 0 2 180 3 -190;
createNode animCurveTL -n "tx";
	setAttr ".tan" 18;
	setAttr -s 1 ".keyTimeValue[0]" 1 5;
connectAttr -f "ry.output" "rig.rotateY";
connectAttr "tx.o" "cam.tx" -na;
)";

constexpr std::string_view kAimedCamera = R"(//Maya ASCII
createNode transform -n "t";
	setAttr ".t" 4 5 6;
createNode transform -n "c";
createNode camera -n "k" -p "c";
createNode lookAt -n "a";
createNode animCurveTL -n "x";
	setAttr ".ktv" 0 1 5 2;
connectAttr "x.o" "t.tz";
connectAttr "c.t" "a.ct";
connectAttr "t.t" "a.target[0].targetTranslate";
connectAttr "a.crx" "c.rx";
)";

constexpr std::string_view kMarkedLocators = R"(//Maya ASCII
/* two ** locators, "one" of them ; marked */
createNode camera -n "persp\"Shape";  // the comment's line end
	setAttr ".o" no;
createNode transform -n "a" -p "gone";
	setAttr ".s" 2 -1 0;
createNode locator -n "aNull" -p "a";
createNode locator -n "b" -p "a";
parent -s -nc "a" "b";
createNode locator -parent "b" -name "NULL2";
)";

constexpr std::string_view kWidePixels = R"(//Maya ASCII
requires maya "2020";
createNode camera -n "k";
select -ne :time1;
setAttr ".w" 5;
select -ne :defaultResolution;
	setAttr ".w" 640;
	setAttr -k on ".h" 48.9 ".pa" 1.5;
	setAttr ".dar" 1.33;
currentUnit -time 23.976fps -angle rad -linear m;
createNode mesh -n "m";
	setAttr ".fl" 5;
)";

constexpr std::string_view kNamesakes = R"(//Maya ASCII
createNode transform -n "a" -p "b";
createNode transform -n "b" -p "a";
createNode transform -n "A";
	setAttr ".t" 7;
createNode camera -n "k" -p "a";
createNode animCurveTL -n "x";
	setAttr ".ktv" 0 1 5;
	setAttr ".ktv" 6 3;
createNode animCurveTL -n "y";
	setAttr ".ktv" 0 1;
connectAttr "x.o" "b.tx";
connectAttr "y.o" "b.ty";
)";

constexpr std::string_view kLateAttributes = R"(//Maya ASCII
createNode animCurveTL -n "x";
	setAttr ".ktv" 0 1 5 2;
createNode transform -n "c";
connectAttr "x.o" "c.tx";
	setAttr ".v" 0;
createNode camera -n "k" -p "c";
connectAttr "x.o" "k.fl";
	setAttr ".cap";
createNode transform -n "d";
)";

}  // namespace

const std::vector<SmallScene>& smallScenes() {
  static const std::vector<SmallScene> scenes = {
      {"ZoomingCamera", kZoomingCamera},   {"MovingRig", kMovingRig},   {"AimedCamera", kAimedCamera},
      {"MarkedLocators", kMarkedLocators}, {"WidePixels", kWidePixels}, {"Namesakes", kNamesakes},
      {"LateAttributes", kLateAttributes},
  };
  return scenes;
}

}  // namespace secondreader
