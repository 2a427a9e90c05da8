"""Runs inside Blender: imports scenes with the add-on and measures them.

Its one argument is a JSON file: the add-on's folder, the tool, and the jobs:
a scene, whether to bake, the frames, and where to write.
"""

import sys

import bpy

sys.path.insert(0, sys.argv[sys.argv.index("--") + 1])

from blender_measure import measure, write  # noqa: E402
from blender_session import begin, read_job  # noqa: E402


def _import(job):
    bpy.ops.import_scene.mayascene(filepath=job["scene"], bake=job["bake"],
                                   metres=job["metres"])


def _run(job):
    _import(job)
    scene = bpy.context.scene
    named = {item["mayascene_layer"]: item for item in bpy.data.objects
             if "mayascene_layer" in item}
    frames = [(frame, frame + job["first"]) for frame in job["frames"]]
    render = scene.render
    write(job["output"], {
        "frames": measure(frames, named),
        "range": [scene.frame_start, scene.frame_end],
        "rate": render.fps / render.fps_base,
        "size": [render.resolution_x, render.resolution_y],
        "aspect": render.pixel_aspect_x / render.pixel_aspect_y,
        "active": scene.camera["mayascene_layer"],
    })


def main():
    jobs = read_job()
    for job in jobs["jobs"]:
        begin(jobs["addons"], job["tool"])
        _run(job)


main()
