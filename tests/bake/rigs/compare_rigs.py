"""Holds the bakes of generated rigs to a model of the cameras that they have: at every frame the same points lie at the same
pixels, seen through the rig's own camera and through the composition that is made of its bake.

usage: compare_rigs.py TOOL

A quick share of the rigs, or with MAYASCENE_TESTS all of them.
"""

import json
import math
import os
import pathlib
import random
import sys
import tempfile

from rig import CENTIMETRES, RATES
from rig_generator import generated
from rig_model import Moment, point_through
from rig_text import scene_text

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[2] / "support"))
from compositions import Composition, Tool  # noqa: E402

QUICK, WIDE = 40, 300
MOST_PIXELS = 1e-6
SHOWN = 10

# How rigs are baked: the options, the frames where they are given, and the step.
WAYS = (
    ([], None, 1.0),
    (["--step", "0.5"], None, 0.5),
    (["--world"], None, 1.0),
    (["--frames", "-1:6"], (-1, 6), 1.0),
)
IN_ONE_GO = 3  # the way that lets the import bake

# What occurs among all rigs.
WANTED = (
    *(f"order {order} of a {kind}" for order in range(6) for kind in ("transform", "joint", "lookAt")),
    *(f"order {order} of what aims" for order in range(6)),
    *(f"{kind} up {up}" for up in range(5) for kind in ("lookAt", "aimConstraint")),
    *(f"{kind} below {depth}" for depth in range(4) for kind in ("chain", "pivots", "lookAt", "aimConstraint", "focal")),
    *(f"tangent {code}" for code in (1, 2, 3, 5, 9, 10, 16, 17, 18, 28)),
    *(f"infinity {code}" for code in (0, 1, 3, 4, 5)),
    *(f"fit {fit}" for fit in (0, 1, 2, 3, "silent")),
    *(f"length {unit}" for unit in CENTIMETRES),
    *(f"time {unit}" for unit in RATES),
    *("rp", "sp", "rpt", "spt", "ra", "opm", "shear", "limits", "inheritance off", "inheritance off with opm"),
    *("joint orient", "segment scale", "scaled alike", "scaled unalike", "film offset", "camera scale", "squeeze"),
    *("angle deg", "angle rad", "square pixels", "oblong pixels", "aim with an offset", "two targets", "still"),
    *("focal length passed on", "focal length from an attribute's default", "keys outside what is played"),
    *("nothing is played", "curve in another unit", "weighted", "not weighted", "curve TL", "curve TA", "curve TU"),
)


def frames_of(rig, given, step):
    """What is played and all keys, outward to whole frames; or what was given."""
    if given is None:
        seconds = [key.time for curve in rig.curves() for key in curve.keys] + list(rig.playback or ())
        moments = [second * rig.unit_seconds * rig.rate if RATES[rig.time] is None else second for second in seconds] or [1]
        given = math.floor(min(moments)), math.ceil(max(moments))
    first, last = given
    return [first + place * step for place in range(round((last - first) / step) + 1)]


class Comparison:
    def __init__(self):
        self.worst = 0.0
        self.points = self.ahead = self.nulls = self.frames = self.cameras = 0
        self.complaints, self.features = [], {}

    def complain(self, *words):
        self.complaints.append(" ".join(map(str, words)))

    def rig(self, rig, scene, report, way):
        _, given, step = WAYS[way]
        frames = frames_of(rig, given, step)
        for feature in rig.features:
            self.features[feature] = self.features.get(feature, 0) + 1
        reported = report["frames"]
        if (reported["first"], reported["count"]) != (frames[0], len(frames)):
            self.complain(rig.name, "frames", reported, "expected", frames[0], len(frames))
            return
        composition = Composition(scene)
        self.hold_times(rig, composition, len(frames), step)
        chance = random.Random(rig.name)
        aims = [[chance.uniform(-0.35, 0.35), chance.uniform(-0.25, 0.25), -1.0] for _ in range(3)]
        distances = [chance.uniform(5, 200) for _ in aims]
        points = [[part * distance for part in aim] for aim, distance in zip(aims, distances)]
        layers = {layer["name"]: layer for layer in composition.layers.values()}
        self.cameras += len(rig.of_kind("camera"))
        for place, frame in enumerate(frames):
            self.frames += 1
            self.moment(rig, Moment(rig, frame), composition, layers, place * step / rig.rate, points)

    def hold_times(self, rig, composition, count, step):
        for layer in composition.layers.values():
            for stream in layer["streams"]:
                seconds = composition.key_seconds(stream) if stream["keys"] else [0.0] * count
                expected = [place * step / rig.rate for place in range(count)]
                if len(seconds) != count or (stream["keys"] and max(abs(a - b) for a, b in zip(seconds, expected)) > 0.002):
                    self.complain(rig.name, layer["name"], stream["name"], "has keys at", seconds[:5], "expected", expected[:5])

    def moment(self, rig, moment, composition, layers, second, points):
        for camera in rig.of_kind("camera"):
            layer, world = layers[camera.name], moment.world(camera.parent)
            shown = points if moment.keeps_squares(camera) else straight_ahead(points)
            for inside in shown:
                x, y, z = point = point_through(inside, world)
                self.point(rig, moment, camera, composition.pixel(layer, (x, -y, -z), second), point)
            self.points += len(points) if shown is points else 0
            self.ahead += len(shown) if shown is not points else 0
            for locator in rig.of_kind("locator"):
                self.null(rig, moment, camera, locator, composition, layer, layers["null_" + locator.name], second)

    def point(self, rig, moment, camera, ours, point):
        theirs = without_film_offset(moment, camera, moment.pixel(camera, point))
        off = max(abs(a - b) for a, b in zip(ours, theirs)) if ours else math.inf
        self.worst = max(self.worst, off)
        if not off <= MOST_PIXELS:
            at = f"at {moment.seconds * rig.rate:g}"
            self.complain(rig.name, camera.name, at, "pixel", ours, "by the model", theirs, sorted(rig.features))

    def null(self, rig, moment, camera, locator, composition, layer, null, second):
        """A null stands where its locator does, and is seen there where the camera sees it."""
        point = moment.world(locator.parent)[3][:3]
        _, (x, y, z) = composition.place(null, second)
        far = max(1.0, *(abs(part) for part in point))
        if max(abs(a - b) for a, b in zip(point, (x, -y, -z))) > 1e-9 * far:
            self.complain(rig.name, locator.name, "stands at", (x, -y, -z), "by the model", point)
        inside = point_through(point, moment.inverse_world(camera.parent))
        before = inside[2] < -1.0 and max(abs(inside[0]), abs(inside[1])) < -2 * inside[2]
        if before and moment.keeps_squares(camera):
            self.point(rig, moment, camera, composition.pixel(layer, (x, y, z), second), point)
            self.nulls += 1


# What a composition cannot hold.


def without_film_offset(moment, camera, pixel):
    """A composition's camera looks through the centre of the picture."""
    return [part + offset for part, offset in zip(pixel, moment.film_offset(camera))]


def straight_ahead(points):
    """Of a camera that is sheared, mirrored or scaled unalike a composition holds the place and the direction."""
    return [[0.0, 0.0, point[2]] for point in points]


# The run.


def compare(tool, count):
    comparison = Comparison()
    rigs = [generated(number) for number in range(count)]
    for rig in rigs:
        (tool.folder / f"{rig.name}.ma").write_text(scene_text(rig, random.Random(rig.name)), encoding="ascii")
    for way, (options, _, _) in enumerate(WAYS):
        chosen = rigs[way :: len(WAYS)]
        paths = [f"{rig.name}.ma" for rig in chosen]
        common = ["--quiet", "--locators", "all", "--report", "report.json", *options]
        if way == IN_ONE_GO:
            scenes = tool.all_imported(paths, "--bake", *common)
        else:
            tool.run("bake", *common, *paths, "-o", f"bakes{way}")
            scenes = tool.all_imported([f"bakes{way}/{path}" for path in paths])
        reports = json.loads((tool.folder / "report.json").read_text(encoding="ascii"))["scenes"]
        for rig, scene, report in zip(chosen, scenes, reports, strict=True):
            comparison.rig(rig, scene, report, way)
    return comparison


def main():
    count = WIDE if os.environ.get("MAYASCENE_TESTS") in ("wide", "all") else QUICK
    with tempfile.TemporaryDirectory() as folder:
        comparison = compare(Tool(sys.argv[1], pathlib.Path(folder)), count)
    for complaint in comparison.complaints[:SHOWN]:
        print(complaint)
    print(
        f"{count} rigs, {comparison.cameras} cameras, {comparison.frames} frames: {comparison.points} points, "
        f"{comparison.ahead} straight ahead, {comparison.nulls} nulls; {len(comparison.complaints)} complaints, "
        f"at most {comparison.worst:.1e} px"
    )
    missing = [feature for feature in WANTED if count == WIDE and feature not in comparison.features]
    if missing:
        print("no rig has:", ", ".join(missing))
    complete = comparison.points > 0 and comparison.ahead > 0 and comparison.nulls > 0 and not missing
    return 0 if complete and not comparison.complaints else 1


if __name__ == "__main__":
    sys.exit(main())
