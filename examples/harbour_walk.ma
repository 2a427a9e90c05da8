//Maya ASCII 2024 scene
// A walk along a harbour as it is animated: a few keys with curved tangents, a camera that turns in the order zxy, and
// edits of a referenced ferry whose paths have no quotes. Import it with --bake: the importer alone stops at the first
// of these paths.
//Name: harbour_walk.ma
file -rdi 1 -ns "ferry" -rfn "ferryRN" -op "v=0;" -typ "mayaAscii" "sets/ferry.ma";
file -r -ns "ferry" -dr 1 -rfn "ferryRN" -op "v=0;" -typ "mayaAscii" "sets/ferry.ma";
requires maya "2024";
currentUnit -l centimeter -a degree -t film;
fileInfo "application" "maya";
fileInfo "version" "2024";
createNode transform -s -n "persp";
	setAttr ".v" no;
	setAttr ".t" -type "double3" 280 210 280 ;
	setAttr ".r" -type "double3" -27.9 45 0 ;
createNode camera -s -n "perspShape" -p "persp";
	setAttr -k off ".v" no;
	setAttr ".fl" 34.99999999999999;
	setAttr ".coi" 448.3;
	setAttr ".imn" -type "string" "persp";
createNode transform -n "walker";
createNode transform -n "walk_cam" -p "walker";
	setAttr ".t" -type "double3" 0 168 0 ;
	setAttr ".r" -type "double3" -4 12 1.5 ;
	setAttr ".ro" 2;
createNode camera -n "walk_camShape" -p "walk_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.41732 0.94488 ;
	setAttr ".ff" 0;
	setAttr ".fl" 32;
	setAttr ".coi" 900;
	setAttr ".imn" -type "string" "walk_cam";
createNode transform -n "mooring";
	setAttr ".t" -type "double3" -140 40 -760 ;
createNode locator -n "mooring_nullShape" -p "mooring";
	setAttr -k off ".v";
createNode reference -n "ferryRN";
	setAttr ".phl[1]" 0;
	setAttr ".ed" -type "dataReferenceEdits" 
		"ferryRN"
		"ferryRN" 0
		"ferryRN" 4
		1 |ferry:hull|ferry:deck 
		"crowd" "crowd" " -ci 1 -min 0 -max 1 -at \"double\""
		2 "|ferry:hull" "translate" " -type \"double3\" -420 0 -2600"
		2 |ferry:hull|ferry:deck "crowd" " -k 1 0.75"
		5 4 "ferryRN" "|ferry:hull.translateX" "ferryRN.placeHolderList[1]" "";
	setAttr ".ptag" -type "string" "";
lockNode -l 1 ;
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 72 -ast 1 -aet 72 ";
	setAttr ".st" 6;
createNode animCurveTL -n "walker_translateX";
	setAttr ".tan" 18;
	setAttr ".wgt" no;
	setAttr -s 3 ".ktv[0:2]"  1 0 40 -85 72 -60;
createNode animCurveTL -n "walker_translateZ";
	setAttr ".tan" 18;
	setAttr ".wgt" no;
	setAttr -s 4 ".ktv[0:3]"  1 0 24 -150 48 -330 72 -420;
createNode animCurveTL -n "walk_cam_translateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 2 ".ktv[0:1]"  1 166 7 170;
	setAttr ".pre" 5;
	setAttr ".pst" 5;
createNode animCurveTA -n "walk_cam_rotateX";
	setAttr ".tan" 1;
	setAttr -s 3 ".ktv[0:2]"  1 -4 30 -9.5 72 2;
	setAttr -s 3 ".kix[0:2]"  0.41666666666666669 1.1 1.4;
	setAttr -s 3 ".kiy[0:2]"  0 0.02 0.11;
	setAttr -s 3 ".kox[0:2]"  0.9 0.8 1;
	setAttr -s 3 ".koy[0:2]"  -0.16 0.014545454545454545 0;
createNode animCurveTA -n "walk_cam_rotateY";
	setAttr ".tan" 18;
	setAttr -s 3 ".ktv[0:2]"  1 12 36 -31 72 24;
	setAttr -s 3 ".kit[1:2]"  10 16;
	setAttr -s 3 ".kot[1:2]"  10 16;
createNode animCurveTA -n "walk_cam_rotateZ";
	setAttr ".tan" 18;
	setAttr -s 3 ".ktv[0:2]"  1 1.5 20 -2 72 0.5;
createNode animCurveTL -n "ferry:hull_translateX";
	setAttr ".tan" 2;
	setAttr -s 2 ".ktv[0:1]"  -120 -420 300 900;
select -ne :time1;
	setAttr ".o" 1;
	setAttr ".unw" 1;
select -ne :defaultResolution;
	setAttr ".w" 1920;
	setAttr ".h" 1080;
	setAttr ".dar" 1.7777777910232544;
connectAttr "walker_translateX.o" "walker.tx";
connectAttr "walker_translateZ.o" "walker.tz";
connectAttr "walk_cam_translateY.o" "walk_cam.ty";
connectAttr "walk_cam_rotateX.o" "walk_cam.rx";
connectAttr "walk_cam_rotateY.o" "walk_cam.ry";
connectAttr "walk_cam_rotateZ.o" "walk_cam.rz";
connectAttr "ferry:hull_translateX.o" "ferryRN.phl[1]";
// End of harbour_walk.ma
