//Maya ASCII 2024 scene
// A tabletop set measured in centimetres, on a turning plate. Import it with the option --linear-units 1: every
// distance is then converted to points, 72 to the inch, so that 2.54 centimetres become 72 pixels.
// Baked at every fifth frame, 24 frames a second.
//Name: tabletop_centimeters.ma
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
createNode transform -n "table_cam";
	setAttr ".t" -type "double3" 0 62 115 ;
	setAttr ".r" -type "double3" -24 0 0 ;
createNode camera -n "table_camShape" -p "table_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 60;
	setAttr ".coi" 130;
createNode transform -n "turn_plate";
	setAttr ".t" -type "double3" 0 2.54 0 ;
	setAttr ".rp" -type "double3" 6 0 -4 ;
	setAttr ".sp" -type "double3" 6 0 -4 ;
createNode transform -n "null_bottle" -p "turn_plate";
	setAttr ".t" -type "double3" 12.7 25.4 -7.62 ;
createNode locator -n "null_bottleShape" -p "null_bottle";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "null_cup" -p "turn_plate";
	setAttr ".t" -type "double3" -15.24 9.5 5.08 ;
	setAttr ".s" -type "double3" 1.5 1.5 1.5 ;
createNode locator -n "null_cupShape" -p "null_cup";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "null_edge";
	setAttr ".t" -type "double3" 60 0 40 ;
createNode locator -n "null_edgeShape" -p "null_edge";
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
createNode animCurveTL -n "table_cam_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 115 6 114.973846 11 114.80459 16 114.385418 21 113.645651 26 112.546938
		31 111.079453 36 109.258094 41 107.118675 46 104.714127 51 102.110693 56 99.384124
		61 96.615876 66 93.8893069 71 91.2858729 76 88.8813252 81 86.7419062 86 84.9205468
		91 83.4530622 96 82.3543492 101 81.6145822 106 81.1954103 111 81.0261537 116 81;
createNode animCurveTL -n "table_cam_translateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 62 6 61.9900001 11 61.9252843 16 61.7650127 21 61.4821606 26 61.0620644
		31 60.5009674 36 59.8045653 41 58.9865521 46 58.0671662 51 57.0717356 56 56.0292239
		61 54.9707761 66 53.9282644 71 52.9328338 76 52.0134479 81 51.1954347 86 50.4990326
		91 49.9379356 96 49.5178394 101 49.2349873 106 49.0747157 111 49.0099999 116 49;
createNode animCurveTA -n "turn_plate_rotateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 0 6 0.0576919223 11 0.43105223 16 1.35569608 21 2.987535 26 5.41116671
		31 8.64826502 36 12.6659696 41 17.3852761 46 22.6894255 51 28.4322945 56 34.4467852
		61 40.5532148 66 46.5677055 71 52.3105745 76 57.6147239 81 62.3340304 86 66.351735
		91 69.5888333 96 72.012465 101 73.6443039 106 74.5689478 111 74.9423081 116 75;
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
connectAttr "table_cam_translateZ.o" "table_cam.tz";
connectAttr "table_cam_translateY.o" "table_cam.ty";
connectAttr "turn_plate_rotateY.o" "turn_plate.ry";
// End of tabletop_centimeters.ma
