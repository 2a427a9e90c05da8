//Maya ASCII 2024 scene
// A node is named, and the text ends before the command does.
createNode camera -n "late" -p "dolly"