"""Where a point lies in the picture of a rig's camera. Plain and slow; points are rows, so matrices are applied from left to
right. It shares no code with what it judges."""

import math
import pathlib
import sys

from rig import CENTIMETRES, CHILDREN, ONES, ORDERS, Curve

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[2] / "motion" / "model"))
import curve_model  # noqa: E402

IDENTITY = [[1.0 if i == j else 0.0 for j in range(4)] for i in range(4)]
SCENE, OBJECT, OBJECT_ROTATION, VECTOR, NONE = range(5)
FILL, HORIZONTAL, VERTICAL, OVERSCAN = range(4)
DEFAULT_ONE = {"it", "ssc", *(child for compound in ONES for child in CHILDREN[compound])}
CAMERA_DEFAULTS = {"fl": 35.0, "hfa": 1.41732, "vfa": 0.94488, "ff": HORIZONTAL, "cs": 1.0, "lsr": 1.0, "hfo": 0.0, "vfo": 0.0}


def times(*matrices):
    result = matrices[0]
    for b, c, d, e in matrices[1:]:
        columns = range(4)
        result = [[x * b[j] + y * c[j] + z * d[j] + w * e[j] for j in columns] for x, y, z, w in result]
    return result


def moved(x, y, z):
    return [[1.0, 0.0, 0.0, 0.0], [0.0, 1.0, 0.0, 0.0], [0.0, 0.0, 1.0, 0.0], [x, y, z, 1.0]]


def scaled(x, y, z):
    return [[x, 0.0, 0.0, 0.0], [0.0, y, 0.0, 0.0], [0.0, 0.0, z, 0.0], [0.0, 0.0, 0.0, 1.0]]


def sheared(xy, xz, yz):
    return [[1.0, 0.0, 0.0, 0.0], [xy, 1.0, 0.0, 0.0], [xz, yz, 1.0, 0.0], [0.0, 0.0, 0.0, 1.0]]


def turned(order, angles):
    """Angles about x, y and z in radians; the first letter of the order turns first."""
    cos, sin = [math.cos(angle) for angle in angles], [math.sin(angle) for angle in angles]
    about = {
        "x": [[1.0, 0.0, 0.0, 0.0], [0.0, cos[0], sin[0], 0.0], [0.0, -sin[0], cos[0], 0.0], [0.0, 0.0, 0.0, 1.0]],
        "y": [[cos[1], 0.0, -sin[1], 0.0], [0.0, 1.0, 0.0, 0.0], [sin[1], 0.0, cos[1], 0.0], [0.0, 0.0, 0.0, 1.0]],
        "z": [[cos[2], sin[2], 0.0, 0.0], [-sin[2], cos[2], 0.0, 0.0], [0.0, 0.0, 1.0, 0.0], [0.0, 0.0, 0.0, 1.0]],
    }
    return times(*(about[letter] for letter in order))


def cross(a, b):
    return [a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]]


def dot(a, b):
    return sum(map(float.__mul__, a, b))


def unit(vector):
    length = math.hypot(*vector)
    return [part / length for part in vector]


def as_linear(rows):
    return [[*row, 0.0] for row in rows] + [[0.0, 0.0, 0.0, 1.0]]


def inverse(matrix):
    """Of a matrix whose last column is 0 0 0 1, by the cofactors of its linear part."""
    a, b, c = (row[:3] for row in matrix[:3])
    size = dot(a, cross(b, c))
    columns = [[part / size for part in cross(*pair)] for pair in ((b, c), (c, a), (a, b))]
    linear = [list(row) for row in zip(*columns)]
    origin = [-dot(matrix[3][:3], column) for column in columns]
    return [[*row, 0.0] for row in linear] + [[*origin, 1.0]]


def point_through(point, matrix):
    return [sum(point[i] * matrix[i][j] for i in range(3)) + matrix[3][j] for j in range(3)]


def vector_through(vector, matrix):
    return [sum(vector[i] * matrix[i][j] for i in range(3)) for j in range(3)]


class Moment:
    """A rig at one time. Each value is computed once and kept."""

    def __init__(self, rig, frame):
        self.rig, self.seconds, self.kept = rig, frame / rig.rate, {}
        self.radians = 1.0 if rig.angle.startswith("rad") else math.radians(1.0)

    def once(self, key, work):
        if key not in self.kept:
            self.kept[key] = work()
        return self.kept[key]

    # Numbers.

    @staticmethod
    def default(node, name):
        if name in node.added:
            return node.added[name]
        return CAMERA_DEFAULTS[name] if node.kind == "camera" else 1.0 if name in DEFAULT_ONE else 0.0

    def number(self, node, name):
        driver = node.drivers.get(name)
        if driver is None:
            return float(node.values.get(name, self.default(node, name)))
        if isinstance(driver, Curve):
            return self.curve_value(driver)
        return self.number(driver.node, driver.name)

    def curve_value(self, curve):
        inside = {"TL": CENTIMETRES[self.rig.length], "TA": self.radians, "TU": 1.0}[curve.kind]
        model = curve_model.Model(curve.weighted, curve.pre, curve.post)
        for key in curve.keys:
            time, value = key.time * self.rig.unit_seconds, key.value * inside
            tangents = key.in_type, key.out_type, key.in_tangent, key.out_tangent
            model.keys.append(curve_model.Key(time, value, *tangents))
        return model.at(self.seconds) / inside

    def three(self, node, compound):
        return self.once((compound, id(node)), lambda: self.find_three(node, compound))

    def find_three(self, node, compound):
        found = []
        for name, axis in zip(CHILDREN[compound], "xyz"):
            value = self.number(node, name)
            lowest, highest = node.values.get(f"mn{compound}{axis}"), node.values.get(f"mx{compound}{axis}")
            value = value if lowest is None else max(value, lowest)
            found.append(value if highest is None else min(value, highest))
        return found

    def angles(self, node, compound):
        return [angle * self.radians for angle in self.three(node, compound)]

    # Places.

    def rotation(self, node):
        if "r" in node.drivers:
            return self.aimed(node.drivers["r"])
        return turned(ORDERS[int(self.number(node, "ro"))], self.angles(node, "r"))

    def local(self, node):
        scale, place = scaled(*self.three(node, "s")), moved(*self.three(node, "t"))
        axis = turned("xyz", self.angles(node, "ra"))
        if node.kind == "joint":
            above = [1.0 / part for part in self.three(node, "is")] if self.number(node, "ssc") else (1.0, 1.0, 1.0)
            orient = turned("xyz", self.angles(node, "jo"))
            return times(scale, axis, self.rotation(node), orient, scaled(*above), place)
        shift = {name: self.three(node, name) for name in ("sp", "spt", "rp", "rpt")}
        back = {name: [-part for part in shift[name]] for name in ("sp", "rp")}
        return times(
            moved(*back["sp"]), scale, sheared(*self.three(node, "sh")), moved(*shift["sp"]), moved(*shift["spt"]),
            moved(*back["rp"]), axis, self.rotation(node), moved(*shift["rp"]), moved(*shift["rpt"]), place,
        )  # fmt: skip

    def above(self, node):
        """The parent matrix."""
        parent = self.world(node.parent) if node.parent and self.number(node, "it") else IDENTITY
        return times(node.matrix, parent) if node.matrix else parent

    def world(self, node):
        return self.once(("world", id(node)), lambda: times(self.local(node), self.above(node)))

    def inverse_world(self, node):
        return self.once(("inverse", id(node)), lambda: inverse(self.world(node)))

    # What looks at something.

    def aimed(self, constraint):
        return self.once(("aim", id(constraint)), lambda: self.aim(constraint))

    def aim(self, constraint):
        aiming, node = constraint.aiming, constraint.aiming.constrained
        into = inverse(self.above(node))
        here = [sum(parts) for parts in zip(*(self.three(node, name) for name in ("t", "rp", "rpt")))]
        ahead, weights = [0.0, 0.0, 0.0], sum(target.weight for target in aiming.targets)
        for target in aiming.targets:
            point = [sum(parts) for parts in zip(*(self.three(target.node, name) for name in ("t", "rp", "rpt")))]
            point = point_through(point, self.above(target.node))
            ahead = [a + b * target.weight / weights for a, b in zip(ahead, point)]
        ahead = unit([a - b for a, b in zip(point_through(ahead, into), here)])
        if aiming.up_type == NONE:
            turn = self.shortest(unit(aiming.aim), ahead)
        else:
            up = self.up_vector(aiming, into, here)
            frame, seen = self.square(unit(aiming.aim), aiming.up), self.square(ahead, up)
            turn = times(as_linear([list(row) for row in zip(*frame)]), as_linear(seen))
        offset = turned("xyz", [angle * self.radians for angle in aiming.offset])
        turn = times(offset, turn)
        if node.kind == "joint":
            turn = times(turn, inverse(turned("xyz", self.angles(node, "jo"))))
        return turn

    def up_vector(self, aiming, into, here):
        if aiming.up_type == OBJECT:
            origin = point_through(self.world(aiming.up_object)[3][:3], into)
            return [a - b for a, b in zip(origin, here)]
        up = {SCENE: (0.0, 1.0, 0.0), VECTOR: aiming.world_up, OBJECT_ROTATION: aiming.world_up}[aiming.up_type]
        if aiming.up_type == OBJECT_ROTATION:
            up = vector_through(up, self.world(aiming.up_object))
        return vector_through(up, into)

    @staticmethod
    def square(ahead, up):
        side = unit(cross(ahead, up))
        return [ahead, cross(side, ahead), side]

    @staticmethod
    def shortest(start, end):
        axis = cross(start, end)
        cosine = dot(start, end)
        skew = [[0.0, axis[2], -axis[1]], [-axis[2], 0.0, axis[0]], [axis[1], -axis[0], 0.0]]
        return as_linear(
            [
                [cosine * (i == j) + skew[i][j] + axis[i] * axis[j] / (1.0 + cosine) for j in range(3)]
                for i in range(3)
            ]
        )

    # Pictures.

    def pixels_per_inch(self, camera):
        """Of the picture's square pixels, on the film."""
        (width, height), aspect = self.rig.size, self.rig.aspect
        pixel = aspect * height / width
        pixel = 1.0 if abs(pixel - 1.0) < 0.01 else pixel
        across, down = self.number(camera, "hfa") * self.number(camera, "lsr"), self.number(camera, "vfa")
        wide = across / down > pixel * width / height
        fit = int(self.number(camera, "ff"))
        vertical = fit == VERTICAL or (fit == FILL and wide) or (fit == OVERSCAN and not wide)
        return height / down if vertical else pixel * width / across

    def film_offset(self, camera):
        """In pixels, to the right and down."""
        density = self.pixels_per_inch(camera)
        return self.number(camera, "hfo") * density, -self.number(camera, "vfo") * density

    def pixel(self, camera, point):
        """From the centre of the picture, to the right and down."""
        x, y, z = point_through(point, self.inverse_world(camera.parent))
        focal = self.number(camera, "fl") / 25.4 / self.number(camera, "cs") * self.pixels_per_inch(camera)
        right, down = self.film_offset(camera)
        return focal * x / -z - right, focal * y / z - down

    def keeps_squares(self, camera):
        """Whether the camera's space is turned, moved and scaled alike in all directions, and no more."""
        rows = [row[:3] for row in self.world(camera.parent)[:3]]
        sizes = [math.hypot(*row) for row in rows]
        x, y, z = (unit(row) for row in rows)
        alike = max(sizes) - min(sizes) < 1e-9 * max(sizes)
        square = max(abs(dot(x, y)), abs(dot(y, z)), abs(dot(z, x))) < 1e-9
        return alike and square and dot(cross(x, y), z) > 0.0
