"""Compares a trace with the model's: doubles within a tolerance, everything else exactly, keys in order."""

import json

TOLERANCE = 1e-9
# Where the trace holds doubles; every other number is an integer and compared exactly.
DOUBLES = {("NewCameraLayer", "center"), ("SetCameraFilmSize", "filmSize"), ("SetStreamValue", "value"),
           ("SetBatchKeyframeValue", "value")}


def close(expected, found):
    return abs(expected - found) <= TOLERANCE * max(1.0, abs(expected), abs(found))


def same_doubles(expected, found):
    if not isinstance(expected, list):
        expected, found = [expected], [found]
    if not isinstance(found, list) or len(expected) != len(found):
        return False
    return all(isinstance(number, (int, float)) and close(value, number)
               for value, number in zip(expected, found))


def difference(expected, found):
    """What is different between two lines, or None."""
    if list(expected) != list(found):
        return "keys are %s, expected %s" % (list(found), list(expected))
    for key, value in expected.items():
        if (expected["call"], key) in DOUBLES and value is not None:
            same = same_doubles(value, found[key])
        else:
            same = json.dumps(value) == json.dumps(found[key])
        if not same:
            return "%s is %s, expected %s" % (key, json.dumps(found[key]), json.dumps(value))
    return None


def first_difference(expected, text):
    """A sentence about the first line of the trace that is not as expected, or None."""
    lines = text.split("\n")
    if lines.pop() != "":
        return "the trace does not end with a line end"
    for number, line in enumerate(lines, 1):
        if number > len(expected):
            return "line %d: nothing expected any more, found %s" % (number, line)
        what = difference(expected[number - 1], json.loads(line))
        if what:
            return "line %d: %s\n  expected %s\n  found    %s" % (
                number, what, json.dumps(expected[number - 1], ensure_ascii=False), line)
    if len(lines) < len(expected):
        return "the trace ends before %s" % json.dumps(expected[len(lines)])
    return None
