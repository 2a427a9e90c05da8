"""Finds the places of a C++ source where one token can be changed so that the program means something else.

A mutant is one such change. Comments, texts, characters, preprocessor lines, what a preprocessor line leaves out on
most machines (after #else), attributes, static assertions and conditions of the compiler (if constexpr) are left
alone.
"""

import re
from dataclasses import dataclass

TOKEN = re.compile(
    r"""
    (?P<ignored>
        //[^\n]* | /\*.*?\*/                                # comments
      | ^[ \t]*\#[ \t]*el(?:se|if)\b.*?^[ \t]*\#[ \t]*endif # what is compiled elsewhere
      | ^[ \t]*\#(?:[^\n]*\\\n)*[^\n]*                      # other preprocessor lines, with their continuations
      | R"(?P<mark>[^(]*)\(.*?\)(?P=mark)"
      | "(?:\\.|[^"\\\n])*" | '(?:\\.|[^'\\\n])+'           # texts and characters
      | \[\[.*?\]\]                                         # attributes
      | \bstatic_assert\s*\(.*?\);
      | \bif\s+constexpr\s*\([^;{]*?\)\s(?=\{|\w)
    )
  | (?P<number>(?:0[xX][0-9a-fA-F']+ | (?:\d[\d']*\.?\d* | \.\d+)(?:[eE][+-]?\d+)?)\w*)
  | (?P<word>[A-Za-z_]\w*)
  | (?P<operator><=>|<<=|>>=|->|::|<<|>>|<=|>=|==|!=|&&|\|\||\+\+|--|[-+*/%&|^]=|[-+*/%<>=!&|^~?:;,.(){}\[\]])
    """,
    re.VERBOSE | re.DOTALL | re.MULTILINE,
)

# Operators that are always binary, and such as are where blanks stand around them, as the formatting has it.
BINARY = {"<=": "<", ">=": ">", "==": "!=", "!=": "==", "+=": "-=", "-=": "+=",
          "*=": "/=", "|=": "&=", "<<": ">>", ">>": "<<"}
SPACED = {"<": "<=", ">": ">=", "+": "-", "-": "+", "*": "/", "/": "*", "%": "*", "&": "|", "|": "&", "&&": "||", "||": "&&"}
KINDS = {**dict.fromkeys(("<", "<=", ">", ">=", "==", "!="), "comparison"), **dict.fromkeys(("&&", "||"), "logic")}
OPPOSITES = {"true": "false", "false": "true"}
UNARY_SIGN_FOLLOWS = ("(", ",", "=", "return", "{", "?", ":", "[")
CONDITIONALS = ("if", "while")

INTEGER = re.compile(r"(0[xX][0-9a-fA-F']+|\d[\d']*)([uUlLzZ]*)")
# Up to here doubles distinguish neighbouring integers.
MOST_EXACT = 2**53


@dataclass(frozen=True)
class Token:
    kind: str
    text: str
    begin: int
    end: int


@dataclass(frozen=True, order=True)
class Mutant:
    """One change: the characters from `begin` to `end` of the file become `replacement`."""

    file: str
    begin: int
    end: int
    replacement: str
    kind: str

    def applied(self, source):
        return source[: self.begin] + self.replacement + source[self.end :]

    def line(self, source):
        return source.count("\n", 0, self.begin) + 1

    def before_and_after(self, source):
        """The line that is changed, as it was and as it becomes."""
        index = self.line(source) - 1
        return source.split("\n")[index].strip(), self.applied(source).split("\n")[index].strip()


def tokens_of(source):
    return [
        Token(match.lastgroup, match.group(), match.start(), match.end())
        for match in TOKEN.finditer(source)
        if match.lastgroup not in ("ignored", "mark") and match.group("ignored") is None
    ]


def other_number(text):
    """A number beside this one; None for what is no plain number."""
    if whole := INTEGER.fullmatch(text):
        digits, suffix = whole.groups()
        return str(int(digits.replace("'", ""), 16 if digits[:2] in ("0x", "0X") else 10) + 1) + suffix
    try:
        value = float(text)
    except ValueError:
        return None
    return repr(value + 1.0 if value.is_integer() and value < MOST_EXACT else 2.0 * value)


def is_spaced(source, token):
    return source[token.begin - 1].isspace() and source[token.end : token.end + 1].isspace()


def change_of_operator(source, before, token, after):
    """(replacement, kind) for an operator, or None."""
    if token.text in BINARY or (token.text in SPACED and is_spaced(source, token)):
        return BINARY.get(token.text) or SPACED[token.text], KINDS.get(token.text, "arithmetic")
    if token.text == "!" and after and (after.kind == "word" or after.text == "("):
        return "", "logic"
    if token.text == "-" and after and after.kind in ("word", "number") and before and before.text in UNARY_SIGN_FOLLOWS:
        return "", "arithmetic"
    return None


def condition_after(tokens, index):
    """Begin and end of the condition whose "(" is the token; None where there is none."""
    depth, begin = 0, tokens[index].end
    for token in tokens[index:]:
        depth += token.text in ("(", "{", "[")
        depth -= token.text in (")", "}", "]")
        if token.text == ";" and depth == 1:
            begin = token.end
        if depth == 0:
            return begin, token.begin
    return None


def is_turned_round_already(tokens, begin, end):
    """Whether to negate the condition is what another of the mutants does: that of its one operator."""
    texts = [token.text for token in tokens if begin <= token.begin < end]
    if "&&" in texts or "||" in texts or "?" in texts:
        return False
    return "==" in texts or "!=" in texts or texts[0] == "!"


def mutants_of(file, source):
    """All mutants of a source."""
    tokens = tokens_of(source)
    found = []
    for index, token in enumerate(tokens):
        before = tokens[index - 1] if index > 0 else None
        after = tokens[index + 1] if index + 1 < len(tokens) else None
        change = None
        if token.kind == "operator":
            change = change_of_operator(source, before, token, after)
        elif token.kind == "number" and (other := other_number(token.text)) is not None:
            change = other, "constant"
        elif token.text in OPPOSITES:
            change = OPPOSITES[token.text], "constant"
        if change:
            found.append(Mutant(file, token.begin, token.end, *change))
        if token.text in CONDITIONALS and after and after.text == "(":
            span = condition_after(tokens, index + 1)
            if span and not is_turned_round_already(tokens, *span):
                found.append(Mutant(file, *span, f"!({source[span[0]:span[1]].strip()})", "condition"))
    return found
