"""Runs inside Blender: imports glTF files and measures them."""

import sys

import bpy

sys.path.insert(0, sys.argv[sys.argv.index("--") + 1])

from blender_measure import measure, write  # noqa: E402
from blender_session import read_job  # noqa: E402


def _run(job):
    bpy.ops.wm.read_factory_settings(use_empty=True)
    bpy.ops.preferences.addon_enable(module="io_scene_gltf2")
    scene = bpy.context.scene
    scene.render.fps = job["fps"]
    scene.render.fps_base = job["fps_base"]
    scene.render.resolution_x, scene.render.resolution_y = job["size"]
    bpy.ops.import_scene.gltf(filepath=job["file"])
    named = {item.name: item for item in bpy.data.objects}
    rate = job["fps"] / job["fps_base"]
    frames = [(frame["label"], frame["time"] * rate)
              for frame in job["frames"]]
    write(job["output"], {"frames": measure(frames, named)})


for one in read_job():
    _run(one)
