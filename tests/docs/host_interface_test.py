"""docs/host-interface.md against the headers of hostapi/ and hostutil/."""

import re
import unittest

import headers
from project import ROOT, read

DOCUMENT = read("docs/host-interface.md")
HEADING = re.compile(r"^### (?:Basic suite|(QZGP [\w ]+ Suite), version (\d+))$", re.MULTILINE)
OPERATION = re.compile(r"^\| (\d+)(\*?) \| `(\w+)` \| `([^`]*)` \| (.+) \|$", re.MULTILINE)


def section(title):
    found = re.search(rf"^## {re.escape(title)}\n(.*?)(?=^## |\Z)", DOCUMENT, re.MULTILINE | re.DOTALL)
    return found[1]


def documented_suites():
    """(name, version) to its operations, as the document has them."""
    marks = list(HEADING.finditer(DOCUMENT))
    found = {}
    for mark in marks:
        text = re.split(r"^##", DOCUMENT[mark.end() :], maxsplit=1, flags=re.MULTILINE)[0]
        rows = OPERATION.findall(text)
        found[mark[1] or "", int(mark[2] or 0)] = tuple(
            headers.Operation(int(slot), name, arguments, star == "*") for slot, star, name, arguments, _ in rows
        )
    return found


class HostInterface(unittest.TestCase):
    maxDiff = None

    def test_every_suite_has_its_versions_slots_and_arguments(self):
        declared = {(suite.name, suite.version): suite.operations for suite in headers.suites()}
        self.assertEqual(len(declared), 14)
        self.assertEqual(documented_suites(), declared)

    def test_the_suites_stand_in_the_order_of_their_release(self):
        source = read("plugin/QZGP_SuiteHandler.cpp")
        released = re.findall(r"\{QZGP_(\w+)_SUITE, QZGP_\w+_SUITE_(\d+)\}", source)
        documented = [
            (name.removeprefix("QZGP ").removesuffix(" Suite").upper().replace(" ", "_"), str(version))
            for name, version in documented_suites()
            if name
        ]
        self.assertEqual(documented, released)

    def test_every_error_code_is_listed_with_its_number_and_meaning(self):
        rows = re.findall(r"^\| `(\w+)` \| (\d+) \| (.+) \|$", section("Error codes"), re.MULTILINE)
        codes = headers.error_codes()
        self.assertEqual(len(codes), read("hostapi/ErrorCodes.h").count("ENTRY("))
        self.assertEqual(rows, codes)

    def test_every_code_that_is_named_exists(self):
        names = {name for name, _, _ in headers.error_codes()}
        library = section("The utility library")
        for name in re.findall(r"`([A-Z]+(?:_[A-Z]+)+)`", library):
            self.assertIn(name, names)

    def test_every_utility_function_is_listed_as_it_is_declared(self):
        rows = re.findall(r"^\| `([^`]+\))` \|", section("The utility library"), re.MULTILINE)
        self.assertEqual(sorted(rows), sorted(headers.utility_functions().values()))

    def test_every_function_is_listed_under_its_header(self):
        parts = re.split(r"^### [\w -]+: (hostutil/\w+\.h)$", section("The utility library"), flags=re.MULTILINE)
        self.assertGreater(len(parts), 2)
        for header, text in zip(parts[1::2], parts[2::2]):
            declared = read(header)
            for name in re.findall(r"^\| `[^`(]*?(\w+)\(", text, re.MULTILINE):
                self.assertRegex(declared, rf"HOSTUTIL_API [^;]*\b{name}\(")

    def test_the_library_exports_what_is_listed(self):
        exported = set(re.findall(r"^\s+(\w+);$", read("hostutil/exports.map"), re.MULTILINE)) - {"local"}
        listed = set(headers.utility_functions()) | set(headers.setup_functions())
        self.assertEqual(exported, listed)

    def test_the_hosts_own_functions_and_services_are_named(self):
        text = section("What the embedded host adds")
        for name in headers.setup_functions() + headers.rehearsed_services():
            self.assertIn(f"`{name}`", text)

    def test_functions_that_are_not_called_are_told(self):
        told = re.search(r"^(`HostCompareNoCase`.*?) are there for other plug-ins", section("The utility library"), re.MULTILINE | re.DOTALL)
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
        self.assertEqual(sorted(re.findall(r"`(\w+)`", told[1])), sorted(unused))

    def test_the_entry_and_the_callbacks_are_as_declared(self):
        code = headers.one_line(re.search(r"```c\n(.*?)```", DOCUMENT, re.DOTALL)[1])
        declared = headers.one_line(
            "".join(
                read(f"hostapi/{name}.h") for name in ("PluginEntry", "FileImportManagerSuite", "RegisterSuite")
            )
        )
        for name, arguments in re.findall(r"HostError \(?\*?(\w+)\)?\(([^)]*)\);", code):
            typename = "HostPluginEntry" if name == "GPMain_MayaImport" else name
            self.assertIn(f"typedef HostError (*{typename})({arguments});", declared)

    def test_every_named_number_of_the_headers_is_told(self):
        for name, value in headers.constants().items():
            self.assertIn(value, DOCUMENT, name)

    def test_the_stream_table_is_that_of_the_border(self):
        source = read("hostapi/LayerStreams.h")
        rows = re.findall(r"^\| (\d+) \| (.+?) \| ([13]) \| (\w+) \|$", section("The layer streams"), re.MULTILINE)
        declared = re.findall(r"^\s+HOST_STREAM_\w+ = (\d+),?\s+/\* (one|three), (\w+)", source, re.MULTILINE)
        counts = {"1": "one", "3": "three"}
        self.assertEqual([(number, counts[count], unit) for number, _, count, unit in rows], declared)


if __name__ == "__main__":
    unittest.main()
