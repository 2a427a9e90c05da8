//Maya ASCII 2024 scene
// A name without its second quote swallows the rest of the text.
createNode camera -n "unfinished;
createNode camera -n unseen;
