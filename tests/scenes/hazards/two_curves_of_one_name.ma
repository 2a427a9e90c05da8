//Maya ASCII 2024 scene
// Two curves of one name: the second takes the first one's record, and its three keys move the camera.
createNode transform -n "dolly";
createNode camera -n "dollyShape" -p "dolly";
createNode animCurveTL -n "dolly_tx";
	setAttr ".ktv[0:1]" 1 0 2 5;
createNode animCurveTL -n "dolly_tx";
	setAttr ".ktv[0:2]" 1 7 2 8 3 9;
connectAttr "dolly_tx.o" "dolly.tx";
