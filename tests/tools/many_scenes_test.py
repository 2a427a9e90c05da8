#!/usr/bin/env python3
"""many_scenes_test.py TOOL PROJECT: runs the commands of docs/many-scenes.md on the example scenes, on this machine.

What needs GNU parallel is left out where there is none; how reports are joined is tried in any case.
"""

import json
import os
import pathlib
import re
import shlex
import shutil
import subprocess
import sys
import tempfile
import unittest

TOOL, PROJECT = (pathlib.Path(argument).resolve() for argument in sys.argv[1:3])


def commands():
    """The blocks of the page: one machine, several, joining."""
    text = (PROJECT / "docs" / "many-scenes.md").read_text(encoding="utf-8")
    return re.findall(r"^```\n(.*?)^```$", text, re.MULTILINE | re.DOTALL)


class ManyScenes(unittest.TestCase):
    def setUp(self):
        self.place = tempfile.TemporaryDirectory()
        self.addCleanup(self.place.cleanup)
        self.folder = pathlib.Path(self.place.name)
        shutil.copytree(PROJECT / "examples", self.folder / "shots")
        (self.folder / "shots" / "no scene.ma").write_text("#usda 1.0\n", encoding="utf-8")
        self.one_machine, self.several, self.joining = commands()

    def run_in_folder(self, command):
        environment = dict(os.environ, PATH=f"{TOOL.parent}:{os.environ['PATH']}", HOME=self.place.name,
                           XDG_CONFIG_HOME=self.place.name)
        return subprocess.run(["bash", "-c", command], cwd=self.folder, env=environment, check=False,
                              capture_output=True, text=True)

    def report(self):
        return json.loads((self.folder / "report.json").read_text(encoding="utf-8"))

    def checked_here(self):
        done = self.run_in_folder(self.one_machine)
        self.assertEqual(done.returncode, 1, done.stderr)
        return self.report()

    def failing_batches(self, command, size):
        """How many batches of scenes end with another status than 0, each checked by itself."""
        search = re.search(r"^find .*(?= \|$)", command, re.MULTILINE)[0]
        scenes = self.run_in_folder(search).stdout.split("\0")[:-1]
        batches = [scenes[first : first + size] for first in range(0, len(scenes), size)]
        checks = [self.run_in_folder(shlex.join(["mayascene", "check", "--quiet", *batch])) for batch in batches]
        failing = sum(check.returncode != 0 for check in checks)
        self.assertTrue(0 < failing < len(batches), [check.returncode for check in checks])
        return failing

    def test_a_folder_is_checked(self):
        paths = [scene["path"] for scene in self.checked_here()["scenes"]]
        self.assertEqual(paths, sorted(paths))
        self.assertEqual(set(paths), {f"shots/{path.name}" for path in (self.folder / "shots").glob("*.ma")})
        self.assertGreater(len(paths), 3)

    def test_joined_reports_are_the_report_of_all(self):
        whole = self.checked_here()
        (self.folder / "reports").mkdir()
        # Ten and more of them: "10.json" comes after "9.json".
        scenes = [scene["path"] for scene in whole["scenes"]] * 2
        for number, scene in enumerate(scenes, start=1):
            done = self.run_in_folder(f"mayascene check --quiet --json reports/{number}.json '{scene}'")
            self.assertLessEqual(done.returncode, 1, done.stderr)
        self.assertGreaterEqual(len(scenes), 10)
        (self.folder / "report.json").unlink()
        done = self.run_in_folder(self.joining)
        self.assertEqual((done.returncode, done.stderr), (0, ""))
        self.assertEqual(self.report(), dict(whole, scenes=whole["scenes"] * 2))

    def test_the_same_with_gnu_parallel(self):
        if shutil.which("parallel") is None:
            print("LEFT OUT: checks spread by GNU parallel, because there is none", flush=True)
            return
        whole = self.checked_here()
        here = self.several.replace("-S node1,node2 ", "").replace("-N 50", "-N 2")
        self.assertNotEqual(here, self.several)
        done = self.run_in_folder(here)
        self.assertEqual(done.returncode, self.failing_batches(here, 2), done.stderr)
        (self.folder / "report.json").unlink()
        self.assertEqual(self.run_in_folder(self.joining).returncode, 0)
        by_path = {scene["path"]: scene for scene in self.report()["scenes"]}
        self.assertEqual(by_path, {scene["path"]: scene for scene in whole["scenes"]})


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
