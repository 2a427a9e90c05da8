//Maya ASCII 2024 scene
// A key so late that its time in thousandths of a second is no 32-bit number.
createNode camera -n "eye";
createNode animCurveTL -n "x";
	setAttr ".ktv[0:1]" 1 0 4500000 2;
