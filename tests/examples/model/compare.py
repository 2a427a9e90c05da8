"""Compares a trace with the model's: doubles that went through an angle within a tolerance, everything else exactly,
keys in order."""

import json

TOLERANCE = 1e-12
# Where the trace holds doubles; every other number is an integer.
DOUBLES = {("NewCameraLayer", "center"), ("SetCameraFilmSize", "filmSize"), ("SetStreamValue", "value"),
           ("SetBatchKeyframeValue", "value")}
# What no angle goes into, so that it agrees to the bit: film sizes, and the values of zoom streams.
FILM_SIZE, ZOOM = "SetCameraFilmSize", 11


def close(expected, found):
    return abs(expected - found) <= TOLERANCE * max(1.0, abs(expected), abs(found))


def same_doubles(expected, found, exact):
    if not isinstance(expected, list):
        expected, found = [expected], [found]
    if not isinstance(found, list) or len(expected) != len(found):
        return False
    return all(isinstance(number, (int, float)) and (value == number if exact else close(value, number))
               for value, number in zip(expected, found))


def difference(expected, found, zooms):
    """What is different between two lines, or None. `zooms` are the zoom streams acquired so far."""
    exact = expected["call"] == FILM_SIZE or expected.get("stream") in zooms
    if expected["call"] == "AcquireLayerStream" and expected["streamId"] == ZOOM:
        zooms.add(expected["stream"])
    if list(expected) != list(found):
        return "keys are %s, expected %s" % (list(found), list(expected))
    for key, value in expected.items():
        if (expected["call"], key) in DOUBLES and value is not None:
            same = same_doubles(value, found[key], exact)
        else:
            same = json.dumps(value) == json.dumps(found[key])
        if not same:
            return "%s is %s, expected %s" % (key, json.dumps(found[key]), json.dumps(value))
    return None


def first_difference(expected, text):
    """A sentence about the first line of the trace that is not as expected, or None."""
    lines, zooms = text.split("\n"), set()
    if lines.pop() != "":
        return "the trace does not end with a line end"
    for number, line in enumerate(lines, 1):
        if number > len(expected):
            return "line %d: nothing expected any more, found %s" % (number, line)
        what = difference(expected[number - 1], json.loads(line), zooms)
        if what:
            return "line %d: %s\n  expected %s\n  found    %s" % (
                number, what, json.dumps(expected[number - 1], ensure_ascii=False), line)
    if len(lines) < len(expected):
        return "the trace ends before %s" % json.dumps(expected[len(lines)])
    return None
