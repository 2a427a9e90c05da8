"""Scenes, imported by the tool."""

import json
import os
import subprocess

from composition import Composition

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(
    os.path.abspath(__file__))))

METRES = {"mm": 0.001, "millimeter": 0.001, "cm": 0.01, "centimeter": 0.01,
          "m": 1.0, "meter": 1.0, "km": 1000.0, "kilometer": 1000.0,
          "in": 0.0254, "inch": 0.0254, "ft": 0.3048, "foot": 0.3048,
          "yd": 0.9144, "yard": 0.9144, "mi": 1609.344, "mile": 1609.344}

# Chains of parents, an animated lens, a fast rate, many frames, film fitted
# to the height, a stereo rig, and one scene in metres.
SHOTS = ("focal_from_transform", "look_at_80fps", "look_at_with_curves",
         "short_film_shot_3", "solve_zxy", "stereo_rig_shot", "turntable",
         "walk_render_cam")


class Scene:
    def __init__(self, path, tool, bake=True):
        self.path = path
        self.bake = bake
        self.name = os.path.splitext(os.path.basename(path))[0]
        words = [tool, "import", "--quiet", "--linear-units", "0", "--json",
                 "-", path] + (["--bake"] if bake else [])
        done = subprocess.run(words, capture_output=True, check=False)
        document = json.loads(done.stdout)["scenes"][0]
        self.imported = document["outcome"] == "imported"
        if self.imported:
            self.composition = Composition(document)

    def metres(self):
        """Of one unit of the scene's lengths; 1 where it is not known."""
        return METRES.get(self.composition.linear_unit, 1.0)


def examples(tool, bake=True):
    folder = os.path.join(ROOT, "examples")
    return [Scene(os.path.join(folder, name), tool, bake)
            for name in sorted(os.listdir(folder)) if name.endswith(".ma")]


# A camera on a rig that turns, with a lens that moves, before frame 0.
_BEFORE_ZERO = """//Maya ASCII 2023 scene
currentUnit -l centimeter -a degree -t film;
createNode transform -n "rig";
\tsetAttr ".t" -type "double3" 30 120 -40;
createNode transform -n "before" -p "rig";
createNode camera -n "beforeShape" -p "before";
createNode animCurveTL -n "before_tz";
\tsetAttr ".tan" 2;
\tsetAttr -s 2 ".ktv[0:1]"  -36 250 -12 130;
createNode animCurveTA -n "rig_ry";
\tsetAttr ".tan" 2;
\tsetAttr -s 3 ".ktv[0:2]"  -36 0 -24 40 -12 -25;
createNode animCurveTU -n "before_fl";
\tsetAttr ".tan" 2;
\tsetAttr -s 2 ".ktv[0:1]"  -36 35 -12 50;
createNode script -n "sceneConfigurationScriptNode";
\tsetAttr ".b" -type "string" "playbackOptions -min -36 -max -12";
\tsetAttr ".st" 6;
connectAttr "before_tz.o" "before.tz";
connectAttr "rig_ry.o" "rig.ry";
connectAttr "before_fl.o" "beforeShape.fl";
"""


def before_zero(tool, folder):
    path = os.path.join(folder, "frames_before_zero.ma")
    with open(path, "w", encoding="utf-8") as file:
        file.write(_BEFORE_ZERO)
    return Scene(path, tool)


def shots(tool):
    """Those that are there, and how many are not."""
    folder = os.path.join(os.path.dirname(ROOT), "shared", "shots")
    paths = [os.path.join(folder, name + ".ma") for name in SHOTS]
    there = [path for path in paths if os.path.isfile(path)]
    return [Scene(path, tool) for path in there], len(paths) - len(there)
