//Maya ASCII 2024 scene
// A camera under a transform that hangs under itself.
createNode transform -n "loop" -p "loop";
	setAttr ".t" 1 2 3;
createNode camera -n "loopShape" -p "loop";
