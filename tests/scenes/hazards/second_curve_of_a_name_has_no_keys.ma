//Maya ASCII 2024 scene
// Two curves of one name: the second, which has no keys, takes the first one's record, and nothing moves.
createNode transform -n "dolly";
createNode camera -n "dollyShape" -p "dolly";
createNode animCurveTL -n "dolly_tx";
	setAttr ".ktv[0:1]" 1 0 2 5;
createNode animCurveTL -n "dolly_tx";
	setAttr ".tan" 18;
connectAttr "dolly_tx.o" "dolly.tx";
