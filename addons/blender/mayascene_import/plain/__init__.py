"""What needs no Blender: the composition, its channels, the tool's run."""
