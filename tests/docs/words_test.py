"""Plain words in sources, scripts and documents: what has a plainer word is not written."""

import re
import unittest

from project import ROOT

# A word that is not written, and what is written for it. What a reader has to think about twice is on this list.
PLAINER = {
    r"behind": "after, or a name for what is meant",
    r"tells?|told|telling": "say, show, report, distinguish",
    r"lets? \w+ by|lets? by": "not take, miss",
    r"let through": "accept",
    r"one who|those who|whoever": "a caller, a user",
}
FORBIDDEN = re.compile(rf"\b(?:{'|'.join(PLAINER)})\b", re.IGNORECASE)

# What somebody leaves behind has no plainer word.
LEFT_BEHIND = re.compile(r"\b(?:left|leav(?:e|es|ing)|stay)(?: \w+){0,6} behind\b", re.IGNORECASE)

# File to the words in it that stand all the same, each with its reason.
EXCEPTIONS = {
    "CONTRIBUTING.md": ['"behind"', '"tell"'],  # it names the rule
    "tests/motion/CameraTest.cpp": ["Behind The Camera"],  # a place in space
}

SUFFIXES = {".h", ".cpp", ".c", ".py", ".sh", ".md", ".txt", ".cmake", ".ma", ".json", ""}
NOT_READ = {"build", ".git", "seeds", "regressions", "golden", "__pycache__", ".cache"}
THIS = "tests/docs/words_test.py"


def files():
    """Every text of the project but inputs and outputs of programs."""
    for path in sorted(ROOT.rglob("*")):
        relative = path.relative_to(ROOT)
        if path.suffix in SUFFIXES and path.is_file() and not NOT_READ & set(relative.parts):
            yield relative.as_posix(), path


def words(text):
    """The text in words: names in their parts, each run of blanks and of a comment's line starts as one blank."""
    text = re.sub(r"(?<=[a-z0-9])(?=[A-Z])|_", " ", text)
    return re.sub(r"\s*\n\s*(?://|#|\*)?\s*|\s+", " ", text)


class Words(unittest.TestCase):
    def test_plainer_words_are_written(self):
        read = 0
        for name, path in files():
            if name == THIS:
                continue
            text = LEFT_BEHIND.sub(" ", words(path.read_text(encoding="utf-8", errors="replace")))
            for phrase in EXCEPTIONS.get(name, []):
                text = text.replace(phrase, " ")
            for found in FORBIDDEN.finditer(text):
                self.fail(f"{name}: write something plainer for: {text[max(0, found.start() - 40) : found.end() + 30]}")
            read += 1
        self.assertGreater(read, 500)

    def test_the_words_are_found_in_sentences_and_in_names(self):
        for text in ("nothing // behind\n", "it\n// tells", "IsToldInWords", "let\n  # by", "Whoever", "let it by"):
            self.assertTrue(FORBIDDEN.search(LEFT_BEHIND.sub(" ", words(text))), text)
        for text in ("what it left behind", "LeavesNothingBehind", "leaves a block of\n// memory behind", "stellar"):
            self.assertFalse(FORBIDDEN.search(LEFT_BEHIND.sub(" ", words(text))), text)

    def test_every_exception_is_needed(self):
        for name, phrases in EXCEPTIONS.items():
            text = words((ROOT / name).read_text(encoding="utf-8"))
            for phrase in phrases:
                self.assertIn(phrase, text, name)


if __name__ == "__main__":
    unittest.main()
