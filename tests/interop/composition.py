"""A composition's JSON, read for the comparison with other programs.

This judges the product, so it shares no code with it. World is the scene's:
Y up, right-handed; a point (x, y, z) of the composition is (x, -y, -z). A
matrix is four rows of four numbers that act on columns.
"""

import bisect
import math


def multiplied(left, right):
    return [[sum(row[k] * right[k][column] for k in range(4))
             for column in range(4)] for row in left]


def moved(matrix, point):
    return [sum(row[k] * point[k] for k in range(3)) + row[3]
            for row in matrix[:3]]


def about(axis, degrees):
    """The rotation about one axis of three."""
    c, s = math.cos(math.radians(degrees)), math.sin(math.radians(degrees))
    one, other = (axis + 1) % 3, (axis + 2) % 3
    made = [[float(i == j) for j in range(4)] for i in range(4)]
    made[one][one], made[one][other] = c, -s
    made[other][one], made[other][other] = s, c
    return made


def diagonal(a, b, c):
    return [[a, 0, 0, 0], [0, b, 0, 0], [0, 0, c, 0], [0, 0, 0, 1]]


def shifted(x, y, z):
    return [[1, 0, 0, x], [0, 1, 0, y], [0, 0, 1, z], [0, 0, 0, 1]]


def _length(vector):
    return math.sqrt(sum(part * part for part in vector))


def _cross(a, b):
    return [a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2],
            a[0] * b[1] - a[1] * b[0]]


def _divided(vector, length):
    return [part / length for part in vector]


def _look_at(place, interest):
    """A level camera, looking along -Z, that sees the interest ahead."""
    back = [a - b for a, b in zip(place, interest)]
    if _length(back) == 0.0:
        return diagonal(1, 1, 1)
    back = _divided(back, _length(back))
    right = _cross([0, 1, 0], back)
    right = _divided(right, _length(right))
    up = _cross(back, right)
    return [[right[i], up[i], back[i], 0] for i in range(3)] + [[0, 0, 0, 1]]


class Stream:
    def __init__(self, item):
        self.value = item["value"]
        keys = item["keys"]
        self.keys = []
        if keys:
            self.keys = [(ticks / scale, value) for (ticks, scale), value
                         in zip(keys["times"], keys["values"])]
        self.times = [time for time, _ in self.keys]

    def at(self, seconds):
        if not self.keys:
            return self.value
        if seconds <= self.keys[0][0]:
            return self.keys[0][1]
        if seconds >= self.keys[-1][0]:
            return self.keys[-1][1]
        after = bisect.bisect_right(self.times, seconds)
        (start, one), (end, other) = self.keys[after - 1:after + 1]
        part = (seconds - start) / (end - start)
        return [a + part * (b - a) for a, b in zip(one, other)]


class Layer:
    def __init__(self, item):
        self.number = item["number"]
        self.name = item["name"]
        self.camera = item["kind"] == "camera"
        self.aimed = item["aimed"]
        self.above = item["parent"]
        self.film = item["filmSize"]
        self.streams = {stream["name"]: Stream(stream)
                        for stream in item["streams"]}

    def local(self, seconds):
        def at(name):
            return self.streams[name].at(seconds)
        x, y, z = at("position")
        turned = multiplied(multiplied(
            about(2, -at("zRotation")[0]), about(1, -at("yRotation")[0])),
            about(0, at("xRotation")[0]))
        if self.aimed:
            a, b, c = at("pointOfInterest")
            turned = multiplied(_look_at([x, -y, -z], [a, -b, -c]), turned)
        sized = multiplied(turned, diagonal(*(part / 100.0
                                              for part in at("scale"))))
        return multiplied(shifted(x, -y, -z), sized)


class Composition:
    """The layers that are shown, and the picture that shows them.

    Pixels are square: those of the inner one of two compositions.
    """

    def __init__(self, scene):
        inner = next(item for item in scene["compositions"]
                     if any(layer["kind"] != "composition"
                            for layer in item["layers"]))
        shows = [item for item in scene["compositions"]
                 if any(layer["source"] == inner["number"]
                        for layer in item["layers"])]
        outer = shows[0] if shows else inner
        self.width, self.height = inner["width"], inner["height"]
        self.shown_width = outer["width"]
        self.shown_height = outer["height"]
        self.pixel_aspect = outer["pixelAspect"][0] / outer["pixelAspect"][1]
        self.rate = inner["frameRate"][0] / inner["frameRate"][1]
        self.linear_unit = scene.get("linearUnit")
        self.layers = [Layer(item) for item in inner["layers"]]
        self.by_number = {layer.number: layer for layer in self.layers}
        times = [pair[0] for layer in self.layers
                 for stream in layer.streams.values()
                 for pair in stream.keys[:1] + stream.keys[-1:]]
        # Composition time 0 is the scene's own first frame.
        self.first = scene.get("firstFrame", 0)
        self.last = scene.get("lastFrame")
        self.start = round(min(times, default=0.0) * self.rate)
        self.end = round(max(times, default=0.0) * self.rate)
        self.seconds = inner["duration"][0] / inner["duration"][1]

    def cameras(self):
        return [layer for layer in self.layers if layer.camera]

    def nulls(self):
        return [layer for layer in self.layers if not layer.camera]

    def frames(self, step=1):
        """Counted from composition time 0: the ends, and every step-th."""
        return sorted({*range(self.start, self.end + 1, step), self.end})

    def range(self):
        """The scene's own first and last frame; without keys all of the
        composition's duration."""
        if self.last is not None:
            return [self.first, self.last]
        last = self.end if any(stream.keys for layer in self.layers
                               for stream in layer.streams.values()
                               ) else round(self.seconds * self.rate)
        return [self.first + self.start, self.first + last]

    def number_of(self, frame):
        """The scene's own number."""
        return self.first + frame

    def chain(self, layer):
        found = []
        while layer is not None and layer not in found:
            found.append(layer)
            layer = self.by_number.get(layer.above)
        return found

    def world(self, layer, frame):
        made = diagonal(1, 1, 1)
        for link in self.chain(layer):
            made = multiplied(link.local(frame / self.rate), made)
        return made

    def place(self, layer, frame):
        return [row[3] for row in self.world(layer, frame)[:3]]

    def reach(self, layer, frame):
        """The largest length that the layer's place is made of."""
        return sum(_length(link.streams["position"].at(frame / self.rate))
                   for link in self.chain(layer))

    def zoom(self, camera, frame):
        return camera.streams["zoom"].at(frame / self.rate)[0]

    def lens_moves(self, camera):
        return len({self.zoom(camera, frame)
                    for frame in self.frames()}) > 1

    def view(self, camera, frame):
        return View(self, camera, frame)


class View:
    """What a camera shows at a frame."""

    def __init__(self, composition, camera, frame):
        world = composition.world(camera, frame)
        self.place = [row[3] for row in world[:3]]
        self.zoom = composition.zoom(camera, frame)
        self.axes = self._axes(world)

    @staticmethod
    def _axes(world):
        """Right, up and back. The X axis keeps its direction, the others
        are made square to it."""
        right, up = ([row[i] for row in world[:3]] for i in (0, 1))
        right = _divided(right, _length(right))
        along = sum(a * b for a, b in zip(right, up))
        up = [b - along * a for a, b in zip(right, up)]
        up = _divided(up, _length(up))
        return right, up, _cross(right, up)

    def pixel(self, point):
        """Pixels to the right of the middle and above it, and the depth.
        None where the point is not ahead."""
        away = [a - b for a, b in zip(point, self.place)]
        seen = [sum(a * b for a, b in zip(axis, away)) for axis in self.axes]
        depth = -seen[2]
        if depth <= 0.0:
            return None
        return seen[0] * self.zoom / depth, seen[1] * self.zoom / depth, depth
