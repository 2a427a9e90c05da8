//Maya ASCII 2024 scene
// A letter with an accent, in an encoding of one byte, where a command would start.
createNode transform -n "café";
étude -n "x";
