"""Runs inside Blender: imports that are refused, and what each one says."""

import json
import sys

import bpy

sys.path.insert(0, sys.argv[sys.argv.index("--") + 1])

from blender_session import begin, read_job  # noqa: E402


def _error(job):
    """An operator's errors are raised where a script calls it."""
    try:
        bpy.ops.import_scene.mayascene(filepath=job["scene"],
                                       bake=job["bake"])
    except RuntimeError as error:
        return str(error)
    return "nothing"


def main():
    jobs = read_job()
    said = {}
    for job in jobs["jobs"]:
        begin(jobs["addons"], job["tool"])
        said[job["name"]] = _error(job), len(bpy.data.objects)
    with open(jobs["output"], "w", encoding="utf-8") as file:
        json.dump(said, file)


main()
