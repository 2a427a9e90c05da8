//Maya ASCII 2024 scene
// Keys that no record holds yet, when a number fails.
createNode camera -n "unbuilt";
createNode animCurveTL -n "x";
	setAttr ".ktv[0:2]" 1 0 2 4 3 --1;
