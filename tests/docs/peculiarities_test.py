"""docs/peculiarities.md and its table against the sources and the tests."""

import re
import unittest

from peculiarities_table import ENTRIES
from project import ROOT, read

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
    def test_the_table_has_the_entries_of_the_page_in_their_order(self):
        titles = re.findall(r"^### (.+)$", read("docs/peculiarities.md"), re.MULTILINE)
        self.assertEqual([title for title, _, _ in ENTRIES], titles)

    def test_every_deliberate_mark_is_quoted(self):
        quotes = [quote for _, _, entry_marks in ENTRIES for quote in entry_marks]
        found = list(marks())
        self.assertTrue(found)
        for path, text in found:
            quoted = any(path == place and quote in text for place, quote in quotes)
            self.assertTrue(quoted, f'{path}: no entry quotes "Deliberate: {text}"')

    def test_every_quote_is_of_a_mark(self):
        found = list(marks())
        for title, _, entry_marks in ENTRIES:
            for place, quote in entry_marks:
                marked = any(place == path and quote in text for path, text in found)
                self.assertTrue(marked, f'"{title}": {place} has no mark "{quote}"')

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
        for title, names, _ in ENTRIES:
            self.assertTrue(names, f'"{title}" names no test')
            for name in names:
                self.assertIn(name, tests, f'"{title}" names a test that does not exist')

    def test_every_test_of_the_peculiarities_has_an_entry(self):
        held = {name for _, names, _ in ENTRIES for name in names}
        for path in (ROOT / "tests" / "docs").glob("*PeculiaritiesTest.cpp"):
            for name in TEST.findall(path.read_text(encoding="utf-8")):
                self.assertIn(name, held, f"{path.name}: {name} holds no entry")


if __name__ == "__main__":
    unittest.main()
