//Maya ASCII 2024 scene
// A chase: an aim constraint, written in full attribute names, turns the camera towards an animated target on the
// car. The camera's own rotation has no keys; its layer is aimed at its point of interest, which follows the target.
// Baked at every third frame, 25 frames a second.
//Name: aimed_camera.ma
requires maya "2024";
currentUnit -l centimeter -a degree -t pal;
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
createNode transform -s -n "top";
	setAttr ".v" no;
	setAttr ".t" -type "double3" 0 1000.1 0 ;
	setAttr ".r" -type "double3" -90 0 0 ;
createNode camera -s -n "topShape" -p "top";
	setAttr -k off ".v" no;
	setAttr ".rnd" no;
	setAttr ".coi" 1000.1;
	setAttr ".ow" 30;
	setAttr ".o" yes;
createNode transform -n "chase_cam";
createNode camera -n "chase_camShape" -p "chase_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 50;
	setAttr ".coi" 800;
createNode aimConstraint -n "chase_cam_aim" -p "chase_cam";
	addAttr -ci true -sn "w0" -ln "car_focusW0" -dv 1 -min 0 -at "double";
	setAttr ".erp" yes;
	setAttr ".aimVector" -type "double3" 0 0 -1 ;
	setAttr ".worldUpType" 0;
createNode transform -n "car_focus";
	setAttr ".t" -type "double3" -640 62 -310 ;
createNode locator -n "car_focusShape" -p "car_focus";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 70 -ast 1 -aet 70 ";
	setAttr ".st" 6;
createNode animCurveTL -n "chase_cam_translateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -40 4 -27.9062595 7 -16.0318857 10 -4.59226642 13 6.20509674 16 16.1643518
		19 25.1048491 22 32.8644183 25 39.3023095 28 44.3017466 31 47.7720456 34 49.6502591
		37 49.9023185 40 48.5236518 43 45.5392662 46 41.0032954 49 34.9980165 52 27.6323586
		55 19.0399263 58 9.37657669 61 -1.18240809 64 -12.4455 67 -24.2083993 70 -36.2577404;
createNode animCurveTL -n "chase_cam_translateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 145 4 145.046154 7 145.344842 10 146.084557 13 147.390028 16 149.328933
		19 151.918612 22 155.132776 25 158.908221 28 163.15154 31 167.745836 34 172.557428
		37 177.442572 40 182.254164 43 186.84846 46 191.091779 49 194.867224 52 198.081388
		55 200.671067 58 202.609972 61 203.915443 64 204.655158 67 204.953846 70 205;
createNode animCurveTL -n "chase_cam_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 420 4 414.347826 7 408.695652 10 403.043478 13 397.391304 16 391.73913
		19 386.086957 22 380.434783 25 374.782609 28 369.130435 31 363.478261 34 357.826087
		37 352.173913 40 346.521739 43 340.869565 46 335.217391 49 329.565217 52 323.913043
		55 318.26087 58 312.608696 61 306.956522 64 301.304348 67 295.652174 70 290;
createNode animCurveTL -n "car_focus_translateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -676.578687 4 -676.131253 7 -673.181998 10 -665.480222 13 -650.5223 16 -625.164869
		19 -585.67475 22 -528.296215 25 -450.238486 28 -350.809491 31 -232.291446 34 -100.1522
		37 37.6290136 40 172.010968 43 294.674956 46 399.555972 49 483.650504 52 546.946125
		55 591.656698 58 621.152471 61 638.994135 64 648.3613 67 651.989035 70 652.541607;
createNode animCurveTL -n "car_focus_translateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 62 4 64.5734972 7 65.4884173 10 64.1551093 13 61.4328685 16 59.0761346
		19 58.6037844 22 60.3202398 25 63.1192733 28 65.1969534 31 65.2142491 34 63.1600136
		37 60.3581682 40 58.6144567 43 59.0526727 46 61.3903931 49 64.1209953 52 65.4846505
		55 64.6025052 58 62.0430877 61 59.4559009 64 58.5083445 67 59.8111032 70 62.5245702;
createNode animCurveTL -n "car_focus_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 41.1071083 4 40.0174579 7 32.9832814 10 15.6993159 13 -14.2920671 16 -57.4825495
		19 -112.257802 22 -174.832152 25 -239.43004 28 -298.893228 31 -345.776757 34 -373.778112
		37 -379.125364 40 -361.467623 43 -323.944303 46 -272.410331 49 -214.105528 52 -156.214509
		55 -104.707062 58 -63.6454179 61 -34.9269778 64 -18.3054533 67 -11.5265279 70 -10.4756875;
select -ne :time1;
	setAttr ".o" 1;
	setAttr ".unw" 1;
select -ne :renderPartition;
	setAttr -s 2 ".st";
select -ne :defaultResolution;
	setAttr ".w" 1920;
	setAttr ".h" 1080;
	setAttr ".pa" 1;
	setAttr ".dar" 1.7777777777777777;
connectAttr "chase_cam_translateX.output" "chase_cam.translateX";
connectAttr "chase_cam_translateY.output" "chase_cam.translateY";
connectAttr "chase_cam_translateZ.output" "chase_cam.translateZ";
connectAttr "car_focus_translateX.output" "car_focus.translateX";
connectAttr "car_focus_translateY.output" "car_focus.translateY";
connectAttr "car_focus_translateZ.output" "car_focus.translateZ";
connectAttr "chase_cam_aim.constraintRotateX" "chase_cam.rotateX";
connectAttr "chase_cam_aim.constraintRotateY" "chase_cam.rotateY";
connectAttr "chase_cam_aim.constraintRotateZ" "chase_cam.rotateZ";
connectAttr "chase_cam.translate" "chase_cam_aim.constraintTranslate";
connectAttr "chase_cam.parentInverseMatrix[0]" "chase_cam_aim.constraintParentInverseMatrix";
connectAttr "chase_cam.rotatePivot" "chase_cam_aim.constraintRotatePivot";
connectAttr "chase_cam_aim.car_focusW0" "chase_cam_aim.target[0].targetWeight";
connectAttr "car_focus.translate" "chase_cam_aim.target[0].targetTranslate";
connectAttr "car_focus.parentMatrix[0]" "chase_cam_aim.target[0].targetParentMatrix";
// End of aimed_camera.ma
