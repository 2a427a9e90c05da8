"""Where the add-on lies; its part that needs no Blender can be imported."""

import sys
from pathlib import Path

ADDON = (Path(__file__).resolve().parents[2]
         / "addons" / "blender" / "mayascene_import")

sys.path.insert(0, str(ADDON))
