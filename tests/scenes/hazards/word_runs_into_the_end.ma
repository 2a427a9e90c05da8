//Maya ASCII 2024 scene
// The last word has nothing after it, not even a line end.
createNode transform -n "slate";
connectAt