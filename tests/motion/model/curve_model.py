"""A second evaluator of animation curves: plain and slow, written from the rules, by halving where a root is sought."""

import math
from dataclasses import dataclass, field
from fractions import Fraction

ON_KEY = 1e-10
STEP, STEP_NEXT, LINEAR, FLAT, CLAMPED, PLATEAU, AUTO, MIX, EASE = 5, 17, 2, 3, 10, 16, 18, 27, 28


@dataclass
class Key:
    time: float
    value: float  # internal units
    in_type: int
    out_type: int
    in_tangent: tuple = None  # (x, y) as written, or None
    out_tangent: tuple = None


@dataclass
class Model:
    weighted: bool
    pre: int
    post: int
    keys: list = field(default_factory=list)
    moved: bool = False  # whether the last value came from a span whose handles were moved to keep time running

    # Slopes.

    def neighbours(self, at):
        key = self.keys[at]
        before = self.keys[at - 1] if at > 0 else None
        after = self.keys[at + 1] if at + 1 < len(self.keys) else None
        return before, key, after

    def rule(self, at, incoming):
        """The slope that a key has by its type."""
        before, key, after = self.neighbours(at)
        kind = key.in_type if incoming else key.out_type
        if kind in (STEP, STEP_NEXT, FLAT):
            return 0.0
        if before is None and after is None:
            return 0.0
        if before is None or after is None:
            left, right = (key, after) if before is None else (before, key)
            rise = right.value - left.value
            slope = rise / (right.time - left.time)
            if kind == LINEAR:
                outside = incoming == (before is None)
                return 0.0 if outside else slope
            if kind in (PLATEAU, AUTO, MIX, EASE):
                return 0.0
            if kind == CLAMPED and abs(rise) <= 0.05:
                return 0.0
            return slope
        a = (key.value - before.value) / (key.time - before.time)
        b = (after.value - key.value) / (after.time - key.time)
        spline = (after.value - before.value) / (after.time - before.time)
        if kind == LINEAR:
            return a if incoming else b
        if kind == CLAMPED:
            near = abs(key.value - before.value) <= 0.05 or abs(after.value - key.value) <= 0.05
            return 0.0 if near else spline
        if kind == PLATEAU:
            extreme = key.value >= max(before.value, after.value) or key.value <= min(before.value, after.value)
            return 0.0 if extreme or abs(spline) > 3 * min(abs(a), abs(b)) else spline
        if kind in (AUTO, MIX, EASE):
            f = (key.time - before.time) / (after.time - before.time)
            if kind == EASE:
                h = f - 0.5
                f = 0.5 + h * (1.5 - 2 * h * h)
            slope = spline if kind == AUTO else (1 - f) * a + f * b
            if (a < 0) != (b < 0) or a == 0 or b == 0:
                return 0.0
            return math.copysign(min(abs(slope), 3 * min(abs(a), abs(b))), slope)
        return spline

    def slope(self, at, incoming):
        key = self.keys[at]
        written = key.in_tangent if incoming else key.out_tangent
        if written is None:
            return self.rule(at, incoming)
        x, y = written
        return y / x if x != 0 else 0.0

    def handle(self, at, incoming, length):
        """How far the handle is from its key, in seconds and in value."""
        key = self.keys[at]
        written = key.in_tangent if incoming else key.out_tangent
        if written is not None:
            return written[0] / 3, written[1] / 3
        return length / 3, self.rule(at, incoming) * length / 3

    # One span.

    def span(self, at, time):
        left, right = self.keys[at], self.keys[at + 1]
        if left.out_type == STEP:
            return left.value
        if left.out_type == STEP_NEXT:
            return right.value
        length = right.time - left.time
        share = (time - left.time) / length
        if left.out_type == LINEAR and right.in_type == LINEAR:
            return (1 - share) * left.value + share * right.value
        if not self.weighted:
            return self.hermite(left.value, right.value, self.slope(at, False) * length, self.slope(at + 1, True) * length, share)
        return self.weighted_span(at, share, length)

    @staticmethod
    def hermite(v0, v1, m0, m1, s):
        return (2 * s**3 - 3 * s**2 + 1) * v0 + (s**3 - 2 * s**2 + s) * m0 + (3 * s**2 - 2 * s**3) * v1 + (s**3 - s**2) * m1

    def weighted_span(self, at, share, length):
        left, right = self.keys[at], self.keys[at + 1]
        out_x, out_y = self.handle(at, False, length)
        in_x, in_y = self.handle(at + 1, True, length)
        x1, x2 = out_x / length, 1 - in_x / length
        new1, new2 = max(x1, 0.0), min(x2, 1.0)
        if new1 > 1 or new2 < 0:
            new1, new2 = self.monotone(new1, new2)
        if new1 != x1:
            out_y = self.slope(at, False) * new1 * length
        if new2 != x2:
            in_y = self.slope(at + 1, True) * (1 - new2) * length
        if abs(new1 - 1 / 3) < 1e-6 and abs(new2 - 2 / 3) < 1e-6:
            u = share
        else:
            u = self.halving(lambda u: self.bezier(0.0, new1, new2, 1.0, u), share)
        return self.bezier(left.value, left.value + out_y, right.value - in_y, right.value, u)

    def monotone(self, x1, x2):
        x, y = x1, 1 - x2
        if x >= 4 / 3:
            self.moved = True
            return 4 / 3, 2 / 3
        # y² + (x - 2) y + (x - 1)² has the value 0 at the edge.
        if y * y + (x - 2) * y + (x - 1) ** 2 <= 0:
            return x1, x2
        self.moved = True
        root = math.sqrt((x - 2) ** 2 - 4 * (x - 1) ** 2)
        lower, upper = ((2 - x) - root) / 2, ((2 - x) + root) / 2
        y = upper - 1e-10 if abs(y - upper) < abs(y - lower) else lower + 1e-10
        return x1, 1 - y

    @staticmethod
    def bezier(a, b, c, d, u):
        ab, bc, cd = a + (b - a) * u, b + (c - b) * u, c + (d - c) * u
        abc, bcd = ab + (bc - ab) * u, bc + (cd - bc) * u
        return abc + (bcd - abc) * u

    @staticmethod
    def halving(function, target):
        low, high = 0.0, 1.0
        while True:
            middle = (low + high) / 2
            if middle in (low, high):
                return middle
            if function(middle) < target:
                low = middle
            else:
                high = middle

    # Any time.

    def inside(self, time):
        for key in self.keys:
            if abs(time - key.time) <= ON_KEY:
                return key.value
        at = max(index for index, key in enumerate(self.keys) if key.time < time)
        return self.span(at, time)

    def at(self, time):
        self.moved = False
        first, last = self.keys[0], self.keys[-1]
        if len(self.keys) == 1:
            return first.value
        if first.time - ON_KEY <= time <= last.time + ON_KEY:
            return self.inside(time)
        after = time > last.time
        code = self.post if after else self.pre
        end = last if after else first
        if code == 1:
            return end.value + self.slope(len(self.keys) - 1 if after else 0, not after) * (time - end.time)
        if code not in (3, 4, 5):
            return end.value
        duration = Fraction(last.time) - Fraction(first.time)
        beyond = Fraction(time) - Fraction(last.time) if after else Fraction(first.time) - Fraction(time)
        turns, rest = divmod(beyond, duration)
        if duration - rest <= ON_KEY:  # a whole turn but for rounding
            turns, rest = turns + 1, 0
        from_first, from_last = float(first.time + Fraction(rest)), float(last.time - Fraction(rest))
        if code == 5:
            forwards = turns % 2 == (1 if after else 0)
            return self.inside(from_first if forwards else from_last)
        value = self.inside(from_first if after else from_last)
        if code == 4:
            offset = (turns + 1) * (last.value - first.value)
            value += offset if after else -offset
        return value
