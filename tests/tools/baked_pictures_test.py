#!/usr/bin/env python3
"""Holds bakes to the picture: each example shows the same points at the same pixels, imported as it is and baked first.
The two that are not baked show them alike with their parents and without, and what a camera looks at in the middle. And
where the folder of real shots lies beside the clone, known points land where they were seen.

Also validates the report of a bake against its schema.
"""

import argparse
import json
import pathlib
import sys
import tempfile

import jsonschema

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1] / "support"))
from compositions import Composition, Tool, applied  # noqa: E402

MOST_PIXELS = 1e-6

# What an import shows only when it bakes, and the null that the camera looks at.
UNBAKED = {"harbour_walk.ma": None, "look_at_dancer.ma": "dance_cam_aim_nullShape"}


def key_times(scene):
    """The seconds of all keys of the cameras and of what stands above them."""
    times = {0.0}
    for layer in scene.layers.values():
        for stream in layer["streams"] or []:
            times |= {top / bottom for top, bottom in (stream["keys"] or {"times": []})["times"]}
    return sorted(times)


def points_around(scene):
    """Some points before each camera, and every null."""
    points = []
    for camera in scene.cameras:
        linear, position = scene.place(camera, 0.0)
        for across, down, ahead in ((0, 0, 10), (3, -2, 12), (-4, 1, 25), (6, 5, 80)):
            step = applied(linear, (across, down, ahead))
            points.append([a + b for a, b in zip(position, step)])
    points += [scene.place(null, 0.0)[1] for null in scene.nulls]
    return points


def compared(cameras, plain, baked, seconds):
    worst, count = 0.0, 0
    for before, after in cameras:
        for second in seconds:
            for point in points_around(plain):
                one, other = plain.pixel(before, point, second), baked.pixel(after, point, second)
                if one is None or other is None or max(map(abs, one)) > 1e5:
                    continue
                worst = max(worst, abs(one[0] - other[0]), abs(one[1] - other[1]))
                count += 1
    return worst, count


def hold_example(tool, path):
    """The worst distance in pixels, and how many were compared."""
    plain, baked = Composition(tool.imported(path)), Composition(tool.imported(path, "--bake"))
    if len(plain.cameras) != len(baked.cameras):
        sys.exit("%s: %d cameras, baked %d" % (path.name, len(plain.cameras), len(baked.cameras)))
    worst, count = compared(list(zip(plain.cameras, baked.cameras)), plain, baked, key_times(plain))
    if count == 0:
        sys.exit("%s: no point was compared" % path.name)
    return worst, count


def hold_unbaked(tool, path, centre):
    """With the parents and without; and what is in the middle of the picture at every frame, where there is such a null."""
    chained, alone = Composition(tool.imported(path, "--bake")), Composition(tool.imported(path, "--bake", "--world"))
    seconds = key_times(chained)
    if seconds != key_times(alone) or len(seconds) < 50:
        sys.exit("%s: keys at other times, or too few" % path.name)
    worst, count = compared([(chained.cameras[0], alone.cameras[0])], chained, alone, seconds)
    for null in chained.nulls:
        for second in seconds if null["name"] == centre else ():
            pixel = chained.pixel(chained.cameras[0], chained.place(null, second)[1], second)
            worst, count = max(worst, *map(abs, pixel)), count + 1
    return worst, count


def hold_truth(tool, shots):
    """Eight points that were seen in each of 101 frames."""
    scene = Composition(tool.imported(shots / "cube_a.ma", "--bake", "--locators", "all"))
    nulls = {null["name"]: null for null in scene.nulls}
    lines = iter((shots / "cube_a.uv").read_text(encoding="ascii").split("\n"))
    worst, count = 0.0, 0
    for track in range(int(next(lines))):
        next(lines)
        for _ in range(int(next(lines))):
            frame, u, v, _ = map(float, next(lines).split())
            second = (frame - 1.0) / 24.0
            _, point = scene.place(nulls["null_locatorShape%d" % (track + 1)], second)
            x, y = scene.pixel(scene.cameras[0], point, second)
            worst = max(worst, abs(x - (u - 0.5) * 960.0), abs(y + (v - 0.5) * 640.0))
            count += 1
    return worst, count


def main():
    arguments = argparse.ArgumentParser(description=__doc__)
    arguments.add_argument("tool")
    arguments.add_argument("root", type=pathlib.Path)
    given = arguments.parse_args()
    with tempfile.TemporaryDirectory() as folder:
        tool = Tool(given.tool, folder)
        examples = sorted((given.root / "examples").glob("*.ma"))
        judged = [(path.name, *hold_example(tool, path)) for path in examples if path.name not in UNBAKED]
        judged += [(name, *hold_unbaked(tool, given.root / "examples" / name, centre)) for name, centre in UNBAKED.items()]
        shots = given.root.parent / "shared" / "shots"
        if (shots / "cube_a.uv").exists():
            judged.append(("cube_a.ma", *hold_truth(tool, shots)))
        else:
            print("LEFT OUT: 808 points of ../shared/shots seen in a bake, beside the source folder")
        tool.run("bake", "-q", *map(str, examples), "-o", "bakes", "--report", "report.json")
        schema = json.loads((given.root / "docs" / "bake-report.schema.json").read_text(encoding="utf-8"))
        report = json.loads((pathlib.Path(folder) / "report.json").read_text(encoding="utf-8"))
        jsonschema.validate(report, schema)
    for name, worst, count in judged:
        print("%-24s %6d points, %.2g px" % (name, count, worst))
    if len(examples) < 10 or any(worst > MOST_PIXELS for _, worst, _ in judged):
        sys.exit("beyond %g px, or too few examples" % MOST_PIXELS)


if __name__ == "__main__":
    main()
