"""What the parser and the lexer show is what runs: each of their public operations has a caller in the product."""

import functools
import re
import unittest

from project import ROOT, read

HEADERS = {"MAYA_Parse": "maya/MAYA_Parse.h", "MAYA_Lex": "maya/MAYA_Lex.h"}

# Operations that nothing calls, and why they are there all the same.
WITHOUT_A_CALLER = {
    "SkipCharacters": "moves over bytes of the caller's own choice; every command has its arguments apart by white space",
    "SetTwoDStream": "stands between the values of one and of three dimensions; no stream of an import has two",
    "ParseParent": "the command changes nothing: a node's parent comes from its creation alone",
    "ParseTransformParent": "as ParseParent, for a transform",
    "ParseCameraParent": "as ParseParent, for a camera",
    "ParseLocatorSetAttr": "a locator takes no attribute",
}

COMMENT_OR_TEXT = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"|\'(?:\\.|[^\'\\\n])*\'', re.DOTALL)


def plain(text):
    """The code without comments and literals."""
    return COMMENT_OR_TEXT.sub(" ", text)


def without_bodies(code):
    """The code without what stands in braces; each body leaves a semicolon."""
    depth = 0
    kept = []
    for character in code:
        depth += character == "{"
        if depth == 0:
            kept.append(character)
        if character == "}":
            depth -= 1
            kept.append(";" if depth == 0 else "")
    return "".join(kept)


def public_operations(header, name):
    """The names of the member functions in the public part of the class; constructors and destructor left out."""
    body = re.search(rf"^class {name} [^{{;]*\{{\n public:\n(.*?)^ (?:private|protected):", plain(header), re.M | re.S)
    operations = {}
    for statement in without_bodies(body[1]).split(";"):
        if called := re.search(r"(~?)\b(\w+)\s*\(", statement):
            if called[2] != name:
                operations[called[2]] = None
    return list(operations)


@functools.cache
def product():
    """The product's code by its path, without the declarations in the two headers."""
    found = {}
    for room in ("plugin", "maya", "comp"):
        for suffix in ("*.h", "*.cpp"):
            for path in sorted((ROOT / room).glob(suffix)):
                name = path.relative_to(ROOT).as_posix()
                found[name] = plain(path.read_text(encoding="utf-8"))
    for name in HEADERS.values():
        found[name] = "\n".join(re.findall(r"\{[^{}]*\}", found[name]))  # bodies that stand in the class
    return found


def has_caller(operation, sources):
    for path, code in sources.items():
        if f"&MAYA_Parse::{operation}" in re.findall(rf"&\w+::{operation}\b", code):
            return True
        for called in re.finditer(rf"\b{operation}\s*\(", code):
            line = code[code.rfind("\n", 0, called.start()) + 1 : called.start()]
            if not line[:1].isspace():
                continue  # a definition begins in the first column, a call never does
            through_an_object = line.rstrip().endswith((".", "->"))
            if through_an_object or not path.startswith("plugin/"):
                return True
    return False


def without_definition(operation, sources):
    """The code but for the operation's own, which does not make it called."""
    own = re.compile(rf"^\S[^\n]*\b\w+::{operation}\b(?:[^\n]*\}}$|.*?^\}})", re.M | re.S)
    return {path: own.sub(" ", code) for path, code in sources.items()}


def without_caller(operations, sources):
    """Those that nothing calls, or only what nothing calls itself."""
    waiting, found = set(operations), set()
    while True:
        uncalled = {
            operation for operation in waiting if not has_caller(operation, without_definition(operation, sources))
        }
        if not uncalled:
            return found
        for operation in uncalled:
            sources = without_definition(operation, sources)
        waiting -= uncalled
        found |= uncalled


def all_operations():
    return [operation for name, header in HEADERS.items() for operation in public_operations(read(header), name)]


class Callers(unittest.TestCase):
    def test_every_public_operation_has_a_caller_or_is_listed(self):
        self.assertEqual(without_caller(all_operations(), product()), set(WITHOUT_A_CALLER))

    def test_the_headers_are_read_to_their_end(self):
        parse = public_operations(read(HEADERS["MAYA_Parse"]), "MAYA_Parse")
        self.assertGreater(len(parse), 45)
        for operation in ("Parse", "BuildQuote", "ExtractAnimInfo", "InsertThreeDKeyframe", "ConvertRot"):
            self.assertIn(operation, parse)
        self.assertNotIn("CreateNodeRecord", parse, "it is private")
        lex = public_operations(read(HEADERS["MAYA_Lex"]), "MAYA_Lex")
        self.assertEqual((lex[0], lex[-1], len(lex)), ("GetNextToken", "FailAtEnd", 12))

    def test_an_operation_that_loses_its_callers_is_noticed(self):
        for operation in ("VerifyAnimInfo", "GetKeyTime", "ExtractAnimInfo", "BuildQuote", "SkipWhiteSpace", "ParseID",
                          "ParseCreateAnimNode", "MakeComp", "FindFrameRate", "ReportError"):
            self.assertTrue(has_caller(operation, product()), operation)
            silent = {
                path: re.sub(rf"(?m)^[ \t].*\b{operation}\b.*$", " ", code) for path, code in product().items()
            }
            self.assertFalse(has_caller(operation, silent), operation)

    def test_a_new_operation_that_nothing_calls_is_noticed(self):
        for name, header in HEADERS.items():
            for declaration in ("void Fresh();", "int Fresh(int) const;", "static int Fresh(int a) { return a; }"):
                changed = read(header).replace(" public:\n", f" public:\n  {declaration}\n", 1)
                self.assertIn("Fresh", public_operations(changed, name), declaration)
        self.assertEqual(without_caller(["Fresh", "Parse"], product()), {"Fresh"})

    def test_what_only_calls_itself_or_is_called_by_such_has_no_caller(self):
        sources = {
            "maya/One.cpp": "void MAYA_Parse::Outer(int a,\n                     int b) {\n  Inner(a);\n}\n\n"
            "void MAYA_Parse::Inner(int a) {\n  if (a > 0) Inner(a - 1);\n}\n\n"
            "void MAYA_Parse::Short() {}\n\nvoid MAYA_Parse::Used() {\n  Used();\n}\n\n"
            "void Run() {\n  parser.Used();\n}\n"
        }
        self.assertEqual(without_caller(["Outer", "Inner", "Short", "Used"], sources), {"Outer", "Inner", "Short"})

    def test_what_only_looks_like_a_call_is_none(self):
        for code in (
            "void MAYA_Parse::SetTwoDStream(int x) {}\n",
            "  // SetTwoDStream(1)\n",
            '  Say("SetTwoDStream(");\n',
            "  ResetTwoDStream(1);\n  NotSetTwoDStream(1);\n",
            "  SetTwoDStreams(1);\n",
        ):
            self.assertFalse(has_caller("SetTwoDStream", {"comp/One.cpp": plain(code)}), code)
        self.assertFalse(has_caller("ReportError", {"plugin/One.cpp": "  ReportError(suites, nullptr, 1);\n"}))

    def test_every_form_of_a_call_is_one(self):
        for code in (
            "  SetTwoDStream(1);\n",
            "  return f(a, SetTwoDStream(1));\n",
            "  parser->SetTwoDStream(1);\n",
            "  parser.SetTwoDStream(1);\n",
            '    {"x", &MAYA_Parse::SetTwoDStream},\n',
        ):
            self.assertTrue(has_caller("SetTwoDStream", {"comp/One.cpp": plain(code)}), code)

    def test_each_exception_has_its_reason(self):
        for operation, reason in WITHOUT_A_CALLER.items():
            self.assertGreater(len(reason.split()), 3, operation)


if __name__ == "__main__":
    unittest.main()
