//Maya ASCII 2024 scene
// Anamorphic pixels: a 1828 by 1556 plate whose pixels are twice as wide as high. The camera lands in a square-pixel
// composition of 3656 by 1556, which is nested in one that has the plate's own size and pixel aspect.
// Baked at every fifth frame, 24 frames a second.
//Name: anamorphic_pan.ma
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
createNode transform -n "scope_cam";
	setAttr ".t" -type "double3" -150 172 640 ;
createNode camera -n "scope_camShape" -p "scope_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.728 0.7355 ;
	setAttr ".fl" 50;
	setAttr ".lsr" 1;
	setAttr ".coi" 650;
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 116 -ast 1 -aet 116 ";
	setAttr ".st" 6;
createNode animCurveTL -n "scope_cam_translateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -150 6 -149.926924 11 -149.454001 16 -148.282785 21 -146.215789 26 -143.145855
		31 -139.045531 36 -133.956438 41 -127.97865 46 -121.260061 51 -113.98576 56 -106.367405
		61 -98.6325946 66 -91.0142398 71 -83.739939 76 -77.0213497 81 -71.0435615 86 -65.954469
		91 -61.8541445 96 -58.784211 101 -56.717215 106 -55.5459995 111 -55.0730764 116 -55;
createNode animCurveTA -n "scope_cam_rotateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -2.5 6 -2.38061702 11 -2.26232549 16 -2.14620686 21 -2.03332274 26 -1.92470515
		31 -1.82134712 36 -1.72419358 41 -1.63413274 46 -1.55198798 51 -1.47851029 56 -1.41437144
		61 -1.36015779 66 -1.316365 71 -1.28339343 76 -1.26154452 81 -1.25101802 86 -1.25191017
		91 -1.26421282 96 -1.28781348 101 -1.32249639 106 -1.36794447 111 -1.42374221 116 -1.4893795;
createNode animCurveTA -n "scope_cam_rotateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 31 6 30.9553849 11 30.6666529 16 29.951595 21 28.6896396 26 26.8153644
		31 24.3120084 36 21.2049835 41 17.5553865 46 13.4535109 51 9.01235888 56 4.36115275
		61 -0.361152754 66 -5.01235888 71 -9.45351095 76 -13.5553865 81 -17.2049835 86 -20.3120084
		91 -22.8153644 96 -24.6896396 101 -25.951595 106 -26.6666529 111 -26.9553849 116 -27;
select -ne :time1;
	setAttr ".o" 1;
	setAttr ".unw" 1;
select -ne :renderPartition;
	setAttr -s 2 ".st";
select -ne :defaultResolution;
	setAttr ".w" 1828;
	setAttr ".h" 1556;
	setAttr ".pa" 2;
	setAttr ".dar" 2.3496143958868894;
connectAttr "scope_cam_translateX.o" "scope_cam.tx";
connectAttr "scope_cam_rotateX.o" "scope_cam.rx";
connectAttr "scope_cam_rotateY.o" "scope_cam.ry";
// End of anamorphic_pan.ma
