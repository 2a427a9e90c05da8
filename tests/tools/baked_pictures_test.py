#!/usr/bin/env python3
"""Holds bakes to the picture: each example shows the same points at the same pixels, imported as it is and baked first;
and where the folder of real shots lies beside the clone, known points land where they were seen.

Also validates the report of a bake against its schema.
"""

import argparse
import json
import math
import pathlib
import subprocess
import sys
import tempfile

import jsonschema

MOST_PIXELS = 1e-6
STREAMS = {name: place for place, name in enumerate(("point", "position", "scale", "z", "x", "y", "zoom"))}


def turned(angle, axis):
    """About an axis; columns are where the axes go."""
    c, s = math.cos(math.radians(angle)), math.sin(math.radians(angle))
    rows = [[1.0 if i == j else 0.0 for j in range(3)] for i in range(3)]
    a, b = (axis + 1) % 3, (axis + 2) % 3
    rows[a][a], rows[a][b], rows[b][a], rows[b][b] = c, -s, s, c
    return rows


def product(a, b):
    return [[sum(a[i][k] * b[k][j] for k in range(3)) for j in range(3)] for i in range(3)]


def applied(rows, vector):
    return [sum(rows[i][k] * vector[k] for k in range(3)) for i in range(3)]


class Composition:
    """The inner composition of an import, at the times of its keys."""

    def __init__(self, scene):
        self.layers = {layer["number"]: layer for layer in scene["compositions"][0]["layers"]}
        self.cameras = [layer for layer in self.layers.values() if layer["kind"] == "camera"]
        self.nulls = [layer for layer in self.layers.values() if layer["kind"] == "null"]

    @staticmethod
    def value(layer, name, second):
        stream = layer["streams"][STREAMS[name]]
        value = stream["value"]
        if stream["keys"]:
            seconds = [top / bottom for top, bottom in stream["keys"]["times"]]
            nearest = min(range(len(seconds)), key=lambda place: abs(seconds[place] - second))
            value = stream["keys"]["values"][nearest]
        return value

    def number(self, layer, name, second):
        value = self.value(layer, name, second)
        return value[0] if isinstance(value, list) else value

    def place(self, layer, second):
        """Rotation with scale, and position, against the world."""
        turn = product(turned(self.number(layer, "z", second), 2),
                       product(turned(self.number(layer, "y", second), 1), turned(self.number(layer, "x", second), 0)))
        if layer["kind"] == "camera" and layer["aimed"]:
            turn = product(self.aim(layer, second), turn)
        scale = self.value(layer, "scale", second)
        linear = [[turn[i][j] * scale[j] / 100.0 for j in range(3)] for i in range(3)]
        position = list(self.value(layer, "position", second))
        if layer["parent"]:
            above, origin = self.place(self.layers[layer["parent"]], second)
            position = [part + shift for part, shift in zip(applied(above, position), origin)]
            linear = product(above, linear)
        return linear, position

    def aim(self, layer, second):
        """Looks at the point of interest: +z goes there, +y stays as far down as it can."""
        here, there = self.value(layer, "position", second), self.value(layer, "point", second)
        ahead = [b - a for a, b in zip(here, there)]
        length = math.hypot(*ahead)
        ahead = [part / length for part in ahead]
        side = [ahead[2], 0.0, -ahead[0]]
        length = math.hypot(*side)
        side = [part / length for part in side]
        down = [ahead[1] * side[2] - ahead[2] * side[1], ahead[2] * side[0] - ahead[0] * side[2],
                ahead[0] * side[1] - ahead[1] * side[0]]
        return [[side[i], down[i], ahead[i]] for i in range(3)]

    def pixel(self, camera, point, second):
        """From the centre of the picture, to the right and down; None for what is not before the camera."""
        linear, position = self.place(camera, second)
        away = [a - b for a, b in zip(point, position)]
        x, y, z = (sum(linear[i][axis] * away[i] for i in range(3)) for axis in range(3))
        zoom = self.number(camera, "zoom", second)
        return (x / z * zoom, y / z * zoom) if z > 1e-9 else None


class Tool:
    def __init__(self, tool, folder):
        self.tool, self.folder = tool, folder

    def run(self, *arguments):
        command = [self.tool, *arguments]
        done = subprocess.run(command, capture_output=True, text=True, check=False, cwd=self.folder,
                              env={"HOME": self.folder, "XDG_CONFIG_HOME": self.folder, "TMPDIR": self.folder})
        if done.returncode != 0:
            sys.exit("%s ended with %d: %s" % (" ".join(command), done.returncode, done.stderr))
        return done.stdout

    def imported(self, path, *options):
        return json.loads(self.run("import", "--json", "-", *options, str(path)))["scenes"][0]


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


def hold_example(tool, path):
    """The worst distance in pixels, and how many were compared."""
    plain, baked = Composition(tool.imported(path)), Composition(tool.imported(path, "--bake"))
    if len(plain.cameras) != len(baked.cameras):
        sys.exit("%s: %d cameras, baked %d" % (path.name, len(plain.cameras), len(baked.cameras)))
    worst, count = 0.0, 0
    for before, after in zip(plain.cameras, baked.cameras):
        for second in key_times(plain):
            for point in points_around(plain):
                one, other = plain.pixel(before, point, second), baked.pixel(after, point, second)
                if one is None or other is None or max(map(abs, one)) > 1e5:
                    continue
                worst = max(worst, abs(one[0] - other[0]), abs(one[1] - other[1]))
                count += 1
    if count == 0:
        sys.exit("%s: no point was compared" % path.name)
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
        judged = [(path.name, *hold_example(tool, path)) for path in examples]
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
    if len(examples) < 8 or any(worst > MOST_PIXELS for _, worst, _ in judged):
        sys.exit("beyond %g px, or too few examples" % MOST_PIXELS)


if __name__ == "__main__":
    main()
