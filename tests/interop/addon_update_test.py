"""A second import updates what the first made and leaves a user's work."""

import json
import os

import blender

# What a user did between the imports, and what has to be left of it.
_LEFT = {"root": [5.0, 6.0, 7.0], "depth of field": True, "property": "mine",
         "constraints": ["mine"], "child": ["mine"], "hidden": True,
         "name": "renamed", "active": "renamed"}

# What a second import makes no second time.
_SAME = ("layers", "cameras", "collections")


def _changed(path, place):
    """The scene with its camera 50 units higher, played two frames longer."""
    with open(path, encoding="utf-8") as file:
        text = file.read()
    for before, after in (('"double3" 0 158 210 ', '"double3" 0 208 210 '),
                          ("-max 93 ", "-max 95 ")):
        if text.count(before) != 1:
            raise AssertionError(f"the scene has no single {before}")
        text = text.replace(before, after)
    with open(place, "w", encoding="utf-8") as file:
        file.write(text)


def problems(scene, tool, addons, folder):
    """What is wrong, in words."""
    job = {"addons": addons, "tool": tool, "before": scene.path,
           "after": os.path.join(folder, "after.ma"),
           "place": os.path.join(folder, "shot.ma"),
           "output": os.path.join(folder, "update.json")}
    _changed(scene.path, job["after"])
    blender.run("blender_update.py", job, folder)
    with open(job["output"], encoding="utf-8") as file:
        before, after = json.load(file)
    found = [f"{name} is {after[name]}, not {wanted}"
             for name, wanted in _LEFT.items() if after[name] != wanted]
    found += [f"{name} were {before[name]}, are {after[name]}"
              for name in _SAME if before[name] != after[name]]
    if after["objects"] != before["objects"] + 1:
        found.append(f"{after['objects']} objects after {before['objects']}")
    if after["curves"] != before["curves"] + 1:
        found.append(f"{after['curves']} curves after {before['curves']}")
    rise = [b - a for a, b in zip(before["place"], after["place"])]
    wanted = 5.0, 6.0, 7.0 + 50.0 * scene.metres()
    if any(abs(a - b) > 1e-4 for a, b in zip(rise, wanted)):
        found.append(f"the camera rose by {rise}")
    if after["range"][1] != before["range"][1] + 2:
        found.append(f"the range is {after['range']}")
    return found
