""".usda files in three; the head and the lens by the reader of these tests.
"""

import os

import blender
import browser
import exports
import usda
from comparison import LIMIT_DOUBLE, compare
from gltf_test import in_metres


class Stage:
    """A file, and the prim of each layer."""

    def __init__(self, scene, path):
        self.composition = scene.composition
        self.root = usda.read(path)
        self.prims = {}
        self._take(self.root.children[0], None)

    def _take(self, prim, above):
        """Layers are the children of a prim, in their order."""
        children = [child for child in prim.children
                    if child.kind == "Xform"]
        layers = [layer for layer in self.composition.layers
                  if layer.above == above]
        if [child.name for child in children] != [
                layer.name for layer in layers]:
            raise exports.ExportFailed(
                f'the prims below "{prim.prim}" are not the layers')
        for layer, child in zip(layers, children):
            self.prims[layer.number] = child
            self._take(child, layer.number)

    def lens(self, camera):
        below = [child for child in self.prims[camera.number].children
                 if child.kind == "Camera"]
        if len(below) != 1:
            raise exports.ExportFailed(
                f'"{camera.name}" has {len(below)} lenses')
        return below[0]

    def names(self):
        """A camera is the prim of its lens."""
        return {layer.number: (self.lens(layer) if layer.camera
                               else self.prims[layer.number]).prim
                for layer in self.composition.layers}

    def shown_lens(self):
        """The frame whose lens three shows: frame 0, else the first one."""
        frames = self.composition.frames()
        zero = -self.composition.first
        return zero if zero in frames else frames[0]

    def head_problems(self, scene):
        first, last = self.composition.range()
        wanted = {"metersPerUnit": scene.metres(), "upAxis": "Y",
                  "timeCodesPerSecond": self.composition.rate,
                  "startTimeCode": first, "endTimeCode": last}
        return [f"{scene.name}: {name} is {self.root.values.get(name)}, not "
                f"{value}" for name, value in wanted.items()
                if self.root.values.get(name) != value]

    def zooms(self, camera, time):
        """In pixels, across the picture and up."""
        lens = self.lens(camera)
        focal = lens.number_at("focalLength", time)
        return [focal * size / lens.number_at(side + "Aperture", time)
                for side, size in (("horizontal", self.composition.width),
                                   ("vertical", self.composition.height))]

    def worst_lens(self):
        """By how many pixels the edge of the picture is off, at any frame.
        """
        worst = 0.0
        composition = self.composition
        for camera in composition.cameras():
            for frame in composition.frames():
                wanted = composition.zoom(camera, frame)
                found = self.zooms(camera, composition.number_of(frame))
                for zoom, size in zip(found, (composition.width,
                                              composition.height)):
                    worst = max(worst, abs(zoom / wanted - 1) * size / 2)
        return worst


def lens_problems(scenes, files):
    """The largest difference, how many lenses move, and what is wrong."""
    worst, moving, problems = 0.0, 0, []
    for scene in scenes:
        stage = Stage(scene, files[scene.name])
        problems += stage.head_problems(scene)
        worst = max(worst, stage.worst_lens())
        moving += sum(scene.composition.lens_moves(camera)
                      for camera in scene.composition.cameras())
    if worst > LIMIT_DOUBLE:
        problems.append(f"USD: a lens is {worst:.3g} px off at the edge")
    if moving == 0:
        problems.append("USD: no lens moves in these scenes")
    return worst, moving, problems


def through_three(scenes, files, folder):
    """A lens that moves is held by the reader of these tests; three shows
    one of its frames."""
    stages = [Stage(scene, files[scene.name]) for scene in scenes]
    jobs = []
    for scene, stage in zip(scenes, stages):
        composition = scene.composition
        jobs.append({
            "file": files[scene.name],
            "frames": exports.frames_of(
                composition,
                composition.number_of(composition.start) / composition.rate,
                1.0 / composition.rate),
            "output": os.path.join(folder, scene.name + ".usd.json")})
    browser.run(jobs, folder)
    for scene, stage, job in zip(scenes, stages, jobs):
        found = blender.read(job["output"])
        yield scene, compare(scene.composition, found["frames"],
                             stage.names(), in_metres(scene), "single",
                             lens_at=stage.shown_lens())
