"""What the add-on cannot import is an error in words, and builds nothing."""

import json
import os

import blender

_HEAD = "//Maya ASCII 2023 scene\n"

# A scene, whether it is baked, and what the error has to say.
_CASES = {
    "no picture": (
        _HEAD + 'createNode transform -n "rig";\n', True,
        "the scene has no cameras to import"),
    "a start-up camera alone": (
        _HEAD + 'createNode camera -n "perspShape";\n', False,
        "the scene has no cameras to import"),
    "no scene": ("just some notes\n", True, "this is not a Maya ASCII scene"),
    "no file": (None, True, "the file cannot be read"),
    "no tool": (_HEAD, True, "no_tool cannot be started"),
}


def _scene(folder, number, text):
    path = os.path.join(folder, f"refused_{number}.ma")
    if text is not None:
        with open(path, "w", encoding="utf-8") as file:
            file.write(text)
    return path


def problems(tool, addons, folder):
    """What is wrong, in words."""
    jobs = [{"name": name, "bake": bake, "scene": _scene(folder, number, text),
             "tool": os.path.join(folder, "no_tool") if name == "no tool"
             else tool}
            for number, (name, (text, bake, _)) in enumerate(_CASES.items())]
    output = os.path.join(folder, "refusals.json")
    blender.run("blender_refusals.py",
                {"addons": addons, "jobs": jobs, "output": output}, folder)
    with open(output, encoding="utf-8") as file:
        said = json.load(file)
    found = []
    for name, (_, _, wanted) in _CASES.items():
        error, objects = said[name]
        if not error.startswith("Error: ") or wanted not in error:
            found.append(f'{name}: the add-on says "{error}", not "{wanted}"')
        if objects != 0:
            found.append(f"{name}: {objects} objects are made")
    return found
