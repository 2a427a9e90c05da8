//Maya ASCII 2024 scene
// The resolution is selected, and the text ends in the option's blank.
select -ne :defaultResolution 