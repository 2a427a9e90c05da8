"""The documents themselves: links, names of files, and what README.md takes from the code."""

import re
import subprocess
import unittest

from project import ROOT, read

DOCUMENTS = ["README.md", "CHANGELOG.md", "CONTRIBUTING.md", "SECURITY.md", "examples/README.md"] + sorted(
    path.relative_to(ROOT).as_posix() for path in (ROOT / "docs").glob("**/*.md")
)
LINK = re.compile(r"\[[^\]]*\]\(([^)\s]+)\)")
FENCED = re.compile(r"^```.*?^```$", re.MULTILINE | re.DOTALL)
QUOTED_NAME = re.compile(r"`((?:\w+::)*[A-Za-z]\w*)(?:\(\))?`")
ABOUT_CODE = ["CONTRIBUTING.md", "docs/architecture.md", "docs/host-interface.md", "docs/performance.md",
              "docs/reliability.md", "tests/README.md"]
SPELLINGS = {"camelCase", "camelCase_", "PascalCase", "UPPER_CASE", "kPascalCase"}  # rules for names, and no names
QUOTED_FILE = re.compile(r"`((?:[\w.]+/)*[\w.]+\.(?:h|cpp|ma|md|json|txt))`")


def anchors(text):
    """The anchors of a document's headings, as they are derived from the words."""
    found = set()
    for heading in re.findall(r"^#+ (.+)$", FENCED.sub("", text), re.MULTILINE):
        words = re.sub(r"[^\w\- ]", "", heading.lower())
        found.add(words.replace(" ", "-"))
    return found


def links():
    for name in DOCUMENTS:
        for target in LINK.findall(FENCED.sub("", read(name))):
            yield name, target


class Documents(unittest.TestCase):
    def test_every_relative_link_leads_somewhere(self):
        followed = 0
        for name, target in links():
            if re.match(r"\w+:", target):
                continue
            path, _, anchor = target.partition("#")
            file = (ROOT / name).parent / path if path else ROOT / name
            self.assertTrue(file.exists(), f"{name}: {target}")
            if anchor:
                self.assertIn(anchor, anchors(file.read_text(encoding="utf-8")), f"{name}: {target}")
            followed += 1
        self.assertGreater(followed, 20)

    def test_no_link_leads_out_of_the_project(self):
        for name, target in links():
            self.assertTrue(
                ((ROOT / name).parent / target.partition("#")[0]).resolve().is_relative_to(ROOT), f"{name}: {target}"
            )

    def test_every_file_that_is_named_exists(self):
        for name in DOCUMENTS:
            for file in QUOTED_FILE.findall(read(name)):
                if "/" in file:
                    self.assertTrue((ROOT / file).exists(), f"{name} names {file}")

    def test_every_name_of_the_code_that_is_named_exists(self):
        listed = subprocess.run(["git", "-C", ROOT, "ls-files", "-z", "*.cpp", "*.h", "*.py", "*.txt", "*.cmake", "*.ma"],
                                check=True, capture_output=True, text=True).stdout
        words = set()
        for name in listed.split("\0"):
            if name and (ROOT / name).is_file():
                words.update(re.findall(r"\w+", (ROOT / name).read_text(encoding="utf-8", errors="replace")))
        looked = 0
        for name in ABOUT_CODE:
            for quoted in QUOTED_NAME.findall(read(name)):
                if not re.search(r"::|[a-z][A-Z]|_", quoted):
                    continue
                for word in quoted.split("::"):
                    self.assertTrue(word in words or word in SPELLINGS, f"{name} names {quoted}")
                looked += 1
        self.assertGreater(looked, 100)

    def test_the_exit_statuses_are_those_of_the_help(self):
        table = re.findall(r"^\| (\d) \| (.+) \|$", read("README.md"), re.MULTILINE)
        helped = re.search(r"^Exit status:\n(.*?)^With", read("docs/mayascene.md"), re.MULTILINE | re.DOTALL)[1]
        rows = re.findall(r"^  (\d)  (.+)$", re.sub(r"\n {5}", " ", helped), re.MULTILINE)
        self.assertEqual([(number, text.replace("`", "")) for number, text in table], rows)

    def test_the_architecture_lists_every_file_of_the_builder(self):
        listed = set(re.findall(r"^\| `(MAYA_Parse_\w+\.cpp)` \|", read("docs/architecture.md"), re.MULTILINE))
        self.assertEqual(listed, {path.name for path in (ROOT / "comp").glob("MAYA_Parse_*.cpp")})

    def test_no_document_names_a_folder_of_this_machine(self):
        home = r"(?<![\w.])/(?:home|root|work|tmp|mnt|Users)/"
        for name in DOCUMENTS + ["LICENSE"]:
            text = read(name)
            self.assertIsNone(re.search(home, text), name)
            self.assertNotIn(str(ROOT), text, name)

    def test_dates_stand_in_measurements_alone(self):
        for name in DOCUMENTS:
            if not name.startswith("docs/measurements/"):
                text = LINK.sub("", read(name))
                self.assertIsNone(re.search(r"\b20\d\d-\d\d-\d\d\b", text), name)

    def test_no_document_has_lines_that_end_in_blanks_or_tabs(self):
        for name in DOCUMENTS:
            for line in read(name).splitlines():
                self.assertIsNone(re.search(r"[ \t]$|\t", line), f"{name}: {line}")


class Contributing(unittest.TestCase):
    def test_every_file_and_folder_that_it_names_exists(self):
        named = re.findall(r"`((?:[a-z]+/)+[\w.-]*)`", read("CONTRIBUTING.md"))
        self.assertGreater(len(named), 40)
        for name in named:
            if not name.startswith("build/"):
                self.assertTrue((ROOT / name).exists(), name)


class Readme(unittest.TestCase):
    readme = read("README.md")

    def test_it_begins_with_a_title_a_sentence_and_the_two_commands(self):
        begin = r"# mayascene\n\n(.+\n){1,2}\n    scripts/import (examples/\w+\.ma)\n    scripts/test\n\n"
        found = re.match(begin, self.readme)
        self.assertIsNotNone(found)
        for file in ("scripts/import", "scripts/test", found[2]):
            self.assertTrue((ROOT / file).is_file(), file)

    def test_it_stays_short(self):
        self.assertLess(len(self.readme.splitlines()), 120)

    def test_it_has_the_exit_statuses_of_the_tool(self):
        statuses = re.findall(r"^  \w+ = (\d),", read("tools/mayascene/ExitStatus.h"), re.MULTILINE)
        self.assertTrue(statuses)
        self.assertEqual(re.findall(r"^\| (\d) \| ", self.readme, re.MULTILINE), statuses)

    def test_the_page_of_the_examples_has_every_one(self):
        listed = set(re.findall(r"\((\w+\.ma)\)", read("examples/README.md")))
        self.assertEqual(listed, {path.name for path in (ROOT / "examples").glob("*.ma")})

    def test_every_option_in_the_documents_is_one_of_the_tool(self):
        words = sorted((ROOT / "tools/mayascene").glob("*Words.cpp"))
        arguments = "".join(read(path.relative_to(ROOT)) for path in [ROOT / "tools/mayascene/Arguments.cpp", *words])
        arguments += read("README.md").partition("Building by hand")[2]
        for name in DOCUMENTS:
            text = read(name)
            for script, option in re.findall(r"(scripts/\w+) (--[a-z][\w-]+)", text):
                self.assertIn(option, read(script), f"{name} names {script} {option}")
            text = re.sub(r"(scripts/\w+|build/test/bin/\w+_tests?) --[a-z][\w-]+", "", text)
            # The options of another program, up to the command that it is to run.
            text = re.sub(r"\bparallel -[^']*", "", text)
            for option in re.findall(r"(?<![\w-])(--[a-z][\w-]+)", text):
                self.assertIn(option, arguments + "--help --version", f"{name} names {option}")

    def test_it_has_every_preset(self):
        line = re.search(r"The presets are (.*?);", self.readme, re.DOTALL)[1]
        presets = re.findall(r'"name": "(\w+)",\n\s+"displayName"', read("CMakePresets.json"))
        self.assertEqual(re.findall(r"`(\w+)`", line), presets)

    def test_it_has_every_node_type_that_is_read(self):
        table = re.search(r"kNodeTypes\[\] = \{(.*?)\};", read("maya/MAYA_Parse_Nodes.cpp"), re.DOTALL)[1]
        for node_type in re.findall(r'\{"(\w+)"', table):
            if "ransform" not in node_type:
                self.assertIn(f"`{node_type}`", self.readme)


class Changelog(unittest.TestCase):
    def test_its_first_entry_is_the_projects_version(self):
        version = re.search(r"project\(\w+ VERSION ([\d.]+)", read("CMakeLists.txt"))[1]
        self.assertEqual(re.search(r"^## ([\d.]+)$", read("CHANGELOG.md"), re.MULTILINE)[1], version)


if __name__ == "__main__":
    unittest.main()
