//Maya ASCII 2024 scene
// A key time that is larger than every double.
createNode camera -n "unbuilt";
createNode animCurveTL -n "x";
	setAttr ".ktv[0:1]" 1 0 2e400 1;
