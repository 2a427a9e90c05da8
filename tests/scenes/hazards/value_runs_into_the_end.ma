//Maya ASCII 2024 scene
// Three numbers of a position, and the text ends before the command does.
createNode transform -n "dolly";
	setAttr ".translate" -type "double3" 4 5 6 