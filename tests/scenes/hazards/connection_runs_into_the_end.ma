//Maya ASCII 2024 scene
// A source without a destination, and no more text.
createNode transform -n "dolly";
connectAttr "dolly_tx.output"
	