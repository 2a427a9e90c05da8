"""Takes scenes through other programs and holds them to the composition.

scripts/interop runs it, after it has installed what it needs.
"""

import argparse
import os
import sys
import tempfile

import addon_refusals_test
import addon_test
import addon_update_test
import assimp
import blender
import browser
import chan_test
import doubles_test
import exports
import gltf_test
import scenes
import usd_test
import usda
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
        self.remarks = []
        self.examples = scenes.examples(self.tool)
        self.shots, self.absent = scenes.shots(self.tool)
        self.scenes = self.examples + self.shots
        self.exported = self.scenes + [scenes.before_zero(self.tool, folder)]
        for scene in self.exported:
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
    run.problems += addon_refusals_test.problems(run.tool, _ADDONS, run.folder)
    lens = next(scene for scene in run.examples if scene.name == "dolly_zoom")
    run.problems += [
        f"second import: {text}" for text in addon_update_test.problems(
            lens, run.tool, _ADDONS, run.folder)]


def _exported(run, suffix):
    return {scene.name: exports.export(run.tool, scene, suffix, run.folder)
            for scene in run.exported}


def _remark_lens(run, format_name, found):
    worst, moving, problems = found
    run.problems += problems
    run.remarks.append(f"{format_name}: lenses that move: {moving}; the edge "
                       f"of the picture is at most {worst:.1e} px off")


def _gltf(run):
    gltf, glb = _exported(run, ".gltf"), _exported(run, ".glb")
    run.problems += gltf_test.validator_problems(
        [*gltf.values(), *glb.values()])
    run.remarks.append(f"glTF: {2 * len(gltf)} files go to the validator")
    _remark_lens(run, "glTF", gltf_test.lens_problems(run.exported, gltf))
    ways = ((f".gltf, Blender {blender.version()}",
             gltf_test.through_blender, gltf),
            (f".glb, {browser.version()}",
             gltf_test.through_three, glb),
            (f".gltf, assimp {assimp.version()}",
             gltf_test.through_assimp, gltf))
    for through, way, files in ways:
        for scene, result in way(run.exported, files, run.folder):
            run.take(scene, through, result)


def _usd(run):
    files = _exported(run, ".usda")
    _remark_lens(run, "USD", usd_test.lens_problems(run.exported, files))
    through = f".usda, {browser.version()}"
    for scene, result in usd_test.through_three(run.exported, files,
                                                run.folder):
        run.take(scene, through, result)
    for scene, result in doubles_test.through_usd(run.exported, files):
        run.take(scene, ".usda, the tests' own reader", result)


def _chan(run):
    files = _exported(run, ".chan")
    through = f".chan, Blender {blender.version()}"
    for scene, result in chan_test.through_blender(run.exported, files,
                                                   run.folder):
        run.take(scene, through, result)
    for scene, result in doubles_test.through_chan(run.exported, files):
        run.take(scene, ".chan, the tests' own reader", result)


def _csv(run):
    files = _exported(run, ".csv")
    run.problems += doubles_test.csv_problems(run.exported, files)
    for scene, result in doubles_test.through_csv(run.exported, files):
        run.take(scene, ".csv, the tests' own reader", result)


_FAILURES = (assimp.AssimpFailed, blender.BlenderFailed,
             exports.ExportFailed, browser.BrowserFailed, usda.NoUsda)

_PARTS = {"addon": _addon, "gltf": _gltf, "usd": _usd, "chan": _chan,
          "csv": _csv}


def main():
    options = _options()
    with tempfile.TemporaryDirectory() as folder:
        run = Run(options, folder)
        for name in options.only or _PARTS:
            try:
                _PARTS[name](run)
            except _FAILURES as failure:
                run.problems.append(f"{name}: {failure}")
        if options.picture:
            _draw(run, options.picture)
    print(summary_of(run.rows))
    print(table_of(run.rows))
    for text in run.remarks:
        print(text)
    print(f"{run.absent} of {len(scenes.SHOTS)} shots are absent")
    if options.table:
        with open(options.table, "w", encoding="utf-8") as file:
            file.write(summary_of(run.rows))
    for text in run.problems:
        print(f"FAILED: {text}", file=sys.stderr)
    return 1 if run.problems or not run.rows else 0


if __name__ == "__main__":
    sys.exit(main())
