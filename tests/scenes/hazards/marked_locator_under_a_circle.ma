//Maya ASCII 2024 scene
// A marked locator under a transform that hangs under itself.
createNode camera -n "eye";
createNode transform -n "loop" -p "loop";
createNode locator -n "loop_nullShape" -p "loop";
