"""USD as text: the reader of these tests."""

import re
import struct

_TOKEN = re.compile(r'\s+|#[^\n]*|"(?:[^"\\]|\\.)*"|[][{}()=,:]'
                    r'|[^\s#"\][{}()=,:]+(?::[^\s#"\][{}()=,:]+)*')

_BRACKETS = {"(": ")", "[": "]", "{": "}"}


class NoUsda(Exception):
    pass


class Prim:
    def __init__(self, kind, prim, above):
        self.kind = kind
        self.prim = prim
        self.above = above
        self.name = prim
        self.children = []
        self.values = {}
        self.samples = {}

    def number_at(self, attribute, time):
        """A number of 32 bits; between two samples it moves evenly."""
        (before, one), (after, other) = self._around(attribute, time)
        one, other = _single(one), _single(other)
        if before == after:
            return one
        return one + (other - one) * (time - before) / (after - before)

    def vector_at(self, attribute, time):
        """Doubles, at a sample."""
        (before, one), (after, _) = self._around(attribute, time)
        if before != after:
            raise ValueError(f"{attribute} has no sample at {time}")
        return one

    def _around(self, attribute, time):
        samples = self.samples.get(attribute)
        if not samples:
            return [(time, self.values[attribute])] * 2
        before = max((key for key in samples if key <= time),
                     default=min(samples))
        after = min((key for key in samples if key >= time),
                    default=max(samples))
        return (before, samples[before]), (after, samples[after])


def _single(number):
    return struct.unpack("f", struct.pack("f", number))[0]


class _Reader:
    def __init__(self, text):
        if not text.startswith("#usda 1.0\n"):
            raise ValueError("the file does not begin as USD text")
        self._tokens = [match[0] for match in _TOKEN.finditer(text)
                        if not match[0][0].isspace() and match[0][0] != "#"]
        self._place = 0

    def _next(self):
        self._place += 1
        return self._tokens[self._place - 1]

    def _at(self, token):
        return (self._place < len(self._tokens)
                and self._tokens[self._place] == token)

    def _expect(self, token):
        found = self._next()
        if found != token:
            raise ValueError(f"{found} where {token} belongs")

    def stage(self):
        """The head and the prims, below one that stands for the file."""
        root = Prim("", "", None)
        self._expect("(")
        root.values = self._assignments(")")[0]
        prim = root
        while self._place < len(self._tokens):
            if self._at("}"):
                self._next()
                prim = prim.above
            elif self._at("def"):
                prim = self._begin(prim)
            else:
                self._attribute(prim.values, prim.samples)
        if prim is not root:
            raise ValueError("a prim has no end")
        return root

    def _begin(self, above):
        self._expect("def")
        prim = Prim(self._next(), _text(self._next()), above)
        above.children.append(prim)
        if self._at("("):
            self._next()
            head = self._assignments(")")[0]
            prim.name = head.get("customData", {}).get("name", prim.prim)
        self._expect("{")
        return prim

    def _assignments(self, end):
        values, samples = {}, {}
        while not self._at(end):
            self._attribute(values, samples)
        self._expect(end)
        return values, samples

    def _attribute(self, values, samples):
        """`double3 NAME = value`: the last of the words is the name."""
        words = []
        while not self._at("="):
            words.append(self._next())
        self._expect("=")
        name = words[-1]
        if name.endswith(".timeSamples"):
            samples[name.removesuffix(".timeSamples")] = self._samples()
        elif self._at("{"):
            self._next()
            values[name] = self._assignments("}")[0]
        else:
            values[name] = self._value()

    def _samples(self):
        found = {}
        self._expect("{")
        while not self._at("}"):
            time = float(self._next())
            self._expect(":")
            found[time] = self._value()
            if self._at(","):
                self._next()
        self._expect("}")
        return found

    def _value(self):
        token = self._next()
        if token in ("(", "["):
            parts = []
            while not self._at(_BRACKETS[token]):
                parts.append(self._value())
                if self._at(","):
                    self._next()
            self._next()
            return parts
        return _text(token) if token[0] == '"' else float(token)


def _text(token):
    return re.sub(r"\\(.)", r"\1", token[1:-1])


def read(path):
    with open(path, encoding="utf-8") as file:
        text = file.read()
    try:
        return _Reader(text).stage()
    except (ValueError, IndexError) as failure:
        raise NoUsda(f"{path}: {failure}") from failure
