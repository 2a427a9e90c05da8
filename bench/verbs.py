"""Time and memory of the other verbs of the tool, beside those of the import of the same scene."""

import os
import shutil

from imports import Measured
from limits import JOBS, MB
from running import run, take_turns
from table import Table


class VerbTable(Table):
    """A row for each verb and workload."""

    HEAD = ["verb", "workload", "output", "MB", "s", "import s", "result s", "/import", "limit", "/result", "limit",
            "peak MB", "limit"]
    WIDTHS = [-7, -12, -10, 6, 8, 8, 8, 7, 6, 7, 6, 7, 6]


def add_verb(table, limits, arguments, folder):
    measured = Measured(limits.workload, arguments, folder)
    scene = measured.scene(arguments.scale)
    commands = {"import": (measured.importing(scene),)}
    output = None
    try:
        verb = [arguments.programs / "mayascene", limits.verb, "--quiet", *limits.options, scene]
        if limits.verb != "bake":  # which asks no preference
            verb += ["--preferences", folder / "preferences"]
        if limits.output:
            output = folder / limits.output
            verb += ["-o", output]
        status = limits.status
        run(verb, status)
        commands["verb"] = (verb, status)
        if limits.by_result is not None:
            commands["result"] = (measured.importing(output),)
        medians = take_turns(commands, arguments.runs)
        size = scene.stat().st_size / MB
    finally:
        scene.unlink()
        if output:
            output.unlink(missing_ok=True)
            output.with_suffix(".bin").unlink(missing_ok=True)  # the data of a .gltf
    seconds = {name: values[2] for name, values in medians.items()}
    ratio = {name: seconds["verb"] / seconds[name] for name in seconds}
    times = [f"{seconds[name]:.3f}" if name in seconds else "-" for name in ("verb", "import", "result")]
    table.row([limits.verb, limits.workload], [limits.output or "-", f"{size:.1f}", *times], [
        ("time / import", ratio["import"], limits.by_import, "{:.2f}"),
        ("time / import of the output", ratio.get("result"), limits.by_result, "{:.2f}"),
        ("peak memory", medians["verb"][1], limits.memory(size, arguments.scale, medians["import"][1]), "{:.0f}"),
    ])


class JobsTable(Table):
    """The row of many scenes."""

    HEAD = ["scenes", "number", "KB each", "one job s", "two jobs s", "two/one", "limit"]
    WIDTHS = [-14, 7, 8, 10, 10, 8, 6]


def add_jobs(arguments, folder):
    """Checks many scenes one at a time and two at a time."""
    if (os.cpu_count() or 1) < 2:
        print("LEFT OUT: two scenes at a time, because there is one processor")
        return []
    table = JobsTable()
    one = Measured(JOBS.workload, arguments, folder).scene(JOBS.each)
    scenes = folder / "many"
    scenes.mkdir()
    count = max(2, round(JOBS.scenes * arguments.scale))
    for number in range(count):
        shutil.copyfile(one, scenes / f"{number:04}.ma")
    checking = [arguments.programs / "mayascene", "check", "--quiet", "--preferences", folder / "preferences"]
    try:
        medians = take_turns({jobs: ([*checking, "--jobs", str(jobs), scenes],) for jobs in (1, 2)}, arguments.runs)
    finally:
        shutil.rmtree(scenes)
    size = one.stat().st_size / 1000
    one.unlink()
    table.row(["check of many"], [str(count), f"{size:.0f}", f"{medians[1][0]:.2f}", f"{medians[2][0]:.2f}"],
              [("two jobs / one job", medians[2][0] / medians[1][0], JOBS.by_one_job, "{:.2f}")])
    return table.missed
