"""Compares the importer's traces with those of the model, call by call.

usage: check_traces.py TOOL SOURCE_DIR

Every example scene is imported, and its golden trace checked as well, so that a golden trace cannot be renewed
into something wrong. So are the scenes of tests/scenes. Scenes beside the source folder (../shared/scenes and
../shared/hazards) join where they are there.
"""

import glob
import os
import subprocess
import sys
import tempfile

HERE = os.path.dirname(os.path.abspath(__file__))
sys.path.insert(0, os.path.join(HERE, "model"))

from compare import first_difference  # noqa: E402
from composition import whole_trace  # noqa: E402

OWN = ("examples/*.ma", "tests/scenes/hazards/*.ma", "tests/scenes/production/*.ma")
OUTSIDE = {"../shared/scenes/*.ma": 13, "../shared/hazards/h*.ma": 27}  # and how many there are, where they are
LINEAR_UNITS = "--linear-units 1"  # as a scene's comment asks for it


def options_of(text):
    return LINEAR_UNITS.split() if LINEAR_UNITS.encode() in text.split(b"requires")[0] else []


def traced(tool, source_dir, path, options):
    """The exit status and the trace of an import."""
    with tempfile.TemporaryDirectory() as folder:
        trace = os.path.join(folder, "trace")
        command = [tool, "import", "--quiet", "--preferences", os.path.join(folder, "preferences"),
                   "--trace", trace, *options, path]
        status = subprocess.run(command, cwd=source_dir, stderr=subprocess.DEVNULL, check=False).returncode
        with open(trace, encoding="utf-8", newline="") as lines:
            return status, lines.read()


def scenes_of(source_dir, pattern):
    return [os.path.relpath(path, source_dir) for path in sorted(glob.glob(os.path.join(source_dir, pattern)))]


def complaint_about(tool, source_dir, path):
    with open(os.path.join(source_dir, path), "rb") as scene:
        text = scene.read()
    options = options_of(text)
    expected = whole_trace(path, text, bool(options))
    status, found = traced(tool, source_dir, path, options)
    imported = all(line["error"] == 0 for line in expected if line["call"] == "leave")
    if status != (0 if imported else 1):
        return "exit status %d" % status
    problem = first_difference(expected, found)
    if problem or not path.startswith("examples"):
        return problem
    golden = os.path.join(HERE, "golden", os.path.basename(path)[: -len(".ma")] + ".trace")
    with open(golden, encoding="utf-8", newline="") as lines:
        problem = first_difference(expected, lines.read())
    return problem and "golden trace: " + problem


def main():
    tool, source_dir = sys.argv[1:]
    own = [scenes_of(source_dir, pattern) for pattern in OWN]
    outside = {pattern: scenes_of(source_dir, pattern) for pattern in OUTSIDE}
    scenes = sum(own, []) + sum(outside.values(), [])
    complaints = ["no scenes: %s" % pattern for pattern, found in zip(OWN, own) if not found]
    for path in scenes:
        problem = complaint_about(tool, source_dir, path)
        if problem:
            complaints.append("%s: %s" % (path, problem))
    print("\n".join(complaints))
    print("%d scenes compared, %d complaints" % (len(scenes), len(complaints)))
    left_out = sum(max(OUTSIDE[pattern] - len(found), 0) for pattern, found in outside.items())
    if left_out:
        print("LEFT OUT: the traces of %d scenes of ../shared, beside the source folder" % left_out)
    return 1 if complaints else 0


if __name__ == "__main__":
    sys.exit(main())
