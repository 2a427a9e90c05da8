"""The Blender add-on: scenes imported by it, held against the composition.

Every frame's pixels agree, and a second import updates what the first one
made and leaves what users added.
"""

import os

import blender
from comparison import compare


def keys_of(composition):
    """The names of the add-on's layers, by the layers' numbers."""
    seen, keys = {}, {}
    for layer in composition.layers:
        path = "/".join(link.name for link
                        in reversed(composition.chain(layer)))
        path = ("camera:" if layer.camera else "null:") + path
        seen[path] = seen.get(path, 0) + 1
        keys[layer.number] = f"{path}#{seen[path]}"
    return keys


def _job(scene, tool, folder, every):
    return {"tool": tool, "scene": scene.path, "bake": scene.bake,
            "metres": True, "frames": scene.composition.frames(every),
            "first": scene.composition.first,
            "output": os.path.join(
                folder, f"{scene.name}.{int(scene.bake)}.addon.json")}


def _check_settings(composition, found, result):
    wanted = {
        "range": composition.range(),
        "rate": composition.rate,
        "size": [composition.shown_width, composition.shown_height],
        "aspect": composition.pixel_aspect}
    for name, value in wanted.items():
        pairs = zip(_listed(value), _listed(found[name]))
        if any(abs(a - b) > 1e-6 * abs(a) for a, b in pairs):
            result.fail(f"the {name} is {found[name]}, not {value}")


def _listed(value):
    return value if isinstance(value, list) else [value]


def measure(scenes, tool, addons, folder, every=1):
    """The result of each scene."""
    jobs = [_job(scene, tool, folder, every) for scene in scenes]
    blender.run("blender_addon.py", {"addons": addons, "jobs": jobs}, folder)
    results = []
    for scene, job in zip(scenes, jobs):
        found = blender.read(job["output"])
        composition = scene.composition
        part = (composition.shown_width * composition.pixel_aspect
                / composition.width,
                composition.shown_height / composition.height)
        result = compare(composition, found["frames"], keys_of(composition),
                         blender.to_blender(scene.metres()), "single", part)
        _check_settings(composition, found, result)
        results.append(result)
    return results
