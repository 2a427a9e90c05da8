//Maya ASCII 2024 scene
// Nothing is read after a selection. The second curve differs from the first in case alone and takes its
// record.
createNode transform -n "dolly";
createNode camera -n "dollyShape" -p "dolly";
createNode animCurveTL -n "dolly_tx";
	setAttr ".ktv[0:1]" 1 0 2 1;
select -ne "dolly_tx";
	setAttr ".ktv[2]" 9 9;
createNode animCurveTL -n "DOLLY_TX";
	setAttr ".ktv[0:1]" 3 3 4 4;
	setAttr ".ktv[2]" 5 5;
connectAttr "dolly_tx.o" "dolly.tx";
