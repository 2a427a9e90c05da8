"""Finds and runs the command-line tool."""

import json
import os
import shutil
import subprocess
import tempfile
from collections import namedtuple

# `remarks` are (severity, text); severity is "error", "warning" or "note".
Run = namedtuple("Run", "document remarks status")

_TOOL = "mayascene"
_BUILDS = ("release", "test", "dev")


class ToolFailed(Exception):
    """The tool could not be started, or gave no composition."""


def _beside_the_project(folder):
    root = os.path.realpath(folder)
    for _ in range(3):
        root = os.path.dirname(root)
    return [os.path.join(root, "build", build, "bin", _TOOL)
            for build in _BUILDS]


def find_tool(preference, folder):
    """The tool of the preferences, of PATH, or of the project's builds.

    `folder` is the add-on's own. None where there is none.
    """
    if preference:
        return preference
    found = shutil.which(_TOOL)
    if found:
        return found
    for path in _beside_the_project(folder):
        if os.access(path, os.X_OK) and os.path.isfile(path):
            return path
    return None


def command(tool, scene, bake, report):
    words = [tool, "import", "--json", "-", "--linear-units", "0"]
    if bake:
        words += ["--bake", "--report", report]
    return words + [os.path.abspath(scene)]


def _diagnostics(path):
    """Those of the report; None where it cannot be read."""
    try:
        with open(path, encoding="utf-8") as file:
            report = json.load(file)
        return [item for scene in report["scenes"]
                for item in scene.get("diagnostics", [])]
    except (OSError, ValueError, KeyError, TypeError):
        return None


def _remark(item):
    return (item["severity"],
            f"line {item['line']}: {item['sentence']} [{item['code']}]")


def _said(text, diagnostics, kind):
    """The tool's own lines, without those that are among the diagnostics,
    and without the help below each of these."""
    known = [f": {item['sentence']} [{item['code']}]" for item in diagnostics]
    lines, repeated = [], False
    for line in map(str.strip, text.splitlines()):
        if repeated and line.startswith("help: "):
            continue
        repeated = any(line.endswith(end) for end in known)
        if line and not repeated:
            lines.append((kind, line))
    return lines


def _ending(status):
    return f"status {status}" if status >= 0 else f"ended by signal {-status}"


def run(tool, scene, bake):
    """Imports a scene. Raises ToolFailed."""
    with tempfile.TemporaryDirectory() as folder:
        report = os.path.join(folder, "report.json")
        try:
            done = subprocess.run(
                command(tool, scene, bake, report), capture_output=True,
                stdin=subprocess.DEVNULL, check=False)
        except OSError as problem:
            raise ToolFailed(f"{tool} cannot be started: "
                             f"{problem.strerror or problem}") from problem
        diagnostics = _diagnostics(report)
    said = done.stderr.decode("utf-8", "replace")
    try:
        document = json.loads(done.stdout.decode("utf-8"))
    except ValueError as problem:
        raise ToolFailed(said.strip() or f"{tool} gave no composition, "
                         + _ending(done.returncode)) from problem
    remarks = [_remark(item) for item in diagnostics or []]
    # After a bake that ended well the lines only name what was baked.
    if not bake or done.returncode != 0 or diagnostics is None:
        kind = "warning" if done.returncode == 0 else "error"
        remarks = _said(said, diagnostics or [], kind) + remarks
    return Run(document, remarks, done.returncode)
