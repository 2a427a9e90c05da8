"""Blender, in the background."""

import json
import os
import subprocess

HERE = os.path.dirname(os.path.abspath(__file__))


# Blender looks for its libraries beside the first python3 on PATH.
_ENVIRONMENT = dict(os.environ,
                    PATH="/usr/bin:/bin:" + os.environ.get("PATH", ""))


class BlenderFailed(Exception):
    pass


def run(script, jobs, folder, prefix=""):
    """Runs a script of this folder inside Blender, on a list of jobs."""
    path = os.path.join(folder, script + ".json")
    with open(path, "w", encoding="utf-8") as file:
        json.dump(jobs, file)
    done = subprocess.run(
        ["blender", "--background", "--factory-startup",
         "--python-exit-code", "9", "--python", os.path.join(HERE, script),
         "--", HERE, path],
        stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True,
        errors="replace", check=False, env=_ENVIRONMENT)
    if done.returncode != 0:
        raise BlenderFailed(prefix + done.stdout[-4000:])
    return done.stdout


def version():
    done = subprocess.run(["blender", "--version"], capture_output=True,
                          text=True, check=True)
    return done.stdout.splitlines()[0].removeprefix("Blender ")


def read(path):
    """What a script has measured, by frame."""
    with open(path, encoding="utf-8") as file:
        document = json.load(file)
    document["frames"] = {int(frame): layers for frame, layers
                          in document["frames"].items()}
    return document


def to_blender(unit=1.0):
    """Maya's Y is up, Blender's Z."""
    return lambda point: [point[0] * unit, -point[2] * unit, point[1] * unit]
