"""Runs inside Blender: imports .chan files onto cameras and measures them."""

import sys

import bpy

sys.path.insert(0, sys.argv[sys.argv.index("--") + 1])

from blender_measure import measure, write  # noqa: E402
from blender_session import read_job  # noqa: E402


def _camera(name):
    """A new camera, which is the active object."""
    item = bpy.data.objects.new(name, bpy.data.cameras.new(name))
    item.rotation_mode = 'QUATERNION'
    bpy.context.scene.collection.objects.link(item)
    bpy.context.view_layer.objects.active = item
    return item


def _run(job):
    bpy.ops.wm.read_factory_settings(use_empty=True)
    bpy.ops.preferences.addon_enable(module="io_anim_nuke_chan")
    render = bpy.context.scene.render
    render.resolution_x, render.resolution_y = job["size"]
    named = {}
    for camera in job["cameras"]:
        named[camera["name"]] = _camera(camera["name"])
        bpy.ops.import_scene.import_chan(
            filepath=camera["file"], z_up=True, rotation_order='XYZ',
            sensor_width=camera["film"][0], sensor_height=camera["film"][1])
    frames = [(frame["label"], frame["number"]) for frame in job["frames"]]
    write(job["output"], {"frames": measure(frames, named)})


for one in read_job():
    _run(one)
