//Maya ASCII 2024 scene
// A comment whose last byte could begin its end.
createNode camera -n "unseen";
/* a ** b *