//Maya ASCII 2024 scene
// Keys that no record holds yet, when a byte is no part of any word.
createNode camera -n "unbuilt";
createNode animCurveTL -n "x";
	setAttr ".ktv[0:2]" 1 0 2 4 @;
