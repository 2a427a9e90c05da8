//Maya ASCII 2024 scene
// A width that no integer holds is held at the largest one.
select -ne :defaultResolution;
	setAttr ".w" 4e200;
	setAttr ".h" 1080;
	setAttr ".pa" 1;
createNode camera -n "wide";
