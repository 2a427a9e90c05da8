"""glTF in Blender, in three, in assimp; the lens; the validator."""

import math
import os
import subprocess

import assimp
import blender
import browser
import exports
import gltf
from comparison import LIMIT_SINGLE, compare
from scenes import ROOT


def _names(composition):
    return {layer.number: f"layer{index}"
            for index, layer in enumerate(composition.layers)}


def _frames(scene, path):
    document, _ = gltf.read(path)
    start = document["scenes"][0]["extras"]["firstSeconds"]
    return exports.frames_of(scene.composition, start,
                             1.0 / scene.composition.rate)


def _held(scene, measured, to_program, precision="single"):
    """A lens that moves is held by the reader of these tests; programs show
    that of the first frame."""
    return compare(scene.composition, measured, _names(scene.composition),
                   to_program, precision, lens_at=scene.composition.start)


def through_blender(scenes, files, folder):
    jobs = []
    for scene in scenes:
        composition = scene.composition
        fps = math.ceil(composition.rate)
        jobs.append({
            "file": gltf.numbered(files[scene.name]), "fps": fps,
            "fps_base": fps / composition.rate,
            "size": [composition.width, composition.height],
            "frames": _frames(scene, files[scene.name]),
            "output": os.path.join(folder, scene.name + ".gltf.json")})
    blender.run("blender_gltf.py", jobs, folder)
    for scene, job in zip(scenes, jobs):
        found = blender.read(job["output"])
        yield scene, _held(scene, found["frames"],
                           blender.to_blender(scene.metres()))


def through_three(scenes, files, folder):
    jobs = [{"file": files[scene.name],
             "frames": _frames(scene, files[scene.name]),
             "output": os.path.join(folder, scene.name + ".three.json")}
            for scene in scenes]
    browser.run(jobs, folder)
    for scene, job in zip(scenes, jobs):
        found = blender.read(job["output"])
        yield scene, _held(scene, found["frames"], in_metres(scene))


def through_assimp(scenes, files, folder):
    for scene in scenes:
        plain = gltf.without_lens(gltf.numbered(files[scene.name]))
        found = assimp.measure(plain, _frames(scene, files[scene.name]),
                               folder)
        yield scene, _held(scene, found, in_metres(scene), "six digits")


def in_metres(scene):
    unit = scene.metres()
    return lambda point: [part * unit for part in point]


def lens_problems(scenes, files):
    """The rows of the lens, and what is wrong."""
    moving = 0
    worst = 0.0
    for scene in scenes:
        off, count = gltf.worst_lens(scene.composition, files[scene.name])
        worst, moving = max(worst, off), moving + count
    problems = []
    if worst > LIMIT_SINGLE:
        problems.append(f"glTF: a lens is {worst:.3g} px off at the edge")
    if moving == 0:
        problems.append("glTF: no lens moves in these scenes")
    return worst, moving, problems


def validator_problems(files):
    done = subprocess.run(
        [os.path.join(ROOT, "scripts", "validate-gltf"), *files],
        capture_output=True, text=True, errors="replace", check=False)
    if done.returncode == 0:
        return []
    return ["validator: " + done.stdout[-2000:] + done.stderr[-500:]]
