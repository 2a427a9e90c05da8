"""Node, with the packages that scripts/interop has installed."""

import json
import os
import shutil
import subprocess

from scenes import ROOT

_HERE = os.path.dirname(os.path.abspath(__file__))
_PACKAGES = os.path.join(ROOT, "build", "interop")


class NodeFailed(Exception):
    pass


def output(script, arguments):
    """What a script of this folder prints. It runs from beside the
    packages, where its imports find them."""
    copy = os.path.join(_PACKAGES, script)
    shutil.copyfile(os.path.join(_HERE, script), copy)
    done = subprocess.run(["node", copy, *arguments], capture_output=True,
                          text=True, errors="replace", check=False)
    if done.returncode != 0:
        raise NodeFailed(f"{script}: {done.stderr[-2000:]}")
    return done.stdout


def run(script, jobs, folder):
    path = os.path.join(folder, script + ".json")
    with open(path, "w", encoding="utf-8") as file:
        json.dump(jobs, file)
    return output(script, [path])


def version_of(package):
    path = os.path.join(_PACKAGES, "node_modules", package, "package.json")
    with open(path, encoding="utf-8") as file:
        return json.load(file)["version"]
