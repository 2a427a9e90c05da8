//Maya ASCII 2024 scene
// A big wheel: the wheel makes a turn and a half, a gondola hangs from it and turns the other way to stay upright,
// and the null in the gondola follows both. Rotations run on past a full turn instead of jumping back. The camera,
// framed by the height of its film back (vertical fit), stands still. Baked at every fifth frame, 24 frames a second.
//Name: big_wheel.ma
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
createNode transform -n "fair_cam";
	setAttr ".t" -type "double3" 0 850 2900 ;
	setAttr ".r" -type "double3" 4.5 0 0 ;
createNode camera -n "fair_camShape" -p "fair_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.9449 ;
	setAttr ".ff" 2;
	setAttr ".fl" 35;
	setAttr ".coi" 3000;
createNode transform -n "wheel";
	setAttr ".t" -type "double3" 0 1100 0 ;
createNode transform -n "gondola" -p "wheel";
	setAttr ".t" -type "double3" 820 -120 0 ;
	setAttr ".rp" -type "double3" 0 120 0 ;
	setAttr ".sp" -type "double3" 0 120 0 ;
createNode transform -n "gondola_null" -p "gondola";
	setAttr ".t" -type "double3" 0 -85 0 ;
createNode locator -n "gondola_nullShape" -p "gondola_null";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 116 -ast 1 -aet 116 ";
	setAttr ".st" 6;
createNode animCurveTA -n "wheel_rotateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 0 6 -8.4873895 11 -18.452107 16 -30.9968316 21 -46.851229 26 -66.4112167
		31 -89.7782281 36 -116.798477 41 -147.102222 46 -180.143033 51 -215.237052 56 -251.602259
		61 -288.397741 66 -324.762948 71 -359.856967 76 -392.897778 81 -423.201523 86 -450.221772
		91 -473.588783 96 -493.148771 101 -509.003168 106 -521.547893 111 -531.51261 116 -540;
createNode animCurveTA -n "gondola_rotateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 0 6 11.6528615 11 22.3224668 16 32.5635716 21 44.8964912 26 62.4544576
		31 86.895115 36 117.230111 41 150.513086 46 183.881794 51 216.397497 56 249.282352
		61 284.400791 66 322.195864 71 360.715194 76 396.514199 81 426.765023 86 450.96237
		91 470.930799 96 489.158308 101 506.782092 106 522.822691 111 535.292357 116 543.346623;
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
connectAttr "wheel_rotateZ.o" "wheel.rz";
connectAttr "gondola_rotateZ.o" "gondola.rz";
// End of big_wheel.ma
