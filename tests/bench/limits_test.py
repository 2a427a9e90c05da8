"""Each format that is exported has a limit of its memory, on one workload."""

import pathlib
import subprocess
import sys
import unittest

TOOL, ROOT = sys.argv[1], pathlib.Path(sys.argv[2])
sys.path.insert(0, str(ROOT / "bench"))

from limits import VERBS  # noqa: E402


def _formats():
    """Those that the tool's own help names."""
    help_text = subprocess.run([TOOL, "export", "--help"], check=True, capture_output=True, text=True).stdout
    lines = help_text.partition("\nFormats:\n")[2].partition("\n\n")[0].splitlines()
    return [line.split()[0] for line in lines]


class Limits(unittest.TestCase):
    def test_each_format_and_a_list_of_keys_may_take_twice_the_composition(self):
        rows = {(row.output.rpartition(".")[2], row.options) for row in VERBS
                if row.verb == "export" and row.workload == "composition" and row.compositions == 2.0}
        wanted = {(name, ()) for name in _formats()} | {("csv", ("--keys",))}
        self.assertGreater(len(wanted), 5)
        self.assertEqual(rows, wanted)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
