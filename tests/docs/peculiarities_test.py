"""docs/peculiarities.md against the sources and the tests."""

import re
import unittest

from project import ROOT, read

MARK = re.compile(r"Held by|Marked in")
HELD = re.compile(r"Held by ((?:`\w+`(?: and )?)+)\.")
MARKED = re.compile(r"Marked in `([^`]+)`: \"(.+?)\"\.(?=\s|$)")
TEST = re.compile(r"\bTEST(?:_F|_P)?\(\s*\w+,\s*(\w+)\s*\)")
ROOMS = ("plugin", "maya", "comp")


def comment_blocks(path):
    """The comments of a source, each with its lines joined."""
    block = []
    for line in path.read_text(encoding="utf-8").splitlines() + [""]:
        found = re.search(r"(?:^\s*|\s)//\s?(.*)$", line)
        if found:
            block.append(found.group(1).strip())
        elif block:
            yield " ".join(block)
            block = []


def marks():
    """Every "Deliberate:" of the rooms, as (path, its text)."""
    for room in ROOMS:
        for path in sorted((ROOT / room).glob("*.*")):
            if path.suffix not in (".h", ".cpp"):
                continue
            for block in comment_blocks(path):
                for text in block.split("Deliberate:")[1:]:
                    yield path.relative_to(ROOT).as_posix(), text.strip()


class Peculiarities(unittest.TestCase):
    document = read("docs/peculiarities.md")

    def test_every_deliberate_mark_is_quoted(self):
        quotes = MARKED.findall(self.document)
        found = list(marks())
        self.assertTrue(found)
        for path, text in found:
            quoted = any(path == place and quote in text for place, quote in quotes)
            self.assertTrue(quoted, f'{path}: no entry quotes "Deliberate: {text}"')

    def test_every_quote_is_of_a_mark(self):
        found = list(marks())
        for place, quote in MARKED.findall(self.document):
            marked = any(place == path and quote in text for path, text in found)
            self.assertTrue(marked, f'{place} has no mark "{quote}"')

    def test_no_mark_is_written_where_it_is_not_looked_for(self):
        in_sources = sum(
            path.read_text(encoding="utf-8").count("Deliberate")
            for room in ROOMS
            for path in (ROOT / room).glob("**/*")
            if path.is_file()
        )
        self.assertEqual(in_sources, len(list(marks())))

    def test_every_entry_names_a_test_that_exists(self):
        tests = set()
        for path in (ROOT / "tests").glob("**/*.cpp"):
            tests.update(TEST.findall(path.read_text(encoding="utf-8")))
        entries = re.split(r"^### ", self.document, flags=re.MULTILINE)[1:]
        self.assertTrue(entries)
        for entry in entries:
            title = entry.splitlines()[0]
            names = re.findall(r"`(\w+)`", " ".join(HELD.findall(entry)))
            self.assertTrue(names, f'"{title}" names no test')
            for name in names:
                self.assertIn(name, tests, f'"{title}" names a test that does not exist')

    def test_every_footer_has_the_form_that_is_looked_for(self):
        self.assertEqual(
            len(MARK.findall(self.document)) - 2,  # the two that the introduction explains
            len(HELD.findall(self.document)) + len(MARKED.findall(self.document)),
        )

    def test_every_test_of_the_peculiarities_has_an_entry(self):
        held = set(re.findall(r"`(\w+)`", " ".join(HELD.findall(self.document))))
        for path in (ROOT / "tests" / "docs").glob("*PeculiaritiesTest.cpp"):
            for name in TEST.findall(path.read_text(encoding="utf-8")):
                self.assertIn(name, held, f"{path.name}: {name} holds no entry")


if __name__ == "__main__":
    unittest.main()
