"""Holds the trace of one build to that of another: byte for byte, but for doubles that went through sine, cosine or
arc tangent."""

import json
import math

RELATIVE = 1e-12
# Where parts of a sum take each other away, what is left carries the rounding of the parts: a coordinate of 1e-14
# beside one of 600 is such a remainder. So a number is measured by the largest of its value, and by no less than 1,
# of a point, a percent or a degree.
FLOOR = 1.0

POSITION, SCALE, ROTATION_Z, ROTATION_X, ROTATION_Y = 1, 2, 3, 8, 9
# The streams whose values are read off a matrix. All others go from the scene to the host by plain arithmetic.
FROM_MATRIX = {POSITION, SCALE, ROTATION_Z, ROTATION_X, ROTATION_Y}


class Tally:
    """What was compared, and what the numbers that differ amount to."""

    def __init__(self):
        self.traces = self.same_bytes = self.lines = self.differing = 0
        self.worst = 0.0

    def add(self, other):
        for name in ("traces", "same_bytes", "lines", "differing"):
            setattr(self, name, getattr(self, name) + getattr(other, name))
        self.worst = max(self.worst, other.worst)


def is_number(value):
    return isinstance(value, (int, float))  # "inf" and "nan" are texts


def values_agree(ours, theirs, tally):
    """Two values of a stream that was read off a matrix."""
    if not isinstance(ours, list) or not isinstance(theirs, list) or len(ours) != len(theirs):
        return ours == theirs
    measure = max([FLOOR] + [abs(value) for value in ours + theirs if is_number(value)])
    for one, other in zip(ours, theirs):
        if not is_number(one) or not is_number(other):
            if one != other:
                return False
        elif one != other or math.copysign(1, one) != math.copysign(1, other):
            tally.differing += 1
            tally.worst = max(tally.worst, abs(one - other) / measure)
            if abs(one - other) > RELATIVE * measure:
                return False
    return True


def without_value(line):
    """A line up to its value and from there on. What stands before cannot hold a value: it is a handle or a number."""
    head, found, tail = line.partition(b',"value":[')
    return head, tail.partition(b"]")[2] if found else b""


def lines_agree(ours, theirs, streams, tally):
    """`streams` has the property of each stream that was acquired, by handle, and is kept up."""
    if ours == theirs:
        if ours.startswith(b'{"call":"AcquireLayerStream"'):
            call = json.loads(ours)
            streams[call["stream"]] = call["streamId"]
        return True
    if not ours.startswith(b'{"call":"Set') or without_value(ours) != without_value(theirs):
        return False
    call = json.loads(ours)
    return streams.get(call.get("stream")) in FROM_MATRIX and values_agree(
        call["value"], json.loads(theirs)["value"], tally)


def compare(ours, theirs):
    """Two traces, as bytes. Returns a tally, and the first line that differs with both its forms, or None."""
    tally = Tally()
    tally.traces = 1
    tally.same_bytes = int(ours == theirs)
    if ours == theirs:
        tally.lines = ours.count(b"\n")
        return tally, None
    our_lines, their_lines = ours.split(b"\n"), theirs.split(b"\n")
    tally.lines = len(our_lines) - 1
    streams = {}
    for number, (one, other) in enumerate(zip(our_lines, their_lines), 1):
        if not lines_agree(one, other, streams, tally):
            return tally, (number, one, other)
    if len(our_lines) != len(their_lines):
        return tally, (tally.lines, b"(%d lines)" % tally.lines, b"(%d lines)" % (len(their_lines) - 1))
    return tally, None
