"""Rotations and places in the scene's axes: Y up, a camera looks along -Z.

A matrix is three rows that act on columns. Angles are radians, and a
rotation is Rz*Ry*Rx, which is Blender's order XYZ.
"""

import math

IDENTITY = ((1.0, 0.0, 0.0), (0.0, 1.0, 0.0), (0.0, 0.0, 1.0))

# Below this cosine of the Y angle, X and Z turn about one axis.
_POLE = 1e-9


def times(left, right):
    columns = tuple(zip(*right))
    return tuple(tuple(dot(row, column) for column in columns)
                 for row in left)


def dot(a, b):
    return a[0] * b[0] + a[1] * b[1] + a[2] * b[2]


def cross(a, b):
    return (a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2],
            a[0] * b[1] - a[1] * b[0])


def unit(vector):
    """The direction of a vector; None where its length is 0 or infinite."""
    length = math.hypot(*vector)
    if not length > 0.0 or math.isinf(length):
        return None
    return tuple(component / length for component in vector)


def applied(matrix, vector):
    return tuple(dot(row, vector) for row in matrix)


def rotation(x, y, z):
    sx, cx = math.sin(x), math.cos(x)
    sy, cy = math.sin(y), math.cos(y)
    sz, cz = math.sin(z), math.cos(z)
    return ((cy * cz, sx * sy * cz - cx * sz, cx * sy * cz + sx * sz),
            (cy * sz, sx * sy * sz + cx * cz, cx * sy * sz - sx * cz),
            (-sy, sx * cy, cx * cy))


def towards(direction):
    """A camera that looks along a direction, without a roll."""
    ahead = unit(direction)
    if ahead is None:
        return IDENTITY
    back = tuple(-component for component in ahead)
    right = unit(cross((0.0, 1.0, 0.0), back)) or (1.0, 0.0, 0.0)
    return tuple(zip(right, cross(back, right), back))


def upright(matrix):
    """The rotation that a camera has under a matrix.

    X keeps its direction, Y keeps its plane with X, and Z is square to
    both. None where X or Y has no direction.
    """
    x, y, _ = zip(*matrix)
    x = unit(x)
    if x is None:
        return None
    along = dot(x, y)
    y = unit(tuple(b - along * a for a, b in zip(x, y)))
    if y is None:
        return None
    return tuple(zip(x, y, cross(x, y)))


def _nearest(angle, before):
    turn = 2.0 * math.pi
    return angle + turn * round((before - angle) / turn)


def angles(matrix, before=(0.0, 0.0, 0.0)):
    """The angles of a rotation that are nearest to those before."""
    cosine = math.hypot(matrix[0][0], matrix[1][0])
    y = math.atan2(-matrix[2][0], cosine)
    if cosine < _POLE:
        z = before[2]
        sign = 1.0 if y > 0.0 else -1.0
        x = sign * z + math.atan2(sign * matrix[0][1], matrix[1][1])
        found = [(x, y, z)]
    else:
        x = math.atan2(matrix[2][1], matrix[2][2])
        z = math.atan2(matrix[1][0], matrix[0][0])
        found = [(x, y, z), (x + math.pi, math.pi - y, z + math.pi)]
    near = [tuple(map(_nearest, three, before)) for three in found]
    return min(near, key=lambda three: math.dist(three, before))
