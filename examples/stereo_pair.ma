//Maya ASCII 2024 scene
// A stereo pair: a left and a right eye, 6.5 centimetres apart, parallel, under one rig that trucks past a window.
// The rig's own centre camera comes along; all three see the same move.
// Baked at every third frame, 30 frames a second.
//Name: stereo_pair.ma
requires maya "2024";
currentUnit -l centimeter -a degree -t ntsc;
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
createNode stereoRigTransform -n "window_rig";
	setAttr ".t" -type "double3" 0 150 300 ;
createNode stereoRigCamera -n "window_rigCenterCamShape" -p "window_rig";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 40;
	setAttr ".coi" 300;
createNode transform -n "window_rigLeft" -p "window_rig";
	setAttr ".t" -type "double3" -3.25 0 0 ;
createNode camera -n "window_rigLeftShape" -p "window_rigLeft";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 40;
	setAttr ".coi" 300;
createNode transform -n "window_rigRight" -p "window_rig";
	setAttr ".t" -type "double3" 3.25 0 0 ;
createNode camera -n "window_rigRightShape" -p "window_rigRight";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 40;
	setAttr ".coi" 300;
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 70 -ast 1 -aet 70 ";
	setAttr ".st" 6;
createNode animCurveTL -n "window_rig_translateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -180 4 -179.723079 7 -177.930949 10 -173.492659 13 -165.659832 16 -154.0264
		19 -138.488328 22 -119.203346 25 -96.5506748 28 -71.0907576 31 -43.5249862 34 -14.6554309
		37 14.6554309 40 43.5249862 43 71.0907576 46 96.5506748 49 119.203346 52 138.488328
		55 154.0264 58 165.659832 61 173.492659 64 177.930949 67 179.723079 70 180;
createNode animCurveTL -n "window_rig_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 300 4 293.872501 7 287.859145 10 282.071951 13 276.618722 16 271.601043
		19 267.112382 22 263.236355 25 260.045165 28 257.598259 31 255.941216 34 255.104905
		37 255.104905 40 255.941216 43 257.598259 46 260.045165 49 263.236355 52 267.112382
		55 271.601043 58 276.618722 61 282.071951 64 287.859145 67 293.872501 70 300;
createNode animCurveTA -n "window_rig_rotateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -17 4 -16.9738463 7 -16.8045897 10 -16.3854178 13 -15.6456508 16 -14.5469378
		19 -13.0794532 22 -11.2580938 25 -9.11867484 28 -6.71412711 31 -4.11069314 34 -1.38412403
		37 1.38412403 40 4.11069314 43 6.71412711 46 9.11867484 49 11.2580938 52 13.0794532
		55 14.5469378 58 15.6456508 61 16.3854178 64 16.8045897 67 16.9738463 70 17;
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
connectAttr "window_rig_translateX.o" "window_rig.tx";
connectAttr "window_rig_translateZ.o" "window_rig.tz";
connectAttr "window_rig_rotateY.o" "window_rig.ry";
// End of stereo_pair.ma
