//Maya ASCII 2024 scene
// A camera under a circle of two transforms.
createNode transform -n "hen" -p "egg";
createNode transform -n "egg" -p "hen";
createNode camera -n "henShape" -p "hen";
