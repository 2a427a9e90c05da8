"""The tracks of a layer for Blender: location, rotation, scale.

A point (x, y, z) of the composition is (x, -y, -z) in the scene's axes. A
rotation about X keeps its sign, one about Y or Z changes it.
"""

import math
from collections import namedtuple

from . import matrices

# One animated number. `frames` is None where it stays: then `values` holds
# one value.
Track = namedtuple("Track", "path index frames values")

# How far the axes of a camera may differ from those of a rotation. Beyond it
# the camera is shown by its place in the world.
_STRAIGHT = 1e-6


def turned(vector):
    return (vector[0], -vector[1], -vector[2])


def track(path, index, frames, values):
    if frames is None or all(value == values[0] for value in values):
        return Track(path, index, None, values[:1])
    return Track(path, index, list(frames), list(values))


def _columns(path, frames, rows):
    return [track(path, index, frames, [row[index] for row in rows])
            for index in range(3)]


def _own_rotation(layer, frame):
    return matrices.rotation(
        math.radians(layer.streams["xRotation"].at(frame)[0]),
        -math.radians(layer.streams["yRotation"].at(frame)[0]),
        -math.radians(layer.streams["zRotation"].at(frame)[0]))


def rotation_at(layer, frame):
    """The rotation under the parent, with that towards the interest."""
    own = _own_rotation(layer, frame)
    if not layer.aimed:
        return own
    place = turned(layer.streams["position"].at(frame))
    interest = turned(layer.streams["pointOfInterest"].at(frame))
    looks = matrices.towards([b - a for a, b in zip(place, interest)])
    return matrices.times(looks, own)


def world_at(layer, frame):
    """Linear part and origin in the scene's world."""
    linear, origin = matrices.IDENTITY, (0.0, 0.0, 0.0)
    for link in layer.chain():
        scale = [part / 100.0 for part in link.streams["scale"].at(frame)]
        turn = rotation_at(link, frame)
        local = tuple(tuple(a * b for a, b in zip(row, scale))
                      for row in turn)
        place = turned(link.streams["position"].at(frame))
        moved = matrices.applied(local, origin)
        origin = tuple(a + b for a, b in zip(moved, place))
        linear = matrices.times(local, linear)
    return linear, origin


def sampled_frames(streams):
    """Each frame from the first key to the last, and the keys themselves.

    None where nothing moves.
    """
    keyed = [frame for stream in streams if stream.moves
             for frame in stream.frames]
    if not keyed:
        return None
    first, last = min(keyed), max(keyed)
    count = int(math.floor(last - first)) + 1
    return sorted({first + step for step in range(count)} | set(keyed))


def _evenly_scaled(layer):
    return all(value[0] == value[1] == value[2] and value[0] > 0.0
               for link in layer.chain()
               for value in link.streams["scale"].values)


def _is_straight(linear):
    wanted = matrices.upright(linear)
    if wanted is None:
        return True
    for axis, square in zip(zip(*linear), zip(*wanted)):
        direction = matrices.unit(axis)
        if direction is None or math.dist(direction, square) > _STRAIGHT:
            return False
    return True


def is_slanted(layer):
    """Whether a camera's place in the world is more than a rotation.

    Scales above it have slanted or mirrored its axes. Blender would show
    the picture through the slanted axes, the composition does not.
    """
    if _evenly_scaled(layer):
        return False
    frames = sampled_frames(_moving(layer)) or [0.0]
    return not all(_is_straight(world_at(layer, frame)[0])
                   for frame in frames)


def _moving(layer):
    return [stream for link in layer.chain()
            for name, stream in link.streams.items() if name != "zoom"]


def _angle_rows(rotations):
    rows = []
    before = (0.0, 0.0, 0.0)
    for rotation in rotations:
        before = matrices.angles(rotation, before)
        rows.append(before)
    return rows


def _plain_rotation(layer):
    signs = (("xRotation", 1.0), ("yRotation", -1.0), ("zRotation", -1.0))
    return [track("rotation_euler", index, layer.streams[name].frames,
                  [sign * math.radians(value[0])
                   for value in layer.streams[name].values])
            for index, (name, sign) in enumerate(signs)]


def _aimed_rotation(layer):
    names = ("position", "pointOfInterest",
             "xRotation", "yRotation", "zRotation")
    frames = sampled_frames([layer.streams[name] for name in names])
    rows = _angle_rows(rotation_at(layer, frame)
                       for frame in frames or [0.0])
    return _columns("rotation_euler", frames, rows)


def tracks(layer, factor):
    """The tracks of a layer under its parent. Lengths times the factor."""
    position = layer.streams["position"]
    places = [[part * factor for part in turned(value)]
              for value in position.values]
    scale = layer.streams["scale"]
    parts = [[part / 100.0 for part in value] for value in scale.values]
    return (_columns("location", position.frames, places)
            + (_aimed_rotation(layer) if layer.aimed
               else _plain_rotation(layer))
            + _columns("scale", scale.frames, parts))


def world_tracks(layer, factor):
    """The tracks of a slanted camera: its place and rotation in the world."""
    frames = sampled_frames(_moving(layer))
    worlds = [world_at(layer, frame) for frame in frames or [0.0]]
    places = [[part * factor for part in origin] for _, origin in worlds]
    rows = _angle_rows(matrices.upright(linear) or matrices.IDENTITY
                       for linear, _ in worlds)
    return (_columns("location", frames, places)
            + _columns("rotation_euler", frames, rows)
            + [Track("scale", index, None, [1.0]) for index in range(3)])
