"""Points of a scene's world whose pixels are compared.

They are the places of the nulls that are no part of a camera's rig, and a
grid across the picture at three depths, as each camera sees it at the first,
the middle and the last frame.
"""

import math

_GRID = (-0.45, -0.2, 0.0, 0.3, 0.45)
_DEPTHS = (0.3, 1.0, 4.0)


def filmed(composition):
    """The nulls that carry no camera: a camera does not film its own rig."""
    rigs = [link for camera in composition.cameras()
            for link in composition.chain(camera)]
    names = {link.name for link in rigs}
    return [null for null in composition.nulls() if null.name not in names]


def _depth_of(composition, place, frame):
    """How far what is filmed may be: the origin, a null, at least 1."""
    others = [composition.place(null, frame) for null in filmed(composition)]
    far = [math.dist(place, other) for other in others + [[0.0, 0.0, 0.0]]]
    return max(1.0, sorted(far)[len(far) // 2])


def _grid(composition, camera, frame):
    view = composition.view(camera, frame)
    usual = _depth_of(composition, view.place, frame)
    for times in _DEPTHS:
        depth = usual * times
        for u in _GRID:
            for v in _GRID:
                seen = (u * composition.width * depth / view.zoom,
                        v * composition.height * depth / view.zoom, -depth)
                yield [view.place[i]
                       + sum(seen[k] * view.axes[k][i] for k in range(3))
                       for i in range(3)]


def known_points(composition, camera):
    ends = composition.start, composition.end
    frames = sorted({*ends, sum(ends) // 2})
    points = [composition.place(null, frame) for frame in frames
              for null in filmed(composition)]
    for frame in frames:
        points += _grid(composition, camera, frame)
    return points
