"""glTF files: the reader of these tests, and the programs that load them."""

import array
import json
import math
import os
import struct
import sys


def read(path):
    """The JSON and the buffer of a .gltf or .glb."""
    with open(path, "rb") as file:
        data = file.read()
    if data[:4] != b"glTF":
        document = json.loads(data)
        buffers = document.get("buffers", [])
        if not buffers:
            return document, b""
        beside = os.path.join(os.path.dirname(path), buffers[0]["uri"])
        with open(beside, "rb") as file:
            return document, file.read()
    chunks, place = [], 12
    while place < len(data):
        length = struct.unpack_from("<I", data, place)[0]
        chunks.append(data[place + 8:place + 8 + length])
        place += 8 + length
    return json.loads(chunks[0]), chunks[1] if len(chunks) > 1 else b""


def _floats(document, buffer, accessor):
    """A list of numbers; accessors here hold one number each."""
    accessor = document["accessors"][accessor]
    if accessor["componentType"] != 5126 or accessor["type"] != "SCALAR":
        raise ValueError("the accessor holds no single numbers")
    view = document["bufferViews"][accessor["bufferView"]]
    start = view.get("byteOffset", 0) + accessor.get("byteOffset", 0)
    found = array.array("f", buffer[start:start + 4 * accessor["count"]])
    if sys.byteorder != "little":
        found.byteswap()
    return list(found)


def _value_at(times, values, time):
    if time <= times[0]:
        return values[0]
    for index in range(1, len(times)):
        if time <= times[index]:
            part = ((time - times[index - 1])
                    / (times[index] - times[index - 1]))
            return values[index - 1] + part * (values[index]
                                               - values[index - 1])
    return values[-1]


def fields_of_view(document, buffer, camera):
    """The vertical field of view as a function of the seconds."""
    pointer = f"/cameras/{camera}/perspective/yfov"
    for animation in document.get("animations", []):
        for channel in animation["channels"]:
            extension = channel["target"].get("extensions", {}).get(
                "KHR_animation_pointer", {})
            if extension.get("pointer") == pointer:
                sampler = animation["samplers"][channel["sampler"]]
                times = _floats(document, buffer, sampler["input"])
                values = _floats(document, buffer, sampler["output"])
                return lambda time: _value_at(times, values, time)
    still = document["cameras"][camera]["perspective"]["yfov"]
    return lambda _: still


def worst_lens(composition, path):
    """By how many pixels the edge of the picture is off, at any frame, and
    how many cameras have a lens that moves."""
    document, buffer = read(path)
    start = document["scenes"][0]["extras"]["firstSeconds"]
    worst, moving = 0.0, 0
    cameras = [node["camera"] if "camera" in node else None
               for node in document["nodes"]]
    for index, layer in enumerate(composition.layers):
        if not layer.camera:
            continue
        angle = fields_of_view(document, buffer, cameras[index])
        for frame in composition.frames():
            seconds = start + (frame - composition.start) / composition.rate
            wanted = composition.zoom(layer, frame)
            half = composition.height / 2
            found = half / math.tan(angle(seconds) / 2)
            worst = max(worst, abs(half * found / wanted - half))
        moving += composition.lens_moves(layer)
    return worst, moving


def numbered(path):
    """A copy in which each node is called by its number: programs change
    names that stand twice."""
    document, _ = read(path)
    for index, node in enumerate(document.get("nodes", [])):
        node["name"] = f"layer{index}"
    for index, camera in enumerate(document.get("cameras", [])):
        camera["name"] = f"lens{index}"
    copy = path.removesuffix(".gltf") + ".numbered.gltf"
    with open(copy, "w", encoding="utf-8") as file:
        json.dump(document, file)
    return copy


def without_lens(path):
    """A copy without the animation of lenses: assimp 5.2 takes its values
    for places of the first node."""
    document, _ = read(path)
    for animation in document.get("animations", []):
        animation["channels"] = [
            channel for channel in animation["channels"]
            if channel["target"]["path"] != "pointer"]
    document["animations"] = [
        animation for animation in document.get("animations", [])
        if animation["channels"]]
    copy = path.removesuffix(".gltf") + ".still.gltf"
    with open(copy, "w", encoding="utf-8") as file:
        json.dump(document, file)
    return copy
