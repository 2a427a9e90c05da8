#!/usr/bin/env python3
"""A bake that is baked again differs in comments alone, and a node whose channels say all keeps them bit for bit.

usage: rebake_test.py TOOL ROOT

Takes the examples and some rigs made by chance, with a key at every frame and at every half frame.
"""

import json
import pathlib
import random
import re
import struct
import sys
import tempfile

TESTS = pathlib.Path(__file__).resolve().parents[1]
sys.path[:0] = [str(TESTS / "support"), str(TESTS / "bake" / "rigs")]
from compositions import Tool  # noqa: E402
from rig_generator import generated  # noqa: E402
from rig_text import scene_text  # noqa: E402

RIGS = 8
STEPS = (1.0, 0.5)
CURVE = re.compile(r'^createNode animCurveT[LA] -n "([^"]+)";(.*?)(?=^\w)', re.MULTILINE | re.DOTALL)
KEYS = re.compile(r'"\.ktv\[[\d:]+\]"\s+([^;]*);')
LINK = re.compile(r'^connectAttr "([^".]+)\.o(?:utput)?" "([^".]+)\.(\w+)";', re.MULTILINE)
TRANSFORM = re.compile(r'^createNode transform -n "([^"]+)"[^;]*;(.*?)(?=^\w)', re.MULTILINE | re.DOTALL)
NOT_PLAIN = re.compile(r'"\.(?:ro|ra|rp|sp|rpt|spt|sh|opm|it)[xyz]*"')
CHANNELS = {name[0] + name[-1].lower(): name for name in ("translateX", "translateY", "translateZ", "rotateX", "rotateY", "rotateZ")}


def without_comments(text):
    return [line for line in text.splitlines() if not line.startswith("//")]


def bits(number):
    return struct.pack("<d", number)


def keyed(text):
    """The keys of the moved channels, by node and channel: values by time."""
    curves = {}
    for name, body in CURVE.findall(text):
        numbers = [float(word) for keys in KEYS.findall(body) for word in keys.split()]
        curves[name] = dict(zip(numbers[::2], numbers[1::2]))
    return {(node, CHANNELS.get(to, to)): curves[name] for name, node, to in LINK.findall(text) if name in curves}


def hold_bits(name, source, baked, first, complaints):
    """How many keys of plain nodes were compared."""
    plain = {node for node, body in TRANSFORM.findall(source) if not NOT_PLAIN.search(body)}
    after, compared = keyed(baked), 0
    for (node, channel), keys in keyed(source).items():
        if node not in plain or (node, channel) not in after:
            continue
        for time, value in keys.items():
            if time == int(time):
                compared += 1
                found = after[node, channel].get(time - first)
                if found is None or bits(found) != bits(value):
                    complaints.append(f"{name}: {node}.{channel} at {time}: {value!r}, baked {found!r}")
    return compared


def hold_rebakes(tool, names, step, complaints):
    words = ["--quiet", "--step", str(step), "--report", "report.json"]
    tool.run("bake", *words, *names, "-o", f"once{step}")
    reports = json.loads((tool.folder / "report.json").read_text(encoding="ascii"))["scenes"]
    compared = 0
    for name, report in zip(names, reports, strict=True):
        count, again = report["frames"]["count"], tool.folder / "again.ma"
        once = tool.folder / f"once{step}" / pathlib.Path(name).name
        own = f"0:{(count - 1) * step:g}"
        tool.run("bake", "--quiet", "--frames", own, "--step", str(step), "--locators", "marked", once, "-o", again)
        before, after = once.read_text(encoding="ascii"), again.read_text(encoding="ascii")
        if without_comments(before) != without_comments(after):
            complaints.append(f"{name}, step {step}: the second bake differs")
        source = (tool.folder / name).read_text(encoding="ascii")
        if step == 1.0 and "rig_" not in name:
            compared += hold_bits(name, source, before, report["frames"]["first"], complaints)
    return compared


def main():
    complaints, compared = [], 0
    with tempfile.TemporaryDirectory() as place:
        tool = Tool(sys.argv[1], pathlib.Path(place))
        texts = {path.name: path.read_text(encoding="ascii") for path in (pathlib.Path(sys.argv[2]) / "examples").glob("*.ma")}
        texts.update({f"rig_{number}.ma": scene_text(generated(number), random.Random(number)) for number in range(RIGS)})
        for name, text in texts.items():
            (tool.folder / name).write_text(text, encoding="ascii")
        for step in STEPS:
            compared += hold_rebakes(tool, sorted(texts), step, complaints)
    for complaint in complaints:
        print(complaint)
    print(f"{len(texts)} scenes, {compared} keys of plain nodes, {len(complaints)} complaints")
    return 1 if complaints or len(texts) < 10 + RIGS or compared < 500 else 0


if __name__ == "__main__":
    sys.exit(main())
