//Maya ASCII 2024 scene
// The word that would name the kind of node is missing: one token is taken, and the reading ends in good
// order.
createNode camera -n "kept";
createNode 