"""What a generated rig consists of. Values stand in the scene's own units, as they stand in its text."""

from dataclasses import dataclass, field

# The three numbers of each compound, and its default.
CHILDREN = {
    **{name: tuple(name + axis for axis in "xyz") for name in ("t", "r", "s", "rp", "sp", "rpt", "spt", "ra", "jo", "is")},
    "sh": ("shxy", "shxz", "shyz"),
}
ONES = ("s", "is")
ORDERS = ("xyz", "yzx", "zxy", "xzy", "yxz", "zyx")

CENTIMETRES = {
    "millimeter": 0.1, "mm": 0.1, "centimeter": 1.0, "cm": 1.0, "meter": 100.0, "m": 100.0, "kilometer": 100000.0,
    "inch": 2.54, "in": 2.54, "foot": 30.48, "ft": 30.48, "yard": 91.44, "mile": 160934.4,
}  # fmt: skip
# Frames a second; None counts seconds, and is baked at the film's 24 frames a second.
RATES = {
    "game": 15.0, "film": 24.0, "pal": 25.0, "ntsc": 30.0, "show": 48.0, "palf": 50.0, "ntscf": 60.0, "12fps": 12.0,
    "40fps": 40.0, "120fps": 120.0, "23.976fps": 24000 / 1001, "29.97fps": 30000 / 1001, "59.94fps": 60000 / 1001, "sec": None,
}  # fmt: skip
FILM = 24.0


@dataclass
class Key:
    time: float  # in the scene's time unit
    value: float
    in_type: int
    out_type: int
    in_tangent: tuple = None  # of a fixed tangent: seconds, and centimetres, radians or plain numbers
    out_tangent: tuple = None


@dataclass
class Curve:
    """Drives a length (TL), an angle (TA) or a plain number (TU)."""

    kind: str
    weighted: bool
    pre: int
    post: int
    keys: list


@dataclass
class Plug:
    """Another node's value."""

    node: "Node"
    name: str


@dataclass(eq=False)
class Node:
    kind: str
    name: str
    parent: "Node" = None
    values: dict = field(default_factory=dict)  # by the short names of single numbers
    drivers: dict = field(default_factory=dict)  # the same names: a Curve, a Plug; "r": what aims all three
    matrix: list = None  # the offset parent matrix, or None
    aiming: "Aiming" = None  # of a lookAt or an aimConstraint
    added: dict = field(default_factory=dict)  # attributes that somebody added, with their defaults


@dataclass
class Target:
    node: Node
    weight: float = 1.0


@dataclass
class Aiming:
    constrained: Node
    targets: list
    up_type: int
    aim: tuple = (0.0, 0.0, -1.0)
    up: tuple = (0.0, 1.0, 0.0)
    world_up: tuple = (0.0, 1.0, 0.0)
    up_object: Node = None
    offset: tuple = (0.0, 0.0, 0.0)


@dataclass
class Rig:
    name: str
    length: str = "centimeter"
    angle: str = "degree"
    time: str = "film"
    size: tuple = (1920, 1080)
    aspect: float = 1920 / 1080  # of the picture as it is shown
    playback: tuple = None
    nodes: list = field(default_factory=list)  # parents before children
    features: set = field(default_factory=set)

    def of_kind(self, *kinds):
        return [node for node in self.nodes if node.kind in kinds]

    @property
    def rate(self):
        return RATES[self.time] or FILM

    @property
    def unit_seconds(self):
        """How long the scene's time unit is."""
        return 1.0 if RATES[self.time] is None else 1.0 / RATES[self.time]

    def curves(self):
        return [driver for node in self.nodes for driver in node.drivers.values() if isinstance(driver, Curve)]
