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


def _report_remarks(path):
    try:
        with open(path, encoding="utf-8") as file:
            report = json.load(file)
        scenes = report["scenes"]
    except (OSError, ValueError, KeyError, TypeError):
        return []
    return [(item["severity"],
             f"line {item['line']}: {item['sentence']} [{item['code']}]")
            for scene in scenes for item in scene.get("diagnostics", [])]


def _said(text):
    """The tool's own lines."""
    lines = [line.strip() for line in text.splitlines()]
    return [("warning", line) for line in lines if line]


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
        remarks = _report_remarks(report)
    said = done.stderr.decode("utf-8", "replace")
    try:
        document = json.loads(done.stdout.decode("utf-8"))
    except ValueError as problem:
        raise ToolFailed(said.strip() or f"{tool} gave no composition, "
                         f"status {done.returncode}") from problem
    if not bake or (done.returncode != 0 and not remarks):
        remarks = remarks + _said(said)
    return Run(document, remarks, done.returncode)
