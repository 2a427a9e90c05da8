"""Makes rigs by chance. The same number makes the same rig everywhere."""

import math
import random

from rig import CENTIMETRES, CHILDREN, RATES, Aiming, Curve, Key, Node, Plug, Rig, Target

TYPES = (2, 3, 5, 9, 10, 16, 17, 18, 28, 1)
STEPPED = (5, 17)
INFINITIES = (0, 0, 0, 1, 3, 4, 5)
SIZES = ((1920, 1080), (960, 540), (2048, 858), (640, 480), (1080, 1920), (720, 576), (1024, 1024))
FILMS = ((1.41732, 0.94488), (0.864, 0.63), (0.98, 0.735), (1.0, 0.8), (0.8, 1.0))
KINDS = ("chain", "joints", "lookAt", "aimConstraint", "focal", "pivots")


class Generator:
    def __init__(self, number):
        self.chance, self.number = random.Random(number), number
        self.rig = Rig(f"rig_{number:03}")
        self.still = self.likely(0.15)
        self.driven = 0
        self.first_time = self.chance.choice((-3, 0, 1, 1, 101))

    def likely(self, share):
        return self.chance.random() < share

    def note(self, *features):
        self.rig.features.update(features)

    def about(self, size):
        return round(self.chance.uniform(-size, size), self.chance.choice((1, 4, 12)))

    def three(self, size):
        return [self.about(size) for _ in range(3)]

    def make(self):
        rig = self.rig
        rig.length = self.chance.choice(list(CENTIMETRES)) if self.likely(0.5) else "centimeter"
        rig.angle = self.chance.choice(("radian", "rad", "deg")) if self.likely(0.3) else "degree"
        rig.time = list(RATES)[self.number % len(RATES)]
        self.note("length " + rig.length, "angle " + rig.angle[:3], "time " + rig.time)
        self.picture()
        kind = KINDS[self.number % len(KINDS)]
        above = self.chain(kind)
        for name in ["main", "second"][: 1 + self.likely(0.3)]:
            self.camera(name, kind, above)
        self.locators(above)
        if self.driven == 0:
            self.note("still")
        self.playback()
        return rig

    def picture(self):
        width, height = self.rig.size = self.chance.choice(SIZES)
        pixel = self.chance.choice((1.0, 1.0, 1.0, 1.0000001, 2.0, 0.9, 1.0940, 1.009, 0.9909)) if self.likely(0.6) else 1.0
        self.rig.aspect = width / height * pixel
        self.note("square pixels" if abs(pixel - 1.0) < 0.01 else "oblong pixels")

    def playback(self):
        """Wide enough for all keys where some may not count for what is written; else it may be narrow, or missing."""
        rig = self.rig
        per_unit = round(1 / rig.unit_seconds) if RATES[rig.time] is None else 1
        times = [key.time for curve in rig.curves() for key in curve.keys] or [1]
        low, high = math.floor(min(times)), math.ceil(max(times))
        hidden = bool(rig.of_kind("lookAt", "aimConstraint")) or any("it" in node.values for node in rig.nodes)
        if hidden or self.likely(0.5):
            rig.playback = (low - self.chance.randrange(3) * per_unit, high + self.chance.randrange(4) * per_unit)
        elif self.likely(0.6):
            rig.playback = (low + 0.5, low + 0.5 + (high > low))
            self.note("keys outside what is played")
        else:
            self.note("nothing is played")

    # Curves.

    def curve(self, kind, centre, size, tame=False):
        """A tame one stays near its keys."""
        self.driven += 1
        codes = [code for code in TYPES if code != 1] if tame else TYPES
        ends = [code for code in INFINITIES if code in (0, 3, 5)] if tame else INFINITIES
        rig, seconds = self.rig, RATES[self.rig.time] is None
        count = self.chance.choice((1, 2, 2, 3, 4, 5))
        time, keys = (self.first_time + self.chance.choice((0, 0, 0, 2))) / (8 if seconds else 1), []
        for _ in range(count):
            value = centre if self.likely(0.1) else centre + self.about(size)
            in_type, out_type = self.chance.choice([code for code in codes if code not in STEPPED]), self.chance.choice(codes)
            if self.likely(0.5):
                out_type = 18 if out_type not in STEPPED and in_type == 18 else out_type
                in_type = in_type if out_type in STEPPED else out_type
            keys.append(Key(time, value, in_type, out_type))
            self.note(f"tangent {out_type}")
            if in_type == 1:
                keys[-1].in_tangent = self.tangent(kind, size)
            if out_type == 1:
                keys[-1].out_tangent = self.tangent(kind, size)
            time += self.chance.choice((0.125, 0.25) if seconds else (1, 2, 3, 4))
            time += 0.5 if self.likely(0.2) and not seconds else 0
        curve = Curve(kind, self.likely(0.4), self.chance.choice(ends), self.chance.choice(ends), keys)
        self.note("weighted" if curve.weighted else "not weighted", "curve " + kind, f"infinity {curve.post}")
        if rig.length != "centimeter" and kind == "TL":
            self.note("curve in another unit")
        return curve

    def tangent(self, kind, size):
        inside = {"TL": CENTIMETRES[self.rig.length], "TA": self.radian(), "TU": 1.0}[kind]
        return (self.chance.uniform(0.02, 0.3), self.about(1.0) * size * inside)

    def radian(self):
        return 1.0 if self.rig.angle.startswith("rad") else math.pi / 180

    def angle(self, degrees):
        """In the scene's unit."""
        return math.radians(degrees) if self.rig.angle.startswith("rad") else degrees

    def drive(self, node, name, kind, size, share=0.35):
        if not self.still and self.likely(share):
            node.drivers[name] = self.curve(kind, node.values.get(name, 0.0), size, tame=kind == "TU")

    # Transforms.

    def add(self, kind, name, parent=None):
        node = Node(kind, name, parent)
        self.rig.nodes.append(node)
        self.note(kind)
        return node

    def set_three(self, node, compound, numbers):
        node.values.update(zip(CHILDREN[compound], numbers))

    def place(self, node, far):
        self.set_three(node, "t", self.three(far))
        for name in CHILDREN["t"]:
            self.drive(node, name, "TL", far / 2)

    def turn(self, node, most=180):
        self.set_three(node, "r", [self.angle(angle) for angle in self.three(most)])
        for name in CHILDREN["r"]:
            self.drive(node, name, "TA", self.angle(60))
        node.values["ro"] = self.chance.randrange(6)
        self.note(f"order {node.values['ro']} of a {node.kind}")

    def scale(self, node, alike):
        if alike:
            self.set_three(node, "s", [self.chance.choice((0.5, 2.0, 1.3, 0.1))] * 3)
            self.note("scaled alike")
        else:
            self.set_three(node, "s", [self.chance.uniform(0.4, 2.0) for _ in range(3)])
            self.note("scaled unalike")
            for name in CHILDREN["s"]:
                self.drive(node, name, "TU", 0.2, 0.2)

    def extras(self, node, share):
        """Pivots, axes, offsets and what else a transform can have."""
        for compound in ("rp", "sp", "rpt", "spt"):
            if self.likely(share):
                self.set_three(node, compound, self.three(3))
                self.note(compound)
        if self.likely(share * 0.7):
            self.set_three(node, "ra", [self.angle(angle) for angle in self.three(120)])
            self.note("ra")
        if self.likely(share * 0.4):
            node.matrix = self.offset_matrix()
            self.note("opm")
        if node.parent and self.likely(share * 0.4):
            node.values["it"] = 0
            self.note("inheritance off", *(["inheritance off with opm"] if node.matrix else []))
        if self.likely(share * 0.3) and "r" not in node.drivers:
            compound = self.chance.choice("tr")
            node.values[f"mn{compound}x"] = self.angle(-5.0) if compound == "r" else -1.0
            node.values[f"mx{compound}y"] = self.angle(4.0) if compound == "r" else 2.0
            self.note("limits")

    def offset_matrix(self):
        """Turned about y and z, and moved."""
        y, z = self.chance.uniform(-3, 3), self.chance.uniform(-3, 3)
        cy, sy, cz, sz = math.cos(y), math.sin(y), math.cos(z), math.sin(z)
        rows = [[cy * cz, cy * sz, -sy], [-sz, cz, 0.0], [sy * cz, sy * sz, cy]]
        return [[*row, 0.0] for row in rows] + [[*self.three(10), 1.0]]

    def chain(self, kind):
        """What stands above the cameras: at most three nodes, or none."""
        above = None
        for depth in range(self.chance.choice((0, 1, 2, 3)) if kind != "joints" else 2):
            node = self.add("joint" if kind == "joints" else "transform", f"above{depth}", above)
            self.place(node, 20)
            self.turn(node)
            if kind == "joints":
                self.joint(node)
            if self.likely(0.3):
                self.scale(node, alike=self.likely(0.7))
            if self.likely(0.1) and kind != "joints":
                self.set_three(node, "sh", self.three(0.4))
                self.note("shear")
            self.extras(node, 0.5 if kind == "pivots" else 0.12)
            above = node
        self.note(f"{kind} below {0 if above is None else 1 + int(above.name[-1])}")
        return above

    def joint(self, node):
        self.set_three(node, "jo", [self.angle(angle) for angle in self.three(90)])
        self.note("joint orient")
        if self.likely(0.3):
            node.values["ssc"] = 0
        if node.parent and node.parent.kind == "joint" and self.likely(0.8):
            for own, other in zip(CHILDREN["is"], CHILDREN["s"]):
                node.drivers[own] = Plug(node.parent, other)
            self.note("segment scale")

    # Cameras.

    def camera(self, name, kind, above):
        if kind == "lookAt":
            above = self.add("lookAt", f"{name}_group", above)
            self.place(above, 10)
            self.turn(above, 30)
        node = self.add("joint" if kind == "joints" and self.likely(0.3) else "transform", f"{name}_cam", above)
        self.place(node, 30)
        if kind == "aimConstraint":
            node.values["ro"] = self.chance.randrange(6)
            self.note(f"order {node.values['ro']} of what aims")
        elif kind != "lookAt":
            self.turn(node)
        if node.kind == "joint":
            self.joint(node)
        if kind in ("lookAt", "aimConstraint"):
            self.aim(name, node, above if kind == "lookAt" else None)
        if self.likely(0.15):
            self.scale(node, alike=True)
        self.extras(node, 0.5 if kind == "pivots" else 0.12)
        shape = self.add("camera", f"{name}_camShape", node)
        self.lens(shape)
        if kind == "focal":
            self.pass_focal_on(name, shape)

    def aim(self, name, node, group):
        """Targets are far enough away that the camera never stands in one, or looks along its up."""
        constraint = group or self.add("aimConstraint", f"{name}_aim", node)
        aiming = constraint.aiming = Aiming(node, [], self.number // len(KINDS) % 5)
        self.note(f"{constraint.kind} up {aiming.up_type}")
        for place in range(1 + self.likely(0.3)):
            target = self.add("transform", f"{name}_target{place}", group if group and self.likely(0.5) else None)
            self.set_three(target, "t", [self.about(40), self.about(40), -300 + self.about(40)])
            for child in CHILDREN["t"]:
                self.drive(target, child, "TL", 30)
            if self.likely(0.3):
                self.set_three(target, "rp", self.three(20))
                self.set_three(target, "rpt", self.three(5))
            aiming.targets.append(Target(target, self.chance.choice((1.0, 1.0, 0.25, 2.5))))
        if len(aiming.targets) > 1:
            self.note("two targets")
        if aiming.up_type in (1, 2):
            aiming.up_object = self.add("transform", f"{name}_up")
            self.set_three(aiming.up_object, "t", [self.about(20), 400, self.about(20)])
            self.turn(aiming.up_object, 40)
        if self.likely(0.3):
            aiming.world_up = tuple(self.three(1)[:2] + [0.3])
        if self.likely(0.3):
            aiming.offset = tuple(self.angle(angle) for angle in self.three(40))
            self.note("aim with an offset")
        if self.likely(0.2):
            aiming.aim, aiming.up = (0.3, 0.2, -2.0), (0.1, 1.0, 0.4)
        node.drivers["r"] = constraint

    def lens(self, shape):
        values = shape.values
        values["fl"] = round(self.chance.uniform(15, 120), 3)
        values["hfa"], values["vfa"] = self.chance.choice(FILMS)
        if self.likely(0.85):
            values["ff"] = self.chance.randrange(4)
        self.note(f"fit {values.get('ff', 'silent')}")
        for name, feature, number in (("cs", "camera scale", 1.7), ("lsr", "squeeze", 2.0)):
            if self.likely(0.15):
                values[name] = number
                self.note(feature)
        if self.likely(0.3):
            values["hfo"], values["vfo"] = self.about(0.1), self.about(0.1)
            self.note("film offset")
        self.drive(shape, "fl", "TU", 5, 0.25)
        self.drive(shape, self.chance.choice(("hfa", "vfa")), "TU", 0.1, 0.1)
        if self.chance.random() < 0.2:
            self.note("aperture of its own default")
            del values["hfa"], values["vfa"]
            shape.drivers.pop("hfa", None)
            shape.drivers.pop("vfa", None)

    def pass_focal_on(self, name, shape):
        settings = self.add("transform", f"{name}_settings")
        settings.added["FOV"] = 35.0
        if self.likely(0.7):
            settings.values["FOV"] = round(self.chance.uniform(20, 80), 2)
            if not self.still:
                settings.drivers["FOV"] = self.curve("TU", settings.values["FOV"], 8, tame=True)
        else:
            self.note("focal length from an attribute's default")
        shape.drivers["fl"] = Plug(settings, "FOV")
        self.note("focal length passed on")

    def locators(self, above):
        for place in range(self.chance.randrange(3)):
            node = self.add("transform", f"mark{place}", above if self.likely(0.5) else None)
            self.place(node, 10)
            self.turn(node)
            self.extras(node, 0.2)
            self.add("locator", f"mark{place}Shape", node)


def generated(number):
    return Generator(number).make()
