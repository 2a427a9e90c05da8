//Maya ASCII 2024 scene
// A crane shot: the camera rides on a pan-and-tilt head at the end of a crane arm, five animated or still
// parents above it. The track rolls in, the arm rises and swings, and the head holds the actor at the origin.
// Baked at every fifth frame, 24 frames a second.
//Name: crane_shot.ma
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
createNode transform -n "crane_track";
createNode transform -n "crane_column" -p "crane_track";
createNode transform -n "crane_arm" -p "crane_column";
	setAttr ".t" -type "double3" 0 170 0 ;
createNode transform -n "crane_plate" -p "crane_arm";
	setAttr ".t" -type "double3" 0 0 -360 ;
createNode transform -n "crane_head" -p "crane_plate";
createNode transform -n "shot_cam" -p "crane_head";
	setAttr ".t" -type "double3" 0 14 -9.5 ;
createNode camera -n "shot_camShape" -p "shot_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 32;
	setAttr ".coi" 560;
	setAttr ".imn" -type "string" "shot_cam";
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 116 -ast 1 -aet 116 ";
	setAttr ".st" 6;
createNode animCurveTL -n "crane_track_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 980 6 979.823078 11 978.678106 16 975.842532 21 970.838226 26 963.405755
		31 953.478654 36 941.157693 41 926.685153 46 910.419095 51 892.80763 56 874.363192
		61 855.636808 66 837.19237 71 819.580905 76 803.314847 81 788.842307 86 776.521346
		91 766.594245 96 759.161774 101 754.157468 106 751.321894 111 750.176922 116 750;
createNode animCurveTA -n "crane_column_rotateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -34 6 -33.9553849 11 -33.6666529 16 -32.951595 21 -31.6896396 26 -29.8153644
		31 -27.3120084 36 -24.2049835 41 -20.5553865 46 -16.4535109 51 -12.0123589 56 -7.36115275
		61 -2.63884725 66 2.01235888 71 6.45351095 76 10.5553865 81 14.2049835 86 17.3120084
		91 19.8153644 96 21.6896396 101 22.951595 106 23.6666529 111 23.9553849 116 24;
createNode animCurveTA -n "crane_arm_rotateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 -14 6 -13.957593 11 -13.6849668 16 -13.0152614 21 -11.844161 26 -10.122662
		31 -7.84984105 36 -5.06562266 41 -1.84354732 46 1.71646074 51 5.49532556 56 9.36205162
		61 13.1809559 66 16.8189001 71 20.1525225 76 23.0754703 81 25.5056317 86 27.3923679
		91 28.7237453 96 29.5337675 101 29.9096074 106 29.9988396 111 30 116 30;
createNode animCurveTA -n "crane_plate_rotateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 14 6 13.957593 11 13.6849668 16 13.0152614 21 11.844161 26 10.122662
		31 7.84984105 36 5.06562266 41 1.84354732 46 -1.71646074 51 -5.49532556 56 -9.36205162
		61 -13.1809559 66 -16.8189001 71 -20.1525225 76 -23.0754703 81 -25.5056317 86 -27.3923679
		91 -28.7237453 96 -29.5337675 101 -29.9096074 106 -29.9988396 111 -30 116 -30;
createNode animCurveTA -n "crane_head_rotateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 6.04328119 6 6.02761063 11 5.92644362 16 5.67422548 21 5.21971296 26 4.51903808
		31 3.53204909 36 2.22339113 41 0.569639334 46 -1.42703866 51 -3.72145381 56 -6.21303125
		61 -8.7516535 66 -11.1681608 71 -13.3173391 76 -15.1088992 81 -16.5122035 86 -17.5412549
		91 -18.2356537 96 -18.6482762 101 -18.8422945 106 -18.8955277 111 -18.9012907 116 -18.9020729;
createNode animCurveTA -n "crane_head_rotateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 48.5901365 6 48.5390759 11 48.207654 16 47.3802578 21 45.8975987 26 43.6426263
		31 40.5311083 36 36.508961 41 31.5580005 46 25.7106944 51 19.0709762 56 11.8316895
		61 4.27349154 66 -3.26634166 71 -10.449546 76 -16.9927581 81 -22.6992549 86 -27.4605887
		91 -31.2399251 96 -34.0531253 101 -35.9580663 106 -37.0557263 111 -37.5050481 116 -37.5744766;
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
connectAttr "crane_track_translateZ.o" "crane_track.tz";
connectAttr "crane_column_rotateY.o" "crane_column.ry";
connectAttr "crane_arm_rotateX.o" "crane_arm.rx";
connectAttr "crane_plate_rotateX.o" "crane_plate.rx";
connectAttr "crane_head_rotateX.o" "crane_head.rx";
connectAttr "crane_head_rotateY.o" "crane_head.ry";
// End of crane_shot.ma
