//Maya ASCII 2024 scene
// What a valid scene may hold: under a rig another node of the rig's name.
createNode transform -n "crane";
	setAttr ".t" -type "double3" 0 0 8 ;
createNode transform -n "crane" -p "crane";
	setAttr ".t" -type "double3" 0 0 20 ;
createNode transform -n "take" -p "crane";
createNode camera -n "takeShape" -p "take";
