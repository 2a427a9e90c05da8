"""Text files in double precision, by readers of the tests' own.

Nothing between the composition and the pixel is single here: the places, and
the pixels of known points, are held to the limit of doubles.
"""

import csv
import math

import exports
from chan_test import file_of
from comparison import compare
from composition import about, diagonal, multiplied, shifted
from usd_test import Stage


def _turned(degrees):
    """About x first, then y, then z."""
    x, y, z = (about(axis, angle) for axis, angle in enumerate(degrees))
    return multiplied(multiplied(z, y), x)


def _local(place, degrees, scale=(1, 1, 1)):
    return multiplied(multiplied(shifted(*place), _turned(degrees)),
                      diagonal(*scale))


def _projection(composition, zoom, zoom_up=None):
    """Of a camera that looks along -z."""
    across = 2 * zoom / composition.width
    up = 2 * (zoom_up or zoom) / composition.height
    return [[across, 0, 0, 0], [0, up, 0, 0], [0, 0, -1, 0], [0, 0, -1, 0]]


def _same(point):
    return point


def _held(scene, measured, layers):
    names = {layer.number: layer.number for layer in layers}
    return compare(scene.composition, measured, names, _same, "double")


_OPERATIONS = {
    "xformOp:translate": lambda value: shifted(*value),
    "xformOp:rotateXYZ": _turned,
    "xformOp:scale": lambda value: diagonal(*value),
}


def _prim_world(prim, time):
    made = diagonal(1, 1, 1)
    while prim is not None:
        local = diagonal(1, 1, 1)
        for name in prim.values.get("xformOpOrder", []):
            local = multiplied(local, _OPERATIONS[name](
                prim.vector_at(name, time)))
        made, prim = multiplied(local, made), prim.above
    return made


def through_usd(scenes, files):
    for scene in scenes:
        composition = scene.composition
        stage = Stage(scene, files[scene.name])
        measured = {}
        for frame in composition.frames(10):
            time = composition.number_of(frame)
            measured[frame] = found = {}
            for layer in composition.layers:
                prim = (stage.lens(layer) if layer.camera
                        else stage.prims[layer.number])
                found[layer.number] = {
                    "world": _prim_world(prim, time),
                    "projection": _projection(
                        composition, *stage.zooms(layer, time))
                    if layer.camera else None}
        yield scene, _held(scene, measured, composition.layers)


def _chan_rows(path):
    with open(path, encoding="ascii") as file:
        rows = [[float(word) for word in line.split("\t")] for line in file]
    return {row[0]: row[1:] for row in rows}


def through_chan(scenes, files):
    """Every frame: a lens that moves is held here as well."""
    for scene in scenes:
        composition = scene.composition
        cameras = composition.cameras()
        measured = {frame: {} for frame in composition.frames()}
        for camera in cameras:
            rows = _chan_rows(file_of(composition, camera, files[scene.name]))
            for frame, found in measured.items():
                row = rows[composition.number_of(frame)]
                half = math.tan(math.radians(row[6]) / 2)
                found[camera.number] = {
                    "world": _local(row[:3], row[3:6]),
                    "projection": _projection(
                        composition, composition.height / 2 / half)}
        yield scene, _held(scene, measured, cameras)


def _numbers(row, *names):
    return [float(row[name]) for name in names]


class _Table:
    """The rows of a frame by the layers' own numbers in the table."""

    def __init__(self, path):
        self.frames = {}
        with open(path, encoding="utf-8", newline="") as file:
            for row in csv.DictReader(file):
                self.frames.setdefault(float(row["frame"]), {})[
                    int(row["number"])] = row

    def world(self, frame, number):
        made = diagonal(1, 1, 1)
        while number:
            row = self.frames[frame][int(number)]
            made = multiplied(_local(_numbers(row, "tx", "ty", "tz"),
                                     _numbers(row, "rx", "ry", "rz"),
                                     _numbers(row, "sx", "sy", "sz")), made)
            number = row["parent"]
        return made

    def problems(self, name, rate):
        """Of what the table says twice."""
        for frame, rows in self.frames.items():
            for number, row in rows.items():
                world = self.world(frame, number)
                place = _numbers(row, "wx", "wy", "wz")
                off = math.dist(place, [line[3] for line in world[:3]])
                if off > 1e-9 * max(1.0, *map(abs, place)):
                    yield f"{name}, csv: two places at frame {frame}"
                if abs(float(row["seconds"]) * rate - frame) > 1e-9:
                    yield f"{name}, csv: wrong seconds at frame {frame}"


def csv_problems(scenes, files):
    return [problem for scene in scenes
            for problem in _Table(files[scene.name]).problems(
                scene.name, scene.composition.rate)]


def through_csv(scenes, files):
    for scene in scenes:
        composition = scene.composition
        table = _Table(files[scene.name])
        measured = {}
        for frame in composition.frames(10):
            own = composition.number_of(frame)
            if len(table.frames[own]) != len(composition.layers):
                raise exports.ExportFailed(
                    f"{scene.name}.csv: the rows are not the layers")
            measured[frame] = {
                layer.number: {
                    "world": table.world(own, number),
                    "projection": _projection(composition, *_numbers(
                        table.frames[own][number], "zoom"))
                    if layer.camera else None}
                for number, layer in enumerate(composition.layers, 1)}
        yield scene, _held(scene, measured, composition.layers)
