"""The add-on's sources: what they import, and how they look."""

import ast
import shutil
import subprocess
import unittest

from addon import ADDON

_OF_BLENDER = {"bpy", "bpy_extras", "mathutils"}


def imported(path):
    for node in ast.walk(ast.parse(path.read_text(encoding="utf-8"))):
        if isinstance(node, ast.Import):
            yield from (name.name for name in node.names)
        elif isinstance(node, ast.ImportFrom) and node.level == 0:
            yield node.module
        elif isinstance(node, ast.ImportFrom):
            yield "." * node.level


class Sources(unittest.TestCase):
    def test_what_needs_no_blender_imports_nothing_of_it(self):
        plain = sorted((ADDON / "plain").glob("*.py"))
        self.assertGreater(len(plain), 5)
        for path in plain:
            self.assertFalse({"..", *_OF_BLENDER} & set(imported(path)), path)

    def test_the_rest_imports_it(self):
        self.assertIn("bpy", set(imported(ADDON / "builder.py")))

    def test_the_version_of_blender_is_asked_in_one_place(self):
        asking = [path.name for path in ADDON.glob("**/*.py")
                  if "app.version" in path.read_text(encoding="utf-8")]
        self.assertEqual(asking, ["compat.py"])

    def test_flake8_has_no_complaint(self):
        program = shutil.which("flake8")
        if program is None:
            print("LEFT OUT: flake8 over the add-on, which is not installed")
            return
        done = subprocess.run([program, "--isolated", str(ADDON)],
                              capture_output=True, text=True, check=False)
        self.assertEqual((done.returncode, done.stdout), (0, ""))


if __name__ == "__main__":
    unittest.main()
