""".chan files in Blender, by the importer that comes with it."""

import os

import blender
import exports
from comparison import compare

_MILLIMETRES_PER_POINT = 25.4 / 72.0


def _names(composition):
    """The format has no nulls."""
    return {camera.number: f"camera{camera.number}"
            for camera in composition.cameras()}


def _film(composition, camera):
    """The film back in millimetres, with the aspect of the picture."""
    size = camera.film["points"] * _MILLIMETRES_PER_POINT
    if camera.film["direction"] == "vertical":
        return [size * composition.width / composition.height, size]
    return [size, size * composition.height / composition.width]


def file_of(composition, camera, path):
    """Several cameras have a file each."""
    if len(composition.cameras()) == 1:
        return path
    return f"{path.removesuffix('.chan')}.{camera.name}.chan"


def _frames(composition):
    """Every frame where a lens moves, because Blender holds it."""
    moves = any(composition.lens_moves(camera)
                for camera in composition.cameras())
    return exports.frames_of(composition, 0.0, 1.0, 1 if moves else 10)


def _job(scene, path, folder):
    composition = scene.composition
    names = _names(composition)
    return {"size": [composition.width, composition.height],
            "frames": _frames(composition),
            "cameras": [{"name": names[camera.number],
                         "file": file_of(composition, camera, path),
                         "film": _film(composition, camera)}
                        for camera in composition.cameras()],
            "output": os.path.join(folder, scene.name + ".chan.json")}


def through_blender(scenes, files, folder):
    jobs = [_job(scene, files[scene.name], folder) for scene in scenes]
    blender.run("blender_chan.py", jobs, folder)
    for scene, job in zip(scenes, jobs):
        found = blender.read(job["output"])
        yield scene, compare(scene.composition, found["frames"],
                             _names(scene.composition), blender.to_blender(),
                             "single")
