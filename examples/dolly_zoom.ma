//Maya ASCII 2024 scene
// A dolly with zoom: the camera rolls back from the actor at the origin while the lens grows longer at the same
// rate, so that the actor keeps their size and the room in the background closes in. The focal length is animated.
// Baked at every fourth frame, 24 frames a second.
//Name: dolly_zoom.ma
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
createNode transform -n "vertigo_cam";
	setAttr ".t" -type "double3" 0 158 210 ;
createNode camera -n "vertigo_camShape" -p "vertigo_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 1.4173 0.7972 ;
	setAttr ".fl" 21;
	setAttr ".coi" 210;
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1 -max 93 -ast 1 -aet 93 ";
	setAttr ".st" 6;
createNode animCurveTL -n "vertigo_cam_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 210 5 210.530766 9 213.965681 13 222.472404 17 237.485322 21 259.782734
		25 289.564038 29 326.526921 33 369.94454 37 418.742715 41 471.57711 45 526.910424
		49 583.089576 53 638.42289 57 691.257285 61 740.05546 65 783.473079 69 820.435962
		73 850.217266 77 872.514678 81 887.527596 85 896.034319 89 899.469234 93 900;
createNode animCurveTU -n "vertigo_camShape_focalLength";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1 21 5 21.0530766 9 21.3965681 13 22.2472404 17 23.7485322 21 25.9782734
		25 28.9564038 29 32.6526921 33 36.994454 37 41.8742715 41 47.157711 45 52.6910424
		49 58.3089576 53 63.842289 57 69.1257285 61 74.005546 65 78.3473079 69 82.0435962
		73 85.0217266 77 87.2514678 81 88.7527596 85 89.6034319 89 89.9469234 93 90;
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
connectAttr "vertigo_cam_translateZ.o" "vertigo_cam.tz";
connectAttr "vertigo_camShape_focalLength.o" "vertigo_camShape.fl";
// End of dolly_zoom.ma
