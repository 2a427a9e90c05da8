"""Writes a rig as Maya ASCII, in the many forms in which scenes say the same."""

from rig import CHILDREN, Curve, Plug

LONG = {
    "t": "translate", "r": "rotate", "s": "scale", "rp": "rotatePivot", "sp": "scalePivot", "rpt": "rotatePivotTranslate",
    "spt": "scalePivotTranslate", "ra": "rotateAxis", "jo": "jointOrient", "is": "inverseScale", "sh": "shear",
    "shxy": "shearXY", "shxz": "shearXZ", "shyz": "shearYZ", "ro": "rotateOrder", "it": "inheritsTransform",
    "ssc": "segmentScaleCompensate", "fl": "focalLength", "hfa": "horizontalFilmAperture", "vfa": "verticalFilmAperture",
    "ff": "filmFit", "cs": "cameraScale", "lsr": "lensSqueezeRatio", "hfo": "horizontalFilmOffset", "vfo": "verticalFilmOffset",
    "o": "output",
}  # fmt: skip
LONG.update({name + axis: LONG[name] + axis.upper() for name in CHILDREN if name != "sh" for axis in "xyz"})
PAIRS = {"cap": ("hfa", "vfa"), "fio": ("hfo", "vfo")}
LIMITS = {"t": ("mntl", "mxtl", "mt", "xt"), "r": ("mnrl", "mxrl", "mr", "xr"), "s": ("mnsl", "mxsl", "ms", "xs")}
FLAGS = ("it", "ssc")
FIXED = 1


class Writer:
    def __init__(self, rig, chance):
        self.rig, self.chance = rig, chance
        self.lines, self.links = [], []

    def likely(self, share):
        return self.chance.random() < share

    def name(self, attribute):
        return LONG.get(attribute, attribute) if self.likely(0.15) else attribute

    def text(self):
        rig = self.rig
        words = ("-linear", "-angle", "-time") if self.likely(0.2) else ("-l", "-a", "-t")
        self.lines += ["//Maya ASCII 2020 scene", f"//Name: {rig.name}.ma", 'requires maya "2020";']
        self.lines.append("currentUnit " + " ".join(map(" ".join, zip(words, (rig.length, rig.angle, rig.time)))) + ";")
        self.startup_cameras()
        for node in rig.nodes:
            self.node(node)
        if rig.playback:
            first, last = rig.playback
            self.lines.append('createNode script -n "sceneConfigurationScriptNode";')
            played = f"-min {first!r} -max {last!r} -ast {first!r} -aet {last!r}"
            self.lines.append(f'\tsetAttr ".b" -type "string" "playbackOptions {played} ";')
            self.lines.append('\tsetAttr ".st" 6;')
        self.lines.append("select -ne :defaultResolution;")
        for attribute, value in (("w", rig.size[0]), ("h", rig.size[1]), ("dar", rig.aspect)):
            self.lines.append(f'\tsetAttr ".{attribute}" {value!r};')
        self.lines += self.links + [f"// End of {rig.name}.ma", ""]
        return "\n".join(self.lines)

    def startup_cameras(self):
        for name, flat in (("persp", "no"), ("top", "yes")):
            self.lines += [f'createNode transform -s -n "{name}";', '\tsetAttr ".t" -type "double3" 0 1000.1 0 ;']
            self.lines += [f'createNode camera -s -n "{name}Shape" -p "{name}";', f'\tsetAttr ".o" {flat};']

    def node(self, node):
        parent = f' -p "{self.named(node.parent)}"' if node.parent else ""
        self.lines.append(f'createNode {node.kind} -n "{node.name}"{parent};')
        for name, default in node.added.items():
            self.lines.append(f'\taddAttr -ci true -sn "{name}" -ln "{name}" -dv {default!r} -at "double";')
        self.values(node)
        if node.matrix:
            numbers = " ".join(repr(number) for row in node.matrix for number in row)
            self.lines.append(f'\tsetAttr ".opm" -type "matrix" {numbers} ;')
        if node.aiming:
            self.aiming(node, node.aiming)
        left = dict(node.drivers)
        for compound, children in CHILDREN.items():
            self.whole(node, compound, children, left)
        for name, driver in left.items():
            if isinstance(driver, Curve):
                self.curve(node, name, driver)
            elif isinstance(driver, Plug):
                self.link(f"{driver.node.name}.{self.name(driver.name)}", f"{node.name}.{self.name(name)}")

    def whole(self, node, compound, children, left):
        """Three numbers that three of another node drive, as one connection."""
        held = [left.get(child) for child in children]
        if not all(isinstance(driver, Plug) for driver in held) or self.likely(0.4):
            return
        for source, names in CHILDREN.items():
            if tuple(driver.name for driver in held) == names and len({id(driver.node) for driver in held}) == 1:
                self.link(f"{held[0].node.name}.{self.name(source)}", f"{node.name}.{self.name(compound)}")
                for child in children:
                    del left[child]

    def named(self, node):
        """By its name, or by its path."""
        if self.likely(0.7):
            return node.name
        path = ""
        while node:
            path, node = f"|{node.name}{path}", node.parent
        return path

    def values(self, node):
        left = dict(node.values)
        for compound, (lowest, highest, low, high) in LIMITS.items():
            for attribute, prefix, enable in ((lowest, f"mn{compound}", low), (highest, f"mx{compound}", high)):
                held = [left.pop(prefix + axis, None) for axis in "xyz"]
                if any(value is not None for value in held):
                    self.triple(attribute, [value or 0.0 for value in held])
                    on = [axis for axis, value in zip("xyz", held) if value is not None]
                    self.lines += [f'\tsetAttr ".{enable}{axis}e" yes;' for axis in on]
        for compound, children in CHILDREN.items():
            held = [left.get(child) for child in children]
            if all(value is not None for value in held) and self.likely(0.75):
                self.triple(self.name(compound), held)
                for child in children:
                    del left[child]
        for pair, children in PAIRS.items():
            if all(child in left for child in children):
                self.lines.append(f'\tsetAttr ".{pair}" -type "double2" {left.pop(children[0])!r} {left.pop(children[1])!r} ;')
        for name, value in left.items():
            shown = ("yes" if value else "no") if name in FLAGS else repr(value)
            owner = next((compound for compound, children in CHILDREN.items() if name in children), None)
            spelled = f"{owner}.{name}" if owner and self.likely(0.3) else self.name(name)
            keyable = " -k on" if self.likely(0.1) else ""
            self.lines.append(f'\tsetAttr{keyable} ".{spelled}" {shown};')

    def triple(self, attribute, numbers):
        self.lines.append(f'\tsetAttr ".{attribute}" -type "double3" ' + " ".join(map(repr, numbers)) + " ;")

    # Connections.

    def link(self, source, target):
        self.links.append(f'connectAttr "{source}" "{target}";')

    def link_three(self, source, target, inner):
        """As a whole, or number by number."""
        if self.likely(0.5):
            self.link(source, target)
        else:
            for axis in "xyz":
                self.link(source + axis, f"{inner}{axis}")

    def aiming(self, node, aiming):
        for attribute, numbers in (("a", aiming.aim), ("u", aiming.up), ("wu", aiming.world_up), ("o", aiming.offset)):
            self.triple(attribute, numbers)
        if aiming.up_type != 3 or self.likely(0.5):
            self.lines.append(f'\tsetAttr ".wut" {aiming.up_type};')
        held = aiming.constrained
        for place, target in enumerate(aiming.targets):
            plug = f"{node.name}.tg[{place}]"
            self.lines.append(f'\taddAttr -dcb 0 -ci true -sn "w{place}" -ln "{target.node.name}W{place}" -dv 1 -at "double";')
            if target.weight != 1.0:
                self.lines.append(f'\tsetAttr ".w{place}" {target.weight!r};')
            self.link_three(f"{target.node.name}.t", f"{plug}.tt", f"{plug}.tt")
            self.link(f"{target.node.name}.rp", f"{plug}.trp")
            self.link(f"{target.node.name}.rpt", f"{plug}.trt")
            self.link(f"{target.node.name}.pm", f"{plug}.tpm")
            self.link(f"{node.name}.w{place}", f"{plug}.tw")
        for source, target in (("pim", "cpim"), ("rp", "crp"), ("rpt", "crt"), ("ro", "cro")):
            self.link(f"{held.name}.{source}", f"{node.name}.{target}")
        self.link_three(f"{held.name}.t", f"{node.name}.ct", f"{node.name}.ct")
        if held.kind == "joint":
            self.link(f"{held.name}.jo", f"{node.name}.cjo")
        if aiming.up_object:
            self.link(f"{aiming.up_object.name}.wm", f"{node.name}.wum")
        self.link_three(f"{node.name}.cr", f"{held.name}.r", f"{held.name}.r")

    # Curves.

    def curve(self, node, name, curve):
        label = f"{node.name}_{name}"
        common = self.chance.choice([key.out_type for key in curve.keys])
        self.lines += [f'createNode animCurve{curve.kind} -n "{label}";', f'\tsetAttr ".tan" {common};']
        if not curve.weighted:
            self.lines.append('\tsetAttr ".wgt" no;')
        count = len(curve.keys)
        cut = self.chance.randrange(1, count) if count > 2 and self.likely(0.2) else count
        for first, last in ((0, cut), (cut, count)):
            if first < last:
                pairs = "".join(f" {key.time!r} {key.value!r}" for key in curve.keys[first:last])
                self.array("ktv", first, last, count, pairs)
        ends = {"kit": [key.in_type for key in curve.keys], "kot": [key.out_type for key in curve.keys]}
        for attribute, types in ends.items():
            start = next((place for place, kind in enumerate(types) if kind != common), None)
            if start is not None:
                self.array(attribute, start, count, count, "".join(f" {kind}" for kind in types[start:]))
        self.tangents("ki", [key.in_tangent if key.in_type == FIXED else None for key in curve.keys])
        self.tangents("ko", [key.out_tangent if key.out_type == FIXED else None for key in curve.keys])
        for attribute, code in (("pre", curve.pre), ("pst", curve.post)):
            if code:
                self.lines.append(f'\tsetAttr ".{attribute}" {code};')
        self.link(f"{label}.{self.name('o')}", f"{node.name}.{self.name(name)}")

    def array(self, attribute, first, last, count, shown):
        size = f" -s {count}" if self.likely(0.8) else ""
        span = f"{first}:{last - 1}" if last - first > 1 else f"{first}"
        self.lines.append(f'\tsetAttr{size} ".{attribute}[{span}]" {shown};')

    def tangents(self, side, given):
        """From the first fixed tangent to the last key. What lies between stands there as the program computed it, which a
        generated rig does not know; so each fixed tangent has a command of its own."""
        for place, tangent in enumerate(given):
            if tangent is not None:
                for letter, number in zip("xy", tangent):
                    self.array(f"{side}{letter}", place, place + 1, len(given), f" {number!r}")


def scene_text(rig, chance):
    return Writer(rig, chance).text()
