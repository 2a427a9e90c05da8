"""The second reader of tests/secondreader judges the product, so it must not share code with it."""

import unittest

from project import ROOT
from rooms_test import INCLUDE, folders

FOLDER = ROOT / "tests" / "secondreader"

# The border, and the embedded host that it is held to and whose options it takes.
ALLOWED = ("hostapi/", "refhost/")

# Where the importer is run.
RUNNER = "SceneRun.cpp"
ALLOWED_IN_RUNNER = ("plugin/Entry.h", "plugin/Globals.h")

# What works out the prediction meets the host's options and nothing that the host does.
OPTIONS = "refhost/Host.h"
RUNS_THE_HOST = ("SceneRun.cpp", "SceneRun.h", "FailureSweepTest.cpp", "SeededScenesTest.cpp")


def included(path):
    return INCLUDE.findall(path.read_text(encoding="utf-8"))


def reached(path, seen):
    """The headers that a source comes to include, those of the tests with what they include in turn."""
    for header in included(path):
        if header not in seen:
            seen.add(header)
            if header.startswith(("tests/", "fuzz/")):
                reached(ROOT / header, seen)
    return seen


class SecondReader(unittest.TestCase):
    sources = sorted((*FOLDER.glob("*.h"), *FOLDER.glob("*.cpp")))
    rooms = tuple(folder.name + "/" for folder in folders())

    def product_headers(self, headers):
        return [header for header in headers if header.startswith(self.rooms)]

    def test_it_includes_nothing_of_the_product_but_the_border_and_the_host(self):
        looked_at = 0
        for path in self.sources:
            for header in self.product_headers(reached(path, set())):
                looked_at += 1
                if path.name == RUNNER and header in ALLOWED_IN_RUNNER:
                    continue
                self.assertTrue(header.startswith(ALLOWED), f"{path.name} comes to include {header}")
        self.assertGreater(looked_at, 20)

    def test_what_predicts_knows_the_options_of_the_host_alone(self):
        for path in self.sources:
            if path.name in RUNS_THE_HOST:
                continue
            for header in self.product_headers(included(path)):
                self.assertTrue(header == OPTIONS or header.startswith("hostapi/"), f"{path.name} includes {header}")

    def test_the_exceptions_are_there(self):
        self.assertEqual(set(self.product_headers(included(FOLDER / RUNNER))) - {OPTIONS}, set(ALLOWED_IN_RUNNER))

    def test_a_step_into_the_product_is_noticed(self):
        for header in ("hostutil/HostMatrix.h", "maya/MAYA_Lex.h", "comp/UnwrapAngle.h", "plugin/Guarded.h"):
            self.assertEqual(self.product_headers([header]), [header])
            self.assertFalse(header.startswith(ALLOWED))


if __name__ == "__main__":
    unittest.main()
