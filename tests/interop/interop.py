"""Takes scenes through other programs and holds them to the composition.

scripts/interop runs it, after it has installed what it needs.
"""

import argparse
import os
import sys
import tempfile

import addon_test
import addon_update_test
import blender
import scenes
from table import Row, summary_of, table_of


def _options():
    parser = argparse.ArgumentParser(prog="scripts/interop")
    parser.add_argument("--tool", required=True)
    parser.add_argument("--only", action="append", choices=sorted(_PARTS))
    parser.add_argument("--table")
    parser.add_argument("--picture")
    return parser.parse_args()


class Run:
    """What is taken through, by what tool, and what was found."""

    def __init__(self, options, folder):
        self.tool = os.path.abspath(options.tool)
        self.folder = folder
        self.rows = []
        self.problems = []
        self.examples = scenes.examples(self.tool)
        self.shots, self.absent = scenes.shots(self.tool)
        self.scenes = self.examples + self.shots
        for scene in self.scenes:
            if not scene.imported:
                self.problems.append(f"{scene.name} is not imported")

    def take(self, scene, through, result):
        self.rows.append(Row(scene.name, through, result))
        self.problems += [f"{scene.name}, {through}: {text}"
                          for text in result.failures]


_ADDONS = os.path.join(scenes.ROOT, "addons", "blender")


def _draw(run, path):
    """The picture of docs/blender.md."""
    crane = next(scene for scene in run.examples if scene.name == "crane_shot")
    blender.run("blender_picture.py",
                {"addons": _ADDONS, "tool": run.tool, "scene": crane.path,
                 "output": os.path.abspath(path)}, run.folder)


def _addon(run):
    plain = [scene for scene in scenes.examples(run.tool, bake=False)
             if scene.imported]
    for bake, taken in ((True, run.scenes), (False, plain)):
        through = ("add-on" if bake else "add-on, without a bake")
        results = addon_test.measure(taken, run.tool, _ADDONS, run.folder)
        for scene, result in zip(taken, results):
            run.take(scene, f"{through}, Blender {blender.version()}", result)
    lens = next(scene for scene in run.examples if scene.name == "dolly_zoom")
    run.problems += [
        f"second import: {text}" for text in addon_update_test.problems(
            lens, run.tool, _ADDONS, run.folder)]


_PARTS = {"addon": _addon}


def main():
    options = _options()
    with tempfile.TemporaryDirectory() as folder:
        run = Run(options, folder)
        for name in options.only or _PARTS:
            _PARTS[name](run)
        if options.picture:
            _draw(run, options.picture)
    print(summary_of(run.rows))
    print(table_of(run.rows))
    print(f"{run.absent} of {len(scenes.SHOTS)} shots are absent")
    if options.table:
        with open(options.table, "w", encoding="utf-8") as file:
            file.write(summary_of(run.rows))
    for text in run.problems:
        print(f"FAILED: {text}", file=sys.stderr)
    return 1 if run.problems or not run.rows else 0


if __name__ == "__main__":
    sys.exit(main())
