"""Imports scenes with several builds of the tool and holds their traces to those of the first.

usage: compare_builds.py [--jobs N] --scenes FOLDER [--examples FOLDER] --build NAME COMMAND ...

COMMAND is the tool, with an emulator before it where it needs one, as one argument of words. FOLDER has a folder for
each scene, as write-scenes makes them; each scene of the examples is imported as it stands and in the scene's units.
"""

import argparse
import concurrent.futures
import os
import shlex
import subprocess
import sys
import tempfile
import time
from pathlib import Path

from traces import Tally, compare

SHOWN = 5
LONGEST_RUN = 300  # seconds


def runs_of_examples(folder):
    for scene in sorted(folder.glob("*.ma")):
        for units in (0, 1):
            yield f"{scene.name}, linear units {units}", folder, [f"--linear-units={units}", scene.name]


def runs_of_scenes(folder):
    for scene in sorted(folder.iterdir(), key=lambda path: int(path.name)):
        arguments = (scene / "arguments").read_text(encoding="utf-8").splitlines()
        yield f"generated scene {scene.name}", scene, arguments


def traced(command, folder, arguments):
    """The exit status and the trace of a run. Preferences are those of a new user."""
    with tempfile.TemporaryDirectory() as place:
        trace = Path(place) / "trace"
        run = subprocess.run(
            [*command, "import", "--quiet", f"--preferences={place}/preferences", f"--trace={trace}", *arguments],
            cwd=folder, env={"LC_ALL": "C.UTF-8", "PATH": os.environ["PATH"]}, stdout=subprocess.DEVNULL,
            stderr=subprocess.PIPE, check=False, timeout=LONGEST_RUN)
        return run.returncode, run.stderr, trace.read_bytes() if trace.exists() else b""


class Build:
    def __init__(self, name, command):
        self.name, self.command = name, shlex.split(command)
        self.tally, self.complaints, self.seconds = Tally(), [], 0.0

    def hold(self, run, expected):
        name, folder, arguments = run
        start = time.monotonic()
        status, errors, trace = traced(self.command, folder, arguments)
        taken = time.monotonic() - start
        if status != expected[0]:
            return Tally(), f"{name}: exit status {status}, not {expected[0]}", taken
        if errors != expected[1]:
            return Tally(), f"{name}: {errors!r} on standard error, not {expected[1]!r}", taken
        tally, difference = compare(expected[2], trace)
        if difference:
            line, ours, theirs = (part.decode(errors="replace") if isinstance(part, bytes) else part for part in difference)
            return tally, f"{name}, line {line}:\n    {ours}\n    {theirs}", taken
        return tally, None, taken

    def note(self, outcome):
        tally, complaint, taken = outcome
        self.tally.add(tally)
        self.seconds += taken
        if complaint:
            self.complaints.append(complaint)

    def report(self):
        tally = self.tally
        print(f"{self.name:28} {tally.traces:6} traces, {tally.same_bytes} the same in every byte; "
              f"{tally.lines} calls; {tally.differing} numbers read off a matrix differ, "
              f"by at most {tally.worst:.1e}; {self.seconds:.0f} s; "
              + (f"{len(self.complaints)} DIFFER" if self.complaints else "as the first"))
        for complaint in self.complaints[:SHOWN]:
            print("  " + complaint)


def arguments():
    parser = argparse.ArgumentParser(usage=__doc__.split("usage: ")[1].split("\n")[0])
    parser.add_argument("--jobs", type=int, default=os.cpu_count())
    parser.add_argument("--scenes", type=Path, required=True)
    parser.add_argument("--examples", type=Path)
    parser.add_argument("--build", nargs=2, action="append", required=True)
    return parser.parse_args()


def main():
    options = arguments()
    reference, *others = [Build(name, command) for name, command in options.build]
    runs = list(runs_of_examples(options.examples)) if options.examples else []
    runs += runs_of_scenes(options.scenes)

    def hold_all(run):
        expected = traced(reference.command, run[1], run[2])
        return expected, [build.hold(run, expected) for build in others]

    lines = imported = 0
    with concurrent.futures.ThreadPoolExecutor(options.jobs) as pool:
        for expected, outcomes in pool.map(hold_all, runs):
            lines += expected[2].count(b"\n")
            imported += expected[0] == 0
            for build, outcome in zip(others, outcomes):
                build.note(outcome)
    print(f"{reference.name:28} {len(runs):6} runs, {imported} of them with exit status 0; {lines} lines of trace")
    for build in others:
        build.report()
    # A comparison of nothing proves nothing.
    return 1 if not lines or not imported or not others or any(build.complaints for build in others) else 0


if __name__ == "__main__":
    sys.exit(main())
