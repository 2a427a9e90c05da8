"""docs/host-reference.md and docs/host-interface.md against the headers, the sources and the calls of real imports.

usage: host_interface_test.py TOOL
"""

import json
import re
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path

import headers
import host_reference
from project import ROOT, read

REFERENCE = read("docs/host-reference.md")
DOCUMENT = read("docs/host-interface.md")


def section(title):
    return re.search(rf"^## {re.escape(title)}\n(.*?)(?=^## |\Z)", DOCUMENT, re.MULTILINE | re.DOTALL)[1]


def code_names(text):
    return re.findall(r"`(\w+)`", text)


class Reference(unittest.TestCase):
    maxDiff = None

    def test_it_is_what_its_script_prints(self):
        self.assertEqual(REFERENCE, host_reference.page())

    def test_it_has_every_operation_of_every_suite(self):
        declared = []
        for path in (ROOT / "hostapi").glob("*Suite.h"):
            tables = re.findall(r"typedef struct (?:QZGP_|WN)\w+ \{.*?^\}", path.read_text(encoding="utf-8"), re.M | re.S)
            declared += re.findall(r"HostError \(\*(\w+)\)", "".join(tables))
        listed = re.findall(r"^\| \d+\*? \| `(\w+)\(", REFERENCE, re.MULTILINE)
        self.assertEqual(len(headers.suites()), 14)
        self.assertEqual(sorted(listed), sorted(declared))

    def test_every_operation_names_the_codes_of_the_embedded_host(self):
        for suite in headers.suites():
            for operation in suite.operations:
                self.assertTrue(operation.codes[0].startswith("HOST_ERR_"), operation.name)

    def test_it_has_every_error_code(self):
        self.assertEqual(len(headers.error_codes()), read("hostapi/ErrorCodes.h").count("ENTRY("))

    def test_every_code_that_is_named_exists(self):
        names = {name for name, _, _ in headers.error_codes()}
        for path in [*(ROOT / "hostapi").glob("*.h"), *(ROOT / "hostutil").glob("*.h")]:
            for name in re.findall(r"\bHOST_ERR_([A-Z]\w+)", path.read_text(encoding="utf-8")):
                self.assertIn(name, names | {"NONE"}, path.name)

    def test_it_has_every_function_of_the_library_with_a_contract(self):
        listed = [
            re.search(r"(\w+)\(", declaration)[1]
            for functions in headers.utility_contracts().values()
            for declaration, contract in functions
            if contract
        ]
        self.assertEqual(sorted(listed), sorted(headers.utility_functions()))

    def test_the_library_exports_what_is_listed(self):
        exported = set(re.findall(r"^\s+(\w+);$", read("hostutil/exports.map"), re.MULTILINE)) - {"local"}
        self.assertEqual(exported, set(headers.utility_functions()) | set(headers.setup_functions()))

    def test_it_has_every_named_number_of_the_suites(self):
        for name, value in headers.constants().items():
            self.assertRegex(REFERENCE, rf"#define {name} \(?{re.escape(value)}\b")

    def test_it_has_every_stream(self):
        self.assertEqual(len(headers.streams()), read("hostapi/LayerStreams.h").count("HOST_STREAM_"))


class Interface(unittest.TestCase):
    def test_the_hosts_own_functions_and_services_are_named(self):
        named = code_names(section("What the embedded host adds"))
        for name in headers.setup_functions() + headers.rehearsed_services():
            self.assertIn(name, named)

    def test_functions_that_are_not_called_are_named(self):
        sentence = re.search(r"^(`HostCompareNoCase`.*?) are there for other plug-ins", DOCUMENT, re.M | re.S)
        sources = "".join(
            path.read_text(encoding="utf-8") for room in ("plugin", "maya", "comp") for path in (ROOT / room).glob("*.*")
        )
        # What the headers' inline parts call, by what the sources write.
        inline = {
            "HostTranslateAndReport": "TranslateAndReport",
            "UTF16StringRelease": "UTF16Handle",
        }
        unused = [
            name
            for name in headers.utility_functions()
            if not re.search(rf"\b({name}|{inline.get(name, name)})\b", sources)
        ]
        self.assertEqual(sorted(code_names(sentence[1])), sorted(unused))

    def test_every_operation_that_is_named_exists(self):
        operations = {operation.name for suite in headers.suites() for operation in suite.operations}
        rows = re.findall(r"^\| `(\w+)` \|", section("What the module passes"), re.MULTILINE)
        self.assertGreater(len(rows), 10)
        for name in rows:
            self.assertIn(name, operations)


class Life(unittest.TestCase):
    """The drawing of an import is taken as a grammar, and traces of imports have to be sentences of it."""

    text = section("The life of an import")
    drawing = re.search(r"^```mermaid\nsequenceDiagram\n(.*?)^```$", text, re.MULTILINE | re.DOTALL)[1]
    runs = dict(re.findall(r"^\| (values|keys) \| (.+) \|$", text, re.MULTILINE))

    def sentence(self, name):
        if name not in self.runs:
            return f"{name} "
        return "".join("(?:" + "".join(f"{call} " for call in code_names(part)) + ")*" for part in self.runs[name].split(";"))

    def grammar(self):
        pattern = ""
        ends = []
        for line in self.drawing.splitlines():
            word, _, rest = line.strip().partition(" ")
            if word in ("loop", "opt"):
                pattern += "(?:"
                ends.append(")*" if word == "loop" else ")?")
            elif word == "end":
                pattern += ends.pop()
            elif word != "participant":
                self.assertRegex(word, r"^(Host->>Module|Module->>Host):$")
                pattern += "".join(self.sentence(name) for name in rest.split(", "))
        self.assertEqual(ends, [])
        return re.compile(pattern)

    @classmethod
    def setUpClass(cls):
        with tempfile.TemporaryDirectory() as folder:
            cls.traces = {
                (verb, scene.name): cls.calls(verb, scene, Path(folder))
                for verb in ("import", "verify")
                for scene in sorted((ROOT / "examples").glob("*.ma"))
            }

    @staticmethod
    def calls(verb, scene, folder):
        """What the tool's host and the module call with the scene, but for the way to the suites."""
        trace = folder / "trace"
        command = [TOOL, verb, "--quiet", "--preferences", folder / "preferences", "--trace", trace, scene]
        subprocess.run(command, check=False, capture_output=True)  # some examples end in an error
        records = [json.loads(line) for line in trace.read_text(encoding="utf-8").splitlines()]
        trace.unlink()
        return [
            record["callback"] if record["call"] == "enter" else record["call"]
            for record in records
            if record["call"] not in ("leave", "AcquireSuite", "ReleaseSuiteByName")
        ]

    def is_drawn(self, calls):
        return bool(self.grammar().fullmatch("".join(f"{call} " for call in calls)))

    def test_what_becomes_of_every_example_is_drawn(self):
        for name, calls in self.traces.items():
            self.assertTrue(self.is_drawn(calls), name)

    def test_the_examples_make_every_call(self):
        made = {call for calls in self.traces.values() for call in calls}
        operations = {operation.name for suite in headers.suites() for operation in suite.operations}
        self.assertEqual(operations - made, {"AcquireSuite", "ReleaseSuiteByName"})

    def test_every_operation_is_drawn(self):
        drawn = set(re.findall(r"\w+", self.drawing)) | set(code_names("".join(self.runs.values())))
        for suite in headers.suites():
            for operation in suite.operations:
                self.assertIn(operation.name, drawn | {"AcquireSuite", "ReleaseSuiteByName"})

    def test_a_call_out_of_order_is_no_sentence(self):
        calls = list(next(iter(self.traces.values())))
        self.assertTrue(self.is_drawn(calls))
        at = calls.index("CreateComp")
        calls[at], calls[at + 1] = calls[at + 1], calls[at]
        self.assertFalse(self.is_drawn(calls))



if __name__ == "__main__":
    TOOL = sys.argv.pop(1)
    unittest.main()
