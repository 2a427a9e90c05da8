//Maya ASCII 2024 scene
// Two curves without a name, of two kinds, each with keys.
createNode animCurveTL;
	setAttr ".ktv[0:1]" 1 0 2 1;
createNode animCurveTU;
	setAttr ".ktv[0]" 1 3;
createNode camera -n "beside";
