//Maya ASCII 2024 scene
// An option takes the semicolon that follows for its value, so the next command is lost.
createNode animCurveTL -n "x";
	setAttr -keyable;
createNode camera -n "swallowed";
createNode camera -n "read";
