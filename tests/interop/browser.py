"""three, in Chromium, with the packages that scripts/interop has installed."""

import json
import os
import shutil
import subprocess

from scenes import ROOT

_HERE = os.path.dirname(os.path.abspath(__file__))
_PACKAGES = os.path.join(ROOT, "build", "interop")


class BrowserFailed(Exception):
    pass


def run(jobs, folder):
    """Has three load files: each job is a file, the frames with their
    seconds, and where to write."""
    path = os.path.join(folder, "three.json")
    with open(path, "w", encoding="utf-8") as file:
        json.dump({"chromium": shutil.which("chromium"),
                   "packages": os.path.join(_PACKAGES, "node_modules"),
                   "page": os.path.join(_HERE, "three_measure.mjs"),
                   "jobs": jobs}, file)
    # A module's imports are looked for beside it.
    driver = os.path.join(_PACKAGES, "browser.mjs")
    shutil.copyfile(os.path.join(_HERE, "browser.mjs"), driver)
    done = subprocess.run(["node", driver, path], capture_output=True,
                          text=True, errors="replace", check=False)
    if done.returncode != 0:
        raise BrowserFailed(done.stderr[-2000:])


def version():
    path = os.path.join(_PACKAGES, "node_modules", "three", "package.json")
    with open(path, encoding="utf-8") as file:
        three = json.load(file)["version"]
    done = subprocess.run(["chromium", "--version"], capture_output=True,
                          text=True, check=True)
    return f"three {three}, Chromium {done.stdout.split()[1].split('.')[0]}"
