//Maya ASCII 2024 scene
// Triples that end early: a scale of one number, a pivot of none.
createNode transform -n "short";
	setAttr ".s" -type "double3" 3;
	setAttr ".sp" -type "double3";
	setAttr ".t" -type "double3" 2;
createNode camera -n "shortShape" -p "short";
