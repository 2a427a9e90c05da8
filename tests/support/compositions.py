"""Runs the tool, and reads compositions out of what it writes: where things stand, and where a camera sees a point."""

import bisect
import json
import math
import os
import subprocess
import sys

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
    """The inner composition of an import, at the times of its keys. Right, down and ahead are positive."""

    def __init__(self, scene):
        self.layers = {layer["number"]: layer for layer in scene["compositions"][0]["layers"]}
        self.cameras = [layer for layer in self.layers.values() if layer["kind"] == "camera"]
        self.nulls = [layer for layer in self.layers.values() if layer["kind"] == "null"]
        self.seconds, self.nearest, self.places = {}, {}, {}

    def nearest_key(self, stream, second):
        found = self.nearest.get((id(stream), second))
        if found is None:
            seconds = self.key_seconds(stream)
            after = bisect.bisect_left(seconds, second)
            found = min((max(after - 1, 0), min(after, len(seconds) - 1)), key=lambda place: abs(seconds[place] - second))
            self.nearest[id(stream), second] = found
        return found

    def key_seconds(self, stream):
        found = self.seconds.get(id(stream))
        if found is None:
            found = self.seconds[id(stream)] = [top / bottom for top, bottom in stream["keys"]["times"]]
        return found

    def value(self, layer, name, second):
        stream = layer["streams"][STREAMS[name]]
        if not stream["keys"]:
            return stream["value"]
        return stream["keys"]["values"][self.nearest_key(stream, second)]

    def number(self, layer, name, second):
        value = self.value(layer, name, second)
        return value[0] if isinstance(value, list) else value

    def place(self, layer, second):
        """Rotation with scale, and position, against the world."""
        key = (layer["number"], second)
        if key not in self.places:
            self.places[key] = self.find_place(layer, second)
        return self.places[key]

    def find_place(self, layer, second):
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
    """The tool in a folder of its own, which is also its home."""

    def __init__(self, tool, folder):
        self.tool, self.folder = tool, folder

    def run(self, *arguments):
        command = [self.tool, *map(str, arguments)]
        home = {"HOME": self.folder, "XDG_CONFIG_HOME": self.folder, "TMPDIR": self.folder}
        done = subprocess.run(command, capture_output=True, text=True, check=False, cwd=self.folder, env={**os.environ, **home})
        if done.returncode != 0:
            sys.exit("%s ended with %d: %s" % (" ".join(command[:8]), done.returncode, done.stderr))
        return done.stdout

    def all_imported(self, paths, *options):
        return json.loads(self.run("import", "--quiet", "--json", "-", *options, *paths))["scenes"]

    def imported(self, path, *options):
        return self.all_imported([path], *options)[0]
