//Maya ASCII 2024 scene
// A whole scene whose closing comment has no line end.
requires maya "2024";
requires "stereoCamera" "10.0";
currentUnit -l centimeter -a degree -t film;
fileInfo "application" "maya";
fileInfo "osv" "Linux 5.14 x86_64 #1 SMP (\"PREEMPT\")\n";
createNode transform -s -n "persp";
	rename -uid "5B1C0E5A-0001-4D11-9C00-000000000005";
	setAttr ".v" no;
	setAttr ".t" -type "double3" 0 100.1 0 ;
createNode camera -s -n "perspShape" -p "persp";
	setAttr -k off ".v" no;
	setAttr ".fl" 34.999999999999993;
	setAttr ".hc" -type "string" "viewSet -p %camera";
createNode transform -n "done";
createNode camera -n "doneShape" -p "done";
select -ne :defaultResolution;
	setAttr ".w" 1920;
	setAttr ".h" 1080;
	setAttr ".pa" 1;
// End of scene