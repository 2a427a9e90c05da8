//Maya ASCII 2024 scene
// A tracked shot: a hand-held camera with all six channels solved, four markers that the tracking artist named
// null and wants as layers, and two automatic features that stay behind because nothing in their names says null.
// Every frame from 1001 to 1024, 25 frames a second.
//Name: tracked_markers.ma
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
createNode transform -n "solved_cam";
	setAttr ".t" -type "double3" 12 161 380 ;
createNode camera -n "solved_camShape" -p "solved_cam";
	setAttr -k off ".v";
	setAttr ".cap" -type "double2" 0.9764 0.5492 ;
	setAttr ".fl" 28.4;
	setAttr ".coi" 400;
createNode transform -n "null_doorLeft";
	setAttr ".t" -type "double3" -88.41 4.02 -212.6 ;
createNode locator -n "null_doorLeftShape" -p "null_doorLeft";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "null_doorRight";
	setAttr ".t" -type "double3" 91.77 3.88 -214.05 ;
createNode locator -n "null_doorRightShape" -p "null_doorRight";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "lamp_NULL";
	setAttr ".t" -type "double3" -23.9 236.4 -131.28 ;
createNode locator -n "lamp_NULLShape" -p "lamp_NULL";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "signNull";
	setAttr ".t" -type "double3" 64.13 187.5 -209.9 ;
createNode locator -n "signNullShape" -p "signNull";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "feature_0173";
	setAttr ".t" -type "double3" -140.2 88.1 -96.7 ;
createNode locator -n "feature_0173Shape" -p "feature_0173";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode transform -n "feature_0209";
	setAttr ".t" -type "double3" 133.6 52.75 -41.2 ;
createNode locator -n "feature_0209Shape" -p "feature_0209";
	setAttr -k off ".v";
	setAttr ".los" -type "double3" 5 5 5 ;
createNode lightLinker -s -n "lightLinker1";
	setAttr -s 2 ".lnk";
	setAttr -s 2 ".slnk";
createNode renderLayer -n "defaultRenderLayer";
	setAttr ".g" yes;
createNode script -n "sceneConfigurationScriptNode";
	setAttr ".b" -type "string" "playbackOptions -min 1001 -max 1024 -ast 1001 -aet 1024 ";
	setAttr ".st" 6;
createNode animCurveTL -n "solved_cam_translateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1001 12.5778908 1002 13.1825133 1003 13.3029463 1004 13.4560277 1005 13.8893293 1006 14.228654
		1007 14.0419259 1008 13.525836 1009 13.3414797 1010 13.8029847 1011 14.5228159 1012 14.988401
		1013 15.2600403 1014 15.8232614 1015 16.815172 1016 17.7223593 1017 17.9952863 1018 17.7474367
		1019 17.5819046 1020 17.7899889 1021 18.0274818 1022 17.9003954 1023 17.621881 1024 17.802689;
createNode animCurveTL -n "solved_cam_translateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1001 161.753334 1002 161.676803 1003 161.021588 1004 160.342481 1005 160.228465 1006 160.531077
		1007 160.697103 1008 160.655797 1009 160.87064 1010 161.493206 1011 161.975795 1012 161.793316
		1013 161.190741 1014 160.813719 1015 160.793964 1016 160.685789 1017 160.308582 1018 160.136746
		1019 160.595912 1020 161.350778 1021 161.709237 1022 161.55002 1023 161.375634 1024 161.450424;
createNode animCurveTL -n "solved_cam_translateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1001 380.391663 1002 379.784946 1003 379.105573 1004 378.351086 1005 377.530377 1006 376.662352
		1007 375.77307 1008 374.891803 1009 374.046611 1010 373.260102 1011 372.546009 1012 371.907121
		1013 371.334858 1014 370.810564 1015 370.308336 1016 369.798932 1017 369.254196 1018 368.651313
		1019 367.97626 1020 367.225921 1021 366.408565 1022 365.542589 1023 364.653743 1024 363.771232;
createNode animCurveTA -n "solved_cam_rotateX";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1001 -4.05805539 1002 -4.01214314 1003 -3.88185698 1004 -3.67083312 1005 -3.74751142 1006 -4.09885498
		1007 -4.31852766 1008 -4.36441724 1009 -4.53592073 1010 -4.7474475 1011 -4.63413176 1012 -4.28946517
		1013 -4.10894115 1014 -4.05423601 1015 -3.84267054 1016 -3.63942521 1017 -3.78756661 1018 -4.11689153
		1019 -4.26069543 1020 -4.33264538 1021 -4.58115618 1022 -4.7678929 1023 -4.58865615 1024 -4.28263447;
createNode animCurveTA -n "solved_cam_rotateY";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1001 2.68052878 1002 2.71322855 1003 2.43539375 1004 2.19072754 1005 2.18789082 1006 2.19782966
		1007 2.01148291 1008 1.855096 1009 2.03511521 1010 2.41986843 1011 2.65197436 1012 2.72709815
		1013 2.94576821 1014 3.33191409 1015 3.53488234 1016 3.3948611 1017 3.20179118 1018 3.20338832
		1019 3.21108694 1020 2.97879076 1021 2.6898254 1022 2.69880074 1023 2.9637132 1024 3.14167315;
createNode animCurveTA -n "solved_cam_rotateZ";
	setAttr ".tan" 9;
	setAttr ".wgt" no;
	setAttr -s 24 ".ktv[0:23]"  1001 0.565206827 1002 0.646067129 1003 0.620576884 1004 0.497892467 1005 0.322083461 1006 0.15630238
		1007 0.0600996002 1008 0.0680322103 1009 0.17725073 1010 0.348522675 1011 0.520325291 1012 0.630945202
		1013 0.640646528 1014 0.545944447 1015 0.38085698 1016 0.204685349 1017 0.080712328 1018 0.05347038
		1019 0.13274511 1020 0.29006017 1021 0.468906271 1022 0.605039941 1023 0.649560479 1024 0.58647562;
select -ne :time1;
	setAttr ".o" 1001;
	setAttr ".unw" 1001;
select -ne :renderPartition;
	setAttr -s 2 ".st";
select -ne :defaultResolution;
	setAttr ".w" 2048;
	setAttr ".h" 1152;
	setAttr ".pa" 1;
	setAttr ".dar" 1.7777777777777777;
connectAttr "solved_cam_translateX.o" "solved_cam.tx";
connectAttr "solved_cam_translateY.o" "solved_cam.ty";
connectAttr "solved_cam_translateZ.o" "solved_cam.tz";
connectAttr "solved_cam_rotateX.o" "solved_cam.rx";
connectAttr "solved_cam_rotateY.o" "solved_cam.ry";
connectAttr "solved_cam_rotateZ.o" "solved_cam.rz";
// End of tracked_markers.ma
