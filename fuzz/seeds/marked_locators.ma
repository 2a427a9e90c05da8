//Maya ASCII 2020 scene
/* two marked locators
   under one chain; a third is not marked */
createNode camera -s -n "persp\"Shape";
	setAttr ".o" no;
createNode transform -n "world";
createNode transform -n "points" -p "world";
	setAttr ".s" 2 -1 0.5;
createNode transform -n "p1" -p "points";
	setAttr ".t" 1 2 3;
createNode locator -n "p1_nullShape" -p "p1";
createNode transform -n "p2" -p "points";
createNode locator -parent "p2" -name "NULL2";
createNode transform -n "p3" -p "points";
createNode locator -n "p3Shape" -p "p3"; // not this one
createNode animCurveTL -n "x";
	setAttr -s 3 ".ktv[0:2]" 1 -2.5 2 0 4 1e1;
connectAttr "x.output" "p2.translateX";
connectAttr "x.o" "world.sy";
