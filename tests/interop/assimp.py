"""assimp: a file loaded by it and written as its own JSON."""

import json
import math
import os
import re
import subprocess


class AssimpFailed(Exception):
    pass


def version():
    done = subprocess.run(["assimp", "version"], capture_output=True,
                          text=True, check=True)
    return re.search(r"Version (\d+\.\d+)", done.stdout)[1]


def _load(path, folder):
    out = os.path.join(folder, os.path.basename(path) + ".assjson")
    done = subprocess.run(["assimp", "export", path, out, "-fassjson"],
                          capture_output=True, text=True, errors="replace",
                          check=False)
    if done.returncode != 0 or not os.path.exists(out):
        raise AssimpFailed(done.stdout[-2000:] + done.stderr[-2000:])
    with open(out, encoding="utf-8") as file:
        return json.load(file)


def _between(keys, time):
    """The two keys about a time, and how far it is from one to the other."""
    if time <= keys[0][0]:
        return keys[0][1], keys[0][1], 0.0
    for (start, one), (end, other) in zip(keys, keys[1:]):
        if time <= end:
            return one, other, (time - start) / (end - start)
    return keys[-1][1], keys[-1][1], 0.0


def _vector(keys, time):
    one, other, part = _between(keys, time)
    return [a + part * (b - a) for a, b in zip(one, other)]


def _turn(keys, time):
    """On the shorter way from one key to the next. w comes first."""
    one, other, part = _between(keys, time)
    along = sum(a * b for a, b in zip(one, other))
    if along < 0.0:
        other, along = [-part for part in other], -along
    angle = math.acos(min(1.0, along))
    if angle < 1e-6:
        return [a + part * (b - a) for a, b in zip(one, other)]
    first = math.sin((1.0 - part) * angle) / math.sin(angle)
    second = math.sin(part * angle) / math.sin(angle)
    return [first * a + second * b for a, b in zip(one, other)]


def _matrix(place, turn, scale):
    w, x, y, z = turn
    size = w * w + x * x + y * y + z * z
    s = 2.0 / size
    rows = [
        [1 - s * (y * y + z * z), s * (x * y - w * z), s * (x * z + w * y)],
        [s * (x * y + w * z), 1 - s * (x * x + z * z), s * (y * z - w * x)],
        [s * (x * z - w * y), s * (y * z + w * x), 1 - s * (x * x + y * y)]]
    return [[rows[i][j] * scale[j] for j in range(3)] + [place[i]]
            for i in range(3)] + [[0.0, 0.0, 0.0, 1.0]]


def _multiplied(left, right):
    return [[sum(row[k] * right[k][column] for k in range(4))
             for column in range(4)] for row in left]


def _local(item, channels, seconds):
    channel = channels.get(item["name"])
    if channel is None:
        numbers = item["transformation"]
        return [numbers[4 * i:4 * i + 4] for i in range(4)]
    time = seconds * channel["ticks"]
    return _matrix(_vector(channel["positionkeys"], time),
                   _turn(channel["rotationkeys"], time),
                   _vector(channel["scalingkeys"], time))


def _projection(camera):
    """assimp 5.2 gives the vertical angle times the aspect as the horizontal
    one."""
    high = 1.0 / math.tan(camera["horizontalfov"] / camera["aspect"] / 2)
    return [[high / camera["aspect"], 0, 0, 0], [0, high, 0, 0],
            [0, 0, 0, 0], [0, 0, -1, 0]]


def measure(path, frames, folder):
    document = _load(path, folder)
    channels = {}
    for animation in document.get("animations", []):
        for channel in animation["channels"]:
            # assimp counts the times of glTF in thousandths.
            channels[channel["name"]] = dict(
                channel, ticks=animation.get("tickspersecond") or 1000.0)
    cameras = {camera["name"]: camera
               for camera in document.get("cameras", [])}
    measured = {}
    for frame in frames:
        layers = {}
        _walk(document["rootnode"], _matrix([0] * 3, [1, 0, 0, 0], [1] * 3),
              channels, cameras, frame["time"], layers)
        measured[frame["label"]] = layers
    return measured


def _walk(item, above, channels, cameras, seconds, layers):
    world = _multiplied(above, _local(item, channels, seconds))
    layers[item["name"]] = {"world": world}
    if item["name"] in cameras:
        layers[item["name"]]["projection"] = _projection(
            cameras[item["name"]])
    for child in item.get("children", []):
        _walk(child, world, channels, cameras, seconds, layers)
