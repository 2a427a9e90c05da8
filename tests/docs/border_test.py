"""What holds at the border: where exceptions begin and end, and the codes of every operation."""

import re
import unittest

import codes
from project import ROOT

# The importer's folders, and the two places in them that know of exceptions.
MODULE = ("plugin", "maya", "comp", "scan")
THROWS = "plugin/ErrorCodes.h"
CATCHES = "plugin/Guarded.h"
EXCEPTION_WORD = re.compile(r"\b(?:throw|try|catch)\b")

# Codes that need more than a row of a test: tests of their own make the limits happen, and memory that is
# exhausted cannot be made to happen here.
BEYOND_A_ROW = {"TOO_MANY_LAYERS", "TOO_MANY_KEYS", "MEMORY"}


def module_sources():
    for folder in MODULE:
        for suffix in ("*.h", "*.cpp"):
            for path in sorted((ROOT / folder).glob(f"**/{suffix}")):
                yield path.relative_to(ROOT).as_posix(), codes.bare(path.read_text(encoding="utf-8"))


class Exceptions(unittest.TestCase):
    sources = dict(module_sources())

    def test_they_are_thrown_and_caught_in_two_places(self):
        self.assertGreater(len(self.sources), 40)
        speaking = {path for path, text in self.sources.items() if EXCEPTION_WORD.search(text)}
        self.assertEqual(speaking, {THROWS, CATCHES})

    def test_one_place_throws_and_throws_only(self):
        self.assertEqual(EXCEPTION_WORD.findall(self.sources[THROWS]), ["throw"])

    def test_one_place_catches_all_and_it_is_the_only_one(self):
        self.assertNotRegex(self.sources[CATCHES], r"\bthrow\b")
        self.assertEqual(len(re.findall(r"catch \(\.\.\.\)", self.sources[CATCHES])), 1)

    def test_words_in_comments_and_texts_are_none(self):
        self.assertNotRegex(codes.bare('// throw\n/* try */ f("catch (");'), EXCEPTION_WORD)
        self.assertRegex(codes.bare("if (bad) throw int{3};  // throw"), EXCEPTION_WORD)


class Codes(unittest.TestCase):
    maxDiff = None
    declared = codes.declared()

    def test_every_operation_names_its_codes(self):
        self.assertEqual(len(self.declared), 31)
        for operation, named in self.declared.items():
            self.assertTrue(named, operation)

    def test_the_named_codes_are_those_that_the_embedded_host_gives(self):
        self.assertEqual(self.declared, codes.given())

    def test_every_refusal_that_a_test_makes_happen_is_named(self):
        for operation, happened in codes.tested().items():
            self.assertLessEqual(happened, self.declared[operation], operation)

    def test_every_named_code_is_made_to_happen(self):
        happened = codes.tested()
        for operation, named in self.declared.items():
            self.assertLessEqual(named - happened[operation], BEYOND_A_ROW, operation)

    def test_a_code_that_is_reached_through_others_is_found(self):
        own = {"Do": "call.layer(handle); check(1);", "check": "call.refuse(HOST_ERR_BAD_SIZE);"}
        members = {"layer": "refuseHandle();", "refuseHandle": "refuse(HOST_ERR_BAD_HANDLE);", "refuse": ""}
        self.assertEqual(codes.reached(own["Do"], own, members, False), {"BAD_SIZE", "BAD_HANDLE"})
        self.assertEqual(codes.reached("host.layer(handle);", own, members, False), set())


if __name__ == "__main__":
    unittest.main()
