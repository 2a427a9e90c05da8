"""Affine maps of column vectors as (linear 3x3, translation 3), and how one is taken apart."""

import math

POLE = 1e-9


class Affine:
    """A map p -> L p + t. Each operation acts after those that the map already holds."""

    def __init__(self):
        self.linear = [[1.0, 0.0, 0.0], [0.0, 1.0, 0.0], [0.0, 0.0, 1.0]]
        self.offset = [0.0, 0.0, 0.0]

    def translate(self, x, y, z):
        self.offset = [a + b for a, b in zip(self.offset, (x, y, z))]

    def after(self, matrix):
        self.linear = [[sum(row[k] * self.linear[k][column] for k in range(3)) for column in range(3)]
                       for row in matrix]
        self.offset = [sum(row[k] * self.offset[k] for k in range(3)) for row in matrix]

    def scale(self, x, y, z):
        self.after([[x, 0.0, 0.0], [0.0, y, 0.0], [0.0, 0.0, z]])

    def rotate(self, axis, angle):
        sine, cosine = math.sin(angle), math.cos(angle)
        first, second = (axis + 1) % 3, (axis + 2) % 3
        matrix = [[1.0 if row == column else 0.0 for column in range(3)] for row in range(3)]
        matrix[first][first] = matrix[second][second] = cosine
        matrix[first][second], matrix[second][first] = -sine, sine
        self.after(matrix)

    def decompose(self):
        """(translation, scale, angles): T Rz Ry Rx S gives the map back; only the x scale can be negative."""
        columns = [[self.linear[row][column] for row in range(3)] for column in range(3)]
        scale = [math.hypot(*column) for column in columns]
        a, b, c = columns
        volume = (a[0] * (b[1] * c[2] - b[2] * c[1]) - b[0] * (a[1] * c[2] - a[2] * c[1])
                  + c[0] * (a[1] * b[2] - a[2] * b[1]))
        if volume < 0.0:
            scale[0] = -scale[0]
        x, y, z = [[part / length for part in column] if length else [float(k == n) for k in range(3)]
                   for n, (column, length) in enumerate(zip(columns, scale))]
        cosine = math.hypot(x[0], x[1])
        about_y = math.atan2(-x[2], cosine)
        if cosine < POLE:
            return self.offset, scale, [math.atan2(-z[1], y[1]), about_y, 0.0]
        return self.offset, scale, [math.atan2(y[2], z[2]), about_y, math.atan2(x[1], x[0])]
