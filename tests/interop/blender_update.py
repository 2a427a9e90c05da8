"""Runs inside Blender: imports a scene twice, with a user's work between.

Its arguments are this folder and a JSON file: the add-on's folder, the tool,
and two scenes that lie at one path, one after the other.
"""

import json
import shutil
import sys

import bpy

sys.path.insert(0, sys.argv[sys.argv.index("--") + 1])

from blender_session import begin, read_job  # noqa: E402


def _import(job, scene):
    shutil.copyfile(scene, job["place"])
    bpy.ops.import_scene.mayascene(filepath=job["place"])


def _curves(owner):
    data = owner.animation_data
    if data is None or data.action is None:
        return 0
    return len(data.action.fcurves)


def _work_of_a_user(camera, root):
    """What a second import has to leave."""
    root.location = (5.0, 6.0, 7.0)
    camera.data.dof.use_dof = True
    camera["note"] = "mine"
    camera.constraints.new('LIMIT_SCALE').name = "mine"
    child = bpy.data.objects.new("mine", None)
    child.parent = camera
    bpy.context.scene.collection.objects.link(child)
    camera.keyframe_insert("hide_render", frame=3)
    camera.name = "renamed"


def _state():
    items = {item["mayascene_layer"]: item for item in bpy.data.objects
             if "mayascene_layer" in item}
    camera = next(item for item in items.values() if item.type == 'CAMERA')
    return items, camera


def _facts(items, camera):
    return {
        "layers": sorted(items),
        "objects": len(bpy.data.objects),
        "cameras": len(bpy.data.cameras),
        "actions": len(bpy.data.actions),
        "collections": len(bpy.data.collections),
        "curves": _curves(camera),
        "name": camera.name,
        "place": list(camera.matrix_world.translation),
        "range": [bpy.context.scene.frame_start, bpy.context.scene.frame_end],
        "root": list(items["root"].location),
        "depth of field": camera.data.dof.use_dof,
        "property": camera.get("note"),
        "constraints": [item.name for item in camera.constraints],
        "child": [item.name for item in camera.children],
        "hidden": camera.animation_data.action.fcurves.find(
            "hide_render") is not None,
        "active": bpy.context.scene.camera.name,
    }


def main():
    job = read_job()
    begin(job["addons"], job["tool"])
    _import(job, job["before"])
    items, camera = _state()
    facts = [_facts(items, camera)]
    _work_of_a_user(camera, items["root"])
    _import(job, job["after"])
    facts.append(_facts(*_state()))
    with open(job["output"], "w", encoding="utf-8") as file:
        json.dump(facts, file)


main()
