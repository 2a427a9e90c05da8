"""Reads a scene text into records: a model of the importer's reader, written on its own and for clearness.

It keeps every rule that changes what comes out: tokens, the copy of the current node, first match by name.
"""

import copy
import re
from dataclasses import dataclass, field

from tokens import CODE_END, END_MESSAGE, ImportFailure, Tokens, copied, scanned, truncated, unquoted


@dataclass
class Node:
    kind: str
    name: bytes = b""
    parent: bytes = b""
    translate: list = field(default_factory=lambda: [0.0, 0.0, 0.0])
    rotate: list = field(default_factory=lambda: [0.0, 0.0, 0.0])
    scale: list = field(default_factory=lambda: [1.0, 1.0, 1.0])
    rotate_pivot: list = field(default_factory=lambda: [0.0, 0.0, 0.0])
    scale_pivot: list = field(default_factory=lambda: [0.0, 0.0, 0.0])
    curve: list = field(default_factory=lambda: [-1] * 12)
    aperture: list = field(default_factory=lambda: [1.4173, 0.9449])
    focal_length: float = 35.0
    vertical_fit: bool = False
    orthographic: bool = False
    focal_curve: int = -1
    keys: list = None

    def snapshot(self):
        """A copy as the importer makes one: everything by value but the key list, which is a handle."""
        twin = copy.copy(self)
        for name in ("translate", "rotate", "scale", "rotate_pivot", "scale_pivot", "curve", "aperture"):
            setattr(twin, name, list(getattr(self, name)))
        return twin


NODE_TYPES = {b"transform": "transform", b"stereorigtransform": "transform", b"lookat": "transform",
              b"aimconstraint": "transform", b"locator": "locator", b"camera": "camera",
              b"stereorigcamera": "camera", b"animcurvetl": "curve", b"animcurveta": "curve",
              b"animcurvetu": "curve"}
TRIPLES = {b".t": ("translate", 0.0), b".translate": ("translate", 0.0), b".r": ("rotate", 0.0),
           b".rotate": ("rotate", 0.0), b".s": ("scale", 1.0), b".scale": ("scale", 1.0),
           b".rp": ("rotate_pivot", 0.0), b".rotatepivot": ("rotate_pivot", 0.0),
           b".sp": ("scale_pivot", 0.0), b".scalepivot": ("scale_pivot", 0.0)}
LINEAR = {b"mm": 1, b"millimeter": 1, b"cm": 2, b"centimeter": 2, b"m": 3, b"meter": 3, b"km": 4,
          b"kilometer": 4, b"in": 5, b"inch": 5, b"ft": 6, b"foot": 6, b"yd": 7, b"yard": 7, b"mi": 8,
          b"mile": 8}
ANGLE = {b"deg": 1, b"degree": 1, b"rad": 2, b"radian": 2}
TIME = {b"hour": 1, b"min": 2, b"sec": 3, b"millisec": 4, b"game": 5, b"film": 6, b"pal": 7, b"ntsc": 8,
        b"show": 9, b"palf": 10, b"ntscf": 11}
CUSTOM_RATE = 12
CHANNELS = {}
for _slot, _names in enumerate((b"tx translatex", b"ty translatey", b"tz translatez", b"rx rotatex",
                                b"ry rotatey", b"rz rotatez", b"sx scalex", b"sy scaley", b"sz scalez")):
    for _name in _names.split():
        CHANNELS[_name] = _slot
FOLLOWS, TARGET, TURNS = 9, 10, 11
TURNING = {b"constraintrotate", b"cr", b"constraintrotatex", b"crx", b"constraintrotatey", b"cry",
           b"constraintrotatez", b"crz", b"constraintvector", b"cv", b"constraintvectorx",
           b"constraintvectory", b"constraintvectorz"}
FOLLOWING = {b"constrainttranslate", b"ct", b"constrainttranslatex", b"ctx", b"constrainttranslatey",
             b"cty", b"constrainttranslatez", b"ctz"}


class SceneText:
    """The records and settings of one scene."""

    def __init__(self, text):
        self.tokens = Tokens(text)
        self.lists = {"transform": [], "camera": [], "curve": [], "locator": []}
        self.kind = None
        self.current = None
        self.time_unit, self.frame_rate, self.angle_unit, self.linear_unit = 3, 29.97, 1, 2
        self.width, self.height, self.pixel_aspect = 720, 486, 0.9091

    def first(self, kind, name):
        """The index of the first record of that name, or -1."""
        lowered = name.lower()
        for index, node in enumerate(self.lists[kind]):
            if node.name.lower() == lowered:
                return index
        return -1

    def inside(self):
        """The next token of a command, which the end of the text must not cut short."""
        token = self.tokens.next()
        if token[0] == "end":
            raise ImportFailure(CODE_END, END_MESSAGE)
        return token

    def to_semicolon(self):
        while True:
            token = self.inside()
            if token[0] == ";":
                return
            yield token

    def read(self):
        commands = {"createnode": self.create_node, "connectattr": self.connect, "select": self.select,
                    "currentunit": self.units, "setattr": self.set_attribute}
        while True:
            kind, _ = self.tokens.next()
            if kind == "end":
                return
            if kind in commands:
                commands[kind]()

    def create_node(self):
        kind, text = self.tokens.next()
        if kind != "identifier":
            return
        node_kind = NODE_TYPES.get(copied(text).lower())
        if node_kind is None:
            self.kind = self.current = None
            return
        node = Node(node_kind)
        fields = {b"-n": "name", b"-name": "name", b"-p": "parent", b"-parent": "parent"}
        for kind, text in self.to_semicolon():
            where = fields.get(copied(text).lower()) if kind == "option" else None
            if where is None:
                continue
            kind, text = self.inside()
            if kind == "string":
                setattr(node, where, unquoted(text))
            if kind == ";":
                break
        self.lists[node_kind].append(node)
        self.kind, self.current = node_kind, node.snapshot()

    def write_back(self):
        index = self.first(self.kind, self.current.name)
        if index >= 0:
            self.lists[self.kind][index] = self.current.snapshot()

    def set_attribute(self):
        parsers = {"transform": self.set_transform, "camera": self.set_camera, "curve": self.set_keys,
                   "render": self.set_render}
        if self.kind in parsers:
            parsers[self.kind]()

    def set_transform(self):
        kind, text = self.tokens.next()
        known = TRIPLES.get(unquoted(text).lower()) if kind == "string" else None
        if known is None:
            return
        name, start = known
        setattr(self.current, name, self.numbers(3, start)[1])
        self.write_back()

    def numbers(self, count, start):
        values, found = [start] * count, 0
        for kind, text in self.to_semicolon():
            if kind == "number" and found < count:
                values[found] = scanned(text)
                found += 1
        return found, values

    def set_camera(self):
        kind, text = self.tokens.next()
        if kind == "option":
            self.tokens.next()
            kind, text = self.tokens.next()
        name = unquoted(text).lower() if kind == "string" else b""
        camera, given = self.current, 0
        if name in (b".o", b".orthographic"):
            for kind, text in self.to_semicolon():
                if kind == "identifier" and copied(text).lower() == b"yes":
                    camera.orthographic, given = True, 1
        elif name in (b".ff", b".filmfit"):
            for kind, text in self.to_semicolon():
                if kind == "number":
                    camera.vertical_fit, given = abs(scanned(text) - 2.0) < 2e-12, 1
        elif name in (b".fl", b".focallength"):
            for kind, text in self.to_semicolon():
                if kind == "number":
                    camera.focal_length, given = scanned(text), 1
        elif name in (b".cap", b".cameraaperture"):
            given, values = self.numbers(2, 0.0)
            if given:
                camera.aperture = values
        elif name in (b".wci", b".worldcenterofinterest"):
            given, _ = self.numbers(3, 0.0)
        if given:
            self.write_back()

    def set_keys(self):
        for kind, text in self.to_semicolon():
            if kind == "option" and copied(text).lower() != b"-s":
                self.inside()
            elif kind == "string" and re.search(rb"\.ktv|\.keyTimeValue", unquoted(text)):
                self.read_keys()
                break
        self.write_back()

    def read_keys(self):
        for kind, text in self.to_semicolon():
            if kind != "number":
                continue
            time, value = scanned(text), 0.0
            kind, text = self.inside()
            if kind == "number":
                value = scanned(text)
            if self.current.keys is None:
                self.current.keys = []
            self.current.keys.append((time, value))
            if kind == ";":
                return

    def set_render(self):
        fields = {b".w": "width", b".width": "width", b".h": "height", b".height": "height",
                  b".pa": "pixel_aspect", b".pixelaspect": "pixel_aspect", b".dar": None,
                  b".deviceaspectratio": None}
        for kind, text in self.to_semicolon():
            name = unquoted(text).lower() if kind == "string" else b""
            if name not in fields:
                continue
            kind, text = self.inside()
            if kind == ";":
                return
            if kind == "number" and fields[name]:
                value = scanned(text)
                setattr(self, fields[name], value if fields[name] == "pixel_aspect" else truncated(value))

    def select(self):
        matched = False
        while True:
            kind, text = self.inside()
            if kind == "option":
                continue
            if kind == ":":
                kind, text = self.inside()
                if kind == ";":
                    return
                if kind != "identifier" or copied(text).lower() != b"defaultresolution":
                    continue
            if kind == "identifier" and copied(text).lower() == b"defaultresolution":
                self.current, self.kind, matched = None, "render", True
                continue
            if not matched:
                self.current = self.kind = None
            if kind == ";":
                return

    def units(self):
        for kind, text in self.to_semicolon():
            option = copied(text).lower() if kind == "option" else b""
            if option not in (b"-l", b"-linear", b"-a", b"-angle", b"-t", b"-time"):
                continue
            kind, text = self.inside()
            if kind == ";":
                return
            word = copied(text).lower() if kind == "identifier" else b""
            if option in (b"-l", b"-linear"):
                self.linear_unit = LINEAR.get(word, self.linear_unit)
            elif option in (b"-a", b"-angle"):
                self.angle_unit = ANGLE.get(word, self.angle_unit)
            elif kind == "number":
                self.time_unit = CUSTOM_RATE
                self.frame_rate = scanned(text)
            else:
                self.time_unit = TIME.get(word, self.time_unit)

    def connect(self):
        source = destination = b""
        while True:
            kind, text = self.inside()
            if kind == ";":
                break
            if kind != "string":
                continue
            source = unquoted(text)
            kind, text = self.inside()
            if kind == "string":
                destination = unquoted(text)
            if kind == ";":
                break
        if b"." in source and b"." in destination:
            self.make_connection(*source.split(b".", 1), *destination.split(b".", 1))

    def make_connection(self, source, output, destination, channel):
        curve, transform = self.first("curve", source), self.first("transform", source)
        index = self.first("transform", destination)
        low_output, low_channel = output.lower(), channel.lower()
        if index >= 0:
            links = self.lists["transform"][index].curve
            if curve >= 0:
                if low_output in (b"output", b"o") and low_channel in CHANNELS:
                    links[CHANNELS[low_channel]] = curve
            elif transform >= 0:
                if low_output in TURNING:
                    self.lists["transform"][transform].curve[TURNS] = index
                elif low_channel in FOLLOWING:
                    links[FOLLOWS] = transform
                elif b"target" in channel:
                    links[TARGET] = transform
            return
        camera = self.first("camera", destination)
        if camera >= 0 and curve >= 0 and low_output in (b"output", b"o"):
            if low_channel in (b"fl", b"focallength"):
                self.lists["camera"][camera].focal_curve = curve
