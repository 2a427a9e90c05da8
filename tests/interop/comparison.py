"""What a program makes of a scene, held against the composition.

A program hands in, for each frame, a world matrix for each layer and a
projection for each camera. Both stay as the program has them; `to_program`
says where a point of the scene's world is in the program's.
"""

import math

from known_points import known_points

LIMIT_SINGLE = 0.05
LIMIT_DOUBLE = 1e-3

# Half a unit in the last place, relative: of a single, of a double, and of
# six digits in a text.
EPSILON = {"single": 2.0 ** -24, "double": 2.0 ** -53, "six digits": 5e-6}

# How many roundings a place or a pixel goes through, at most, in a chain of
# parents: each link has a matrix of products and sums, and a key between
# two frames has its own.
_ROUNDINGS = 16

# How near a point may be, as a part of the camera's reach.
_NEAREST = 0.05


class Result:
    """The largest differences, and how many values were held."""

    def __init__(self):
        self.places = 0
        self.pixels = 0
        self.worst_place = 0.0
        self.worst_pixel = 0.0
        self.limit = 0.0
        self.failures = []

    def fail(self, text):
        self.failures.append(text)


def inverse_of_rigid(matrix):
    """Of a matrix whose axes are square to each other. Scales are dropped,
    as every program does for a camera."""
    axes = []
    for column in range(3):
        axis = [matrix[row][column] for row in range(3)]
        length = math.sqrt(sum(part * part for part in axis))
        axes.append([part / length for part in axis])
    origin = [matrix[row][3] for row in range(3)]
    return [axis + [-sum(a * b for a, b in zip(axis, origin))]
            for axis in axes] + [[0.0, 0.0, 0.0, 1.0]]


def projected(view, projection, point):
    """From -1 to 1 across the picture."""
    seen = [sum(row[k] * point[k] for k in range(3)) + row[3]
            for row in view[:3]] + [1.0]
    clip = [sum(row[k] * seen[k] for k in range(4)) for row in projection]
    return clip[0] / clip[3], clip[1] / clip[3]


def _pixel_limit(composition, camera, frame, depth, precision, usual):
    """The usual limit, or what the roundings of single precision come to
    where the scene is far from its origin, and near the lens."""
    if precision != "single":
        return usual
    epsilon = EPSILON[precision]
    reach = composition.reach(camera, frame) + depth
    zoom = composition.zoom(camera, frame)
    wide = math.hypot(composition.width, composition.height)
    return max(usual, _ROUNDINGS * epsilon * (
        zoom * reach / depth + zoom + wide))


def compare(composition, measured, names, to_program, precision,
            scale_of_picture=(1.0, 1.0), lens_at=None):
    """`names` maps the number of each layer that a format has to the
    program's name for it. `measured` is
    {frame: {name: {"world": rows, "projection": rows or None}}}.

    `scale_of_picture` is the part of the composition's width and height that
    the program's picture shows: of two nested compositions the outer one is
    up to a pixel narrower or wider. `lens_at` is a frame whose lens a program
    shows at all frames.
    """
    usual = LIMIT_DOUBLE if precision == "double" else LIMIT_SINGLE
    result = Result()
    result.limit = usual
    points = {camera.number: known_points(composition, camera)
              for camera in composition.cameras()}
    for frame, layers in sorted(measured.items()):
        for layer in composition.layers:
            if layer.number not in names:
                continue
            found = layers.get(names[layer.number])
            if found is None:
                result.fail(f'"{layer.name}" is missing at frame {frame}')
                continue
            _compare_place(composition, layer, frame, found, to_program,
                           precision, result)
            if layer.camera:
                _compare_pixels(composition, layer, frame, found, to_program,
                                precision, usual, scale_of_picture,
                                points[layer.number], result, lens_at)
    if composition.cameras() and result.pixels == 0:
        result.fail("no known point was in front of a camera")
    return result


def _compare_place(composition, layer, frame, found, to_program, precision,
                   result):
    wanted = to_program(composition.place(layer, frame))
    off = math.dist(wanted, [row[3] for row in found["world"][:3]])
    # The program's own unit: how long one of the scene's is there.
    unit = math.dist(to_program([1.0, 0.0, 0.0]), to_program([0.0, 0.0, 0.0]))
    reach = composition.reach(layer, frame) * unit
    result.places += 1
    result.worst_place = max(result.worst_place, off / unit)
    limit = max(_ROUNDINGS * EPSILON[precision] * reach, 1e-9 * unit)
    if not off <= limit:
        result.fail(f'"{layer.name}" at frame {frame} is {off:.3g} from its '
                    f"place, more than {limit:.3g}")


def _measures(composition, wanted, reach):
    """Far outside the picture, and close before the lens, a pixel is no
    measure: there it moves far for nothing."""
    return (abs(wanted[0]) <= composition.width
            and abs(wanted[1]) <= composition.height
            and wanted[2] >= _NEAREST * reach)


def _compare_pixels(composition, camera, frame, found, to_program, precision,
                    usual, scale_of_picture, points, result, lens_at):
    half = (composition.width * scale_of_picture[0] / 2,
            composition.height * scale_of_picture[1] / 2)
    reach = composition.reach(camera, frame)
    shown = composition.view(camera, frame)
    if lens_at is not None:
        shown.zoom = composition.zoom(camera, lens_at)
    view = inverse_of_rigid(found["world"])
    for point in points:
        wanted = shown.pixel(point)
        if wanted is None or not _measures(composition, wanted, reach):
            continue
        u, v = projected(view, found["projection"], to_program(point))
        off = math.hypot(u * half[0] - wanted[0], v * half[1] - wanted[1])
        limit = _pixel_limit(composition, camera, frame, wanted[2], precision,
                             usual)
        result.pixels += 1
        result.worst_pixel = max(result.worst_pixel, off)
        result.limit = max(result.limit, limit)
        if not off <= limit:
            result.fail(f'"{camera.name}" at frame {frame} shows a point '
                        f"{off:.3g} px away, more than {limit:.3g}")
